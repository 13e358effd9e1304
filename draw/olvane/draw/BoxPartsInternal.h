// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <algorithm>
#include <string>
#include <string_view>
#include <vector>

#include <olvane/draw/BoxArtInternal.h>
#include <olvane/picture/TextFit.h>

namespace olvane::draw {

// The parts of a person's box, in the order in which they are drawn, and what they share. All lengths in px.

constexpr double kInset = 7;  // from the border to any text
constexpr double kSilhouetteWidth = 44;
constexpr double kPhotoWidth = 42;  // of a photograph
constexpr double kPhotoTop = 6;     // and from the upper edge of its box
constexpr double kTallPhotoHeight = 50;
constexpr double kMarkInside = 3;  // by which a mark at the edge reaches into its box, where no text goes
constexpr double kBadgeHeight = kMarkInside + kMarkOutside;
constexpr double kBadgeSize = 10;
constexpr double kBadgeInset = 6;

inline bool isWide(const BoxFrame& box) {
    return box.width > box.height;
}

// Whether names are larger than beside or below a silhouette.
bool isForPaper(const BoxFrame& box);

// A pill with a title of its own.
struct Badge {
    std::string text;
    std::string title;
    bool hollow = false;
    double x = 0;

    double width() const {
        return std::max(kBadgeHeight + 3, picture::textWidth(text, {kBadgeSize, true}) + 9);
    }
};

// The upper edge of a box's badges: on top of a tall box, where the silhouette leaves room, and at the foot of a wide
// one, beside the years.
double badgeTopOf(const BoxFrame& box);

struct TextLook {
    std::string_view anchor;  // an attribute
    picture::Font font;
    std::string_view colour;
};

constexpr std::string_view kMiddle = " text-anchor=\"middle\"";

// Appends one line of text; y is its baseline.
void appendTextLine(std::string& svg, double x, double y, std::string_view text, const TextLook& look);

// What the badges state in words.
std::string hiddenSentence(const BoxFrame& frame, bool isLiving);
std::string repeatSentence(const BoxFrame& box);
std::string furtherSentence(const BoxFrame& frame);

// The count of hidden relatives in the right corner; the repeat mark and that of further parents in the left one, or
// before it in a wide box.
std::vector<Badge> badgesOf(const BoxFrame& box, bool isLiving);

// Name, years and details, beside the badges.
void appendTexts(std::string& svg, const BoxFrame& box, const kin::PersonLabel& label,
                 const std::vector<Badge>& badges, const DrawingTheme& theme);

// The invitation in the box of an unknown parent.
void appendInvitation(std::string& svg, const BoxFrame& box, std::string_view invitation,
                      const DrawingTheme& theme);

// One badge, of which y is the upper edge.
void appendBadge(std::string& svg, double y, const Badge& badge, const DrawingTheme& theme);

// The sign of a person with further parents.
constexpr std::string_view kTwoUp = "\xE2\x87\x88";

void appendBadges(std::string& svg, const BoxFrame& box, const std::vector<Badge>& badges,
                  const DrawingTheme& theme);

// The marks at the four edges.
void appendMarks(std::string& svg, const BoxFrame& box, const DrawingTheme& theme);

// What the person is to the other one of a kinship, on a plate outside the box. Nothing without one.
void appendPlate(std::string& svg, const BoxFrame& box, const DrawingTheme& theme);

}  // namespace olvane::draw
