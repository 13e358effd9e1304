// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What a search finds in the records of a file, and what it says of where.

#include <string>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <olvane/kin/PersonIndex.h>
#include <olvane/source/GedcomSearchTexts.h>

#include "GedcomText.h"

namespace olvane::gedcom::test {
namespace {

GedcomData readWithFacts(const std::string& records) {
    ReadOptions options;
    options.facts = true;
    return readGedcomBytes(document(records), "test.ged", options);
}

// "2 marriedName Darwin; 3 place Kew, Surrey"
std::string found(const GedcomData& data, const std::string& text) {
    const GedcomSearchTexts texts(data);
    std::string out;
    for (const kin::SearchHit& hit : kin::PersonIndex(texts).find(text)) {
        out += (out.empty() ? "" : "; ") + std::to_string(hit.id);
        for (const kin::SearchReason& reason : hit.reasons) {
            const kin::WrittenReason written = kin::writtenReason(texts, hit, reason);
            out += std::string(" ") + kin::nameOf(reason.in) + " " + written.text;
            if (!written.label.empty()) out += " (" + written.label + ")";
        }
    }
    return out;
}

TEST(GedcomSearchTexts, aWomanIsFoundByHerHusbandsSurnameAndByMarriedNames) {
    const GedcomData data = readWithFacts(
        "0 @I1@ INDI\n1 NAME Charles /Darwin/\n1 SEX M\n1 FAMS @F1@\n"
        "0 @I2@ INDI\n1 NAME Emma /Wedgwood/\n1 SEX F\n1 FAMS @F1@\n"
        "0 @I3@ INDI\n1 NAME Ellen /Smith/\n1 SEX F\n1 NAME Ellen /Hara/\n2 TYPE MARRIED\n"
        "0 @F1@ FAM\n1 HUSB @I1@\n1 WIFE @I2@\n");
    EXPECT_EQ(found(data, "darwin"), "1 name Charles Darwin; 2 marriedName Darwin");
    EXPECT_EQ(found(data, "wedgwood"), "2 name Emma Wedgwood") << "a man has no name of his wife's";
    EXPECT_EQ(found(data, "hara ellen"), "3 marriedName Hara name Ellen Smith");
}

TEST(GedcomSearchTexts, titlesNicknamesPlacesFactsAndYearsAreFoundByTheirTags) {
    const GedcomData data = readWithFacts(
        "0 @I1@ INDI\n1 NAME Dr. Ada /Byron/ Jr.\n2 NPFX Dr.\n2 NSFX Jr.\n2 NICK Countess\n1 SEX F\n"
        "1 BIRT\n2 DATE 10 DEC 1815\n2 PLAC Marylebone, London\n1 TITL Lady Lovelace\n"
        "1 OCCU Mathematician\n2 DATE 1843\n1 FAMS @F1@\n"
        "0 @F1@ FAM\n1 WIFE @I1@\n1 MARR\n2 DATE 1835\n2 PLAC Ockham\n");
    EXPECT_EQ(found(data, "countess"), "1 nickname Countess");
    EXPECT_EQ(found(data, "lovelace"), "1 title Lady Lovelace (TITL)");
    EXPECT_EQ(found(data, "marylebone"), "1 place Marylebone, London (BIRT)");
    EXPECT_EQ(found(data, "ockham"), "1 place Ockham (MARR)");
    EXPECT_EQ(found(data, "mathematician"), "1 other Mathematician (OCCU)");
    EXPECT_EQ(found(data, "1815"), "1 birth 10 DEC 1815 (BIRT)");
    EXPECT_EQ(found(data, "1840-1845"), "1 other 1843 (OCCU)");
    EXPECT_EQ(found(data, "1835"), "1 other 1835 (MARR)");
    EXPECT_EQ(found(data, "i1"), "1 identifier ");
    EXPECT_EQ(found(data, "1900"), "");
}

}  // namespace
}  // namespace olvane::gedcom::test
