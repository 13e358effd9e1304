// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What the structs of options say, as the libraries in C++ take it. The bridge for Foundation has the same structs.

#include "ViewOptions.h"

#include <cmath>
#include <cstddef>
#include <cstdint>
#include <iterator>
#include <string_view>
#include <type_traits>

#include <olvane/charts/ViewOption.h>

#include "FileInternal.h"

namespace olvane::c {

namespace {

bool areFinite(const olvane_sizes& sizes) {
    for (const float size : {sizes.node_width, sizes.node_height, sizes.horz_padding, sizes.vert_padding,
                             sizes.spouse_line_step, sizes.line_inset}) {
        if (!std::isfinite(size)) return false;
    }
    return true;
}

TreeSize treeSizeOf(const olvane_sizes& sizes) {
    TreeSize size;
    size.nodeWidth = sizes.node_width;
    size.nodeHeight = sizes.node_height;
    size.horzPadding = sizes.horz_padding;
    size.vertPadding = sizes.vert_padding;
    size.spouseLineStep = sizes.spouse_line_step;
    size.lineInset = sizes.line_inset;
    return size;
}

bool areFolds(const olvane_fold* folds, std::size_t count) {
    if (!folds && count > 0) return false;
    for (std::size_t i = 0; i < count; ++i) {
        if (!isOneOf(folds[i].branch, static_cast<std::int32_t>(charts::branchNames().size()))) return false;
    }
    return true;
}

bool areBoxSizes(const olvane_box_size* sizes, std::size_t count) {
    if (!sizes && count > 0) return false;
    for (std::size_t i = 0; i < count; ++i) {
        if (!charts::isSize(sizes[i].width) || !charts::isSize(sizes[i].height)) return false;
    }
    return true;
}

template <auto... path>
double read(const olvane_picture_options& options) {
    return static_cast<double>((options.*....*path));
}

template <auto... path>
void write(olvane_picture_options& options, double value) {
    auto& field = (options.*....*path);
    field = static_cast<std::remove_reference_t<decltype(field)>>(value);
}

// An option of a request, as the struct has it. The names of fields never change, whatever the option's own is.
struct Field {
    std::string_view option;
    const char* name;
    double (*read)(const olvane_picture_options& options);
    void (*write)(olvane_picture_options& options, double value);
};

template <auto... path>
constexpr Field fieldOf(std::string_view option, const char* name) {
    return {option, name, read<path...>, write<path...>};
}

using Options = olvane_picture_options;
constexpr auto kLayout = &Options::layout;
constexpr auto kSizes = &olvane_options::sizes;

constexpr Field kFields[] = {
    fieldOf<&Options::view>("view", "view"),
    fieldOf<&Options::up>("up", "up"),
    fieldOf<&Options::down>("down", "down"),
    fieldOf<&Options::direction>("direction", "direction"),
    fieldOf<&Options::spouses>("spouses", "spouses"),
    fieldOf<&Options::siblings>("siblings", "siblings"),
    fieldOf<&Options::compact>("compact", "compact"),
    fieldOf<&Options::fan_of>("fan", "fan_of"),
    fieldOf<&Options::fan_angle>("angle", "fan_angle"),
    fieldOf<&Options::ways>("ways", "ways"),
    fieldOf<&Options::most_ways>("mostWays", "most_ways"),
    fieldOf<&Options::language>("language", "language"),
    fieldOf<&Options::marks>("marks", "marks"),
    fieldOf<&Options::effort>("effort", "effort"),
    fieldOf<&Options::all_parts>("allParts", "all_parts"),
    fieldOf<&Options::unknown_parents>("unknownParents", "unknown_parents"),
    fieldOf<&Options::mirrored>("mirrored", "mirrored"),
    fieldOf<kLayout, &olvane_options::shown>("shown", "layout.shown"),
    fieldOf<kLayout, &olvane_options::generations>("generations", "layout.generations"),
    fieldOf<kLayout, kSizes, &olvane_sizes::node_width>("width", "layout.sizes.node_width"),
    fieldOf<kLayout, kSizes, &olvane_sizes::node_height>("height", "layout.sizes.node_height"),
    fieldOf<kLayout, kSizes, &olvane_sizes::horz_padding>("gapX", "layout.sizes.horz_padding"),
    fieldOf<kLayout, kSizes, &olvane_sizes::vert_padding>("gapY", "layout.sizes.vert_padding"),
    fieldOf<&Options::aspect>("aspect", "aspect"),
};

// In C whatever is not 0 is yes.
bool isTaken(const charts::OptionForm& option, double value) {
    return option.kind == charts::OptionKind::flag || charts::takes(option, value);
}

}  // namespace

olvane_options defaultOptions() {
    const TreeSize size = familyTreeSize();
    olvane_options options;
    options.struct_size = sizeof(olvane_options);
    options.sizes = {size.nodeWidth,   size.nodeHeight,     size.horzPadding,
                     size.vertPadding, size.spouseLineStep, size.lineInset};
    options.shown = OLVANE_SHOW_ALL;
    options.generations = LayoutOptions().generations;
    options.flag_depth = LayoutOptions().flagDepth;
    return options;
}

LayoutOptions layoutOptionsOf(const olvane_options& options) {
    LayoutOptions result;
    result.sizes = treeSizeOf(options.sizes);
    charts::setShown(result, options.shown);
    result.generations = options.generations;
    result.flagDepth = options.flag_depth;
    return result;
}

bool areInRange(const olvane_options& options) {
    return options.struct_size == sizeof(olvane_options) && areFinite(options.sizes) &&
           (options.shown & ~OLVANE_SHOW_ALL) == 0 && options.generations >= 1 &&
           options.generations <= OLVANE_MOST_GENERATIONS && options.flag_depth >= 0;
}

const char* refusedOption(const olvane_picture_options& options) {
    if (options.struct_size != sizeof(olvane_picture_options)) return "struct_size";
    for (const Field& field : kFields) {
        if (!isTaken(charts::viewOption(field.option).form, field.read(options))) return field.name;
    }
    if (!areFolds(options.folds, options.fold_count)) return "folds";
    if (!areBoxSizes(options.box_sizes, options.box_size_count)) return "box_sizes";
    if (!isOneOf(options.year, kLastYear + 1)) return "year";
    return areInRange(options.layout) ? nullptr : "layout";
}

void setDefaults(olvane_picture_options& options) {
    options = {};
    options.struct_size = sizeof(olvane_picture_options);
    options.layout = defaultOptions();
    for (const Field& field : kFields) field.write(options, charts::viewOption(field.option).form.usual);
}

std::size_t optionCount() {
    return std::size(kFields);
}

void describeOption(std::size_t index, olvane_picture_option& option) {
    const Field& field = kFields[index];
    const charts::ViewOption& known = charts::viewOption(field.option);
    option.name = field.name;
    option.kind = static_cast<std::int32_t>(known.form.kind);
    option.least = known.form.least;
    option.most = known.form.most;
    option.usual = known.form.usual;
    option.views = known.views;
}

const char* wordOfOption(std::size_t index, std::size_t word) {
    if (index >= std::size(kFields)) return nullptr;
    const auto words = charts::viewOption(kFields[index].option).form.words;
    return word < words.size() ? words[word].data() : nullptr;  // a literal, so a zero byte ends it
}

AskedView::AskedView(const olvane_picture_options& options) {
    charts::ChartRequest& chart = request.chart;
    chart.layout = layoutOptionsOf(options.layout);
    for (const Field& field : kFields) charts::viewOption(field.option).set(request, field.read(options));
    for (std::size_t i = 0; i < options.fold_count; ++i) {
        const olvane_fold& fold = options.folds[i];
        folds.push_back(
            {fold.person, static_cast<picture::Branch>(isOneOf(fold.branch, 255) ? fold.branch : 255)});
    }
    chart.folded = folds;
    for (std::size_t i = 0; i < options.box_size_count; ++i) {
        const olvane_box_size& box = options.box_sizes[i];
        boxSizes.push_back({box.person, {box.width, box.height}});
    }
    chart.sizedBoxes = boxSizes;
}

}  // namespace olvane::c

