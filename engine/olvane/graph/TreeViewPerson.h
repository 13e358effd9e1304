// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <boost/container/flat_map.hpp>
#include <boost/function.hpp>
#include <boost/shared_ptr.hpp>

#include <cstddef>
#include <functional>
#include <map>
#include <span>
#include <utility>
#include <vector>

#include <olvane/Export.h>
#include <olvane/adapters/ChildrenAdapter.h>
#include <olvane/adapters/SpouseAdapter.h>
#include <olvane/detail/Arena.h>
#include <olvane/detail/ArenaList.h>
#include <olvane/graph/TreeLineSegment.h>
#include <olvane/graph/TreePoint.h>
#include <olvane/graph/TreeViewGenerationEdge.h>
#include <olvane/graph/TreeViewSpouseEdge.h>

// A person's box in the chart, with the relatives that hang from it.
//
// Units: points; x grows right, y grows down. nodeCenter is the upper-left corner of the box for lines and
//        for the host, in spite of its name.
// Holds: relatives lie here by value, each in exactly one list of exactly one person; a copy is a deep copy.
//        The same human being can stand in the graph several times, and such nodes are never merged.
//
// Three phases, in this order:
//   1. relatives are added and placed. A reference into a list is good until the next append to that list.
//   2. lines and flags. No list of displayed relatives grows any more; only now may pointers to persons be
//      kept and spouse edges be made (nonDisplayedSpouses may still be filled: nothing points at those
//      nodes).
//   3. the whole graph goes in one destruction.
//
// A copy takes the plain pointers in spouseEdges along, so a person that owns edges must not be copied: the edge
// would have two owners. Growing a list in phase 2 would leave edges that point at where persons were.
class OLVANE_API TreeViewPerson {
public:
    typedef boost::function<void(TreeViewPerson&)> Visitor;
    typedef boost::function<void(const Visitor&)> Iterator;  // walks some relation when it is called
    typedef boost::function<void(TreeViewPerson&, TreeViewPerson&)> PairVisitor;
    typedef boost::function<void(TreeViewPerson&, int)> ReverseVisitor;
    typedef olvane::RecordsCallback<SpouseAdapter> SpousesLoader;  // also of std::set<SpouseAdapter>
    typedef olvane::RecordsCallback<ChildrenAdapter> ChildrenLoader;
    typedef boost::function<void(TreeLineSegment&)> SegmentVisitor;
    typedef boost::function<void(TreeViewGenerationEdge*)> GenerationEdgeVisitor;
    typedef boost::function<void(TreeViewSpouseEdge*)> SpouseEdgeVisitor;
    template <class Element>
    using List = olvane::ArenaList<Element>;
    // A few entries side by side: a new one moves those behind it, though never what a list in them holds.
    template <class Value>
    using ByKey =
        boost::container::flat_map<int, Value, std::less<int>, olvane::ArenaAllocator<std::pair<int, Value>>>;
    typedef List<TreeViewPerson> Persons;
    typedef List<TreeLineSegment> Segments;
    // A list in it stays where it is when another key is added.
    typedef std::map<int, Persons, std::less<int>, olvane::ArenaAllocator<std::pair<const int, Persons>>>
        ChildrenByKey;

    static constexpr int kNoKey = -1;  // unset, or no other parent

    // All that hangs from the person lies in the arena, or on the heap without one.
    explicit TreeViewPerson(int key, olvane::Arena* arena = nullptr);
    TreeViewPerson(const TreeViewPerson&) = default;  // on the heap, whatever the original's arena
    // How a list grows: the relatives come along as they lie.
    TreeViewPerson(TreeViewPerson&&) noexcept = default;
    TreeViewPerson& operator=(const TreeViewPerson&) = delete;
    virtual ~TreeViewPerson();  // deletes the spouse edges that this person owns, first of all

