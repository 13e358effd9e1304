// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A person for other programs.

#include <cli/PersonJson.h>

#include <string>

namespace olvane::cli {

namespace {

using Json = nlohmann::ordered_json;

void addEvent(const gedcom::GedcomData& data, gedcom::PersonId id, const char* name, std::string_view tag,
              const gedcom::GedcomDate& date, const gedcom::HiddenNames& hiddenNames, JsonOutput& json) {
    if (!hiddenNames.shownPlace(date.written).empty()) json.field(name, dateJson(date));
    const std::string_view place = hiddenNames.shownPlace(placeOf(data, id, tag));
    if (!place.empty()) json.field(std::string(name) + "Place", place);
}

}  // namespace

const char* sexName(gedcom::Sex sex) {
    switch (sex) {
        case gedcom::Sex::male:
            return "male";
        case gedcom::Sex::female:
            return "female";
        case gedcom::Sex::other:
            break;
    }
    return "other";
}

std::string_view placeOf(const gedcom::GedcomData& data, gedcom::PersonId id, std::string_view tag) {
    const gedcom::Person& person = data.person(id);
    const std::uint32_t dateLine = tag == "BIRT" ? person.birth.line : person.death.line;
    std::string_view first;
    for (const gedcom::Fact& fact : data.factsOfPerson(id)) {
        if (fact.tag != tag || fact.place.empty()) continue;
        if (dateLine != 0 && fact.date.line == dateLine) return fact.place;
        if (first.empty()) first = fact.place;
    }
    return first;
}

// As written and, where it could be read, in the form that sorts.
Json dateJson(const gedcom::GedcomDate& date) {
    Json json;
    json["written"] = std::string(date.written);
    if (date.isRead()) {
        json["year"] = date.year;
        json["sort"] = gedcom::sortText(date);
    }
    json["shown"] = gedcom::displayYear(date);
    return json;
}

void writePersonFields(const gedcom::GedcomData& data, gedcom::PersonId id,
                       const gedcom::HiddenNames& hiddenNames, JsonOutput& json) {
    const gedcom::Person& person = data.person(id);
    const gedcom::PersonName& name = data.firstName(id);
    json.field("xref", hiddenNames.shownText(person.xref));
    json.key("name");
    json.text([&name](const picture::TextSink& write) { gedcom::writeDisplayName(name, write); });
    json.field("given", name.given);
    json.field("surname", name.surname);
    json.field("sex", std::string_view(sexName(person.sex)));
    json.field("dead", Json(person.dead));
    addEvent(data, id, "birth", "BIRT", person.birth, hiddenNames, json);
    addEvent(data, id, "death", "DEAT", person.death, hiddenNames, json);
}

}  // namespace olvane::cli
