// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What is odd in a file: the remarks on its persons and years, each with the line that it comes from, and those on
// records that name each other from one side alone, which only a file has.

#include <cli/DataCheck.h>

#include <algorithm>
#include <string_view>
#include <utility>

#include <olvane/source/GedcomKin.h>
#include <olvane/source/GedcomLives.h>

#include <cli/FocusChoice.h>

namespace olvane::cli {

namespace {

using gedcom::FamilyId;
using gedcom::GedcomData;
using gedcom::PersonId;
using kin::Remark;
using Kind = DataFindingKind;

std::string tagOf(std::string_view xref) {
    return xref.empty() ? "(no xref)" : "@" + std::string(xref) + "@";
}

kin::Place placeOf(PersonId id) {
    return static_cast<kin::Place>(id - 1);
}

PersonId idOf(kin::Place place) {
    return static_cast<PersonId>(place + 1);
}

class DataChecker {
public:
    explicit DataChecker(const GedcomData& data) : data_(data) {
        names_.person = [&data](kin::Place place) {
            return tagOf(data.person(idOf(place)).xref) + " " + readableName(data, idOf(place));
        };
        names_.family = [&data](std::uint32_t family) { return tagOf(data.family(family).xref); };
    }

    std::vector<DataFinding> check() {
        for (PersonId id = 1; id <= data_.personCount(); ++id) {
            checkParentLinks(id);
            checkCoupleLinks(id);
        }
        for (FamilyId id = 1; id <= data_.familyCount(); ++id) {
            for (const gedcom::ChildLink& link : data_.childLinks(id)) checkChild(id, link);
        }
        const kin::KinGraph graph = gedcom::kinGraphOf(data_);
        // Families by birth were looked at above, with those whose partners nobody knows.
        for (const Remark& remark : kin::checkData(graph, gedcom::livesOf(data_, graph))) {
            if (remark.kind != Kind::severalBirthFamilies) report(remark, lineOf(remark));
        }
        std::stable_sort(findings_.begin(), findings_.end(),
                         [](const DataFinding& a, const DataFinding& b) { return a.line < b.line; });
        return std::move(findings_);
    }

private:
    void report(const Remark& remark, gedcom::LineNumber line) {
        DataFinding finding{remark.kind, line, {}, remarkText(remark, names_, kin::Language::english)};
        const auto add = [&finding](std::string_view xref) {
            if (!xref.empty()) finding.xrefs.emplace_back(xref);
        };
        const bool familyFirst =
            remark.kind == Kind::parentsNotNamed || remark.kind == Kind::marriageNotNamed;
        const bool namesFamily = remark.family != 0 && remark.kind != Kind::severalBirthFamilies;
        if (namesFamily && familyFirst) add(data_.family(remark.family).xref);
        add(data_.person(idOf(remark.person)).xref);
        if (remark.other != kin::kNobody) add(data_.person(idOf(remark.other)).xref);
        if (namesFamily && !familyFirst) add(data_.family(remark.family).xref);
        findings_.push_back(std::move(finding));
    }

    void reportLink(Kind kind, PersonId id, FamilyId family, gedcom::LineNumber line) {
        report({kind, placeOf(id), kin::kNobody, family, 0}, line);
    }

    // That of the marriage, or of the person.
    gedcom::LineNumber lineOf(const Remark& remark) const {
        if (remark.kind == Kind::marriedBeforeBirth || remark.kind == Kind::marriedAfterDeath)
            return data_.family(remark.family).line;
        return data_.person(idOf(remark.person)).line;
    }

    void checkParentLinks(PersonId id) {
        std::size_t births = 0;
        for (const gedcom::FamilyLink& link : data_.parentLinks(id)) {
            if (link.family == 0) continue;
            if (link.isNamedByFamilyOnly) reportLink(Kind::parentsNotNamed, id, link.family, link.line);
            const bool byBirth =
                link.pedigree == gedcom::Pedigree::birth || link.pedigree == gedcom::Pedigree::notGiven;
            if (byBirth && ++births == 2) reportLink(Kind::severalBirthFamilies, id, link.family, link.line);
        }
    }

    void checkCoupleLinks(PersonId id) {
        for (const gedcom::FamilyLink& link : data_.coupleLinks(id)) {
            if (link.family == 0) continue;
            if (link.isNamedByFamilyOnly) {
                reportLink(Kind::marriageNotNamed, id, link.family, link.line);
            } else if (!namesPartner(data_.family(link.family), id, link.line)) {
                reportLink(Kind::partnerNotNamed, id, link.family, link.line);
            }
        }
    }

    // A partner whom the family does not name stands there by the line of their own link.
    static bool namesPartner(const gedcom::Family& family, PersonId id, gedcom::LineNumber own) {
        return (family.husband == id && family.husbandLine != own) ||
               (family.wife == id && family.wifeLine != own);
    }

    void checkChild(FamilyId id, const gedcom::ChildLink& link) {
        if (link.child != 0 && link.isNamedByChildOnly)
            reportLink(Kind::childNotListed, link.child, id, link.line);
    }

    const GedcomData& data_;
    kin::RemarkNames names_;
    std::vector<DataFinding> findings_;
};

}  // namespace

bool isFoundInData(gedcom::DiagnosticKind kind) {
    return kind == gedcom::DiagnosticKind::oneSidedLink || kind == gedcom::DiagnosticKind::contradictingLink;
}

std::vector<DataFinding> checkData(const GedcomData& data) {
    return DataChecker(data).check();
}

}  // namespace olvane::cli
