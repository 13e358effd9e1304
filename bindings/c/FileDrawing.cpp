// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// From the options of a drawing, as texts and numbers, to SVG.

#include "FileDrawing.h"

#include "FileInternal.h"

#include <memory>
#include <string_view>
#include <utility>
#include <vector>

#include <olvane/charts/BoxForm.h>
#include <olvane/charts/LaterSide.h>
#include <olvane/charts/Views.h>
#include <olvane/draw/SvgDrawing.h>
#include <olvane/gedcom/GedcomReader.h>
#include <olvane/gedcom/HiddenNames.h>
#include <olvane/kin/FamilyDataSource.h>
#include <olvane/kin/FamilyLabels.h>
#include <olvane/picture/HiddenPersons.h>
#include <olvane/source/GedcomDataSource.h>
#include <olvane/source/GedcomLabels.h>
#include <olvane/source/LimitedDataSource.h>

namespace olvane::c {

namespace {

charts::View viewOf(const char* name) {
    if (!name) return charts::View::family;
    for (const auto view :
         {charts::View::family, charts::View::pedigree, charts::View::near, charts::View::ancestors,
          charts::View::descendants, charts::View::hourglass, charts::View::relatives, charts::View::fan,
          charts::View::kinship, charts::View::everybody}) {
        if (charts::nameOf(view) == std::string_view(name)) return view;
    }
    refuseOption("view", name,
                 "family, pedigree, near, ancestors, descendants, hourglass, relatives, fan, kinship or "
                 "everybody");
}

charts::Direction directionOf(const char* name) {
    const std::string_view given = name ? name : "down";
    if (given == "down") return charts::Direction::down;
    if (given == "up") return charts::Direction::up;
    if (given == "left") return charts::Direction::left;
    if (given == "right") return charts::Direction::right;
    refuseOption("direction", given, "down, up, left or right");
}

charts::BoxForm boxFormOf(const char* name, const charts::ChartRequest& chart) {
    if (!name) return usualBoxForm(chart.view, chart.direction);
    const std::string_view given = name;
    if (given == "tall") return charts::BoxForm::tall;
    if (given == "wide") return charts::BoxForm::wide;
    refuseOption("boxes", given, "tall or wide");
}

const draw::DrawingTheme* themeOf(const char* name) {
    const char* const given = name ? name : "light";
    if (const draw::DrawingTheme* theme = draw::themeOfName(given)) return theme;
    refuseOption("theme", given, "light, dark or print");
}

charts::ViewRequest requestOf(const olvane_draw_options& options, const kin::KinGraph& graph,
                              std::int64_t focus) {
    charts::ViewRequest request;
    charts::ChartRequest& chart = request.chart;
    chart.view = viewOf(options.view);
    chart.direction = directionOf(options.direction);
    setBoxForm(chart, boxFormOf(options.boxes, chart));
    if (options.up < 0 || options.down < 0) refuseOption("up or down", "negative", "0 and more");
    if (options.generations < 0 || options.generations > 12) {
        refuseOption("generations", std::to_string(options.generations), "1 to 12, or 0 for the default");
    }
    chart.up = options.up;
    chart.down = options.down;
    if (options.generations > 0) chart.layout.generations = options.generations;
    charts::flagBeyondGenerations(chart);
    chart.focus = graph.placeOf(focus);
    if (chart.view == charts::View::kinship) {
        chart.to = graph.placeOf(options.to);
        requirePerson(chart.to != kin::kNobody, options.to);
    }
    request.unknownParents = options.unknown_parents != 0;
    return request;
}

std::string svgOf(draw::DrawingContent content, const olvane_draw_options& options) {
    draw::DrawingOptions drawing;
    drawing.theme = themeOf(options.theme);
    drawing.headline = options.title && *options.title != '\0';
    drawing.title =
        drawing.headline ? options.title : draw::titleOf(charts::nameOf(viewOf(options.view)), content);
    content.countsHidden = true;
    return draw::drawSvg(content, drawing).svg;
}

std::vector<bool> hiddenIn(const olvane_file& file, const olvane_draw_options& options) {
    if (options.year < 0 || options.year > kLastYear) {
        refuseOption("year", std::to_string(options.year), "1 to 9999, or 0 for the present one");
    }
    return options.hide_living != 0 ? file.living(options.year) : std::vector<bool>();
}

gedcom::HiddenTexts hiddenTexts(const gedcom::GedcomData& data, const std::vector<bool>& hidden) {
    if (hidden.empty()) return {};
    const gedcom::HiddenNames names(data, hidden);
    return {hidden, [names](std::string_view text) { return names.shownPlace(text); },
            [names](std::string_view text) { return names.shownText(text); }};
}

}  // namespace

void refuseOption(const char* option, std::string_view given, const char* allowed) {
    throw Refusal{OLVANE_INVALID_ARGUMENT,
                  std::string(option) + " is '" + std::string(given) + "', and takes " + allowed};
}

void requirePerson(bool isKnown, std::int64_t person) {
    if (!isKnown) throw Refusal{OLVANE_INVALID_PERSON, "there is no person " + std::to_string(person)};
}

olvane_draw_options chosenOptions(const olvane_draw_options* options) {
    olvane_draw_options chosen = {};
    if (options && options->struct_size != sizeof(olvane_draw_options)) {
        throw Refusal{OLVANE_INVALID_ARGUMENT, "struct_size of the options is not that of this version"};
    }
    if (options) chosen = *options;
    return chosen;
}

// "family.ged: no person is called 'Ada'"
std::int64_t personMeant(const olvane_file& file, const char* who) {
    const std::vector<gedcom::PersonId> found = file.meant(who);
    if (found.size() == 1) return found.front();
    const std::string named = file.data.file() + ": ";
    if (found.empty()) {
        throw Refusal{OLVANE_INVALID_PERSON, named + "no person is called '" + who + "'"};
    }
    throw Refusal{OLVANE_INVALID_PERSON,
                  named + "'" + who + "' may be any of " + std::to_string(found.size()) + " persons"};
}

std::string drawnFromFile(const olvane_file& file, std::int64_t focus, const olvane_draw_options& options) {
    requirePerson(file.has(focus), focus);
    gedcom::GedcomDataSource people(file.data);
    const auto source = std::make_shared<gedcom::LimitedDataSource>(people, kMostRelatives);
    const gedcom::ShownFacts shown{options.dates != 0, options.places != 0, options.occupation != 0,
                                   options.marriage != 0};
    const std::vector<bool> hidden = hiddenIn(file, options);
    const charts::ViewRequest request = requestOf(options, file.graph(), focus);
    const gedcom::GedcomLabels labels(file.data, shown, hiddenTexts(file.data, hidden),
                                      request.chart.language);
    draw::DrawingContent content;
    content.picture = charts::pictureOf(source, file.graph(), request);
    content.laterSide = charts::laterSideOf(request.chart);
    picture::hidePersons(hidden, content.picture);
    content.labelOf = [&labels](std::int64_t id) { return labels.ofPerson(id); };
    content.familyLabelOf = [&labels](std::uint32_t number) { return labels.ofFamily(number); };
    return svgOf(std::move(content), options);
}

std::string drawnFromTable(const Family& table, std::int64_t focus, const olvane_draw_options& options) {
    requirePerson(table.hasPerson(focus), focus);
    if (options.hide_living != 0) refuseOption("hide_living", "1", "0 where a table is drawn");
    const kin::KinGraph graph = kinGraphOf(table);
    draw::DrawingContent content;
    const charts::ViewRequest request = requestOf(options, graph, focus);
    content.picture = charts::pictureOf(std::make_shared<FamilyDataSource>(table), graph, request);
    content.laterSide = charts::laterSideOf(request.chart);
    content.labelOf = [&table](std::int64_t id) { return kin::labelOf(table, id); };
    return svgOf(std::move(content), options);
}

std::string drawnFromPath(const char* path, const char* who, const olvane_draw_options& options) {
    gedcom::ReadOptions reading;
    reading.facts = options.places != 0 || options.occupation != 0;
    const olvane_file file(gedcom::readGedcomFile(path, reading));
    return drawnFromFile(file, personMeant(file, who), options);
}

}  // namespace olvane::c
