// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// JSON by pieces. Strings and short values are nlohmann's; what stands between them is written here.

#include <cli/JsonOutput.h>

#include <algorithm>
#include <cstddef>
#include <string>

namespace olvane::cli {

namespace {

using Json = nlohmann::ordered_json;

constexpr std::size_t kPieceBytes = 64 * 1024;

bool isPlain(char c) {
    return c >= 0x20 && c != '"' && c != '\\' && c != 0x7F;
}

// The start of a text, cut before a character rather than within it.
std::string_view pieceOf(std::string_view text) {
    constexpr std::size_t kMostFollowing = 3;
    if (text.size() <= kPieceBytes) return text;
    std::size_t end = kPieceBytes;
    while (end > kPieceBytes - kMostFollowing && (static_cast<unsigned char>(text[end]) & 0xC0U) == 0x80U)
        --end;
    return text.substr(0, end);
}

std::string dumped(const Json& value, int indent) {
    return value.dump(indent, ' ', false, Json::error_handler_t::replace);
}

}  // namespace

void JsonOutput::key(std::string_view name) {
    separate();
    write_("\"");
    addText(name);
    write_(form_ == Form::indented ? "\": " : "\":");
    hasKey_ = true;
}

void JsonOutput::text(std::string_view text) {
    separate();
    write_("\"");
    addText(text);
    write_("\"");
}

void JsonOutput::text(const std::function<void(const picture::TextSink& write)>& make) {
    separate();
    write_("\"");
    make([this](std::string_view piece) { addText(piece); });
    write_("\"");
}

void JsonOutput::addText(std::string_view text) {
    while (!text.empty()) {
        const std::string_view piece = pieceOf(text);
        if (std::all_of(piece.begin(), piece.end(), isPlain)) {
            write_(piece);
        } else {
            const std::string quoted = dumped(std::string(piece), -1);
            write_(std::string_view(quoted).substr(1, quoted.size() - 2));
        }
        text.remove_prefix(piece.size());
    }
}

// No string has a raw line end, so each one begins a line, to be moved in.
void JsonOutput::value(const Json& value) {
    separate();
    if (form_ == Form::compact) return write_(dumped(value, -1));
    const std::string all = dumped(value, 1);
    std::string_view rest = all;
    for (std::size_t end = rest.find('\n'); end != std::string_view::npos; end = rest.find('\n')) {
        write_(rest.substr(0, end));
        startLine();
        rest.remove_prefix(end + 1);
    }
    write_(rest);
}

void JsonOutput::field(std::string_view name, std::string_view text) {
    key(name);
    this->text(text);
}

void JsonOutput::field(std::string_view name, const Json& value) {
    key(name);
    this->value(value);
}

void JsonOutput::begin(std::string_view bracket) {
    separate();
    write_(bracket);
    ++depth_;
    isFirst_ = true;
}

void JsonOutput::end(std::string_view bracket) {
    --depth_;
    if (!isFirst_) startLine();
    write_(bracket);
    isFirst_ = false;
}

// What stands before a name, or before a value that has none.
void JsonOutput::separate() {
    if (!hasKey_) {
        if (!isFirst_) write_(",");
        if (depth_ > 0) startLine();
    }
    hasKey_ = false;
    isFirst_ = false;
}

void JsonOutput::startLine() {
    if (form_ == Form::compact) return;
    write_("\n");
    write_(std::string(static_cast<std::size_t>(depth_), ' '));
}

}  // namespace olvane::cli
