// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The expected lines of a golden case: "#=" and one record a line.

#include <support/GoldenCase.h>

#include <fstream>
#include <sstream>
#include <stdexcept>
#include <string_view>
#include <vector>

namespace support {

namespace {

constexpr std::string_view kMark = "#=";
constexpr const char* kRecordIndent = "#= ";

std::vector<std::string> linesOf(const std::string& text) {
    std::vector<std::string> lines;
    std::istringstream in(text);
    for (std::string line; std::getline(in, line);) lines.push_back(line);
    return lines;
}

bool isExpectedLine(const std::string& line) {
    return line.compare(0, kMark.size(), kMark) == 0;
}

bool isComment(const std::string& line) {
    return !line.empty() && line.front() == '#';
}

std::string withoutSpaces(std::string_view text) {
    std::string kept;
    for (const char c : text) {
        if (c != ' ') kept += c;
    }
    return kept;
}

// One "#=" line a record; an empty text is one bare mark.
std::string expectedLines(const std::string& text) {
    if (text.empty()) return "#=\n";
    std::string lines;
    std::size_t start = 0;
    while (start < text.size()) {
        std::size_t end = text.find(';', start);
        end = end == std::string::npos ? text.size() : end + 1;
        lines += kRecordIndent + text.substr(start, end - start) + "\n";
        start = end;
    }
    return lines;
}

}  // namespace

std::string readWhole(const std::string& path) {
    std::ifstream in(path, std::ios::binary);
    std::ostringstream whole;
    if (!in || !(whole << in.rdbuf())) throw std::runtime_error(path + ": cannot be read");
    return whole.str();
}

bool hasExpectedText(const std::string& caseText) {
    for (const std::string& line : linesOf(caseText)) {
        if (isExpectedLine(line)) return true;
    }
    return false;
}

std::string expectedText(const std::string& caseText) {
    std::string text;
    for (const std::string& line : linesOf(caseText)) {
        if (isExpectedLine(line)) text += withoutSpaces(std::string_view(line).substr(kMark.size()));
    }
    return text;
}

std::string withExpectedText(const std::string& caseText, const std::string& text) {
    std::string result;
    bool placed = false;
    for (const std::string& line : linesOf(caseText)) {
        if (isExpectedLine(line)) continue;
        if (!placed && !isComment(line)) {
            result += expectedLines(text);
            placed = true;
        }
        result += line + "\n";
    }
    if (!placed) result += expectedLines(text);
    return result;
}

}  // namespace support
