// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Cells for spreadsheets, after the advice of OWASP on CSV injection:
// https://owasp.org/www-community/attacks/CSV_Injection

#include <cli/TableCells.h>

#include <algorithm>
#include <array>
#include <cstdio>

namespace olvane::cli {

namespace {

bool isControl(char c) {
    return static_cast<unsigned char>(c) < 0x20 || c == 0x7F;
}

bool beginsLikeFormula(std::string_view text) {
    constexpr std::array<std::string_view, 9> kSigns = {
        "=", "+", "-", "@", "'", "\xEF\xBC\x9D", "\xEF\xBC\x8B", "\xEF\xBC\x8D", "\xEF\xBC\xA0"};
    return std::any_of(kSigns.begin(), kSigns.end(),
                       [text](std::string_view sign) { return text.starts_with(sign); });
}

std::string quoted(std::string_view text) {
    std::string cell = "\"";
    for (const char c : text) cell.append(c == '"' ? 2 : 1, c);
    return cell + '"';
}

}  // namespace

std::string tableCell(std::string_view text) {
    std::string cell(text);
    std::replace_if(cell.begin(), cell.end(), isControl, ' ');
    if (beginsLikeFormula(cell)) return "'" + cell;
    return cell.starts_with('"') ? quoted(cell) : cell;
}

std::string tableLine(std::initializer_list<std::string_view> cells) {
    std::string line;
    for (const std::string_view cell : cells) line += tableCell(cell) + '\t';
    line.back() = '\n';
    return line;
}

std::string escapedField(std::string_view text) {
    std::string field;
    for (const char c : text) {
        std::array<char, 8> code{};
        if (c == '\\') {
            field += "\\\\";
        } else if (c == '\t') {
            field += "\\t";
        } else if (c == '\r') {
            field += "\\r";
        } else if (c == '\n') {
            field += "\\n";
        } else if (isControl(c)) {
            std::snprintf(code.data(), code.size(), "\\x%02X",
                          static_cast<unsigned>(static_cast<unsigned char>(c)));
            field += code.data();
        } else {
            field += c;
        }
    }
    return field;
}

}  // namespace olvane::cli
