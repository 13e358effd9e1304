// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What is special about a box: badges inside it, marks at its edges, and the caption outside. Each badge is a pill whose
// title states in words what its sign stands for.

#include <olvane/draw/BoxPartsInternal.h>

#include <algorithm>
#include <utility>

#include <olvane/draw/DrawingWordsInternal.h>
#include <olvane/draw/LineArtInternal.h>
#include <olvane/draw/SvgTextInternal.h>

namespace olvane::draw {

namespace {

using picture::Side;

// All in px.
constexpr double kWideBadgeInset = 2;  // at the foot of a wide box
constexpr double kCaptionSize = 10.5;
constexpr double kCaptionPitch = 13;
constexpr double kCaptionFrame = 5;   // above and below its lines together
constexpr double kCaptionInside = 1;  // by which a caption reaches into the border of its box
constexpr double kFrameReach = 7;     // of the frames around ends and common ancestors

std::string counted(int count, Phrase one, Phrase many, kin::Language language) {
    return phraseWith(count == 1 ? one : many, language, {joined(whole(count))});
}

std::string hiddenMark(const BoxFrame& frame, bool isLiving) {
    const int count = frame.countsHidden && !isLiving ? frame.hiddenCount() : 0;
    return count > 0 ? "+" + std::to_string(count) : "+";
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
        appendBadge(svg, y, badge, theme);
    }
}

}  // namespace

void appendBadge(std::string& svg, double y, const Badge& badge, const DrawingTheme& theme) {
    const std::string_view fill = badge.hollow ? theme.page : theme.badge;
    const std::string_view ink = badge.hollow ? theme.text : theme.badgeText;
    put(svg, "<g><title>", Escaped{badge.title}, "</title>\n<rect x=\"", number(badge.x), "\" y=\"",
        number(y), "\" width=\"", number(badge.width()), "\" height=\"", number(kBadgeHeight),
        "\" rx=\"7.5\" fill=\"", fill, "\" stroke=\"", theme.badge, "\"/>\n");
    appendTextLine(svg, badge.x + badge.width() / 2, y + kBadgeHeight - 4, badge.text,
                   {kMiddle, {kBadgeSize, true}, ink});
    svg += "</g>\n";
}

double badgeTopOf(const BoxFrame& box) {
    return isWide(box) ? box.height - kBadgeHeight - kWideBadgeInset : kBadgeInset;
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

std::string repeatSentence(const BoxFrame& box) {
    return phraseWith(Phrase::inBoxes, box.language,
                      {joined(whole(box.repeatCount)), joined(whole(box.repeatNumber))});
}

std::string furtherSentence(const BoxFrame& frame) {
    const int families = frame.box->furtherParents;
    if (families == 1) return std::string(wordsOf(Phrase::furtherParents, frame.language));
    return phraseWith(Phrase::furtherFamilies, frame.language, {joined(whole(families))});
}

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
    for (const Badge& badge : badges) appendBadge(svg, badgeTopOf(box), badge, theme);
    if (box.text != nullptr && !badges.empty()) box.text->add(kBadgeSize);
}

void appendMarks(std::string& svg, const BoxFrame& box, const DrawingTheme& theme) {
    for (const Side side : {Side::top, Side::right, Side::bottom, Side::left}) {
        appendMarks(svg, box, side, theme);
    }
}

picture::PlateStyle plateStyle() {
    constexpr double kScale = Frame::kScale;
    picture::PlateStyle style;
    style.letters = kCaptionSize / kScale;
    style.pitch = kCaptionPitch / kScale;
    style.inset = kInset / kScale;
    style.frame = kCaptionFrame / kScale;
    style.onBorder = kCaptionInside / kScale;
    style.marks = (kMarkOutside + 1) / kScale;
    style.frames = kFrameReach / kScale;
    return style;
}

void appendPlate(std::string& svg, const BoxFrame& box, const DrawingTheme& theme) {
    if (box.plate == nullptr) return;
    constexpr double kScale = Frame::kScale;
    const double x = (box.plate->x - box.box->x) * kScale;
    const double y = (box.plate->y - box.box->y) * kScale;
    const double width = box.plate->width * kScale;
    put(svg, "<rect x=\"", number(x), "\" y=\"", number(y), "\" width=\"", number(width), "\" height=\"",
        number(box.plate->height * kScale), "\" rx=\"6\" fill=\"", theme.focus, "\"/>\n");
    double baseline = y + kCaptionPitch - 1.5;
    for (const std::string& line : box.plate->lines) {
        appendTextLine(svg, x + width / 2, baseline, line, {kMiddle, {kCaptionSize, true}, theme.page});
        baseline += kCaptionPitch;
    }
    if (box.text != nullptr) box.text->add(kCaptionSize);
}

}  // namespace olvane::draw
