// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Dates in words. The value is read once more, since a GedcomDate keeps no more than what sorts. Grammar is in the tables of
// DateLanguages.cpp; here is what every language has in common.

#include <olvane/gedcom/DateText.h>

#include <array>
#include <cstddef>

#include <olvane/gedcom/DateLanguageInternal.h>

namespace olvane::gedcom {

namespace {

// Years of the French Republic are written so.
std::string romanNumber(int number) {
    struct Numeral {
        int value;
        std::string_view letters;
    };
    constexpr std::array<Numeral, 9> kNumerals{
        {{100, "C"}, {90, "XC"}, {50, "L"}, {40, "XL"}, {10, "X"}, {9, "IX"}, {5, "V"}, {4, "IV"}, {1, "I"}}};
    constexpr int kLast = 399;
    if (number > kLast) return std::to_string(number);
    std::string text;
    for (const auto& [value, letters] : kNumerals) {
        for (; number >= value; number -= value) text += letters;
    }
    return text;
}

// "1731/32", "1699/1700"
std::string dualYear(int earlier) {
    constexpr int kCentury = 100;
    const int later = earlier + 1;
    if (later % kCentury == 0) return std::to_string(earlier) + "/" + std::to_string(later);
    const std::string digits = std::to_string(later % kCentury);
    return std::to_string(earlier) + (digits.size() < 2 ? "/0" : "/") + digits;
}

std::string yearText(int year, const DateLanguage& words) {
    return year < 0 ? std::to_string(-year).append(words.beforeChrist) : std::to_string(year);
}

std::string_view monthText(Calendar calendar, int month, const DateLanguage& words) {
    const std::string_view months = calendar == Calendar::frenchRepublican ? words.frenchMonths
                                    : calendar == Calendar::hebrew         ? words.hebrewMonths
                                                                           : words.months;
    return wordIn(months, static_cast<std::size_t>(month - 1));
}

std::string yearText(const ReadDate& read, const DateLanguage& words) {
    if (read.calendar == Calendar::frenchRepublican) return romanNumber(read.date.year);
    return read.earlierYear != 0 ? dualYear(read.earlierYear) : yearText(read.date.year, words);
}

// "12 Feb 1809", in the date's own calendar.
std::string dayText(const ReadDate& read, const DateLanguage& words) {
    std::string text;
    if (read.date.month == 0) {
        if (read.calendar == Calendar::frenchRepublican) text = words.frenchYear;
    } else {
        if (read.date.day != 0) text.append(std::to_string(read.date.day)).append(words.behindDay);
        text.append(monthText(read.calendar, read.date.month, words)).append(" ");
    }
    text += yearText(read, words);
    if (read.calendar == Calendar::julian) text += words.julian;
    return text;
}

bool isGregorian(const ReadDate& read) {
    return read.calendar == Calendar::gregorian;
}

// Behind a date of another calendar the Gregorian one, where it is not the same year alone.
std::string calendarText(const ReadDate& read, const DateLanguage& words) {
    std::string text = dayText(read, words);
    const bool isSame = read.calendar == Calendar::julian && read.date.month == 0;
    if (isGregorian(read) || isSame) return text;
    ReadDate gregorian;
    gregorian.date = toGregorian(read.calendar, read.date);
    return text.append(" (").append(dayText(gregorian, words)).append(")");
}

// Before the only date of a form, or the first one.
std::string_view prefixOf(DateForm form, bool isDay, const DateLanguage& words) {
    return wordIn(isDay ? words.beforeDay : words.beforeOther, static_cast<std::size_t>(form));
}

std::string_view joinOf(DateForm form, bool isDay, const DateLanguage& words) {
    return wordIn(isDay ? words.joinsDay : words.joinsOther, form == DateForm::lasting ? 1 : 0);
}

bool isInBounds(const ReadDate& read) {
    const int year = toGregorian(read.calendar, read.date).year;
    return year <= kLastYear && year >= -kLastYear;
}

// Whether a date can be put into words without losing any of it.
bool hasWords(const ReadDate& read) {
    const bool isDualBeforeChrist = read.earlierYear != 0 && read.date.year < 0;
    return !read.yearAlone && !read.shortened && !isDualBeforeChrist && isInBounds(read);
}

bool isSame(const CalendarDate& one, const CalendarDate& other) {
    return one.year == other.year && one.month == other.month && one.day == other.day;
}

bool hasWords(const WrittenDate& written) {
    const bool isDoubtedTwice = written.first.doubtful && written.form != DateForm::exact;
    if (!written.isWhole || !hasWords(written.first) || isDoubtedTwice) return false;
    return !written.last || (hasWords(*written.last) && !written.last->doubtful);
}

DateForm formOf(const WrittenDate& written) {
    if (written.form == DateForm::exact && written.first.doubtful) return DateForm::about;
    const bool isOneDate = written.last && written.form == DateForm::between &&
                           written.first.calendar == written.last->calendar &&
                           isSame(written.first.date, written.last->date);
    return isOneDate ? DateForm::exact : written.form;
}

std::string wordsOf(const WrittenDate& written, const DateLanguage& words) {
    const DateForm form = formOf(written);
    std::string text(prefixOf(form, written.first.date.day != 0, words));
    text += calendarText(written.first, words);
    if (written.last && form != DateForm::exact)
        text.append(joinOf(form, written.last->date.day != 0, words))
            .append(calendarText(*written.last, words));
    if (!written.phrase.empty()) text.append(" ").append(written.phrase);
    return text;
}

DateForm formOf(DateMark mark) {
    constexpr std::array<DateForm, 5> kForms{DateForm::exact, DateForm::about, DateForm::before,
                                             DateForm::after, DateForm::between};
    return kForms.at(static_cast<std::size_t>(mark));
}

// "about 1809", "between 1809 and 1811"; empty for a date that was not read.
std::string yearWords(const GedcomDate& date, const DateLanguage& words) {
    if (!date.isRead()) return {};
    const bool hasLast = date.lastYear != 0 && date.lastYear != date.year;
    const bool isOneYear = date.mark == DateMark::between && !hasLast;
    const DateForm form = isOneYear ? DateForm::exact : formOf(date.mark);
    std::string text(prefixOf(form, false, words));
    text += yearText(date.year, words);
    if (date.mark == DateMark::between && hasLast)
        text.append(joinOf(form, false, words)).append(yearText(date.lastYear, words));
    return text;
}

constexpr std::string_view kDash = "\xE2\x80\x93";

}  // namespace

std::string dateText(const GedcomDate& date, std::string_view language) {
    const auto written = date.isRead() ? readWrittenDate(date.written) : std::nullopt;
    return written && hasWords(*written) ? wordsOf(*written, dateLanguageOf(language))
                                         : std::string(date.written);
}

std::string displayYear(const GedcomDate& date, std::string_view language) {
    if (!date.isRead()) return std::string(date.written);
    const DateLanguage& words = dateLanguageOf(language);
    std::string text;
    if (date.mark == DateMark::about) text.push_back('~');
    if (date.mark == DateMark::before) text.push_back('<');
    if (date.mark == DateMark::after) text.push_back('>');
    text += yearText(date.year, words);
    if (date.mark == DateMark::between && date.lastYear != 0 && date.lastYear != date.year)
        text.append("-").append(yearText(date.lastYear, words));
    return text;
}

std::string yearsText(const GedcomDate& birth, const GedcomDate& death, std::string_view language) {
    const DateLanguage& words = dateLanguageOf(language);
    const std::string born = yearWords(birth, words);
    const std::string died = yearWords(death, words);
    if (born.empty() && died.empty()) return {};
    if (died.empty()) return std::string(words.born) + born;
    if (born.empty()) return std::string(words.died) + died;
    const bool isPlain = birth.mark == DateMark::exact && death.mark == DateMark::exact;
    std::string text = born;
    return text.append(isPlain ? "" : " ").append(kDash).append(isPlain ? "" : " ").append(died);
}

std::string lifeText(const GedcomDate& birth, const GedcomDate& death, std::string_view language) {
    const DateLanguage& words = dateLanguageOf(language);
    std::string text;
    if (birth.isGiven()) text.append(words.born).append(dateText(birth, language));
    if (death.isGiven())
        text.append(text.empty() ? "" : ", ").append(words.died).append(dateText(death, language));
    return text;
}

std::string placeText(std::string_view place) {
    constexpr std::string_view kSpaces = " \t\r\n";
    std::string text;
    while (!place.empty()) {
        const std::size_t end = place.find(',');
        std::string_view part = place.substr(0, end);
        place.remove_prefix(end == std::string_view::npos ? place.size() : end + 1);
        const std::size_t first = part.find_first_not_of(kSpaces);
        if (first == std::string_view::npos) continue;
        part = part.substr(first, part.find_last_not_of(kSpaces) + 1 - first);
        text.append(text.empty() ? "" : ", ").append(part);
    }
    return text;
}

}  // namespace olvane::gedcom
