// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Checks a file, and the layouts of its persons: what is in it, what was wrong with it, what will look odd,
// and what makes a picture hard to read.

#include <cli/Commands.h>

#include <algorithm>

#include <olvane/draw/LayoutCheck.h>

#include <cli/DataCheck.h>
#include <cli/FileReading.h>
#include <cli/FocusChoice.h>
#include <cli/OutputFile.h>
#include <cli/ParallelWork.h>

namespace olvane::cli {

namespace {

constexpr std::size_t kBlock = 512;

std::string counted(std::size_t count, const char* one, const char* many) {
    return std::to_string(count) + " " + (count == 1 ? one : many);
}

std::string summaryOf(const gedcom::GedcomData& data) {
    const std::string version = data.version().empty() ? "of no told version" : data.version();
    return data.file() + ": GEDCOM " + version + ", " + data.encoding() + ", " +
           counted(data.personCount(), "person", "persons") + ", " +
           counted(data.familyCount(), "family", "families") + "\n";
}

// Answers how many problems were told; notes are told and not counted.
std::size_t tellDiagnostics(const gedcom::GedcomData& data, std::string& text) {
    std::size_t problems = 0;
    for (const gedcom::Diagnostic& diagnostic : data.diagnostics()) {
        text += gedcom::formatDiagnostic(diagnostic) + "\n";
        if (diagnostic.severity != gedcom::Severity::note) ++problems;
    }
    return problems;
}

std::size_t tellOddities(const gedcom::GedcomData& data, std::string& text) {
    const std::vector<DataFinding> findings = checkData(data);
    for (const DataFinding& finding : findings) {
        text += data.file() + ":" + std::to_string(finding.line) + ": odd: " + finding.text + "\n";
    }
    return findings.size();
}

struct CheckedLayout {
    std::size_t boxes = 0;
    draw::LayoutFindings findings;
};

CheckedLayout checkLayoutOf(const gedcom::GedcomData& data, gedcom::PersonId focus,
                            const LayoutRequest& request) {
    const std::vector<LayoutRecord> records = readLayoutText(layoutText(data, focus, request));
    const TreeSize size = sizeOf(request.boxes);
    const auto direction =
        request.view == View::pedigree ? draw::LineDirection::sideways : draw::LineDirection::downward;
    const draw::BoxSize box{static_cast<int>(size.nodeWidth), static_cast<int>(size.nodeHeight)};
    return {records.size(), draw::checkLayout(records, direction, box)};
}

void tellPairs(const std::vector<draw::IdPair>& pairs, const char* what, std::string& text) {
    for (const auto& [one, other] : pairs) {
        text += std::string(what) + "\t" + std::to_string(one) + "\t" + std::to_string(other) + "\n";
    }
}

void tellLayout(const CheckedLayout& layout, std::string& text) {
    const draw::LayoutFindings& findings = layout.findings;
    tellPairs(findings.overlappingBoxes, "boxes overlap", text);
    tellPairs(findings.linesThroughBoxes, "line through box", text);
    tellPairs(findings.sharedTracks, "families on one track", text);
    for (const draw::RepeatedPerson& person : findings.repeatedPersons) {
        text += "several boxes\t" + std::to_string(person.id) + "\t" + std::to_string(person.boxes) + "\n";
    }
    text += counted(layout.boxes, "box", "boxes") + ", " + std::to_string(findings.overlappingBoxes.size()) +
            " overlapping, " + counted(findings.linesThroughBoxes.size(), "line", "lines") +
            " through boxes, " + std::to_string(findings.sharedTracks.size()) +
            " pairs of families on one track, " +
            counted(findings.repeatedPersons.size(), "person", "persons") + " in several boxes\n";
}

std::string tableLine(gedcom::PersonId id, const CheckedLayout& layout) {
    const draw::LayoutFindings& findings = layout.findings;
    std::string text = std::to_string(id);
    for (const std::size_t count :
         {layout.boxes, findings.overlappingBoxes.size(), findings.linesThroughBoxes.size(),
          findings.sharedTracks.size(), findings.repeatedPersons.size()}) {
        text += "\t" + std::to_string(count);
    }
    return text + "\n";
}

// One line for each person as focus; answers how many layouts have trouble.
std::size_t tellAllLayouts(const gedcom::GedcomData& data, const LayoutRequest& request) {
    writeStandardOutput(
        "focus\tboxes\toverlaps\tlines through boxes\tfamilies on one track\tpersons in several boxes\n");
    std::size_t troubled = 0;
    const std::size_t count = data.personCount();
    for (std::size_t start = 0; start < count; start += kBlock) {
        std::vector<CheckedLayout> layouts(std::min(kBlock, count - start));
        const auto idAt = [start](std::size_t i) { return static_cast<gedcom::PersonId>(start + i + 1); };
        inParallel(layouts.size(),
                   [&](std::size_t i) { layouts[i] = checkLayoutOf(data, idAt(i), request); });
        std::string text;
        for (std::size_t i = 0; i < layouts.size(); ++i) {
            text += tableLine(idAt(i), layouts[i]);
            if (layouts[i].findings.anyTrouble()) ++troubled;
        }
        writeStandardOutput(text);
    }
    return troubled;
}

}  // namespace

int runCheck(const CheckOptions& options) {
    const gedcom::GedcomData data = readFileQuietly(options.file);
    if (options.all) return tellAllLayouts(data, options.request) == 0 ? 0 : 1;
    if (!options.focus.empty()) {
        const CheckedLayout layout = checkLayoutOf(data, chooseFocus(data, options.focus), options.request);
        std::string text;
        tellLayout(layout, text);
        writeStandardOutput(text);
        return layout.findings.anyTrouble() ? 1 : 0;
    }
    std::string text = summaryOf(data);
    const std::size_t problems = tellDiagnostics(data, text) + tellOddities(data, text);
    writeStandardOutput(text);
    return problems == 0 ? 0 : 1;
}

}  // namespace olvane::cli
