// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Line break opportunities, by the rules LB2 to LB31 of UAX 14 (https://www.unicode.org/reports/tr14/), version 15.0,
// with numbers as its example 7 of section 8.2 has them. Texts without spaces between words, such as Thai, have no
// opportunities within a word: that would take a dictionary.

#include <olvane/picture/TextMetrics.h>

#include <algorithm>
#include <initializer_list>

#include <olvane/picture/TextPropertiesInternal.h>

namespace olvane::picture {

namespace {

using L = LineClass;

bool isOneOf(L c, std::initializer_list<L> classes) {
    for (const L each : classes) {
        if (c == each) return true;
    }
    return false;
}

bool isMark(L c) {
    return c == L::cm || c == L::zwj;
}
bool isLetter(L c) {
    return c == L::al || c == L::hl;
}
bool isClosing(L c) {
    return c == L::cl || c == L::cp || c == L::cpWide;
}
bool isOpening(L c) {
    return c == L::op || c == L::opWide;
}
bool isIdeograph(L c) {
    return isOneOf(c, {L::id, L::idPict, L::eb, L::em});
}
bool isHangul(L c) {
    return isOneOf(c, {L::jl, L::jv, L::jt, L::h2, L::h3});
}

// Goes from character to character. Marks are of the class of what they stand on (LB9), so that left_ is the last
// character that is neither a mark nor a space.
class LineBreaker {
public:
    // next is the class of a character, after that of what follows it and its marks.
    bool breaksBefore(L next, L after) {
        const bool joins =
            isMark(next) && !isOneOf(raw_, {L::sp, L::bk, L::cr, L::lf, L::nl, L::zw}) && !isFirst_;
        const L resolved = isMark(next) ? L::al : next;  // LB10
        const bool breaks = !isFirst_ && (joins ? false : decide(resolved, after));
        advance(next, resolved, joins);
        return breaks;
    }

private:
    bool decide(L b, L after) const {
        if (raw_ == L::bk || raw_ == L::lf || raw_ == L::nl || (raw_ == L::cr && b != L::lf))
            return true;                                                           // LB4, 5
        if (isOneOf(b, {L::bk, L::cr, L::lf, L::nl, L::sp, L::zw})) return false;  // LB5 to LB7
        if (left_ == L::zw) return true;                                           // LB8
        if (raw_ == L::zwj) return false;                                          // LB8a
        if (joinsAcrossSpaces(b)) return false;                                    // LB11 to LB17
        if (spaces_) return true;                                                  // LB18
        if (b == L::qu || left_ == L::qu) return false;                            // LB19
        if (b == L::cb || left_ == L::cb) return true;                             // LB20
        return !joinsHyphens(b) && !joinsNumbers(b, after) && !joinsSyllables(b) && !joinsLetters(b) &&
               !joinsEmoji(b);
    }

    bool joinsAcrossSpaces(L b) const {
        if (b == L::wj || (left_ == L::wj && !spaces_)) return true;                  // LB11
        if (left_ == L::gl && !spaces_) return true;                                  // LB12
        if (b == L::gl && !spaces_ && left_ != L::ba && left_ != L::hy) return true;  // LB12a
        if (b == L::ex || isClosing(b) || b == L::is || b == L::sy) return true;      // LB13
        if (isOpening(left_)) return true;                                            // LB14
        if (left_ == L::qu && isOpening(b)) return true;                              // LB15
        if (isClosing(left_) && b == L::ns) return true;                              // LB16
        return left_ == L::b2 && b == L::b2;                                          // LB17
    }

    bool joinsHyphens(L b) const {
        if (isOneOf(b, {L::ba, L::hy, L::ns}) || left_ == L::bb) return true;     // LB21
        if (before_ == L::hl && (left_ == L::hy || left_ == L::ba)) return true;  // LB21a
        if (left_ == L::sy && b == L::hl) return true;                            // LB21b
        return b == L::in;                                                        // LB22
    }

