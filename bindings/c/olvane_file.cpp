// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// GEDCOM files and drawings in C: what is read lies in one object, and answers and failures are texts.

#include <olvane_file.h>

#include <memory>
#include <new>
#include <stdexcept>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "FamilyInternal.h"
#include "FileInternal.h"
#include "LayoutInternal.h"

#include <olvane/charts/BoxForm.h>
#include <olvane/charts/Views.h>
#include <olvane/draw/SvgDrawing.h>
#include <olvane/gedcom/GedcomReader.h>
#include <olvane/gedcom/HiddenNames.h>
#include <olvane/kin/DataCheck.h>
#include <olvane/kin/FamilyLabels.h>
#include <olvane/kin/Kinship.h>
#include <olvane/kin/KinshipJson.h>
#include <olvane/kin/RemarkJson.h>
#include <olvane/picture/HiddenPersons.h>
#include <olvane/source/GedcomDataSource.h>
#include <olvane/source/GedcomFamily.h>
#include <olvane/source/GedcomKin.h>
#include <olvane/source/GedcomLabels.h>
#include <olvane/source/GedcomLives.h>
#include <olvane/source/LimitedDataSource.h>

namespace gedcom = olvane::gedcom;
namespace charts = olvane::charts;
namespace kin = olvane::kin;
namespace draw = olvane::draw;

struct olvane_result {
    std::string text;
};

