// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What the structs of options say, as the libraries in C++ take it. The bridge for Foundation has the same structs.

#include "ViewOptions.h"

#include <cmath>
#include <cstddef>
#include <cstdint>

#include "FileInternal.h"

namespace olvane::c {

namespace {

constexpr int kDefaultGenerations = 5;
constexpr int kDefaultFlagDepth = 4;  // as the family view's own

constexpr std::int32_t kViewCount = 10;

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

bool areSizesOfCharts(const olvane_sizes& sizes) {
    for (const float size : {sizes.node_width, sizes.node_height, sizes.horz_padding, sizes.vert_padding}) {
        if (!(size >= 0)) return false;
    }
    return true;
}

bool areFolds(const olvane_fold* folds, std::size_t count) {
    if (!folds && count > 0) return false;
    for (std::size_t i = 0; i < count; ++i) {
        if (!isOneOf(folds[i].branch, 3)) return false;
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

// All enumerations of a request have fewer than 255 entries.
template <class Choice>
Choice choice(std::int32_t number) {
    return static_cast<Choice>(isOneOf(number, 255) ? number : 255);
}

}  // namespace

olvane_options defaultOptions() {
    const TreeSize size = familyTreeSize();
    olvane_options options;
    options.struct_size = sizeof(olvane_options);
    options.sizes = {size.nodeWidth,   size.nodeHeight,     size.horzPadding,
                     size.vertPadding, size.spouseLineStep, size.lineInset};
    options.shown = OLVANE_SHOW_ALL;
    options.generations = kDefaultGenerations;
    options.flag_depth = kDefaultFlagDepth;
    return options;
}

LayoutOptions layoutOptionsOf(const olvane_options& options) {
    LayoutOptions result;
    result.sizes = treeSizeOf(options.sizes);
    result.auntsUncles = (options.shown & OLVANE_SHOW_AUNTS_UNCLES) != 0;
    result.cousins = (options.shown & OLVANE_SHOW_COUSINS) != 0;
    result.siblings = (options.shown & OLVANE_SHOW_SIBLINGS) != 0;
    result.siblingSpouses = (options.shown & OLVANE_SHOW_SIBLING_SPOUSES) != 0;
    result.niecesNephews = (options.shown & OLVANE_SHOW_NIECES_NEPHEWS) != 0;
    result.grandchildren = (options.shown & OLVANE_SHOW_GRANDCHILDREN) != 0;
    result.greatGrandparents = (options.shown & OLVANE_SHOW_GREAT_GRANDPARENTS) != 0;
    result.spousesOfChildren = (options.shown & OLVANE_SHOW_SPOUSES_OF_CHILDREN) != 0;
    result.generations = options.generations;
    result.flagDepth = options.flag_depth;
    return result;
}

bool areInRange(const olvane_options& options) {
    return options.struct_size == sizeof(olvane_options) && areFinite(options.sizes) &&
           (options.shown & ~OLVANE_SHOW_ALL) == 0 && options.generations >= 1 &&
           options.generations <= OLVANE_MOST_GENERATIONS && options.flag_depth >= 0;
}

bool areInRange(const olvane_picture_options& options) {
    return options.struct_size == sizeof(olvane_picture_options) && isOneOf(options.view, kViewCount) &&
           areSizesOfCharts(options.layout.sizes) && areFolds(options.folds, options.fold_count) &&
           areBoxSizes(options.box_sizes, options.box_size_count) && options.aspect >= 0 &&
           std::isfinite(options.aspect) && options.up >= 0 && options.down >= 0 &&
           isOneOf(options.direction, 4) && isOneOf(options.fan_of, 2) && options.fan_angle >= 90 &&
           options.fan_angle <= 360 && isOneOf(options.ways, 3) && options.most_ways >= 0 &&
           isOneOf(options.language, 3) && options.marks >= -1 && isOneOf(options.effort, 101) &&
           isOneOf(options.year, kLastYear + 1) && areInRange(options.layout);
}

AskedView::AskedView(const olvane_picture_options& options) {
    charts::ChartRequest& chart = request.chart;
    chart.view = choice<charts::View>(options.view);
    chart.up = options.up;
    chart.down = options.down;
    chart.direction = choice<charts::Direction>(options.direction);
    chart.spouses = options.spouses != 0;
    chart.siblings = options.siblings != 0;
    chart.compact = options.compact != 0;
    chart.mirrored = options.mirrored != 0;
    chart.fanOf = choice<charts::FanOf>(options.fan_of);
    chart.fanAngle = options.fan_angle;
    chart.ways = choice<charts::WayChoice>(options.ways);
    chart.mostWays = options.most_ways;
    chart.language = choice<kin::Language>(options.language);
    chart.marks = options.marks;
    chart.effort = options.effort;
    chart.onePart = options.all_parts == 0;
    chart.layout = layoutOptionsOf(options.layout);
    chart.sizes = {options.layout.sizes.node_width, options.layout.sizes.node_height,
                   options.layout.sizes.horz_padding, options.layout.sizes.vert_padding};
    request.unknownParents = options.unknown_parents != 0;
    for (std::size_t i = 0; i < options.fold_count; ++i) {
        folds.push_back({options.folds[i].person, choice<picture::Branch>(options.folds[i].branch)});
    }
    chart.folded = folds;
    for (std::size_t i = 0; i < options.box_size_count; ++i) {
        const olvane_box_size& box = options.box_sizes[i];
        boxSizes.push_back({box.person, {box.width, box.height}});
    }
    chart.sizedBoxes = boxSizes;
    chart.aspect = options.aspect;
}

}  // namespace olvane::c

olvane_status olvane_options_default(olvane_options* options) {
    if (!options) return OLVANE_INVALID_ARGUMENT;
    *options = olvane::c::defaultOptions();
    return OLVANE_OK;
}

olvane_status olvane_picture_options_default(int32_t view, olvane_picture_options* options) {
    if (!options || !olvane::c::isOneOf(view, olvane::c::kViewCount)) return OLVANE_INVALID_ARGUMENT;
    *options = {};
    options->struct_size = sizeof(olvane_picture_options);
    options->view = view;
    options->spouses = 1;
    options->fan_angle = 360;
    options->ways = 2;
    options->most_ways = 8;
    options->effort = 1;
    options->unknown_parents = 1;
    return olvane_options_default(&options->layout);
}
