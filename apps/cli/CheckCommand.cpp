// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Checks a file, and the layouts of its persons: what is in it, what was wrong with it, what will look odd,
// and what makes a picture hard to read.

#include <cli/Commands.h>

#include <algorithm>

#include <cli/CheckJson.h>
#include <cli/FileReading.h>
#include <cli/FocusChoice.h>
#include <cli/LayoutFindings.h>
#include <cli/OutputFile.h>
#include <cli/ParallelWork.h>
#include <cli/PictureRun.h>
#include <cli/RemarkList.h>

namespace olvane::cli {

namespace {

constexpr std::size_t kBlock = 512;

std::string counted(std::size_t count, const char* one, const char* many) {
    return std::to_string(count) + " " + (count == 1 ? one : many);
}

std::string summaryOf(const gedcom::GedcomData& data) {
    const std::string version = data.version().empty() ? "version not stated" : data.version();
    return data.file() + ": GEDCOM " + version + ", " + data.encoding() + ", " +
           counted(data.personCount(), "person", "persons") + ", " +
           counted(data.familyCount(), "family", "families") + "\n";
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
    const TreeSize size = charts::treeSizeOf(request.boxes);
    writeReport(
        findingsText(findings, static_cast<double>(size.nodeWidth), static_cast<double>(size.nodeHeight)));
    return findings.hasTrouble();
}

bool hasProblem(const std::vector<Remark>& remarks) {
    return std::any_of(remarks.begin(), remarks.end(),
                       [](const Remark& remark) { return remark.isProblem(); });
}

// For people: the data, then the layouts as they come. Returns whether there is anything to see to.
bool printText(const gedcom::GedcomData& data, gedcom::PersonId focus, const CheckOptions& options) {
    const std::vector<Remark> remarks = remarksOf(data, options.request.chart.language);
    writeReport(summaryOf(data) + remarksText(data, remarks));
    bool anyTrouble = hasProblem(remarks);
    if (focus != 0) anyTrouble = printOneLayout(data, focus, options.request) || anyTrouble;
    if (options.all) anyTrouble = printAllLayouts(data, options.request) > 0 || anyTrouble;
    return anyTrouble;
}

bool printTable(const gedcom::GedcomData& data, const CheckOptions& options) {
    const std::vector<Remark> remarks = remarksOf(data, options.request.chart.language);
    writeReport(remarksTable(data, remarks));
    return hasProblem(remarks);
}

std::vector<CheckedLayout> checkedLayouts(const gedcom::GedcomData& data, gedcom::PersonId focus,
                                          const CheckOptions& options) {
    std::vector<CheckedLayout> layouts(options.all ? data.personCount() : (focus != 0 ? 1 : 0));
    if (layouts.empty()) return layouts;
    const PictureRun pictures(data, options.request, {});
    inParallel(layouts.size(), [&](std::size_t i) {
        layouts[i].focus = options.all ? static_cast<gedcom::PersonId>(i + 1) : focus;
        layouts[i].findings = findingsOf(pictures.pictureOf(layouts[i].focus));
    });
    return layouts;
}

bool printJson(const gedcom::GedcomData& data, gedcom::PersonId focus, const CheckOptions& options) {
    const std::vector<Remark> remarks = remarksOf(data, options.request.chart.language);
    const std::vector<CheckedLayout> layouts = checkedLayouts(data, focus, options);
    writeReport(checkJson(data, remarks, layouts));
    return hasProblem(remarks) ||
           std::any_of(layouts.begin(), layouts.end(),
                       [](const CheckedLayout& layout) { return layout.findings.hasTrouble(); });
}

}  // namespace

// The focus is settled first, so that a mistyped name is not lost below what the data brings up.
int runCheck(const CheckOptions& options) {
    const gedcom::GedcomData data = readFileQuietly(options.input);
    const gedcom::PersonId focus = options.focus.empty() ? 0 : chooseFocus(data, options.focus);
    if (options.format == ListFormat::tsv) return printTable(data, options) ? 1 : 0;
    if (options.format == ListFormat::json) return printJson(data, focus, options) ? 1 : 0;
    return printText(data, focus, options) ? 1 : 0;
}

}  // namespace olvane::cli
