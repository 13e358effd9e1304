// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A family handed over as a table is laid out as one whose data source is asked, byte for byte, in both views.

#include <gtest/gtest.h>
#include <rapidcheck/gtest.h>

#include <support/CaseRun.h>

#include <olvane/boundary/FamilyViewLayout.h>
#include <olvane/kin/Family.h>
#include <olvane/kin/FamilyDataSource.h>
#include <olvane/pedigree/TreeViewPedigreeLayouter.h>

#include <algorithm>
#include <memory>
#include <set>
#include <string>
#include <string_view>
#include <vector>

#include "RandomFamily.h"

namespace {

using support::CaseFile;
using support::PersonId;

constexpr int kMostPersons = 24;
constexpr int kGenerations = 5;

// Everybody whom a case names, with or without answers of their own.
std::set<PersonId> everybodyIn(const CaseFile& request) {
    std::set<PersonId> persons = support::personsOf(request);
    persons.insert(request.focus);
    for (const auto* parents : {&request.fathers, &request.mothers}) {
        for (const auto& [child, parent] : *parents) persons.insert({child, parent});
    }
    for (const auto* lists : {&request.spouses, &request.children}) {
        for (const auto& [person, list] : *lists) persons.insert(list.begin(), list.end());
    }
    persons.erase(support::kNotFound);
    return persons;
}

// A table holds each person once in a list, a preferred spouse who is in the list, and dates in UTF-8.
void leaveOutWhatIsRefused(CaseFile& request) {
    for (auto* dates : {&request.births, &request.dates}) {
        for (auto& [person, date] : *dates) {
            const bool isPlain = std::all_of(date.begin(), date.end(), [](char c) { return c > 0; });
            if (!isPlain) date = date.size() % 2 == 0 ? "\u00e9" : "\u20ac17";
        }
    }
    for (auto* lists : {&request.spouses, &request.children}) {
        for (auto& [person, list] : *lists) {
            std::set<PersonId> seen;
            std::erase_if(list, [&seen](PersonId id) { return !seen.insert(id).second; });
        }
    }
    std::erase_if(request.preferredSpouses, [&request](const auto& entry) {
        const auto& list = request.spouses[entry.first];
        return std::find(list.begin(), list.end(), entry.second) == list.end();
    });
}

template <class Map, class Value>
Value answerOf(const Map& map, PersonId person, Value otherwise) {
    const auto found = map.find(person);
    return found == map.end() ? otherwise : static_cast<Value>(found->second);
}

std::string_view textOf(const std::map<PersonId, std::string>& map, PersonId person) {
    const auto found = map.find(person);
    return found == map.end() ? std::string_view() : std::string_view(found->second);
}

struct Columns {
    std::vector<std::int64_t> ids, fathers, mothers, sexes, dead;
    std::vector<std::string_view> births, deaths;
    std::vector<std::int64_t> married, spouses, preferred, parents, children;

    explicit Columns(const CaseFile& request) {
        for (const PersonId id : everybodyIn(request)) {
            ids.push_back(id);
            fathers.push_back(answerOf(request.fathers, id, support::kNotFound));
            mothers.push_back(answerOf(request.mothers, id, support::kNotFound));
            sexes.push_back(answerOf(request.sexes, id, 0) == 0 ? 0 : 1);
            dead.push_back(answerOf(request.dead, id, false) ? 1 : 0);
            births.push_back(textOf(request.births, id));
            deaths.push_back(textOf(request.dates, id));
        }
        for (const auto& [person, list] : request.spouses) {
            for (const PersonId spouse : list) {
                married.push_back(person);
                spouses.push_back(spouse);
                preferred.push_back(answerOf(request.preferredSpouses, person, PersonId{0}) == spouse ? 1
                                                                                                      : 0);
            }
        }
        for (const auto& [person, list] : request.children) {
            for (const PersonId child : list) {
                parents.push_back(person);
                children.push_back(child);
            }
        }
    }

    olvane::Family family() const {
        olvane::FamilyColumns columns;
        columns.persons.id = std::span(ids);
        columns.persons.father = std::span(fathers);
        columns.persons.mother = std::span(mothers);
        columns.persons.sex = std::span(sexes);
        columns.persons.dead = std::span(dead);
        columns.persons.birth = std::span(births);
        columns.persons.death = std::span(deaths);
        columns.spouses.person = std::span(married);
        columns.spouses.spouse = std::span(spouses);
        columns.spouses.preferred = std::span(preferred);
        columns.children.parent = std::span(parents);
        columns.children.child = std::span(children);
        return olvane::Family(columns);
    }
};

// The same family, one edit after the other.
olvane::Family familyByEdits(const CaseFile& request) {
    olvane::Family family;
    for (const PersonId id : everybodyIn(request)) family.addPerson({.id = id});
    const Columns columns(request);
    for (std::size_t i = 0; i < columns.ids.size(); ++i) {
        family.setPerson({.id = columns.ids[i],
                          .father = columns.fathers[i],
                          .mother = columns.mothers[i],
                          .sex = static_cast<olvane::kin::Sex>(columns.sexes[i]),
                          .dead = columns.dead[i] != 0,
                          .birth = columns.births[i],
                          .death = columns.deaths[i]});
    }
    for (const PersonId id : columns.ids) {
        const auto spouses = request.spouses.find(id);
        if (spouses != request.spouses.end()) {
            family.setSpouses(id, spouses->second, answerOf(request.preferredSpouses, id, PersonId{0}));
        }
        const auto children = request.children.find(id);
        family.setChildren(id,
                           children == request.children.end() ? std::vector<PersonId>() : children->second);
    }
    return family;
}

std::string pedigreeText(PersonId focus, const std::shared_ptr<OlvaneViewerManagerWrapProtocol>& manager) {
    ViewerGlue glue;
    const olvane::HostCallbacks callbacks(glue, manager);
    std::string text;
    olvane::resetAddParentId();
    olvane::guarded([&] {
        DataAdapter adapter = callbacks.dataAdapter();
        const int key = glue.getKeyFromPerson(std::to_string(focus));
        SharedTreeViewer::TreeViewPedigreeLayouter layouter(&adapter, key, adapter.isMale(key) ? 1 : 0,
                                                            SharedTreeViewer::OptionMap(),
                                                            olvane::familyTreeSize(), kGenerations, 4);
        layouter.layoutForFocusNID();
        olvane::ResultBounds bounds;
        layouter.graphIterator(olvane::resultWriter(glue, bounds, text));
    });
    return text;
}

void expectSameTexts(const CaseFile& request, const olvane::Family& family) {
    const auto host = std::make_shared<support::CaseManager>(request);
    const auto table = std::make_shared<olvane::FamilyDataSource>(family);
    const std::string focus = std::to_string(request.focus);
    RC_ASSERT(FamilyViewLayout(focus, table) == FamilyViewLayout(focus, host));
    RC_ASSERT(pedigreeText(request.focus, table) == pedigreeText(request.focus, host));
}

RC_GTEST_PROP(FamilyTable, isLaidOutAsTheDataSourceOfTheSameAnswers, ()) {
    CaseFile request = *property::anyFamily(kMostPersons);
    leaveOutWhatIsRefused(request);
    RC_LOG(support::formatCase(request));
    expectSameTexts(request, Columns(request).family());
}

RC_GTEST_PROP(FamilyTable, madeByEditsIsLaidOutAsTheDataSourceOfTheSameAnswers, ()) {
    CaseFile request = *property::anyFamily(kMostPersons);
    leaveOutWhatIsRefused(request);
    RC_LOG(support::formatCase(request));
    expectSameTexts(request, familyByEdits(request));
}

}  // namespace
