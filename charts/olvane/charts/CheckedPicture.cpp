// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/charts/CheckedPicture.h>

#include <cmath>
#include <stdexcept>

namespace olvane::charts {

namespace {

void require(bool condition, const char* cause) {
    if (!condition) throw std::invalid_argument(cause);
}

template <class Enumeration>
bool isUpTo(Enumeration value, Enumeration last) {
    return static_cast<std::uint8_t>(value) <= static_cast<std::uint8_t>(last);
}

void checkChoices(const ChartRequest& chart) {
    require(isUpTo(chart.view, View::everybody), "view is none of the views");
    require(isUpTo(chart.direction, Direction::right), "direction is none of the four");
    require(isUpTo(chart.fanOf, FanOf::descendants), "fanOf is neither ancestors nor descendants");
    require(isUpTo(chart.ways, WayChoice::both), "ways is none of blood, marriage and both");
    require(isUpTo(chart.language, kin::Language::spanish), "language is none of those that are known");
    for (const Fold& fold : chart.folded) {
        require(isUpTo(fold.branch, picture::Branch::beside), "branch is none of up, down and beside");
    }
}

void checkNumbers(const ChartRequest& chart) {
    const ChartSizes& sizes = chart.sizes;
    require(chart.up >= 0, "up is below 0");
    require(chart.down >= 0, "down is below 0");
    require(chart.fanAngle >= 90 && chart.fanAngle <= 360, "fanAngle is not between 90 and 360");
    require(chart.mostWays >= 0, "mostWays is below 0");
    require(chart.marks >= -1, "marks is below -1");
    require(chart.effort >= 0 && chart.effort <= 100, "effort is not between 0 and 100");
    require(isSize(sizes.boxWidth) && isSize(sizes.boxHeight) && isSize(sizes.gapX) && isSize(sizes.gapY),
            "a size is not between 0 and a million points");
    for (const SizedBox& box : chart.sizedBoxes) {
        require(isSize(box.size.width) && isSize(box.size.height),
                "the size of a box is not between 0 and a million points");
    }
    require(chart.aspect >= 0 && std::isfinite(chart.aspect), "aspect is below 0 or not finite");
    require(chart.boxSizes.empty(), "boxSizes are for a graph, not for a host");
}

// What is asked for, so that a closure captures one reference and needs no memory of its own.
struct Work {
    std::int64_t focus;
    const ViewRequest& request;
    std::int64_t other;
    picture::Picture& picture;
    bool isConnected = true;

    void run(const std::shared_ptr<OlvaneViewerManagerWrapProtocol>& checked) {
        checkChoices(request.chart);
        checkNumbers(request.chart);
        try {
            picture = pictureOfHost(checked, focus, request, other);
        } catch (const std::out_of_range&) {
            if (request.chart.view != View::kinship) throw;
            isConnected = false;
            throw std::out_of_range("not connected with the focus");
        }
    }
};

}  // namespace

CheckedPicture checkedPicture(const std::shared_ptr<OlvaneViewerManagerWrapProtocol>& host,
                              std::int64_t focus, const ViewRequest& request, std::int64_t other) noexcept {
    CheckedPicture result;
    Work work{focus, request, other, result.picture};
    static_cast<CheckedOutcome&>(result) = checkedRun(
        host, focus,
        [&work](const std::shared_ptr<OlvaneViewerManagerWrapProtocol>& checked) { work.run(checked); });
    if (!work.isConnected && result.status == CheckedStatus::layoutFailed) {
        result.status = CheckedStatus::invalidPerson;
        result.reason.person = other;
    }
    return result;
}

}  // namespace olvane::charts
