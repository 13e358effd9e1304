// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// How persons of an open GEDCOM file are related, in words, as JSON in the order that gedcom.mjs reads.

#include <cstddef>
#include <cstdint>
#include <exception>
#include <utility>
#include <vector>

#include <olvane/kin/KinshipText.h>
#include <olvane/kin/NearRelatives.h>

#include "JsonText.h"
#include "OpenFile.h"

#define OLVANE_EXPORT(name) extern "C" __attribute__((export_name(name)))

namespace olvane::js {
namespace {

using kin::Language;
using kin::Place;

Language languageOf(const char* code) {
    return kin::languageOf(code).value_or(Language::english);
}

Place placeOf(std::uint32_t person) {
    return static_cast<Place>(person) - 1;
}

void writePersons(JsonText& json, const std::vector<Place>& persons) {
    json.begin();
    for (const Place person : persons) json.number(person + 1);
    json.end();
}

template <class Way>
void writeWays(JsonText& json, const kin::KinGraph& graph, const std::vector<Way>& ways, const char* sort,
               Language language) {
    for (const Way& way : ways) {
        json.begin();
        json.string(sort);
        json.string(kin::wayText(graph, way, language));
        writePersons(json, way.persons);
        json.end();
    }
}

// The texts of each person, which say nothing of how many ways there are: the whole one, the short one, and a list of
// shorter ones.
std::string kinshipWordsJson(OpenFile& file, std::uint32_t focus, const std::uint32_t* persons,
                             std::size_t count, Language language) {
    const kin::KinGraph& graph = file.kin();
    JsonText json;
    json.begin();
    kin::KinshipLimits limits;
    limits.nearestAlone = true;
    for (std::size_t i = 0; i < count; ++i) {
        const kin::Kinship kinship = file.kinship().between(placeOf(focus), placeOf(persons[i]), limits);
        json.string(kin::kinshipText(graph, kinship, language));
        const std::vector<std::string> wordings = kin::kinshipWordings(graph, kinship, language);
        json.string(wordings.front());
        json.begin();
        for (std::size_t shorter = 1; shorter < wordings.size(); ++shorter) json.string(wordings[shorter]);
        json.end();
    }
    json.end();
    return std::move(json).take();
}

// The words for all, and each way with its sort and its persons.
std::string kinshipWaysJson(OpenFile& file, std::uint32_t a, std::uint32_t b, Language language) {
    const kin::KinGraph& graph = file.kin();
    const kin::Kinship kinship = file.kinship().between(placeOf(a), placeOf(b));
    JsonText json;
    json.begin();
    json.string(kin::kinshipText(graph, kinship, language));
    json.begin();
    writeWays(json, graph, kinship.blood, "blood", language);
    writeWays(json, graph, kinship.legal, "legal", language);
    writeWays(json, graph, kinship.marriage, "marriage", language);
    json.end();
    json.end();
    return std::move(json).take();
}

}  // namespace
}  // namespace olvane::js

using namespace olvane;
using js::OpenFile;

// Of count persons to the focus. Null where somebody is not in the file, and last_text says why.
OLVANE_EXPORT("gedcom_kinship_words")
const char* gedcomKinshipWords(OpenFile* file, std::uint32_t focus, const std::uint32_t* persons,
                               std::size_t count, const char* language) {
    return js::textOrRefusal(
        [&] { return js::kinshipWordsJson(*file, focus, persons, count, js::languageOf(language)); });
}

OLVANE_EXPORT("gedcom_siblings") const char* gedcomSiblings(OpenFile* file, std::uint32_t person) {
    return js::textOrRefusal([&] {
        js::JsonText json;
        js::writePersons(json, kin::siblingsOf(file->kin(), js::placeOf(person)));
        return std::move(json).take();
    });
}

// The number of the person to begin with; 0 in a file of nobody, and where there is no memory to find out.
OLVANE_EXPORT("gedcom_best_focus") std::uint32_t gedcomBestFocus(OpenFile* file) {
    try {
        const auto isNamed = [&](kin::Place person) {
            return !gedcom::displayName(file->data.firstName(static_cast<std::uint32_t>(person) + 1)).empty();
        };
        return static_cast<std::uint32_t>(kin::bestFocus(file->kin(), isNamed) + 1);
    } catch (const std::exception&) {
        return 0;
    }
}

OLVANE_EXPORT("gedcom_kinship")
const char* gedcomKinship(OpenFile* file, std::uint32_t a, std::uint32_t b, const char* language) {
    return js::textOrRefusal([&] { return js::kinshipWaysJson(*file, a, b, js::languageOf(language)); });
}
