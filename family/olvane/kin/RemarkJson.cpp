// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/kin/KinJson.h>

namespace olvane::kin {

std::string remarksJson(const KinGraph& graph, const std::vector<Remark>& remarks, const RemarkNames& names) {
    std::string json = "[";
    for (const Remark& remark : remarks) {
        if (json.size() > 1) json += ",";
        json += "\n{\"kind\": " + jsonText(nameOf(remark.kind)) + ", \"person\": ";
        json += remark.person == kNobody ? "null" : std::to_string(graph.id(remark.person));
        json += ", \"family\": " + (remark.family == 0 ? "null" : std::to_string(remark.family));
        json += ", \"text\": " + jsonText(remarkText(remark, names, Language::english)) + "}";
    }
    return json + "]\n";
}

}  // namespace olvane::kin
