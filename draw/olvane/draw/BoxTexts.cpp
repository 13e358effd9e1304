// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The texts of a box. Names take the largest of a few sizes in which no word has to be cut; only when the smallest does
// not do are words cut and lines shortened. Years and details take the foot of the box, names the middle of what is left.

#include <olvane/draw/BoxPartsInternal.h>

#include <algorithm>
#include <limits>
#include <utility>

#include <olvane/draw/SvgTextInternal.h>

namespace olvane::draw {

namespace {

using picture::cleanText;
using picture::fitLine;
using picture::Font;
using picture::runsRightToLeft;
using picture::textWidth;

// All in px.
constexpr double kYearsSize = 10.5;
constexpr double kYearsPitch = 14;
constexpr double kDescent = 0.22;  // of letters, in sizes
constexpr double kNameGap = 3;     // between lines of a name
constexpr double kLargestName = 13;
constexpr double kSmallestName = 10;
constexpr std::size_t kMostNameLines = 8;

// What a box leaves for text.
struct TextRoom {
    double x = 0;  // anchor of each line
    double width = 0;
    double top = 0;
    double bottom = 0;
    bool centred = true;
    double largestName = kLargestName;
    double smallestName = kSmallestName;
    double nameGap = kNameGap;  // between lines of a name
    double lastLineGap = 3;     // from the last baseline to the bottom
    double yearsSize = kYearsSize;
    double yearsPitch = kYearsPitch;
    // Text that reaches below `narrowFrom` has no more room than this: badges stand beside it.
    double narrowWidth = 0;
    double narrowFrom = std::numeric_limits<double>::infinity();

    // Of a line of years or details, counted from the last one.
    double widthOfFact(std::size_t fromLast) const {
        const double below =
            lastBaseline() - yearsPitch * static_cast<double>(fromLast) + yearsSize * kDescent;
        return below > narrowFrom ? std::min(narrowWidth, width) : width;
    }
    double lastBaseline() const { return bottom - lastLineGap; }

