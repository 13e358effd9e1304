// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Dates as records write them. A value is a qualifier, one or two dates, and perhaps a phrase; a date is a
// calendar, a day, a month and a year, of which only the year must be there. The reader walks over words,
// takes what it knows and gives up on the first word that it does not: a guess would be worse than the text
// as it stands.

#include <olvane/gedcom/GedcomDate.h>

#include <algorithm>
#include <array>
#include <cstddef>
#include <initializer_list>
#include <optional>

#include <olvane/gedcom/CalendarDaysInternal.h>

namespace olvane::gedcom {
namespace {

constexpr int kLastYear = 9999;
constexpr std::size_t kLongestWord = 16;

// A word in capitals; words that are longer than any known one are empty.
class Word {
public:
    explicit Word(std::string_view raw) {
        if (raw.size() > kLongestWord) return;
        for (const char c : raw)
            letters_[length_++] = c >= 'a' && c <= 'z' ? static_cast<char>(c - 'a' + 'A') : c;
    }
    std::string_view text() const { return {letters_.data(), length_}; }
    // Without the point of an abbreviation.
    std::string_view stem() const {
        return length_ > 0 && letters_[length_ - 1] == '.' ? text().substr(0, length_ - 1) : text();
    }
    bool isOneOf(std::initializer_list<std::string_view> choices) const {
        return std::find(choices.begin(), choices.end(), stem()) != choices.end();
    }

private:
    std::array<char, kLongestWord> letters_{};
    std::size_t length_ = 0;
};

bool isSpace(char c) {
    return c == ' ' || c == '\t' || c == '\n' || c == '\r';
}

bool isDigit(char c) {
    return c >= '0' && c <= '9';
}

// Words of a value from left to right.
class Words {
public:
    explicit Words(std::string_view text) : rest_(text) { findWord(); }

    bool atEnd() const { return rest_.empty(); }
    char front() const { return rest_.empty() ? '\0' : rest_.front(); }
    std::string_view peek() const { return rest_.substr(0, wordLength_); }
    std::string_view rest() const { return rest_; }
    void skip() { drop(wordLength_); }
    void drop(std::size_t bytes) {
        rest_.remove_prefix(bytes);
        findWord();
    }
    // No choice begins with a digit.
    bool skipIf(std::initializer_list<std::string_view> choices) {
        if (isDigit(front()) || !Word(peek()).isOneOf(choices)) return false;
        skip();
        return true;
    }

private:
    void findWord() {
        while (!rest_.empty() && isSpace(rest_.front())) rest_.remove_prefix(1);
        wordLength_ = 0;
        while (wordLength_ < rest_.size() && !isSpace(rest_[wordLength_])) ++wordLength_;
    }

