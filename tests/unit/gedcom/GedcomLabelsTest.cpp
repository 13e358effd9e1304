// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What stands in a box and at a marriage line.

#include <string>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <olvane/gedcom/HiddenNames.h>
#include <olvane/source/GedcomLabels.h>

#include "GedcomText.h"

namespace olvane::gedcom::test {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

GedcomData dataOf(const std::string& records) {
    ReadOptions options;
    options.facts = true;
    return readGedcomBytes(document(records), "test.ged", options);
}

const char* const kCouple =
    "0 @A@ INDI\n1 NAME Ada /Berg/\n1 SEX F\n1 BIRT\n2 DATE 3 MAY 1819\n2 PLAC Bergen\n1 DEAT\n2 DATE ABT "
    "1890\n"
    "2 PLAC Oslo\n1 OCCU Weaver\n1 OCCU Singer\n1 FAMS @F@\n0 @B@ INDI\n1 NAME /Lund/ Nils\n1 SEX M\n1 FAMS "
    "@F@\n"
    "0 @C@ INDI\n0 @F@ FAM\n1 HUSB @B@\n1 WIFE @A@\n1 MARR\n2 DATE 1840\n";

TEST(GedcomLabels, namesYearsAndSexStandInEveryLabel) {
    const GedcomData data = dataOf(kCouple);
    const kin::PersonLabel ada = GedcomLabels(data).ofPerson(1);
    EXPECT_EQ(ada.given, "Ada");
    EXPECT_EQ(ada.surname, "Berg");
    EXPECT_FALSE(ada.surnameFirst);
    EXPECT_EQ(ada.birth, "1819");
    EXPECT_EQ(ada.death, "~1890");
    EXPECT_EQ(ada.sex, kin::Sex::female);
    EXPECT_FALSE(ada.living);
    EXPECT_THAT(ada.details, IsEmpty());
    EXPECT_TRUE(GedcomLabels(data).ofPerson(2).surnameFirst);
    EXPECT_EQ(kin::fullName(GedcomLabels(data).ofPerson(2)), "Lund Nils");
    EXPECT_EQ(kin::fullName(GedcomLabels(data).ofPerson(3)), "Name not known");
}

TEST(GedcomLabels, datesPlacesAndTheFirstOccupationStandWhereAskedFor) {
    const GedcomData data = dataOf(kCouple);
    ShownFacts shown;
    shown.dates = true;
    EXPECT_EQ(GedcomLabels(data, shown).ofPerson(1).birth, "3 May 1819");
    shown.places = true;
    EXPECT_THAT(GedcomLabels(data, shown).ofPerson(1).details, ElementsAre("* Bergen", "† Oslo"));
    shown.occupation = true;
    EXPECT_THAT(GedcomLabels(data, shown).ofPerson(1).details, ElementsAre("* Bergen", "† Oslo", "Weaver"));
}

TEST(GedcomLabels, datesAndLivesAreInTheLanguageOfTheReader) {
    const GedcomData data = dataOf(kCouple);
    ShownFacts shown;
    EXPECT_EQ(GedcomLabels(data, shown, {}, kin::Language::german).ofPerson(1).life, "1819 – um 1890");
    shown.dates = true;
    const kin::PersonLabel ada = GedcomLabels(data, shown, {}, kin::Language::german).ofPerson(1);
    EXPECT_EQ(kin::lifeLine(ada), "* 3. Mai 1819  † um 1890");
    EXPECT_EQ(kin::lifeWords(ada), "geboren 3. Mai 1819, gestorben um 1890");
    const kin::PersonLabel inSpanish = GedcomLabels(data, shown, {}, kin::Language::spanish).ofPerson(1);
    EXPECT_THAT(kin::lifeLines(inSpanish), ElementsAre("* 3 may 1819", "† hacia 1890"));
    EXPECT_THAT(kin::shortLifeLines(inSpanish), ElementsAre("* 1819", "† ~1890"));
}

TEST(GedcomLabels, aDeathWithoutADateIsACross) {
    const GedcomData data =
        dataOf("0 @A@ INDI\n1 BIRT\n2 DATE 1819\n1 DEAT Y\n0 @B@ INDI\n1 BURI\n0 @C@ INDI\n");
    const GedcomLabels labels(data);
    EXPECT_EQ(kin::lifeLine(labels.ofPerson(1)), "* 1819  †");
    EXPECT_EQ(kin::lifeLine(labels.ofPerson(2)), "†");
    EXPECT_EQ(kin::lifeLine(labels.ofPerson(3)), "");
    kin::PersonLabel hidden = labels.ofPerson(1);
    hidden.living = true;
    EXPECT_EQ(kin::lifeLine(hidden) + kin::lifeWords(hidden), "");
}

TEST(GedcomLabels, emptyLevelsOfAPlaceAreLeftOut) {
    const GedcomData data = dataOf("0 @A@ INDI\n1 BIRT\n2 PLAC Kew,,, England\n");
    ShownFacts shown;
    shown.places = true;
    EXPECT_THAT(GedcomLabels(data, shown).ofPerson(1).details, ElementsAre("* Kew, England"));
}

TEST(GedcomLabels, marriageHasItsYearWhereAskedFor) {
    const GedcomData data = dataOf(kCouple);
    EXPECT_EQ(GedcomLabels(data).ofFamily(1), "");
    ShownFacts shown;
    shown.marriage = true;
    EXPECT_EQ(GedcomLabels(data, shown).ofFamily(1), "1840");
}

TEST(GedcomLabels, hiddenPersonsAreLivingAndNamedByNobody) {
    const GedcomData data = dataOf(
        "0 @A@ INDI\n1 NAME Ada /Berg/\n0 @B@ INDI\n1 NAME Nils /Lund/\n1 BIRT\n2 DATE 1850\n"
        "2 PLAC House of Ada Berg\n");
    const std::vector<bool> hidden = {true, false};
    const HiddenNames names(data, hidden);
    ShownFacts shown;
    shown.places = true;
    const GedcomLabels labels(data, shown,
                              {hidden, [names](std::string_view text) { return names.shownPlace(text); },
                               [names](std::string_view text) { return names.shownText(text); }});
    const kin::PersonLabel ada = labels.ofPerson(1);
    EXPECT_TRUE(ada.living);
    EXPECT_EQ(kin::fullName(ada), "Living");
    EXPECT_EQ(ada.given + ada.surname, "");
    EXPECT_EQ(labels.ofPerson(2).birth, "1850");
    EXPECT_THAT(labels.ofPerson(2).details, IsEmpty());
}

TEST(GedcomLabels, textsOfAnyLengthGiveShortLabels) {
    std::string letters;
    for (int i = 0; i < 100000; ++i) letters += "é";
    const GedcomData data = dataOf("0 @A@ INDI\n1 NAME " + letters + " /" + letters + "/\n1 BIRT\n2 DATE " +
                                   letters + "\n2 PLAC " + letters + "\n");
    ShownFacts shown;
    shown.places = true;
    const kin::PersonLabel label = GedcomLabels(data, shown).ofPerson(1);
    ASSERT_EQ(label.details.size(), 1u);
    for (const std::string& text : {label.given, label.surname, label.birth, label.details[0]}) {
        EXPECT_FALSE(text.empty());
        EXPECT_LE(text.size(), GedcomLabels::kMostLabelBytes + 10);
        EXPECT_TRUE(text.ends_with("é"));
    }
}

TEST(GedcomLabels, nobodyHasNoLabel) {
    const GedcomData data = dataOf(kCouple);
    EXPECT_THROW(GedcomLabels(data).ofPerson(0), std::out_of_range);
    EXPECT_THROW(GedcomLabels(data).ofPerson(4), std::out_of_range);
}

}  // namespace
}  // namespace olvane::gedcom::test
