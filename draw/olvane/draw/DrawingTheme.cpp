// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The three sets of colours. The tests hold each to its promise of contrast.

#include <olvane/draw/DrawingTheme.h>

namespace olvane::draw {

const BoxColours& DrawingTheme::coloursOf(kin::Sex sex) const {
    switch (sex) {
        case kin::Sex::male:
            return male;
        case kin::Sex::female:
            return female;
        case kin::Sex::unknown:
            break;
    }
    return other;
}

const DrawingTheme& lightTheme() {
    static constexpr DrawingTheme kTheme = {
        .page = "#ffffff",
        .text = "#1b2330",
        .quietText = "#4a525e",
        .line = "#6b7380",
        .focus = "#b3470f",
        .badge = "#3a4250",
        .badgeText = "#ffffff",
        .unknownParent = "#7a828e",
        .male = {"#d3e3f5", "#2f6199", "#8dacd0"},
        .female = {"#fdeaf1", "#a63d6e", "#d79db8"},
        .other = {"#eeede8", "#66625a", "#aaa69c"},
        .ways = {"#0060a8", "#b3470f", "#00724f", "#8f3f86", "#6b5600", "#00707f", "#a32a3c", "#55504a"},
    };
    return kTheme;
}

const DrawingTheme& darkTheme() {
    static constexpr DrawingTheme kTheme = {
        .page = "#15181d",
        .text = "#f4f6f8",
        .quietText = "#c6cdd6",
        .line = "#98a2af",
        .focus = "#ffb454",
        .badge = "#dfe4ea",
        .badgeText = "#15181d",
        .unknownParent = "#8b95a2",
        .male = {"#18304d", "#7fb0e6", "#4d759f"},
        .female = {"#592740", "#ee9dbf", "#8f5170"},
        .other = {"#35373c", "#b4b4b4", "#6c6d71"},
        .ways = {"#6cb6ff", "#ff9a5c", "#58d3a0", "#e294d8", "#e0c95a", "#5fd0e0", "#ff8f9c", "#c9c4bc"},
    };
    return kTheme;
}

const DrawingTheme& printTheme() {
    static constexpr DrawingTheme kTheme = {
        .page = "#ffffff",
        .text = "#000000",
        .quietText = "#303030",
        .line = "#404040",
        .focus = "#000000",
        .badge = "#202020",
        .badgeText = "#ffffff",
        .unknownParent = "#6a6a6a",
        .male = {"#e8e8e8", "#202020", "#9c9c9c"},
        .female = {"#ffffff", "#202020", "#b4b4b4"},
        .other = {"#f4f4f4", "#202020", "#a8a8a8"},
        .ways = {"#000000", "#303030", "#000000", "#303030", "#000000", "#303030", "#000000", "#303030"},
    };
    return kTheme;
}

const DrawingTheme* themeOfName(std::string_view name) {
    if (name == "light") return &lightTheme();
    if (name == "dark") return &darkTheme();
    if (name == "print") return &printTheme();
    return nullptr;
}

}  // namespace olvane::draw
