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
#include <olvane/gedcom/DateWordsInternal.h>

namespace olvane::gedcom {
namespace {

constexpr bool isSpace(char c) {
    return c == ' ' || c == '\t' || c == '\n' || c == '\r';
}

constexpr bool isDigit(char c) {
    return c >= '0' && c <= '9';
}

constexpr bool isWordLetter(char c) {
    return (c >= 'A' && c <= 'Z') || (c >= 'a' && c <= 'z') || static_cast<unsigned char>(c) >= 0x80;
}

constexpr bool isSeparator(char c) {
    return c == '.' || c == '-' || c == '/';
}

enum class CharacterSort : unsigned char { other, space, letter, digit, separator };

constexpr auto kSorts = [] {
    std::array<CharacterSort, 256> sorts{};
    for (std::size_t c = 0; c < sorts.size(); ++c) {
        const char character = static_cast<char>(c);
        if (isSpace(character)) sorts[c] = CharacterSort::space;
        if (isDigit(character)) sorts[c] = CharacterSort::digit;
        if (isWordLetter(character)) sorts[c] = CharacterSort::letter;
        if (isSeparator(character)) sorts[c] = CharacterSort::separator;
    }
    return sorts;
}();

// Words of a value from left to right. A word ends at a space, and between letters and digits: "12MAY1900", "c.1590",
// "972B.C.", "24-JAN-1915".
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
        if (isDigit(front()) || !DateWord(peek()).isOneOf(choices)) return false;
        skip();
        return true;
    }

private:
    void findWord() {
        while (!rest_.empty() && isSpace(rest_.front())) rest_.remove_prefix(1);
        CharacterSort last = CharacterSort::space;  // of the last letter or digit
        bool isClose = false;  // it stands here but for one separator, or one behind a point
        for (wordLength_ = 0; wordLength_ < rest_.size(); ++wordLength_) {
            const CharacterSort sort = kSorts[static_cast<unsigned char>(rest_[wordLength_])];
            if (sort == CharacterSort::space) return;
            if (sort == CharacterSort::letter || sort == CharacterSort::digit) {
                if (isClose && sort != last) return;
                last = sort;
                isClose = true;
            } else {
                isClose = isClose && sort == CharacterSort::separator &&
                          (!isSeparator(rest_[wordLength_ - 1]) || rest_[wordLength_ - 1] == '.');
            }
        }
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
std::optional<Calendar> takeCalendar(Words& words) {
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

// A date, and what is doubtful about it.
struct ReadDate {
    Calendar calendar = Calendar::gregorian;
    CalendarDate date;
    bool doubtful = false;
    bool yearAlone = false;  // day and month are there, in an order that is not certain
};

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
    result.doubtful = !fits;
    return true;
}

bool takeYear(Words& words, ReadDate& result) {
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

// The letters of up to so many words, without what stands between them; empty if a digit or a phrase is among them.
std::string lettersAhead(Words words, int count) {
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
bool takeEra(Words& words, ReadDate& result) {
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

// A day that the month does not have is left out; the month and year still say something.
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

// Numbers between separators of one sort: "06.05.1900", "24/01/1915", "1915/1/24", "01/1915".
struct NumberGroups {
    std::array<int, 3> values{};
    std::array<std::size_t, 3> digits{};
    std::size_t count = 0;
    char separator = '\0';
};

std::optional<NumberGroups> readGroups(std::string_view word) {
    NumberGroups groups;
    while (groups.count < groups.values.size()) {
        std::size_t length = 0;
        while (length < word.size() && isDigit(word[length])) ++length;
        const auto number = wholeNumber(word.substr(0, length), 4);
        if (!number) return {};
        groups.values[groups.count] = *number;
        groups.digits[groups.count++] = length;
        word.remove_prefix(length);
        if (word.empty() || (word == "." && groups.count == 3)) break;
        if (!isSeparator(word.front()) || (groups.separator != '\0' && groups.separator != word.front()))
            return {};
        groups.separator = word.front();
        word.remove_prefix(1);
    }
    return word.size() <= 1 && groups.count >= 2 ? std::optional(groups) : std::nullopt;
}

// Points are set where the day comes first. Strokes are set in both orders, so the day comes first only where the other
// order is impossible; else, and where no order is possible, the year alone is certain. A 0 is written for what is not known.
bool readDayMonthYear(const NumberGroups& groups, ReadDate& result) {
    const auto [first, second, year] = groups.values;
    const bool secondIsMonth = second >= 1 && second <= 12;
    const bool either = groups.separator != '.' && first <= 12 && first != second;
    if (year == 0 || first > 31 || second > 31) return false;
    result.yearAlone = !secondIsMonth || either;
    result.date = result.yearAlone ? CalendarDate{year, 0, 0} : CalendarDate{year, second, first};
    if (!result.yearAlone) dropImpossibleDay(result);
    return true;
}

bool readNumericDate(std::string_view word, ReadDate& result) {
    const auto groups = readGroups(word);
    if (!groups) return false;
    const auto& values = groups->values;
    const auto& digits = groups->digits;
    if (groups->count == 2) {
        const bool isMonthAndYear =
            digits[0] <= 2 && digits[1] >= 3 && values[0] >= 1 && values[0] <= 12 && values[1] != 0;
        if (isMonthAndYear) result.date = {values[1], values[0], 0};
        return isMonthAndYear;
    }
    if (digits[0] <= 2 && digits[1] <= 2 && digits[2] >= 3) return readDayMonthYear(*groups, result);
    if (digits[0] < 3 || digits[1] > 2 || digits[2] > 2 || values[0] == 0 || values[1] < 1 || values[1] > 12)
        return false;
    result.date = {values[0], values[1], values[2]};
    dropImpossibleDay(result);
    return true;
}

// Also in three words: "6. 5. 1900".
bool takeNumericDate(Words& words, ReadDate& result) {
    constexpr std::size_t kDayDigits = 2;
    const std::string_view word = words.peek();
    const bool mayHaveSeparator =
        isDigit(words.front()) && (word.size() > kDayDigits || isSeparator(word.back()));
    if (!mayHaveSeparator || std::none_of(word.begin(), word.end(), isSeparator)) return false;
    if (readNumericDate(words.peek(), result)) {
        words.skip();
        return true;
    }
    if (words.peek().back() != '.') return false;
    Words ahead = words;
    std::string joined;
    for (int i = 0; i < 3 && joined.size() < 16; ++i, ahead.skip()) joined += ahead.peek();
    if (!readNumericDate(joined, result)) return false;
    words = ahead;
    return true;
}

// A day's number of one or two digits, with a point or an ending behind it: "24", "24.", "1st", "1er".
std::optional<int> takeDay(Words& words) {
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
int takeMonth(Words& words, Calendar calendar) {
    Words ahead = words;
    const auto number = isDigit(words.front()) ? wholeNumber(words.peek(), 2) : std::nullopt;
    ahead.skip();
    if (isDigit(words.front()) && !number) return 0;
    const bool counted = number && *number >= 7 && *number <= 10 && ahead.skipIf({"BRE"});
    const int month = counted ? *number + 2 : monthOf(calendar, words.peek());
    if (month != 0) words = ahead;
    return month;
}

// "of" and the like, between a day, a month and a year.
bool skipParticle(Words& words) {
    return words.skipIf({"OF", "DE", "DEL", "DI", "DO"});
}

// "May 24, 1819": the day behind the month, if a year follows it.
void takeDayBehindMonth(Words& words, ReadDate& result) {
    Words ahead = words;
    const auto day = takeDay(ahead);
    if (!day || !isDigit(ahead.front())) return;
    result.date.day = *day;
    words = ahead;
}

// [day] month, or month day; nothing where no month is.
void takeDayAndMonth(Words& words, ReadDate& result) {
    const Words start = words;
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
bool standsBeforeDayAndMonth(Words words, Calendar calendar) {
    words.skip();
    ReadDate numeric;
    if (takeNumericDate(words, numeric)) return true;
    if (!takeDay(words)) return false;
    skipParticle(words);
    return takeMonth(words, calendar) != 0;
}

// What may stand before a day: a weekday, with or without an article; AD before a year.
void skipWordsAhead(Words& words, Calendar calendar) {
    if (monthOf(calendar, words.peek()) != 0 && !standsBeforeDayAndMonth(words, calendar)) return;
    if (isWeekday(DateWord(words.peek()))) {
        words.skip();
        words.skipIf({"DEN", "LE", "EL", "IL", "THE"});
    } else {
        words.skipIf({"AD", "A.D"});
    }
}

// [calendar] [weekday] [[day] month] year [B.C.]
std::optional<ReadDate> takeDate(Words& words) {
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

}  // namespace

namespace {

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

Qualifier takeQualifier(Words& words) {
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

}  // namespace

namespace {

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
    Words words(text);
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
