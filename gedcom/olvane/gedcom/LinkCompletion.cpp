// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Links that one side alone records. First free slots of families are taken by those whose FAMS asks for them, since
// the slots say who is a partner; then each HUSB, WIFE and CHIL gets its FAMS or FAMC, and each FAMC its CHIL. Nearly
// all files have both sides, so links are added to lists at the side, which are merged at the end if there are any.

#include <olvane/gedcom/LinkCompletionInternal.h>

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <span>
#include <unordered_set>
#include <utility>
#include <vector>

namespace olvane::gedcom {
namespace {

// Whether a list holds a number. Short lists are looked through; long ones are hashed once, so that many questions to
// one list take linear time.
class Membership {
public:
    template <class Link, class NumberOf>
    bool holds(std::uint32_t owner, std::span<const Link> list, std::uint32_t number,
               const NumberOf& numberOf) {
        constexpr std::size_t kShort = 32;
        if (list.size() <= kShort) {
            return std::any_of(list.begin(), list.end(),
                               [&](const Link& link) { return numberOf(link) == number; });
        }
        if (hashedOwners_.insert(owner).second) {
            for (const Link& link : list) hashed_.insert(key(owner, numberOf(link)));
        }
        return hashed_.contains(key(owner, number));
    }

private:
    static std::uint64_t key(std::uint32_t owner, std::uint32_t number) {
        return std::uint64_t{owner} << 32 | number;
    }

    std::unordered_set<std::uint32_t> hashedOwners_;
    std::unordered_set<std::uint64_t> hashed_;
};

FamilyId familyOf(const FamilyLink& link) {
    return link.family;
}

PersonId childOf(const ChildLink& link) {
    return link.child;
}

bool mayBeBirth(Pedigree pedigree) {
    return pedigree == Pedigree::notGiven || pedigree == Pedigree::birth;
}

// A link for the list of an owner, to be put behind those it has.
template <class Link>
struct Addition {
    std::uint32_t owner = 0;
    Link link;
};

// Owners have consecutive slices of the list; so they have afterwards.
template <class Link, class Owner>
void addBehind(std::vector<Link>& list, std::vector<Owner>& owners, Slice Owner::*sliceOf,
               std::vector<Addition<Link>>& additions) {
    if (additions.empty()) return;
    std::stable_sort(additions.begin(), additions.end(),
                     [](const auto& one, const auto& other) { return one.owner < other.owner; });
    std::vector<Link> merged;
    merged.reserve(list.size() + additions.size());
    auto next = additions.begin();
    for (std::uint32_t number = 1; number <= owners.size(); ++number) {
        Slice& slice = owners[number - 1].*sliceOf;
        const auto old = std::span(list).subspan(slice.first, slice.count);
        slice.first = static_cast<std::uint32_t>(merged.size());
        merged.insert(merged.end(), old.begin(), old.end());
        for (; next != additions.end() && next->owner == number; ++next) merged.push_back(next->link);
        slice.count = static_cast<std::uint32_t>(merged.size()) - slice.first;
    }
    list = std::move(merged);
}

class LinkCompleter {
public:
    LinkCompleter(GedcomTables& tables, DiagnosticList& diagnostics)
        : tables_(tables), diagnostics_(diagnostics), lastParents_(tables.persons.size() + 1, 0) {}

    void completeAll() {
        for (PersonId id = 1; id <= tables_.persons.size(); ++id) takeFreeSlots(id);
        for (Family& family : tables_.families) putIntoOwnSlots(family);
        for (FamilyId id = 1; id <= tables_.families.size(); ++id) {
            const Family& family = tables_.families[id - 1];
            followPartner(id, family.husband, family.husbandLine);
            if (family.wife != family.husband) followPartner(id, family.wife, family.wifeLine);
            followChildren(id);
        }
        for (PersonId id = 1; id <= tables_.persons.size(); ++id) followParents(id);
        addBehind(tables_.coupleLinks, tables_.persons, &Person::coupleLinkSlice, newCoupleLinks_);
        addBehind(tables_.parentLinks, tables_.persons, &Person::parentLinkSlice, newParentLinks_);
        addBehind(tables_.childLinks, tables_.families, &Family::childLinkSlice, newChildLinks_);
    }

private:
    std::span<FamilyLink> parentLinks(PersonId id) {
        const Slice slice = tables_.persons[id - 1].parentLinkSlice;
        return std::span(tables_.parentLinks).subspan(slice.first, slice.count);
    }
    std::span<const FamilyLink> coupleLinks(PersonId id) const {
        const Slice slice = tables_.persons[id - 1].coupleLinkSlice;
        return std::span(tables_.coupleLinks).subspan(slice.first, slice.count);
    }
    std::span<const ChildLink> childLinks(FamilyId id) const {
        const Slice slice = tables_.families[id - 1].childLinkSlice;
        return std::span(tables_.childLinks).subspan(slice.first, slice.count);
    }

