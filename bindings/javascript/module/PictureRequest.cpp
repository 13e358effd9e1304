// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Options of a picture come in as a run of numbers.

#include "PictureRequest.h"

#include <cstddef>
#include <memory>
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
    return asked;
}

picture::Picture pictureOf(OpenFile& file, const PictureRequest& asked) {
    static picture::Picture kept;
    static charts::Direction keptDirection = charts::Direction::down;
    gedcom::GedcomDataSource source(file.data, asked.parents);
    const auto limited = std::make_shared<gedcom::LimitedDataSource>(source, kMostRelatives);
    charts::ViewRequest view = asked.view;
    const bool mayKeep = asked.keepsPlaces && !kept.boxes.empty() && keptDirection == view.chart.direction;
    if (mayKeep) view.chart.earlier = &kept;
    picture::Picture picture = charts::pictureOf(limited, file.kin(asked.parents), view);
    if (asked.keepsPlaces) {
        kept = picture;
        keptDirection = view.chart.direction;
    }
    return picture;
}

// Room for so many numbers, which JavaScript fills before it asks for a picture.
OLVANE_EXPORT("picture_options") double* pictureOptionsRoom(std::size_t count) {
    pictureOptions.assign(count, 0);
    return pictureOptions.data();
}

}  // namespace olvane::js
