// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <cli/PeopleList.h>

#include <nlohmann/json.hpp>

#include <cli/PersonJson.h>
#include <cli/TableCells.h>

namespace olvane::cli {

namespace {

using Json = nlohmann::ordered_json;

constexpr int kFormatVersion = 1;

std::string lineOf(const gedcom::GedcomData& data, gedcom::PersonId id) {
    const gedcom::Person& person = data.person(id);
    const gedcom::PersonName& name = data.firstName(id);
    return tableLine({std::to_string(id), person.xref, sexName(person.sex), gedcom::displayName(name),
                      name.given, name.surname, person.dead ? "true" : "false", person.birth.written,
                      gedcom::sortText(person.birth), placeOf(data, id, "BIRT"), person.death.written,
                      gedcom::sortText(person.death), placeOf(data, id, "DEAT")});
}

}  // namespace

std::string peopleTable(const gedcom::GedcomData& data, const std::vector<gedcom::PersonId>& persons) {
    std::string text =
        "id\txref\tsex\tname\tgiven\tsurname\tdead\tbirth\tbirth_sort\tbirth_place\tdeath\tdeath_sort\tdeath_"
        "place\n";
    for (const gedcom::PersonId id : persons) text += lineOf(data, id);
    return text;
}

std::string peopleJson(const gedcom::GedcomData& data, const std::vector<gedcom::PersonId>& persons) {
    Json json;
    json["format"] = kFormatVersion;
    json["file"] = data.file();
    json["persons"] = Json::array();
    for (const gedcom::PersonId id : persons) {
        Json person;
        person["id"] = id;
        person.update(personJson(data, id));
        json["persons"].push_back(std::move(person));
    }
    return json.dump(1, ' ', false, Json::error_handler_t::replace) + "\n";
}

}  // namespace olvane::cli
