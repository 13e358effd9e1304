// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Everything that an open file knows of one person or family, as one JSON text: it is asked for when somebody reads
// about them, so no other person's details come over.

#include <cstdint>
#include <span>
#include <string>

#include <olvane/gedcom/GedcomDetails.h>
#include <olvane/gedcom/LifeOrder.h>

#include "GedcomJson.h"
#include "OpenFile.h"

#define OLVANE_EXPORT(name) extern "C" __attribute__((export_name(name)))

namespace olvane::js {
namespace {

void appendFacts(JsonText& json, const gedcom::GedcomData& data, std::span<const gedcom::Fact> facts) {
    json.begin();
    for (const gedcom::Fact* fact : gedcom::inLifeOrder(facts)) {
        json.begin();
        appendFact(json, *fact);
        appendDetails(json, gedcom::factDetails(data, *fact));
        json.end();
    }
    json.end();
}

void appendNames(JsonText& json, const gedcom::GedcomData& data, gedcom::PersonId id) {
    json.begin();
    for (const gedcom::PersonName& name : data.names(id)) {
        json.begin();
        json.string(gedcom::displayName(name));
        json.string(name.type);
        json.string(name.nickname);
        appendDetails(json, gedcom::nameDetails(data, name));
        json.end();
    }
    json.end();
}

std::string personText(const gedcom::GedcomData& data, gedcom::PersonId id) {
    JsonText json;
    json.begin();
    appendDetails(json, gedcom::personDetails(data, id));
    appendFacts(json, data, data.factsOfPerson(id));
    appendNames(json, data, id);
    json.end();
    return std::move(json).take();
}

std::string familyText(const gedcom::GedcomData& data, gedcom::FamilyId id) {
    JsonText json;
    json.begin();
    appendDetails(json, gedcom::familyDetails(data, id));
    appendFacts(json, data, data.factsOfFamily(id));
    json.end();
    return std::move(json).take();
}

}  // namespace
}  // namespace olvane::js

using namespace olvane;

OLVANE_EXPORT("gedcom_person_details")
const char* gedcomPersonDetails(const js::OpenFile* file, std::uint32_t id) {
    return js::textOrRefusal([&] { return js::personText(file->data, id); });
}

OLVANE_EXPORT("gedcom_family_details")
const char* gedcomFamilyDetails(const js::OpenFile* file, std::uint32_t id) {
    return js::textOrRefusal([&] { return js::familyText(file->data, id); });
}
