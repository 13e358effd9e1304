// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Keys by first sight and the records of unknown parents, without any data source.

#include <cstdint>
#include <stdexcept>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include <olvane/boundary/ViewerGlue.h>
#include <unit/boundary/Request.h>

namespace {

using unit::failureOf;
using unit::kUnknownKeyFailure;

TEST(PersonKeys, firstTextOfAnEmptyTableGetsKeyZero) {
    ViewerGlue glue;
    EXPECT_EQ(0, glue.getKeyFromPerson("4711"));
}

TEST(PersonKeys, areDenseInTheOrderOfFirstSightRealAndNegativeInOneSequence) {
    ViewerGlue glue;
    EXPECT_EQ(0, glue.getKeyFromPerson("17"));
    EXPECT_EQ(1, glue.getKeyFromPerson("-1"));
    EXPECT_EQ(2, glue.getKeyFromPerson("5"));
    EXPECT_EQ(3, glue.getKeyFromPerson("-2"));
}

TEST(PersonKeys, sameTextGivesTheSameKeyAndAddsNothing) {
    ViewerGlue glue;
    glue.getKeyFromPerson("17");
    const int key = glue.getKeyFromPerson("42");
    EXPECT_EQ(key, glue.getKeyFromPerson("42"));
    EXPECT_EQ(2u, glue.keyToPerson.size());
    EXPECT_EQ(2u, glue.personToKey.size());
}

TEST(PersonKeys, anyTextReceivesOneAndIsKeptAsItIs) {
    ViewerGlue glue;
    EXPECT_EQ(0, glue.getKeyFromPerson(""));
    EXPECT_EQ(1, glue.getKeyFromPerson("abc"));
    EXPECT_EQ(2, glue.getKeyFromPerson("17"));
    EXPECT_EQ(3, glue.getKeyFromPerson("017"));
    EXPECT_EQ("", glue.personOfKey(0));
    EXPECT_EQ("017", glue.personOfKey(3));
}

TEST(PersonKeys, stayTheSameWhileManyOthersCome) {
    constexpr int kCount = 5000;
    ViewerGlue glue;
    for (int id = 0; id < kCount; ++id) ASSERT_EQ(id, glue.keyOfNumber(id * 7 - kCount));
    for (int id = 0; id < kCount; ++id) {
        ASSERT_EQ(id, glue.getKeyFromPerson(std::to_string(id * 7 - kCount)));
        ASSERT_EQ(id * 7 - kCount, glue.numberOfKey(id));
    }
    EXPECT_EQ(kCount, glue.keyOfNumber(kCount * 7));
}

// A table half full, with every second place taken: a search must find one of the others.
TEST(PersonKeys, ofNumbersThatFallOnEverySecondPlaceAreFound) {
    const auto fallsOnAnEvenPlace = [](int id) {
        return ((static_cast<std::uint32_t>(id) * std::uint64_t{0x9E3779B97F4A7C15}) >> 32) % 2 == 0;
    };
    std::vector<int> ids;
    for (int id = 1; ids.size() < 1000; ++id) {
        if (fallsOnAnEvenPlace(id)) ids.push_back(id);
    }
    ViewerGlue glue;
    int key = 0;
    for (const int id : ids) ASSERT_EQ(key++, glue.keyOfNumber(id));
    key = 0;
    for (const int id : ids) ASSERT_EQ(key++, glue.keyOfNumber(id));
}

TEST(PersonKeys, bothTablesMirrorEachOther) {
    ViewerGlue glue;
    for (const char* text : {"17", "-1", "42", "-2", "17"}) glue.getKeyFromPerson(text);
    ASSERT_EQ(4u, glue.keyToPerson.size());
    ASSERT_EQ(4u, glue.personToKey.size());
    for (const auto& [key, text] : glue.keyToPerson) EXPECT_EQ(key, glue.personToKey.at(text));
}

TEST(PersonKeys, tablesStartEmptyWithElevenBucketsAndAtMostOneEntryForEach) {
    const ViewerGlue glue;
    EXPECT_TRUE(glue.keyToPerson.empty());
    EXPECT_TRUE(glue.personToKey.empty());
    EXPECT_TRUE(glue.addNodes.empty());
    EXPECT_LE(11u, glue.keyToPerson.bucket_count());
    EXPECT_LE(11u, glue.personToKey.bucket_count());
    EXPECT_LE(11u, glue.addNodes.bucket_count());
    EXPECT_EQ(1.0f, glue.keyToPerson.max_load_factor());
    EXPECT_EQ(1.0f, glue.personToKey.max_load_factor());
    EXPECT_EQ(1.0f, glue.addNodes.max_load_factor());
}

TEST(PersonKeys, unknownKeyFailsByNameAndAddsNothing) {
    ViewerGlue glue;
    glue.getKeyFromPerson("17");
    EXPECT_EQ(kUnknownKeyFailure, failureOf<std::out_of_range>([&] { glue.personOfKey(1); }));
    EXPECT_EQ(kUnknownKeyFailure, failureOf<std::out_of_range>([&] { glue.personOfKey(-1); }));
    EXPECT_EQ(1u, glue.keyToPerson.size());
}

TEST(AddNodeRecords, holdWhatTheyWereMadeOf) {
    ViewerGlue glue;
    glue.addAddNodeValue("-1", true, "17", "-2");
    const AddNodeValues record = glue.getAddNodeValue("-1");
    EXPECT_TRUE(record.male);
    EXPECT_EQ("-1", record.addNodeText);
    EXPECT_EQ("17", record.childText);
    EXPECT_EQ("-2", record.otherParentText);
}

TEST(AddNodeRecords, firstRecordOfATextStands) {
    ViewerGlue glue;
    glue.addAddNodeValue("-1", true, "17", "-2");
    glue.addAddNodeValue("-1", false, "99", "3");
    const AddNodeValues record = glue.getAddNodeValue("-1");
    EXPECT_TRUE(record.male);
    EXPECT_EQ("17", record.childText);
    EXPECT_EQ("-2", record.otherParentText);
    EXPECT_EQ(1u, glue.addNodes.size());
}

TEST(AddNodeRecords, areHandedOutAsCopies) {
    ViewerGlue glue;
    glue.addAddNodeValue("-1", true, "17", "-2");
    AddNodeValues copy = glue.getAddNodeValue("-1");
    copy.childText = "changed";
    EXPECT_EQ("17", glue.getAddNodeValue("-1").childText);
}

TEST(AddNodeRecords, unknownTextFailsByNameAndAddsNothing) {
    ViewerGlue glue;
    EXPECT_EQ(kUnknownKeyFailure, failureOf<std::out_of_range>([&] { glue.getAddNodeValue("-1"); }));
    EXPECT_TRUE(glue.addNodes.empty());
}

TEST(AddNodeRecords, startAsAMissingMotherOfNobody) {
    const AddNodeValues record;
    EXPECT_FALSE(record.male);
    EXPECT_EQ("", record.addNodeText);
    EXPECT_EQ("", record.childText);
    EXPECT_EQ("", record.otherParentText);
}

TEST(AddNodeRecords, ofATextThatIsNoNumberAreFoundByIt) {
    ViewerGlue glue;
    EXPECT_EQ(kUnknownKeyFailure, failureOf<std::out_of_range>([&glue] { glue.getAddNodeValue("abc"); }));
    glue.addAddNodeValue("abc", true, "17", "42");
    EXPECT_EQ("17", glue.getAddNodeValue("abc").childText);
    const int key = glue.getKeyFromPerson("abc");
    EXPECT_TRUE(glue.addNodeIsMale(key));
    EXPECT_EQ("17", glue.childTextOfAddNode(key));
    EXPECT_EQ("42", glue.getAddNodeValue("abc").otherParentText);
    EXPECT_EQ(1u, glue.addNodes.size());
}

TEST(AddNodeRecords, firstOneStandsWhetherItCameByTextOrByKey) {
    ViewerGlue glue;
    const int byText = glue.getKeyFromPerson("abc");
    const int byKey = glue.getKeyFromPerson("def");
    const int child = glue.getKeyFromPerson("17");
    glue.addAddNodeValue("abc", true, "17", "42");
    glue.addAddNode(byText, false, child, child);
    glue.addAddNode(byKey, false, child, byText);
    glue.addAddNodeValue("def", true, "1", "2");
    EXPECT_TRUE(glue.addNodeIsMale(byText));
    EXPECT_FALSE(glue.addNodeIsMale(byKey));
    EXPECT_EQ("42", glue.getAddNodeValue("abc").otherParentText);
    EXPECT_EQ("abc", glue.getAddNodeValue("def").otherParentText);
    EXPECT_EQ("17", glue.getAddNodeValue("def").childText);
    EXPECT_EQ(2u, glue.addNodes.size());
}

}  // namespace