    std::string_view rest_;
    std::size_t wordLength_ = 0;
};

std::optional<int> wholeNumber(std::string_view digits, std::size_t longest) {
    if (digits.empty() || digits.size() > longest || !std::all_of(digits.begin(), digits.end(), isDigit))
        return {};
    int number = 0;
    for (const char c : digits) number = number * 10 + (c - '0');
    return number;
}

constexpr std::size_t kLongestMonthCode = 4;

// Up to four letters as a number, in capitals; 0 for more.
constexpr std::uint32_t code(std::string_view letters) {
    if (letters.size() > kLongestMonthCode) return 0;
    std::uint32_t packed = 0;
    for (const char c : letters) {
        packed = packed << 8 | static_cast<unsigned char>(c >= 'a' && c <= 'z' ? c - 'a' + 'A' : c);
    }
    return packed;
}

constexpr std::array kMonths = {code("JAN"), code("FEB"), code("MAR"), code("APR"), code("MAY"), code("JUN"),
                                code("JUL"), code("AUG"), code("SEP"), code("OCT"), code("NOV"), code("DEC")};
constexpr std::array kFrenchMonths = {code("VEND"), code("BRUM"), code("FRIM"), code("NIVO"), code("PLUV"),
                                      code("VENT"), code("GERM"), code("FLOR"), code("PRAI"), code("MESS"),
                                      code("THER"), code("FRUC"), code("COMP")};
constexpr std::array kHebrewMonths = {code("TSH"), code("CSH"), code("KSL"), code("TVT"), code("SHV"),
                                      code("ADR"), code("ADS"), code("NSN"), code("IYR"), code("SVN"),
                                      code("TMZ"), code("AAV"), code("ELL")};
constexpr std::array<std::string_view, 12> kLongMonths = {"JANUARY",   "FEBRUARY", "MARCH",    "APRIL",
                                                          "MAY",       "JUNE",     "JULY",     "AUGUST",
                                                          "SEPTEMBER", "OCTOBER",  "NOVEMBER", "DECEMBER"};

// Place of the name in the list from 1; 0 if it is not there.
template <typename Name, std::size_t N>
int placeIn(const std::array<Name, N>& names, Name name) {
    const auto found = std::find(names.begin(), names.end(), name);
    return found == names.end() ? 0 : static_cast<int>(found - names.begin()) + 1;
}

int monthOf(Calendar calendar, std::string_view word) {
    if (!word.empty() && word.back() == '.') word.remove_suffix(1);
    switch (calendar) {
        case Calendar::gregorian:
        case Calendar::julian: {
            const std::uint32_t letters = code(word);
            if (letters == code("SEPT")) return 9;
            const int place = letters == 0 ? 0 : placeIn(kMonths, letters);
            return place != 0 || word.size() <= 3 ? place : placeIn(kLongMonths, Word(word).text());
        }
        case Calendar::frenchRepublican:
            return placeIn(kFrenchMonths, code(word));
        case Calendar::hebrew:
            return placeIn(kHebrewMonths, code(word));
    }
    return 0;
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
std::optional<Calendar> takeCalendar(Words& words) {
    const std::string_view rest = words.rest();
    if (rest.starts_with("@#D") || rest.starts_with("@#d")) {
        const std::size_t end = rest.find('@', 3);
        if (end == std::string_view::npos) return {};
        const auto calendar = calendarNamed(Word(rest.substr(3, end - 3)).text());
        words.drop(end + 1);
        return calendar;
    }
    const std::string_view word = words.peek();
    const auto calendar = word.size() > kLongestMonthCode ? calendarNamed(Word(word).text()) : std::nullopt;
    if (!calendar) return Calendar::gregorian;
    words.skip();
    return calendar;
}

// A date, and what is doubtful about it.
struct ReadDate {
    Calendar calendar = Calendar::gregorian;
    CalendarDate date;
    bool doubtful = false;
};

// A year with its second form: "1731/32" is the year 1732, "1699/00" 1700. What does not fit makes it
// doubtful.
bool readDualYear(std::string_view first, std::string_view second, ReadDate& result) {
    const auto year = wholeNumber(first, 4);
    const auto later = wholeNumber(second, 4);
    if (!year || !later) return false;
    const int modulus = second.size() <= 2 ? (second.size() == 1 ? 10 : 100) : 10000;
    const bool fits = (*year + 1) % modulus == *later;
    result.date.year = fits ? *year + 1 : *year;
    result.doubtful = !fits;
    return true;
}

bool takeYear(Words& words, ReadDate& result) {
    std::string_view word = words.peek();
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

bool takeEpoch(Words& words, ReadDate& result) {
    if (words.atEnd() || !words.skipIf({"BC", "B.C", "BCE", "B.C.E"})) return true;
    const bool counted = result.calendar == Calendar::gregorian || result.calendar == Calendar::julian;
    result.date.year = -result.date.year;
    return counted;
}

// A day that the month does not have is left out; the month and year still tell something.
void dropImpossibleDay(ReadDate& result) {
    if (result.date.day < 1 ||
        result.date.day > daysInMonth(result.calendar, result.date.year, result.date.month)) {
        result.date.day = 0;
    }
}

// "1819-05-24" or "1819-05".
bool readIsoDate(std::string_view word, ReadDate& result) {
    const auto year = word.size() > 4 && word[4] == '-' ? wholeNumber(word.substr(0, 4), 4) : std::nullopt;
    const auto month = year ? wholeNumber(word.substr(5, 2), 2) : std::nullopt;
    if (!month || *month < 1 || *month > 12 || *year == 0) return false;
    result.date = {*year, *month, 0};
    if (word.size() == 7) return true;
    const auto day = word.size() == 10 && word[7] == '-' ? wholeNumber(word.substr(8, 2), 2) : std::nullopt;
    if (!day) return false;
    result.date.day = *day;
    dropImpossibleDay(result);
    return true;
}

// [calendar] [[day] month] year [B.C.]
std::optional<ReadDate> takeDate(Words& words) {
    ReadDate result;
    const auto calendar = takeCalendar(words);
    if (!calendar) return {};
    result.calendar = *calendar;
    if (readIsoDate(words.peek(), result)) {
        words.skip();
        return result;
    }
    const Words start = words;
    if (const auto day = isDigit(words.front()) ? wholeNumber(words.peek(), 2) : std::nullopt) {
        words.skip();
        result.date.month = monthOf(result.calendar, words.peek());
        result.date.day = *day;
        if (result.date.month == 0) {
            words = start;
            result.date.day = 0;
        }
    } else {
        result.date.month = monthOf(result.calendar, words.peek());
    }
    if (result.date.month != 0) words.skip();
    if (!takeYear(words, result) || !takeEpoch(words, result)) return {};
    dropImpossibleDay(result);
    return result;
}

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
}

bool onlyPhraseLeft(const Words& words) {
    return words.atEnd() || words.front() == '(';
}

// The date, and the end of the range if one follows the joining word.
void readRange(Words& words, std::string_view joiningWord, DateMark markWithoutEnd, GedcomDate& date) {
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

void readSingle(Words& words, DateMark mark, GedcomDate& date) {
    const auto read = takeDate(words);
    if (read && onlyPhraseLeft(words)) store(*read, mark, date);
}

std::string yearText(int year) {
    return year < 0 ? std::to_string(-year) + " BC" : std::to_string(year);
}

// Appends the number in so many digits at least.
void appendPadded(std::string& text, int number, std::size_t digits) {
    const std::string plain = std::to_string(number);
    if (plain.size() < digits) text.append(digits - plain.size(), '0');
    text.append(plain);
}

// Years B.C. are turned round, so that they sort: "-9955" is 44 B.C.
std::string sortableDate(const CalendarDate& date) {
    std::string text;
    if (date.year < 0) text.push_back('-');
    appendPadded(text, date.year < 0 ? kLastYear + date.year : date.year, 4);
    for (const int part : {date.month, date.day}) {
        if (part == 0) break;
        text.push_back('-');
        appendPadded(text, part, 2);
    }
    return text;
}

// The day, month or year before, as fine as the date is.
CalendarDate justBefore(const CalendarDate& date) {
    CalendarDate before =
        previousDay({date.year, date.month == 0 ? 1 : date.month, date.day == 0 ? 1 : date.day});
    if (date.day == 0) before.day = 0;
    if (date.month == 0) before.month = 0;
    return before;
}

}  // namespace

GedcomDate parseGedcomDate(std::string_view written) {
    GedcomDate date;
    date.written = written;
    Words words(written);
    if (words.skipIf({"BET", "BETWEEN"})) {
        readRange(words, "AND", DateMark::after, date);
    } else if (words.skipIf({"FROM"})) {
        readRange(words, "TO", DateMark::after, date);
    } else if (words.skipIf({"TO", "BEF", "BEFORE"})) {
        readSingle(words, DateMark::before, date);
    } else if (words.skipIf({"AFT", "AFTER"})) {
        readSingle(words, DateMark::after, date);
    } else if (words.skipIf({"ABT", "ABOUT", "CAL", "EST", "CIRCA", "CA", "C"})) {
        readSingle(words, DateMark::about, date);
    } else {
        words.skipIf({"INT"});
        readSingle(words, DateMark::exact, date);
    }
    return date;
}

std::string sortText(const GedcomDate& date) {
    if (!date.isRead()) return {};
    const CalendarDate day = {date.year, date.month, date.day};
    if (date.mark == DateMark::after) return sortableDate(day) + "~";
    if (date.mark == DateMark::before && date.year > -kLastYear) return sortableDate(justBefore(day)) + "~";
    return sortableDate(day);
}

std::string displayYear(const GedcomDate& date) {
    if (!date.isRead()) return std::string(date.written);
    std::string text;
    if (date.mark == DateMark::about) text.push_back('~');
    if (date.mark == DateMark::before) text.push_back('<');
    if (date.mark == DateMark::after) text.push_back('>');
    text.append(yearText(date.year));
    if (date.mark == DateMark::between && date.lastYear != 0 && date.lastYear != date.year) {
        text.append("-").append(yearText(date.lastYear));
    }
    return text;
}

}  // namespace olvane::gedcom
