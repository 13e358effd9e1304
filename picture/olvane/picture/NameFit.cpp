// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Tries a name whole in each size, then with initials, and cuts it only in the smallest.

#include <olvane/picture/TextFit.h>

#include <algorithm>
#include <optional>

#include <olvane/picture/TextPropertiesInternal.h>

namespace olvane::picture {

namespace {

constexpr int kSizes = 4;

std::vector<double> sizesOf(const NameRoom& room) {
    if (room.largest == room.smallest) return {room.largest};
    std::vector<double> sizes;
    sizes.reserve(kSizes);
    for (int i = 0; i < kSizes; ++i) {
        sizes.push_back(room.largest - (room.largest - room.smallest) * i / (kSizes - 1));
    }
    return sizes;
}

struct CharacterRange {
    std::int32_t first;
    std::int32_t last;
};

// Blocks of capitals; in Latin Extended-A, small letters alternate with them.
constexpr CharacterRange kCapitals[] = {{'A', 'Z'},     {0xC0, 0xDE},   {0x100, 0x17F},
                                        {0x386, 0x3AB}, {0x400, 0x42F}, {0x531, 0x556}};

bool beginsWithCapital(std::string_view word) {
    std::size_t size = 1;
    const std::int32_t character = decodeFront(word, size);
    return std::any_of(std::begin(kCapitals), std::end(kCapitals), [character](const CharacterRange& range) {
        return character >= range.first && character <= range.last;
    });
}

std::string initialOf(std::string_view word) {
    const std::vector<std::string_view> letters = graphemeClusters(word);
    if (letters.size() < 3 || !beginsWithCapital(word)) return std::string(word);
    return std::string(letters.front()) + ".";
}

// The first word stays, the others become initials.
std::string withInitials(std::string_view given) {
    std::string result;
    while (!given.empty()) {
        const std::size_t end = std::min(given.find(' '), given.size());
        const std::string_view word = given.substr(0, end);
        given.remove_prefix(std::min(end + 1, given.size()));
        if (word.empty()) continue;
        if (result.empty()) {
            result = word;
        } else {
            result += " " + initialOf(word);
        }
    }
    return result;
}

class NameFitter {
public:
    NameFitter(bool surnameFirst, const NameRoom& room) : surnameFirst_(surnameFirst), room_(room) {}

    // In lines of one size, with no word broken.
    std::optional<FittedName> whole(std::string_view given, std::string_view surname, double size) const {
        const Font font{size, true};
        const std::size_t most = linesOf(size);
        const FittedText first = fitText(surnameFirst_ ? surname : given, font, room_.width, most + 1);
        const FittedText second = fitText(surnameFirst_ ? given : surname, font, room_.width, most + 1);
        if (isCut(first) || isCut(second)) return std::nullopt;
        if (first.lines.size() + second.lines.size() <= most) return joined(first, second, size);
        const std::string both(surnameFirst_ ? surname : given);
        const FittedText together =
            fitText(both + " " + std::string(surnameFirst_ ? given : surname), font, room_.width, most);
        if (isCut(together)) return std::nullopt;
        return FittedName{together.lines, size, NameLoss::nothing};
    }

    // As much as goes in; the surname keeps up to half of the lines.
    FittedName cut(std::string_view given, std::string_view surname) const {
        FittedName name = cutLines(given, surname);
        name.loss = NameLoss::letters;
        return name;
    }

private:
    FittedName cutLines(std::string_view given, std::string_view surname) const {
        const double size = room_.smallest;
        const Font font{size, true};
        const std::size_t most = linesOf(size);
        if (most == 1 && !given.empty() && !surname.empty()) return cutToOneLine(given, surname, font);
        const std::size_t needed = fitText(surname, font, room_.width, most).lines.size();
        const std::size_t kept = given.empty() ? most : std::min(needed, std::max<std::size_t>(1, most / 2));
        const FittedText shownGiven = fitText(given, font, room_.width, most - (surname.empty() ? 0 : kept));
        const FittedText shownSurname = fitText(surname, font, room_.width, most - shownGiven.lines.size());
        return surnameFirst_ ? joined(shownSurname, shownGiven, size)
                             : joined(shownGiven, shownSurname, size);
    }

    std::size_t linesOf(double size) const {
        const double lines = std::min(room_.height / (size + room_.gap), 1000.0);
        return std::clamp<std::size_t>(static_cast<std::size_t>(std::max(lines, 1.0)), 1,
                                       std::max<std::size_t>(room_.mostLines, 1));
    }

    static bool isCut(const FittedText& fitted) { return fitted.shortened || fitted.wordBroken; }

    static FittedName joined(const FittedText& first, const FittedText& second, double size) {
        FittedName name{first.lines, size, NameLoss::nothing};
        name.lines.insert(name.lines.end(), second.lines.begin(), second.lines.end());
        return name;
    }

    FittedName cutToOneLine(std::string_view given, std::string_view surname, const Font& font) const {
        const std::string first(surnameFirst_ ? surname : given);
        const std::string second(surnameFirst_ ? given : surname);
        return {fitText(first + " " + second, font, room_.width, 1).lines, font.size, NameLoss::letters};
    }

    bool surnameFirst_;
    NameRoom room_;
};

}  // namespace

FittedName fitName(std::string_view given, std::string_view surname, bool surnameFirst,
                   const NameRoom& room) {
    const NameFitter fitter(surnameFirst, room);
    const std::vector<double> sizes = sizesOf(room);
    for (const double size : sizes) {
        if (auto name = fitter.whole(given, surname, size)) return *name;
    }
    const std::string initials = withInitials(given);
    for (const double size : sizes) {
        auto name = fitter.whole(initials, surname, size);
        if (!name) continue;
        name->loss = NameLoss::givenNames;
        return *name;
    }
    return fitter.cut(initials, surname);
}

}  // namespace olvane::picture
