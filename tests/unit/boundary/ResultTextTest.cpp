// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The form of the result text, record by record, with persons made by hand.

#include <algorithm>
#include <limits>
#include <stdexcept>
#include <string>

#include <gtest/gtest.h>

#include <olvane/boundary/LayoutPieces.h>
#include <unit/boundary/Request.h>

namespace {

using unit::failureOf;
using unit::kUnknownKeyFailure;

// A writer with its glue; persons are named by id text.
class ResultText : public testing::Test {
protected:
    TreeViewPerson personAt(const std::string& idText, float x, float y) {
        TreeViewPerson person(glue.getKeyFromPerson(idText));
        person.getNodeCenter() = TreePoint{x, y};
        return person;
    }

    void write(TreeViewPerson& person) { olvane::resultWriter(glue, bounds, text)(person); }
    void writeAt(const std::string& idText, float x, float y) {
        TreeViewPerson person = personAt(idText, x, y);
        write(person);
    }

    ViewerGlue glue;
    olvane::ResultBounds bounds;
    std::string text;
};

TEST_F(ResultText, fourPersonsWithSegmentsAddNodesAndAFlag) {
    glue.addAddNodeValue("-1", true, "17", "-2");
    glue.addAddNodeValue("-2", false, "17", "-1");
    TreeViewPerson focus = personAt("17", 0.0f, 0.0f);
    focus.addLineSegment(40.0f, -15.0f, 40.0f, 0.0f, false);
    TreeViewPerson father = personAt("-1", -40.0f, -110.0f);
    father.addLineSegment(-40.0f, -55.0f, 40.0f, -55.0f, false);
    TreeViewPerson mother = personAt("-2", 40.0f, -110.0f);
    TreeViewPerson spouse = personAt("42", 80.0f, 0.0f);
    spouse.hasNonDisplayedRelationships = true;
    for (TreeViewPerson* person : {&focus, &father, &mother, &spouse}) write(*person);
    EXPECT_EQ("17:0:0:0:40,-15,40,0|;-1:-40:-110:0:-40,-55,40,-55|:M:17;-2:40:-110:0::F:17;42:80:0:1:;",
              text);
}

TEST_F(ResultText, fractionsAreCutTowardZeroNeverRounded) {
    writeAt("17", -27.5f, 27.5f);
    writeAt("17", -0.5f, 0.9f);
    writeAt("17", 0.99f, -109.99f);
    EXPECT_EQ("17:-27:27:0:;17:0:0:0:;17:0:-109:0:;", text);
}

TEST_F(ResultText, segmentsAreCutTowardZeroInAllFourNumbers) {
    TreeViewPerson person = personAt("17", 0.0f, 0.0f);
    person.addLineSegment(-72.5f, 72.5f, -0.9f, 0.9f, true);
    write(person);
    EXPECT_EQ("17:0:0:0:-72,72,0,0|;", text);
}

TEST_F(ResultText, idTextThatIsLongerThanAnyNumberIsWrittenWhole) {
    writeAt("00000000000000000017", 1.0f, 2.0f);
    writeAt("00000000018", 3.0f, 4.0f);
    EXPECT_EQ("00000000000000000017:1:2:0:;00000000018:3:4:0:;", text);
}

// -2147483648 is the longest number; each segment here differs from the one before it.
TEST_F(ResultText, anyNumberOfTheLongestSegmentsIsWritten) {
    TreeViewPerson person = personAt("-2147483647", -3.0e9f, -3.0e9f);
    std::string expected = "-2147483647:-2147483648:-2147483648:0:";
    glue.addAddNodeValue("-2147483647", true, "17", "-2");
    for (int i = 0; i < 60; ++i) {
        const float y = i % 2 == 0 ? -3.0e9f : 3.0e9f;
        person.addLineSegment(-3.0e9f, y, -3.0e9f, -3.0e9f, false);
        expected += i % 2 == 0 ? "-2147483648,-2147483648,-2147483648,-2147483648|"
                               : "-2147483648,2147483647,-2147483648,-2147483648|";
    }
    write(person);
    EXPECT_EQ(expected + ":M:17;", text);
}

TEST_F(ResultText, segmentIsRepeatedWhereverItStandsInALongList) {
    for (int before = 0; before < 60; ++before) {
        TreeViewPerson person = personAt("17", 0.0f, 0.0f);
        std::string expected = "17:0:0:0:";
        for (int i = 0; i < before; ++i) {
            person.addLineSegment(static_cast<float>(i), 1000000.0f, -1000000.0f, -1000000.0f, false);
            expected += std::to_string(i) + ",1000000,-1000000,-1000000|";
        }
        for (int i = 0; i < 40; ++i) {
            person.addLineSegment(-3.0e9f, 7.0f, 3.0e9f, 7.0f, false);
            expected += "-2147483648,7,2147483647,7|";
        }
        text.clear();
        write(person);
        EXPECT_EQ(expected + ";", text) << before;
    }
}

TEST_F(ResultText, numbersThatNoIntHoldsBecomeTheNearestAndNotANumberBecomesZero) {
    writeAt("17", 3.0e9f, -3.0e9f);
    writeAt("17", std::numeric_limits<float>::infinity(), -std::numeric_limits<float>::infinity());
    writeAt("17", std::numeric_limits<float>::quiet_NaN(), -0.0f);
    EXPECT_EQ(
        "17:2147483647:-2147483648:0:;17:2147483647:-2147483648:0:;"
        "17:0:0:0:;",
        text);
}

TEST_F(ResultText, personWithoutLinesWritesNothingBetweenTheFourthColonAndTheEnd) {
    writeAt("17", 1.0f, 2.0f);
    EXPECT_EQ("17:1:2:0:;", text);
}

TEST_F(ResultText, addNodeWithoutLinesReadsTwoColonsAheadOfItsSex) {
    glue.addAddNodeValue("-1", true, "17", "4");
    writeAt("-1", 1.0f, 2.0f);
    EXPECT_EQ("-1:1:2:0::M:17;", text);
}

TEST_F(ResultText, realRecordHasFourColonsAndAnAddNodesSix) {
    glue.addAddNodeValue("-2", false, "17", "3");
    TreeViewPerson real = personAt("17", 0.0f, 0.0f);
    TreeViewPerson addNode = personAt("-2", 0.0f, 0.0f);
    for (TreeViewPerson* person : {&real, &addNode}) person->addLineSegment(1.0f, 2.0f, 3.0f, 4.0f, false);
    write(real);
    EXPECT_EQ(4, std::count(text.begin(), text.end(), ':'));
    text.clear();
    write(addNode);
    EXPECT_EQ(6, std::count(text.begin(), text.end(), ':'));
}

TEST_F(ResultText, segmentsComeInTheOrderAddedAndEachEndsInABar) {
    TreeViewPerson person = personAt("17", 0.0f, 0.0f);
    person.addLineSegment(9.0f, 8.0f, 7.0f, 6.0f, false);
    person.addLineSegment(1.0f, 2.0f, 3.0f, 4.0f, true);
    person.addLineSegment(9.0f, 8.0f, 7.0f, 6.0f, false);
    write(person);
    EXPECT_EQ("17:0:0:0:9,8,7,6|1,2,3,4|9,8,7,6|;", text);
}

TEST_F(ResultText, spouseLinesKeptByKeyAreNotWritten) {
    TreeViewPerson person = personAt("17", 0.0f, 0.0f);
    person.addSpouseLine(1, 1.0f, 2.0f, 3.0f, 4.0f);
    write(person);
    EXPECT_EQ("17:0:0:0:;", text);
}

TEST_F(ResultText, idsStandAsTheHostGaveThemWhateverTheirKeys) {
    writeAt("2147483647", 0.0f, 0.0f);
    writeAt("3", 0.0f, 0.0f);
    writeAt("17x", 0.0f, 0.0f);
    EXPECT_EQ("2147483647:0:0:0:;3:0:0:0:;17x:0:0:0:;", text);
}

TEST_F(ResultText, personOfIdZeroHasNoSuffix) {
    writeAt("0", 0.0f, 0.0f);
    EXPECT_EQ("0:0:0:0:;", text);
}

TEST_F(ResultText, unknownKeyFailsByNameBeforeAnythingIsWritten) {
    TreeViewPerson stranger(99);
    EXPECT_EQ(kUnknownKeyFailure, failureOf<std::out_of_range>([&] { write(stranger); }));
    EXPECT_EQ("", text);
    EXPECT_EQ(0, bounds.minX);
}

TEST_F(ResultText, negativeIdWithoutARecordIsCutBehindItsSegments) {
    TreeViewPerson stranger = personAt("-9", 1.0f, 2.0f);
    stranger.addLineSegment(1.0f, 2.0f, 3.0f, 4.0f, false);
    EXPECT_EQ(kUnknownKeyFailure, failureOf<std::out_of_range>([&] { write(stranger); }));
    EXPECT_EQ("-9:1:2:0:1,2,3,4|:", text);
}

TEST_F(ResultText, writingHappensBehindWhatStandsThere) {
    text = "before;";
    writeAt("17", 0.0f, 0.0f);
    EXPECT_EQ("before;17:0:0:0:;", text);
}

// --- The running bounds.

void expectBounds(const olvane::ResultBounds& bounds, int minX, int minY, int maxX, int maxY) {
    EXPECT_EQ(minX, bounds.minX);
    EXPECT_EQ(minY, bounds.minY);
    EXPECT_EQ(maxX, bounds.maxX);
    EXPECT_EQ(maxY, bounds.maxY);
}

TEST_F(ResultText, firstPersonSetsAllFourBounds) {
    writeAt("17", -12.5f, 110.0f);
    expectBounds(bounds, -12, 110, -12, 110);
}

TEST_F(ResultText, firstPersonAboveTheOriginSetsAllFourBounds) {
    writeAt("17", 12.5f, -110.0f);
    expectBounds(bounds, 12, -110, 12, -110);
}

TEST_F(ResultText, boundsGrowWithEachPerson) {
    writeAt("17", 10.0f, 20.0f);
    expectBounds(bounds, 10, 20, 10, 20);
    writeAt("18", -5.0f, 30.0f);
    expectBounds(bounds, -5, 20, 10, 30);
    writeAt("19", 7.0f, 25.0f);
    expectBounds(bounds, -5, 20, 10, 30);
    writeAt("20", -9.0f, 3.0f);
    expectBounds(bounds, -9, 3, 10, 30);
    writeAt("21", 11.0f, 31.0f);
    expectBounds(bounds, -9, 3, 11, 31);
}

TEST_F(ResultText, boundsBelowAndAtOneAreSetLikeAnyOther) {
    writeAt("17", 1.0f, 1.0f);
    expectBounds(bounds, 1, 1, 1, 1);
    writeAt("18", 5.0f, 5.0f);
    expectBounds(bounds, 1, 1, 5, 5);
    writeAt("19", -3.0f, -3.0f);
    expectBounds(bounds, -3, -3, 5, 5);
}

TEST_F(ResultText, boundThatHasReachedZeroIsTakenForUnset) {
    writeAt("17", 10.0f, 20.0f);
    writeAt("18", -5.0f, 0.0f);
    expectBounds(bounds, -5, 0, 10, 20);
    writeAt("19", 7.0f, 50.0f);
    expectBounds(bounds, -5, 50, 10, 50);
}

TEST_F(ResultText, boundsOfAFirstPersonAtTheOriginAreSetByTheNext) {
    writeAt("17", 0.0f, 0.0f);
    expectBounds(bounds, 0, 0, 0, 0);
    writeAt("18", -80.0f, 110.0f);
    expectBounds(bounds, -80, 110, -80, 110);
}

}  // namespace