    // LB23 to LB25.
    bool joinsNumbers(L b, L after) const {
        if ((isLetter(left_) && b == L::nu) || (left_ == L::nu && isLetter(b))) return true;
        if ((left_ == L::pr && isIdeograph(b)) || (isIdeograph(left_) && b == L::po)) return true;
        const bool leftIsSign = left_ == L::pr || left_ == L::po;
        const bool isSign = b == L::pr || b == L::po;
        if ((leftIsSign && isLetter(b)) || (isLetter(left_) && isSign)) return true;
        const bool opensNumber = isOpening(b) || b == L::hy;
        if (leftIsSign && (b == L::nu || (opensNumber && after == L::nu))) return true;
        if ((isOpening(left_) || left_ == L::hy) && b == L::nu) return true;
        if (number_ == Number::open && b == L::nu) return true;
        return number_ != Number::none && isSign;
    }

    // LB26, LB27.
    bool joinsSyllables(L b) const {
        if (left_ == L::jl && isOneOf(b, {L::jl, L::jv, L::h2, L::h3})) return true;
        if ((left_ == L::jv || left_ == L::h2) && (b == L::jv || b == L::jt)) return true;
        if ((left_ == L::jt || left_ == L::h3) && b == L::jt) return true;
        return (isHangul(left_) && b == L::po) || (left_ == L::pr && isHangul(b));
    }

    // LB28 to LB30.
    bool joinsLetters(L b) const {
        if (isLetter(left_) && isLetter(b)) return true;
        if (left_ == L::is && isLetter(b)) return true;
        if ((isLetter(left_) || left_ == L::nu) && b == L::op) return true;
        return left_ == L::cp && (isLetter(b) || b == L::nu);
    }

    // LB30a, LB30b.
    bool joinsEmoji(L b) const {
        if (left_ == L::ri && b == L::ri) return indicators_ % 2 == 1;
        return (left_ == L::eb || left_ == L::idPict) && b == L::em;
    }

    void advance(L next, L resolved, bool joins) {
        raw_ = next;
        isFirst_ = false;
        if (joins) return;
        if (next == L::sp) {
            spaces_ = true;
            number_ = Number::none;
            return;
        }
        before_ = spaces_ ? L::sp : left_;
        indicators_ = resolved != L::ri ? 0 : (spaces_ ? 1 : indicators_ + 1);
        number_ = numberAfter(resolved);
        left_ = resolved;
        spaces_ = false;
    }

    // How far a number has come: NU (NU | SY | IS)*, then (CL | CP)?.
    enum class Number : std::uint8_t { none, open, closed };

    Number numberAfter(L b) const {
        if (b == L::nu) return Number::open;
        if (number_ != Number::open) return Number::none;
        if (b == L::sy || b == L::is) return Number::open;
        return isClosing(b) ? Number::closed : Number::none;
    }

    L raw_ = L::sp;     // the last character
    L left_ = L::sp;    // the last one that is neither space nor mark; sp for none
    L before_ = L::sp;  // the one before that, sp where a space is between
    bool spaces_ = false;
    bool isFirst_ = true;
    int indicators_ = 0;  // regional indicators up to here
    Number number_ = Number::none;
};

struct Character {
    std::size_t start;
    L kind;
};

std::vector<Character> charactersOf(std::string_view text) {
    std::vector<Character> characters;
    std::size_t position = 0;
    forEachCharacter(text, [&](std::int32_t character, std::string_view bytes) {
        characters.push_back({position, textPropertiesOf(character).line});
        position += bytes.size();
    });
    return characters;
}

}  // namespace

std::vector<std::size_t> lineBreaks(std::string_view text) {
    const std::vector<Character> characters = charactersOf(text);
    std::vector<std::size_t> breaks;
    LineBreaker breaker;
    std::size_t after = 0;
    for (std::size_t i = 0; i < characters.size(); ++i) {
        after = std::max(after, i + 1);
        while (after < characters.size() && isMark(characters[after].kind)) ++after;
        const L following = after < characters.size() ? characters[after].kind : L::sp;
        if (breaker.breaksBefore(characters[i].kind, following)) breaks.push_back(characters[i].start);
    }
    return breaks;
}

}  // namespace olvane::picture
