// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A family in C, edited at random, rightly and wrongly, beside plain maps that are edited alike.

#include <algorithm>
#include <array>
#include <cstdint>
#include <iterator>
#include <limits>
#include <map>
#include <memory>
#include <random>
#include <string>
#include <utility>
#include <vector>

#include <gtest/gtest.h>

#include <olvane_family.h>

#include <support/PlainFamily.h>

namespace {

using olvane::kin::ChildKind;
using olvane::kin::Sex;
using olvane::kin::UnionState;
using support::PlainFamily;

typedef std::vector<std::int64_t> Ids;

struct FamilyDeleter {
    void operator()(olvane_family* family) const { olvane_family_free(family); }
};
typedef std::unique_ptr<olvane_family, FamilyDeleter> FamilyPointer;

FamilyPointer emptyFamily() {
    olvane_family* family = nullptr;
    EXPECT_EQ(olvane_family_create(nullptr, &family, nullptr), OLVANE_OK);
    return FamilyPointer(family);
}

FamilyPointer copyOf(const FamilyPointer& family) {
    olvane_family* copy = nullptr;
    EXPECT_EQ(olvane_family_copy(family.get(), &copy), OLVANE_OK);
    return FamilyPointer(copy);
}

std::string stringOf(const olvane_text& text) {
    return std::string(text.bytes ? text.bytes : "", text.length);
}

std::vector<std::string> namesOf(const olvane_family* family, std::int64_t id) {
    std::vector<std::string> names;
    std::int32_t kind = 0;
    olvane_text text = {};
    while (olvane_family_name_at(family, id, names.size(), &kind, &text) == OLVANE_OK)
        names.push_back(stringOf(text));
    return names;
}

std::map<std::string, std::string> fieldsOf(const olvane_family* family, std::int64_t id) {
    std::map<std::string, std::string> fields;
    olvane_text key = {};
    olvane_text text = {};
    for (std::size_t place = 0; olvane_family_field_at(family, id, place, &key, &text) == OLVANE_OK; ++place)
        fields[stringOf(key)] = stringOf(text);
    return fields;
}

void expectSamePerson(const olvane_family* family, std::int64_t id, const PlainFamily::Person& plain) {
    olvane_person person = {};
    ASSERT_EQ(olvane_family_person(family, id, &person), OLVANE_OK);
    EXPECT_EQ(person.id, id);
    EXPECT_EQ(person.father, plain.father);
    EXPECT_EQ(person.mother, plain.mother);
    EXPECT_EQ(person.preferred, plain.preferred);
    EXPECT_EQ(person.sex, static_cast<std::int32_t>(plain.sex));
    EXPECT_EQ(person.dead != 0, plain.dead);
    EXPECT_EQ(stringOf(person.birth), plain.birth);
    EXPECT_EQ(stringOf(person.death_written), plain.deathWritten);
    EXPECT_EQ(Ids(person.spouses, person.spouses + person.spouse_count), plain.spouses);
    EXPECT_EQ(Ids(person.children, person.children + person.child_count), plain.children);
    EXPECT_EQ(namesOf(family, id), plain.names);
    EXPECT_EQ(fieldsOf(family, id), plain.fields);
}

void expectSameFamily(const olvane_family* family, std::int64_t number, const PlainFamily::Couple& plain) {
    std::array<std::int64_t, 2> partners{};
    std::int32_t state = 0;
    ASSERT_EQ(
        olvane_family_family(family, number, &partners[0], &partners[1], &state, nullptr, nullptr, nullptr),
        OLVANE_OK);
    EXPECT_EQ(partners, plain.partners);
    EXPECT_EQ(state, static_cast<std::int32_t>(plain.state));
    std::vector<olvane_family_child> children(plain.children.size() + 1);
    std::size_t count = 0;
    ASSERT_EQ(olvane_family_family_children(family, number, children.data(), children.size(), &count),
              OLVANE_OK);
    ASSERT_EQ(count, plain.children.size());
    for (std::size_t i = 0; i < count; ++i) {
        EXPECT_EQ(children[i].child, plain.children[i].child);
        EXPECT_EQ(children[i].kind, static_cast<std::int32_t>(plain.children[i].kind));
    }
}

template <class Map>
std::vector<std::uint32_t> keysOf(const Map& map) {
    std::vector<std::uint32_t> keys;
    keys.reserve(map.size());
    for (const auto& entry : map) keys.push_back(static_cast<std::uint32_t>(entry.first));
    return keys;
}

void expectSame(const FamilyPointer& family, const PlainFamily& plain) {
    std::vector<std::uint32_t> ids(olvane_family_person_count(family.get()));
    ASSERT_EQ(olvane_family_person_ids(family.get(), ids.data(), ids.size()), OLVANE_OK);
    std::sort(ids.begin(), ids.end());
    ASSERT_EQ(ids, keysOf(plain.persons));
    for (const auto& [id, person] : plain.persons) expectSamePerson(family.get(), id, person);
    std::vector<std::uint32_t> numbers(olvane_family_family_count(family.get()));
    ASSERT_EQ(olvane_family_family_numbers(family.get(), numbers.data(), numbers.size()), OLVANE_OK);
    std::sort(numbers.begin(), numbers.end());
    ASSERT_EQ(numbers, keysOf(plain.families));
    for (const auto& [number, couple] : plain.families) expectSameFamily(family.get(), number, couple);
}

class RandomEdits {
public:
    explicit RandomEdits(std::uint64_t seed) : table(emptyFamily()), random_(seed) {}

