// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <span>
#include <string_view>

#include <olvane/Export.h>
#include <olvane/charts/Views.h>

namespace olvane::charts {

// What an option takes: one of its words, which stand for 0 and up; yes or no; a whole number; a number; the number of a
// person, 0 for nobody.
enum class OptionKind : std::uint8_t { word, flag, whole, number, person };

// An option by its name, as every front end offers it: what it takes, and what it is where nobody said otherwise.
//
// Holds: least <= usual <= most. Both ends are whole, but for numbers; a word's are the first and the last, a flag's 0 and 1.
struct OptionForm {
    std::string_view name;
    OptionKind kind = OptionKind::flag;
    double least = 0;
    double most = 1;
    double usual = 0;
    std::span<const std::string_view> words{};
};

// Whether the option takes it: a number in its range, and a whole one where it takes no other.
OLVANE_API bool takes(const OptionForm& option, double value);

using ViewSet = std::uint16_t;  // a bit for each view, the first the lowest

constexpr ViewSet setOf(View view) {
    return static_cast<ViewSet>(1u << static_cast<unsigned>(view));
}

// An option of a request for a picture.
//
// set writes what the option takes into a request. Of anything else it writes what the check of the request refuses, if it
// refuses anything.
struct ViewOption {
    OptionForm form;
    ViewSet views = 0;  // that it changes; the others ignore it
    void (*set)(ViewRequest& request, double value) = nullptr;
};

// All of them, the view first. Command, C, Python and JavaScript take their names, their bounds and what they mean from
// here; folded branches and boxes of their own size, which are lists, are not among them.
OLVANE_API std::span<const ViewOption> viewOptions();

// Fails: std::out_of_range for a name that none has.
OLVANE_API const ViewOption& viewOption(std::string_view name);

// A group of relatives that the views family and near show or leave out, by the name that addresses and languages have for
// it. Its place in the list is its bit in the option "shown".
struct RelativeGroup {
    std::string_view name;
    bool LayoutOptions::*shown;
};

OLVANE_API std::span<const RelativeGroup> relativeGroups();

// Shows the groups whose bits are set, and no others.
OLVANE_API void setShown(LayoutOptions& layout, unsigned groups);

// What a list of folded branches names: the branches by their numbers. The views that such a list changes, and those that
// a list of boxes of their own size does.
OLVANE_API std::span<const std::string_view> branchNames();
OLVANE_API ViewSet viewsOfFolds();
OLVANE_API ViewSet viewsOfBoxSizes();

}  // namespace olvane::charts
