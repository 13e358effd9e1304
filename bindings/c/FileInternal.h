// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <cstdint>
#include <memory>
#include <mutex>
#include <optional>
#include <string>
#include <vector>

#include <olvane/gedcom/GedcomData.h>
#include <olvane/kin/KinGraph.h>
#include <olvane/kin/Kinship.h>
#include <olvane/source/PersonFinder.h>

// The opaque file. What is made at the first need is made once, by whichever thread comes first.
struct olvane_file {
    explicit olvane_file(olvane::gedcom::GedcomData read) : data(std::move(read)) {}

    const olvane::kin::KinGraph& graph() const;
    // The kinship of two persons as one line of JSON.
    std::string kinship(std::int64_t a, std::int64_t b) const;
    std::vector<olvane::gedcom::PersonId> meant(const std::string& who) const;

    bool has(std::int64_t person) const {
        return person >= 1 && person <= static_cast<std::int64_t>(data.personCount());
    }

    // Who may be living in a year, 0 for the present one: an entry for each person.
    std::vector<bool> living(int year) const;

    const olvane::gedcom::GedcomData data;

private:
    mutable std::mutex guard_;
    mutable std::optional<olvane::kin::KinGraph> graph_;
    mutable std::unique_ptr<olvane::kin::KinshipFinder> kinships_;
    mutable std::unique_ptr<olvane::gedcom::PersonFinder> finder_;
};

namespace olvane::c {

constexpr std::size_t kMostRelatives = 5000000;  // a thousand times what charts of real families ask for

// The years that a caller may state for living persons, 0 for the present one.
constexpr std::int32_t kLastYear = 9999;

}  // namespace olvane::c