    FamilyPointer table;
    PlainFamily plain;

    void edit() {
        const std::size_t kind = plain.persons.size() < 4 ? 0 : below(9);
        if (below(8) == 0) return editWrongly();
        if (kind <= 1 && plain.persons.size() < 40) return putPerson(freeId());
        if (kind <= 2) return putPerson(pick());
        if (kind == 3 && below(2) == 0) return removePerson(pick());
        if (kind <= 5) return setLists(pick());
        if (kind <= 7) return editFamily();
        setTexts(pick());
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
            const auto offset = static_cast<std::int64_t>(below(60));
            const std::int64_t id =
                below(10) == 0 ? std::numeric_limits<std::int32_t>::max() - offset : 1 + offset;
            if (plain.persons.count(id) == 0) return id;
        }
    }
    Ids some() {
        Ids ids = {};
        for (const auto& entry : plain.persons) {
            if (below(plain.persons.size()) < 3) ids.push_back(entry.first);
        }
        if (ids.size() > 1 && below(2) == 0) std::swap(ids.front(), ids.back());
        return ids;
    }

    void putPerson(std::int64_t id) {
        olvane_person_row row = {};
        row.id = id;
        row.father = pickOrNobody();
        row.mother = pickOrNobody();
        row.sex = static_cast<std::int32_t>(below(3));
        row.dead = static_cast<std::int32_t>(below(2));
        row.birth = below(2) == 0 ? "1850" : nullptr;
        row.death_written = below(2) == 0 ? "im Mai" : "";
        const auto put = plain.persons.count(id) == 0 ? olvane_family_add_person : olvane_family_set_person;
        ASSERT_EQ(put(table.get(), &row, nullptr), OLVANE_OK);
        olvane::PersonRow same;
        same.id = id;
        same.father = row.father;
        same.mother = row.mother;
        same.sex = static_cast<Sex>(row.sex);
        same.dead = row.dead != 0;
        same.birth = row.birth ? row.birth : "";
        same.deathWritten = row.death_written;
        plain.putPerson(same);
    }

    void removePerson(std::int64_t id) {
        ASSERT_EQ(olvane_family_remove_person(table.get(), id, nullptr), OLVANE_OK);
        plain.removePerson(id);
    }

    void setLists(std::int64_t id) {
        PlainFamily::Person& person = plain.persons.at(id);
        person.spouses = some();
        person.preferred = person.spouses.empty() || below(3) == 0 ? 0 : person.spouses.back();
        person.children = some();
        ASSERT_EQ(olvane_family_set_spouses(table.get(), id, person.spouses.data(), person.spouses.size(),
                                            person.preferred, nullptr),
                  OLVANE_OK);
        ASSERT_EQ(olvane_family_set_children(table.get(), id, person.children.data(), person.children.size(),
                                             nullptr),
                  OLVANE_OK);
    }

