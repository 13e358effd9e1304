// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Findings of the judge with names for those whom they are about.

#include <cli/LayoutFindings.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <map>
#include <span>

#include <cli/JudgementReport.h>

namespace olvane::cli {

namespace {

using picture::FindingKind;
using picture::Judgement;

std::int64_t idOfBox(const picture::Picture& picture, picture::Index place) {
    return picture.boxes[static_cast<std::size_t>(place)].id;
}

std::int64_t idOfFamily(const picture::Picture& picture, picture::Index place) {
    const picture::Family& family = picture.families[static_cast<std::size_t>(place)];
    const auto children = picture.children(family);
    return idOfBox(picture, children.empty() ? picture.parents(family).front() : children.front());
}

LayoutFindings::Pair pairOf(const picture::Picture& picture, const picture::Finding& finding) {
    const bool firstIsBox = finding.kind == FindingKind::overlap;
    const bool secondIsBox =
        firstIsBox || finding.kind == FindingKind::hit || finding.kind == FindingKind::unjoined;
    return {finding.kind, firstIsBox ? idOfBox(picture, finding.one) : idOfFamily(picture, finding.one),
            secondIsBox ? idOfBox(picture, finding.other) : idOfFamily(picture, finding.other)};
}

std::vector<std::pair<std::int64_t, int>> severalBoxesOf(const picture::Picture& picture) {
    std::map<std::int64_t, int> boxes;
    for (const picture::Box& box : picture.boxes) {
        if (box.kind == picture::BoxKind::person) ++boxes[box.id];
    }
    std::vector<std::pair<std::int64_t, int>> several;
    for (const auto& entry : boxes) {
        if (entry.second > 1) several.emplace_back(entry);
    }
    return several;
}

// What a kind is called: in the list of one picture, and in the line of one of many.
struct KindName {
    FindingKind kind;
    const char* inList;
    const char* inLine;
};

constexpr std::array<KindName, 5> kKindNames = {{
    {FindingKind::overlap, "boxes overlap", "overlap"},
    {FindingKind::hit, "line through box", "through"},
    {FindingKind::track, "families on one track", "one track"},
    {FindingKind::touch, "line ends on line", "touch"},
    {FindingKind::unjoined, "no line reaches", "unjoined"},
}};

std::string counted(std::size_t count, const char* one, const char* many) {
    return std::to_string(count) + " " + (count == 1 ? one : many);
}

std::vector<std::size_t> columnsOf(const Judgement& counts) {
    return {counts.boxes,   counts.overlaps, counts.hits,      counts.tracks,
            counts.touches, counts.unjoined, counts.crossings, counts.repeats};
}

// Whom the counts of a line are about: "overlap 3+8; several boxes 4 9".
std::string idsOf(const LayoutFindings& findings) {
    std::string text;
    for (const KindName& name : kKindNames) {
        bool first = true;
        for (const LayoutFindings::Pair& pair : findings.pairs) {
            if (pair.kind != name.kind) continue;
            if (first) text += (text.empty() ? "" : "; ") + std::string(name.inLine);
            text += " " + std::to_string(pair.one) + "+" + std::to_string(pair.other);
            first = false;
        }
    }
    if (findings.severalBoxes.empty()) return text;
    text += std::string(text.empty() ? "" : "; ") + "several boxes";
    for (const auto& [id, boxes] : findings.severalBoxes) text += " " + std::to_string(id);
    return text;
}

std::string lineOf(const std::string& name, const Judgement& counts, const std::string& last) {
    std::string text = name;
    for (const std::size_t count : columnsOf(counts)) text += "\t" + std::to_string(count);
    return text + "\t" + last + "\n";
}

}  // namespace

bool LayoutFindings::hasTrouble() const {
    return cli::hasTrouble(counts);
}

LayoutFindings findingsOf(const picture::Picture& picture) {
    LayoutFindings findings;
    std::vector<picture::Finding> found;
    findings.counts = picture::judge(picture, nullptr, &found);
    for (const picture::Finding& finding : found) {
        if (finding.kind != FindingKind::crossing) findings.pairs.push_back(pairOf(picture, finding));
    }
    findings.severalBoxes = severalBoxesOf(picture);
    return findings;
}

std::string findingsText(const LayoutFindings& findings, double boxWidth, double boxHeight) {
    std::string text;
    for (const KindName& name : kKindNames) {
        for (const LayoutFindings::Pair& pair : findings.pairs) {
            if (pair.kind != name.kind) continue;
            text += std::string(name.inList) + "\t" + std::to_string(pair.one) + "\t" +
                    std::to_string(pair.other) + "\n";
        }
    }
    for (const auto& [id, boxes] : findings.severalBoxes) {
        text += "several boxes\t" + std::to_string(id) + "\t" + std::to_string(boxes) + "\n";
    }
    const Judgement& counts = findings.counts;
    return text + counted(counts.boxes, "box", "boxes") + " of " + std::to_string(std::lround(boxWidth)) +
           " by " + std::to_string(std::lround(boxHeight)) + ", " + std::to_string(counts.overlaps) +
           " overlapping, " + counted(counts.hits, "line", "lines") + " through boxes, " +
           std::to_string(counts.tracks) + " pairs of families on one track, " +
           counted(counts.touches, "line", "lines") + " ending on lines of others, " +
           counted(counts.unjoined, "person", "persons") + " whom no line reaches, " +
           counted(counts.crossings, "crossing", "crossings") + ", " +
           counted(counts.repeats, "person", "persons") + " in several boxes\n";
}

std::string findingsHeading() {
    return "focus\tboxes\toverlaps\tlines through boxes\tfamilies on one track\tlines ending on others\t"
           "not reached\tcrossings\tpersons in several boxes\tids\n";
}

std::string findingsLine(const std::string& focus, const LayoutFindings& findings) {
    return lineOf(focus, findings.counts, idsOf(findings));
}

std::string findingsTotal(const Judgement& totals, std::size_t troubled) {
    return lineOf("total", totals, counted(troubled, "layout", "layouts") + " with trouble");
}

void addCounts(const Judgement& counts, Judgement& totals) {
    totals.boxes += counts.boxes;
    totals.overlaps += counts.overlaps;
    totals.hits += counts.hits;
    totals.tracks += counts.tracks;
    totals.touches += counts.touches;
    totals.unjoined += counts.unjoined;
    totals.crossings += counts.crossings;
    totals.repeats += counts.repeats;
}

}  // namespace olvane::cli
