// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A GEDCOM file in the module's memory: opened from bytes, laid out, closed. Its persons and families are handed over by
// GedcomRows.cpp; facts are written as JSON, in the order that gedcom.mjs reads, when somebody asks for them.

#include <cstddef>
#include <exception>
#include <memory>
#include <new>
#include <span>
#include <string>
#include <string_view>

#include <olvane/gedcom/GedcomEncodings.h>
#include <olvane/gedcom/GedcomMedia.h>
#include <olvane/gedcom/GedcomReader.h>
#include <olvane/source/LimitedDataSource.h>

#include "GedcomJson.h"
#include "JsonText.h"
#include "LayoutAnswer.h"
#include "MemoryGrowth.h"
#include "OpenFile.h"
#include "SearchJson.h"

// Bytes that have been read, and all of them, while a file is being opened.
extern "C" __attribute__((import_module("olvane"), import_name("reading_progress"))) void readingProgress(
    std::size_t done, std::size_t all);

#define OLVANE_EXPORT(name) extern "C" __attribute__((export_name(name)))

namespace olvane::js {

std::string lastText;

namespace {

void write(JsonText& json, const gedcom::DiagnosticPhrase& phrase) {
    json.begin();
    json.string(gedcom::sentenceName(phrase.sentence));
    for (const std::string& argument : phrase.arguments) json.string(argument);
    json.end();
}

void write(JsonText& json, const gedcom::Diagnostic& diagnostic) {
    json.begin();
    json.number(diagnostic.line);
    json.string(gedcom::severityName(diagnostic.severity));
    json.string(gedcom::kindName(diagnostic.kind));
    write(json, diagnostic.what);
    json.begin();
    for (const gedcom::DiagnosticPhrase& phrase : diagnostic.done) write(json, phrase);
    json.end();
    json.string(diagnostic.quoted);
    json.end();
}

// What is said of the file as a whole.
std::string headOf(const gedcom::GedcomData& data) {
    JsonText json;
    json.begin();
    json.string(data.encoding());
    json.string(data.version());
    json.begin();
    for (const gedcom::Diagnostic& diagnostic : data.diagnostics()) write(json, diagnostic);
    json.end();
    json.end();
    return std::move(json).take();
}

std::string factsText(std::span<const gedcom::Fact> facts) {
    JsonText json;
    json.begin();
    for (const gedcom::Fact& fact : facts) {
        json.begin();
        appendFact(json, fact);
        json.end();
    }
    json.end();
    return std::move(json).take();
}

}  // namespace
}  // namespace olvane::js

using namespace olvane;
using js::OpenFile;

// An empty encoding is what the file itself says. Null for a file that is refused; last_text then says why.
OLVANE_EXPORT("gedcom_open")
OpenFile* gedcomOpen(const char* bytes, std::size_t length, const char* name, const char* encoding) {
    // What a file takes with its tables and with the text that hands them over, as measured.
    constexpr std::size_t kMemoryOfByte = 12;
    try {
        js::ensureMemory(length * kMemoryOfByte);
        gedcom::ReadOptions options;
        options.details = true;
        options.progress = readingProgress;
        options.encoding = encoding;
        return std::make_unique<OpenFile>(gedcom::readGedcomBytes(std::string(bytes, length), name, options))
            .release();
    } catch (const std::exception& error) {
        js::lastText = error.what();
        return nullptr;
    }
}

// Texts live until the next call that gives one; null where there is none, and last_text says why.
OLVANE_EXPORT("gedcom_head") const char* gedcomHead(const OpenFile* file) {
    return js::textOrRefusal([&] { return js::headOf(file->data); });
}

OLVANE_EXPORT("gedcom_person_facts") const char* gedcomPersonFacts(const OpenFile* file, std::uint32_t id) {
    return js::textOrRefusal([&] { return js::factsText(file->data.factsOfPerson(id)); });
}

// Whose partners are the person's father and mother; 0 for none and for nobody.
OLVANE_EXPORT("gedcom_parent_family")
std::uint32_t gedcomParentFamily(const OpenFile* file, std::uint32_t id) {
    return file->data.hasPerson(id) ? file->data.person(id).parentFamily : 0;
}

OLVANE_EXPORT("gedcom_family_facts") const char* gedcomFamilyFacts(const OpenFile* file, std::uint32_t id) {
    return js::textOrRefusal([&] { return js::factsText(file->data.factsOfFamily(id)); });
}

// Adds more persons to the index, at most that many: 1 where all are in it, 0 where some are to come, -1 where memory is short.
OLVANE_EXPORT("gedcom_prepare_search") int gedcomPrepareSearch(OpenFile* file, std::size_t persons) {
    try {
        return file->personIndex.add(file->searchTexts, persons) ? 1 : 0;
    } catch (const std::exception& error) {
        js::lastText = error.what();
        return -1;
    }
}

// Adds all who are not in the index yet.
OLVANE_EXPORT("gedcom_search") const char* gedcomSearch(OpenFile* file, const char* text, std::size_t limit) {
    return js::textOrRefusal([&] { return js::searchJson(file->index(), file->searchTexts, text, limit); });
}

// The text of a layout, or else its records. Null where memory is short.
OLVANE_EXPORT("gedcom_layout")
js::LayoutAnswer* gedcomLayout(OpenFile* file, int view, double focus, int withText) {
    try {
        auto answer = std::make_unique<js::LayoutAnswer>();
        const auto limited = [file] {
            return std::make_shared<gedcom::LimitedDataSource>(file->source, js::kMostRelatives);
        };
        js::layOutSource(limited, static_cast<js::View>(view), focus, withText != 0, *answer);
        return answer.release();
    } catch (const std::bad_alloc&) {
        return nullptr;
    }
}

// The member of an archive that the FILE of a medium stands for; null for what lies outside.
OLVANE_EXPORT("archive_member") const char* archiveMember(const char* file) {
    try {
        const auto member = gedcom::memberOfArchive(file);
        if (!member) return nullptr;
        js::lastText = *member;
        return js::lastText.c_str();
    } catch (const std::exception&) {
        return nullptr;
    }
}

// The encodings to choose from, each on a line of its own.
OLVANE_EXPORT("encoding_names") const char* encodingNames() {
    return js::textOrRefusal([] { return js::linesOf(gedcom::encodingNames()); });
}

OLVANE_EXPORT("gedcom_close") void gedcomClose(OpenFile* file) {
    delete file;
}

OLVANE_EXPORT("last_text") const char* lastText() {
    return js::lastText.c_str();
}