    void editFamily() {
        const auto number = static_cast<std::int64_t>(1 + below(12));
        const bool isThere = plain.families.count(number) != 0;
        if (isThere && below(3) == 0) {
            ASSERT_EQ(olvane_family_remove_family(table.get(), number, nullptr), OLVANE_OK);
            plain.removeFamily(number);
            return;
        }
        olvane_family_row row = {};
        row.number = number;
        row.partner0 = pickOrNobody();
        row.partner1 = pickOrNobody();
        row.state = static_cast<std::int32_t>(below(4));
        std::vector<olvane_family_child> children;
        std::vector<olvane::FamilyChild> same;
        for (const std::int64_t child : some()) {
            children.push_back({child, static_cast<std::int32_t>(below(6))});
            same.push_back({child, static_cast<ChildKind>(children.back().kind)});
        }
        const auto put = isThere ? olvane_family_set_family : olvane_family_add_family;
        ASSERT_EQ(put(table.get(), &row, children.data(), children.size(), nullptr), OLVANE_OK);
        olvane::FamilyRow couple;
        couple.number = number;
        couple.partner0 = row.partner0;
        couple.partner1 = row.partner1;
        couple.state = static_cast<UnionState>(row.state);
        plain.putFamily(couple, same);
    }

    void setTexts(std::int64_t id) {
        PlainFamily::Person& person = plain.persons.at(id);
        const char* key = below(2) == 0 ? "job" : "note";
        const std::string text = below(3) == 0 ? std::string() : std::string(below(3000), 'x');
        ASSERT_EQ(olvane_family_set_field(table.get(), id, key, text.c_str(), nullptr), OLVANE_OK);
        person.fields.erase(key);
        if (!text.empty()) person.fields[key] = text;
        person.names = {"Karl", std::string(below(300), 'k')};
        const olvane_name_part parts[] = {{0, person.names[0].c_str()}, {5, person.names[1].c_str()}};
        ASSERT_EQ(olvane_family_set_names(table.get(), id, parts, 2, nullptr), OLVANE_OK);
    }

    // Somebody who is not there, or no id at all: refused by that number, wherever it stands.
    void editWrongly() {
        constexpr std::int64_t kWrong[] = {-1, std::int64_t{1} << 31, (std::int64_t{1} << 32) + 4,
                                           (std::int64_t{1} << 53) + 1,
                                           std::numeric_limits<std::int64_t>::min()};
        const std::int64_t wrong = kWrong[below(std::size(kWrong))];
        olvane_person_row row = {};
        row.id = freeId();
        (below(2) == 0 ? row.father : row.id) = wrong;
        olvane_family_error error = {};
        ASSERT_EQ(olvane_family_add_person(table.get(), &row, &error), OLVANE_REFUSED);
        EXPECT_NE(std::string(error.message).find(std::to_string(wrong)), std::string::npos) << error.message;
        ASSERT_EQ(olvane_family_remove_person(table.get(), wrong, &error), OLVANE_REFUSED);
        if (plain.persons.empty()) return;
        const std::int64_t spouses[] = {pick(), wrong};
        ASSERT_EQ(olvane_family_set_spouses(table.get(), pick(), spouses, 2, 0, &error), OLVANE_REFUSED);
        ASSERT_EQ(olvane_family_set_children(table.get(), pick(), spouses, 2, &error), OLVANE_REFUSED);
        const olvane_family_row couple = {30, pick(), wrong, 0, nullptr, nullptr, nullptr};
        ASSERT_EQ(olvane_family_add_family(table.get(), &couple, nullptr, 0, &error), OLVANE_REFUSED);
    }

    std::mt19937_64 random_;
};

TEST(CFamilyEdits, doAtRandomWhatAPlainFamilyDoesAndLeaveCopiesAlone) {
    for (std::uint64_t seed = 1; seed <= 5; ++seed) {
        SCOPED_TRACE("seed " + std::to_string(seed));
        RandomEdits run(seed);
        std::vector<std::pair<FamilyPointer, PlainFamily>> kept;
        for (int step = 0; step < 1500; ++step) {
            SCOPED_TRACE("step " + std::to_string(step));
            run.edit();
            if (step % 150 == 0) kept.emplace_back(copyOf(run.table), run.plain);
            if (step % 25 == 0) expectSame(run.table, run.plain);
            if (step % 400 == 399) {  // undo
                const auto& [table, plain] = kept[run.below(kept.size())];
                run.table = copyOf(table);
                run.plain = plain;
            }
            if (testing::Test::HasFailure()) return;
        }
        for (const auto& [table, plain] : kept) expectSame(table, plain);
    }
}

}  // namespace
