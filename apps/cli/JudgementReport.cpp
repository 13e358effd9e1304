// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// One list of what is counted, for every form of output.

#include <cli/JudgementReport.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <cstddef>
#include <cstdio>

#include <nlohmann/json.hpp>

#include <cli/TableCells.h>

namespace olvane::cli {

namespace {

using Json = nlohmann::ordered_json;
using picture::FindingKind;
using picture::Judgement;

constexpr int kFormatVersion = 1;

// A count or a measure by name; null for one that was not made.
struct NamedValue {
    const char* name;
    Json value;
};

// Three decimals: more than a picture has.
double rounded(double value) {
    return std::round(value * 1000) / 1000;
}

std::vector<NamedValue> valuesOf(const Judgement& counts) {
    return {{"boxes", counts.boxes},
            {"persons", counts.persons},
            {"families", counts.families},
            {"overlaps", counts.overlaps},
            {"hits", counts.hits},
            {"crossings", counts.crossings},
            {"tracks", counts.tracks},
            {"touches", counts.touches},
            {"unjoined", counts.unjoined},
            {"untold", counts.untold ? Json(*counts.untold) : Json(nullptr)},
            {"couples", counts.couples},
            {"sideBySide", counts.sideBySide},
            {"repeats", counts.repeats},
            {"unmarked", counts.unmarked},
            {"slanted", counts.slanted},
            {"samePersonMarks", counts.samePersonMarks},
            {"parentsElsewhereMarks", counts.parentsElsewhereMarks},
            {"partnersElsewhereMarks", counts.partnersElsewhereMarks},
            {"width", rounded(counts.width)},
            {"height", rounded(counts.height)},
            {"areaPerPerson", rounded(counts.areaPerPerson)},
            {"aspect", rounded(counts.aspect)},
            {"medianLineLength", rounded(counts.medianLineLength)},
            {"longLineLength", rounded(counts.longLineLength)}};
}

std::string textOf(const Json& value) {
    return value.is_null() ? "" : value.dump();
}

// Which two things a finding is about.
std::array<const char*, 2> placesOf(FindingKind kind) {
    if (kind == FindingKind::overlap) return {"box", "otherBox"};
    if (kind == FindingKind::hit || kind == FindingKind::unjoined) return {"family", "box"};
    return {"family", "otherFamily"};
}

Json findingJson(const picture::Finding& finding) {
    const auto places = placesOf(finding.kind);
    return {{"kind", findingName(finding.kind)}, {places[0], finding.one}, {places[1], finding.other}};
}

Json pictureJson(const JudgedPicture& picture) {
    Json json;
    json["file"] = picture.file;
    json["view"] = picture.view;
    json["trouble"] = hasTrouble(picture.counts);
    for (const NamedValue& value : valuesOf(picture.counts)) {
        if (!value.value.is_null()) json["counts"][value.name] = value.value;
    }
    json["findings"] = Json::array();
    for (const picture::Finding& finding : picture.findings) json["findings"].push_back(findingJson(finding));
    return json;
}

std::string padded(const std::string& text, std::size_t width) {
    return text + std::string(width > text.size() ? width - text.size() : 0, ' ');
}

}  // namespace

const char* findingName(FindingKind kind) {
    switch (kind) {
        case FindingKind::overlap:
            return "overlap";
        case FindingKind::hit:
            return "hit";
        case FindingKind::crossing:
            return "crossing";
        case FindingKind::track:
            return "track";
        case FindingKind::touch:
            return "touch";
        case FindingKind::unjoined:
            break;
    }
    return "unjoined";
}

bool hasTrouble(const Judgement& counts) {
    return counts.overlaps + counts.hits + counts.tracks + counts.touches + counts.unjoined +
               counts.unmarked + counts.untold.value_or(0) >
           0;
}

std::string judgementsText(const std::vector<JudgedPicture>& pictures) {
    constexpr std::size_t kLeastWidth = 10;
    const auto names = valuesOf(Judgement());
    std::string text = padded("", 24);
    for (const JudgedPicture& picture : pictures) text += "  " + padded(picture.file, kLeastWidth);
    text += "\n" + padded("view", 24);
    for (const JudgedPicture& picture : pictures) {
        text += "  " + padded(picture.view, std::max(picture.file.size(), kLeastWidth));
    }
    text.erase(text.find_last_not_of(' ') + 1);
    text += "\n";
    for (std::size_t i = 0; i < names.size(); ++i) {
        text += padded(names[i].name, 24);
        for (const JudgedPicture& picture : pictures) {
            const std::string value = textOf(valuesOf(picture.counts)[i].value);
            text += "  " + padded(value.empty() ? "-" : value, std::max(picture.file.size(), kLeastWidth));
        }
        text.erase(text.find_last_not_of(' ') + 1);
        text += "\n";
    }
    return text;
}

std::string judgementsTable(const std::vector<JudgedPicture>& pictures) {
    std::string text = "file\tview";
    for (const NamedValue& value : valuesOf(Judgement())) text += std::string("\t") + value.name;
    text += "\n";
    for (const JudgedPicture& picture : pictures) {
        text += tableCell(picture.file) + "\t" + tableCell(picture.view);
        for (const NamedValue& value : valuesOf(picture.counts)) text += "\t" + textOf(value.value);
        text += "\n";
    }
    return text;
}

std::string judgementsJson(const std::vector<JudgedPicture>& pictures) {
    Json json;
    json["format"] = kFormatVersion;
    json["pictures"] = Json::array();
    for (const JudgedPicture& picture : pictures) json["pictures"].push_back(pictureJson(picture));
    return json.dump(1, ' ', false, Json::error_handler_t::replace) + "\n";
}

}  // namespace olvane::cli
