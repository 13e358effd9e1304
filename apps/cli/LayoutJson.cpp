// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Layouts for other programs, in words.

#include <cli/LayoutJson.h>

#include <nlohmann/json.hpp>

#include <cli/PersonJson.h>

namespace olvane::cli {

namespace {

using Json = nlohmann::ordered_json;

constexpr int kFormatVersion = 1;

Json segmentJson(const LayoutSegment& segment) {
    return {{"x1", segment.x1}, {"y1", segment.y1}, {"x2", segment.x2}, {"y2", segment.y2}};
}

Json boxJson(const gedcom::GedcomData& data, const LayoutRecord& record, const std::vector<bool>& living,
             const gedcom::HiddenNames& hiddenNames) {
    Json json;
    json["id"] = record.id;
    json["x"] = record.x;
    json["y"] = record.y;
    json["hasHiddenRelatives"] = record.hasHiddenRelatives;
    json["segments"] = Json::array();
    for (const LayoutSegment& segment : record.segments) json["segments"].push_back(segmentJson(segment));
    if (record.addNode) {
        json["addNode"] = {{"sex", record.addNode->male ? "male" : "female"},
                           {"child", record.addNode->childId}};
    } else if (!living.empty() && living[static_cast<std::size_t>(record.id - 1)]) {
        json["living"] = true;
    } else {
        json["person"] = personJson(data, static_cast<gedcom::PersonId>(record.id), hiddenNames);
    }
    return json;
}

}  // namespace

std::string layoutJson(const gedcom::GedcomData& data, gedcom::PersonId focus, const LayoutRequest& request,
                       const std::vector<LayoutRecord>& records, const std::vector<bool>& living) {
    const TreeSize size = charts::treeSizeOf(request.boxes);
    const gedcom::HiddenNames hiddenNames(data, living);
    Json json;
    json["format"] = kFormatVersion;
    json["view"] = request.view() == View::pedigree ? "pedigree" : "family";
    json["focus"] = focus;
    json["boxWidth"] = static_cast<int>(size.nodeWidth);
    json["boxHeight"] = static_cast<int>(size.nodeHeight);
    json["boxes"] = Json::array();
    for (const LayoutRecord& record : records)
        json["boxes"].push_back(boxJson(data, record, living, hiddenNames));
    return json.dump(1, ' ', false, Json::error_handler_t::replace);
}

}  // namespace olvane::cli
