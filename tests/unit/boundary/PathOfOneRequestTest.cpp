// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// One request from the host's call to the text, followed step by step: a man of id 17 with a wife, a child
// and two parents, and nobody else. The figures are worked out by hand.
//
//     y -220   [-1 father?][-2 mother?]   [-3 father?][-4 mother?]
//     y -110               [3]------------[4]
//     y    0                    [17]--[42]
//     y  110                       [5]

#include <memory>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include <olvane/boundary/FamilyViewLayout.h>
#include <olvane/boundary/OlvaneViewerBridge.h>
#include <olvane/family/FamilyOptions.h>
#include <olvane/family/TreeViewFamilyLayouter.h>
#include <support/FamilyText.h>
#include <unit/boundary/Request.h>

namespace {

using SharedTreeViewer::OptionMap;
using SharedTreeViewer::TreeViewFamilyLayouter;
using support::family;
using unit::Calls;
using unit::Request;

support::CaseFile fiveRelatives() {
    return family("17+42: 5; 3+4: 17");
}

const char kWholeText[] =
    "17:27:0:0:82,40,107,40|55,-15,55,-15|55,0,55,-15|;"
    "3:-12:-110:0:55,-70,55,-15|42,-70,67,-70|15,-125,-25,-125|15,-110,15,-125|;"
    "-1:-92:-220:0:-25,-180,-25,-125|-37,-180,-12,-180|:M:3;"
    "-2:-12:-220:0::F:3;"
    "4:67:-110:0:95,-125,135,-125|95,-110,95,-125|;"
    "-3:67:-220:0:135,-180,135,-125|122,-180,147,-180|:M:4;"
    "-4:147:-220:0::F:4;"
    "42:107:0:0:95,40,95,95|;"
    "5:67:110:0:95,95,95,95|95,110,95,95|;";

TEST(PathOfOneRequest, bridgeHandsTheWholeTextBack) {
    const auto bridge =
        OlvaneViewerBridge::initWithManagerWrap(std::make_shared<support::CaseManager>(fiveRelatives()));
    EXPECT_EQ(kWholeText, bridge.valuesForPersonId(17));
}

TEST(PathOfOneRequest, entryFunctionGivesTheSameText) {
    EXPECT_EQ(kWholeText, FamilyViewLayout("17", std::make_shared<support::CaseManager>(fiveRelatives())));
}

// A host's own frame around the layouter, in the order of the request.
class PathOfOneRequestByPieces : public testing::Test {
protected:
    PathOfOneRequestByPieces()
        : request(fiveRelatives()), adapter(request.callbacks.dataAdapter()), focusKey(request.key(17)) {
        options[SharedTreeViewer::IndicateNonDisplayedRelationships] = true;
    }

    int isMale() const { return adapter.isMale(focusKey) ? 1 : 0; }

    Request request;
    DataAdapter adapter;
    int focusKey;
    OptionMap options;
    TreeSize size = olvane::familyTreeSize();
};

TEST_F(PathOfOneRequestByPieces, focusGetsKeyZeroAndItsSexIsAskedFor) {
    EXPECT_EQ(0, focusKey);
    EXPECT_EQ(1, isMale());
    EXPECT_EQ((Calls{"sexOfPersonWithID 17"}), request.newCalls());
}

struct Placed {
    std::string idText;
    float x;
    float y;
    bool flag;

