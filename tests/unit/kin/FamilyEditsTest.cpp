// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Edits of a table: by example, at random against a plain family, and with memory that runs out at every moment.

#include <olvane/kin/Family.h>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <functional>
#include <random>
#include <string>
#include <string_view>
#include <thread>
#include <utility>
#include <vector>

#include <support/PlainFamily.h>
#include <unit/boundary/AllocationCountdown.h>

namespace {

using olvane::Family;
using olvane::FamilyChild;
using olvane::FamilyError;
using olvane::FamilyRow;
using olvane::NameKind;
using olvane::NamePart;
using olvane::PersonRow;
using olvane::kin::ChildKind;
using olvane::kin::Sex;
using olvane::kin::UnionState;
using support::PlainFamily;
using testing::ElementsAre;
using testing::IsEmpty;

typedef std::vector<std::int64_t> Ids;

PersonRow person(std::int64_t id, std::int64_t father = 0, std::int64_t mother = 0) {
    PersonRow row;
    row.id = id;
    row.father = father;
    row.mother = mother;
    return row;
}

FamilyRow couple(std::int64_t number, std::int64_t partner0, std::int64_t partner1) {
    FamilyRow row;
    row.number = number;
    row.partner0 = partner0;
    row.partner1 = partner1;
    return row;
}

Family persons(std::int64_t count) {
    Family family;
    for (std::int64_t id = 1; id <= count; ++id) family.addPerson(person(id));
    return family;
}

std::string refusalOf(const std::function<void()>& edit) {
    try {
        edit();
    } catch (const FamilyError& error) {
        return error.what();
    }
    return "nothing is refused";
}

TEST(FamilyEdits, aNewPersonEntersTheListsOfItsParents) {
    Family family = persons(2);
    family.addPerson(person(3, 1, 2));
    EXPECT_THAT(family.children(1), ElementsAre(3));
    EXPECT_THAT(family.children(2), ElementsAre(3));
    family.setPerson(person(3, 2, 0));
    EXPECT_THAT(family.children(1), IsEmpty());
    EXPECT_THAT(family.children(2), ElementsAre(3));
}

TEST(FamilyEdits, somebodyMayBeTheirOwnParent) {
    Family family;
    family.addPerson(person(7, 7, 7));
    EXPECT_THAT(family.children(7), ElementsAre(7));
    family.removePerson(7);
    EXPECT_EQ(family.personCount(), 0U);
    family.addPerson(person(7));
    EXPECT_THAT(family.children(7), IsEmpty());
}

TEST(FamilyEdits, aRemovedPersonIsNamedNowhere) {
    Family family = persons(3);
    family.addPerson(person(4, 1, 2));
    family.addFamily(couple(9, 1, 2),
                     std::vector<FamilyChild>{{4, ChildKind::foster}, {3, ChildKind::birth}});
    family.addFamily(couple(10, 1, 0), {});
    family.removePerson(1);
    EXPECT_EQ(family.father(4), 0U);
    EXPECT_THAT(family.spouses(2), IsEmpty());
    EXPECT_EQ(family.preferredSpouse(2), 0U);
    EXPECT_EQ(family.family(9).partner0, 0);
    EXPECT_FALSE(family.hasFamily(10));
    family.removePerson(4);
    EXPECT_THAT(family.familyChildren(9), ElementsAre(FamilyChild{3, ChildKind::birth}));
}

TEST(FamilyEdits, partnersAreSeparatedWhenTheirLastFamilyGoes) {
    Family family = persons(2);
    family.addFamily(couple(1, 1, 2), {});
    family.addFamily(couple(2, 2, 1), {});
    EXPECT_EQ(family.preferredSpouse(1), 2U);
    family.removeFamily(1);
    EXPECT_THAT(family.spouses(1), ElementsAre(2));
    family.removeFamily(2);
    EXPECT_THAT(family.spouses(1), IsEmpty());
    EXPECT_THAT(family.spouses(2), IsEmpty());
}

TEST(FamilyEdits, aCopyStaysAsItWas) {
    Family family = persons(200);
    const Family before = family;
    family.addPerson(person(500, 1, 0));
    family.removePerson(150);
    family.setField(3, "note", "x");
    EXPECT_EQ(before.personCount(), 200U);
    EXPECT_THAT(before.children(1), IsEmpty());
    EXPECT_TRUE(before.hasPerson(150));
    EXPECT_EQ(before.field(3, "note"), "");
    EXPECT_EQ(family.field(3, "note"), "x");
}

TEST(FamilyEdits, aMovedTableIsEmpty) {
    Family family = persons(2);
    const Family other = std::move(family);
    EXPECT_EQ(other.personCount(), 2U);
    family.addPerson(person(1));  // NOLINT(bugprone-use-after-move): that is what is tested
    EXPECT_EQ(family.personCount(), 1U);
}

TEST(FamilyEdits, textsOfTheTableItselfMayBeHandedIn) {
    Family family = persons(2);
    family.setField(1, "note", std::string(100, 'n'));
    for (int i = 0; i < 5000; ++i) family.setField(2, family.fields(1).front().key, family.field(1, "note"));
    EXPECT_EQ(family.field(2, "note"), std::string(100, 'n'));
}

TEST(FamilyEdits, textsThatNobodyHasAnyMoreAreTidiedAway) {
    Family family = persons(2);
    family.setField(2, "kept", "kept");
    for (int i = 0; i < 3000; ++i) family.setField(1, "note", std::string(1000, 'n'));
    EXPECT_LT(family.memoryBytes(), 1500000U);
    EXPECT_EQ(family.field(2, "kept"), "kept");
}

TEST(FamilyEdits, personsWhoCameAndWentLeaveNoRoomBehind) {
    Family family = persons(3);
    family.addFamily(couple(1, 2, 3), {});
    const std::size_t before = family.memoryBytes();
    for (int i = 0; i < 3000; ++i) {
        family.addPerson(person(10 + i, 1, 0));
        family.addFamily(couple(5, 10 + i, 0), {});
        family.removePerson(10 + i);
    }
    EXPECT_LT(family.memoryBytes(), before + 400000);
    EXPECT_THAT(family.personIds(), ElementsAre(1, 2, 3));
    EXPECT_THAT(family.familyNumbers(), ElementsAre(1));
    EXPECT_THAT(family.children(1), IsEmpty());
}

TEST(FamilyEdits, areRefusedByThePersonAndTheField) {
    Family family = persons(2);
    family.addFamily(couple(1, 1, 2), {});
    EXPECT_EQ(refusalOf([&] { family.addPerson(person(2)); }),
              "person 2, field id: 2 is the id of another person");
    EXPECT_EQ(refusalOf([&] { family.addPerson(person((std::int64_t{1} << 32) + 4)); }),
              "person 4294967300, field id: 4294967300 is not a whole number of 1 to 2147483647");
    EXPECT_EQ(refusalOf([&] { family.setPerson(person(3)); }),
              "person 3, field id: 3 is not the id of a person");
    EXPECT_EQ(refusalOf([&] { family.setPerson(person(1, 9)); }),
              "person 1, field father: 9 is not the id of a person");
    EXPECT_EQ(refusalOf([&] {
                  family.setChildren(1, Ids{2, 2});
              }),
              "person 1, field child: 2 is in the list twice");
    EXPECT_EQ(refusalOf([&] { family.setSpouses(1, Ids{2}, 1); }),
              "person 1, field preferred: 1 is not in the list of spouses");
    EXPECT_EQ(refusalOf([&] { family.setPreferredSpouse(1, 9); }),
              "person 1, field preferred: 9 is not in the list of spouses");
    EXPECT_EQ(refusalOf([&] { family.setField(1, "", "x"); }), "person 1, field key: the key is empty");
    EXPECT_EQ(refusalOf([&] { family.setField(1, "k", "\xff"); }),
              "person 1, field text: the text is not valid UTF-8 at byte 0");
    EXPECT_EQ(refusalOf([&] { family.setField(1, "k", std::string(Family::kMostTextBytes + 1, 'x')); }),
              "person 1, field text: the text has 1048577 bytes, and at most 1048576 are stored");
    EXPECT_EQ(refusalOf([&] { family.addFamily(couple(1, 1, 2), {}); }),
              "family 1, field number: 1 is the number of another family");
    EXPECT_EQ(refusalOf([&] { family.setFamily(couple(2, 1, 2), {}); }),
              "family 2, field number: 2 is not the number of a family");
    EXPECT_EQ(refusalOf([&] { family.addFamily(couple(2, 1, 9), {}); }),
              "family 2, field partner1: 9 is not the id of a person");
    EXPECT_EQ(refusalOf([&] { family.removeFamily(3); }),
              "family 3, field number: 3 is not the number of a family");
    EXPECT_EQ(refusalOf([&] { family.removePerson(3); }), "person 3, field id: 3 is not the id of a person");
}

// One family as a table and as plain maps, edited alike.
class RandomEdits {
public:
    explicit RandomEdits(std::uint64_t seed) : random_(seed) {}

