// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Which encoding text looks like, by counts of bytes above ASCII and of their neighbours. The rules are our own; they
// serve a hint to the user, and no text is read by them.

#include <olvane/gedcom/EncodingGuessInternal.h>

#include <array>
#include <cstddef>

namespace olvane::gedcom {
namespace {

bool isAsciiLetter(unsigned char c) {
    return (c >= 'A' && c <= 'Z') || (c >= 'a' && c <= 'z');
}

// A run of bytes above ASCII is what Latin text has one or two of in a row, and other alphabets a whole word.
struct HighByteCensus {
    std::array<std::size_t, 256> all{};
    std::size_t bytes = 0;
    std::size_t inWords = 0;           // in runs of three and more
    std::size_t words = 0;             // such runs
    std::size_t capitalThenSmall = 0;  // runs whose first byte is C0 to DF, the others DC to FF
    std::size_t smallThenCapital = 0;  // the other way round
    std::size_t evenWords = 0;         // runs of an even length
    std::size_t signsInWords = 0;      // bytes that are signs in windows-1252, close to a letter

    void addRun(std::string_view run, unsigned char before, unsigned char behind) {
        for (const char c : run) ++all[static_cast<unsigned char>(c)];
        bytes += run.size();
        if (run.size() >= 3) addWord(run);
        if (run.size() == 1) addSign(static_cast<unsigned char>(run.front()), before, behind);
    }

private:
    static bool allUpper(std::string_view text) {
        for (const char c : text) {
            if (static_cast<unsigned char>(c) < 0xC0 || static_cast<unsigned char>(c) > 0xDF) return false;
        }
        return true;
    }
    // With the accented vowels of Greek, which stand at DC to DF.
    static bool allLower(std::string_view text) {
        for (const char c : text) {
            if (static_cast<unsigned char>(c) < 0xDC) return false;
        }
        return true;
    }

    void addWord(std::string_view run) {
        inWords += run.size();
        ++words;
        if (run.size() % 2 == 0) ++evenWords;
        if (allUpper(run.substr(0, 1)) && allLower(run.substr(1))) ++capitalThenSmall;
        if (allLower(run.substr(0, 1)) && allUpper(run.substr(1))) ++smallThenCapital;
    }

    // Letters of windows-1250, Polish ones first: within a word, or before one that goes on in small letters. "Petrović" ends
    // in what is an ae there, and "Ştefan" begins with an ordinal sign.
    void addSign(unsigned char sign, unsigned char before, unsigned char behind) {
        switch (sign) {
            case 0xA3:
            case 0xA5:
            case 0xAF:
            case 0xB3:
            case 0xB9:
            case 0xBC:
            case 0xBE:
                if (isAsciiLetter(before) || (behind >= 'a' && behind <= 'z')) ++signsInWords;
                return;
            case 0xBF:
                if (isAsciiLetter(before)) ++signsInWords;
                return;
            case 0xBA:
            case 0xAA:
                if (behind >= 'a' && behind <= 'z') ++signsInWords;
                return;
            case 0xE6:
                if (before == 'i' && !isAsciiLetter(behind)) ++signsInWords;
                return;
            default:
                return;
        }
    }
};

HighByteCensus takeCensus(std::string_view bytes) {
    HighByteCensus census;
    std::size_t at = 0;
    while (at < bytes.size()) {
        if (static_cast<unsigned char>(bytes[at]) < 0x80) {
            ++at;
            continue;
        }
        std::size_t end = at;
        while (end < bytes.size() && static_cast<unsigned char>(bytes[end]) >= 0x80) ++end;
        census.addRun(bytes.substr(at, end - at), static_cast<unsigned char>(at == 0 ? ' ' : bytes[at - 1]),
                      static_cast<unsigned char>(end == bytes.size() ? ' ' : bytes[end]));
        at = end;
    }
    return census;
}

std::size_t sum(const HighByteCensus& census, unsigned char first, unsigned char last) {
    std::size_t total = 0;
    for (std::size_t byte = first; byte <= last; ++byte) total += census.all[byte];
    return total;
}

// Of an alphabet that is not Latin. Greek has accented vowels at DC to DF, where Cyrillic has rare capitals.
const KnownEncoding* alphabetOf(const HighByteCensus& census) {
    const std::size_t most = census.bytes - census.bytes / 10;
    if (sum(census, 0xE0, 0xFA) >= most && census.capitalThenSmall == 0) return findEncoding("windows-1255");
    if (sum(census, 0x80, 0xAF) * 2 > census.bytes &&
        sum(census, 0x80, 0xAF) + sum(census, 0xE0, 0xF1) >= most)
        return findEncoding("IBM866");
    if (census.smallThenCapital > census.capitalThenSmall) return findEncoding("KOI8-R");
    if (census.capitalThenSmall * 2 < census.words) return nullptr;
    const bool greek = sum(census, 0xDC, 0xDF) * 30 > census.bytes && census.all[0xFF] == 0;
    return findEncoding(greek ? "windows-1253" : "windows-1251");
}

// Words of bytes above ASCII alone, which no text in windows-1252 has.
bool isFarFromLatin(const HighByteCensus& census) {
    return census.words >= 2 && census.inWords * 2 > census.bytes;
}

// Hungarian: the long umlauts are the tildes and circumflexes of windows-1252, which Portuguese and Estonian, or French and
// Welsh, have the one without the other.
bool looksHungarian(const HighByteCensus& census) {
    return census.all[0xF5] >= 1 && census.all[0xFB] >= 1 && census.all[0xE3] + census.all[0xE7] == 0;
}

// Czech: r with caron is the o with stroke of windows-1252, e with caron the i with grave, which no other language
// has both.
bool looksCzech(const HighByteCensus& census) {
    const std::size_t r = census.all[0xF8];
    const std::size_t e = census.all[0xEC];
    return r >= 2 && e >= 2 && census.all[0xE5] + census.all[0xE6] <= (r + e) / 4;
}

}  // namespace

const KnownEncoding* likelyEncoding(std::string_view bytes) {
    const HighByteCensus census = takeCensus(bytes);
    if (isFarFromLatin(census)) return alphabetOf(census);
    const bool central = census.signsInWords >= 2 && census.signsInWords * 20 > census.bytes;
    return central || looksCzech(census) || looksHungarian(census) ? findEncoding("windows-1250") : nullptr;
}

bool looksWestern(std::string_view bytes) {
    return likelyEncoding(bytes) == nullptr && !isFarFromLatin(takeCensus(bytes));
}

DiagnosticPhrase encodingSuggestion(std::string_view bytes) {
    if (const KnownEncoding* likely = likelyEncoding(bytes)) {
        return DiagnosticPhrase{DiagnosticSentence::looksLike, {std::string(likely->name)}};
    }
    return isFarFromLatin(takeCensus(bytes)) ? DiagnosticSentence::chooseFarEncoding
                                             : DiagnosticSentence::chooseNearEncoding;
}

}  // namespace olvane::gedcom
