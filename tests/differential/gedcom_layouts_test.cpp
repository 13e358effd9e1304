// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Every person of a large real family, in both views: nobody fails to be laid out, and the engine agrees with
// the plain layout about each of them. The file's folder comes from OLVANE_GEDCOM_DIR.

#include <gtest/gtest.h>

#include <support/CaseRun.h>
#include <support/plain/PlainLayout.h>

#include <cstdlib>
#include <set>
#include <string>

#include "GedcomCase.h"

namespace {

constexpr std::size_t kPersonsOfRoyal92 = 3010;

class Royal92 : public testing::Test {
protected:
    void SetUp() override {
        const char* folder = std::getenv("OLVANE_GEDCOM_DIR");
        if (folder == nullptr) GTEST_SKIP() << "OLVANE_GEDCOM_DIR does not name a folder of GEDCOM files";
        family = support::caseOfGedcom(std::string(folder) + "/history/royal92.ged");
        persons = support::personsOf(family);
        ASSERT_EQ(persons.size(), kPersonsOfRoyal92);
    }

    support::CaseFile family;
    std::set<support::PersonId> persons;
};

TEST_F(Royal92, everyPersonLaysOutInTheFamilyViewAsThePlainLayoutSays) {
    for (const support::PersonId id : persons) {
        family.focus = id;
        const std::string text = support::layoutText(family);
        ASSERT_EQ(text.substr(0, text.find(':')), std::to_string(id));
        ASSERT_EQ(text.back(), ';');
        ASSERT_EQ("text " + text, plain::layOut(family, false, false).lines.at(0)) << "focus " << id;
    }
}

TEST_F(Royal92, everyPersonLaysOutInThePedigreeViewAsThePlainLayoutSays) {
    family.view = support::CaseView::pedigree;
    family.maxGenerations = 5;
    for (const support::PersonId id : persons) {
        family.focus = id;
        const std::string text = support::layoutText(family);
        ASSERT_EQ(text.substr(0, text.find(':')), std::to_string(id));
        ASSERT_EQ(text.back(), ';');
        ASSERT_EQ("text " + text, plain::layOut(family, false, false).lines.at(0)) << "focus " << id;
    }
}

}  // namespace