    Family table;
    PlainFamily plain;

    void edit() {
        const std::size_t kind = plain.persons.size() < 4 ? 0 : below(9);
        if (kind <= 1 && plain.persons.size() < 60) return putPerson(freeId());
        if (kind <= 2) return putPerson(pick());
        if (kind == 3) return below(2) == 0 ? removePerson(pick()) : setFieldsOf(pick());
        if (kind <= 5) return setLists(pick());
        if (kind <= 7) return editFamily();
        return setFieldsOf(pick());
    }

    std::size_t below(std::size_t most) { return static_cast<std::size_t>(random_() % most); }

private:
    std::int64_t pick() {
        auto at = plain.persons.begin();
        std::advance(at, below(plain.persons.size()));
        return at->first;
    }
    std::int64_t pickOrNobody() { return plain.persons.empty() || below(3) == 0 ? 0 : pick(); }
    std::int64_t freeId() {
        for (;;) {
            const std::int64_t id = below(10) == 0 ? olvane::kMostId - static_cast<std::int64_t>(below(9))
                                                   : 1 + static_cast<std::int64_t>(below(90));
            if (plain.persons.count(id) == 0) return id;
        }
    }
    Ids some() {
        Ids ids;
        for (const auto& [id, person_] : plain.persons) {
            if (below(plain.persons.size()) < 3) ids.push_back(id);
        }
        if (ids.size() > 1 && below(2) == 0) std::swap(ids.front(), ids.back());
        return ids;
    }

