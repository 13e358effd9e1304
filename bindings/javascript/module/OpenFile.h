// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <exception>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <utility>

#include <olvane/charts/ViewRequest.h>
#include <olvane/gedcom/GedcomData.h>
#include <olvane/kin/KinGraph.h>
#include <olvane/kin/Kinship.h>
#include <olvane/kin/PersonIndex.h>
#include <olvane/picture/Picture.h>
#include <olvane/source/GedcomDataSource.h>
#include <olvane/source/GedcomKin.h>
#include <olvane/source/GedcomSearchTexts.h>

namespace olvane::js {

// A chart of everybody whose places a later one may keep.
struct EarlierChart {
    picture::Picture picture;
    charts::Direction direction = charts::Direction::down;
    bool mirrored = false;
};

// A GEDCOM file in the module's memory, with what is made of it when somebody first asks.
struct OpenFile {
    explicit OpenFile(gedcom::GedcomData read) : data(std::move(read)), source(data), searchTexts(data) {}

    const kin::KinGraph& kin() {
        if (!graph) graph = gedcom::kinGraphOf(data);
        return *graph;
    }

    // With the parents first who were chosen; the last choice is kept.
    const kin::KinGraph& kin(const gedcom::ParentChoice& parents) {
        if (parents == gedcom::ParentChoice()) return kin();
        if (!chosenGraph || !(parents == chosenParents)) {
            chosenGraph = gedcom::kinGraphOf(data, parents);
            chosenParents = parents;
        }
        return *chosenGraph;
    }

    kin::KinshipFinder& kinship() {
        if (!kinshipFinder) kinshipFinder.emplace(kin());
        return *kinshipFinder;
    }

    // Of everybody.
    const kin::PersonIndex& index() {
        personIndex.add(searchTexts);
        return personIndex;
    }

    gedcom::GedcomData data;
    gedcom::GedcomDataSource source;
    gedcom::GedcomSearchTexts searchTexts;
    std::optional<kin::KinGraph> graph;
    std::optional<kin::KinGraph> chosenGraph;
    gedcom::ParentChoice chosenParents;
    std::optional<kin::KinshipFinder> kinshipFinder;
    kin::PersonIndex personIndex;  // of those who were added so far
    std::optional<EarlierChart> everybody;
};

// Two hundred times what charts of real families ask for; a browser takes some seconds and 300 MB for this many.
constexpr std::size_t kMostRelatives = 1000000;

// What the last call had to say: a table, facts, or why something was refused.
extern std::string lastText;

inline std::string linesOf(std::span<const std::string_view> names) {
    std::string lines;
    for (const std::string_view name : names) lines.append(lines.empty() ? "" : "\n").append(name);
    return lines;
}

// The text that make gives, which lives until the next one; or null with the reason in its place.
template <class Make>
const char* textOrRefusal(const Make& make) {
    try {
        lastText = make();
        return lastText.c_str();
    } catch (const std::exception& error) {
        lastText = error.what();
        return nullptr;
    }
}

}  // namespace olvane::js
