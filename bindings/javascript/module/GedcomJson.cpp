// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Dates and details of a file as JSON arrays, in the order in which gedcom.mjs reads them.

#include "GedcomJson.h"

#include <string_view>
#include <vector>

#include <olvane/gedcom/GedcomPeriod.h>

namespace olvane::js {
namespace {

void appendTexts(JsonText& json, const std::vector<std::string_view>& texts) {
    json.begin();
    for (const std::string_view text : texts) json.string(text);
    json.end();
}

void appendCitations(JsonText& json, const std::vector<gedcom::Citation>& citations) {
    json.begin();
    for (const gedcom::Citation& citation : citations) {
        json.begin();
        json.string(citation.title);
        json.string(citation.author);
        json.string(citation.publication);
        json.string(citation.page);
        json.string(citation.text);
        json.number(citation.quality.value_or(-1));
        json.end();
    }
    json.end();
}

void appendMedia(JsonText& json, const std::vector<gedcom::MediaFile>& media) {
    json.begin();
    for (const gedcom::MediaFile& medium : media) {
        json.begin();
        json.string(medium.title);
        json.string(medium.file);
        json.string(medium.format);
        json.end();
    }
    json.end();
}

}  // namespace

void appendDate(JsonText& json, const gedcom::GedcomDate& date) {
    if (!date.isGiven()) return json.number(0);
    json.begin();
    json.string(date.written);
    json.number(date.year);
    json.number(date.month);
    json.number(date.day);
    json.number(static_cast<int>(date.mark));
    json.number(date.lastYear);
    json.string(gedcom::displayYear(date));
    json.number(gedcom::isPeriod(date) ? 1 : 0);
    json.end();
}

void appendFact(JsonText& json, const gedcom::Fact& fact) {
    json.string(fact.tag);
    json.string(fact.value);
    appendDate(json, fact.date);
    json.string(fact.place);
}

void appendDetails(JsonText& json, const gedcom::Details& details) {
    if (details.isEmpty()) return json.number(0);
    json.begin();
    json.string(details.type);
    json.string(details.cause);
    json.string(details.age);
    json.string(details.husbandAge);
    json.string(details.wifeAge);
    json.string(details.agency);
    json.string(details.address);
    appendTexts(json, details.notes);
    appendCitations(json, details.citations);
    appendMedia(json, details.media);
    appendTexts(json, details.links);
    json.end();
}

}  // namespace olvane::js
