// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/kin/KinJson.h>

#include <array>
#include <cstdio>
#include <cstdlib>

#include <olvane/kin/KinshipText.h>

namespace olvane::kin {

namespace {

constexpr std::array kBonds{"blood", "adopted", "foster", "step", "other"};

// With as few digits as give the same number back. The library for browsers writes no fractions by to_chars.
std::string number(double value) {
    constexpr int kMostDigits = 17;
    std::array<char, 32> text{};
    for (int digits = 1; digits <= kMostDigits; ++digits) {
        std::snprintf(text.data(), text.size(), "%.*g", digits, value);
        if (std::strtod(text.data(), nullptr) == value) break;
    }
    return text.data();
}

template <class Value>
std::string orNull(const std::optional<Value>& value) {
    return value ? std::to_string(*value) : "null";
}

// Words hold no characters that would need an escape: they come from our own tables.
template <class Text>
std::string words(const Text& textIn) {
    std::string out = "{";
    for (const Language language : kLanguages) {
        if (out.size() > 1) out += ", ";
        out += "\"" + std::string(languageCode(language)) + "\": \"" + textIn(language) + "\"";
    }
    return out + "}";
}

std::string ids(const KinGraph& graph, const std::vector<Place>& persons) {
    std::string out = "[";
    for (const Place person : persons) {
        if (out.size() > 1) out += ", ";
        out += std::to_string(graph.id(person));
    }
    return out + "]";
}

std::string wayJson(const KinGraph& graph, const KinWay& way) {
    std::string out = R"({"up": )" + std::to_string(way.up) + R"(, "down": )" + std::to_string(way.down);
    out += way.half ? R"(, "half": true)" : R"(, "half": false)";
    if (way.bond != Bond::blood)
        out += R"(, "bond": ")" + std::string(kBonds[static_cast<std::size_t>(way.bond)]) + "\"";
    out += R"(, "ancestors": )" + ids(graph, way.ancestors) + R"(, "persons": )" + ids(graph, way.persons);
    const auto text = [&graph, &way](Language language) { return wayText(graph, way, language); };
    return out + R"(, "words": )" + words(text) + "}";
}

std::string wayJson(const KinGraph& graph, const MarriageWay& way) {
    std::string out = R"({"links": )" + std::to_string(way.links());
    out += R"(, "persons": )" + ids(graph, way.persons);
    const auto text = [&graph, &way](Language language) { return wayText(graph, way, language); };
    return out + R"(, "words": )" + words(text) + "}";
}

template <class Way>
std::string listJson(const KinGraph& graph, const std::vector<Way>& ways) {
    std::string out = "[";
    for (const Way& way : ways) {
        if (out.size() > 1) out += ", ";
        out += wayJson(graph, way);
    }
    return out + "]";
}

}  // namespace

std::string kinshipJson(const KinGraph& graph, const Kinship& kinship) {
    const auto text = [&graph, &kinship](Language language) { return kinshipText(graph, kinship, language); };
    std::string out = R"({"a": )" + std::to_string(graph.id(kinship.a)) + R"(, "b": )" +
                      std::to_string(graph.id(kinship.b)) + R"(, "words": )" + words(text);
    out += R"(, "phi": )" + (kinship.phi ? number(*kinship.phi) : std::string("null"));
    if (kinship.bloodLoop || kinship.legalLoop) out += R"(, "reason": "loop")";
    out += R"(, "degree": )" + orNull(kinship.degree);
    out += R"(, "blood": )" + listJson(graph, kinship.blood);
    out += R"(, "bloodCount": )" + orNull(kinship.bloodCount);
    out += R"(, "legal": )" + listJson(graph, kinship.legal);
    out += R"(, "legalCount": )" + orNull(kinship.legalCount);
    out += R"(, "marriage": )" + listJson(graph, kinship.marriage);
    out += R"(, "marriageCount": )" + orNull(kinship.marriageCount);
    return out + "}";
}

}  // namespace olvane::kin
