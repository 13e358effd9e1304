// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The index beside a search without one, over random families and what somebody may type to find their members.

#include <olvane/kin/PersonIndex.h>

#include <gtest/gtest.h>

#include <random>
#include <string>
#include <vector>

#include "PlainSearch.h"

namespace olvane::kin::test {
namespace {

constexpr int kFamilies = 25;
constexpr int kSearches = 60;  // of each family

class Random {
public:
    explicit Random(unsigned seed) : next_(seed) {}
    // From 0 up to count.
    std::size_t below(std::size_t count) { return next_() % count; }
    bool isOneIn(std::size_t count) { return below(count) == 0; }
    template <class List>
    auto oneOf(const List& list) {
        return list[below(std::size(list))];
    }

private:
    std::mt19937 next_;
};

// Few parts, so that words begin, hold and resemble one another.
std::string randomWord(Random& random) {
    static const std::vector<std::string> kLatin{"an", "na",     "ma", "ri",      "e", "\u00e9l",
                                                 "ss", "\u00df", "O'", "D\u2019", "k"};
    static const std::vector<std::string> kCyrillic{"\u043c\u0430", "\u0440\u0438", "\u044f", "\u0438",
                                                    "\u0430\u0440"};
    const std::vector<std::string>& parts = random.isOneIn(6) ? kCyrillic : kLatin;
    std::string word;
    for (std::size_t n = 1 + random.below(4); n > 0; --n) word += random.oneOf(parts);
    return word;
}

std::string randomWords(Random& random) {
    std::string words = randomWord(random);
    while (random.isOneIn(3)) words += (random.isOneIn(4) ? ", " : " ") + randomWord(random);
    return words;
}

std::string randomDate(Random& random) {
    std::string year = std::to_string(1798 + random.below(8));
    switch (random.below(6)) {
        case 0:
            return "";
        case 1:
            return year + "/" + std::to_string(1800 + random.below(12));
        case 2:
            return "ABT " + year;
        case 3:
            return "-0044";
        default:
            return year;
    }
}

Family randomFamily(Random& random) {
    constexpr NameKind kKinds[] = {NameKind::full,   NameKind::given,    NameKind::surname, NameKind::prefix,
                                   NameKind::suffix, NameKind::nickname, NameKind::married};
    const auto count = static_cast<std::int64_t>(random.below(30));
    Family family;
    for (std::int64_t id = 1; id <= count; ++id) {
        const std::string birth = randomDate(random);
        const std::string death = randomDate(random);
        PersonRow row;
        row.id = id;
        row.sex = random.isOneIn(2) ? Sex::female : Sex::male;
        row.birth = birth;
        row.birthWritten = birth;
        row.death = death;
        row.deathWritten = death;
        family.addPerson(row);
        std::vector<std::string> texts;
        for (std::size_t n = random.below(4); n > 0; --n) texts.push_back(randomWords(random));
        std::vector<NamePart> names;
        names.reserve(texts.size());
        for (const std::string& text : texts) names.push_back({random.oneOf(kKinds), text});
        family.setNames(id, names);
        family.setField(id, "xref", (random.isOneIn(5) ? "A" : "I") + std::to_string(random.below(40)));
        if (random.isOneIn(2)) family.setField(id, "birthPlace", randomWords(random));
        if (random.isOneIn(3)) family.setField(id, "occupation", randomWords(random));
    }
    for (std::int64_t id = 1; id + 1 <= count; id += 2) {
        const std::vector<std::int64_t> spouses{id + 1};
        family.setSpouses(id, spouses, 0);
        const std::vector<std::int64_t> others{id};
        family.setSpouses(id + 1, others, 0);
    }
    return family;
}

std::string withOneSlip(Random& random, std::string word) {
    if (word.empty()) return word;
    const std::size_t at = random.below(word.size());
    if (static_cast<unsigned char>(word[at]) >= 0x80) return word.substr(0, word.size() - 2) + "\u0438";
    switch (random.below(4)) {
        case 0:
            return word.erase(at, 1);
        case 1:
            return word.insert(at, 1, 'q');
        case 2:
            word[at] = 'q';
            return word;
        default:
            if (at + 1 < word.size() && static_cast<unsigned char>(word[at + 1]) < 0x80)
                std::swap(word[at], word[at + 1]);
            return word;
    }
}

std::string randomPiece(Random& random) {
    std::string year = std::to_string(1796 + random.below(14));
    switch (random.below(9)) {
        case 0:
            return withOneSlip(random, randomWord(random));
        case 1:
            return withOneSlip(random, randomWord(random) + randomWord(random));
        case 2:
            return year;
        case 3:
            return year + (random.isOneIn(2) ? "-" : "\u2013") + std::to_string(1796 + random.below(14));
        case 4:
            return year.substr(0, 1 + random.below(4));
        case 5:
            return random.oneOf(std::vector<std::string>{"a", "m", "\u0440", "e", "1"});
        default:
            return randomWord(random);
    }
}

std::string randomSearch(Random& random) {
    if (random.isOneIn(10))
        return random.oneOf(std::vector<std::string>{"I", "@I", "A", ""}) + std::to_string(random.below(40));
    if (random.isOneIn(20)) return "@I" + std::to_string(random.below(40)) + "@";
    std::string text = randomPiece(random);
    while (random.isOneIn(3)) text += (random.isOneIn(5) ? ", " : " ") + randomPiece(random);
    return text;
}

std::vector<std::string> linesOf(const std::vector<SearchHit>& hits) {
    std::vector<std::string> lines;
    for (const SearchHit& hit : hits) {
        std::string line = std::to_string(hit.id) + ":";
        for (const SearchReason& reason : hit.reasons) {
            line += std::string(line.ends_with(":") ? " " : ", ") + nameOf(reason.in) + " " +
                    nameOf(reason.fit) + " " + reason.word;
        }
        lines.push_back(line);
    }
    return lines;
}

TEST(PersonIndex, findsWhomASearchWithoutAnIndexFindsInTheSameOrderForTheSameReasons) {
    Random random(7);
    std::size_t found = 0;
    for (int i = 0; i < kFamilies; ++i) {
        const Family family = randomFamily(random);
        const FamilySearchTexts texts(family);
        const PersonIndex index(texts);
        for (int j = 0; j < kSearches; ++j) {
            const std::string text = randomSearch(random);
            const std::vector<std::string> plain = plainSearch(texts, text);
            found += plain.size();
            ASSERT_EQ(linesOf(index.find(text)), plain) << "family " << i << ", search \"" << text << "\"";
        }
    }
    EXPECT_GT(found, 3000U) << "searches that find nobody show nothing";
}

TEST(PersonIndex, isTheSameWhetherPersonsAreAddedAtOnceOrAFewAtATime) {
    Random random(11);
    for (int i = 0; i < kFamilies; ++i) {
        const Family family = randomFamily(random);
        const FamilySearchTexts texts(family);
        const PersonIndex atOnce(texts);
        PersonIndex slowly;
        std::size_t rounds = 1;
        while (!slowly.add(texts, 3)) ++rounds;
        EXPECT_EQ(rounds, std::max<std::size_t>(1, (texts.personCount() + 2) / 3));
        EXPECT_TRUE(slowly.add(texts, 3)) << "a full index stays full";
        for (int j = 0; j < 10; ++j) {
            const std::string text = randomSearch(random);
            EXPECT_EQ(linesOf(slowly.find(text)), linesOf(atOnce.find(text))) << text;
        }
    }
}

TEST(PersonIndex, findsThoseWhoAreInWhileOthersAreStillToCome) {
    Family family;
    for (const std::int64_t id : {1, 2}) {
        PersonRow row;
        row.id = id;
        family.addPerson(row);
        family.setNames(id, std::vector<NamePart>{{NameKind::full, "Emma Darwin"}});
    }
    const FamilySearchTexts texts(family);
    PersonIndex index;
    EXPECT_TRUE(index.find("emma").empty());
    EXPECT_FALSE(index.add(texts, 1));
    EXPECT_EQ(linesOf(index.find("emma")), (std::vector<std::string>{"1: name whole emma"}));
    EXPECT_TRUE(index.add(texts, 1));
    EXPECT_EQ(index.find("emma").size(), 2U);
}

Family familyNamed(const std::string& name) {
    Family family;
    PersonRow row;
    row.id = 1;
    family.addPerson(row);
    family.setNames(1, std::vector<NamePart>{{NameKind::full, name}});
    return family;
}

// Letters beyond ASCII share bytes with one another, which are no letters of their own.
TEST(PersonIndex, aSlipIsOfOneWholeLetterInEveryAlphabet) {
    const PersonIndex index(familyNamed("\u041c\u0430\u0440\u0438\u044f"));             // Мария
    EXPECT_EQ(index.find("\u041c\u0430\u0438\u0440\u044f").size(), 1U) << "exchanged";  // Маиря
    EXPECT_EQ(index.find("\u041c\u0430\u0440\u044f").size(), 1U) << "missing";          // Маря
    EXPECT_EQ(index.find("\u041c\u0430\u0440\u043a\u044f").size(), 1U) << "wrong";      // Маркя
    EXPECT_EQ(index.find("\u041c\u0430\u0440\u0438\u0438\u044f").size(), 1U) << "too many";
    // Two letters, of which each has a byte of the one that is meant.
    const PersonIndex other(familyNamed("\u0430\u0431\u0432\u0436"));  // абвж
    EXPECT_TRUE(other.find("\u0430\u0433\u0434\u0436").empty());       // агдж
    const PersonIndex rare(familyNamed("ab\U00020000cd"));
    EXPECT_EQ(rare.find("abcd").size(), 1U) << "a letter of four bytes is missing";
}

}  // namespace
}  // namespace olvane::kin::test
