// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Pictures in C: one of each view of a family, a file or a host, or of a layout; its JSON, and what the judge counts.

#include <olvane_picture.h>

#include <cstddef>
#include <functional>
#include <memory>
#include <mutex>
#include <new>
#include <stdexcept>
#include <string>
#include <utility>
#include <vector>

#include "FamilyInternal.h"
#include "FileInternal.h"
#include "HostSource.h"
#include "LayoutInternal.h"
#include "PictureArrays.h"
#include "ViewOptions.h"

#include <olvane/charts/Views.h>
#include <olvane/picture/HiddenPersons.h>
#include <olvane/picture/Judge.h>
#include <olvane/picture/LayoutPicture.h>
#include <olvane/picture/PictureJson.h>
#include <olvane/source/GedcomDataSource.h>
#include <olvane/source/LimitedDataSource.h>

namespace {

namespace picture = olvane::picture;
namespace charts = olvane::charts;

// The request, with the places of an earlier picture where that was laid out alike.
struct Request : olvane::c::AskedView {
    explicit Request(const olvane_picture_options& options) : AskedView(options) {
        const olvane_picture* earlier = options.earlier;
        if (earlier && earlier->direction == options.direction &&
            earlier->mirrored == request.chart.mirrored && earlier->source.view == "everybody")
            request.chart.earlier = &earlier->source;
    }
};

void fillAsked(picture::Picture from, const olvane_picture_options& options, olvane_picture& to) {
    olvane::c::fill(std::move(from), to);
    to.direction = options.direction;
    to.mirrored = options.mirrored != 0;
}

olvane_picture_options chosenOptions(const olvane_picture_options* options) {
    olvane_picture_options chosen;
    if (options) return *options;
    olvane_picture_options_default(OLVANE_PICTURE_FAMILY, &chosen);
    return chosen;
}

// Runs what fills a picture; a failure is stated in an empty picture.
template <class Work>
olvane_status make(const Work& work, olvane_picture** picture) noexcept {
    try {
        auto made = std::make_unique<olvane_picture>();
        const olvane_status status = olvane::c::guarded([&] { work(*made); }, made->failure);
        *picture = made.release();
        return status;
    } catch (...) {
        return OLVANE_OUT_OF_MEMORY;  // nothing else can fail here
    }
}

// The same, unless a layout of a host is running on this thread.
template <class Work>
olvane_status makeUnlessNested(const Work& work, olvane_picture** picture) noexcept {
    olvane_status status = OLVANE_NESTED_CALL;
    const auto makeIt = [&] { status = make(work, picture); };
    olvane::c::unlessNested(std::cref(makeIt));  // a copy would allocate, outside of all guards
    return status;
}

void fillFromFile(const olvane_file& file, std::int64_t focus, const olvane_picture_options& options,
                  olvane_picture& to) {
    const auto placeOf = [&file](std::int64_t person) {
        if (!file.has(person)) throw std::out_of_range("no person of the file");
        return file.graph().placeOf(person);
    };
    Request asked(options);
    charts::ChartRequest& chart = asked.request.chart;
    chart.focus = placeOf(focus);
    if (chart.view == charts::View::kinship) chart.to = placeOf(options.other);
    olvane::gedcom::GedcomDataSource people(file.data);
    const auto source =
        std::make_shared<olvane::gedcom::LimitedDataSource>(people, olvane::c::kMostRelatives);
    picture::Picture made = charts::pictureOf(source, file.graph(), asked.request);
    const std::vector<bool> hidden =
        options.hide_living != 0 ? file.living(options.year) : std::vector<bool>();
    picture::hidePersons(hidden, made);
    fillAsked(std::move(made), options, to);
    for (olvane_picture_box& box : to.boxes) box.living = picture::isHidden(hidden, box.id) ? 1 : 0;
}

olvane_judgement judgementOf(const picture::Judgement& found) {
    const auto number = [](std::size_t count) { return static_cast<std::int64_t>(count); };
    return {sizeof(olvane_judgement),
            number(found.boxes),
            number(found.persons),
            number(found.families),
            number(found.overlaps),
            number(found.hits),
            number(found.crossings),
            number(found.tracks),
            number(found.touches),
            number(found.unjoined),
            found.untold ? number(*found.untold) : -1,
            number(found.couples),
            number(found.sideBySide),
            number(found.repeats),
            number(found.unmarked),
            number(found.slanted),
            number(found.samePersonMarks),
            number(found.parentsElsewhereMarks),
            number(found.partnersElsewhereMarks),
            found.width,
            found.height,
            found.areaPerPerson,
            found.aspect,
            found.medianLineLength,
            found.longLineLength};
}

}  // namespace

