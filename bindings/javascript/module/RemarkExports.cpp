// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The remarks on an open GEDCOM file in words, and the words of diagnostics that come from elsewhere.

#include <string>
#include <string_view>
#include <utility>
#include <variant>
#include <vector>

#include <olvane/source/GedcomCheck.h>

#include "JsonText.h"
#include "OpenFile.h"

#define OLVANE_EXPORT(name) extern "C" __attribute__((export_name(name)))

namespace olvane::js {
namespace {

using gedcom::GedcomData;
using gedcom::PersonId;

kin::Language languageOf(const char* code) {
    return kin::languageOf(code).value_or(kin::Language::english);
}

// People by their names, records without one by their identifiers.
kin::RemarkNames namesOf(const GedcomData& data) {
    kin::RemarkNames names;
    names.person = [&data](kin::Place place) {
        const auto id = static_cast<PersonId>(place + 1);
        std::string name = gedcom::displayName(data.firstName(id));
        return name.empty() ? "@" + std::string(data.person(id).xref) + "@" : name;
    };
    names.family = [&data](std::uint32_t family) {
        return "@" + std::string(data.family(family).xref) + "@";
    };
    return names;
}

void writeText(JsonText& json, const GedcomData& data, const gedcom::FileRemark& remark,
               kin::Language language) {
    if (const auto* diagnostic = std::get_if<const gedcom::Diagnostic*>(&remark.about)) {
        json.string(gedcom::whatText(**diagnostic, kin::languageCode(language)));
        json.string(gedcom::doneText(**diagnostic, kin::languageCode(language)));
    } else {
        json.string(kin::remarkText(std::get<kin::Remark>(remark.about), namesOf(data), language));
        json.string("");
    }
}

std::string remarksJson(const GedcomData& data, kin::Language language) {
    JsonText json;
    json.begin();
    for (const gedcom::FileRemark& remark : gedcom::remarksOf(data)) {
        json.begin();
        json.string(remark.kind());
        json.string(remark.severity());
        json.number(remark.line);
        json.begin();
        for (const PersonId person : remark.persons) json.number(person);
        json.end();
        writeText(json, data, remark, language);
        json.end();
    }
    json.end();
    return std::move(json).take();
}

std::vector<std::string_view> partsOf(std::string_view text, char separator) {
    std::vector<std::string_view> parts;
    for (std::size_t end = text.find(separator); end != std::string_view::npos; end = text.find(separator)) {
        parts.push_back(text.substr(0, end));
        text.remove_prefix(end + 1);
    }
    parts.push_back(text);
    return parts;
}

constexpr char kBetweenPhrases = '\x1E';
constexpr char kBetweenArguments = '\x1F';

// Phrases whose sentence nobody knows are left out.
std::vector<gedcom::DiagnosticPhrase> phrasesIn(const std::vector<std::string_view>& texts) {
    std::vector<gedcom::DiagnosticPhrase> phrases;
    for (const std::string_view text : texts) {
        const std::vector<std::string_view> parts = partsOf(text, kBetweenArguments);
        const auto sentence = gedcom::sentenceOfName(parts.front());
        if (sentence) phrases.push_back({*sentence, {parts.begin() + 1, parts.end()}});
    }
    return phrases;
}

// What was quoted, what was wrong and what was done, one behind the other.
std::string diagnosticJson(std::string_view text, std::string_view language) {
    std::vector<std::string_view> parts = partsOf(text, kBetweenPhrases);
    const std::string_view quoted = parts.front();
    parts.erase(parts.begin());
    std::vector<gedcom::DiagnosticPhrase> phrases = phrasesIn(parts);
    JsonText json;
    json.begin();
    if (!phrases.empty()) {
        const std::vector<gedcom::DiagnosticPhrase> done(phrases.begin() + 1, phrases.end());
        const gedcom::Diagnostic diagnostic{"", 0, {}, {}, phrases.front(), done, std::string(quoted)};
        json.string(gedcom::whatText(diagnostic, language));
        json.string(gedcom::doneText(diagnostic, language));
    }
    json.end();
    return std::move(json).take();
}

}  // namespace
}  // namespace olvane::js

using namespace olvane;
using js::OpenFile;

OLVANE_EXPORT("gedcom_remarks") const char* gedcomRemarks(const OpenFile* file, const char* language) {
    return js::textOrRefusal([&] { return js::remarksJson(file->data, js::languageOf(language)); });
}

OLVANE_EXPORT("diagnostic_words") const char* diagnosticWords(const char* text, const char* language) {
    return js::textOrRefusal([&] { return js::diagnosticJson(text, language); });
}
