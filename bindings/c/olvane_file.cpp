// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// GEDCOM files and drawings in C: what is read lies in one object, and answers and failures are texts.

#include <olvane_file.h>

#include <memory>
#include <new>
#include <string>
#include <utility>
#include <vector>

#include "FamilyInternal.h"
#include "FileDrawing.h"
#include "FileInternal.h"
#include "LayoutInternal.h"

#include <olvane/gedcom/GedcomReader.h>
#include <olvane/kin/DataCheck.h>
#include <olvane/kin/KinJson.h>
#include <olvane/kin/Kinship.h>
#include <olvane/source/GedcomDataSource.h>
#include <olvane/source/GedcomFamily.h>
#include <olvane/source/GedcomKin.h>
#include <olvane/source/GedcomLives.h>

namespace gedcom = olvane::gedcom;
namespace kin = olvane::kin;

struct olvane_result {
    std::string text;
};

namespace {

using olvane::c::Refusal;
using olvane::c::refuseOption;
using olvane::c::requirePerson;

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
    return answered(failure, [&] { *person = olvane::c::personMeant(*file, who); });
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

namespace {

// A drawing is a layout too, which a callback may not ask for while its own is running on this thread.
template <class Draw>
olvane_status drawn(olvane_result** svg, const Draw& draw) {
    return answered(svg, [&] {
        bool isNested = true;
        olvane::c::unlessNested([&isNested] { isNested = false; });
        if (isNested) throw Refusal{OLVANE_NESTED_CALL, olvane_status_text(OLVANE_NESTED_CALL)};
        *svg = new olvane_result{draw()};
    });
}

}  // namespace

olvane_status olvane_draw_file(const char* path, const char* who, const olvane_draw_options* options,
                               olvane_result** svg) {
    if (!path || !who || !svg) return OLVANE_INVALID_ARGUMENT;
    return drawn(svg, [&] { return olvane::c::drawnFromPath(path, who, olvane::c::chosenOptions(options)); });
}

olvane_status olvane_draw(const olvane_file* file, int64_t focus, const olvane_draw_options* options,
                          olvane_result** svg) {
    if (!file || !svg) return OLVANE_INVALID_ARGUMENT;
    return drawn(svg,
                 [&] { return olvane::c::drawnFromFile(*file, focus, olvane::c::chosenOptions(options)); });
}

olvane_status olvane_draw_family(const olvane_family* family, int64_t focus,
                                 const olvane_draw_options* options, olvane_result** svg) {
    if (!family || !svg) return OLVANE_INVALID_ARGUMENT;
    return drawn(svg, [&] {
        return olvane::c::drawnFromTable(family->table, focus, olvane::c::chosenOptions(options));
    });
}
