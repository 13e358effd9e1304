// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/kin/AncestryInternal.h>

#include <algorithm>

namespace olvane::kin {

Ancestry::Ancestry(const KinLinks& links)
    : links_(links), stamps_(at(links.nodeCount()), 0), spots_(at(links.nodeCount()), kNowhere) {}

void Ancestry::gather(Place a, Place b, Links which) {
    which_ = which;
    if (++stamp_ == 0) {
        std::fill(stamps_.begin(), stamps_.end(), 0);
        stamp_ = 1;
    }
    found_.clear();
    reach(a);
    reach(b);
    reachAll();
    putInOrder();
    hasLoop_ = nodes_.size() < found_.size();
    if (hasLoop_) return;
    spotOfA_ = spots_[at(a)];
    spotOfB_ = spots_[at(b)];
    addLinks();
    findCommon();
}

void Ancestry::reach(Node node) {
    if (stamps_[at(node)] == stamp_) return;
    stamps_[at(node)] = stamp_;
    spots_[at(node)] = static_cast<Spot>(found_.size());
    found_.push_back(node);
}

void Ancestry::reachAll() {
    for (std::size_t next = 0; next < found_.size(); ++next) {
        for (const UpLink& link : linksUp(found_[next])) reach(link.to);
    }
}

// A person all of whose children are placed comes next. In a loop nobody ever is.
void Ancestry::putInOrder() {
    waitsFor_.assign(found_.size(), 0);
    for (const Node node : found_) {
        for (const UpLink& link : linksUp(node)) ++waitsFor_[at(spots_[at(link.to)])];
    }
    nodes_.clear();
    for (const Node node : found_) {
        if (waitsFor_[at(spots_[at(node)])] == 0) nodes_.push_back(node);
    }
    for (std::size_t next = 0; next < nodes_.size(); ++next) {
        for (const UpLink& link : linksUp(nodes_[next])) {
            if (--waitsFor_[at(spots_[at(link.to)])] == 0) nodes_.push_back(link.to);
        }
    }
    for (std::size_t i = 0; i < nodes_.size(); ++i) spots_[at(nodes_[i])] = static_cast<Spot>(i);
}

void Ancestry::addLinks() {
    upStart_.clear();
    up_.clear();
    hasOtherBonds_ = false;
    for (const Node node : nodes_) {
        upStart_.push_back(static_cast<std::uint32_t>(up_.size()));
        const auto length = static_cast<std::int8_t>(links_.isCouple(node) ? 0 : 1);
        for (const UpLink& link : linksUp(node)) {
            up_.push_back({spots_[at(link.to)], link.bond, length});
            hasOtherBonds_ = hasOtherBonds_ || link.bond != Bond::blood;
        }
    }
    upStart_.push_back(static_cast<std::uint32_t>(up_.size()));
}

void Ancestry::findCommon() {
    sides_.assign(nodes_.size(), 0);
    relevant_.assign(nodes_.size(), 0);
    common_.clear();
    sides_[at(spotOfA_)] |= 1U;
    sides_[at(spotOfB_)] |= 2U;
    for (Spot spot = 0; spot < size(); ++spot) {
        if (isCommon(spot)) common_.push_back(spot);
        for (const SpotLink& link : up(spot)) sides_[at(link.to)] |= sides_[at(spot)];
    }
    for (Spot spot = size(); spot-- > 0;) {
        const auto links = up(spot);
        const bool leadsOn = std::any_of(links.begin(), links.end(),
                                         [this](const SpotLink& link) { return isRelevant(link.to); });
        relevant_[at(spot)] = isCommon(spot) || leadsOn ? 1 : 0;
    }
}

}  // namespace olvane::kin
