// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Draws the boxes, part by part. A tall box has the silhouette on top and centred lines below it; a wide one, as sideways
// pictures use, has the silhouette at the left and lines beside it.

#include <olvane/draw/BoxArtInternal.h>

#include <string_view>
#include <vector>

#include <olvane/draw/BoxPartsInternal.h>
#include <olvane/draw/DrawingWordsInternal.h>
#include <olvane/draw/SvgTextInternal.h>

namespace olvane::draw {

namespace {

// All in px.
constexpr double kSilhouetteHeight = 40;
constexpr double kFocusBorder = 4;

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

// Cut to its place, never stretched.
void appendPhoto(std::string& svg, const BoxFrame& box) {
    const double x = isWide(box) ? kInset : (box.width - kPhotoWidth) / 2;
    const double height = isWide(box) ? box.height - 2 * kPhotoTop : kTallPhotoHeight;
    put(svg, "<image href=\"", Escaped{box.photo}, "\" x=\"", number(x), "\" y=\"", number(kPhotoTop),
        "\" width=\"", number(kPhotoWidth), "\" height=\"", number(height),
        "\" preserveAspectRatio=\"xMidYMid slice\"/>\n");
}

std::string titleOf(const BoxFrame& box, const kin::PersonLabel& label) {
    std::string title = kin::fullName(label, box.language);
    const std::string life = kin::lifeWords(label);
    if (!life.empty()) put(title, ", ", life);
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
        if (shown.given.empty() && shown.surname.empty()) shown.given = kin::unnamedText(language);
        return shown;
    }
    kin::PersonLabel shown;
    shown.given = kin::livingText(language);
    shown.living = true;
    return shown;
}

}  // namespace

kin::PersonLabel readableLabel(const DrawingContent& content, std::int64_t id) {
    kin::PersonLabel label = content.labelOf(id);
    for (std::string* text : {&label.given, &label.surname, &label.birth, &label.death, &label.life})
        *text = picture::cutText(*text);
    for (std::string& detail : label.details) detail = picture::cutText(detail);
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
    if (!box.photo.empty()) {
        appendPhoto(svg, box);
    } else if (!isForPaper(box)) {
        appendSilhouette(svg, box, shown.sex, theme);
    }
    const std::vector<Badge> badges = badgesOf(box, label.living);
    appendTexts(svg, box, shown, badges, theme);
    appendBadges(svg, box, badges, theme);
    appendMarks(svg, box, theme);
    appendPlate(svg, box, theme);
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
    appendInvitation(svg, box, invitation, theme);
    svg += "</g>\n";
}

}  // namespace olvane::draw
