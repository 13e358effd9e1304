// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// From pointers to relatives. A family names its partners and children, a person the families. Where only one side
// names the other, the missing side is added; then parents come by a person's parent links, spouses and children by
// the couple links.

#include <olvane/gedcom/LinkResolverInternal.h>

#include <cstddef>
#include <cstdint>
#include <span>
#include <string>
#include <vector>

#include <olvane/gedcom/LinkCompletionInternal.h>

namespace olvane::gedcom {
namespace {

// Lists for persons whom the family does not name as partners may hold this many entries for each child of the
// file's families, so that a file in which all claim one family stays small in memory.
constexpr std::size_t kClaimedChildren = 1;
constexpr std::size_t kClaimedChildrenAtLeast = 1000;

class LinkResolver {
public:
    LinkResolver(GedcomTables& tables, const XrefTable& xrefs, DiagnosticList& diagnostics)
        : tables_(tables),
          xrefs_(xrefs),
          diagnostics_(diagnostics),
          takenBy_(tables.persons.size() + 1, 0),
          visitedBy_(tables.families.size() + 1, 0) {}

    // Pointers before links of one side: only what leads somewhere has another side.
    void resolveAll() {
        for (Family& family : tables_.families) resolveFamily(family);
        for (ChildLink& link : tables_.childLinks) link.child = personAt(link.child, link.line);
        for (FamilyLink& link : tables_.parentLinks) link.family = familyAt(link.family, link.line);
        for (FamilyLink& link : tables_.coupleLinks) link.family = familyAt(link.family, link.line);
        completeLinks(tables_, diagnostics_);
        listKnownChildren();
        for (PersonId id = 1; id <= tables_.persons.size(); ++id) findParents(tables_.persons[id - 1]);
        for (PersonId id = 1; id <= tables_.persons.size(); ++id) listSpouses(id);
        forgetTaken();
        for (PersonId id = 1; id <= tables_.persons.size(); ++id) listChildren(id);
    }

private:
    void resolveFamily(Family& family) {
        family.husband = personAt(family.husband, family.husbandLine);
        family.wife = personAt(family.wife, family.wifeLine);
        if (family.husband == 0 || family.husband != family.wife) return;
        diagnostics_.add(DiagnosticKind::samePartners, Severity::warning, family.wifeLine,
                         DiagnosticSentence::onePersonTwice, DiagnosticSentence::noOwnSpouse, family.xref);
    }

    // Links that lead nowhere are no children, and are not to be walked over again and again.
    void listKnownChildren() {
        knownChildrenOf_.reserve(tables_.families.size());
        for (const Family& family : tables_.families) {
            Slice slice = {static_cast<std::uint32_t>(knownChildren_.size()), 0};
            for (const ChildLink& link : childLinks(family)) {
                if (link.child != 0) knownChildren_.push_back(link.child);
            }
            slice.count = static_cast<std::uint32_t>(knownChildren_.size()) - slice.first;
            knownChildrenOf_.push_back(slice);
        }
        claimsLeft_ = knownChildren_.size() * kClaimedChildren + kClaimedChildrenAtLeast;
    }

    PersonId personAt(XrefPlace place, LineNumber line) {
        const PersonId person = xrefs_.at(place).person;
        if (place != 0 && person == 0) reportLoose(place, line, DiagnosticSentence::noPerson);
        return person;
    }

    FamilyId familyAt(XrefPlace place, LineNumber line) {
        const FamilyId family = xrefs_.at(place).family;
        if (place != 0 && family == 0) reportLoose(place, line, DiagnosticSentence::noFamily);
        return family;
    }

    void reportLoose(XrefPlace place, LineNumber line, DiagnosticSentence what) {
        const XrefTable::Entry& entry = xrefs_.at(place);
        if (entry.line == 0) {
            diagnostics_.add(DiagnosticKind::danglingPointer, Severity::error, line,
                             DiagnosticSentence::noSuchRecord, DiagnosticSentence::leftOut, entry.xref);
        } else {
            diagnostics_.add(DiagnosticKind::wrongPointer, Severity::error, line, what,
                             DiagnosticSentence::leftOut, entry.xref);
        }
    }