    // --- Adding relatives. A bool is the new person's gender, true for male. Nothing looks for an entry that
    // is already there: the same key added twice stands twice. Each returns the new element of its list.
    // Fails: std::bad_alloc, and the list is as it was.
    TreeViewPerson& addPerson(int id, Persons& list, bool male);
    TreeViewPerson& addChild(int id, Persons& list, bool male);
    TreeViewPerson& addSiblingHelper(int id, Persons& list, bool male);
    // The same on a list of the host's own.
    TreeViewPerson& addPerson(int id, std::vector<TreeViewPerson>& list, bool male);
    TreeViewPerson& addChild(int id, std::vector<TreeViewPerson>& list, bool male);
    TreeViewPerson& addSiblingHelper(int id, std::vector<TreeViewPerson>& list, bool male);
    TreeViewPerson& addParent(int id, bool male);  // leaves the preferred indices alone
    void setParents(int fatherId, int motherId);
    void setParentsFatherOnly(int fatherId);
    void setParentsMotherOnly(int motherId);
    TreeViewPerson& addSibling(int id, bool male);
    TreeViewPerson& addHalfSibling(int id, int sharedParentId, bool male);
    TreeViewPerson& addSpouse(int id, bool male);
    // Always a woman, a husband too. The walks treat such a node as one, and the order of the children that
    // hosts see through it rests on that.
    TreeViewPerson& addNonDisplayedSpouse(int id);
    TreeViewPerson& addChildWithSpouse(int childId, int spouseId, bool male);
    TreeViewPerson& addChildWithNoOtherSpouse(int childId, bool male);
    // The list under that key, with room for `more` more children.
    Persons& childrenWithSpouse(int spouseId, std::size_t more);

    // --- Plain reads and writes.
    void setGender(bool male) { gender = male; }
    void setHasBeenVisited(bool visited) { hasBeenVisited_ = visited; }
    bool hasBeenVisited() const { return hasBeenVisited_; }
    // The place in the walk of the result, counted from 0: set where lines are recorded, else kNoKey.
    void setWalkNumber(int number) { walkNumber_ = number; }
    int walkNumber() const { return walkNumber_; }
    int getPersonId() const { return personId; }
    int getParentId() const { return parentId; }
    TreePoint& getNodeCenter() { return nodeCenter; }
    const TreePoint& getNodeCenter() const { return nodeCenter; }
    // Fail with std::out_of_range where there is no such relative.
    TreeViewPerson& getPreferredFather();
    TreeViewPerson& getPreferredMother();
    TreeViewPerson& getPreferredSpouse();

    // The children by that other parent, where they lie. Leaves no list under a key that is missing.
    std::span<TreeViewPerson> childrenBy(int key) {
        if (children.empty()) return {};  // as for most persons
        const auto entry = children.find(key);
        if (entry == children.end()) return {};
        return {entry->second.data(), entry->second.size()};
    }

    // --- Walks. The order of a visit is the order on the page. None skips a person, asks for hasBeenVisited,
    // or guards an empty visitor: boost::bad_function_call comes with the first person, and never on an empty
    // walk. A visitor must not append to the list that is being walked.
    void parentsIterator(const Visitor& visitor);
    void spouseIterator(const Visitor& visitor);
    void nonDisplayedSpouseIterator(const Visitor& visitor);
    void childrenIterator(int key, const Visitor& visitor);
    void grandparentsIterator(const Visitor& visitor);
    void greatGrandparentsIterator(const Visitor& visitor);
    void allChildrenIterator(bool includeBastards, const Visitor& visitor);
    void allChildrenWithSpouseIterator(TreeViewPerson& spouse, const Visitor& visitor);
    void childAndSpouseIterator(const PairVisitor& visitor);  // (child, its other parent or this person)
    void allSiblingsIterator(bool fromSelf, const Visitor& visitor);
    void allSiblingsReverseIterator(const ReverseVisitor& visitor);  // the int is always -1

    // --- Walks for later. Each is good while this person is neither moved nor destroyed.
    Iterator getChildrenIterator(int key);
    Iterator getAllChildrenIterator(bool includeBastards);
    Iterator getSpouseIterator();
    Iterator getSelfAndSpousesIterator();
    Iterator getParentIterator();
    Iterator getGrandparentIterator();
    Iterator getGreatGrandparentIterator();
    Iterator getChildrenAndBastardsWithSpouseIterator(TreeViewPerson& spouse);

    // --- Loaders: ask the data source at most once for each node. The mark is set before the question, so a
    // loader that throws is not asked again.
    Iterator getNonDisplayedSpouseIterator(const SpousesLoader& loader);  // loads, then offers the walk
    Persons& getNonDisplayedSpouses(const SpousesLoader& loader) {        // loads, then offers the list
        if (!nonDisplayedSpousesLoaded) loadNonDisplayedSpouses(loader);
        return nonDisplayedSpouses;
    }
    ChildrenSet& getAllChildrenVector(const ChildrenLoader& loader) {  // the ordered set, whatever its name
        if (!allChildrenLoaded) loadAllChildren(loader);
        return allChildren;
    }

