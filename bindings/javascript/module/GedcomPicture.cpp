// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Pictures of an open GEDCOM file, and of a host in JavaScript, as runs of numbers.

#include <array>
#include <cstdint>
#include <exception>
#include <string>
#include <utility>
#include <vector>

#include <olvane/charts/Folding.h>
#include <olvane/charts/Views.h>
#include <olvane/picture/MarriageLabels.h>

#include <HostSource.h>
#include <LayoutInternal.h>

#include "HostImports.h"
#include "OpenFile.h"
#include "PictureAnswer.h"
#include "PictureArt.h"
#include "PictureRequest.h"

#define OLVANE_EXPORT(name) extern "C" __attribute__((export_name(name)))

namespace olvane::js {

namespace {

olvane_status lastStatus = OLVANE_OK;

std::string lastArt;  // of the last picture that was asked for with it

}  // namespace
}  // namespace olvane::js

using namespace olvane;
using js::OpenFile;

// With the words of a kinship in last_text, and behind its numbers a place for each family's label where labels are asked for. Null for a picture that is refused; last_text then says why.
OLVANE_EXPORT("gedcom_picture") std::vector<double>* gedcomPicture(OpenFile* file, std::int32_t focus) {
    std::vector<picture::LabelPlace> labels;
    double labelSize = 0;
    const auto make = [&] {
        const js::PictureRequest asked = js::requestOf(focus - 1);
        picture::Picture picture = js::pictureOf(*file, asked);
        labelSize = asked.labelSize;
        if (labelSize > 0) labels = picture::marriageLabelPlaces(picture, labelSize);
        js::lastArt = asked.paths ? js::artOf(picture, asked.view.chart.language) : std::string();
        return picture;
    };
    return js::pictureAnswer(make, [&](std::vector<double>& numbers) {
        for (const picture::LabelPlace& label : labels) {
            const picture::LabelOffset offset = picture::labelOffsetOf(label.side, labelSize);
            numbers.insert(numbers.end(), {label.x, label.y, static_cast<double>(label.side),
                                           label.x + offset.x, label.y + offset.y});
        }
    });
}

// What is drawn of that picture, where it was asked for with its paths.
OLVANE_EXPORT("picture_art") const char* pictureArt() {
    return js::lastArt.c_str();
}

// How many persons the branches up, down and beside of a person have for themselves, and on which side of the box each
// stands: six numbers. Null for a picture that is refused; last_text then says why.
OLVANE_EXPORT("gedcom_branches")
const std::int32_t* gedcomBranches(OpenFile* file, std::int32_t focus, std::int32_t person) {
    static std::array<std::int32_t, 6> answer;
    try {
        const js::PictureRequest request = js::requestOf(focus - 1);
        const charts::ChartRequest chart = js::viewOf(request).chart;
        const auto sizes = charts::branchSizes(file->kin(request.parents), chart, person);
        for (std::size_t i = 0; i < sizes.size(); ++i) {
            const auto branch = static_cast<picture::Branch>(i);
            answer.at(2 * i) = sizes.at(i);
            answer.at(2 * i + 1) = static_cast<std::int32_t>(charts::sideOf(branch, chart));
        }
        return answer.data();
    } catch (const std::exception& error) {
        js::lastText = error.what();
        return nullptr;
    }
}

// A picture of a host in JavaScript. Null where it failed; picture_status then says how, and last_text why.
OLVANE_EXPORT("host_picture") std::vector<double>* hostPicture(std::int32_t focus) {
    std::vector<double>* answer = nullptr;
    std::string failure;
    const auto ask = [&] {
        const olvane_host host = js::hostOfJavaScript();
        const js::PictureRequest request = js::requestOf(0);
        const charts::ViewRequest view = js::viewOf(request);
        // The other person of a kinship is written down as a place, one less than the id.
        picture::Picture picture =
            charts::pictureOfHost(c::sourceOf(host), focus, view, std::int64_t{view.chart.to} + 1);
        answer = js::pictureAnswer([&] { return std::move(picture); });
    };
    js::lastStatus = OLVANE_NESTED_CALL;
    c::unlessNested([&] { js::lastStatus = c::guarded(ask, failure); });
    if (js::lastStatus != OLVANE_OK) js::lastText = failure;
    return answer;
}

OLVANE_EXPORT("picture_status") int pictureStatus() {
    return js::lastStatus;
}
