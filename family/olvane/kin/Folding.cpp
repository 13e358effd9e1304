// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/kin/Folding.h>

#include <algorithm>

#include <olvane/kin/FoldingTableInternal.h>

namespace olvane::kin {

namespace {

struct Letter {
    char32_t code;
    std::size_t bytes;
};

constexpr char32_t kNoLetter = 0xFFFFFFFF;

bool isContinuation(char c) {
    return (static_cast<unsigned char>(c) & 0xC0U) == 0x80U;
}

// The letter at the front of a text that is not empty; kNoLetter for a byte that begins none.
Letter firstLetter(std::string_view text) {
    const auto lead = static_cast<unsigned char>(text[0]);
    if (lead < 0x80) return {lead, 1};
    const std::size_t bytes = lead >= 0xF0 ? 4 : lead >= 0xE0 ? 3 : 2;
    if (lead < 0xC2 || lead > 0xF4 || text.size() < bytes) return {kNoLetter, 1};
    char32_t code = lead & (0x7FU >> bytes);
    for (std::size_t i = 1; i < bytes; ++i) {
        if (!isContinuation(text[i])) return {kNoLetter, 1};
        code = (code << 6U) | (static_cast<unsigned char>(text[i]) & 0x3FU);
    }
    return {code, bytes};
}

bool isIn(char32_t code, const LetterRange* ranges, std::size_t count) {
    const LetterRange* const found =
        std::lower_bound(ranges, ranges + count, code,
                         [](const LetterRange& range, char32_t value) { return range.last < value; });
    return found != ranges + count && found->first <= code;
}

const char* foldedLetter(char32_t code) {
    const FoldedLetter* const end = kFoldings + kFoldingCount;
    const FoldedLetter* const found = std::lower_bound(
        kFoldings, end, code, [](const FoldedLetter& each, char32_t value) { return each.letter < value; });
    return found != end && found->letter == code ? kFoldedLetters + found->folded : nullptr;
}

// Also those that Unicode counts as letters. Asked for letters beyond ASCII alone.
bool isApostrophe(char32_t code) {
    constexpr char32_t kApostrophes[] = {0xB4,  0x2B9, 0x2BB,  0x2BC,  0x2BD,  0x2BE,
                                         0x2BF, 0x5F3, 0x2018, 0x2019, 0x201B, 0xFF07};
    return std::find(std::begin(kApostrophes), std::end(kApostrophes), code) != std::end(kApostrophes);
}

bool isAsciiWordLetter(char32_t code) {
    return (code >= 'a' && code <= 'z') || (code >= 'A' && code <= 'Z') || (code >= '0' && code <= '9') ||
           code == '\'' || code == '`';
}

// How many letters and digits of ASCII the text begins with.
std::size_t plainLettersOf(std::string_view text) {
    std::size_t count = 0;
    while (count < text.size() && isAsciiWordLetter(static_cast<unsigned char>(text[count])) &&
           text[count] != '\'' && text[count] != '`')
        ++count;
    return count;
}

// Most letters of most files: all at once.
void appendPlain(std::string_view letters, std::string& out) {
    const std::size_t start = out.size();
    out += letters;
    for (std::size_t i = start; i < out.size(); ++i) {
        if (out[i] >= 'A' && out[i] <= 'Z') out[i] = static_cast<char>(out[i] - 'A' + 'a');
    }
}

bool isWordLetter(char32_t code) {
    return code < 0x80 ? isAsciiWordLetter(code) : !isIn(code, kBetweenWords, kBetweenWordsCount);
}

void appendFolded(std::string_view bytes, char32_t code, std::string& out) {
    if (code < 0x80) {
        if (code != '\'' && code != '`')
            out += static_cast<char>(code >= 'A' && code <= 'Z' ? code - 'A' + 'a' : code);
        return;
    }
    if (isApostrophe(code)) return;
    if (code == kNoLetter || !isIn(code, kMarks, kMarkCount)) {
        const char* const folded = code == kNoLetter ? nullptr : foldedLetter(code);
        out += folded != nullptr ? std::string_view(folded) : bytes;
    }
}

}  // namespace

std::string foldedForSearch(std::string_view text) {
    std::string out;
    out.reserve(text.size());
    while (!text.empty()) {
        const Letter letter = firstLetter(text);
        appendFolded(text.substr(0, letter.bytes), letter.code, out);
        text.remove_prefix(letter.bytes);
    }
    return out;
}

void visitFoldedWords(std::string_view text,
                      const std::function<void(std::string_view written, std::string_view folded)>& use) {
    std::size_t start = 0;
    std::string folded;
    for (std::size_t at = 0; at <= text.size();) {
        if (const std::size_t count = plainLettersOf(text.substr(at)); count > 0) {
            appendPlain(text.substr(at, count), folded);
            at += count;
        }
        const Letter letter = at < text.size() ? firstLetter(text.substr(at)) : Letter{' ', 1};
        if (isWordLetter(letter.code)) {
            appendFolded(text.substr(at, letter.bytes), letter.code, folded);
        } else {
            if (!folded.empty()) use(text.substr(start, at - start), folded);
            folded.clear();
            start = at + letter.bytes;
        }
        at += letter.bytes;
    }
}

std::vector<FoldedWord> foldedWords(std::string_view text) {
    std::vector<FoldedWord> words;
    visitFoldedWords(text, [&words](std::string_view written, std::string_view folded) {
        words.push_back({written, std::string(folded)});
    });
    return words;
}

}  // namespace olvane::kin