    // --- Counts. Those that ask for children by key leave an empty list under a key that is missing.
    int getParentCount() const { return countOf(parents); }
    int getSpouseCount() const { return countOf(spouses); }
    int getNonDisplayedSpouseCount() const { return countOf(nonDisplayedSpouses); }  // 0 until loaded
    int getSiblingCount() const { return countOf(siblings); }  // the person's own entry counts
    int getGrandparentCount();
    int getGreatGrandparentCount();
    int getChildrenWithSpouseCount(int key);
    int getChildrenWithNoOtherParentCount();
    int getAllChildrenCount();  // without the bastard children of the spouses
    bool hasChildWithSpouse(int spouseKey, int childKey);

    // --- Edges.
    // Finds or makes the edge between this person and the spouse. An edge that is there keeps its line, and
    // the one given is dropped. The person on whom it was first asked owns the edge.
    TreeViewSpouseEdge* spouseEdge(TreeViewPerson* spouse, TreeLine line);
    void addUnownedSpouseEdge(TreeViewSpouseEdge* edge, int spouseKey);
    void addGenerationEdge(boost::shared_ptr<TreeViewGenerationEdge> edge);
    void generationEdgeIterator(GenerationEdgeVisitor visitor);
    void spouseEdgeIterator(const SpouseEdgeVisitor& visitor);  // owned edges alone, by ascending key

    // --- Lines.
    void addLineSegment(float x1, float y1, float x2, float y2, bool isSpouseLine) {
        if (lineSegments.capacity() == 0) lineSegments.reserve(kUsualSegments);
        lineSegments.push_back(TreeLineSegment{x1, y1, x2, y2, isSpouseLine});
    }
    void addSpouseLine(int spouseKey, float x1, float y1, float x2, float y2);
    // The first line to that spouse. Fails with std::out_of_range where there is none, leaving an empty list.
    TreeLineSegment& getSpouseLine(int spouseKey);
    void lineSegmentIterator(const SegmentVisitor& visitor);

    // --- Fields.
    bool isProximalPerson = false;   // treated as the person of its unit by the width pass; read by nothing
    float layoutWidth = 0.0f;        // width of the block below this person, written by the width pass
    float spouseLineOffset = 0.0f;   // handed to a spouse by placement; read by nothing
    int personId;                    // the person's key; never negative
    int parentId = kNoKey;           // on a half sibling: the parent through whom it is related
    bool gender = false;             // true for male
    bool allChildrenLoaded = false;  // allChildren has been asked for
    bool nonDisplayedSpousesLoaded = false;         // nonDisplayedSpouses has been asked for
    bool hasNonDisplayedRelationships = false;      // the flag of the result
    ByKey<TreeViewSpouseEdge*> spouseEdges;         // owned, by the other spouse's key
    ByKey<TreeViewSpouseEdge*> unownedSpouseEdges;  // owned by the other spouse, by that spouse's key
    // To children of whom this person is the only drawn parent.
    List<boost::shared_ptr<TreeViewGenerationEdge>> generationEdges;
    ChildrenSet allChildren;        // the host's children, filled at most once
    int preferredFatherIndex = -1;  // into parents
    int preferredMotherIndex = -1;  // into parents
    Persons parents;
    Persons spouses;
    Persons nonDisplayedSpouses;  // every spouse that the host knows; never drawn
    ChildrenByKey children;       // by the other parent's key; kNoKey without one
    Persons siblings;             // with an entry for the person itself
    Segments lineSegments;        // in the order added; what the result text writes
    ByKey<Segments> spouseLines;
    TreePoint nodeCenter;

private:
    static constexpr std::size_t kUsualSegments = 4;  // a person's own, without those that children leave

    static int countOf(const Persons& persons) { return static_cast<int>(persons.size()); }

    void loadNonDisplayedSpouses(const SpousesLoader& loader);
    void loadAllChildren(const ChildrenLoader& loader);
    olvane::Arena* arena() const { return parents.get_allocator().arena(); }
    Persons& childrenUnder(int key);  // both make the list where there is none
    Segments& linesTo(int spouseKey);

    bool hasBeenVisited_ = false;  // mark of the traversals that enter a node once
    int walkNumber_ = kNoKey;
};
