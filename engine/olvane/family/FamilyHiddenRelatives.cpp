// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The flag of each person: the data source knows a relative who stands nowhere on the chart. The passes over
// ancestors, siblings, children and spouses come first, each overwriting what it finds; then a final pass
// compares every real person with the whole display and has the last word.
//
// All of them stay although the final pass replaces most answers: they fill what the nodes keep of the data
// source's answers, they use up negative ids in a fixed order, and they alone decide about unknown parents.

#include <olvane/family/TreeViewFamilyLayouter.h>
#include <olvane/graph/PersonWalksInternal.h>
#include <olvane/layouter/HiddenRelativesInternal.h>

#include <algorithm>
#include <utility>

namespace SharedTreeViewer {

void TreeViewFamilyLayouter::flagNonDisplayedRelationships(TreeViewPerson& focus) {
    flagGreatGrandparentsWithParents(*this, focus);
    flagSiblings(focus);
    traverseTreeForStacking(0, focus);
    flagChildren(focus);
    clearVisitedMarks();
    flagNonDisplayedRelationshipsForSpouses(focus, false);
    collectShownPersons();
    flagAgainstWholeDisplay();
    everybody = std::move(stackedPersons);
    stackedPersons.clear();
    shownKeys.clear();
}

void TreeViewFamilyLayouter::flagSiblings(TreeViewPerson& focus) {
    for (TreeViewPerson& sibling : focus.siblings) {
        if (sibling.allChildrenLoaded) flagNonDisplayedRelationshipsForSpouses(sibling, true);
        if (!sibling.hasNonDisplayedRelationships && hasParents(sibling)) {
            sibling.hasNonDisplayedRelationships = siblingHasAnotherParent(sibling, focus);
        }
        checkPersonsChildren(sibling);
    }
}

bool TreeViewFamilyLayouter::siblingHasAnotherParent(TreeViewPerson& sibling, TreeViewPerson& focus) {
    const ParentKeys parents = parentKeysOf(*this, sibling);
    if (!dataAdapter->isAddNode(parents.father) && focus.preferredFatherIndex != -1 &&
        focus.getPreferredFather().personId != parents.father) {
        return true;
    }
    if (dataAdapter->isAddNode(parents.mother) || focus.preferredMotherIndex == -1) return false;
    return focus.getPreferredMother().personId != parents.mother;
}

void TreeViewFamilyLayouter::flagChildren(TreeViewPerson& focus) {
    visitAllChildren(focus, true, [&](TreeViewPerson& child) {
        checkChildForUnshownParents(focus, child);
        flagNonDisplayedRelationshipsForSpouses(child, true);
        checkPersonsChildren(child);
    });
}

void TreeViewFamilyLayouter::clearVisitedMarks() {
    for (TreeViewPerson* person : stackedPersons) person->setHasBeenVisited(false);
    stackedPersons.clear();
}

void TreeViewFamilyLayouter::collectShownPersons() {
    stackedPersons = everyPerson();
    for (const TreeViewPerson* person : stackedPersons) shownKeys.insert(person->personId);
}

namespace {

// The whole display, and the data source to compare it with.
class WholeDisplay {
public:
    WholeDisplay(const DataAdapter& data, const KeySet& shownKeys, olvane::Arena& memory)
        : data_(data), shownKeys_(shownKeys), memory_(memory) {}

    void flag(TreeViewPerson& person) const {
        if (data_.isAddNode(person.personId)) return;
        const bool hiddenChildren = hasHiddenChildren(person);
        const bool hiddenSpouses = hasHiddenSpouses(person);
        const bool hiddenParent = hasHiddenParent(person);
        person.hasNonDisplayedRelationships = hiddenChildren || hiddenSpouses || hiddenParent;
    }

private:
    // A relative counts as shown if any node with its key stands anywhere on the display. Where as many are
    // drawn under the person as the data source knows, nobody is looked up.
    template <class Records>
    bool someAreHidden(const Records& records, int drawnUnderPerson) const {
        if (static_cast<int>(records.size()) == drawnUnderPerson) return false;
        return std::any_of(records.begin(), records.end(),
                           [&](const auto& record) { return !shownKeys_.contains(record.key); });
    }

    bool hasHiddenChildren(TreeViewPerson& person) const {
        const ChildrenSet& children = person.getAllChildrenVector(data_.getChildren);
        return !children.empty() && someAreHidden(children, countOfAllChildren(person));
    }

    bool hasHiddenSpouses(TreeViewPerson& person) const {
        SpouseSet spouses(&memory_);
        data_.getSpouses(person.personId, spouses);
        return someAreHidden(spouses, person.getSpouseCount());
    }

    bool hasHiddenParent(TreeViewPerson& person) const {
        int father =
            person.preferredFatherIndex == -1 ? TreeViewPerson::kNoKey : person.getPreferredFather().personId;
        int mother =
            person.preferredMotherIndex == -1 ? TreeViewPerson::kNoKey : person.getPreferredMother().personId;
        if (father == TreeViewPerson::kNoKey || mother == TreeViewPerson::kNoKey) {
            data_.getParents(person.personId, father, mother);
        }
        const bool fatherShown = isShownOrUnknown(father);
        const bool motherShown = isShownOrUnknown(mother);
        return !(fatherShown && motherShown);
    }

    bool isShownOrUnknown(int parentKey) const {
        return parentKey == TreeViewPerson::kNoKey || data_.isAddNode(parentKey) ||
               shownKeys_.contains(parentKey);
    }

    const DataAdapter& data_;
    const KeySet& shownKeys_;
    olvane::Arena& memory_;
};

}  // namespace

void TreeViewFamilyLayouter::flagAgainstWholeDisplay() {
    const WholeDisplay display(*dataAdapter, shownKeys, memory);
    for (TreeViewPerson* person : stackedPersons) display.flag(*person);
}

void TreeViewFamilyLayouter::flagNonDisplayedRelationshipsForSpouses(TreeViewPerson& person,
                                                                     bool checkChildren) {
    for (TreeViewPerson& spouse : person.spouses) {
        bool flag = spouseHasRelativesElsewhere(*this, spouse);
        if (checkChildren) {
            const ChildrenSet& children = spouse.getAllChildrenVector(dataAdapter->getChildren);
            if (!children.empty()) {
                int child = children.begin()->key;
                int other = spouse.personId;
                if (!checkIfPrefferedParent(person, child, other)) flag = true;
            }
        }
        spouse.hasNonDisplayedRelationships = flag;
    }
}

// The host's spouses of the parent are loaded where the couple is not on the chart. How many there are
// changes nothing; that they were asked for does.
void TreeViewFamilyLayouter::checkChildForUnshownParents(TreeViewPerson& parent, TreeViewPerson& child) {
    const ParentKeys parents = parentKeysOf(*this, child);
    bool unshown = !parentsAreAShownCouple(*this, parent, parents);
    if (unshown) {
        loadHostSpouses(*this, parent);
        if (dataAdapter->isAddNode(parents.father) || dataAdapter->isAddNode(parents.mother)) unshown = false;
    }
    child.hasNonDisplayedRelationships = unshown;
}

void TreeViewFamilyLayouter::checkPersonsChildren(TreeViewPerson& person) {
    flagChildrenWithFamilies(*this, person);
}

}  // namespace SharedTreeViewer