    // Two lines of the smallest letters.
    double leastNameHeight() const { return 2 * (smallestName + nameGap); }
};

// The size of names that was asked for, or the largest at which most names go into a box of that form: nine letters
// in a line, and three lines with years below.
double leastNameOf(const BoxFrame& box) {
    return std::min({box.leastName, box.width / 9, box.height / 4});
}

TextRoom paperRoomOf(const BoxFrame& box) {
    constexpr double kSide = 5;
    const double edge = box.marks.empty() ? 2 : kMarkInside + 1;
    TextRoom room{box.width / 2, box.width - 2 * kSide, edge, box.height - edge, true};
    if (isWide(box)) {
        room.x = kSide;
        room.centred = false;
    } else if (box.hasHidden() || box.repeatNumber > 0 || box.box->furtherParents > 0) {
        room.top = kBadgeInset + kBadgeHeight;
    }
    const double least = leastNameOf(box);
    room.largestName = 1.3 * least;
    room.smallestName = least;
    room.nameGap = 0.06 * least;
    room.yearsSize = std::max(kYearsSize, 0.6 * least);
    room.yearsPitch = room.yearsSize;
    room.lastLineGap = 0.2 * room.yearsSize;
    return room;
}

TextRoom usualRoomOf(const BoxFrame& box) {
    if (isForPaper(box)) return paperRoomOf(box);
    if (isWide(box)) {
        const double left = kInset + kSilhouetteWidth + kInset;
        return {left, box.width - left - kInset, 4, box.height - 5, false};
    }
    const double top = box.photo.empty() ? 55 : kPhotoTop + kTallPhotoHeight + 2;
    return {box.width / 2, box.width - 2 * kInset, top, box.height - 6, true};
}

TextRoom textRoomOf(const BoxFrame& box, const std::vector<Badge>& badges) {
    TextRoom room = usualRoomOf(box);
    if (!isWide(box) || badges.empty()) return room;
    room.narrowFrom = badgeTopOf(box);
    room.narrowWidth = room.width;
    for (const Badge& badge : badges) {
        room.narrowWidth = std::min(room.narrowWidth, badge.x - kBadgeInset / 2 - room.x);
    }
    return room;
}

picture::FittedName nameOf(const kin::PersonLabel& label, const TextRoom& room, double height) {
    picture::NameRoom names{room.width, std::max(height, room.leastNameHeight()), room.nameGap,
                            kMostNameLines};
    names.largest = room.largestName;
    names.smallest = room.smallestName;
    return picture::fitName(cleanText(label.given), cleanText(label.surname), label.surnameFirst, names);
}

std::vector<std::string> cleanTexts(std::vector<std::string> lines) {
    for (std::string& line : lines) line = cleanText(line);
    return lines;
}

// How many details have room beside that number of lines and two lines of a name.
std::size_t detailsBelow(std::size_t lines, const kin::PersonLabel& label, const TextRoom& room) {
    const double spare = room.bottom - room.top - room.leastNameHeight();
    const auto most = static_cast<std::size_t>(std::max(0.0, spare / room.yearsPitch));
    return std::min(label.details.size(), most - std::min(most, lines));
}

// Birth and death in one line if they fit, else each in its own, or in fewer letters where that has no room.
std::vector<std::string> lifeLinesOf(const kin::PersonLabel& label, const TextRoom& room) {
    const Font font{room.yearsSize, false};
    const std::string both = cleanText(kin::lifeLine(label));
    if (both.empty()) return {};
    if (textWidth(both, font) <= room.widthOfFact(detailsBelow(1, label, room))) return {both};
    std::vector<std::string> lines = cleanTexts(kin::lifeLines(label));
    std::vector<std::string> shorter = cleanTexts(kin::shortLifeLines(label));
    const std::size_t below = detailsBelow(lines.size(), label, room);
    for (std::size_t i = 0; i < lines.size(); ++i) {
        if (textWidth(lines[i], font) > room.widthOfFact(below + lines.size() - 1 - i))
            lines[i] = std::move(shorter[i]);
    }
    return lines;
}

// Birth and death, then as many details as leave room for two lines of a name.
std::vector<std::string> factLinesOf(const kin::PersonLabel& label, const TextRoom& room) {
    const Font font{room.yearsSize, false};
    std::vector<std::string> lines = lifeLinesOf(label, room);
    const std::size_t details = detailsBelow(lines.size(), label, room);
    for (std::size_t i = 0; i < details; ++i) lines.push_back(cleanText(label.details[i]));
    for (std::size_t i = 0; i < lines.size(); ++i) {
        lines[i] = fitLine(lines[i], font, room.widthOfFact(lines.size() - 1 - i));
    }
    return lines;
}

std::string_view anchorAttribute(const TextRoom& room, std::string_view text) {
    if (room.centred) return kMiddle;
    return runsRightToLeft(text) ? " text-anchor=\"end\"" : "";
}

void appendNames(std::string& svg, const picture::FittedName& name, const TextRoom& room, double top,
                 const DrawingTheme& theme) {
    double y = top + name.size;
    for (const std::string& line : name.lines) {
        appendTextLine(svg, room.x, y, line, {anchorAttribute(room, line), {name.size, true}, theme.text});
        y += name.size + room.nameGap;
    }
}

void appendYears(std::string& svg, const std::vector<std::string>& lines, const TextRoom& room,
                 double lastBaseline, const DrawingTheme& theme) {
    double y = lastBaseline - room.yearsPitch * (static_cast<double>(lines.size()) - 1);
    for (const std::string& line : lines) {
        appendTextLine(
            svg, room.x, y, line,
            {room.centred ? kMiddle : std::string_view(), {room.yearsSize, false}, theme.quietText});
        y += room.yearsPitch;
    }
}

}  // namespace

// Whether names are larger than beside or below a silhouette.
bool isForPaper(const BoxFrame& box) {
    return leastNameOf(box) > kSmallestName;
}

void appendTextLine(std::string& svg, double x, double y, std::string_view text, const TextLook& look) {
    put(svg, "<text x=\"", number(x), "\" y=\"", number(y), "\"", look.anchor);
    if (look.font.bold) svg += " font-weight=\"bold\"";
    put(svg, " font-size=\"", number(look.font.size), "\" fill=\"", look.colour, "\"");
    if (runsRightToLeft(text)) svg += " direction=\"rtl\"";
    put(svg, ">", Escaped{text}, "</text>\n");
}

// Names in the middle of what the years leave.
void appendTexts(std::string& svg, const BoxFrame& box, const kin::PersonLabel& label,
                 const std::vector<Badge>& badges, const DrawingTheme& theme) {
    const TextRoom room = textRoomOf(box, badges);
    const std::vector<std::string> years = factLinesOf(label, room);
    const double gap = isForPaper(box) ? 0 : 2;
    const double yearsTop =
        room.bottom - room.yearsPitch * static_cast<double>(years.size()) - (years.empty() ? 0 : gap);
    const double namesBottom = std::min(yearsTop, room.narrowFrom);
    const double namesHeight = namesBottom - room.top;
    const picture::FittedName names = nameOf(label, room, namesHeight);
    const double used = static_cast<double>(names.lines.size()) * (names.size + room.nameGap);
    appendNames(svg, names, room, room.top + std::max(0.0, (namesHeight - used) / 2), theme);
    appendYears(svg, years, room, room.lastBaseline(), theme);
    if (box.text == nullptr) return;
    if (!names.lines.empty()) box.text->addName(names.size);
    if (!years.empty()) box.text->add(room.yearsSize);
}

void appendInvitation(std::string& svg, const BoxFrame& box, std::string_view invitation,
                      const DrawingTheme& theme) {
    const TextRoom room = textRoomOf(box, {});
    const double baseline = isWide(box) ? box.height / 2 + 4 : box.height / 2 + 22;
    appendTextLine(svg, room.x, baseline, invitation,
                   {anchorAttribute(room, invitation), {12, false}, theme.quietText});
}

}  // namespace olvane::draw
