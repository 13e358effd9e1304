// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// How two persons of a file are related: in words with every way, or as JSON.

#include <cli/Commands.h>

#include <cstdlib>

#include <olvane/kin/KinJson.h>
#include <olvane/kin/Kinship.h>
#include <olvane/kin/KinshipText.h>
#include <olvane/source/GedcomKin.h>

#include <cli/FocusChoice.h>
#include <cli/OutputFile.h>

namespace olvane::cli {

namespace {

std::string nameOf(const gedcom::GedcomData& data, std::int64_t id) {
    const std::string name = readableName(data, static_cast<gedcom::PersonId>(id));
    return name.empty() ? "#" + std::to_string(id) : name;
}

// The language asked for, or that of the environment for messages, or else English.
kin::Language languageFor(const std::string& asked) {
    if (!asked.empty()) return kin::languageOf(asked).value_or(kin::Language::english);
    for (const char* variable : {"LC_ALL", "LC_MESSAGES", "LANG"}) {
        const char* const value = std::getenv(variable);
        if (value != nullptr && *value != '\0')
            return kin::languageOf(value).value_or(kin::Language::english);
    }
    return kin::Language::english;
}

class KinshipReport {
public:
    KinshipReport(const gedcom::GedcomData& data, const kin::KinGraph& graph, kin::Language language)
        : data_(data), graph_(graph), language_(language) {}

    // A line for the whole, then one for each way: what it makes of B, and the persons on it.
    std::string text(const kin::Kinship& kinship) const {
        std::string text = nameOf(data_, graph_.id(kinship.b)) + "\t";
        text +=
            (kinship.isRelated() ? kin::kinshipText(graph_, kinship, language_) : std::string("-")) + "\n";
        for (const kin::KinWay& way : kinship.blood)
            text += line(kin::wayText(graph_, way, language_), way.persons);
        for (const kin::KinWay& way : kinship.legal)
            text += line(kin::wayText(graph_, way, language_), way.persons);
        for (const kin::MarriageWay& way : kinship.marriage) {
            text += line(kin::wayText(graph_, way, language_), way.persons);
        }
        return text;
    }

private:
    std::string line(const std::string& words, const std::vector<kin::Place>& persons) const {
        std::string text = "  " + words + "\t";
        const char* separator = "";
        for (const kin::Place person : persons) {
            text.append(separator).append(nameOf(data_, graph_.id(person)));
            separator = " > ";
        }
        return text + "\n";
    }

    const gedcom::GedcomData& data_;
    const kin::KinGraph& graph_;
    kin::Language language_;
};

}  // namespace

int runKin(const KinOptions& options) {
    const gedcom::GedcomData data = readFile(options.input);
    const gedcom::PersonId a = chooseFocus(data, options.a);
    const gedcom::PersonId b = chooseFocus(data, options.b);
    const kin::KinGraph graph = gedcom::kinGraphOf(data);
    kin::KinshipLimits limits;
    limits.ways = options.ways;
    const kin::Kinship kinship =
        kin::KinshipFinder(graph).between(graph.placeOf(a), graph.placeOf(b), limits);
    if (options.json) {
        writeReport(kin::kinshipJson(graph, kinship) + "\n");
    } else {
        writeReport(KinshipReport(data, graph, languageFor(options.language)).text(kinship));
    }
    return kinship.isRelated() ? statusOfReading(data) : 1;
}

}  // namespace olvane::cli
