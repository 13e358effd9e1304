// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <algorithm>
#include <array>
#include <cmath>
#include <cstddef>
#include <cstdint>
#include <numeric>
#include <set>
#include <utility>
#include <vector>

#include <olvane/kin/shared/MergeSort.h>

namespace olvane::picture {

// An upright rectangle, edges included. It may be as thin as a line.
struct Rect {
    double x1 = 0;
    double y1 = 0;
    double x2 = 0;
    double y2 = 0;
};

// Finds all pairs of rectangles that meet: a sweep over y; the rectangles at the sweep line are kept by the
// magnitude of their width, each class ordered by its left edge, so that a query reads a class from one
// class width left of itself.
//
// Holds: coordinates are finite; rectangles outlive the sweep.
class RectSweep {
public:
    explicit RectSweep(const std::vector<Rect>& rects) : rects_(rects) {}

    // Calls visit(i, j) once for each pair, in an order that depends on the rectangles alone.
    template <class Visit>
    void forEachPair(Visit visit) {
        const std::vector<std::size_t> starts = sortedBy([this](std::size_t i) { return rects_[i].y1; });
        const std::vector<std::size_t> ends = sortedBy([this](std::size_t i) { return rects_[i].y2; });
        std::size_t ended = 0;
        for (const std::size_t i : starts) {
            for (; ended < ends.size() && rects_[ends[ended]].y2 < rects_[i].y1; ++ended) remove(ends[ended]);
            for (std::size_t c = 0; c < classes_.size(); ++c) visitClass(c, i, visit);
            classes_[classOf(rects_[i])].emplace(rects_[i].x1, i);
        }
    }

private:
    static constexpr int kLeastExponent = -2;
    static constexpr std::size_t kClassCount = 40;

    template <class Key>
    std::vector<std::size_t> sortedBy(Key key) const {
        std::vector<std::size_t> order(rects_.size());
        std::iota(order.begin(), order.end(), std::size_t{0});
        kin::mergeSort(order.begin(), order.end(), [&](std::size_t a, std::size_t b) {
            return std::pair(key(a), a) < std::pair(key(b), b);
        });
        return order;
    }

    static double classWidth(std::size_t c) { return std::ldexp(1.0, kLeastExponent + static_cast<int>(c)); }

    // The least class that is as wide; the last one takes whatever is wider.
    static std::size_t classOf(const Rect& r) {
        std::size_t c = 0;
        while (c + 1 < kClassCount && classWidth(c) < r.x2 - r.x1) ++c;
        return c;
    }

    template <class Visit>
    void visitClass(std::size_t c, std::size_t i, Visit& visit) const {
        const auto& active = classes_[c];
        if (active.empty()) return;
        const Rect& r = rects_[i];
        auto at = c + 1 == kClassCount ? active.begin()
                                       : active.lower_bound({r.x1 - classWidth(c), std::size_t{0}});
        for (; at != active.end() && at->first <= r.x2; ++at) {
            if (rects_[at->second].x2 >= r.x1) visit(at->second, i);
        }
    }

    void remove(std::size_t i) { classes_[classOf(rects_[i])].erase({rects_[i].x1, i}); }

    const std::vector<Rect>& rects_;
    std::array<std::set<std::pair<double, std::size_t>>, kClassCount> classes_;
};

}  // namespace olvane::picture
