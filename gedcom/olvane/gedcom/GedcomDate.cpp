// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Dates as records write them. A value is a qualifier, one or two dates, and perhaps a phrase. The reader walks over words,
// reads those that it knows and stops at the first one that it does not: a guess would be worse than the text as written.

#include <olvane/gedcom/GedcomDate.h>

#include <cstddef>
#include <optional>

#include <olvane/gedcom/CalendarDaysInternal.h>
#include <olvane/gedcom/DateReadingInternal.h>
#include <olvane/gedcom/MonthCodesInternal.h>

namespace olvane::gedcom {
namespace {

int gregorianYear(const ReadDate& read) {
    return toGregorian(read.calendar, read.date).year;
}

void store(const ReadDate& read, DateMark mark, GedcomDate& date) {
    const CalendarDate gregorian = toGregorian(read.calendar, read.date);
    if (gregorian.year > kLastYear || gregorian.year < -kLastYear) return;
    date.year = static_cast<std::int16_t>(gregorian.year);
    date.month = static_cast<std::uint8_t>(gregorian.month);
    date.day = static_cast<std::uint8_t>(gregorian.day);
    date.mark = mark == DateMark::exact && read.doubtful ? DateMark::about : mark;
    date.isYearAlone = read.yearAlone;
}

bool onlyPhraseLeft(const WordScanner& words) {
    return words.atEnd() || words.front() == '(';
}

// The date, and the end of the range if one follows the joining word.
void readRange(WordScanner& words, std::string_view joiningWord, DateMark markWithoutEnd, GedcomDate& date) {
    const auto first = takeDate(words);
    if (!first) return;
    if (words.atEnd()) return store(*first, markWithoutEnd, date);
    if (!words.skipIf({joiningWord})) return;
    const auto last = takeDate(words);
    if (!last || !onlyPhraseLeft(words)) return store(*first, DateMark::after, date);
    store(*first, DateMark::between, date);
    const int lastYear = gregorianYear(*last);
    if (date.year != 0 && lastYear >= -kLastYear && lastYear <= kLastYear) {
        date.lastYear = static_cast<std::int16_t>(lastYear);
    }
}

void readSingle(WordScanner& words, DateMark mark, GedcomDate& date) {
    const auto read = takeDate(words);
    if (read && onlyPhraseLeft(words)) store(*read, mark, date);
}

enum class Qualifier : unsigned char { none, between, from, before, after, about, interpreted };

struct QualifierWord {
    std::string_view word;
    Qualifier qualifier;
};

// The standard's words first, then what people write.
constexpr QualifierWord kQualifiers[] = {
    {"ABT", Qualifier::about},       {"BEF", Qualifier::before},    {"AFT", Qualifier::after},
    {"BET", Qualifier::between},     {"FROM", Qualifier::from},     {"TO", Qualifier::before},
    {"CAL", Qualifier::about},       {"EST", Qualifier::about},     {"INT", Qualifier::interpreted},
    {"BETWEEN", Qualifier::between}, {"BEFORE", Qualifier::before}, {"VOR", Qualifier::before},
    {"AVANT", Qualifier::before},    {"VOOR", Qualifier::before},   {"ANTES", Qualifier::before},
    {"AFTER", Qualifier::after},     {"NACH", Qualifier::after},    {"APRES", Qualifier::after},
    {"NA", Qualifier::after},        {"DOPO", Qualifier::after},    {"EFTER", Qualifier::after},
    {"ABOUT", Qualifier::about},     {"CIRCA", Qualifier::about},   {"CA", Qualifier::about},
    {"C", Qualifier::about},         {"UM", Qualifier::about},      {"ENV", Qualifier::about},
    {"ENVIRON", Qualifier::about},   {"VERS", Qualifier::about},    {"OMSTREEKS", Qualifier::about},
    {"APPROX", Qualifier::about},    {"AROUND", Qualifier::about},
};

Qualifier takeQualifier(WordScanner& words) {
    if (!isWordLetter(words.front())) return Qualifier::none;
    const DateWord word(words.peek());
    for (const QualifierWord& known : kQualifiers) {
        if (known.word != word.text()) continue;
        words.skip();
        return known.qualifier;
    }
    return Qualifier::none;
}

// "1850-1860", which the standard has no word for.
bool readYearRange(std::string_view word, GedcomDate& date) {
    constexpr std::size_t kYearDigits = 4;
    if (word.size() != 2 * kYearDigits + 1 || word[kYearDigits] != '-') return false;
    const auto first = wholeNumber(word.substr(0, kYearDigits), kYearDigits);
    const auto last = wholeNumber(word.substr(kYearDigits + 1), kYearDigits);
    if (!first || !last || *first == 0 || *last < *first) return false;
    date.year = static_cast<std::int16_t>(*first);
    date.lastYear = static_cast<std::int16_t>(*last);
    date.mark = DateMark::between;
    return true;
}

// Takes the signs off that some programs set around a date or before it: "<1590>", "[1590]" and "~1590" are about that
// year, "<1590" is before it and ">1590" after it.
DateMark takeSigns(std::string_view& text) {
    while (!text.empty() && isSpace(text.front())) text.remove_prefix(1);
    while (!text.empty() && isSpace(text.back())) text.remove_suffix(1);
    if (text.size() < 2) return DateMark::exact;
    const char first = text.front();
    const char last = text.back();
    if ((first == '<' && last == '>') || (first == '[' && last == ']')) {
        text = text.substr(1, text.size() - 2);
        return DateMark::about;
    }
    if (first != '<' && first != '>' && first != '~') return DateMark::exact;
    text.remove_prefix(1);
    if (first == '~') return DateMark::about;
    return first == '<' ? DateMark::before : DateMark::after;
}

// Number of two or four digits, or 0 where other characters stand.
int fixedNumber(std::string_view digits) {
    int number = 0;
    for (const char c : digits) {
        if (!isDigit(c)) return 0;
        number = number * 10 + (c - '0');
    }
    return number;
}

// "24 MAY 1819", "MAY 1819" and "1819", behind ABT, BEF, AFT or nothing: most dates of most files, read without looking at
// words. False, with the date as it was, for any other form.
bool readStandardDate(std::string_view text, GedcomDate& date) {
    constexpr std::size_t kYear = 4;
    constexpr std::size_t kMonthAndSpace = 4;
    DateMark mark = DateMark::exact;
    if (text.size() >= 2 * kYear && text[3] == ' ') {
        const std::uint32_t word = code(text.substr(0, 3));
        if (word == code("ABT")) mark = DateMark::about;
        if (word == code("BEF")) mark = DateMark::before;
        if (word == code("AFT")) mark = DateMark::after;
        if (mark != DateMark::exact) text.remove_prefix(kMonthAndSpace);
    }
    if (text.size() < kYear) return false;
    CalendarDate read = {fixedNumber(text.substr(text.size() - kYear)), 0, 0};
    text.remove_suffix(kYear);
    if (text.size() >= kMonthAndSpace && text.back() == ' ') {
        read.month = placeIn(kMonths, code(text.substr(text.size() - kMonthAndSpace, 3)));
        if (read.month == 0) return false;
        text.remove_suffix(kMonthAndSpace);
        if (!text.empty()) {
            if (text.size() > 3 || text.back() != ' ') return false;
            read.day = fixedNumber(text.substr(0, text.size() - 1));
            if (read.day < 1 || read.day > daysInMonth(Calendar::gregorian, read.year, read.month))
                return false;
            text = {};
        }
    }
    if (!text.empty() || read.year == 0) return false;
    store({Calendar::gregorian, read, false, false}, mark, date);
    return true;
}

}  // namespace

GedcomDate parseGedcomDate(std::string_view written) {
    GedcomDate date;
    date.written = written;
    if (readStandardDate(written, date)) return date;
    std::string_view text = written;
    const DateMark signs = takeSigns(text);
    WordScanner words(text);
    const Qualifier qualifier = signs != DateMark::exact ? Qualifier::none : takeQualifier(words);
    switch (qualifier) {
        case Qualifier::between:
            readRange(words, "AND", DateMark::after, date);
            break;
        case Qualifier::from:
            readRange(words, "TO", DateMark::after, date);
            break;
        case Qualifier::before:
            readSingle(words, DateMark::before, date);
            break;
        case Qualifier::after:
            readSingle(words, DateMark::after, date);
            break;
        case Qualifier::about:
            readSingle(words, DateMark::about, date);
            break;
        case Qualifier::interpreted:
        case Qualifier::none:
            if (!readYearRange(text, date)) readSingle(words, signs, date);
    }
    return date;
}

}  // namespace olvane::gedcom
