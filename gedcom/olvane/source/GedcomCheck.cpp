// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What is odd in a file: the remarks on its persons and years, each with the line that it comes from, and those on
// records that name each other from one side alone, which only a file has.

#include <olvane/source/GedcomCheck.h>

#include <algorithm>
#include <string_view>
#include <utility>

#include <olvane/kin/shared/MergeSort.h>
#include <olvane/source/GedcomKin.h>
#include <olvane/source/GedcomLives.h>

namespace olvane::gedcom {

namespace {

using kin::Remark;
using Kind = kin::RemarkKind;

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
    explicit DataChecker(const GedcomData& data) : data_(data) {}

    std::vector<FileRemark> check() {
        for (PersonId id = 1; id <= data_.personCount(); ++id) {
            checkParentLinks(id);
            checkCoupleLinks(id);
        }
        for (FamilyId id = 1; id <= data_.familyCount(); ++id) {
            for (const ChildLink& link : data_.childLinks(id)) checkChild(id, link);
        }
        const kin::KinGraph graph = kinGraphOf(data_);
        // Families by birth were looked at above, with those whose partners nobody knows.
        for (const Remark& remark : kin::checkData(graph, livesOf(data_, graph))) {
            if (remark.kind != Kind::severalBirthFamilies) report(remark, lineOf(remark));
        }
        kin::mergeSort(findings_.begin(), findings_.end(),
                       [](const FileRemark& a, const FileRemark& b) { return a.line < b.line; });
        return std::move(findings_);
    }

private:
    void report(const Remark& remark, LineNumber line) {
        FileRemark finding{remark, line, {}};
        const auto add = [&finding](std::string_view xref) {
            if (!xref.empty()) finding.xrefs.emplace_back(xref);
        };
        const bool familyFirst =
            remark.kind == Kind::parentsNotNamed || remark.kind == Kind::marriageNotNamed;
        const bool namesFamily = remark.family != 0 && remark.kind != Kind::severalBirthFamilies;
        if (namesFamily && familyFirst) add(data_.family(remark.family).xref);
        for (const kin::Place person : {remark.person, remark.other}) {
            if (person == kin::kNobody) continue;
            add(data_.person(idOf(person)).xref);
            finding.persons.push_back(idOf(person));
        }
        if (namesFamily && !familyFirst) add(data_.family(remark.family).xref);
        findings_.push_back(std::move(finding));
    }

    void reportLink(Kind kind, PersonId id, FamilyId family, LineNumber line) {
        report({kind, placeOf(id), kin::kNobody, family, 0}, line);
    }

    // That of the marriage, or of the person.
    LineNumber lineOf(const Remark& remark) const {
        if (remark.kind == Kind::marriedBeforeBirth || remark.kind == Kind::marriedAfterDeath)
            return data_.family(remark.family).line;
        return data_.person(idOf(remark.person)).line;
    }

    void checkParentLinks(PersonId id) {
        std::size_t births = 0;
        for (const FamilyLink& link : data_.parentLinks(id)) {
            if (link.family == 0) continue;
            if (link.isNamedByFamilyOnly) reportLink(Kind::parentsNotNamed, id, link.family, link.line);
            const bool byBirth = link.pedigree == Pedigree::birth || link.pedigree == Pedigree::notGiven;
            if (byBirth && ++births == 2) reportLink(Kind::severalBirthFamilies, id, link.family, link.line);
        }
    }

    void checkCoupleLinks(PersonId id) {
        for (const FamilyLink& link : data_.coupleLinks(id)) {
            if (link.family == 0) continue;
            if (link.isNamedByFamilyOnly) {
                reportLink(Kind::marriageNotNamed, id, link.family, link.line);
            } else if (!namesPartner(data_.family(link.family), id, link.line)) {
                reportLink(Kind::partnerNotNamed, id, link.family, link.line);
            }
        }
    }

    // A partner whom the family does not name stands there by the line of their own link.
    static bool namesPartner(const Family& family, PersonId id, LineNumber own) {
        return (family.husband == id && family.husbandLine != own) ||
               (family.wife == id && family.wifeLine != own);
    }

    void checkChild(FamilyId id, const ChildLink& link) {
        if (link.child != 0 && link.isNamedByChildOnly)
            reportLink(Kind::childNotListed, link.child, id, link.line);
    }

    const GedcomData& data_;
    std::vector<FileRemark> findings_;
};

// Whether checkData finds, with names, what the reader has reported by a diagnostic of this kind.
bool isFoundInData(DiagnosticKind kind) {
    return kind == DiagnosticKind::oneSidedLink || kind == DiagnosticKind::contradictingLink;
}

}  // namespace

std::string_view FileRemark::kind() const {
    if (const auto* diagnostic = std::get_if<const Diagnostic*>(&about)) return kindName((*diagnostic)->kind);
    return kin::nameOf(std::get<Remark>(about).kind);
}

std::string_view FileRemark::severity() const {
    if (const auto* diagnostic = std::get_if<const Diagnostic*>(&about))
        return severityName((*diagnostic)->severity);
    return "odd";
}

std::vector<FileRemark> checkData(const GedcomData& data) {
    return DataChecker(data).check();
}

std::vector<FileRemark> remarksOf(const GedcomData& data) {
    std::vector<FileRemark> remarks;
    for (const Diagnostic& diagnostic : data.diagnostics()) {
        if (!isFoundInData(diagnostic.kind)) remarks.push_back({&diagnostic, diagnostic.line, {}});
    }
    for (FileRemark& finding : checkData(data)) remarks.push_back(std::move(finding));
    return remarks;
}

std::string remarkText(const GedcomData& data, const FileRemark& remark, kin::Language language,
                       const PersonNamer& nameOf) {
    if (const auto* diagnostic = std::get_if<const Diagnostic*>(&remark.about)) {
        const std::string_view code = kin::languageCode(language);
        const std::string done = doneText(**diagnostic, code);
        return whatText(**diagnostic, code) + (done.empty() ? "" : "; " + done);
    }
    kin::RemarkNames names;
    names.person = [&data, &nameOf](kin::Place place) {
        return tagOf(data.person(idOf(place)).xref) + " " + nameOf(data, idOf(place));
    };
    names.family = [&data](std::uint32_t family) { return tagOf(data.family(family).xref); };
    return kin::remarkText(std::get<Remark>(remark.about), names, language);
}

std::string remarkText(const GedcomData& data, const FileRemark& remark, kin::Language language) {
    return remarkText(data, remark, language,
                      [](const GedcomData& of, PersonId id) { return displayName(of.firstName(id)); });
}

}  // namespace olvane::gedcom