olvane_status olvane_picture_of_family(const olvane_family* family, int64_t focus,
                                       const olvane_picture_options* options, olvane_picture** picture) {
    if (!picture) return OLVANE_INVALID_ARGUMENT;
    *picture = nullptr;
    const olvane_picture_options chosen = chosenOptions(options);
    if (!family || !olvane::c::areInRange(chosen) || chosen.hide_living != 0) return OLVANE_INVALID_ARGUMENT;
    const auto work = [&](olvane_picture& made) {
        fillAsked(charts::pictureOf(family->table, focus, Request(chosen).request, chosen.other), chosen,
                  made);
    };
    return makeUnlessNested(work, picture);
}

olvane_status olvane_picture_of_file(const olvane_file* file, int64_t focus,
                                     const olvane_picture_options* options, olvane_picture** picture) {
    if (!picture) return OLVANE_INVALID_ARGUMENT;
    *picture = nullptr;
    const olvane_picture_options chosen = chosenOptions(options);
    if (!file || !olvane::c::areInRange(chosen)) return OLVANE_INVALID_ARGUMENT;
    return makeUnlessNested([&](olvane_picture& made) { fillFromFile(*file, focus, chosen, made); }, picture);
}

olvane_status olvane_picture_of_host(const olvane_host* host, int64_t focus,
                                     const olvane_picture_options* options, olvane_picture** picture) {
    if (!picture) return OLVANE_INVALID_ARGUMENT;
    *picture = nullptr;
    const olvane_picture_options chosen = chosenOptions(options);
    if (!host || !olvane::c::isComplete(*host) || !olvane::c::areInRange(chosen) || chosen.hide_living != 0) {
        return OLVANE_INVALID_ARGUMENT;
    }
    const auto work = [&](olvane_picture& made) {
        if (!olvane::c::isPersonId(focus)) throw std::out_of_range("no id of a person");
        fillAsked(
            charts::pictureOfHost(olvane::c::sourceOf(*host), focus, Request(chosen).request, chosen.other),
            chosen, made);
    };
    return makeUnlessNested(work, picture);
}

olvane_status olvane_picture_failure(const olvane_picture* picture, const char** text) {
    if (!picture || !text) return OLVANE_INVALID_ARGUMENT;
    *text = picture->failure.c_str();
    return OLVANE_OK;
}

olvane_status olvane_picture_create(const olvane_layout* layout, const olvane_family* family,
                                    int unknown_parents, olvane_picture** picture) {
    if (!picture) return OLVANE_INVALID_ARGUMENT;
    *picture = nullptr;
    if (!layout) return OLVANE_INVALID_ARGUMENT;
    try {
        olvane::kin::KinGraph known;
        picture::LayoutPictureOptions options;
        options.unknownParents = unknown_parents != 0;
        if (family) {
            known = olvane::kinGraphOf(family->table);
            options.known = &known;
        }
        auto made = std::make_unique<olvane_picture>();
        olvane::c::fill(picture::pictureOf(layout->typed, options), *made);
        *picture = made.release();
    } catch (...) {
        return OLVANE_OUT_OF_MEMORY;  // nothing else can fail here
    }
    return OLVANE_OK;
}

void olvane_picture_free(olvane_picture* picture) {
    delete picture;
}

olvane_status olvane_picture_json(const olvane_picture* picture, const char** text, size_t* length) {
    if (!picture || !text) return OLVANE_INVALID_ARGUMENT;
    *text = "";
    if (length) *length = 0;
    if (picture->boxes.empty()) return OLVANE_OK;  // after a failure
    try {
        const std::lock_guard<std::mutex> lock(picture->guard);
        if (picture->json.empty()) picture->json = picture::pictureJson(picture->source);
    } catch (...) {
        return OLVANE_OUT_OF_MEMORY;  // nothing else can fail here
    }
    *text = picture->json.c_str();
    if (length) *length = picture->json.size();
    return OLVANE_OK;
}

olvane_status olvane_picture_judge(const olvane_picture* picture, const olvane_family* family,
                                   olvane_judgement* judgement) {
    if (!picture || !judgement || judgement->struct_size != sizeof(olvane_judgement)) {
        return OLVANE_INVALID_ARGUMENT;
    }
    try {
        olvane::kin::KinGraph known;
        if (family) known = olvane::kinGraphOf(family->table);
        *judgement = judgementOf(picture::judge(picture->source, family ? &known : nullptr));
    } catch (...) {
        return OLVANE_OUT_OF_MEMORY;  // nothing else can fail here
    }
    return OLVANE_OK;
}