    // A man takes the husband's slot where both are free, a woman the wife's.
    void takeFreeSlots(PersonId id) {
        for (const FamilyLink& link : coupleLinks(id)) {
            if (link.family == 0) continue;
            Family& family = tables_.families[link.family - 1];
            if (family.husband == id || family.wife == id) continue;
            if (family.husband != 0 && family.wife != 0) {
                diagnostics_.add(DiagnosticKind::contradictingLink, Severity::warning, link.line,
                                 DiagnosticSentence::marriageOfOthers, DiagnosticSentence::childrenOfAll,
                                 family.xref);
                continue;
            }
            const bool isWoman = tables_.persons[id - 1].sex == Sex::female;
            const bool asHusband = family.husband == 0 && (family.wife != 0 || !isWoman);
            (asHusband ? family.husband : family.wife) = id;
            (asHusband ? family.husbandLine : family.wifeLine) = link.line;
            report(link.line, DiagnosticSentence::marriageNotReturned,
                   asHusband ? DiagnosticSentence::asHusband : DiagnosticSentence::asWife, family.xref);
        }
    }

    bool isOf(PersonId person, Sex sex) const {
        return person != 0 && tables_.persons[person - 1].sex == sex;
    }

    void putIntoOwnSlots(Family& family) {
        const bool manAsWife =
            isOf(family.wife, Sex::male) && (family.husband == 0 || isOf(family.husband, Sex::female));
        const bool womanAsHusband =
            isOf(family.husband, Sex::female) && (family.wife == 0 || isOf(family.wife, Sex::male));
        if (!manAsWife && !womanAsHusband) return;
        if (manAsWife) {
            diagnostics_.add(DiagnosticKind::wrongSlot, Severity::warning, family.wifeLine,
                             DiagnosticSentence::manAsWife, DiagnosticSentence::asHusband, family.xref);
        }
        if (womanAsHusband) {
            diagnostics_.add(DiagnosticKind::wrongSlot, Severity::warning, family.husbandLine,
                             DiagnosticSentence::womanAsHusband, DiagnosticSentence::asWife, family.xref);
        }
        std::swap(family.husband, family.wife);
        std::swap(family.husbandLine, family.wifeLine);
    }

    void followPartner(FamilyId id, PersonId partner, LineNumber line) {
        if (partner == 0 || couplesOf_.holds(partner, coupleLinks(partner), id, familyOf)) return;
        newCoupleLinks_.push_back({partner, {id, line, Pedigree::notGiven, true}});
        report(line, DiagnosticSentence::partnerNotReturned, DiagnosticSentence::asIfItHad,
               tables_.families[id - 1].xref);
    }

    void followChildren(FamilyId id) {
        for (const ChildLink& link : childLinks(id)) {
            if (link.child == 0) continue;
            if (parentsOf_.holds(link.child, std::span<const FamilyLink>(parentLinks(link.child)), id,
                                 familyOf)) {
                if (link.pedigree != Pedigree::notGiven) passPedigree(id, link);
                continue;
            }
            if (std::exchange(lastParents_[link.child], id) == id) continue;
            newParentLinks_.push_back({link.child, {id, link.line, link.pedigree, true}});
            reportChild(id, link);
        }
    }

    // The child's own word goes before the family's.
    void passPedigree(FamilyId id, const ChildLink& child) {
        for (FamilyLink& link : parentLinks(child.child)) {
            if (link.family == id && link.pedigree == Pedigree::notGiven) link.pedigree = child.pedigree;
        }
    }

    void reportChild(FamilyId id, const ChildLink& link) {
        const std::string_view xref = tables_.families[id - 1].xref;
        const auto own = parentLinks(link.child);
        const bool namesOthers = std::any_of(own.begin(), own.end(), [](const FamilyLink& other) {
            return other.family != 0 && mayBeBirth(other.pedigree);
        });
        if (!namesOthers || !mayBeBirth(link.pedigree)) {
            return report(link.line, DiagnosticSentence::childNotReturned, DiagnosticSentence::asIfItHad,
                          xref);
        }
        diagnostics_.add(DiagnosticKind::contradictingLink, Severity::warning, link.line,
                         DiagnosticSentence::childOfOthers, DiagnosticSentence::bothKept, xref);
    }

    void followParents(PersonId id) {
        for (const FamilyLink& link : parentLinks(id)) {
            if (link.family == 0 || childrenOf_.holds(link.family, childLinks(link.family), id, childOf))
                continue;
            if (std::exchange(lastParents_[id], link.family) == link.family) continue;
            newChildLinks_.push_back({link.family, {id, link.line, Pedigree::notGiven, true}});
            report(link.line, DiagnosticSentence::parentsNotReturned, DiagnosticSentence::asLastChild,
                   tables_.families[link.family - 1].xref);
        }
    }

    void report(LineNumber line, DiagnosticSentence what, DiagnosticSentence done, std::string_view xref) {
        diagnostics_.add(DiagnosticKind::oneSidedLink, Severity::note, line, what, done, xref);
    }

    GedcomTables& tables_;
    DiagnosticList& diagnostics_;
    std::vector<FamilyId> lastParents_;  // by person: the family that was added last, on either side
    Membership couplesOf_;
    Membership parentsOf_;
    Membership childrenOf_;
    std::vector<Addition<FamilyLink>> newCoupleLinks_;
    std::vector<Addition<FamilyLink>> newParentLinks_;
    std::vector<Addition<ChildLink>> newChildLinks_;
};

}  // namespace

void completeLinks(GedcomTables& tables, DiagnosticList& diagnostics) {
    LinkCompleter(tables, diagnostics).completeAll();
}

}  // namespace olvane::gedcom
