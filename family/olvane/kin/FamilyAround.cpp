// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Walks from the focus, generation by generation, with what is left of the reach. Somebody who is met again with more
// of it left is walked on from once more, but not asked about again.

#include <olvane/kin/FamilyAround.h>

#include <algorithm>
#include <deque>
#include <stdexcept>
#include <string>
#include <unordered_map>
#include <vector>

#include <olvane/kin/FamilyChecksInternal.h>

namespace olvane {

namespace {

using detail::RowPlace;

// What a host answered about one person, and how far the walk goes on from there.
struct Met {
    FamilyId id = 0;
    FamilyId father = 0;
    FamilyId mother = 0;
    std::vector<FamilyId> spouses;
    std::vector<FamilyId> children;
    bool knowsParents = false;
    bool knowsChildren = false;
    int up = -1;
    int down = -1;
};

class WalkAround {
public:
    WalkAround(OlvaneViewerManagerWrapProtocol& host, const ReachAround& reach)
        : host_(host), reach_(reach) {}

    Family from(std::int64_t focus) {
        const RowPlace place{FamilyTable::persons, FamilyError::kNoRow, focus};
        meet(detail::checkedId(place, "id", focus), reach_.up, reach_.down);
        while (!waiting_.empty()) {
            const std::size_t next = waiting_.front();
            waiting_.pop_front();
            walkFrom(next);
        }
        askForSpouses();
        return table();
    }

private:
    void meet(FamilyId id, int up, int down) {
        const auto [entry, isNew] = places_.try_emplace(id, met_.size());
        if (isNew) {
            if (met_.size() >= reach_.mostPersons) {
                throw std::length_error("more than " + std::to_string(reach_.mostPersons) +
                                        " persons are in reach");
            }
            met_.emplace_back();
            met_.back().id = id;
        }
        Met& person = met_[entry->second];
        if (up <= person.up && down <= person.down) return;
        person.up = std::max(person.up, up);
        person.down = std::max(person.down, down);
        waiting_.push_back(entry->second);
    }

    void walkFrom(std::size_t at) {
        if (reach_.everybody) return walkEverywhere(at);
        const int up = met_[at].up;
        const int down = met_[at].down;
        if (up > 0) {
            askForParents(met_[at]);
            for (const FamilyId parent : {met_[at].father, met_[at].mother}) {
                if (parent != 0) meet(parent, up - 1, reach_.downBeside);
            }
        }
        if (down > 0) {
            askForChildren(met_[at]);
            const std::vector<FamilyId> children = met_[at].children;
            for (const FamilyId child : children) meet(child, 0, down - 1);
        }
    }

    void walkEverywhere(std::size_t at) {
        askForParents(met_[at]);
        askForChildren(met_[at]);
        askForSpousesOf(met_[at]);
        std::vector<FamilyId> relatives{met_[at].father, met_[at].mother};
        relatives.insert(relatives.end(), met_[at].spouses.begin(), met_[at].spouses.end());
        relatives.insert(relatives.end(), met_[at].children.begin(), met_[at].children.end());
        for (const FamilyId relative : relatives) {
            if (relative != 0) meet(relative, 0, 0);
        }
    }

    static FamilyId answered(const Met& person, std::string_view field, std::int64_t answer) {
        return detail::checkedId({FamilyTable::persons, FamilyError::kNoRow, person.id}, field, answer);
    }
    static FamilyId answeredParent(const Met& person, std::string_view field, std::int64_t answer) {
        return detail::checkedIdOrNobody({FamilyTable::persons, FamilyError::kNoRow, person.id}, field,
                                         answer);
    }
    static std::vector<FamilyId> answeredList(const Met& person, std::string_view field,
                                              const std::vector<std::int64_t>& answers) {
        std::vector<FamilyId> list;
        list.reserve(answers.size());
        for (const std::int64_t answer : answers) list.push_back(answered(person, field, answer));
        std::vector<std::size_t> repeats;
        detail::findRepeats(list, repeats);
        for (auto at = repeats.rbegin(); at != repeats.rend(); ++at) {
            list.erase(list.begin() + static_cast<std::ptrdiff_t>(*at));
        }
        return list;
    }

    void askForParents(Met& person) {
        if (person.knowsParents) return;
        person.father = answeredParent(person, "father", host_.fatherForPersonWithID(person.id));
        person.mother = answeredParent(person, "mother", host_.motherForPersonWithID(person.id));
        person.knowsParents = true;
    }
    void askForChildren(Met& person) {
        if (person.knowsChildren) return;
        person.children = answeredList(person, "children", host_.childrenForPersonWithID(person.id));
        person.knowsChildren = true;
    }

    void askForSpousesOf(Met& person) {
        person.spouses = answeredList(person, "spouses", host_.spousesForPersonWithID(person.id));
    }

    // Spouses come last: theirs are not asked for, however they were reached.
    void askForSpouses() {
        if (reach_.everybody) return;
        const std::size_t walked = met_.size();
        for (std::size_t at = 0; reach_.spouses && at < walked; ++at) {
            askForSpousesOf(met_[at]);
            const std::vector<FamilyId> spouses = met_[at].spouses;
            for (const FamilyId spouse : spouses) meet(spouse, 0, 0);
        }
        waiting_.clear();
        // A child of somebody in reach says who its other parent is; its parents are there, or unknown.
        for (std::size_t at = 0; at < walked; ++at) askForParents(met_[at]);
    }

    bool isMet(FamilyId id) const { return places_.count(id) != 0; }

    Family table() {
        Family family;
        for (const Met& person : met_) addPerson(family, person);
        for (const Met& person : met_) setParents(family, person);
        for (const Met& person : met_) setLists(family, person);
        return family;
    }

    void addPerson(Family& family, const Met& person) {
        const std::int32_t sex = host_.sexOfPersonWithID(person.id);
        PersonRow row;
        row.id = person.id;
        row.sex = sex == 0 ? kin::Sex::male : sex == 1 ? kin::Sex::female : kin::Sex::unknown;
        row.dead = host_.isPersonDead(person.id);
        const std::string birth = host_.dateForPersonWithID(person.id, true);
        const std::string death = host_.dateForPersonWithID(person.id, false);
        row.birth = birth;
        row.death = death;
        family.addPerson(row);
    }

    void setParents(Family& family, const Met& person) {
        PersonRow row = family.person(person.id);
        row.father = isMet(person.father) ? person.father : 0;
        row.mother = isMet(person.mother) ? person.mother : 0;
        if (row.father != 0 || row.mother != 0) family.setPerson(row);
    }

    void setLists(Family& family, const Met& person) {
        std::vector<std::int64_t> spouses(person.spouses.begin(), person.spouses.end());
        std::int64_t preferred = 0;
        for (const std::int64_t spouse : spouses) {
            if (preferred == 0 && host_.isPreferredSpouse(person.id, spouse)) preferred = spouse;
        }
        if (!spouses.empty()) family.setSpouses(person.id, spouses, preferred);
        if (!person.knowsChildren) return;
        const std::vector<std::int64_t> children(person.children.begin(), person.children.end());
        family.setChildren(person.id, children);
    }

    OlvaneViewerManagerWrapProtocol& host_;
    const ReachAround& reach_;
    std::vector<Met> met_;
    std::unordered_map<FamilyId, std::size_t> places_;
    std::deque<std::size_t> waiting_;
};

}  // namespace

Family familyAround(OlvaneViewerManagerWrapProtocol& host, std::int64_t focus, const ReachAround& reach) {
    return WalkAround(host, reach).from(focus);
}

}  // namespace olvane
