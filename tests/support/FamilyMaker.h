// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <random>
#include <string>
#include <vector>

#include <support/CaseFile.h>

namespace support {

// Makes up a family and a request for it, the same for the same seed on every machine: a family is grown from
// two founders, each further person getting parents among those before it, and contradictions are strewn over
// it.
//
// Fails: persons below 1 is a breach of the contract.
class FamilyMaker {
public:
    FamilyMaker(std::uint64_t seed, int persons);

    CaseFile consistent();                 // everybody agrees with everybody
    CaseFile contradictory(double share);  // each answer is made up again with that probability
    CaseFile both();                       // a consistent family with a tenth of its answers made up
    CaseFile any();                        // one of the three

    // Ids that are huge or below 1 may stand in what is made up from here on.
    void strewOddIds();

    // Gives a request options, sizes of every kind, the bare adapter or the pedigree view, or leaves it
    // alone.
    void setRequest(CaseFile& request);

private:
    void addPerson(PersonId id);
    void giveParents(PersonId child);
    void marry(PersonId a, PersonId b);
    void setOptions(CaseFile& request);
    void setSize(CaseFile& request);
    float pickSize();
    std::string pickDate();
    std::vector<PersonId> pickList(int most);
    PersonId pickId();
    PersonId pickAmong(PersonId most);  // 1 to most
    bool chance(double share);

    std::mt19937_64 random_;
    int persons_;
    std::vector<PersonId> oddIds_;
    CaseFile family_;
};

}  // namespace support
