// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Options of a picture come in as a run of numbers.

#include "PictureRequest.h"

#include <cstddef>
#include <memory>
#include <new>
#include <optional>
#include <string_view>
#include <vector>

#include <olvane/charts/BoxForm.h>
#include <olvane/source/GedcomDataSource.h>
#include <olvane/source/LimitedDataSource.h>

#define OLVANE_EXPORT(name) extern "C" __attribute__((export_name(name)))

namespace olvane::js {
namespace {

// As pictureOptions.mjs writes them, which has checked their ranges.
std::vector<double> pictureOptions;

class OptionReader {
public:
    template <class Value>
    Value next() {
        return static_cast<Value>(static_cast<int>(pictureOptions.at(place_++)));
    }
    bool flag() { return next<int>() != 0; }
    double number() { return pictureOptions.at(place_++); }

private:
    std::size_t place_ = 0;
};

void setShown(LayoutOptions& layout, unsigned bits) {
    layout.auntsUncles = (bits & 0x01u) != 0;
    layout.cousins = (bits & 0x02u) != 0;
    layout.siblings = (bits & 0x04u) != 0;
    layout.siblingSpouses = (bits & 0x08u) != 0;
    layout.niecesNephews = (bits & 0x10u) != 0;
    layout.grandchildren = (bits & 0x20u) != 0;
    layout.greatGrandparents = (bits & 0x40u) != 0;
    layout.spousesOfChildren = (bits & 0x80u) != 0;
}

}  // namespace

PictureRequest requestOf(kin::Place focus) {
    PictureRequest asked;
    charts::ViewRequest& request = asked.view;
    charts::ChartRequest& chart = request.chart;
    OptionReader options;
    chart.focus = focus;
    chart.view = options.next<charts::View>();
    setShown(chart.layout, options.next<unsigned>());
    chart.layout.generations = options.next<int>();
    charts::flagBeyondGenerations(chart);
    chart.to = options.next<kin::Place>() - 1;
    chart.up = options.next<int>();
    chart.down = options.next<int>();
    chart.direction = options.next<charts::Direction>();
    chart.spouses = options.flag();
    chart.siblings = options.flag();
    chart.compact = options.flag();
    chart.fanOf = options.next<charts::FanOf>();
    chart.fanAngle = options.next<int>();
    chart.ways = options.next<charts::WayChoice>();
    chart.mostWays = options.next<int>();
    chart.language = options.next<kin::Language>();
    chart.marks = options.next<int>();
    chart.effort = options.next<int>();
    chart.onePart = !options.flag();
    request.unknownParents = options.flag();
    asked.parents.order = options.next<gedcom::ParentOrder>();
    asked.parents.child = options.next<gedcom::PersonId>();
    asked.parents.family = options.next<gedcom::FamilyId>();
    chart.sizes.boxWidth = static_cast<float>(options.number());
    chart.sizes.boxHeight = static_cast<float>(options.number());
    chart.sizes.gapX = static_cast<float>(options.number());
    chart.sizes.gapY = static_cast<float>(options.number());
    chart.aspect = options.number();
    asked.keepsPlaces = options.flag() && chart.view == charts::View::everybody;
    asked.labelSize = options.number();
    chart.mirrored = options.flag();
    for (int left = options.next<int>(); left > 0; --left) {
        const auto person = options.next<std::int64_t>();
        asked.folded.push_back({person, options.next<picture::Branch>()});
    }
    for (int left = options.next<int>(); left > 0; --left) {
        const auto person = options.next<std::int64_t>();
        const auto width = static_cast<float>(options.number());
        asked.boxSizes.push_back({person, {width, static_cast<float>(options.number())}});
    }
    return asked;
}

charts::ViewRequest viewOf(const PictureRequest& request) {
    charts::ViewRequest view = request.view;
    view.chart.folded = request.folded;
    view.chart.sizedBoxes = request.boxSizes;
    return view;
}

picture::Picture pictureOf(OpenFile& file, const PictureRequest& asked) {
    gedcom::GedcomDataSource source(file.data, asked.parents);
    const auto limited = std::make_shared<gedcom::LimitedDataSource>(source, kMostRelatives);
    charts::ViewRequest view = viewOf(asked);
    std::optional<KeptChart>& kept = file.everybody;
    if (asked.keepsPlaces && kept && kept->direction == view.chart.direction &&
        kept->mirrored == view.chart.mirrored)
        view.chart.earlier = &kept->picture;
    picture::Picture picture = charts::pictureOf(limited, file.kin(asked.parents), view);
    if (asked.keepsPlaces) kept = KeptChart{picture, view.chart.direction, view.chart.mirrored};
    return picture;
}

// The file's next chart of everybody keeps the places of the earlier file's last one. Whoever has an xref is the person
// of that xref there; nobody else is in both. False where there is no such chart.
bool takePlaces(OpenFile& file, const OpenFile& earlier) {
    if (!earlier.everybody) return false;
    file.everybody = earlier.everybody;
    for (picture::Box& box : file.everybody->picture.boxes) {
        const auto number = static_cast<std::size_t>(box.id);
        const bool isPerson = number > 0 && number <= earlier.data.personCount();
        const std::string_view xref = isPerson ? earlier.data.persons()[number - 1].xref : std::string_view();
        box.id = xref.empty() ? 0 : file.data.personByXref(xref);
    }
    return true;
}

OLVANE_EXPORT("gedcom_take_places") int gedcomTakePlaces(OpenFile* file, const OpenFile* earlier) {
    try {
        return takePlaces(*file, *earlier) ? 1 : 0;
    } catch (const std::bad_alloc&) {
        return 0;
    }
}

// Room for so many numbers, which JavaScript fills before it asks for a picture.
OLVANE_EXPORT("picture_options") double* pictureOptionsRoom(std::size_t count) {
    pictureOptions.assign(count, 0);
    return pictureOptions.data();
}

}  // namespace olvane::js
