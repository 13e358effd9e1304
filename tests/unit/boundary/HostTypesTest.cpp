// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A host may write plain standard containers where the engine has its own: sets of records, lists of persons, maps of
// keys. Each test is a piece of such a host; that it compiles is half of the test.

#include <gtest/gtest.h>

#include <boost/function.hpp>
#include <boost/unordered_map.hpp>

#include <map>
#include <memory>
#include <new>
#include <set>
#include <stdexcept>
#include <string>
#include <type_traits>
#include <utility>
#include <vector>

#include <olvane/adapters/DataAdapter.h>
#include <olvane/boundary/LayoutPieces.h>
#include <olvane/family/TreeViewFamilyLayouter.h>
#include <olvane/graph/TreeViewPerson.h>
#include <olvane/pedigree/TreeViewPedigreeLayouter.h>
#include <support/CaseRun.h>
#include <support/FamilyText.h>

namespace {

typedef std::set<SpouseAdapter> Spouses;
typedef std::set<ChildrenAdapter> Children;

template <class Set>
std::vector<int> keysOf(const Set& records) {
    std::vector<int> keys;
    for (const auto& record : records) keys.push_back(record.key);
    return keys;
}

typedef std::vector<int> Keys;

// A family of keys: 0 is married to 1, and 2 is their child.
void addSpouses(int key, Spouses& spouses) {
    if (key == 0) spouses.insert(SpouseAdapter(1, true, true, "", "1", 1));
    if (key == 1) spouses.insert(SpouseAdapter(0, true, true, "", "0", 1));
}

void addChildren(int key, Children& children) {
    if (key < 2) children.insert(ChildrenAdapter(2, "1850", "2", 1));
}

void setParents(int key, int& father, int& mother) {
    if (key != 2) return;
    father = 0;
    mother = 1;
}

DataAdapter plainAdapter() {
    return DataAdapter(
        &addSpouses, &setParents, [](int key, Children& children) { addChildren(key, children); },
        [](int key) { return key != 1; }, [](int key) { return key < 0; }, [](int) {});
}

// --- Callbacks over plain sets.

TEST(PlainCallbacks, aFamilyIsLaidOutThroughThem) {
    DataAdapter adapter = plainAdapter();
    SharedTreeViewer::TreeViewFamilyLayouter layouter(&adapter, 0, 1, {}, olvane::familyTreeSize());
    layouter.layoutForFocusNID();
    Keys keys;
    layouter.graphIterator([&keys](TreeViewPerson& person) { keys.push_back(person.personId); });
    EXPECT_EQ((Keys{0, 1, 2}), keys);
}

TEST(PlainCallbacks, aFieldIsCalledWithASetOfEitherKind) {
    const DataAdapter adapter = plainAdapter();
    Spouses plain;
    adapter.getSpouses(0, plain);
    EXPECT_EQ(Keys{1}, keysOf(plain));
    SpouseSet fast;
    adapter.getSpouses(0, fast);
    EXPECT_EQ(Keys{1}, keysOf(fast));
    Children children;
    adapter.getChildren(1, children);
    EXPECT_EQ(Keys{2}, keysOf(children));
}

TEST(PlainCallbacks, theEnginesOwnAreCalledWithPlainSets) {
    const auto manager = std::make_shared<support::CaseManager>(support::family("17+42: 5 6"));
    const std::shared_ptr<OlvaneViewerManagerWrapProtocol> source = manager;
    ViewerGlue glue;
    const olvane::HostCallbacks callbacks(glue, source);
    const int focus = glue.getKeyFromPerson("17");
    Spouses spouses;
    callbacks.getSpouses(focus, spouses);
    EXPECT_EQ(Keys{1}, keysOf(spouses));
    Children children;
    children.insert(ChildrenAdapter(90, "", "90", 9));
    callbacks.dataAdapter().getChildren(focus, children);
    EXPECT_EQ((Keys{2, 3, 90}), keysOf(children));
}

TEST(PlainCallbacks, aFieldIsAFunctionOverAPlainSet) {
    const DataAdapter adapter = plainAdapter();
    const boost::function<void(int, Spouses&)> getSpouses = adapter.getSpouses;
    Spouses spouses;
    getSpouses(1, spouses);
    EXPECT_EQ(Keys{0}, keysOf(spouses));
}

TEST(PlainCallbacks, aFieldIsReplacedByAFunctionOverAPlainSet) {
    DataAdapter adapter = plainAdapter();
    adapter.getChildren = boost::function<void(int, Children&)>();
    EXPECT_TRUE(adapter.getChildren.empty());
    Children children;
    EXPECT_THROW(adapter.getChildren(0, children), boost::bad_function_call);
    adapter.getChildren = boost::function<void(int, Children&)>(&addChildren);
    adapter.getChildren(0, children);
    EXPECT_EQ(Keys{2}, keysOf(children));
}

TEST(PlainCallbacks, aNullFunctionIsAnEmptyOne) {
    void (*const nothing)(int, Spouses&) = nullptr;
    const DataAdapter::SpousesCallback callback = nothing;
    EXPECT_TRUE(callback.empty());
}

TEST(PlainCallbacks, whatOneAddsBeforeItThrowsIsInTheSet) {
    const DataAdapter::SpousesCallback callback = [](int, Spouses& spouses) {
        spouses.insert(SpouseAdapter(7, true, true, "", "7", 1));
        throw std::runtime_error("no more");
    };
    SpouseSet spouses;
    EXPECT_THROW(callback(0, spouses), std::runtime_error);
    EXPECT_EQ(Keys{7}, keysOf(spouses));
}

// A set in the memory of a picture stays in it.
TEST(PlainCallbacks, theCopiedRecordsLieInTheSetsOwnMemory) {
    olvane::Arena arena;
    SpouseSet spouses(&arena);
    const DataAdapter::SpousesCallback callback = &addSpouses;
    callback(0, spouses);
    EXPECT_EQ(&arena, spouses.get_allocator().arena());
    EXPECT_EQ(Keys{1}, keysOf(spouses));
}

// --- Loaders and operations over plain sets.

TEST(PlainLoaders, fillAPerson) {
    TreeViewPerson person(0);
    const boost::function<void(int, Spouses&)> loadSpouses = &addSpouses;
    const boost::function<void(int, Children&)> loadChildren = &addChildren;
    person.getNonDisplayedSpouseIterator(loadSpouses);
    EXPECT_EQ(1, person.getNonDisplayedSpouseCount());
    const Children loaded = person.getAllChildrenVector(loadChildren);
    EXPECT_EQ(Keys{2}, keysOf(loaded));
    const Children& looked = person.getAllChildrenVector(loadChildren);
    EXPECT_EQ(Keys{2}, keysOf(looked));
}

TEST(PlainOperations, ofALayouterTakeAndReturnSets) {
    DataAdapter adapter = plainAdapter();
    SharedTreeViewer::TreeViewPedigreeLayouter layouter(&adapter, 0, 1, {}, olvane::familyTreeSize(), 3, 4);
    Children one;
    one.insert(ChildrenAdapter(2, "1850", "2", 1));
    Children both = one;
    both.insert(ChildrenAdapter(3, "1851", "3", 2));
    const Children shared = layouter.getIntersectingVector(one, both);
    EXPECT_EQ(Keys{2}, keysOf(shared));
    TreeViewPerson& spouse = layouter.focusPerson.addSpouse(1, false);
    layouter.addChildrenWithSpousesToPerson(layouter.focusPerson, spouse, one);
    EXPECT_EQ(1, layouter.focusPerson.getChildrenWithSpouseCount(1));
    const Children bastards =
        layouter.getBastardChildrenOfPerson(layouter.focusPerson, [](const TreeViewPerson::Visitor&) {});
    EXPECT_EQ(Keys{2}, keysOf(bastards));
}

// --- Lists of persons.

TEST(PlainLists, personsAreAddedToAListOfTheHostsOwn) {
    TreeViewPerson person(0);
    std::vector<TreeViewPerson> list;
    person.addPerson(5, list, true).addSpouse(6, false);
    person.addChild(7, list, false);
    person.addSiblingHelper(8, list, true);
    ASSERT_EQ(3u, list.size());
    EXPECT_TRUE(list[0].gender);
    EXPECT_FALSE(list[1].gender);
    EXPECT_EQ(6, list[0].getPreferredSpouse().personId);
}

TEST(PlainLists, aListOfAPersonIsCopiedIntoOneOfTheHosts) {
    TreeViewPerson person(0);
    person.setParents(1, 2);
    person.addLineSegment(1, 2, 3, 4, false);
    const std::vector<TreeViewPerson> parents = person.parents;
    ASSERT_EQ(2u, parents.size());
    EXPECT_EQ(2, parents[1].personId);
    const std::vector<TreeLineSegment> segments = person.lineSegments;
    EXPECT_EQ(4.0f, segments.at(0).y2);
}

TEST(PlainLists, aListOfChildrenStaysWhenAnotherKeyIsAdded) {
    TreeViewPerson person(0);
    TreeViewPerson::Persons& under5 = person.children[5];
    for (const int key : {1, 9, 2, 8, 3, 7, 4, 6}) person.addChildWithSpouse(100 + key, key, true);
    person.addChild(50, under5, true);
    EXPECT_EQ(&under5, &person.children[5]);
    EXPECT_TRUE(person.hasChildWithSpouse(5, 50));
}

// --- Maps.

TEST(PlainMaps, ofTheGlueAreLookedAtAsHashMaps) {
    ViewerGlue glue;
    glue.getKeyFromPerson("17");
    glue.getKeyFromPerson("-1");
    glue.addAddNodeValue("-1", true, "17", "");
    const boost::unordered_map<int, std::string>& persons = glue.keyToPerson;
    EXPECT_EQ(2u, persons.size());
    EXPECT_EQ("17", glue.keyToPerson[0]);
    EXPECT_EQ(1, glue.personToKey["-1"]);
    const auto found = glue.addNodes.find("-1");
    ASSERT_TRUE(found != glue.addNodes.end());
    EXPECT_EQ("17", found->second.childText);
    boost::unordered_map<std::string, int>::const_iterator entry = glue.personToKey.find("17");
    EXPECT_EQ(0, entry->second);
    int entries = 0;
    for (const std::pair<const int, std::string>& each : glue.keyToPerson) entries += each.first + 1;
    EXPECT_EQ(3, entries);
    EXPECT_GE(1.0f, glue.keyToPerson.load_factor());
    EXPECT_EQ(std::make_pair(glue.keyToPerson.find(1), std::next(glue.keyToPerson.find(1))),
              glue.keyToPerson.equal_range(1));
    EXPECT_EQ(2, std::distance(glue.keyToPerson.cbegin(), glue.keyToPerson.cend()));
}

TEST(PlainMaps, ofTheGlueFailAtAKeyThatIsNotThere) {
    const ViewerGlue glue;
    EXPECT_THROW(glue.keyToPerson[0], std::out_of_range);
    EXPECT_THROW(glue.keyToPerson.at(0), std::out_of_range);
}

TEST(PlainMaps, shownPersonsIsAMap) {
    DataAdapter adapter = plainAdapter();
    SharedTreeViewer::TreeViewFamilyLayouter layouter(&adapter, 0, 1, {}, olvane::familyTreeSize());
    layouter.shownPersons[5] = true;
    EXPECT_TRUE(layouter.shownPersons.insert(std::make_pair(4, true)).second);
    EXPECT_TRUE(layouter.shownPersons.emplace(6, true).second);
    EXPECT_EQ(4, layouter.shownPersons.begin()->first);
    EXPECT_EQ(5, layouter.shownPersons.lower_bound(5)->first);
    EXPECT_EQ(6, layouter.shownPersons.upper_bound(5)->first);
    layouter.shownPersons.find(4)->second = false;
    EXPECT_FALSE(layouter.shownPersons.at(4));
    EXPECT_EQ(1u, layouter.shownPersons.erase(4));
    layouter.shownPersons.erase(layouter.shownPersons.find(6));
    const std::map<int, bool> copy = layouter.shownPersons;
    EXPECT_EQ((std::map<int, bool>{{5, true}}), copy);
    layouter.shownPersons = std::map<int, bool>{{1, true}, {2, true}};
    EXPECT_EQ(2u, layouter.shownPersons.size());
    Keys keys;
    for (const std::pair<const int, bool>& entry : layouter.shownPersons) keys.push_back(entry.first);
    EXPECT_EQ((Keys{1, 2}), keys);
    layouter.shownPersons.clear();
    EXPECT_TRUE(layouter.shownPersons.empty());
}

// --- Classes of a host's own.

struct CountedPerson : TreeViewPerson {
    CountedPerson(int key, int& destroyed) : TreeViewPerson(key), destroyed_(destroyed) {}
    ~CountedPerson() override { ++destroyed_; }
    int& destroyed_;
};

TEST(DerivedClasses, aPersonIsDestroyedThroughItsBase) {
    int destroyed = 0;
    std::unique_ptr<TreeViewPerson> person = std::make_unique<CountedPerson>(3, destroyed);
    EXPECT_EQ(3, person->personId);
    person.reset();
    EXPECT_EQ(1, destroyed);
    static_assert(std::has_virtual_destructor_v<TreeViewPerson>);
}

// A layouter that counts its walks.
template <class Layouter>
struct Counting : Layouter {
    using Layouter::Layouter;
    void graphIterator(const TreeViewPerson::Visitor& visitor) override {
        ++walks;
        Layouter::graphIterator(visitor);
    }
    int walks = 0;
};

TEST(DerivedClasses, bothLayoutersMayBeDerivedFrom) {
    DataAdapter adapter = plainAdapter();
    Counting<SharedTreeViewer::TreeViewFamilyLayouter> family(&adapter, 0, 1, SharedTreeViewer::OptionMap(),
                                                              olvane::familyTreeSize());
    Counting<SharedTreeViewer::TreeViewPedigreeLayouter> pedigree(
        &adapter, 2, 1, SharedTreeViewer::OptionMap(), olvane::familyTreeSize(), 2, 4);
    family.layoutForFocusNID();
    pedigree.layoutForFocusNID();
    int persons = 0;
    family.graphIterator([&persons](TreeViewPerson&) { ++persons; });
    EXPECT_EQ(3, persons);
    EXPECT_EQ(1, family.walks);
}

TEST(NewOfEdges, isAskedNotToThrow) {
    TreeViewPerson husband(1);
    TreeViewPerson wife(2);
    const std::unique_ptr<TreeViewSpouseEdge> couple(new (std::nothrow) TreeViewSpouseEdge(&husband, &wife));
    ASSERT_NE(nullptr, couple);
    const std::unique_ptr<TreeViewGenerationEdge> child(
        new (std::nothrow) TreeViewGenerationEdge(TreeLine(), &wife, &husband));
    ASSERT_NE(nullptr, child);
    EXPECT_EQ(&wife, couple->spouse);
}

}  // namespace
