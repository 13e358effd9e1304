// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The table of options. Each row has the name, what the option takes, the views that it changes, and where in a request it
// goes. A new option is a row here; what a language or the command adds is its own spelling.

#include <olvane/charts/ViewOption.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <cstddef>
#include <limits>
#include <stdexcept>
#include <string>
#include <type_traits>

#include <olvane/charts/Charts.h>

namespace olvane::charts {

namespace {

constexpr double kMostWhole = std::numeric_limits<std::int32_t>::max();
constexpr double kNoWord = 255;  // of any list of words

constexpr std::array<std::string_view, 10> kViews = {"family",      "pedigree",  "near",      "ancestors",
                                                     "descendants", "hourglass", "relatives", "fan",
                                                     "kinship",     "everybody"};
constexpr std::array<std::string_view, 4> kDirections = {"down", "up", "left", "right"};
constexpr std::array<std::string_view, 2> kFansOf = {"ancestors", "descendants"};
constexpr std::array<std::string_view, 3> kWays = {"blood", "marriage", "both"};
constexpr std::array<std::string_view, 3> kBranches = {"up", "down", "beside"};
constexpr std::array<std::string_view, 3> kLanguages = {kin::languageCode(kin::kLanguages[0]),
                                                        kin::languageCode(kin::kLanguages[1]),
                                                        kin::languageCode(kin::kLanguages[2])};

template <class... Some>
constexpr ViewSet setOfAll(Some... views) {
    return static_cast<ViewSet>((setOf(views) | ...));
}

constexpr ViewSet kEvery = (1u << kViews.size()) - 1;
constexpr ViewSet kEngines = setOfAll(View::family, View::pedigree);
constexpr ViewSet kNearRelatives = setOfAll(View::family, View::near);
constexpr ViewSet kUpwards = setOfAll(View::ancestors, View::hourglass, View::relatives, View::fan);
constexpr ViewSet kDownwards = setOfAll(View::descendants, View::hourglass, View::relatives, View::fan);
constexpr ViewSet kFoldable =
    setOfAll(View::near, View::ancestors, View::descendants, View::hourglass, View::relatives);
constexpr ViewSet kTrees = kFoldable | setOf(View::kinship);
constexpr ViewSet kDirected = kTrees | setOf(View::everybody);

// The value as a field of a request has it. What is out of range of an enumeration stays so.
template <class Field>
Field valueOf(double value) {
    if constexpr (std::is_same_v<Field, bool>) {
        return value != 0;
    } else if constexpr (std::is_floating_point_v<Field>) {
        return static_cast<Field>(value);
    } else if constexpr (std::is_enum_v<Field>) {
        return static_cast<Field>(static_cast<std::uint8_t>(value >= 0 && value < kNoWord ? value : kNoWord));
    } else {
        return static_cast<Field>(std::clamp(value, -kMostWhole, kMostWhole));
    }
}

template <auto... path>
void set(ViewRequest& request, double value) {
    auto& field = (request.*....*path);
    field = valueOf<std::remove_reference_t<decltype(field)>>(value);
}

constexpr auto kChart = &ViewRequest::chart;
constexpr auto kLayout = &ChartRequest::layout;
constexpr auto kSizes = &ChartRequest::sizes;

constexpr OptionForm flag(std::string_view name, bool usual = false) {
    return {name, OptionKind::flag, 0, 1, usual ? 1.0 : 0.0, {}};
}

constexpr OptionForm whole(std::string_view name, double least, double most, double usual = 0) {
    return {name, OptionKind::whole, least, most, usual, {}};
}

constexpr OptionForm number(std::string_view name, double least, double most, double usual) {
    return {name, OptionKind::number, least, most, usual, {}};
}

constexpr OptionForm word(std::string_view name, std::span<const std::string_view> words, int usual = 0) {
    return {name, OptionKind::word, 0, static_cast<double>(words.size()) - 1, static_cast<double>(usual),
            words};
}

constexpr RelativeGroup kGroups[] = {
    {"auntsUncles", &LayoutOptions::auntsUncles},
    {"cousins", &LayoutOptions::cousins},
    {"siblings", &LayoutOptions::siblings},
    {"siblingSpouses", &LayoutOptions::siblingSpouses},
    {"niecesNephews", &LayoutOptions::niecesNephews},
    {"grandchildren", &LayoutOptions::grandchildren},
    {"greatGrandparents", &LayoutOptions::greatGrandparents},
    {"spousesOfChildren", &LayoutOptions::spousesOfChildren},
};
constexpr double kAllGroups = (1u << std::size(kGroups)) - 1;

void setGroups(ViewRequest& request, double value) {
    setShown(request.chart.layout, static_cast<unsigned>(std::clamp(value, 0.0, kAllGroups)));
}

void setOther(ViewRequest& request, double value) {
    set<kChart, &ChartRequest::to>(request, value - 1);
}

void setAllParts(ViewRequest& request, double value) {
    request.chart.onePart = value == 0;
}

constexpr ChartSizes kUsualSizes;
constexpr int kUsualGenerations = 5;  // as LayoutOptions has it

constexpr ViewOption kOptions[] = {
    {word("view", kViews), kEvery, set<kChart, &ChartRequest::view>},
    {whole("shown", 0, kAllGroups, kAllGroups), kNearRelatives, setGroups},
    {whole("generations", 1, LayoutOptions::kMostGenerations, kUsualGenerations), setOf(View::pedigree),
     set<kChart, kLayout, &LayoutOptions::generations>},
    {{"to", OptionKind::person, 0, kMostWhole, 0, {}}, setOf(View::kinship), setOther},
    {whole("up", 0, kMostWhole), kUpwards, set<kChart, &ChartRequest::up>},
    {whole("down", 0, kMostWhole), kDownwards, set<kChart, &ChartRequest::down>},
    {word("direction", kDirections), kDirected, set<kChart, &ChartRequest::direction>},
    {flag("spouses", true), kDownwards, set<kChart, &ChartRequest::spouses>},
    {flag("siblings"), setOfAll(View::ancestors, View::hourglass), set<kChart, &ChartRequest::siblings>},
    {flag("compact"), kDirected, set<kChart, &ChartRequest::compact>},
    {word("fan", kFansOf), setOf(View::fan), set<kChart, &ChartRequest::fanOf>},
    {number("angle", 90, 360, 360), setOf(View::fan), set<kChart, &ChartRequest::fanAngle>},
    {word("ways", kWays, static_cast<int>(WayChoice::both)), setOf(View::kinship),
     set<kChart, &ChartRequest::ways>},
    {whole("mostWays", 0, kMostWhole, 8), setOf(View::kinship), set<kChart, &ChartRequest::mostWays>},
    {word("language", kLanguages), setOf(View::kinship), set<kChart, &ChartRequest::language>},
    {whole("marks", -1, kMostWhole), setOf(View::everybody), set<kChart, &ChartRequest::marks>},
    {whole("effort", 0, 100, 1), setOf(View::everybody), set<kChart, &ChartRequest::effort>},
    {flag("allParts"), setOf(View::everybody), setAllParts},
    {flag("unknownParents", true), kEngines, set<&ViewRequest::unknownParents>},
    {number("width", 0, kLargestSize, kUsualSizes.boxWidth), kEvery,
     set<kChart, kSizes, &ChartSizes::boxWidth>},
    {number("height", 0, kLargestSize, kUsualSizes.boxHeight), kEvery,
     set<kChart, kSizes, &ChartSizes::boxHeight>},
    {number("gapX", 0, kLargestSize, kUsualSizes.gapX), kEvery, set<kChart, kSizes, &ChartSizes::gapX>},
    {number("gapY", 0, kLargestSize, kUsualSizes.gapY), kEvery, set<kChart, kSizes, &ChartSizes::gapY>},
    {number("aspect", 0, kLargestSize, 0), kFoldable | setOf(View::everybody),
     set<kChart, &ChartRequest::aspect>},
    {flag("mirrored"), kEvery, set<kChart, &ChartRequest::mirrored>},
};

}  // namespace

const char* nameOf(View view) {
    const auto number = static_cast<std::size_t>(view);
    return number < kViews.size() ? kViews[number].data() : "";
}

bool takes(const OptionForm& option, double value) {
    const bool isWhole = option.kind == OptionKind::number || value == std::floor(value);
    return isWhole && value >= option.least && value <= option.most;
}

std::span<const ViewOption> viewOptions() {
    return kOptions;
}

const ViewOption& viewOption(std::string_view name) {
    for (const ViewOption& option : kOptions) {
        if (option.form.name == name) return option;
    }
    throw std::out_of_range("there is no option " + std::string(name));
}

std::span<const RelativeGroup> relativeGroups() {
    return kGroups;
}

void setShown(LayoutOptions& layout, unsigned groups) {
    unsigned bit = 1;
    for (const RelativeGroup& group : kGroups) {
        layout.*group.shown = (groups & bit) != 0;
        bit <<= 1;
    }
}

std::span<const std::string_view> branchNames() {
    return kBranches;
}

ViewSet viewsOfFolds() {
    return kFoldable;
}

ViewSet viewsOfBoxSizes() {
    return kDirected;
}

}  // namespace olvane::charts
