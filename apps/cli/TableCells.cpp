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

// A cell that begins with a quotation mark has them twice.
std::string cellPart(std::string_view text, bool isQuoted) {
    std::string part;
    part.reserve(text.size());
    for (const char c : text) part.append(isQuoted && c == '"' ? 2 : 1, isControl(c) ? ' ' : c);
    return part;
}

// A cell in pieces: what it begins with decides on its form.
class CellOutput {
public:
    explicit CellOutput(const picture::TextSink& write) : write_(write) {}

    void add(std::string_view text) {
        constexpr std::size_t kPieceBytes = 64 * 1024;
        if (text.empty()) return;
        if (isStart_) begin(text);
        isStart_ = false;
        for (; !text.empty(); text.remove_prefix(std::min(text.size(), kPieceBytes))) {
            write_(cellPart(text.substr(0, kPieceBytes), isQuoted_));
        }
    }

    void finish() {
        if (isQuoted_) write_("\"");
    }

private:
    void begin(std::string_view text) {
        isQuoted_ = text.starts_with('"');
        if (beginsLikeFormula(text)) write_("'");
        if (isQuoted_) write_("\"");
    }

    const picture::TextSink& write_;
    bool isStart_ = true;
    bool isQuoted_ = false;
};

}  // namespace

std::string tableCell(std::string_view text) {
    std::string cell;
    const picture::TextSink write = [&cell](std::string_view piece) { cell += piece; };
    CellOutput output(write);
    output.add(text);
    output.finish();
    return cell;
}

std::string tableLine(std::initializer_list<std::string_view> cells) {
    std::string line;
    for (const std::string_view cell : cells) line += tableCell(cell) + '\t';
    line.back() = '\n';
    return line;
}

void TableLineOutput::cell(std::string_view text) {
    cell([text](const picture::TextSink& write) { write(text); });
}

void TableLineOutput::cell(const std::function<void(const picture::TextSink& write)>& make) {
    if (!isFirst_) write_("\t");
    isFirst_ = false;
    CellOutput output(write_);
    make([&output](std::string_view piece) { output.add(piece); });
    output.finish();
}

void TableLineOutput::finish() {
    write_("\n");
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
