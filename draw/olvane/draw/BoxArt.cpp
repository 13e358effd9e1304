// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Draws the boxes. A tall box has the silhouette on top and centred lines below it; a wide one, as sideways
// pictures use, has the silhouette at the left and lines beside it. Names take the largest of a few sizes in
// which no word has to be cut; only when the smallest does not do are words cut and lines shortened.

#include <olvane/draw/BoxArtInternal.h>

#include <algorithm>
#include <limits>
#include <string_view>
#include <utility>
#include <vector>

#include <olvane/draw/DrawingWordsInternal.h>
#include <olvane/draw/SvgTextInternal.h>
#include <olvane/picture/TextFit.h>

namespace olvane::draw {

namespace {

using picture::cleanText;
using picture::cutText;
using picture::fitLine;
using picture::Font;
using picture::runsRightToLeft;
using picture::Side;
using picture::textWidth;

// All in px.
constexpr double kInset = 7;  // from the border to any text
constexpr double kSilhouetteWidth = 44;
constexpr double kSilhouetteHeight = 40;
constexpr double kYearsSize = 10.5;
constexpr double kYearsPitch = 14;
constexpr double kDescent = 0.22;  // of letters, in sizes
constexpr double kMarkInside = 3;  // by which a mark at the edge reaches into its box, where no text goes
constexpr double kBadgeHeight = kMarkInside + kMarkOutside;
constexpr double kBadgeSize = 10;
constexpr double kBadgeInset = 6;
constexpr double kWideBadgeInset = 2;  // at the foot of a wide box
constexpr double kFocusBorder = 4;
constexpr double kCaptionSize = 10.5;
constexpr double kCaptionPitch = 13;
constexpr double kCaptionFrame = 5;   // above and below its lines together
constexpr double kCaptionInside = 1;  // by which a caption reaches into the border of its box
constexpr std::size_t kMostCaptionLines = 3;
constexpr double kNameGap = 3;  // between lines of a name
constexpr double kLargestName = 13;
constexpr double kSmallestName = 10;
constexpr std::size_t kMostNameLines = 8;

bool isWide(const BoxFrame& box) {
    return box.width > box.height;
}

// A pill with a title of its own.
struct Badge {
    std::string text;
    std::string title;
    bool hollow = false;
    double x = 0;