    void putPerson(std::int64_t id) {
        static const std::string longText(400, 'b');
        PersonRow row = person(id, pickOrNobody(), pickOrNobody());
        row.sex = static_cast<Sex>(below(3));
        row.dead = below(2) == 0;
        row.birth = below(2) == 0 ? std::string_view("1850") : std::string_view(longText);
        row.deathWritten = below(2) == 0 ? std::string_view() : std::string_view("im Mai");
        if (plain.persons.count(id) == 0) {
            table.addPerson(row);
        } else {
            table.setPerson(row);
        }
        plain.putPerson(row);
    }

    void removePerson(std::int64_t id) {
        table.removePerson(id);
        plain.removePerson(id);
    }

    void setLists(std::int64_t id) {
        PlainFamily::Person& person_ = plain.persons.at(id);
        person_.spouses = some();
        person_.preferred = person_.spouses.empty() || below(3) == 0 ? 0 : person_.spouses.back();
        person_.children = some();
        table.setSpouses(id, person_.spouses, 0);
        table.setPreferredSpouse(id, person_.preferred);
        table.setChildren(id, person_.children);
    }

    void editFamily() {
        const auto number = static_cast<std::int64_t>(1 + below(12));
        const bool isThere = plain.families.count(number) != 0;
        if (isThere && below(3) == 0) {
            table.removeFamily(number);
            plain.removeFamily(number);
            return;
        }
        FamilyRow row = couple(number, pickOrNobody(), pickOrNobody());
        row.state = static_cast<UnionState>(below(4));
        std::vector<FamilyChild> children;
        for (const std::int64_t child : some()) children.push_back({child, static_cast<ChildKind>(below(6))});
        if (isThere) {
            table.setFamily(row, children);
        } else {
            table.addFamily(row, children);
        }
        plain.putFamily(row, children);
    }

