// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A date in words: calendar, weekday, day, month, year and era, of which only the year must be there. Each step looks at
// the next words, skips those that are its own, and leaves the rest to the step behind it.

#include <array>
#include <string>

#include <olvane/gedcom/DateReadingInternal.h>
#include <olvane/gedcom/MonthCodesInternal.h>

namespace olvane::gedcom {

namespace {

constexpr std::array kFrenchMonths = {code("VEND"), code("BRUM"), code("FRIM"), code("NIVO"), code("PLUV"),
                                      code("VENT"), code("GERM"), code("FLOR"), code("PRAI"), code("MESS"),
                                      code("THER"), code("FRUC"), code("COMP")};
constexpr std::array kHebrewMonths = {code("TSH"), code("CSH"), code("KSL"), code("TVT"), code("SHV"),
                                      code("ADR"), code("ADS"), code("NSN"), code("IYR"), code("SVN"),
                                      code("TMZ"), code("AAV"), code("ELL")};

int monthOf(Calendar calendar, std::string_view word) {
    if (!word.empty() && word.back() == '.') word.remove_suffix(1);
    switch (calendar) {
        case Calendar::gregorian:
        case Calendar::julian: {
            const std::uint32_t letters = code(word);
            const int place = letters == 0 ? 0 : placeIn(kMonths, letters);
            return place != 0 ? place : monthNamed(DateWord(word));
        }
        case Calendar::frenchRepublican:
            return placeIn(kFrenchMonths, code(word));
        case Calendar::hebrew:
            return placeIn(kHebrewMonths, code(word));
    }
    return 0;
}

std::string capitals(std::string_view word) {
    constexpr std::size_t kLongest = 16;
    std::string text(word.substr(0, kLongest));
    for (char& c : text) {
        if (c >= 'a' && c <= 'z') c = static_cast<char>(c - 'a' + 'A');
    }
    return text;
}

std::optional<Calendar> calendarNamed(std::string_view name) {
    if (name == "GREGORIAN") return Calendar::gregorian;
    if (name == "JULIAN") return Calendar::julian;
    if (name == "FRENCH R" || name == "FRENCH_R") return Calendar::frenchRepublican;
    if (name == "HEBREW") return Calendar::hebrew;
    return {};
}

// Takes a calendar where one stands: "@#DJULIAN@", perhaps close to the next word, or "JULIAN".
// Nothing for a calendar that is not known.
std::optional<Calendar> takeCalendar(WordScanner& words) {
    const std::string_view rest = words.rest();
    if (rest.starts_with("@#D") || rest.starts_with("@#d")) {
        const std::size_t end = rest.find('@', 3);
        if (end == std::string_view::npos) return {};
        const auto calendar = calendarNamed(capitals(rest.substr(3, end - 3)));
        words.drop(end + 1);
        return calendar;
    }
    const std::string_view word = words.peek();
    const auto calendar = word.size() > kLongestMonthCode ? calendarNamed(capitals(word)) : std::nullopt;
    if (!calendar) return Calendar::gregorian;
    words.skip();
    return calendar;
}

// A year with its second form: "1731/32" is the year 1732, "1699/00" 1700. What does not fit makes it
// doubtful.
bool readDualYear(std::string_view first, std::string_view second, ReadDate& result) {
    constexpr std::size_t kFewestDigits = 3;
    if (first.size() < kFewestDigits) return false;
    const auto year = wholeNumber(first, 4);
    const auto later = wholeNumber(second, 4);
    if (!year || !later) return false;
    const int modulus = second.size() <= 2 ? (second.size() == 1 ? 10 : 100) : 10000;
    const bool fits = (*year + 1) % modulus == *later;
    result.date.year = fits ? *year + 1 : *year;
    result.earlierYear = fits ? *year : 0;
    result.doubtful = !fits;
    result.shortened = !fits;
    return true;
}

bool takeYear(WordScanner& words, ReadDate& result) {
    std::string_view word = words.peek();
    while (word.size() > 1 && (word.back() == '.' || word.back() == ',')) word.remove_suffix(1);
    if (word.size() > 1 && word.back() == '?') {
        result.doubtful = true;
        word.remove_suffix(1);
    }
    const std::size_t slash = word.find('/');
    if (slash != std::string_view::npos) {
        if (!readDualYear(word.substr(0, slash), word.substr(slash + 1), result)) return false;
    } else {
        const auto year = wholeNumber(word, 4);
        if (!year) return false;
        result.date.year = *year;
    }
    words.skip();
    return result.date.year != 0;
}

// The letters of the next `count` words, without what stands between them; empty if a digit or a phrase is among them.
std::string lettersAhead(WordScanner words, int count) {
    constexpr std::size_t kLongest = 16;
    std::string letters;
    for (int i = 0; i < count; ++i, words.skip()) {
        if (words.atEnd()) return {};
        for (const char c : words.peek()) {
            if (isDigit(c) || c == '(' || letters.size() == kLongest) return {};
            if (isWordLetter(c)) letters += c >= 'a' && c <= 'z' ? static_cast<char>(c - 'a' + 'A') : c;
        }
    }
    return letters;
}

// False for a year before Christ in a calendar that has none.
bool takeEra(WordScanner& words, ReadDate& result) {
    constexpr int kMostWords = 3;
    for (int count = kMostWords; count > 0 && !words.atEnd(); --count) {
        const Era era = eraNamed(lettersAhead(words, count));
        if (era == Era::none) continue;
        for (int i = 0; i < count; ++i) words.skip();
        if (era == Era::afterChrist) return true;
        result.date.year = -result.date.year;
        return result.calendar == Calendar::gregorian || result.calendar == Calendar::julian;
    }
    return true;
}

// A day's number of one or two digits, with a point or an ending behind it: "24", "24.", "1st", "1er".
std::optional<int> takeDay(WordScanner& words) {
    std::string_view word = words.peek();
    if (!isDigit(words.front())) return {};
    while (isSeparator(word.back()) || word.back() == ',') word.remove_suffix(1);
    const auto day = wholeNumber(word, 2);
    if (!day) return {};
    const bool isOrdinal = words.rest().size() > word.size() && isWordLetter(words.rest()[word.size()]);
    words.skip();
    if (isOrdinal) words.skipIf({"ST", "ND", "RD", "TH", "ER", "RE", "E", "O"});
    if (isOrdinal && (words.peek() == "\u00BA" || words.peek() == "\u00B0")) words.skip();
    return day;
}

// "7bre" to "10bre" are September to December.
int takeMonth(WordScanner& words, Calendar calendar) {
    WordScanner ahead = words;
    const auto number = isDigit(words.front()) ? wholeNumber(words.peek(), 2) : std::nullopt;
    ahead.skip();
    if (isDigit(words.front()) && !number) return 0;
    const bool counted = number && *number >= 7 && *number <= 10 && ahead.skipIf({"BRE"});
    const int month = counted ? *number + 2 : monthOf(calendar, words.peek());
    if (month != 0) words = ahead;
    return month;
}

// "of" and the like, between a day, a month and a year.
bool skipParticle(WordScanner& words) {
    return words.skipIf({"OF", "DE", "DEL", "DI", "DO"});
}

// "May 24, 1819": the day behind the month, if a year follows it.
void takeDayBehindMonth(WordScanner& words, ReadDate& result) {
    WordScanner ahead = words;
    const auto day = takeDay(ahead);
    if (!day || !isDigit(ahead.front())) return;
    result.date.day = *day;
    words = ahead;
}

// [day] month, or month day; nothing where no month is.
void takeDayAndMonth(WordScanner& words, ReadDate& result) {
    const WordScanner start = words;
    const auto day = takeDay(words);
    result.date.month = takeMonth(words, result.calendar);
    if (result.date.month == 0 && day && skipParticle(words)) {
        result.date.month = takeMonth(words, result.calendar);
    }
    if (result.date.month == 0) {
        words = start;
        return;
    }
    if (day) result.date.day = *day;
    if (!isDigit(words.front())) skipParticle(words);
    if (!day) takeDayBehindMonth(words, result);
}

// "mar. 24 mai 1819" is a Tuesday.
bool standsBeforeDayAndMonth(WordScanner words, Calendar calendar) {
    words.skip();
    ReadDate numeric;
    if (takeNumericDate(words, numeric)) return true;
    if (!takeDay(words)) return false;
    skipParticle(words);
    return takeMonth(words, calendar) != 0;
}

// What may stand before a day: a weekday, with or without an article; AD before a year.
void skipWordsAhead(WordScanner& words, Calendar calendar) {
    if (monthOf(calendar, words.peek()) != 0 && !standsBeforeDayAndMonth(words, calendar)) return;
    if (isWeekday(DateWord(words.peek()))) {
        words.skip();
        words.skipIf({"DEN", "LE", "EL", "IL", "THE"});
    } else {
        words.skipIf({"AD", "A.D"});
    }
}

}  // namespace

std::optional<ReadDate> takeDate(WordScanner& words) {
    ReadDate result;
    const auto calendar = takeCalendar(words);
    if (!calendar) return {};
    result.calendar = *calendar;
    const bool plain = result.calendar == Calendar::gregorian || result.calendar == Calendar::julian;
    if (readIsoDate(words.peek(), result)) {
        words.skip();
        return result;
    }
    if (plain && isWordLetter(words.front())) skipWordsAhead(words, result.calendar);
    if (plain && takeNumericDate(words, result)) {
        return takeEra(words, result) ? std::optional(result) : std::nullopt;
    }
    takeDayAndMonth(words, result);
    if (!takeYear(words, result) || !takeEra(words, result)) return {};
    dropImpossibleDay(result);
    return result;
}

}  // namespace olvane::gedcom