    bool operator==(const Placed&) const = default;
};

std::ostream& operator<<(std::ostream& out, const Placed& placed) {
    return out << placed.idText << " (" << placed.x << ", " << placed.y << ") flag " << placed.flag;
}

TEST_F(PathOfOneRequestByPieces, everyoneHasAPlaceAndNoFlagInTheOrderOfTheWalk) {
    TreeViewFamilyLayouter layouter(&adapter, focusKey, isMale(), options, size);
    layouter.layoutForFocusNID();
    std::vector<Placed> placed;
    layouter.graphIterator([&](TreeViewPerson& person) {
        const TreePoint& at = person.getNodeCenter();
        placed.push_back({request.idText(person.personId), at.x, at.y, person.hasNonDisplayedRelationships});
    });
    const std::vector<Placed> expected = {
        {"17", 27.5f, 0.0f, false},     {"3", -12.5f, -110.0f, false}, {"-1", -92.5f, -220.0f, false},
        {"-2", -12.5f, -220.0f, false}, {"4", 67.5f, -110.0f, false},  {"-3", 67.5f, -220.0f, false},
        {"-4", 147.5f, -220.0f, false}, {"42", 107.5f, 0.0f, false},   {"5", 67.5f, 110.0f, false}};
    EXPECT_EQ(expected, placed);
}

TEST_F(PathOfOneRequestByPieces, onlyChildIsWidenedAndTheCouplesSpanIsAsWide) {
    TreeViewFamilyLayouter layouter(&adapter, focusKey, isMale(), options, size);
    layouter.layoutForFocusNID();
    TreeViewPerson& focus = layouter.focusPerson;
    const int wifeKey = request.key(42);
    EXPECT_EQ(135.0f, focus.children[wifeKey].at(0).layoutWidth);
    EXPECT_EQ(135.0f, focus.getPreferredSpouse().layoutWidth);
    EXPECT_EQ(135.0f, layouter.familyUnitWidthForProximalPerson(focus));
}

TEST_F(PathOfOneRequestByPieces, siblingsFindNobodyBesideTheFocus) {
    TreeViewFamilyLayouter layouter(&adapter, focusKey, isMale(), options, size);
    layouter.layoutForFocusNID();
    ASSERT_EQ(1, layouter.focusPerson.getSiblingCount());
    EXPECT_EQ(focusKey, layouter.focusPerson.siblings[0].personId);
}

TEST_F(PathOfOneRequestByPieces, piecesPutTogetherGiveTheSameText) {
    std::string text;
    olvane::guarded([&] {
        TreeViewFamilyLayouter layouter(&adapter, focusKey, isMale(), options, size);
        layouter.layoutForFocusNID();
        olvane::ResultBounds bounds;
        layouter.graphIterator(olvane::resultWriter(request.glue, bounds, text));
    });
    EXPECT_EQ(kWholeText, text);
}

// Each question below stands where one step needs it; the comments name the steps.
const Calls kWholeCalls = {
    // the focus
    "sexOfPersonWithID 17",
    // the wife
    "spousesForPersonWithID 17",
    "isPreferredSpouse 17 42",
    "isPersonDead 42",
    "dateForPersonWithID 42 0",
    // the child: also one of hers? its parents? its sex?
    "childrenForPersonWithID 17",
    "dateForPersonWithID 5 1",
    "childrenForPersonWithID 42",
    "dateForPersonWithID 5 1",
    "fatherForPersonWithID 5",
    "motherForPersonWithID 5",
    "sexOfPersonWithID 5",
    // step children: children of hers who are of none of her husbands
    "spousesForPersonWithID 42",
    "isPreferredSpouse 42 17",
    "isPersonDead 17",
    "dateForPersonWithID 17 0",
    "childrenForPersonWithID 17",
    "dateForPersonWithID 5 1",
    // the child's own family
    "spousesForPersonWithID 5",
    "childrenForPersonWithID 5",
    // parents
    "fatherForPersonWithID 17",
    "motherForPersonWithID 17",
    // siblings: the children of both parents
    "childrenForPersonWithID 3",
    "dateForPersonWithID 17 1",
    "childrenForPersonWithID 4",
    "dateForPersonWithID 17 1",
    "sexOfPersonWithID 17",
    // grandparents
    "fatherForPersonWithID 3",
    "motherForPersonWithID 3",
    "fatherForPersonWithID 4",
    "motherForPersonWithID 4",
    // flags: the focus among its siblings
    "fatherForPersonWithID 17",
    "motherForPersonWithID 17",
    "fatherForPersonWithID 17",
    "motherForPersonWithID 17",
    // flags: other partners of the parents
    "spousesForPersonWithID 3",
    "isPreferredSpouse 3 4",
    "isPersonDead 4",
    "dateForPersonWithID 4 0",
    "spousesForPersonWithID 4",
    "isPreferredSpouse 4 3",
    "isPersonDead 3",
    "dateForPersonWithID 3 0",
    // flags: the child, then the wife
    "fatherForPersonWithID 5",
    "motherForPersonWithID 5",
    "fatherForPersonWithID 42",
    "motherForPersonWithID 42",
    // flags: the final pass, in the order of the walk: 17, 3, 4, 42, 5
    "spousesForPersonWithID 17",
    "isPreferredSpouse 17 42",
    "isPersonDead 42",
    "dateForPersonWithID 42 0",
    "spousesForPersonWithID 3",
    "isPreferredSpouse 3 4",
    "isPersonDead 4",
    "dateForPersonWithID 4 0",
    "spousesForPersonWithID 4",
    "isPreferredSpouse 4 3",
    "isPersonDead 3",
    "dateForPersonWithID 3 0",
    "spousesForPersonWithID 42",
    "isPreferredSpouse 42 17",
    "isPersonDead 17",
    "dateForPersonWithID 17 0",
    "fatherForPersonWithID 42",
    "motherForPersonWithID 42",
    "spousesForPersonWithID 5",
    "fatherForPersonWithID 5",
    "motherForPersonWithID 5",
};

TEST(PathOfOneRequest, hostIsAskedExactlyAsOftenAndInTheOrderOfTheSteps) {
    Request request(fiveRelatives());
    FamilyViewLayout("17", request.source);
    EXPECT_EQ(kWholeCalls, request.newCalls());
}

}  // namespace