    std::span<const FamilyLink> coupleLinks(const Person& person) const {
        return std::span(tables_.coupleLinks)
            .subspan(person.coupleLinkSlice.first, person.coupleLinkSlice.count);
    }

    std::span<const ChildLink> childLinks(const Family& family) const {
        return std::span(tables_.childLinks)
            .subspan(family.childLinkSlice.first, family.childLinkSlice.count);
    }

    // The first family of birth, else the first family. Links that lead nowhere do not count.
    void findParents(Person& person) {
        FamilyId chosen = 0;
        for (const FamilyLink& link :
             std::span(tables_.parentLinks)
                 .subspan(person.parentLinkSlice.first, person.parentLinkSlice.count)) {
            const bool byBirth = link.pedigree == Pedigree::notGiven || link.pedigree == Pedigree::birth;
            if (link.family == 0) continue;
            if (chosen == 0 || byBirth) chosen = link.family;
            if (byBirth) break;
        }
        if (chosen == 0) return;
        person.parentFamily = chosen;
        person.father = tables_.families[chosen - 1].husband;
        person.mother = tables_.families[chosen - 1].wife;
    }

    // The partner beside the person; 0 beside somebody whom the family does not name, for it names two others then.
    static PersonId otherPartner(const Family& family, PersonId person) {
        if (family.husband == person) return family.wife == person ? 0 : family.wife;
        return family.wife == person ? family.husband : 0;
    }

    void listSpouses(PersonId id) {
        Person& person = tables_.persons[id - 1];
        person.spouseSlice.first = static_cast<std::uint32_t>(tables_.spouses.size());
        for (const FamilyLink& link : coupleLinks(person)) {
            if (link.family == 0) continue;
            const PersonId partner = otherPartner(tables_.families[link.family - 1], id);
            if (partner == 0 || takenBy_[partner] == id) continue;
            takenBy_[partner] = id;
            tables_.spouses.push_back(partner);
        }
        person.spouseSlice.count =
            static_cast<std::uint32_t>(tables_.spouses.size()) - person.spouseSlice.first;
    }

    void listChildren(PersonId id) {
        Person& person = tables_.persons[id - 1];
        person.childSlice.first = static_cast<std::uint32_t>(tables_.children.size());
        for (const FamilyLink& link : coupleLinks(person)) {
            if (link.family == 0 || visitedBy_[link.family] == id) continue;
            visitedBy_[link.family] = id;
            if (mayListChildren(id, link)) addChildren(id, link.family);
        }
        person.childSlice.count =
            static_cast<std::uint32_t>(tables_.children.size()) - person.childSlice.first;
    }

    bool mayListChildren(PersonId id, const FamilyLink& link) {
        const Family& family = tables_.families[link.family - 1];
        if (family.husband == id || family.wife == id) return true;
        const std::size_t wanted = knownChildrenOf_[link.family - 1].count;
        if (wanted <= claimsLeft_) {
            claimsLeft_ -= wanted;
            return true;
        }
        diagnostics_.add(DiagnosticKind::wrongPointer, Severity::error, link.line,
                         DiagnosticSentence::onePersonMore, DiagnosticSentence::withoutChildren, family.xref);
        return false;
    }

    void addChildren(PersonId id, FamilyId family) {
        const Slice slice = knownChildrenOf_[family - 1];
        for (const PersonId child : std::span(knownChildren_).subspan(slice.first, slice.count)) {
            if (takenBy_[child] == id) continue;
            takenBy_[child] = id;
            tables_.children.push_back(child);
        }
    }

    void forgetTaken() { takenBy_.assign(takenBy_.size(), 0); }

    GedcomTables& tables_;
    const XrefTable& xrefs_;
    DiagnosticList& diagnostics_;
    std::vector<PersonId> takenBy_;        // by person: who listed them last
    std::vector<PersonId> visitedBy_;      // by family: whose children were listed from it last
    std::vector<PersonId> knownChildren_;  // of all families
    std::vector<Slice> knownChildrenOf_;   // by family
    std::size_t claimsLeft_ = 0;
};

}  // namespace

void resolveLinks(GedcomTables& tables, const XrefTable& xrefs, DiagnosticList& diagnostics) {
    LinkResolver(tables, xrefs, diagnostics).resolveAll();
}

}  // namespace olvane::gedcom
