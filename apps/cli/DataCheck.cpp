// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Looks through the data for what will make a tree look odd. Dates are compared as spans of years, wide where
// a date says "about", open where it says "before" or "after", so that only what cannot be is told.

#include <cli/DataCheck.h>

#include <algorithm>
#include <cstdint>
#include <initializer_list>
#include <limits>
#include <span>
#include <string_view>
#include <utility>

#include <cli/AgeLimits.h>
#include <cli/OwnAncestors.h>

namespace olvane::cli {

namespace {

using gedcom::FamilyId;
using gedcom::GedcomData;
using gedcom::PersonId;
using Kind = DataFindingKind;

constexpr int kAboutYears = 5;

// Years that a date may stand for; all of them for one that is not known.
struct Years {
    int first = std::numeric_limits<std::int16_t>::min();
    int last = std::numeric_limits<std::int16_t>::max();
};

Years yearsOf(const gedcom::GedcomDate& date) {
    Years years;
    if (!date.isRead()) return years;
    switch (date.mark) {
        case gedcom::DateMark::exact:
            return {date.year, date.year};
        case gedcom::DateMark::about:
            return {date.year - kAboutYears, date.year + kAboutYears};
        case gedcom::DateMark::before:
            years.last = date.year;
            return years;
        case gedcom::DateMark::after:
            years.first = date.year;
            return years;
        case gedcom::DateMark::between:
            return {date.year, date.lastYear};
    }
    return years;
}

std::string tagOf(std::string_view xref) {
    return xref.empty() ? "(no xref)" : "@" + std::string(xref) + "@";
}

class DataChecker {
public:
    explicit DataChecker(const GedcomData& data) : data_(data) {}

    std::vector<DataFinding> check() {
        for (PersonId id = 1; id <= data_.personCount(); ++id) checkPerson(id);
        for (FamilyId id = 1; id <= data_.familyCount(); ++id) checkFamily(id);
        findOwnAncestors();
        std::stable_sort(findings_.begin(), findings_.end(),
                         [](const DataFinding& a, const DataFinding& b) { return a.line < b.line; });
        return std::move(findings_);
    }

private:
    void report(Kind kind, gedcom::LineNumber line, std::initializer_list<std::string_view> xrefs,
                std::string text) {
        DataFinding finding{kind, line, {}, std::move(text)};
        for (const std::string_view xref : xrefs) {
            if (!xref.empty()) finding.xrefs.emplace_back(xref);
        }
        findings_.push_back(std::move(finding));
    }

    std::string_view xrefOf(PersonId id) const { return data_.person(id).xref; }
    std::string_view xrefOfFamily(FamilyId id) const { return data_.family(id).xref; }

    std::string named(PersonId id) const {
        return tagOf(data_.person(id).xref) + " " + gedcom::displayName(data_.firstName(id));
    }
    std::string namedFamily(FamilyId id) const { return tagOf(data_.family(id).xref); }

    void checkPerson(PersonId id) {
        checkParentLinks(id);
        checkCoupleLinks(id);
        checkLife(id);
        checkBirthAgainstParent(id, data_.person(id).father, kOldestFather, 1);
        checkBirthAgainstParent(id, data_.person(id).mother, kOldestMother, 0);
    }

    void checkParentLinks(PersonId id) {
        const auto links = data_.parentLinks(id);
        std::size_t births = 0;
        for (const gedcom::FamilyLink& link : links) {
            if (link.family == 0) continue;
            if (link.isFamilysAlone) {
                report(Kind::parentsNotNamed, link.line, {xrefOfFamily(link.family), xrefOf(id)},
                       namedFamily(link.family) + " lists " + named(id) +
                           " as a child, who does not name the family");
            }
            const bool byBirth =
                link.pedigree == gedcom::Pedigree::birth || link.pedigree == gedcom::Pedigree::notGiven;
            if (byBirth && ++births == 2) {
                report(Kind::severalBirthFamilies, link.line, {xrefOf(id)},
                       named(id) + " is a child in two families; the first one is drawn");
            }
        }
    }

    void checkCoupleLinks(PersonId id) {
        for (const gedcom::FamilyLink& link : data_.coupleLinks(id)) {
            if (link.family == 0) continue;
            if (link.isFamilysAlone) {
                report(Kind::marriageNotNamed, link.line, {xrefOfFamily(link.family), xrefOf(id)},
                       namedFamily(link.family) + " names " + named(id) +
                           " as partner, who does not name the family");
            } else if (!namesPartner(data_.family(link.family), id, link.line)) {
                report(Kind::partnerNotNamed, link.line, {xrefOf(id), xrefOfFamily(link.family)},
                       named(id) + " names " + namedFamily(link.family) +
                           " as marriage, which does not name the partner");
            }
        }
    }

    // A partner whom the family does not name stands there by the line of their own link.
    static bool namesPartner(const gedcom::Family& family, PersonId id, gedcom::LineNumber own) {
        return (family.husband == id && family.husbandLine != own) ||
               (family.wife == id && family.wifeLine != own);
    }