    void setFieldsOf(std::int64_t id) {
        PlainFamily::Person& person_ = plain.persons.at(id);
        const std::string key = below(2) == 0 ? "job" : "note";
        const std::string text = below(3) == 0 ? std::string() : std::string(below(3000), 'x');
        table.setField(id, key, text);
        person_.fields.erase(key);
        if (!text.empty()) person_.fields[key] = text;
        person_.names = {"Karl", std::string(below(300), 'k')};
        const NamePart parts[] = {{NameKind::full, person_.names[0]}, {NameKind::nickname, person_.names[1]}};
        table.setNames(id, parts);
    }

    std::mt19937_64 random_;
};

TEST(FamilyEdits, doAtRandomWhatAPlainFamilyDoesAndLeaveCopiesAlone) {
    for (std::uint64_t seed = 1; seed <= 10; ++seed) {
        RandomEdits run(seed);
        std::vector<std::pair<Family, PlainFamily>> kept;
        for (int step = 0; step < 3000; ++step) {
            run.edit();
            if (step % 250 == 0) kept.emplace_back(run.table, run.plain);
            if (step % 25 == 0) {
                ASSERT_EQ(differenceOf(run.table, run.plain), "") << "seed " << seed << " step " << step;
            }
            if (step % 800 == 799) std::tie(run.table, run.plain) = kept[run.below(kept.size())];  // undo
        }
        for (const auto& [table, plain] : kept) ASSERT_EQ(differenceOf(table, plain), "") << "seed " << seed;
    }
}

TEST(FamilyEdits, withoutMemoryLeaveTheTableAsItWas) {
    RandomEdits run(4);
    for (int step = 0; step < 150; ++step) run.edit();
    const std::vector<FamilyChild> children{{1, ChildKind::adopted}};
    const std::string text(2000, 't');
    const std::int64_t known = run.plain.persons.begin()->first;
    const std::vector<std::function<void(Family&)>> edits{
        [](Family& family) { family.addPerson(person(1000000, 0, 0)); },
        [&](Family& family) { family.addPerson(person(1000000, known, known)); },
        [&](Family& family) { family.setPerson(person(known)); },
        [&](Family& family) { family.removePerson(known); },
        [&](Family& family) { family.setChildren(known, Ids{known}); },
        [&](Family& family) { family.setSpouses(known, Ids{known}, known); },
        [&](Family& family) { family.setField(known, "new key", text); },
        [&](Family& family) {
            family.addFamily(couple(1000, known, known), std::vector<FamilyChild>{{known}});
        },
    };
    for (std::size_t edit = 0; edit < edits.size(); ++edit) {
        int failures = 0;
        for (std::int64_t n = 1;; ++n) {
            Family family = run.table;  // shared, so the edit copies it first
            bool isDone = false;
            try {
                const unit::AllocationFailure failure(n);
                edits[edit](family);
                isDone = true;
            } catch (const std::bad_alloc&) {
                ++failures;
            }
            ASSERT_EQ(differenceOf(run.table, run.plain), "") << "edit " << edit << " allocation " << n;
            if (isDone) break;
            ASSERT_EQ(differenceOf(family, run.plain), "") << "edit " << edit << " allocation " << n;
        }
        EXPECT_GT(failures, 1) << "edit " << edit;
    }
}

TEST(Family, withoutMemoryIsNotFilledAndLosesNone) {
    const Ids ids{5, 1, 9}, fathers{0, 9, 5}, spouses{1, 9, 5};
    const std::vector<std::string_view> births{"1850", "", "1900"};
    olvane::FamilyColumns columns;
    columns.persons.id = std::span(ids);
    columns.persons.father = std::span(fathers);
    columns.persons.birth = std::span(births);
    columns.spouses.person = std::span(ids);
    columns.spouses.spouse = std::span(spouses);
    columns.names.person = std::span(ids);
    columns.names.text = std::span(births);
    const std::int64_t before = unit::allocationsOutstanding();
    std::int64_t n = 1;
    for (bool isFilled = false; !isFilled; ++n) {
        try {
            const unit::AllocationFailure failure(n);
            const Family family(columns);
            isFilled = true;
        } catch (const std::bad_alloc&) {
            EXPECT_EQ(unit::allocationsOutstanding(), before);
        }
    }
    EXPECT_EQ(unit::allocationsOutstanding(), before);
    EXPECT_GT(n, 10);
}

}  // namespace
