// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Checks a file, and the layouts of its persons: what is in it, what was wrong with it, what will look odd,
// and what makes a picture hard to read.

#include <cli/Commands.h>

#include <algorithm>
#include <functional>
#include <map>
#include <optional>

#include <olvane/draw/LayoutCheck.h>
#include <olvane/picture/Judge.h>

#include <cli/DataCheck.h>
#include <cli/FileReading.h>
#include <cli/FocusChoice.h>
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

struct CheckedLayout {
    std::size_t boxes = 0;
    draw::BoxSize size{};
    draw::LayoutFindings findings;
};

CheckedLayout checkEngineLayout(const gedcom::GedcomData& data, gedcom::PersonId focus,
                                const LayoutRequest& request) {
    const std::vector<LayoutRecord> records = readLayoutText(layoutText(data, focus, request));
    const TreeSize size = sizeOf(request.boxes);
    const auto direction =
        request.view == View::pedigree ? draw::LineDirection::sideways : draw::LineDirection::downward;
    const draw::BoxSize box{static_cast<int>(size.nodeWidth), static_cast<int>(size.nodeHeight)};
    return {records.size(), box, draw::checkLayout(records, direction, box)};
}

// A family goes by its first child, or by a parent where it has none.
std::int64_t idOfFamily(const picture::Picture& picture, picture::Index place) {
    const picture::Family& family = picture.families[static_cast<std::size_t>(place)];
    const auto children = picture.children(family);
    const picture::Index box = children.empty() ? picture.parents(family).front() : children.front();
    return picture.boxes[static_cast<std::size_t>(box)].id;
}

draw::LayoutFindings findingsOf(const picture::Picture& picture) {
    std::vector<picture::Finding> found;
    picture::judge(picture, nullptr, &found);
    const auto box = [&](picture::Index place) { return picture.boxes[static_cast<std::size_t>(place)].id; };
    draw::LayoutFindings findings;
    for (const picture::Finding& finding : found) {
        if (finding.kind == picture::FindingKind::overlap) {
            findings.overlappingBoxes.emplace_back(box(finding.one), box(finding.other));
        } else if (finding.kind == picture::FindingKind::hit) {
            findings.linesThroughBoxes.emplace_back(idOfFamily(picture, finding.one), box(finding.other));
        } else if (finding.kind == picture::FindingKind::track ||
                   finding.kind == picture::FindingKind::touch) {
            findings.sharedTracks.emplace_back(idOfFamily(picture, finding.one),
                                               idOfFamily(picture, finding.other));
        }
    }
    std::map<std::int64_t, int> boxes;
    for (const picture::Box& one : picture.boxes) {
        if (one.kind == picture::BoxKind::person) ++boxes[one.id];
    }
    for (const auto& [id, count] : boxes) {
        if (count > 1) findings.repeatedPersons.push_back({id, count});
    }
    return findings;
}

// Looks at the layouts of one file in one view.
class LayoutChecker {
public:
    LayoutChecker(const gedcom::GedcomData& data, const LayoutRequest& request)
        : data_(data), request_(request) {
        if (!isEngineView(request.view)) charts_.emplace(data, request, std::vector<bool>());
    }

    CheckedLayout check(gedcom::PersonId focus) const {
        if (!charts_) return checkEngineLayout(data_, focus, request_);
        const picture::Picture picture = charts_->pictureOf(focus);
        const TreeSize size = sizeOf(request_.boxes);
        const draw::BoxSize box{static_cast<int>(size.nodeWidth), static_cast<int>(size.nodeHeight)};
        return {picture.boxes.size(), box, findingsOf(picture)};
    }

private:
    const gedcom::GedcomData& data_;
    const LayoutRequest& request_;
    std::optional<PictureRun> charts_;
};

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
    text += counted(layout.boxes, "box", "boxes") + " of " + std::to_string(layout.size.width) + " by " +
            std::to_string(layout.size.height) + ", " + std::to_string(findings.overlappingBoxes.size()) +
            " overlapping, " + counted(findings.linesThroughBoxes.size(), "line", "lines") +
            " through boxes, " + std::to_string(findings.sharedTracks.size()) +
            " pairs of families on one track, " +
            counted(findings.repeatedPersons.size(), "person", "persons") + " in several boxes\n";
}

