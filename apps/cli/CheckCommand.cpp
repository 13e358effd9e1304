// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Checks a file, and the layouts of its persons: what is in it, what was wrong with it, what will look odd,
// and what makes a picture hard to read.

#include <cli/Commands.h>

#include <algorithm>

#include <cli/DataCheck.h>
#include <cli/FileReading.h>
#include <cli/FocusChoice.h>
#include <cli/LayoutFindings.h>
#include <cli/OutputFile.h>
#include <cli/ParallelWork.h>
#include <cli/PictureRun.h>

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
        if (isFoundInData(diagnostic.kind)) continue;
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

// One line for each person as focus, and one for all of them; returns how many layouts have trouble.
std::size_t printAllLayouts(const gedcom::GedcomData& data, const LayoutRequest& request) {
    writeReport(findingsHeading());
    const PictureRun pictures(data, request, {});
    picture::Judgement totals;
    std::size_t troubled = 0;
    const std::size_t count = data.personCount();
    for (std::size_t start = 0; start < count; start += kBlock) {
        std::vector<LayoutFindings> layouts(std::min(kBlock, count - start));
        const auto idAt = [start](std::size_t i) { return static_cast<gedcom::PersonId>(start + i + 1); };
        inParallel(layouts.size(),
                   [&](std::size_t i) { layouts[i] = findingsOf(pictures.pictureOf(idAt(i))); });
        std::string text;
        for (std::size_t i = 0; i < layouts.size(); ++i) {
            text += findingsLine(std::to_string(idAt(i)), layouts[i]);
            addCounts(layouts[i].counts, totals);
            if (layouts[i].hasTrouble()) ++troubled;
        }
        writeReport(text);
    }
    writeReport(findingsTotal(totals, troubled));
    return troubled;
}

// Returns whether the layout has trouble.
bool printOneLayout(const gedcom::GedcomData& data, gedcom::PersonId focus, const LayoutRequest& request) {
    const LayoutFindings findings = findingsOf(PictureRun(data, request, {}).pictureOf(focus));
    const TreeSize size = sizeOf(request.boxes);
    writeReport(
        findingsText(findings, static_cast<double>(size.nodeWidth), static_cast<double>(size.nodeHeight)));
    return findings.hasTrouble();
}

// Answers how many problems were told.
std::size_t tellData(const gedcom::GedcomData& data) {
    std::string text = summaryOf(data);
    const std::size_t problems = tellDiagnostics(data, text) + tellOddities(data, text);
    writeReport(text);
    return problems;
}

}  // namespace

// The focus is settled first, so that a mistyped name is not lost below what the data brings up.
int runCheck(const CheckOptions& options) {
    const gedcom::GedcomData data = readFileQuietly(options.input);
    const gedcom::PersonId focus = options.focus.empty() ? 0 : chooseFocus(data, options.focus);
    bool anyTrouble = tellData(data) > 0;
    if (focus != 0) anyTrouble = printOneLayout(data, focus, options.request) || anyTrouble;
    if (options.all) anyTrouble = printAllLayouts(data, options.request) > 0 || anyTrouble;
    return anyTrouble ? 1 : 0;
}

}  // namespace olvane::cli
