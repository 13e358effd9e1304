// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <cli/CheckJson.h>

#include <nlohmann/json.hpp>

#include <cli/JudgementReport.h>

namespace olvane::cli {

namespace {

using Json = nlohmann::ordered_json;

constexpr int kFormatVersion = 1;

Json remarkJson(const gedcom::GedcomData& data, const Remark& remark) {
    Json json;
    json["kind"] = remark.kind;
    json["severity"] = remark.severity;
    json["file"] = data.file();
    if (remark.line != 0) json["line"] = remark.line;
    json["xrefs"] = remark.xrefs;
    json["text"] = remark.text;
    return json;
}

Json layoutJson(const CheckedLayout& layout) {
    const LayoutFindings& findings = layout.findings;
    Json json;
    json["focus"] = layout.focus;
    json["trouble"] = findings.hasTrouble();
    json["boxes"] = findings.counts.boxes;
    json["crossings"] = findings.counts.crossings;
    json["findings"] = Json::array();
    for (const LayoutFindings::Pair& pair : findings.pairs) {
        json["findings"].push_back(
            {{"kind", findingName(pair.kind)}, {"one", pair.one}, {"other", pair.other}});
    }
    json["severalBoxes"] = Json::array();
    for (const auto& [id, boxes] : findings.severalBoxes) {
        json["severalBoxes"].push_back({{"id", id}, {"boxes", boxes}});
    }
    return json;
}

}  // namespace

std::string checkJson(const gedcom::GedcomData& data, const std::vector<Remark>& remarks,
                      const std::vector<CheckedLayout>& layouts) {
    Json json;
    json["format"] = kFormatVersion;
    json["file"] = data.file();
    json["version"] = data.version();
    json["encoding"] = data.encoding();
    json["persons"] = data.personCount();
    json["families"] = data.familyCount();
    json["remarks"] = Json::array();
    for (const Remark& remark : remarks) json["remarks"].push_back(remarkJson(data, remark));
    for (const CheckedLayout& layout : layouts) json["layouts"].push_back(layoutJson(layout));
    return json.dump(1, ' ', false, Json::error_handler_t::replace) + "\n";
}

}  // namespace olvane::cli