    double width() const { return std::max(kBadgeHeight + 3, textWidth(text, {kBadgeSize, true}) + 9); }
};

// On top of a tall box, where the silhouette leaves room, and at the foot of a wide one, beside the years.
double badgeTopOf(const BoxFrame& box) {
    return isWide(box) ? box.height - kBadgeHeight - kWideBadgeInset : kBadgeInset;
}

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

// Whether names are larger than beside or below a silhouette.
bool isForPaper(const BoxFrame& box) {
    return leastNameOf(box) > kSmallestName;
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
    return {box.width / 2, box.width - 2 * kInset, 55, box.height - 6, true};
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

// Years in one line if they fit, then as many details as leave room for two lines of a name.
std::vector<std::string> factLinesOf(const kin::PersonLabel& label, const TextRoom& room) {
    const Font font{room.yearsSize, false};
    std::vector<std::string> years;
    if (!label.birth.empty()) years.push_back("* " + cleanText(label.birth));
    if (!label.death.empty()) years.push_back("\xE2\x80\xA0 " + cleanText(label.death));
    const double spare = room.bottom - room.top - room.leastNameHeight();
    const auto most = static_cast<std::size_t>(std::max(0.0, spare / room.yearsPitch));
    const auto detailsBelow = [&](std::size_t lines) {
        return std::min(label.details.size(), most - std::min(most, lines));
    };
    if (years.size() == 2) {
        const std::string both = years[0] + "  " + years[1];
        if (textWidth(both, font) <= room.widthOfFact(detailsBelow(1))) years = {both};
    }
    std::vector<std::string> lines = std::move(years);
    const std::size_t details = detailsBelow(lines.size());
    for (std::size_t i = 0; i < details; ++i) lines.push_back(cleanText(label.details[i]));
    for (std::size_t i = 0; i < lines.size(); ++i) {
        lines[i] = fitLine(lines[i], font, room.widthOfFact(lines.size() - 1 - i));
    }
    return lines;
}

struct TextLook {
    std::string_view anchor;  // an attribute
    Font font;
    std::string_view colour;
};

void appendTextLine(std::string& svg, double x, double y, std::string_view text, const TextLook& look) {
    put(svg, "<text x=\"", number(x), "\" y=\"", number(y), "\"", look.anchor);
    if (look.font.bold) svg += " font-weight=\"bold\"";
    put(svg, " font-size=\"", number(look.font.size), "\" fill=\"", look.colour, "\"");
    if (runsRightToLeft(text)) svg += " direction=\"rtl\"";
    put(svg, ">", Escaped{text}, "</text>\n");
}

constexpr std::string_view kMiddle = " text-anchor=\"middle\"";

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

// Square corners for men, round ones for women, in between for everybody else.
double cornerOf(kin::Sex sex) {
    switch (sex) {
        case kin::Sex::male:
            return 3;
        case kin::Sex::female:
            return 18;
        case kin::Sex::unknown:
            break;
    }
    return 9;
}

std::string_view silhouetteOf(kin::Sex sex) {
    switch (sex) {
        case kin::Sex::male:
            return "olvane-man";
        case kin::Sex::female:
            return "olvane-woman";
        case kin::Sex::unknown:
            break;
    }
    return "olvane-person";
}

// A thick frame outside, apart from the border.
void appendAncestorFrame(std::string& svg, const BoxFrame& box, double corner, const DrawingTheme& theme) {
    put(svg, "<rect x=\"-5\" y=\"-5\" width=\"", number(box.width + 10), "\" height=\"",
        number(box.height + 10), "\" rx=\"", number(corner + 5), "\" fill=\"none\" stroke=\"", theme.badge,
        "\" stroke-width=\"3\"/>\n");
}

void appendFrame(std::string& svg, const BoxFrame& box, kin::Sex sex, const DrawingTheme& theme) {
    const BoxColours& colours = theme.coloursOf(sex);
    const double corner = cornerOf(sex);
    const bool isEnd = box.isFocus || box.isOther;
    put(svg, "<rect width=\"", number(box.width), "\" height=\"", number(box.height), "\" rx=\"",
        number(corner), "\" fill=\"", colours.fill, "\" stroke=\"", isEnd ? theme.focus : colours.border,
        "\" stroke-width=\"", number(isEnd ? kFocusBorder : 1.4), "\"/>\n");
    if (box.isCommonAncestor && !isEnd) appendAncestorFrame(svg, box, corner, theme);
    if (!isEnd) return;
    // A second, thin frame outside marks the focus where colours are lost.
    put(svg, "<rect x=\"-5\" y=\"-5\" width=\"", number(box.width + 10), "\" height=\"",
        number(box.height + 10), "\" rx=\"", number(corner + 5), "\" fill=\"none\" stroke=\"", theme.focus,
        "\" stroke-width=\"1.4\"/>\n");
}

void appendSilhouette(std::string& svg, const BoxFrame& box, kin::Sex sex, const DrawingTheme& theme) {
    const BoxColours& colours = theme.coloursOf(sex);
    const double x = isWide(box) ? kInset : (box.width - kSilhouetteWidth) / 2;
    const double y = isWide(box) ? (box.height - kSilhouetteHeight) / 2 : 11;
    put(svg, "<use href=\"#", silhouetteOf(sex), "\" x=\"", number(x), "\" y=\"", number(y), "\" color=\"",
        colours.silhouette, "\"/>\n");
}

std::string counted(int count, Phrase one, Phrase many, kin::Language language) {
    return phraseWith(count == 1 ? one : many, language, {joined(whole(count))});
}

std::string hiddenSentence(const BoxFrame& frame, bool isLiving) {
    std::string list;
    const auto add = [&list](const std::string& part) { put(list, (list.empty() ? "" : ", "), part); };
    const picture::Box& box = *frame.box;
    if (frame.countsHidden && !isLiving) {
        if (box.hiddenParents > 0)
            add(counted(box.hiddenParents, Phrase::oneParent, Phrase::parents, frame.language));
        if (box.hiddenPartners > 0)
            add(counted(box.hiddenPartners, Phrase::oneSpouse, Phrase::spouses, frame.language));
        if (box.hiddenChildren > 0)
            add(counted(box.hiddenChildren, Phrase::oneChild, Phrase::children, frame.language));
    }
    if (!list.empty()) return phraseWith(Phrase::notShown, frame.language, {list});
    const bool isElsewhere = frame.countsHidden && !isLiving;
    return std::string(
        wordsOf(isElsewhere ? Phrase::hiddenElsewhere : Phrase::hiddenAnywhere, frame.language));
}

std::string hiddenMark(const BoxFrame& frame, bool isLiving) {
    const int count = frame.countsHidden && !isLiving ? frame.hiddenCount() : 0;
    return count > 0 ? "+" + std::to_string(count) : "+";
}

std::string repeatSentence(const BoxFrame& box) {
    return phraseWith(Phrase::inBoxes, box.language,
                      {joined(whole(box.repeatCount)), joined(whole(box.repeatNumber))});
}

constexpr std::string_view kTwoUp = "\xE2\x87\x88";

std::string furtherSentence(const BoxFrame& frame) {
    const int families = frame.box->furtherParents;
    if (families == 1) return std::string(wordsOf(Phrase::furtherParents, frame.language));
    return phraseWith(Phrase::furtherFamilies, frame.language, {joined(whole(families))});
}

void appendBadgeAt(std::string& svg, double y, const Badge& badge, const DrawingTheme& theme) {
    const std::string_view fill = badge.hollow ? theme.page : theme.badge;
    const std::string_view ink = badge.hollow ? theme.text : theme.badgeText;
    put(svg, "<g><title>", Escaped{badge.title}, "</title>\n<rect x=\"", number(badge.x), "\" y=\"",
        number(y), "\" width=\"", number(badge.width()), "\" height=\"", number(kBadgeHeight),
        "\" rx=\"7.5\" fill=\"", fill, "\" stroke=\"", theme.badge, "\"/>\n");
    appendTextLine(svg, badge.x + badge.width() / 2, y + kBadgeHeight - 4, badge.text,
                   {kMiddle, {kBadgeSize, true}, ink});
    svg += "</g>\n";
}

// The count of hidden relatives in the right corner; the repeat mark and that of further parents in the left one, or
// before it in a wide box.
std::vector<Badge> badgesOf(const BoxFrame& box, bool isLiving) {
    std::vector<Badge> badges;
    double right = box.width - kBadgeInset;
    // What is folded counts those whom it hides.
    const bool isFolded =
        std::any_of(box.marks.begin(), box.marks.end(), [](const BoxMark& mark) { return mark.isFolded; });
    if (box.hasHidden() && !isFolded) {
        Badge badge{hiddenMark(box, isLiving), hiddenSentence(box, isLiving)};
        badge.x = right - badge.width();
        right = badge.x - kBadgeInset / 2;
        badges.push_back(std::move(badge));
    }
    double left = kBadgeInset;
    const auto addHollow = [&](const std::string& text, const std::string& title) {
        Badge badge{text, title, true};
        badge.x = isWide(box) ? right - badge.width() : left;
        right -= badge.width() + kBadgeInset / 2;
        left += badge.width() + kBadgeInset / 2;
        badges.push_back(std::move(badge));
    };
    if (box.repeatNumber > 0) addHollow("=" + std::to_string(box.repeatNumber), repeatSentence(box));
    if (box.box->furtherParents > 0 && !isLiving) {
        addHollow(std::string(kTwoUp), furtherSentence(box));
    }
    return badges;
}

void appendBadges(std::string& svg, const BoxFrame& box, const std::vector<Badge>& badges,
                  const DrawingTheme& theme) {
    for (const Badge& badge : badges) appendBadgeAt(svg, badgeTopOf(box), badge, theme);
    if (box.text != nullptr && !badges.empty()) box.text->add(kBadgeSize);
}

// Where a row of badges so wide begins: mostly outside of the upper or lower edge, half outside at the sides. In a wide box
// beside the middle, where the line of a couple leaves that lies sideways.
std::pair<double, double> markStart(const BoxFrame& box, Side side, double width) {
    if (side == Side::left || side == Side::right) {
        return {(side == Side::left ? 0 : box.width) - width / 2, (box.height - kBadgeHeight) / 2};
    }
    return {isWide(box) ? kInset : (box.width - width) / 2,
            side == Side::top ? -kMarkOutside : box.height - kMarkInside};
}

// Side by side at an edge.
void appendMarks(std::string& svg, const BoxFrame& box, Side place, const DrawingTheme& theme) {
    double width = 0;
    std::vector<Badge> badges;
    for (const BoxMark& mark : box.marks) {
        if (mark.place != place) continue;
        badges.push_back({mark.text, mark.title, !mark.isFolded});
        if (box.text != nullptr) box.text->add(kBadgeSize);
        width += badges.back().width() + (badges.size() > 1 ? kBadgeInset / 2 : 0);
    }
    auto [x, y] = markStart(box, place, width);
    for (Badge& badge : badges) {
        badge.x = x;
        x += badge.width() + kBadgeInset / 2;
        appendBadgeAt(svg, y, badge, theme);
    }
}

void appendMarks(std::string& svg, const BoxFrame& box, const DrawingTheme& theme) {
    for (const Side side : {Side::top, Side::right, Side::bottom, Side::left}) {
        appendMarks(svg, box, side, theme);
    }
}

// From the edge of a box to its caption, which touches the border, or the marks that stand at this edge.
double captionGapOf(const BoxFrame& box) {
    const Side place = box.captionOnTop ? Side::top : Side::bottom;
    const bool hasMarks = std::any_of(box.marks.begin(), box.marks.end(),
                                      [place](const BoxMark& mark) { return mark.place == place; });
    return hasMarks ? kMarkOutside + 1 : -kCaptionInside;
}

// What the person is to the other one of a kinship, on a plate outside the box.
void appendCaption(std::string& svg, const BoxFrame& box, const DrawingTheme& theme) {
    if (box.caption.empty()) return;
    const Font font{kCaptionSize, true};
    const double lines = (box.captionRoom - captionGapOf(box) - kCaptionFrame) / kCaptionPitch;
    const auto most = static_cast<std::size_t>(std::clamp<double>(lines, 1, kMostCaptionLines));
    const picture::FittedText text =
        picture::fitText(cleanText(cutText(box.caption)), font, box.width + kCaptionOver - 2 * kInset, most);
    double width = 0;
    for (const std::string& line : text.lines) width = std::max(width, textWidth(line, font));
    width += 2 * kInset;
    const double height = static_cast<double>(text.lines.size()) * kCaptionPitch + kCaptionFrame;
    const double x = (box.width - width) / 2;
    const double y = box.captionOnTop ? -captionGapOf(box) - height : box.height + captionGapOf(box);
    put(svg, "<rect x=\"", number(x), "\" y=\"", number(y), "\" width=\"", number(width), "\" height=\"",
        number(height), "\" rx=\"6\" fill=\"", theme.focus, "\"/>\n");
    double baseline = y + kCaptionPitch - 1.5;
    for (const std::string& line : text.lines) {
        appendTextLine(svg, box.width / 2, baseline, line, {kMiddle, {kCaptionSize, true}, theme.page});
        baseline += kCaptionPitch;
    }
}

std::string titleOf(const BoxFrame& box, const kin::PersonLabel& label) {
    std::string title = fullNameIn(label, box.language);
    if (!label.living && !label.birth.empty()) put(title, ", * ", label.birth);
    if (!label.living && !label.death.empty()) put(title, ", \xE2\x80\xA0 ", label.death);
    if (!label.living) {
        for (const std::string& detail : label.details) put(title, ", ", detail);
    }
    if (box.isFocus) title += wordsOf(Phrase::focus, box.language);
    if (!box.caption.empty()) put(title, ". ", box.caption);
    if (box.isCommonAncestor) put(title, ". ", wordsOf(Phrase::commonAncestor, box.language));
    if (box.repeatNumber > 0) put(title, ". ", repeatSentence(box));
    if (box.hasHidden()) put(title, ". ", hiddenSentence(box, label.living));
    if (box.box->furtherParents > 0 && !label.living) put(title, ". ", furtherSentence(box));
    for (const BoxMark& mark : box.marks) put(title, ". ", mark.title);
    return title;
}

void openBox(std::string& svg, const BoxFrame& box, const std::string& title) {
    put(svg, "<g role=\"img\" transform=\"translate(", number(box.x), " ", number(box.y), ")\"><title>",
        Escaped{title}, "</title>\n");
}

// What is left of a label when it must not be shown.
kin::PersonLabel shownLabel(const kin::PersonLabel& label, kin::Language language) {
    if (!label.living) {
        kin::PersonLabel shown = label;
        if (shown.given.empty() && shown.surname.empty()) shown.given = "?";
        return shown;
    }
    kin::PersonLabel shown;
    shown.given = wordsOf(Phrase::living, language);
    shown.living = true;
    return shown;
}

}  // namespace

kin::PersonLabel readableLabel(const DrawingContent& content, std::int64_t id) {
    kin::PersonLabel label = content.labelOf(id);
    for (std::string* text : {&label.given, &label.surname, &label.birth, &label.death})
        *text = cutText(*text);
    for (std::string& detail : label.details) detail = cutText(detail);
    return label;
}

void appendBoxDefinitions(std::string& svg) {
    svg +=
        "<defs>\n"
        "<g id=\"olvane-man\" fill=\"currentColor\"><circle cx=\"22\" cy=\"10.5\" r=\"9\"/>"
        "<path d=\"M4 40v-5c0-8 5-12.5 11-13.5l7 5 7-5c6 1 11 5.5 11 13.5v5z\"/></g>\n"
        "<g id=\"olvane-woman\" fill=\"currentColor\"><path d=\"M22 1c-8 0-11.5 5.5-11.5 12 0 5.5-.5 8.5-3.5 "
        "11.5 4 1.5 8 1 10.5-.5v3h9v-3c2.5 1.5 6.5 2 10.5 .5-3-3-3.5-6-3.5-11.5 0-6.5-3.5-12-11.5-12z\"/>"
        "<path d=\"M6 40c0-8 5-12.5 11-13.5h10c6 1 11 5.5 11 13.5z\"/></g>\n"
        "<g id=\"olvane-person\" fill=\"none\" stroke=\"currentColor\" stroke-width=\"2.5\"><circle "
        "cx=\"22\" "
        "cy=\"10.5\" r=\"8\"/><path d=\"M5.5 38.7v-3c0-8 7-12 16.5-12s16.5 4 16.5 12v3z\"/></g>\n"
        "</defs>\n";
}

void appendPersonBox(std::string& svg, const BoxFrame& box, const kin::PersonLabel& label,
                     const DrawingTheme& theme) {
    const kin::PersonLabel shown = shownLabel(label, box.language);
    openBox(svg, box, titleOf(box, label));
    appendFrame(svg, box, shown.sex, theme);
    if (!isForPaper(box)) appendSilhouette(svg, box, shown.sex, theme);
    const std::vector<Badge> badges = badgesOf(box, label.living);
    appendTexts(svg, box, shown, badges, theme);
    appendBadges(svg, box, badges, theme);
    appendMarks(svg, box, theme);
    appendCaption(svg, box, theme);
    svg += "</g>\n";
}

void appendUnknownParentBox(std::string& svg, const BoxFrame& box, const std::string& childName,
                            const DrawingTheme& theme) {
    const bool isFather = box.box->sex == kin::Sex::male;
    const std::string_view invitation =
        wordsOf(isFather ? Phrase::addFather : Phrase::addMother, box.language);
    const kin::Sex sex = isFather ? kin::Sex::male : kin::Sex::female;
    openBox(svg, box, phraseWith(Phrase::ofChild, box.language, {invitation, childName}));
    put(svg, "<rect width=\"", number(box.width), "\" height=\"", number(box.height), "\" rx=\"",
        number(cornerOf(sex)), "\" fill=\"", theme.page, "\" stroke=\"", theme.unknownParent,
        "\" stroke-width=\"1.4\" stroke-dasharray=\"5 4\"/>\n");
    const double middleX = isWide(box) ? kInset + kSilhouetteWidth / 2 : box.width / 2;
    const double middleY = isWide(box) ? box.height / 2 : box.height / 2 - 18;
    put(svg, "<path d=\"M", number(middleX - 11), " ", number(middleY), "h22m-11 -11v22\" stroke=\"",
        theme.unknownParent, "\" stroke-width=\"3\" stroke-linecap=\"round\" fill=\"none\"/>\n");
    const TextRoom room = textRoomOf(box, {});
    const double baseline = isWide(box) ? box.height / 2 + 4 : box.height / 2 + 22;
    appendTextLine(svg, room.x, baseline, invitation,
                   {anchorAttribute(room, invitation), {12, false}, theme.quietText});
    svg += "</g>\n";
}

}  // namespace olvane::draw
