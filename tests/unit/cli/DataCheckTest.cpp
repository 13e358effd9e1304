// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Every rule of the data check, with a family in which it has something to say, and the nearest one in which it has not.

#include <olvane/source/GedcomCheck.h>

#include <algorithm>
#include <ostream>
#include <string>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <olvane/gedcom/GedcomReader.h>

#include <cli/AgeLimits.h>

namespace olvane::cli {
namespace {

using Kind = kin::RemarkKind;

gedcom::GedcomData fileOf(const std::string& records) {
    return gedcom::readGedcomBytes("0 HEAD\n1 GEDC\n2 VERS 5.5.1\n1 CHAR UTF-8\n" + records + "0 TRLR\n",
                                   "a.ged");
}

std::string kindsIn(const std::string& records) {
    std::string kinds;
    for (const gedcom::FileRemark& finding : gedcom::checkData(fileOf(records))) {
        kinds += (kinds.empty() ? "" : " ") + std::string(finding.kind());
    }
    return kinds;
}

std::string person(const std::string& xref, const std::string& lines) {
    return "0 @" + xref + "@ INDI\n1 NAME " + xref + " /Test/\n" + lines;
}

std::string event(const std::string& tag, const std::string& date) {
    return date.empty() ? std::string() : "1 " + tag + "\n2 DATE " + date + "\n";
}

// A child and a parent with these dates, well linked.
std::string parentAndChild(const std::string& slot, const std::string& parentBirth,
                           const std::string& parentDeath, const std::string& childBirth) {
    return person("P", event("BIRT", parentBirth) + event("DEAT", parentDeath) + "1 FAMS @F@\n") +
           person("C", event("BIRT", childBirth) + "1 FAMC @F@\n") + "0 @F@ FAM\n1 " + slot +
           " @P@\n1 CHIL @C@\n";
}

std::string couple(const std::string& birth, const std::string& death, const std::string& marriage) {
    return person("P", event("BIRT", birth) + event("DEAT", death) + "1 FAMS @F@\n") +
           "0 @F@ FAM\n1 HUSB @P@\n" + event("MARR", marriage);
}

std::string life(const std::string& birth, const std::string& death) {
    return person("P", event("BIRT", birth) + event("DEAT", death));
}

struct Rule {
    const char* name;
    std::string appears;  // a family in which the rule alone has something to say
    std::string absent;   // one in which none has
    Kind kind;
};

std::ostream& operator<<(std::ostream& out, const Rule& rule) {
    return out << rule.name;
}

class DataCheck : public ::testing::TestWithParam<Rule> {};

TEST_P(DataCheck, reportsWhatIsOdd) {
    EXPECT_EQ(kindsIn(GetParam().appears), nameOf(GetParam().kind)) << GetParam().appears;
}

TEST_P(DataCheck, keepsQuietOtherwise) {
    EXPECT_EQ(kindsIn(GetParam().absent), "") << GetParam().absent;
}

const std::string kLinked =
    person("P", "1 FAMS @F@\n") + person("C", "1 FAMC @F@\n") + "0 @F@ FAM\n1 HUSB @P@\n1 CHIL @C@\n";

std::vector<Rule> rules() {
    return {
        {"childNotListed",
         person("P", "1 FAMS @F@\n") + person("C", "1 FAMC @F@\n") + "0 @F@ FAM\n1 HUSB @P@\n", kLinked,
         Kind::childNotListed},
        {"parentsNotNamed",
         person("P", "1 FAMS @F@\n") + person("C", "") + "0 @F@ FAM\n1 HUSB @P@\n1 CHIL @C@\n", kLinked,
         Kind::parentsNotNamed},
        {"partnerNotNamed",
         person("P", "1 FAMS @F@\n") + person("C", "1 FAMC @F@\n") + "0 @F@ FAM\n1 CHIL @C@\n", kLinked,
         Kind::partnerNotNamed},
        {"marriageNotNamed",
         person("P", "") + person("C", "1 FAMC @F@\n") + "0 @F@ FAM\n1 HUSB @P@\n1 CHIL @C@\n", kLinked,
         Kind::marriageNotNamed},
        {"severalBirthFamilies",
         person("C", "1 FAMC @F@\n1 FAMC @G@\n2 PEDI birth\n") +
             "0 @F@ FAM\n1 CHIL @C@\n0 @G@ FAM\n1 CHIL @C@\n",
         person("C", "1 FAMC @F@\n1 FAMC @G@\n2 PEDI adopted\n") +
             "0 @F@ FAM\n1 CHIL @C@\n0 @G@ FAM\n1 CHIL @C@\n",
         Kind::severalBirthFamilies},
        {"diedBeforeBirth", life("1850", "1849"), life("1850", "1850"), Kind::diedBeforeBirth},
        {"diedBeforeBirthOfAbout", life("1850", "ABT 1844"), life("1850", "ABT 1845"), Kind::diedBeforeBirth},
        {"livedTooLong", life("1800", "1911"), life("1800", "1910"), Kind::livedTooLong},
        {"livedTooLongOfBefore", life("1800", "AFT 1911"), life("1800", "BEF 1990"), Kind::livedTooLong},
        {"bornBeforeParent", parentAndChild("HUSB", "1800", "", "1799"),
         parentAndChild("HUSB", "1800", "", "BEF 1850"), Kind::bornBeforeParent},
        {"parentTooYoung", parentAndChild("WIFE", "1800", "", "1811"),
         parentAndChild("WIFE", "1800", "", "1812"), Kind::parentTooYoung},
        {"motherTooOld", parentAndChild("WIFE", "1800", "", "1861"),
         parentAndChild("WIFE", "1800", "", "1860"), Kind::parentTooOld},
        {"fatherTooOld", parentAndChild("HUSB", "1800", "", "1891"),
         parentAndChild("HUSB", "1800", "", "1890"), Kind::parentTooOld},
        {"bornAfterMothersDeath", parentAndChild("WIFE", "1800", "1830", "1831"),
         parentAndChild("WIFE", "1800", "1830", "1830"), Kind::bornAfterParentsDeath},
        {"bornAfterFathersDeath", parentAndChild("HUSB", "1800", "1830", "1832"),
         parentAndChild("HUSB", "1800", "1830", "1831"), Kind::bornAfterParentsDeath},
        {"marriedBeforeBirth", couple("1800", "", "1799"), couple("1800", "", "1800"),
         Kind::marriedBeforeBirth},
        {"marriedAfterDeath", couple("1800", "1830", "1831"), couple("1800", "1830", "1830"),
         Kind::marriedAfterDeath},
        {"ownAncestor", person("A", "1 FAMC @F@\n1 FAMS @F@\n") + "0 @F@ FAM\n1 HUSB @A@\n1 CHIL @A@\n",
         kLinked, Kind::ownAncestor},
    };
}

INSTANTIATE_TEST_SUITE_P(Rule, DataCheck, ::testing::ValuesIn(rules()),
                         [](const auto& rule) { return std::string(rule.param.name); });

// So that a rule that is added gets its tests.
TEST(DataCheckRules, areAllTested) {
    std::vector<Kind> tested;
    for (const Rule& rule : rules()) tested.push_back(rule.kind);
    for (int kind = 0; kind <= static_cast<int>(Kind::ownAncestor); ++kind) {
        EXPECT_THAT(tested, ::testing::Contains(static_cast<Kind>(kind))) << nameOf(static_cast<Kind>(kind));
    }
}

TEST(DataCheckRules, nameTheRecordsConcernedAndTheLine) {
    const gedcom::GedcomData data = fileOf(parentAndChild("HUSB", "1800", "", "1799"));
    const auto findings = gedcom::checkData(data);
    ASSERT_EQ(findings.size(), 1U);
    EXPECT_THAT(findings[0].xrefs, ::testing::ElementsAre("C", "P"));
    EXPECT_EQ(findings[0].line, 10U);
    EXPECT_THAT(findings[0].persons, ::testing::ElementsAre(2, 1));
    EXPECT_EQ(gedcom::remarkText(data, findings[0], kin::Language::english),
              "@C@ C Test was born before the parent @P@ P Test");
    EXPECT_EQ(gedcom::remarkText(data, findings[0], kin::Language::german),
              "@C@ C Test wurde vor dem Elternteil @P@ P Test geboren");
}

TEST(DataCheckRules, stateTheLongestLifeThatTheLivingAreJudgedBy) {
    const gedcom::GedcomData data = fileOf(life("1700", "1900"));
    const auto findings = gedcom::checkData(data);
    ASSERT_EQ(findings.size(), 1U);
    EXPECT_EQ(gedcom::remarkText(data, findings[0], kin::Language::english),
              "@P@ P Test lived for more than " + std::to_string(kLongestLife) + " years");
}

}  // namespace
}  // namespace olvane::cli
