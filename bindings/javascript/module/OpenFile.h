// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <optional>
#include <string>
#include <utility>

#include <olvane/gedcom/GedcomData.h>
#include <olvane/kin/KinGraph.h>
#include <olvane/source/GedcomDataSource.h>
#include <olvane/source/GedcomKin.h>

namespace olvane::js {

// A GEDCOM file in the module's memory, with what is made of it when somebody first asks.
struct OpenFile {
    explicit OpenFile(gedcom::GedcomData read) : data(std::move(read)), source(data) {}

    const kin::KinGraph& kin() {
        if (!graph) graph = gedcom::kinGraphOf(data);
        return *graph;
    }

    gedcom::GedcomData data;
    gedcom::GedcomDataSource source;
    std::optional<kin::KinGraph> graph;
};

// Two hundred times what charts of real families ask for; a browser takes some seconds and 300 MB for so many.
constexpr std::size_t kMostRelatives = 1000000;

// What the last call had to say: a table, facts, or why something was refused.
extern std::string lastText;

}  // namespace olvane::js
