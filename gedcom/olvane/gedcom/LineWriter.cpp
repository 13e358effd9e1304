// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/gedcom/LineWriterInternal.h>

#include <algorithm>

namespace olvane::gedcom {
namespace {

// The calendar at this place of a date, as "@#DJULIAN@"; empty where none stands. A reader takes one where a word
// begins, so that no @ that is text stands before it.
std::string_view calendarAt(std::string_view date, std::size_t at) {
    const std::string_view rest = date.substr(at);
    const bool beginsWord = at == 0 || date[at - 1] == ' ';
    if (!beginsWord || !(rest.starts_with("@#D") || rest.starts_with("@#d"))) return {};
    const std::size_t end = rest.find('@', 1);
    return end == std::string_view::npos ? std::string_view() : rest.substr(0, end + 1);
}

}  // namespace

void LineWriter::record(std::string_view xref, std::string_view tag) {
    text_.append("0 @").append(xref).append("@ ").append(tag) += '\n';
}

void LineWriter::textRecord(std::string_view xref, std::string_view tag, std::string_view text) {
    text_.append("0 @").append(xref).append("@ ").append(tag);
    appendLines(0, text);
}

void LineWriter::text(int level, std::string_view tag, std::string_view text) {
    start(level, tag);
    appendLines(level, text);
}

void LineWriter::line(int level, std::string_view tag, std::string_view value) {
    start(level, tag);
    appendValue(value);
}

void LineWriter::piece(std::string_view tag, std::string_view value) {
    if (!value.empty()) line(2, tag, value);
}

void LineWriter::date(std::string_view date) {
    start(2, "DATE");
    text_ += ' ';
    for (std::size_t at = 0; at < date.size();) {
        const std::string_view calendar = calendarAt(date, at);
        if (calendar.empty()) appendDoubled(date.substr(at, 1));
        text_ += calendar;
        at += std::max<std::size_t>(calendar.size(), 1);
    }
    text_ += '\n';
}

void LineWriter::pointer(int level, std::string_view tag, std::string_view xref) {
    start(level, tag);
    text_.append(" @").append(xref).append("@\n");
}

void LineWriter::start(int level, std::string_view tag) {
    text_ += static_cast<char>('0' + level);
    text_ += ' ';
    text_ += tag;
}

void LineWriter::appendLines(int level, std::string_view text) {
    std::size_t end = text.find('\n');
    appendValue(text.substr(0, end));
    while (end != std::string_view::npos) {
        const std::size_t begin = end + 1;
        end = text.find('\n', begin);
        start(level + 1, "CONT");
        appendValue(text.substr(begin, end == std::string_view::npos ? end : end - begin));
    }
}

void LineWriter::appendValue(std::string_view value) {
    if (!value.empty()) {
        text_ += ' ';
        appendDoubled(value);
    }
    text_ += '\n';
}

void LineWriter::appendDoubled(std::string_view value) {
    for (const char c : value) text_.append(c == '@' ? 2 : 1, c);
}

}  // namespace olvane::gedcom
