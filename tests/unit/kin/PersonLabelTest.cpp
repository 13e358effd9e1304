// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// How a person is called in a picture, and what stands there of birth and death.

#include <set>
#include <string>
#include <string_view>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <olvane/kin/PersonLabel.h>

namespace olvane::kin {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

PersonLabel lived(const std::string& birth, const std::string& death, bool dead = false) {
    PersonLabel label;
    label.birth = birth;
    label.death = death;
    label.dead = dead;
    return label;
}

TEST(PersonLabel, everyLanguageSaysWhoHasNoNameAndWhoIsLiving) {
    std::set<std::string_view> words;
    PersonLabel hidden;
    hidden.given = "Ada";
    hidden.living = true;
    for (const Language language : kLanguages) {
        words.insert(unnamedText(language));
        words.insert(livingText(language));
        EXPECT_EQ(fullName({}, language), unnamedText(language));
        EXPECT_EQ(fullName(hidden, language), livingText(language));
    }
    EXPECT_EQ(words.size(), 2 * kLanguages.size());
    EXPECT_EQ(words.count(""), 0U);
}

TEST(PersonLabel, birthAndDeathStandInALineEach) {
    PersonLabel label = lived("1819", "~1880");
    EXPECT_THAT(lifeLines(label), ElementsAre("* 1819", "† ~1880"));
    EXPECT_EQ(lifeLine(label), "* 1819  † ~1880");
    EXPECT_EQ(lifeWords(label), "* 1819, † ~1880");
    EXPECT_EQ(shortLifeLines(label), lifeLines(label));
    label.shortDeath = "1880";
    EXPECT_THAT(shortLifeLines(label), ElementsAre("* 1819", "† 1880"));
    label.life = "1819 – about 1880";
    EXPECT_EQ(lifeWords(label), "1819 – about 1880");
    label.living = true;
    EXPECT_THAT(lifeLines(label), IsEmpty());
    EXPECT_EQ(lifeWords(label), "");
}

TEST(PersonLabel, aDeathWithoutADateIsACross) {
    EXPECT_THAT(lifeLines(lived("1819", "", true)), ElementsAre("* 1819", "†"));
    EXPECT_THAT(lifeLines(lived("", "1880", true)), ElementsAre("† 1880"));
    EXPECT_THAT(lifeLines(lived("", "", true)), ElementsAre("†"));
    EXPECT_THAT(lifeLines({}), IsEmpty());
}

}  // namespace
}  // namespace olvane::kin
