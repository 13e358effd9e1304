// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Random families. Numbers are drawn without the standard library's distributions, which differ between
// libraries.

#include <support/FamilyMaker.h>

#include <cstddef>
#include <utility>

namespace support {

FamilyMaker::FamilyMaker(std::uint64_t seed, int persons) : random_(seed), persons_(persons) {}

CaseFile FamilyMaker::consistent() {
    for (int i = 1; i <= persons_; ++i) addPerson(i);
    family_.focus = pickAmong(persons_);
    return family_;
}

CaseFile FamilyMaker::contradictory(double share) {
    for (PersonId id = 1; id <= persons_; ++id) {
        if (chance(share)) family_.fathers[id] = pickId();
        if (chance(share)) family_.mothers[id] = pickId();
        if (chance(share)) family_.spouses[id] = pickList(3);
        if (chance(share)) family_.children[id] = pickList(4);
        if (chance(share)) family_.sexes[id] = static_cast<std::int32_t>(pickAmong(3)) - 1;
        if (chance(share)) family_.births[id] = pickDate();
    }
    family_.focus = 1;
    return family_;
}

CaseFile FamilyMaker::both() {
    consistent();
    const PersonId focus = family_.focus;
    contradictory(0.1);
    family_.focus = focus;
    return family_;
}

CaseFile FamilyMaker::any() {
    switch (pickAmong(3)) {
        case 1:
            return consistent();
        case 2:
            return contradictory(0.35);
        default:
            return both();
    }
}

void FamilyMaker::strewOddIds() {
    oddIds_ = {PersonId{4294967296} + 2, -1, -7, 0, PersonId{99999999999}, support::kNotFound - 1};
}

void FamilyMaker::setRequest(CaseFile& request) {
    if (chance(0.4)) {
        request.view = support::CaseView::pedigree;
        request.maxGenerations = static_cast<std::int32_t>(pickAmong(6)) - 1;
        request.maxStackDepth = static_cast<std::int32_t>(pickAmong(6)) - 1;
    }
    if (chance(0.25)) request.adapter = support::CaseAdapter::bare;
    if (chance(0.4)) setOptions(request);
    if (chance(0.4)) setSize(request);
}

void FamilyMaker::addPerson(PersonId id) {
    family_.sexes[id] = chance(0.5) ? 0 : 1;
    if (chance(0.5)) family_.births[id] = pickDate();
    if (chance(0.3)) family_.dates[id] = pickDate();
    if (chance(0.3)) family_.dead[id] = true;
    if (id > 2 && chance(0.8)) giveParents(id);
}

void FamilyMaker::giveParents(PersonId child) {
    PersonId father = pickAmong(child - 1);
    PersonId mother = pickAmong(child - 1);
    if (family_.sexes[father] != 0) std::swap(father, mother);
    if (chance(0.9)) {
        family_.fathers[child] = father;
        family_.children[father].push_back(child);
    }
    if (father != mother && chance(0.9)) {
        family_.mothers[child] = mother;
        family_.children[mother].push_back(child);
    }
    if (father != mother && chance(0.85)) marry(father, mother);
}

void FamilyMaker::marry(PersonId a, PersonId b) {
    for (const PersonId spouse : family_.spouses[a]) {
        if (spouse == b) return;
    }
    family_.spouses[a].push_back(b);
    family_.spouses[b].push_back(a);
    if (chance(0.3)) family_.preferredSpouses[a] = b;
}

void FamilyMaker::setOptions(CaseFile& request) {
    for (const char* name :
         {"AuntsUncles", "Cousins", "Siblings", "SiblingSpouses", "NeicesNephews", "Grandchildren",
          "GreatGrandparents", "SpousesOfChildren", "GreatGreatGrandparents"}) {
        if (chance(0.5)) request.options[std::string("ACTV_Fam_Show") + name] = chance(0.5);
    }
}

void FamilyMaker::setSize(CaseFile& request) {
    for (float* size : {&request.size.nodeWidth, &request.size.nodeHeight, &request.size.horzPadding,
                        &request.size.vertPadding, &request.size.spouseLineStep, &request.size.lineInset}) {
        *size = pickSize();
    }
}

float FamilyMaker::pickSize() {
    switch (pickAmong(6)) {
        case 1:
            return 0.0f;
        case 2:
            return 0.1f * static_cast<float>(pickAmong(1000));
        case 3:
            return -0.3f * static_cast<float>(pickAmong(100));
        case 4:
            return 1.0e9f * static_cast<float>(pickAmong(7));
        default:
            return static_cast<float>(pickAmong(120));
    }
}

std::string FamilyMaker::pickDate() {
    static const std::vector<std::string> kDates = {"1850", "1851", "2", "", "é", "Ж", "\xff", "\xe2\x82"};
    return kDates[static_cast<std::size_t>(pickAmong(static_cast<PersonId>(kDates.size()))) - 1];
}

std::vector<PersonId> FamilyMaker::pickList(int most) {
    std::vector<PersonId> list;
    for (PersonId n = pickAmong(most + 1) - 1; n > 0; --n) list.push_back(pickId());
    return list;
}

PersonId FamilyMaker::pickId() {
    if (!oddIds_.empty() && chance(0.1)) {
        return oddIds_[static_cast<std::size_t>(pickAmong(static_cast<PersonId>(oddIds_.size()))) - 1];
    }
    return pickAmong(persons_);
}

PersonId FamilyMaker::pickAmong(PersonId most) {
    return static_cast<PersonId>(random_() % static_cast<std::uint64_t>(most)) + 1;
}

bool FamilyMaker::chance(double share) {
    return static_cast<double>(random_() >> 11) * 0x1.0p-53 < share;
}

}  // namespace support
