// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What is found in an open file.

#include "FileInternal.h"

#include <chrono>

#include <olvane/kin/KinJson.h>
#include <olvane/kin/Lives.h>
#include <olvane/source/GedcomKin.h>
#include <olvane/source/GedcomLives.h>

namespace gedcom = olvane::gedcom;
namespace kin = olvane::kin;

const kin::KinGraph& olvane_file::graph() const {
    const std::lock_guard<std::mutex> lock(guard_);
    if (!graph_) graph_ = gedcom::kinGraphOf(data);
    return *graph_;
}

std::string olvane_file::kinship(std::int64_t a, std::int64_t b) const {
    const kin::KinGraph& everybody = graph();
    const std::lock_guard<std::mutex> lock(guard_);
    if (!kinships_) kinships_ = std::make_unique<kin::KinshipFinder>(everybody);
    const kin::Kinship found = kinships_->between(everybody.placeOf(a), everybody.placeOf(b));
    return kin::kinshipJson(everybody, found);
}

std::vector<gedcom::PersonId> olvane_file::meant(const std::string& who) const {
    const std::lock_guard<std::mutex> lock(guard_);
    if (!finder_) finder_ = std::make_unique<gedcom::PersonFinder>(data);
    return finder_->meant(who);
}

std::vector<bool> olvane_file::living(int year) const {
    const auto today = std::chrono::floor<std::chrono::days>(std::chrono::system_clock::now());
    const int present = static_cast<int>(std::chrono::year_month_day(today).year());
    const kin::KinGraph& everybody = graph();
    return kin::livingPersons(everybody, gedcom::livesOf(data, everybody), year != 0 ? year : present);
}
