// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Options of a picture come in as a run of numbers, in the order of the table that goes out.

#include "PictureRequest.h"

#include <array>
#include <cstddef>
#include <limits>
#include <memory>
#include <new>
#include <optional>
#include <string_view>
#include <utility>
#include <vector>

#include <olvane/charts/BoxForm.h>
#include <olvane/charts/LaterSide.h>
#include <olvane/charts/ViewOption.h>
#include <olvane/source/GedcomDataSource.h>
#include <olvane/source/LimitedDataSource.h>

#include "JsonText.h"

#define OLVANE_EXPORT(name) extern "C" __attribute__((export_name(name)))

namespace olvane::js {
namespace {

// As pictureOptions.mjs writes them, which has checked them by the table.
std::vector<double> pictureOptions;

// An option of a picture of a file, beside those of every picture.
struct FileOption {
    charts::OptionForm form;
    void (*set)(PictureRequest& request, double value);
};

constexpr auto kListKind = static_cast<charts::OptionKind>(5);  // of the table that goes out
constexpr double kMostWhole = std::numeric_limits<std::int32_t>::max();
constexpr std::array<std::string_view, 3> kParentOrders = {"birth", "adoptive", "allInOrder"};

constexpr FileOption kFileOptions[] = {
    {{"parents", charts::OptionKind::word, 0, kParentOrders.size() - 1, 0, kParentOrders},
     [](PictureRequest& request, double value) {
         request.parents.order = static_cast<gedcom::ParentOrder>(static_cast<int>(value));
     }},
    {{"parentsOf", charts::OptionKind::person, 0, kMostWhole, 0, {}},
     [](PictureRequest& request, double value) {
         request.parents.child = static_cast<gedcom::PersonId>(value);
     }},
    {{"parentFamily", charts::OptionKind::whole, 0, kMostWhole, 0, {}},
     [](PictureRequest& request, double value) {
         request.parents.family = static_cast<gedcom::FamilyId>(value);
     }},
    {{"keepPlaces"}, [](PictureRequest& request, double value) { request.keepsPlaces = value != 0; }},
    {{"labelSize", charts::OptionKind::number, 0, charts::kLargestSize, 0, {}},
     [](PictureRequest& request, double value) { request.labelSize = value; }},
    {{"paths"}, [](PictureRequest& request, double value) { request.paths = value != 0; }},
};

class OptionReader {
public:
    double number() { return pictureOptions.at(place_++); }
    int whole() { return static_cast<int>(number()); }

private:
    std::size_t place_ = 0;
};

void appendOption(const charts::OptionForm& form, charts::ViewSet views, JsonText& json) {
    json.begin();
    json.string(form.name);
    for (const double number : {static_cast<double>(form.kind), form.least, form.most, form.usual})
        json.number(static_cast<long long>(number));
    json.begin();
    for (const std::string_view word : form.words) json.string(word);
    json.end();
    json.number(views);
    json.end();
}

}  // namespace

PictureRequest requestOf(kin::Place focus) {
    PictureRequest asked;
    charts::ChartRequest& chart = asked.view.chart;
    OptionReader options;
    chart.focus = focus;
    for (const charts::ViewOption& option : charts::viewOptions()) option.set(asked.view, options.number());
    for (const FileOption& option : kFileOptions) option.set(asked, options.number());
    charts::flagBeyondGenerations(chart);
    asked.keepsPlaces = asked.keepsPlaces && chart.view == charts::View::everybody;
    for (int left = options.whole(); left > 0; --left) {
        const std::int64_t person = options.whole();
        asked.folded.push_back({person, static_cast<picture::Branch>(options.whole())});
    }
    for (int left = options.whole(); left > 0; --left) {
        const std::int64_t person = options.whole();
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
    std::optional<EarlierChart>& earlier = file.everybody;
    if (asked.keepsPlaces && earlier && earlier->direction == view.chart.direction &&
        earlier->mirrored == view.chart.mirrored)
        view.chart.earlier = &earlier->picture;
    picture::Picture picture = charts::pictureOf(limited, file.kin(asked.parents), view);
    if (asked.keepsPlaces) earlier = EarlierChart{picture, view.chart.direction, view.chart.mirrored};
    return picture;
}

// The file's next chart of everybody keeps the places of the earlier file's last one. A person with an xref is the one
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

// Of each option its name, its kind, the least, the greatest and the usual number, its words, and the views that it changes
// as bits: those of every picture, those of a file, then the lists.
OLVANE_EXPORT("picture_option_table") const char* pictureOptionTable() {
    return textOrRefusal([] {
        JsonText json;
        json.begin();
        for (const charts::ViewOption& option : charts::viewOptions())
            appendOption(option.form, option.views, json);
        for (const FileOption& option : kFileOptions)
            appendOption(option.form, charts::viewOption("view").views, json);
        appendOption({"folded", kListKind}, charts::viewsOfFolds(), json);
        appendOption({"boxSizes", kListKind}, charts::viewsOfBoxSizes(), json);
        json.end();
        return std::move(json).take();
    });
}

// Where children stand in the picture of a view, seen from their parents, as a picture's numbers have sides.
OLVANE_EXPORT("later_side") int laterSide(int view, int direction, int mirrored) {
    charts::ChartRequest request;
    request.view = static_cast<charts::View>(view);
    request.direction = static_cast<charts::Direction>(direction);
    request.mirrored = mirrored != 0;
    return static_cast<int>(charts::laterSideOf(request));
}

// Room for `count` numbers, which JavaScript fills before it asks for a picture.
OLVANE_EXPORT("picture_options") double* pictureOptionsRoom(std::size_t count) {
    pictureOptions.assign(count, 0);
    return pictureOptions.data();
}

}  // namespace olvane::js
