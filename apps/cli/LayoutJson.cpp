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

void writeBox(const gedcom::GedcomData& data, const LayoutRecord& record, const std::vector<bool>& living,
              const gedcom::HiddenNames& hiddenNames, JsonOutput& json) {
    json.beginObject();
    json.field("id", Json(record.id));
    json.field("x", Json(record.x));
    json.field("y", Json(record.y));
    json.field("hasHiddenRelatives", Json(record.hasHiddenRelatives));
    json.key("segments");
    json.beginList();
    for (const LayoutSegment& segment : record.segments) json.value(segmentJson(segment));
    json.endList();
    if (record.addNode) {
        json.field("addNode", Json{{"sex", record.addNode->male ? "male" : "female"},
                                   {"child", record.addNode->childId}});
    } else if (!living.empty() && living[static_cast<std::size_t>(record.id - 1)]) {
        json.field("living", Json(true));
    } else {
        json.key("person");
        json.beginObject();
        writePersonFields(data, static_cast<gedcom::PersonId>(record.id), hiddenNames, json);
        json.endObject();
    }
    json.endObject();
}

}  // namespace

void writeLayoutJson(const gedcom::GedcomData& data, gedcom::PersonId focus, const LayoutRequest& request,
                     const std::vector<LayoutRecord>& records, const std::vector<bool>& living,
                     const picture::TextSink& write) {
    const TreeSize size = charts::treeSizeOf(request.boxes);
    const gedcom::HiddenNames hiddenNames(data, living);
    JsonOutput json(write, JsonOutput::Form::indented);
    json.beginObject();
    json.field("format", Json(kFormatVersion));
    json.field("view", std::string_view(request.view() == View::pedigree ? "pedigree" : "family"));
    json.field("focus", Json(focus));
    json.field("boxWidth", Json(static_cast<int>(size.nodeWidth)));
    json.field("boxHeight", Json(static_cast<int>(size.nodeHeight)));
    json.key("boxes");
    json.beginList();
    for (const LayoutRecord& record : records) writeBox(data, record, living, hiddenNames, json);
    json.endList();
    json.endObject();
    write("\n");
}

}  // namespace olvane::cli
