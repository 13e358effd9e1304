// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <map>
#include <set>
#include <string>
#include <vector>

#include <support/CaseFile.h>
#include <support/plain/PlainData.h>
#include <support/plain/PlainPerson.h>

namespace plain {

// What both views share: the focus, the rules that admit relatives to the chart, and the climb over the
// ancestors that flags those with another spouse.
//
// Units: points; x grows right, y grows down.
class Layouter {
public:
    Layouter(Data& source, const support::CaseFile& request, int focusKey, bool focusIsMale);
    virtual ~Layouter() = default;
    Layouter(const Layouter&) = delete;
    Layouter& operator=(const Layouter&) = delete;

    virtual void layOut() = 0;

    // Each person of the finished chart, in the order of the result.
    void walk(const Visit& visit);

protected:
    virtual void walkFrom(Person& person, const Visit& visit) = 0;

    bool option(const std::string& key) const;  // true where the request is silent

    void addSpouses(Person& person);
    void addParents(Person& person);
    void addAllChildren(Person& person);
    void addChildrenWithoutOther(Person& person, const Walk& others);
    void addSiblings(Person& person);

    bool hasParents(Person& person);
    bool isPreferredParent(Person& person, int childKey, int otherKey);
    const std::set<ChildRecord>& childRecords(Person& person);  // asks the host once a node
    void readHostSpouses(Person& person);                       // asks the host once a node

    void climb(int depth, int maxDepth, Person& person, std::vector<Person*>& climbed);
    void flagWherePartnerHasOther(Person& partner, const Person& other);
    void flagTopOfTree();
    void flagChildrenWithFamilies(Person& person);

    Data& data;
    support::CaseFile request;
    support::CaseSize size;
    Person focus;
    std::map<int, bool> shown;  // keys of admitted spouses and children

private:
    void addChildrenWithSpouse(Person& person, Person& spouse, const std::set<ChildRecord>& records);
    std::set<ChildRecord> childrenWithoutOther(Person& person, const Walk& others);
    void addFathersSide(Person& person, Person& father);
    void addFullSiblings(Person& person, Person& father, Person& mother);
    void addMothersSide(Person& person, Person& mother);
    void addHalfSibling(Person& person, int key, int parentKey, bool male);
};

}  // namespace plain
