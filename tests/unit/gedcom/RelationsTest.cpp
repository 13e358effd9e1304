// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Who is whose father, mother, spouse and child, by which record, and in which order.

#include <stdexcept>
#include <string>

#include <gtest/gtest.h>

#include "GedcomText.h"

namespace olvane::gedcom::test {
namespace {

TEST(Relations, aFamilyJoinsParentsAndChildren) {
    const GedcomData data =
        read(document("0 @I1@ INDI\n1 SEX M\n1 FAMS @F1@\n0 @I2@ INDI\n1 SEX F\n1 FAMS @F1@\n"
                      "0 @I3@ INDI\n1 FAMC @F1@\n0 @I4@ INDI\n1 SEX X\n1 FAMC @F1@\n"
                      "0 @F1@ FAM\n1 HUSB @I1@\n1 WIFE @I2@\n1 CHIL @I4@\n1 CHIL @I3@\n"));
    EXPECT_EQ(idsOf(data.spouses(1)), "2");
    EXPECT_EQ(idsOf(data.spouses(2)), "1");
    EXPECT_EQ(idsOf(data.children(1)), "4 3");
    EXPECT_EQ(data.person(3).father, 1U);
    EXPECT_EQ(data.person(3).mother, 2U);
    EXPECT_EQ(data.person(1).sex, Sex::male);
    EXPECT_EQ(data.person(2).sex, Sex::female);
    EXPECT_EQ(data.person(3).sex, Sex::other);
    EXPECT_EQ(data.person(4).sex, Sex::other);
    EXPECT_TRUE(data.diagnostics().empty());
}

TEST(Relations, idsCountPersonsInFileOrderWhateverTheirIdentifiers) {
    const GedcomData data =
        read(document("0 @Z@ INDI\n1 NAME A\n0 @N@ NOTE x\n0 INDI\n1 NAME B\n0 @A@ INDI\n1 NAME C\n"));
    EXPECT_EQ(namesOf(data), "A|B|C");
    EXPECT_EQ(data.person(2).xref, "");
    EXPECT_EQ(data.personByXref("@A@"), 3U);
    EXPECT_EQ(data.personByXref("Z"), 1U);
    EXPECT_EQ(data.personByXref("N"), 0U);
    EXPECT_EQ(data.personByXref(""), 0U);
    EXPECT_EQ(data.person(3).line, 11U);
}

// Family 1 has persons 1 and 2 as partners, family 2 persons 3 and 4; person 5 is the child.
std::string childOf(const std::string& links) {
    return document(
        std::string("0 @I1@ INDI\n0 @I2@ INDI\n0 @I3@ INDI\n0 @I4@ INDI\n0 @I5@ INDI\n")
            .append(links)
            .append("0 @F1@ FAM\n1 HUSB @I1@\n1 WIFE @I2@\n0 @F2@ FAM\n1 HUSB @I3@\n1 WIFE @I4@\n"));
}

PersonId fatherBy(const std::string& links) {
    return read(childOf(links)).person(5).father;
}

TEST(Relations, parentsAreOfTheFirstFamilyOfBirth) {
    EXPECT_EQ(fatherBy("1 FAMC @F1@\n1 FAMC @F2@\n"), 1U);
    EXPECT_EQ(fatherBy("1 FAMC @F1@\n2 PEDI adopted\n1 FAMC @F2@\n2 PEDI birth\n"), 3U);
    EXPECT_EQ(fatherBy("1 FAMC @F1@\n2 PEDI foster\n1 FAMC @F2@\n"), 3U);
    EXPECT_EQ(fatherBy("1 FAMC @F1@\n2 PEDI BIRTH\n1 FAMC @F2@\n"), 1U);
    EXPECT_EQ(fatherBy("1 FAMC @F1@\n2 PEDI\n1 FAMC @F2@\n2 PEDI birth\n"), 1U);
}

TEST(Relations, withoutAFamilyOfBirthTheFirstFamilyCounts) {
    EXPECT_EQ(fatherBy("1 FAMC @F2@\n2 PEDI ADOPTED\n1 FAMC @F1@\n2 PEDI FOSTER\n"), 3U);
    EXPECT_EQ(fatherBy("1 FAMC @F2@\n2 PEDI sealing\n"), 3U);
    EXPECT_EQ(fatherBy("1 FAMC @F2@\n2 PEDI _KIND\n"), 3U);
}

TEST(Relations, linksThatLeadNowhereAreNoFamily) {
    EXPECT_EQ(fatherBy("1 FAMC @VOID@\n1 FAMC @F2@\n2 PEDI adopted\n"), 3U);
    EXPECT_EQ(fatherBy("1 FAMC @F9@\n1 FAMC @F2@\n2 PEDI adopted\n"), 3U);
    EXPECT_EQ(fatherBy("1 FAMC @I1@\n"), 0U);
}

TEST(Relations, pedigreesAndLinesOfAllLinksAreKept) {
    const GedcomData data =
        read(childOf("1 FAMC @F1@\n2 PEDI adopted\n1 FAMC @F2@\n2 PEDI Foster\n1 FAMC @VOID@\n"));
    ASSERT_EQ(data.parentLinks(5).size(), 3U);
    EXPECT_EQ(data.parentLinks(5)[0].pedigree, Pedigree::adopted);
    EXPECT_EQ(data.parentLinks(5)[0].line, 11U);
    EXPECT_EQ(data.parentLinks(5)[1].pedigree, Pedigree::foster);
    EXPECT_EQ(data.parentLinks(5)[1].family, 2U);
    EXPECT_EQ(data.parentLinks(5)[2].pedigree, Pedigree::notGiven);
    EXPECT_EQ(data.parentLinks(5)[2].family, 0U);
}

TEST(Relations, aFamilyInAnAdoptionEventIsNoLink) {
    EXPECT_EQ(fatherBy("1 ADOP\n2 FAMC @F1@\n1 FAMC @F2@\n"), 3U);
}

TEST(Relations, oneSpouseInSeveralRecordsIsOneSpouse) {
    const GedcomData data = read(
        document("0 @I1@ INDI\n1 FAMS @F1@\n1 FAMS @F2@\n1 FAMS @F3@\n0 @I2@ INDI\n1 FAMS @F1@\n1 FAMS @F3@\n"
                 "0 @I3@ INDI\n1 FAMS @F2@\n0 @I4@ INDI\n0 @I5@ INDI\n"
                 "0 @F1@ FAM\n1 HUSB @I1@\n1 WIFE @I2@\n1 CHIL @I4@\n0 @F2@ FAM\n1 HUSB @I1@\n1 WIFE @I3@\n"
                 "0 @F3@ FAM\n1 HUSB @I1@\n1 WIFE @I2@\n1 CHIL @I5@\n1 CHIL @I4@\n"));
    EXPECT_EQ(idsOf(data.spouses(1)), "2 3");
    EXPECT_EQ(idsOf(data.children(1)), "4 5");
    EXPECT_EQ(idsOf(data.spouses(3)), "1");
    EXPECT_EQ(data.coupleLinks(1).size(), 3U);
}

TEST(Relations, aCoupleOfOneSexStandsByItsPlaceInTheRecord) {
    const std::string persons =
        "0 @I1@ INDI\n1 SEX F\n1 FAMS @F1@\n0 @I2@ INDI\n1 SEX F\n1 FAMS @F1@\n0 @I3@ INDI\n1 FAMC @F1@\n";
    const auto parents = [&persons](const std::string& family) {
        const GedcomData data = read(document(std::string(persons).append("0 @F1@ FAM\n").append(family)));
        EXPECT_EQ(idsOf(data.spouses(1)), "2") << family;
        EXPECT_EQ(idsOf(data.spouses(2)), "1") << family;
        return std::to_string(data.person(3).father)
            .append(" ")
            .append(std::to_string(data.person(3).mother));
    };
    EXPECT_EQ(parents("1 WIFE @I1@\n1 WIFE @I2@\n"), "1 2");
    EXPECT_EQ(parents("1 WIFE @I2@\n1 WIFE @I1@\n"), "2 1");
    EXPECT_EQ(parents("1 HUSB @I2@\n1 HUSB @I1@\n"), "2 1");
    EXPECT_EQ(parents("1 WIFE @I1@\n1 HUSB @I2@\n"), "2 1");
    EXPECT_EQ(parents("1 HUSB @I1@\n1 WIFE @I2@\n"), "1 2");
}

TEST(Relations, aThirdPartnerIsLeftOutAndReported) {
    const GedcomData data =
        read(document("0 @I1@ INDI\n1 FAMS @F1@\n0 @I2@ INDI\n1 FAMS @F1@\n0 @I3@ INDI\n"
                      "0 @F1@ FAM\n1 HUSB @I1@\n1 HUSB @I3@\n1 WIFE @I2@\n"));
    EXPECT_EQ(data.family(1).husband, 1U);
    EXPECT_EQ(data.family(1).wife, 2U);
    EXPECT_EQ(linesReported(data, DiagnosticKind::tooManyPartners), "13");
}

TEST(Relations, nobodyIsTheirOwnSpouse) {
    const GedcomData data =
        read(document("0 @I1@ INDI\n1 FAMS @F1@\n0 @F1@ FAM\n1 HUSB @I1@\n1 WIFE @I1@\n"));
    EXPECT_EQ(idsOf(data.spouses(1)), "");
    EXPECT_EQ(linesReported(data, DiagnosticKind::samePartners), "10");
}

TEST(Relations, aFamilyThatAloneNamesItsMembersIsFollowed) {
    const GedcomData data =
        read(document("0 @I1@ INDI\n1 SEX M\n0 @I2@ INDI\n0 @I3@ INDI\n0 @I4@ INDI\n"
                      "0 @F1@ FAM\n1 HUSB @I1@\n1 WIFE @I2@\n1 CHIL @I4@\n1 CHIL @I3@\n1 CHIL @I4@\n"));
    EXPECT_EQ(idsOf(data.spouses(1)), "2");
    EXPECT_EQ(idsOf(data.spouses(2)), "1");
    EXPECT_EQ(idsOf(data.children(1)), "4 3");
    EXPECT_EQ(data.person(3).father, 1U);
    EXPECT_EQ(data.person(4).mother, 2U);
    EXPECT_EQ(data.person(4).parentFamily, 1U);
    ASSERT_EQ(data.parentLinks(4).size(), 1U);
    EXPECT_TRUE(data.parentLinks(4)[0].isNamedByFamilyOnly);
    EXPECT_EQ(data.parentLinks(4)[0].line, 14U);
    EXPECT_EQ(linesReported(data, DiagnosticKind::oneSidedLink), "12 13 14 15");
    EXPECT_EQ(data.diagnostics()[0].severity, Severity::note);
}

TEST(Relations, personsWhoAloneNameTheirFamilyAreFollowed) {
    const GedcomData data = read(
        document("0 @I1@ INDI\n1 SEX F\n1 FAMS @F1@\n0 @I2@ INDI\n1 FAMS @F1@\n0 @I3@ INDI\n1 FAMC @F1@\n"
                 "0 @I4@ INDI\n1 FAMC @F1@\n0 @F1@ FAM\n1 CHIL @I4@\n"));
    EXPECT_EQ(data.family(1).wife, 1U);
    EXPECT_EQ(data.family(1).husband, 2U);
    EXPECT_EQ(idsOf(data.spouses(1)), "2");
    EXPECT_EQ(idsOf(data.children(2)), "4 3");
    EXPECT_EQ(data.person(3).mother, 1U);
    ASSERT_EQ(data.childLinks(1).size(), 2U);
    EXPECT_TRUE(data.childLinks(1)[1].isNamedByChildOnly);
    EXPECT_EQ(linesReported(data, DiagnosticKind::oneSidedLink), "8 10 12");
}

TEST(Relations, ownLinksComeFirstThenTheFamiliesInTheirOrder) {
    const GedcomData data =
        read(document("0 @I1@ INDI\n1 FAMS @F3@\n0 @I2@ INDI\n1 FAMC @F3@\n2 PEDI adopted\n"
                      "0 @F1@ FAM\n1 HUSB @I1@\n1 CHIL @I2@\n0 @F2@ FAM\n1 HUSB @I1@\n1 CHIL @I2@\n"
                      "0 @F3@ FAM\n1 HUSB @I1@\n1 CHIL @I2@\n"));
    std::string families;
    for (const FamilyLink& link : data.coupleLinks(1)) families += std::to_string(link.family);
    for (const FamilyLink& link : data.parentLinks(2)) families += std::to_string(link.family);
    EXPECT_EQ(families, "312312");
    EXPECT_EQ(data.person(2).parentFamily, 1U);
}

TEST(Relations, familiesThatContradictEachOtherAreBothKept) {
    const GedcomData data =
        read(document("0 @I1@ INDI\n1 FAMS @F1@\n0 @I2@ INDI\n1 FAMS @F2@\n0 @I3@ INDI\n1 FAMC @F2@\n"
                      "0 @F1@ FAM\n1 HUSB @I1@\n1 CHIL @I3@\n0 @F2@ FAM\n1 HUSB @I2@\n"));
    EXPECT_EQ(data.person(3).father, 2U);
    EXPECT_EQ(idsOf(data.children(1)), "3");
    EXPECT_EQ(idsOf(data.children(2)), "3");
    EXPECT_EQ(data.parentLinks(3).size(), 2U);
    EXPECT_EQ(linesReported(data, DiagnosticKind::contradictingLink), "14");
    EXPECT_EQ(linesReported(data, DiagnosticKind::oneSidedLink), "11");
}

TEST(Relations, anAdoptedChildOfTwoFamiliesIsNoContradiction) {
    const GedcomData data = read(document(
        "0 @I1@ INDI\n1 FAMC @F2@\n2 PEDI adopted\n0 @F1@ FAM\n1 CHIL @I1@\n0 @F2@ FAM\n1 CHIL @I1@\n"));
    EXPECT_EQ(linesReported(data, DiagnosticKind::contradictingLink), "");
    EXPECT_EQ(linesReported(data, DiagnosticKind::oneSidedLink), "10");
}

TEST(Relations, aPartnerWhomAFullFamilyDoesNotNameIsReported) {
    const GedcomData data =
        read(document("0 @I1@ INDI\n1 FAMS @F1@\n0 @I2@ INDI\n1 FAMS @F1@\n0 @I3@ INDI\n1 FAMS @F1@\n"
                      "0 @I4@ INDI\n1 FAMC @F1@\n0 @F1@ FAM\n1 HUSB @I1@\n1 WIFE @I2@\n1 CHIL @I4@\n"));
    EXPECT_EQ(linesReported(data, DiagnosticKind::contradictingLink), "11");
    EXPECT_EQ(idsOf(data.spouses(3)), "");
    EXPECT_EQ(idsOf(data.children(3)), "4");
}

TEST(Relations, aLoneParentStandsInTheSlotOfTheirSex) {
    const auto parents = [](const char* sex, const char* slot) {
        const GedcomData data =
            read(document(std::string("0 @I1@ INDI\n1 SEX ")
                              .append(sex)
                              .append("\n1 FAMS @F1@\n0 @I2@ INDI\n1 FAMC @F1@\n0 @F1@ FAM\n1 ")
                              .append(slot)
                              .append(" @I1@\n1 CHIL @I2@\n")));
        return std::to_string(data.person(2).father) + std::to_string(data.person(2).mother) + ":" +
               linesReported(data, DiagnosticKind::wrongSlot);
    };
    EXPECT_EQ(parents("M", "WIFE"), "10:12");
    EXPECT_EQ(parents("F", "HUSB"), "01:12");
    EXPECT_EQ(parents("M", "HUSB"), "10:");
    EXPECT_EQ(parents("F", "WIFE"), "01:");
    EXPECT_EQ(parents("X", "WIFE"), "01:");
    EXPECT_EQ(parents("U", "HUSB"), "10:");
}

TEST(Relations, aCoupleInEachOthersSlotsIsPutRight) {
    const std::string persons = "0 @I1@ INDI\n1 SEX F\n1 FAMS @F1@\n0 @I2@ INDI\n1 SEX M\n1 FAMS @F1@\n";
    const GedcomData data = read(document(persons + "0 @F1@ FAM\n1 HUSB @I1@\n1 WIFE @I2@\n"));
    EXPECT_EQ(data.family(1).husband, 2U);
    EXPECT_EQ(data.family(1).wife, 1U);
    EXPECT_EQ(data.family(1).wifeLine, 13U);
    EXPECT_EQ(linesReported(data, DiagnosticKind::wrongSlot), "13 14");
}

TEST(Relations, aFamilysWordOnItsChildCountsWhereTheChildHasNone) {
    const auto pedigreeBy = [](const std::string& ties, const std::string& own) {
        const GedcomData data = read(document("0 @I1@ INDI\n1 FAMC @F1@\n" + own +
                                              "0 @I2@ INDI\n0 @F1@ FAM\n1 HUSB @I2@\n1 CHIL @I1@\n" + ties));
        return data.parentLinks(1)[0].pedigree;
    };
    EXPECT_EQ(pedigreeBy("2 _FREL Adopted\n2 _MREL Adopted\n", ""), Pedigree::adopted);
    EXPECT_EQ(pedigreeBy("2 _FREL Step\n2 _MREL Natural\n", ""), Pedigree::birth);
    EXPECT_EQ(pedigreeBy("2 _FREL Natural\n2 _MREL step\n", ""), Pedigree::birth);
    EXPECT_EQ(pedigreeBy("2 _FREL step\n", ""), Pedigree::step);
    EXPECT_EQ(pedigreeBy("2 _FREL Unknown\n", ""), Pedigree::notGiven);
    EXPECT_EQ(pedigreeBy("2 _FREL Adopted\n", "2 PEDI birth\n"), Pedigree::birth);
    EXPECT_EQ(pedigreeBy("", "2 PEDI step\n"), Pedigree::step);
}

TEST(Relations, anAdoptionMakesItsFamilyTheAdoptiveOne) {
    const GedcomData data = read(childOf("1 ADOP Y\n2 FAMC @F1@\n3 ADOP BOTH\n1 FAMC @F1@\n1 FAMC @F2@\n"));
    EXPECT_EQ(data.parentLinks(5)[0].pedigree, Pedigree::adopted);
    EXPECT_EQ(data.parentLinks(5)[1].pedigree, Pedigree::notGiven);
    EXPECT_EQ(data.person(5).father, 3U);
    EXPECT_EQ(read(childOf("1 ADOP\n2 FAMC @F1@\n1 FAMC @F1@\n2 PEDI birth\n")).person(5).father, 1U);
}

// Time is linear however many claims of one side meet in one person or family.
TEST(Relations, manyLinksOfOneSideTakeLinearTime) {
    std::string records = "0 @I0@ INDI\n";
    for (int i = 1; i <= 20000; ++i) {
        const std::string number = std::to_string(i);
        records.append("0 @I").append(number).append("@ INDI\n1 FAMC @F0@\n1 FAMS @F0@\n");
        records.append("0 @F").append(number).append("@ FAM\n1 HUSB @I0@\n1 CHIL @I0@\n");
    }
    records.append("0 @F0@ FAM\n1 CHIL @I0@\n");
    const GedcomData data = read(document(records));
    EXPECT_EQ(data.childLinks(data.familyByXref("F0")).size(), 20001U);
    EXPECT_EQ(data.parentLinks(1).size(), 20001U);
    EXPECT_EQ(data.coupleLinks(1).size(), 20000U);
}

TEST(Relations, aFamilyMayHaveOneParent) {
    const GedcomData data = read(document(
        "0 @I1@ INDI\n1 FAMS @F1@\n0 @I2@ INDI\n1 FAMC @F1@\n0 @F1@ FAM\n1 WIFE @I1@\n1 CHIL @I2@\n"));
    EXPECT_EQ(data.person(2).father, 0U);
    EXPECT_EQ(data.person(2).mother, 1U);
    EXPECT_EQ(idsOf(data.spouses(1)), "");
    EXPECT_EQ(idsOf(data.children(1)), "2");
}

TEST(Relations, circlesAreData) {
    const GedcomData data =
        read(document("0 @I1@ INDI\n1 FAMC @F1@\n1 FAMS @F1@\n0 @F1@ FAM\n1 HUSB @I1@\n1 CHIL @I1@\n"));
    EXPECT_EQ(data.person(1).father, 1U);
    EXPECT_EQ(idsOf(data.children(1)), "1");
}

TEST(Relations, deathBurialCremationAndProbateMeanDead) {
    const GedcomData data =
        read(document("0 @I1@ INDI\n1 DEAT\n0 @I2@ INDI\n1 BURI\n0 @I3@ INDI\n1 CREM\n0 @I4@ INDI\n1 PROB\n0 "
                      "@I5@ INDI\n1 BIRT Y\n"
                      "0 @I6@ INDI\n1 NO DEAT\n0 @I7@ INDI\n1 EVEN\n2 DEAT\n"));
    std::string dead;
    for (const Person& person : data.persons()) dead.push_back(person.dead ? '+' : '-');
    EXPECT_EQ(dead, "++++---");
}

TEST(Relations, anEventThatDidNotHappenLeavesAPersonAlive) {
    const GedcomData data =
        read(document("0 @I1@ INDI\n1 DEAT N\n0 @I2@ INDI\n1 BURI N\n0 @I3@ INDI\n1 DEAT Y\n0 @I4@ INDI\n"
                      "1 DEAT N\n1 BURI\n"));
    std::string dead;
    for (const Person& person : data.persons()) dead.push_back(person.dead ? '+' : '-');
    EXPECT_EQ(dead, "--++");
}

TEST(Relations, theFirstEventWithADateGivesIt) {
    const GedcomData data =
        read(document("0 @I1@ INDI\n1 BIRT\n2 PLAC here\n1 BIRT\n2 DATE 1801\n1 BIRT\n2 DATE 1802\n1 DEAT\n2 "
                      "DATE 1870\n2 SOUR x\n3 DATE 1999\n"));
    EXPECT_EQ(data.person(1).birth.year, 1801);
    EXPECT_EQ(data.person(1).birth.line, 10U);
    EXPECT_EQ(data.person(1).death.year, 1870);
}

TEST(Relations, aPhraseStandsInForAMissingDate) {
    const GedcomData data = read(
        document7("0 @I1@ INDI\n1 BIRT\n2 DATE\n3 PHRASE on a Sunday\n1 DEAT\n2 DATE 1900\n3 PHRASE x\n"));
    EXPECT_EQ(displayYear(data.person(1).birth), "on a Sunday");
    EXPECT_EQ(displayYear(data.person(1).death), "1900");
}

TEST(Relations, aPhraseThatIsADateIsReadAsOne) {
    const GedcomData data = read(document7("0 @I1@ INDI\n1 BIRT\n2 DATE\n3 PHRASE 5 MAY 1900\n"));
    EXPECT_EQ(sortText(data.person(1).birth), "1900-05-05");
}

TEST(Relations, whatDidNotHappenHasNoDate) {
    const GedcomData data =
        read(document("0 @I1@ INDI\n1 BIRT N\n2 DATE 1900\n0 @F1@ FAM\n1 MARR N\n2 DATE 1920\n"));
    EXPECT_FALSE(data.person(1).birth.isGiven());
    EXPECT_FALSE(data.family(1).married);
    EXPECT_FALSE(data.family(1).marriage.isGiven());
}

TEST(Relations, divorceEndsAMarriageUntilTheNext) {
    const GedcomData data =
        read(document("0 @F1@ FAM\n1 MARR\n2 DATE 1900\n1 DIV\n0 @F2@ FAM\n1 MARR\n1 DIV\n1 MARR\n0 @F3@ "
                      "FAM\n1 DIV\n1 MARR\n2 DATE 1910\n"
                      "0 @F4@ FAM\n1 MARR\n0 @F5@ FAM\n1 DIV N\n0 @F6@ FAM\n1 MARR\n1 DIV\n1 MARR\n1 DIV\n"));
    std::string ended;
    for (const Family& family : data.families()) ended.push_back(family.divorced ? '+' : '-');
    EXPECT_EQ(ended, "+-+--+");
    EXPECT_EQ(data.family(1).marriage.year, 1900);
    EXPECT_TRUE(data.family(4).married);
    EXPECT_FALSE(data.family(5).married);
    EXPECT_EQ(data.familyByXref("F3"), 3U);
}

TEST(Relations, idsOutsideTheFileThrow) {
    const GedcomData data = read(document("0 @I1@ INDI\n"));
    EXPECT_THROW(data.person(0), std::out_of_range);
    EXPECT_THROW(data.person(2), std::out_of_range);
    EXPECT_THROW(data.family(1), std::out_of_range);
    EXPECT_THROW(data.spouses(2), std::out_of_range);
}

}  // namespace
}  // namespace olvane::gedcom::test
