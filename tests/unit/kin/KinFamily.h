// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <initializer_list>
#include <map>
#include <string>

#include <olvane/kin/KinGraph.h>

// Families in a small text form, one a line: "Adam + Eva: Seth.m Sara.f". Signs between the two: "+" married, "~" not
// married, "|" divorced; "?" is an unknown partner. A sex stands behind a dot: m, f or x; the first partner is male
// and the second female unless said. How a child came to the family stands in brackets: "Finn(adopted)".
class KinFamily {
public:
    KinFamily(std::initializer_list<const char*> lines);

    const olvane::kin::KinGraph& graph() const { return graph_; }
    // Fails: std::out_of_range for a name that is not there.
    olvane::kin::Place operator[](const std::string& name) const { return places_.at(name); }

private:
    std::map<std::string, olvane::kin::Place> places_;
    olvane::kin::KinGraph graph_;
};
