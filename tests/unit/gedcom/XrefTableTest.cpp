// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Identifiers of every shape find their places again, numbered or not, near or far.

#include <string>
#include <vector>

#include <gtest/gtest.h>

#include <olvane/gedcom/XrefTableInternal.h>

namespace olvane::gedcom {
namespace {

// Each identifier gets a place of its own, which is found again when all are there.
void expectDistinct(const std::vector<std::string>& xrefs) {
    XrefTable table;
    std::vector<XrefPlace> places;
    for (const std::string& xref : xrefs) {
        EXPECT_EQ(table.find(xref), 0U) << xref;
        places.push_back(table.place(xref));
    }
    for (std::size_t at = 0; at < xrefs.size(); ++at) {
        EXPECT_EQ(places[at], at + 1);
        EXPECT_EQ(table.find(xrefs[at]), places[at]) << xrefs[at];
        EXPECT_EQ(table.place(xrefs[at]), places[at]) << xrefs[at];
        EXPECT_EQ(table.at(places[at]).xref, xrefs[at]);
    }
}

TEST(XrefTable, numbersWithAndWithoutZerosAreDifferent) {
    expectDistinct(
        {"I1", "I01", "I001", "F1", "1", "01", "I", "X-1", "I1X", "I10", "I010", "0", "00", "I0", "I00"});
}

TEST(XrefTable, numbersFarAheadAreFoundWhenTheListReachesThem) {
    std::vector<std::string> xrefs = {"I90000", "I2000", "I999999999", "I9999999999",
                                      "I123456789012345678901234567890"};
    for (int number = 1; number < 1500; ++number)
        xrefs.push_back(std::string("I").append(std::to_string(number)));
    for (int number = 2001; number < 95000; number += 7)
        xrefs.push_back(std::string("I").append(std::to_string(number)));
    std::erase(xrefs, "I90000");
    xrefs.insert(xrefs.begin(), "I90000");
    expectDistinct(xrefs);
}

TEST(XrefTable, moreBeginningsThanListsGoByHash) {
    std::vector<std::string> xrefs;
    for (char letter = 'A'; letter <= 'Z'; ++letter) {
        for (int number = 0; number < 200; ++number) {
            xrefs.push_back(std::string(1, letter).append(std::to_string(number)));
        }
    }
    expectDistinct(xrefs);
}

TEST(XrefTable, bareXrefTakesOffBothAtsOnly) {
    EXPECT_EQ(bareXref("@I1@"), "I1");
    EXPECT_EQ(bareXref(" I1 "), "I1");
    EXPECT_EQ(bareXref("@I1"), "@I1");
    EXPECT_EQ(bareXref("@"), "@");
}

}  // namespace
}  // namespace olvane::gedcom