olvane_status olvane_options_default(olvane_options* options) {
    if (!options) return OLVANE_INVALID_ARGUMENT;
    *options = olvane::c::defaultOptions();
    return OLVANE_OK;
}

olvane_status olvane_picture_options_default(int32_t view, olvane_picture_options* options) {
    const bool isView = olvane::charts::takes(olvane::charts::viewOption("view").form, view);
    if (!options || !isView) return OLVANE_INVALID_ARGUMENT;
    olvane::c::setDefaults(*options);
    options->view = view;
    return OLVANE_OK;
}

olvane_status olvane_picture_options_check(const olvane_picture_options* options, const char** refused) {
    if (!options || !refused) return OLVANE_INVALID_ARGUMENT;
    *refused = olvane::c::refusedOption(*options);
    return *refused ? OLVANE_INVALID_ARGUMENT : OLVANE_OK;
}

size_t olvane_picture_option_count(void) {
    return olvane::c::optionCount();
}

olvane_status olvane_picture_option_at(size_t index, olvane_picture_option* option) {
    if (!option || option->struct_size != sizeof(olvane_picture_option) || index >= olvane::c::optionCount())
        return OLVANE_INVALID_ARGUMENT;
    olvane::c::describeOption(index, *option);
    return OLVANE_OK;
}

const char* olvane_picture_option_word(size_t index, size_t word) {
    return olvane::c::wordOfOption(index, word);
}
