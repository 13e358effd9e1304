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

void writeLine(const gedcom::GedcomData& data, gedcom::PersonId id, const picture::TextSink& write) {
    const gedcom::Person& person = data.person(id);
    const gedcom::PersonName& name = data.firstName(id);
    TableLineOutput line(write);
    line.cell(std::to_string(id));
    line.cell(person.xref);
    line.cell(sexName(person.sex));
    line.cell([&name](const picture::TextSink& sink) { gedcom::writeDisplayName(name, sink); });
    line.cell(name.given);
    line.cell(name.surname);
    line.cell(person.dead ? "true" : "false");
    line.cell(person.birth.written);
    line.cell(gedcom::sortText(person.birth));
    line.cell(placeOf(data, id, "BIRT"));
    line.cell(person.death.written);
    line.cell(gedcom::sortText(person.death));
    line.cell(placeOf(data, id, "DEAT"));
    line.finish();
}

}  // namespace

void writePeopleTable(const gedcom::GedcomData& data, const std::vector<gedcom::PersonId>& persons,
                      const picture::TextSink& write) {
    write(
        "id\txref\tsex\tname\tgiven\tsurname\tdead\tbirth\tbirth_sort\tbirth_place\tdeath\tdeath_sort\tdeath_"
        "place\n");
    for (const gedcom::PersonId id : persons) writeLine(data, id, write);
}

void writePeopleJson(const gedcom::GedcomData& data, const std::vector<gedcom::PersonId>& persons,
                     const picture::TextSink& write) {
    JsonOutput json(write, JsonOutput::Form::indented);
    json.beginObject();
    json.field("format", Json(kFormatVersion));
    json.field("file", std::string_view(data.file()));
    json.key("persons");
    json.beginList();
    for (const gedcom::PersonId id : persons) {
        json.beginObject();
        json.field("id", Json(id));
        writePersonFields(data, id, {}, json);
        json.endObject();
    }
    json.endList();
    json.endObject();
    write("\n");
}

}  // namespace olvane::cli
