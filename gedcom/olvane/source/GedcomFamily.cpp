// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Writes the file's records into columns, and fills a table from them.

#include <olvane/source/GedcomFamily.h>

#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include <olvane/source/GedcomKin.h>

namespace olvane::gedcom {

namespace {

// As much of a text as a table stores, without half a character at its end.
std::string_view stored(std::string_view text) {
    if (text.size() <= olvane::Family::kMostTextBytes) return text;
    std::size_t end = olvane::Family::kMostTextBytes;
    while (end > 0 && (static_cast<unsigned char>(text[end]) & 0xC0U) == 0x80U) --end;
    return text.substr(0, end);
}

// Texts one behind the other, for those that are made here and stand nowhere else.
class MadeTexts {
public:
    void add(std::string_view text) {
        bytes_ += stored(text);
        starts_.push_back(static_cast<std::uint32_t>(bytes_.size()));
    }
    TextColumn column() const { return TextColumn(bytes_.data(), bytes_.size(), starts_); }

private:
    std::string bytes_;
    std::vector<std::uint32_t> starts_{0};
};

struct PersonTexts {
    MadeTexts birth, death;
    std::vector<std::string_view> birthWritten, deathWritten;
};

class FamilyMaker {
public:
    explicit FamilyMaker(const GedcomData& data) : data_(data), lastFamilyOf_(data.personCount() + 1, 0) {}

    olvane::Family make() {
        for (PersonId id = 1; id <= data_.personCount(); ++id) {
            addPerson(id);
            addLists(id);
            addNames(id);
        }
        for (FamilyId number = 1; number <= data_.familyCount(); ++number) addFamily(number);
        addChildrenOfUnions(kinGraphOf(data_));
        return olvane::Family(columns());
    }

private:
    typedef std::vector<std::uint32_t> Numbers;

    void addPerson(PersonId id) {
        const Person& person = data_.person(id);
        ids_.push_back(id);
        fathers_.push_back(person.father);
        mothers_.push_back(person.mother);
        sexes_.push_back(static_cast<std::uint8_t>(person.sex));
        dead_.push_back(person.dead ? 1 : 0);
        texts_.birth.add(sortText(person.birth));
        texts_.death.add(sortText(person.death));
        texts_.birthWritten.push_back(stored(person.birth.written));
        texts_.deathWritten.push_back(stored(person.death.written));
        if (person.xref.empty()) return;
        withXref_.push_back(id);
        xrefKeys_.push_back("xref");
        xrefs_.push_back(stored(person.xref));
    }

    void addLists(PersonId id) {
        for (const PersonId spouse : data_.spouses(id)) {
            married_.push_back(id);
            spouses_.push_back(spouse);
        }
        for (const PersonId child : data_.children(id)) {
            parents_.push_back(id);
            children_.push_back(child);
        }
    }

    void addNames(PersonId id) {
        for (const PersonName& name : data_.names(id)) {
            addName(id, NameKind::full, displayName(name));
            addName(id, NameKind::given, name.given);
            addName(id, NameKind::surname, name.surname);
            addName(id, NameKind::prefix, name.prefix);
            addName(id, NameKind::suffix, name.suffix);
            addName(id, NameKind::nickname, name.nickname);
        }
    }

    void addName(PersonId id, NameKind kind, std::string_view text) {
        if (text.empty() && kind != NameKind::full) return;
        named_.push_back(id);
        nameKinds_.push_back(static_cast<std::uint8_t>(kind));
        names_.add(text);
    }

    void addFamily(FamilyId number) {
        const Family& family = data_.family(number);
        numbers_.push_back(number);
        husbands_.push_back(family.husband);
        wives_.push_back(family.wife);
        states_.push_back(static_cast<std::uint8_t>(stateOf(family)));
        marriages_.add(sortText(family.marriage));
        marriagesWritten_.push_back(stored(family.marriage.written));
        places_.push_back(stored(placeOfMarriage(number)));
        if (family.husband != 0 || family.wife != 0) return;
        for (const ChildLink& link : data_.childLinks(number)) {
            if (link.child == 0 || std::exchange(lastFamilyOf_[link.child], number) == number) continue;
            addFamilyChild(number, link.child, kin::ChildKind::birth);
        }
    }

    static kin::UnionState stateOf(const Family& family) {
        if (family.divorced) return kin::UnionState::divorced;
        if (family.married) return kin::UnionState::married;
        return family.notMarried ? kin::UnionState::unmarried : kin::UnionState::unknown;
    }

    std::string_view placeOfMarriage(FamilyId number) const {
        for (const Fact& fact : data_.factsOfFamily(number)) {
            if (fact.tag == "MARR" && !fact.place.empty()) return fact.place;
        }
        return {};
    }

    void addChildrenOfUnions(const kin::KinGraph& graph) {
        for (kin::UnionPlace u = 0; u < graph.unionCount(); ++u) {
            for (std::size_t i = 0; i < graph.children(u).size(); ++i) {
                const auto child = static_cast<std::uint32_t>(graph.children(u)[i]) + 1;
                addFamilyChild(graph.family(u), child, graph.childKinds(u)[i]);
            }
        }
    }

    void addFamilyChild(FamilyId number, PersonId child, kin::ChildKind kind) {
        inFamily_.push_back(number);
        familyChildren_.push_back(child);
        childKinds_.push_back(static_cast<std::uint8_t>(kind));
    }

    FamilyColumns columns() const {
        FamilyColumns columns;
        columns.persons = {std::span(ids_),
                           std::span(fathers_),
                           std::span(mothers_),
                           std::span(sexes_),
                           std::span(dead_),
                           texts_.birth.column(),
                           texts_.death.column(),
                           std::span(texts_.birthWritten),
                           std::span(texts_.deathWritten)};
        columns.spouses = {std::span(married_), std::span(spouses_), {}};
        columns.children = {std::span(parents_), std::span(children_)};
        columns.families = {std::span(numbers_), std::span(husbands_), std::span(wives_),
                            std::span(states_),  marriages_.column(),  std::span(marriagesWritten_),
                            std::span(places_)};
        columns.familyChildren = {std::span(inFamily_), std::span(familyChildren_), std::span(childKinds_)};
        columns.names = {std::span(named_), std::span(nameKinds_), names_.column()};
        columns.fields = {std::span(withXref_), std::span(xrefKeys_), std::span(xrefs_)};
        return columns;
    }

    const GedcomData& data_;
    Numbers lastFamilyOf_;  // of the families without partners, by child
    Numbers ids_, fathers_, mothers_;
    std::vector<std::uint8_t> sexes_, dead_;
    PersonTexts texts_;
    Numbers married_, spouses_, parents_, children_;
    Numbers named_;
    std::vector<std::uint8_t> nameKinds_;
    MadeTexts names_;
    Numbers withXref_;
    std::vector<std::string_view> xrefKeys_, xrefs_;
    Numbers numbers_, husbands_, wives_;
    std::vector<std::uint8_t> states_;
    MadeTexts marriages_;
    std::vector<std::string_view> marriagesWritten_, places_;
    Numbers inFamily_, familyChildren_;
    std::vector<std::uint8_t> childKinds_;
};

}  // namespace

olvane::Family familyOf(const GedcomData& data) {
    return FamilyMaker(data).make();
}

}  // namespace olvane::gedcom
