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
#include <olvane/gedcom/WrittenDateInternal.h>

namespace olvane::gedcom {
namespace {

DateMark markOf(DateForm form) {
    switch (form) {
        case DateForm::about:
        case DateForm::calculated:
        case DateForm::estimated:
            return DateMark::about;
        case DateForm::before:
        case DateForm::until:
            return DateMark::before;
        case DateForm::after:
        case DateForm::since:
            return DateMark::after;
        case DateForm::between:
        case DateForm::lasting:
            return DateMark::between;
        case DateForm::exact:
            break;
    }
    return DateMark::exact;
}

bool isInBounds(const CalendarDate& date) {
    return date.year <= kLastYear && date.year >= -kLastYear;
}

void store(const ReadDate& read, DateMark mark, GedcomDate& date) {
    const CalendarDate gregorian = toGregorian(read.calendar, read.date);
    if (!isInBounds(gregorian)) return;
    date.year = static_cast<std::int16_t>(gregorian.year);
    date.month = static_cast<std::uint8_t>(gregorian.month);
    date.day = static_cast<std::uint8_t>(gregorian.day);
    date.mark = mark == DateMark::exact && read.doubtful ? DateMark::about : mark;
    date.isYearAlone = read.yearAlone;
}

void store(const WrittenDate& written, GedcomDate& date) {
    store(written.first, markOf(written.form), date);
    if (!written.last || date.year == 0) return;
    const CalendarDate last = toGregorian(written.last->calendar, written.last->date);
    if (isInBounds(last)) date.lastYear = static_cast<std::int16_t>(last.year);
}

bool onlyPhraseLeft(const WordScanner& words) {
    return words.atEnd() || words.front() == '(';
}

// The date, and the end of the range if one follows the joining word.
std::optional<WrittenDate> readRange(WordScanner& words, std::string_view joiningWord, DateForm withoutEnd,
                                     DateForm withEnd) {
    const auto first = takeDate(words);
    if (!first) return {};
    WrittenDate date{withoutEnd, *first, {}, {}, true};
    if (words.atEnd()) return date;
    if (!words.skipIf({joiningWord})) return {};
    const auto last = takeDate(words);
    date.isWhole = last && onlyPhraseLeft(words);
    if (!date.isWhole) return date;
    date.form = withEnd;
    date.last = last;
    date.phrase = words.rest();
    return date;
}

std::optional<WrittenDate> readSingle(WordScanner& words, DateForm form) {
    const auto read = takeDate(words);
    if (!read || !onlyPhraseLeft(words)) return {};
    return WrittenDate{form, *read, {}, words.rest(), true};
}

enum class Qualifier : unsigned char {
    none,
    between,
    from,
    to,
    before,
    after,
    about,
    calculated,
    estimated,
    interpreted
};

struct QualifierWord {
    std::string_view word;
    Qualifier qualifier;
};

// The standard's words first, then what people write.
constexpr QualifierWord kQualifiers[] = {
    {"ABT", Qualifier::about},       {"BEF", Qualifier::before},    {"AFT", Qualifier::after},
    {"BET", Qualifier::between},     {"FROM", Qualifier::from},     {"TO", Qualifier::to},
    {"CAL", Qualifier::calculated},  {"EST", Qualifier::estimated}, {"INT", Qualifier::interpreted},
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
std::optional<WrittenDate> readYearRange(std::string_view word) {
    constexpr std::size_t kYearDigits = 4;
    if (word.size() != 2 * kYearDigits + 1 || word[kYearDigits] != '-') return {};
    const auto first = wholeNumber(word.substr(0, kYearDigits), kYearDigits);
    const auto last = wholeNumber(word.substr(kYearDigits + 1), kYearDigits);
    if (!first || !last || *first == 0 || *last < *first) return {};
    WrittenDate date{DateForm::between, {}, ReadDate{}, {}, true};
    date.first.date.year = *first;
    date.last->date.year = *last;
    return date;
}

// Takes the signs off that some programs set around a date or before it: "<1590>", "[1590]" and "~1590" are about that
// year, "<1590" is before it and ">1590" after it.
DateForm takeSigns(std::string_view& text) {
    while (!text.empty() && isSpace(text.front())) text.remove_prefix(1);
    while (!text.empty() && isSpace(text.back())) text.remove_suffix(1);
    if (text.size() < 2) return DateForm::exact;
    const char first = text.front();
    const char last = text.back();
    if ((first == '<' && last == '>') || (first == '[' && last == ']')) {
        text = text.substr(1, text.size() - 2);
        return DateForm::about;
    }
    if (first != '<' && first != '>' && first != '~') return DateForm::exact;
    text.remove_prefix(1);
    if (first == '~') return DateForm::about;
    return first == '<' ? DateForm::before : DateForm::after;
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

std::optional<WrittenDate> readWrittenDate(std::string_view text) {
    const DateForm signs = takeSigns(text);
    WordScanner words(text);
    const Qualifier qualifier = signs != DateForm::exact ? Qualifier::none : takeQualifier(words);
    switch (qualifier) {
        case Qualifier::between:
            return readRange(words, "AND", DateForm::after, DateForm::between);
        case Qualifier::from:
            return readRange(words, "TO", DateForm::since, DateForm::lasting);
        case Qualifier::to:
            return readSingle(words, DateForm::until);
        case Qualifier::before:
            return readSingle(words, DateForm::before);
        case Qualifier::after:
            return readSingle(words, DateForm::after);
        case Qualifier::about:
            return readSingle(words, DateForm::about);
        case Qualifier::calculated:
            return readSingle(words, DateForm::calculated);
        case Qualifier::estimated:
            return readSingle(words, DateForm::estimated);
        case Qualifier::interpreted:
        case Qualifier::none:
            break;
    }
    const auto years = readYearRange(text);
    return years ? years : readSingle(words, signs);
}

GedcomDate parseGedcomDate(std::string_view written) {
    GedcomDate date;
    date.written = written;
    if (readStandardDate(written, date)) return date;
    if (const auto read = readWrittenDate(written)) store(*read, date);
    return date;
}

}  // namespace olvane::gedcom
