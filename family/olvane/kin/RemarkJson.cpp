// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/kin/RemarkJson.h>

namespace olvane::kin {

std::string jsonText(std::string_view text) {
    constexpr std::string_view kHex = "0123456789abcdef";
    std::string json = "\"";
    for (const char c : text) {
        const auto byte = static_cast<unsigned char>(c);
        if (c == '"' || c == '\\') {
            json += '\\';
            json += c;
        } else if (byte < 0x20) {
            json += "\\u00";
            json += kHex[byte >> 4];
            json += kHex[byte & 15];
        } else {
            json += c;
        }
    }
    return json + "\"";
}

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