std::vector<std::size_t> countsOf(const CheckedLayout& layout) {
    const draw::LayoutFindings& findings = layout.findings;
    return {layout.boxes, findings.overlappingBoxes.size(), findings.linesThroughBoxes.size(),
            findings.sharedTracks.size(), findings.repeatedPersons.size()};
}

void appendPairs(const std::vector<draw::IdPair>& pairs, const char* what, std::string& text) {
    if (pairs.empty()) return;
    text += (text.empty() ? "" : "; ") + std::string(what);
    for (const auto& [one, other] : pairs) text += " " + std::to_string(one) + "+" + std::to_string(other);
}

// Whom the counts of a line are about: "overlap 3+8; several boxes 4 9".
std::string idsOf(const draw::LayoutFindings& findings) {
    std::string text;
    appendPairs(findings.overlappingBoxes, "overlap", text);
    appendPairs(findings.linesThroughBoxes, "through", text);
    appendPairs(findings.sharedTracks, "one track", text);
    if (findings.repeatedPersons.empty()) return text;
    text += std::string(text.empty() ? "" : "; ") + "several boxes";
    for (const draw::RepeatedPerson& person : findings.repeatedPersons)
        text += " " + std::to_string(person.id);
    return text;
}

std::string tableLine(const std::string& name, const std::vector<std::size_t>& counts,
                      const std::string& ids) {
    std::string text = name;
    for (const std::size_t count : counts) text += "\t" + std::to_string(count);
    return text + "\t" + ids + "\n";
}

// One line for each person as focus, and one for all of them; answers how many layouts have trouble.
std::size_t tellAllLayouts(const gedcom::GedcomData& data, const LayoutRequest& request) {
    writeReport(
        "focus\tboxes\toverlaps\tlines through boxes\tfamilies on one track\tpersons in several "
        "boxes\tids\n");
    const LayoutChecker checker(data, request);
    std::size_t troubled = 0;
    std::vector<std::size_t> totals(countsOf({}).size());
    const std::size_t count = data.personCount();
    for (std::size_t start = 0; start < count; start += kBlock) {
        std::vector<CheckedLayout> layouts(std::min(kBlock, count - start));
        const auto idAt = [start](std::size_t i) { return static_cast<gedcom::PersonId>(start + i + 1); };
        inParallel(layouts.size(), [&](std::size_t i) { layouts[i] = checker.check(idAt(i)); });
        std::string text;
        for (std::size_t i = 0; i < layouts.size(); ++i) {
            const std::vector<std::size_t> counts = countsOf(layouts[i]);
            std::transform(totals.begin(), totals.end(), counts.begin(), totals.begin(), std::plus<>());
            text += tableLine(std::to_string(idAt(i)), counts, idsOf(layouts[i].findings));
            if (layouts[i].findings.anyTrouble()) ++troubled;
        }
        writeReport(text);
    }
    writeReport(tableLine("total", totals, counted(troubled, "layout", "layouts") + " with trouble"));
    return troubled;
}

// Answers whether the layout has trouble.
bool tellOneLayout(const gedcom::GedcomData& data, gedcom::PersonId focus, const LayoutRequest& request) {
    const CheckedLayout layout = LayoutChecker(data, request).check(focus);
    std::string text;
    tellLayout(layout, text);
    writeReport(text);
    return layout.findings.anyTrouble();
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
    if (focus != 0) anyTrouble = tellOneLayout(data, focus, options.request) || anyTrouble;
    if (options.all) anyTrouble = tellAllLayouts(data, options.request) > 0 || anyTrouble;
    return anyTrouble ? 1 : 0;
}

}  // namespace olvane::cli