    void checkLife(PersonId id) {
        const gedcom::Person& person = data_.person(id);
        if (!person.birth.isRead() || !person.death.isRead()) return;
        const Years birth = yearsOf(person.birth);
        const Years death = yearsOf(person.death);
        if (death.last < birth.first) {
            report(Kind::diedBeforeBirth, person.line, {xrefOf(id)}, named(id) + " died before being born");
        } else if (death.first - birth.last > kLongestLife) {
            report(Kind::livedTooLong, person.line, {xrefOf(id)},
                   named(id) + " lived for more than " + std::to_string(kLongestLife) + " years");
        }
    }

    // yearsAfterDeath: how long after this parent's death a child can be born.
    void checkBirthAgainstParent(PersonId id, PersonId parent, int oldest, int yearsAfterDeath) {
        if (parent == 0 || !data_.person(id).birth.isRead()) return;
        const Years birth = yearsOf(data_.person(id).birth);
        const Years parentBirth = yearsOf(data_.person(parent).birth);
        const Years parentDeath = yearsOf(data_.person(parent).death);
        const gedcom::LineNumber line = data_.person(id).line;
        if (birth.last < parentBirth.first) {
            report(Kind::bornBeforeParent, line, {xrefOf(id), xrefOf(parent)},
                   named(id) + " was born before the parent " + named(parent));
        } else if (birth.last - parentBirth.first < kYoungestParent) {
            report(Kind::parentTooYoung, line, {xrefOf(id), xrefOf(parent)},
                   named(id) + " has a parent younger than " + std::to_string(kYoungestParent) + ", " +
                       named(parent));
        } else if (birth.first - parentBirth.last > oldest) {
            report(Kind::parentTooOld, line, {xrefOf(id), xrefOf(parent)},
                   named(id) + " has a parent older than " + std::to_string(oldest) + ", " + named(parent));
        } else if (birth.first > parentDeath.last + yearsAfterDeath) {
            report(Kind::bornAfterParentsDeath, line, {xrefOf(id), xrefOf(parent)},
                   named(id) + " was born after the death of the parent " + named(parent));
        }
    }

    void checkFamily(FamilyId id) {
        const gedcom::Family& family = data_.family(id);
        checkPartner(id, family.husband);
        if (family.wife != family.husband) checkPartner(id, family.wife);
        for (const gedcom::ChildLink& link : data_.childLinks(id)) checkChild(id, link);
    }

    void checkPartner(FamilyId id, PersonId partner) {
        if (partner == 0) return;
        const gedcom::Family& family = data_.family(id);
        if (family.marriage.isRead() &&
            yearsOf(family.marriage).last < yearsOf(data_.person(partner).birth).first) {
            report(Kind::marriedBeforeBirth, family.line, {xrefOf(partner), xrefOfFamily(id)},
                   named(partner) + " married before being born");
        }
        if (family.marriage.isRead() &&
            yearsOf(family.marriage).first > yearsOf(data_.person(partner).death).last) {
            report(Kind::marriedAfterDeath, family.line, {xrefOf(partner), xrefOfFamily(id)},
                   named(partner) + " married after dying");
        }
    }

    void checkChild(FamilyId id, const gedcom::ChildLink& link) {
        if (link.child == 0 || !link.isChildsAlone) return;
        report(
            Kind::childNotListed, link.line, {xrefOf(link.child), xrefOfFamily(id)},
            named(link.child) + " names " + namedFamily(id) + " as parents, which does not list the child");
    }

    void findOwnAncestors() {
        for (const PersonId id : ownAncestors(data_))
            report(Kind::ownAncestor, data_.person(id).line, {xrefOf(id)},
                   named(id) + " is their own ancestor");
    }

    const GedcomData& data_;
    std::vector<DataFinding> findings_;
};

}  // namespace

const char* nameOf(DataFindingKind kind) {
    switch (kind) {
        case Kind::childNotListed:
            return "childNotListed";
        case Kind::parentsNotNamed:
            return "parentsNotNamed";
        case Kind::partnerNotNamed:
            return "partnerNotNamed";
        case Kind::marriageNotNamed:
            return "marriageNotNamed";
        case Kind::severalBirthFamilies:
            return "severalBirthFamilies";
        case Kind::diedBeforeBirth:
            return "diedBeforeBirth";
        case Kind::livedTooLong:
            return "livedTooLong";
        case Kind::bornBeforeParent:
            return "bornBeforeParent";
        case Kind::parentTooYoung:
            return "parentTooYoung";
        case Kind::parentTooOld:
            return "parentTooOld";
        case Kind::bornAfterParentsDeath:
            return "bornAfterParentsDeath";
        case Kind::marriedBeforeBirth:
            return "marriedBeforeBirth";
        case Kind::marriedAfterDeath:
            return "marriedAfterDeath";
        case Kind::ownAncestor:
            return "ownAncestor";
    }
    return "";
}

bool isFoundInData(gedcom::DiagnosticKind kind) {
    return kind == gedcom::DiagnosticKind::oneSidedLink || kind == gedcom::DiagnosticKind::contradictingLink;
}

std::vector<DataFinding> checkData(const GedcomData& data) {
    return DataChecker(data).check();
}

}  // namespace olvane::cli