namespace {

// What a call refuses, with the status that says so.
struct Refusal {
    olvane_status status;
    std::string text;
};

void keep(olvane_result** result, std::string text) noexcept {
    if (!result) return;
    try {
        *result = new olvane_result{std::move(text)};
    } catch (...) {
        *result = nullptr;
    }
}

// Runs the work, whose text or failure becomes the result. result may be null, where only failures have a text.
template <class Work>
olvane_status answered(olvane_result** result, const Work& work) noexcept {
    if (result) *result = nullptr;
    try {
        work();
        return OLVANE_OK;
    } catch (const Refusal& refusal) {
        keep(result, refusal.text);
        return refusal.status;
    } catch (const gedcom::GedcomError& error) {
        keep(result, error.what());
        return OLVANE_UNREADABLE;
    } catch (const std::bad_alloc&) {
        return OLVANE_OUT_OF_MEMORY;
    } catch (const std::exception& error) {
        keep(result, error.what());
        return OLVANE_LAYOUT_FAILED;
    } catch (...) {
        return OLVANE_LAYOUT_FAILED;
    }
}

[[noreturn]] void refuseOption(const char* option, std::string_view given, const char* allowed) {
    throw Refusal{OLVANE_INVALID_ARGUMENT,
                  std::string(option) + " is '" + std::string(given) + "', and takes " + allowed};
}

void requirePerson(bool isKnown, std::int64_t person) {
    if (!isKnown) throw Refusal{OLVANE_INVALID_PERSON, "there is no person " + std::to_string(person)};
}

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

olvane_draw_options chosenOptions(const olvane_draw_options* options) {
    olvane_draw_options chosen = {};
    if (options && options->struct_size != sizeof(olvane_draw_options)) {
        throw Refusal{OLVANE_INVALID_ARGUMENT, "struct_size of the options is not that of this version"};
    }
    if (options) chosen = *options;
    return chosen;
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
    if (options.year < 0 || options.year > olvane::c::kLastYear) {
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

std::string drawnFromFile(const olvane_file& file, std::int64_t focus, const olvane_draw_options& options) {
    requirePerson(file.has(focus), focus);
    gedcom::GedcomDataSource people(file.data);
    const auto source = std::make_shared<gedcom::LimitedDataSource>(people, olvane::c::kMostRelatives);
    const gedcom::ShownFacts shown{options.dates != 0, options.places != 0, options.occupation != 0,
                                   options.marriage != 0};
    const std::vector<bool> hidden = hiddenIn(file, options);
    const gedcom::GedcomLabels labels(file.data, shown, hiddenTexts(file.data, hidden));
    draw::DrawingContent content;
    content.picture = charts::pictureOf(source, file.graph(), requestOf(options, file.graph(), focus));
    olvane::picture::hidePersons(hidden, content.picture);
    content.labelOf = [&labels](std::int64_t id) { return labels.ofPerson(id); };
    content.familyLabelOf = [&labels](std::uint32_t number) { return labels.ofFamily(number); };
    return svgOf(std::move(content), options);
}

std::string drawnFromTable(const olvane::Family& table, std::int64_t focus,
                           const olvane_draw_options& options) {
    requirePerson(table.hasPerson(focus), focus);
    if (options.hide_living != 0) refuseOption("hide_living", "1", "0 where a table is drawn");
    const kin::KinGraph graph = olvane::kinGraphOf(table);
    draw::DrawingContent content;
    content.picture = charts::pictureOf(std::make_shared<olvane::FamilyDataSource>(table), graph,
                                        requestOf(options, graph, focus));
    content.labelOf = [&table](std::int64_t id) { return kin::labelOf(table, id); };
    return svgOf(std::move(content), options);
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

std::string personName(const gedcom::GedcomData& data, std::int64_t id) {
    return gedcom::displayName(data.firstName(static_cast<gedcom::PersonId>(id)));
}

std::string familyName(const gedcom::GedcomData& data, std::uint32_t number) {
    return "family " + std::string(data.family(number).xref);
}

std::string remarksOf(const olvane_file& file) {
    const kin::KinGraph& graph = file.graph();
    const kin::RemarkNames names{[&](kin::Place place) { return personName(file.data, graph.id(place)); },
                                 [&](std::uint32_t number) { return familyName(file.data, number); }};
    return kin::remarksJson(graph, kin::checkData(graph, gedcom::livesOf(file.data, graph)), names);
}

gedcom::ReadOptions readOptions(std::uint32_t flags) {
    gedcom::ReadOptions options;
    options.facts = (flags & OLVANE_READ_FACTS) != 0;
    return options;
}

template <class Read>
olvane_status opened(olvane_file** file, olvane_result** failure, std::uint32_t flags,
                     const Read& read) noexcept {
    *file = nullptr;
    return answered(failure, [&] {
        if ((flags & ~OLVANE_READ_FACTS) != 0)
            refuseOption("flags", std::to_string(flags), "OLVANE_READ_FACTS");
        *file = std::make_unique<olvane_file>(read(readOptions(flags))).release();
    });
}

}  // namespace

const char* olvane_result_text(const olvane_result* result, size_t* length) {
    if (length) *length = result ? result->text.size() : 0;
    return result ? result->text.c_str() : "";
}

void olvane_result_free(olvane_result* result) {
    delete result;
}

olvane_status olvane_file_open(const char* path, uint32_t flags, olvane_file** file,
                               olvane_result** failure) {
    if (!path || !file) return OLVANE_INVALID_ARGUMENT;
    return opened(file, failure, flags,
                  [&](const gedcom::ReadOptions& options) { return gedcom::readGedcomFile(path, options); });
}

olvane_status olvane_file_read(const void* bytes, size_t length, const char* name, uint32_t flags,
                               olvane_file** file, olvane_result** failure) {
    if (!bytes || !name || !file) return OLVANE_INVALID_ARGUMENT;
    return opened(file, failure, flags, [&](const gedcom::ReadOptions& options) {
        return gedcom::readGedcomBytes(std::string(static_cast<const char*>(bytes), length), name, options);
    });
}

void olvane_file_free(olvane_file* file) {
    delete file;
}

size_t olvane_file_person_count(const olvane_file* file) {
    return file ? file->data.personCount() : 0;
}

olvane_status olvane_file_find(const olvane_file* file, const char* who, int64_t* person,
                               olvane_result** failure) {
    if (!file || !who || !person) return OLVANE_INVALID_ARGUMENT;
    *person = 0;
    return answered(failure, [&] { *person = personMeant(*file, who); });
}

olvane_status olvane_file_family(const olvane_file* file, olvane_family** family) {
    if (!file || !family) return OLVANE_INVALID_ARGUMENT;
    *family = nullptr;
    return answered(nullptr, [&] { *family = new olvane_family{gedcom::familyOf(file->data)}; });
}

olvane_status olvane_file_layout(const olvane_file* file, int32_t view, int64_t focus,
                                 const olvane_options* options, olvane_layout** layout) {
    if (layout) *layout = nullptr;
    if (!file) return OLVANE_INVALID_ARGUMENT;
    const auto source = [&] { return std::make_shared<gedcom::GedcomDataSource>(file->data); };
    return olvane::c::layOutSource(source, view, file->has(focus) ? focus : 0, options, layout);
}

olvane_status olvane_file_kinship(const olvane_file* file, int64_t a, int64_t b, olvane_result** json) {
    if (!file || !json) return OLVANE_INVALID_ARGUMENT;
    return answered(json, [&] {
        requirePerson(file->has(a), a);
        requirePerson(file->has(b), b);
        *json = new olvane_result{file->kinship(a, b)};
    });
}

olvane_status olvane_family_kinship(const olvane_family* family, int64_t a, int64_t b, olvane_result** json) {
    if (!family || !json) return OLVANE_INVALID_ARGUMENT;
    return answered(json, [&] {
        requirePerson(family->table.hasPerson(a), a);
        requirePerson(family->table.hasPerson(b), b);
        const kin::KinGraph graph = olvane::kinGraphOf(family->table);
        kin::KinshipFinder finder(graph);
        *json =
            new olvane_result{kin::kinshipJson(graph, finder.between(graph.placeOf(a), graph.placeOf(b)))};
    });
}

olvane_status olvane_file_remarks(const olvane_file* file, olvane_result** json) {
    if (!file || !json) return OLVANE_INVALID_ARGUMENT;
    return answered(json, [&] { *json = new olvane_result{remarksOf(*file)}; });
}

olvane_status olvane_draw_file(const char* path, const char* who, const olvane_draw_options* options,
                               olvane_result** svg) {
    if (!path || !who || !svg) return OLVANE_INVALID_ARGUMENT;
    return answered(svg, [&] {
        const olvane_draw_options chosen = chosenOptions(options);
        const bool needsFacts = chosen.places != 0 || chosen.occupation != 0;
        const olvane_file file(gedcom::readGedcomFile(path, readOptions(needsFacts ? OLVANE_READ_FACTS : 0)));
        *svg = new olvane_result{drawnFromFile(file, personMeant(file, who), chosen)};
    });
}

olvane_status olvane_draw(const olvane_file* file, int64_t focus, const olvane_draw_options* options,
                          olvane_result** svg) {
    if (!file || !svg) return OLVANE_INVALID_ARGUMENT;
    return answered(svg,
                    [&] { *svg = new olvane_result{drawnFromFile(*file, focus, chosenOptions(options))}; });
}

olvane_status olvane_draw_family(const olvane_family* family, int64_t focus,
                                 const olvane_draw_options* options, olvane_result** svg) {
    if (!family || !svg) return OLVANE_INVALID_ARGUMENT;
    return answered(
        svg, [&] { *svg = new olvane_result{drawnFromTable(family->table, focus, chosenOptions(options))}; });
}
