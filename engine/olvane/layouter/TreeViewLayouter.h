// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <boost/function.hpp>
#include <boost/make_shared.hpp>
#include <boost/unordered_map.hpp>

#include <string>
#include <utility>
#include <vector>

#include <olvane/Export.h>
#include <olvane/adapters/DataAdapter.h>
#include <olvane/detail/AdmittedKeys.h>
#include <olvane/detail/Arena.h>
#include <olvane/graph/TreeViewGenerationEdge.h>
#include <olvane/graph/TreeViewPerson.h>
#include <olvane/layouter/TreeSize.h>

namespace SharedTreeViewer {

class LineRecord;

typedef boost::unordered_map<std::string, bool> OptionMap;

// Called with each person on a line of descent: the person, whether it has neighbours to hang from, and a walk
// over those neighbours. With false the walk is empty and must not be called.
typedef boost::function<void(TreeViewPerson&, bool, const TreeViewPerson::Iterator&)> DirectLineVisitor;

// What the layouters of all views share: the focus person, from whom the whole graph hangs, the options, the
// sizes, the way to the data, the record of who has been admitted, the growth of the graph, and a few
// placements.
//
// Units: points. A bool that comes with a person is its gender, true for male.
// Holds: one layouter serves one layout. It points to the DataAdapter, which must outlive it.
// Fails: whatever a callback throws passes on; an empty callback throws boost::bad_function_call.
//
// No virtual destructor: a layouter is made and destroyed through its concrete type, by the code that runs it.
class OLVANE_API TreeViewLayouter {
protected:
    olvane::Arena memory;  // of the whole graph: declared ahead of the focus, so destroyed after it

public:
    typedef TreeViewPerson::Visitor Visitor;
    typedef TreeViewPerson::Iterator Iterator;

    // isMale: not 0 for a male focus.
    TreeViewLayouter(DataAdapter* data, int focusKey, int isMale, OptionMap optionValues,
                     const TreeSize& sizes);
    TreeViewLayouter(const TreeViewLayouter&) = delete;
    TreeViewLayouter& operator=(const TreeViewLayouter&) = delete;

    // Builds the graph around the focus, gives every person its place, flags and routes the lines. Called
    // once.
    virtual void layoutForFocusNID() = 0;
    // Visits each person of the finished graph once, in the order of the result.
    virtual void graphIterator(const Visitor& visitor) = 0;

    // For the typed layout: from now on what each line is for is recorded too. The record must outlive
    // layoutForFocusNID.
    void recordLinesIn(LineRecord& record) { lineRecord = &record; }

    // The option's value, or the default where the key is absent. Never enters the key.
    bool boolOptionForKey(const std::string& key, bool defaultValue) const;

    // --- Placement.
    // The person in the middle of a span that starts at left.
    void centerPerson(TreeViewPerson& person, float width, float left, float y) const;
    // The pair around the middle of that span, nodeWidth + horzPadding apart, the husband at the left.
    void centerHusbandAndWife(TreeViewPerson& husband, TreeViewPerson& wife, float width, float left,
                              float y) const;
    // A row of count persons at y, evenly spaced around centerX, in the iterator's order from left to right.
    // With count 0 the iterator is not called. An iterator that visits fewer than count leaves the row half a
    // stride too far left: the step behind the last one is taken for a gap inside the row.
    void initializeParentsXAndYCenteredAboveChild(const Iterator& iterator, float y, float centerX,
                                                  int count) const;

    // --- Growing the graph. Each asks the data source for one person's relatives and enters them there. They
    // are asked again at each call, but for the children, which every node keeps. A spouse's gender is the
    // opposite of the person's: the data source is not asked for it.
    void addSpousesToPerson(TreeViewPerson& person);
    void addAllChildrenToPerson(TreeViewPerson& person);
    // The person's children who are not also children of somebody whom the iterator visits.
    void addBastardChildrenToPerson(TreeViewPerson& person, Iterator iterator);
    ChildrenSet getBastardChildrenOfPerson(TreeViewPerson& person, Iterator iterator);
    void addChildrenWithSpousesToPerson(TreeViewPerson& person, TreeViewPerson& spouse,
                                        const ChildrenSet& children);
    // Records of first that are equivalent to one of second, in the sets' own order.
    ChildrenSet getIntersectingVector(const ChildrenSet& first, const ChildrenSet& second) const;
    // Siblings and half siblings through the person's preferred parents, with an entry for the person itself.
    void addSiblingsToPerson(TreeViewPerson& person);
    void addParentsToPerson(TreeViewPerson& person);
    // A real parent is known. Uses up a negative id for each parent that is not.
    bool hasParents(TreeViewPerson& person);
    // The child belongs under the couple of person and other: its parents are the two, or none of its keys
    // has been admitted yet.
    bool checkIfPrefferedParent(TreeViewPerson& person, int& child, int& other);

    TreeViewPerson focusPerson;
    OptionMap options;
    DataAdapter* dataAdapter;
    TreeSize treeSize;
    AdmittedKeys shownPersons;

protected:
    ~TreeViewLayouter() = default;

    // The step from one row or column to the next.
    float rowStep() const;

    // Above is the parent, or the edge of the couple.
    template <class Above>
    boost::shared_ptr<TreeViewGenerationEdge> makeGenerationEdge(TreeLine&& line, TreeViewPerson& child,
                                                                 Above* above) {
        return boost::allocate_shared<TreeViewGenerationEdge>(
            olvane::SlabAllocator<TreeViewGenerationEdge>(memory.slabs()), std::move(line), &child, above);
    }

    void admit(int key) { shownPersons.admit(key); }
    bool isAdmitted(int key) const { return shownPersons.count(key) != 0; }

    LineRecord* lineRecord = nullptr;  // not owned; null where nobody asked for one

private:
    typedef TreeViewPerson::List<const ChildrenAdapter*> Records;  // in the sets where they lie

    // Walk calls a visitor for each of the others, as an Iterator does.
    template <class Walk>
    Records childrenWithoutSecondParent(TreeViewPerson& person, const Walk& walk);
    void addChildrenWithoutSecondParent(TreeViewPerson& person, const Records& alone);
    void addFatherSide(TreeViewPerson& person, bool motherIsReal);
    void addMotherSide(TreeViewPerson& person);
};

}  // namespace SharedTreeViewer
