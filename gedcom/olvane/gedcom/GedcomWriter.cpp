// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A GEDCOM file record by record: which of the data are written, and in what order.

#include <olvane/gedcom/GedcomWriter.h>

#include <cstddef>
#include <cstdint>
#include <span>
#include <utility>

#include <olvane/gedcom/GedcomDetails.h>
#include <olvane/gedcom/LineWriterInternal.h>
#include <olvane/gedcom/TagCodeInternal.h>
#include <olvane/gedcom/WrittenXrefsInternal.h>

namespace olvane::gedcom {
namespace {

std::string_view pedigreeWord(Pedigree pedigree) {
    switch (pedigree) {
        case Pedigree::birth:
            return "birth";
        case Pedigree::adopted:
            return "adopted";
        case Pedigree::foster:
            return "foster";
        case Pedigree::sealing:
            return "sealing";
        case Pedigree::other:
            return "other";
        case Pedigree::step:
            return "step";
        case Pedigree::notGiven:
            break;
    }
    return {};
}

// Facts that have no meaning of their own, but the text that somebody wrote.
bool isFreeText(const Fact& fact) {
    return fact.tag == "EVEN" || fact.tag == "FACT";
}

// Behind a tag these say that something happened, or that it did not.
bool isYesOrNo(std::string_view value) {
    return value == "Y" || value == "N";
}

class Writer {
public:
    Writer(const GedcomData& data, const WriteOptions& options)
        : data_(data),
          options_(options),
          hidden_(data, options.hidden),
          xrefs_(data, hidden_),
          sharedIsInUse_(data.sharedRecords().size(), false) {}

    std::string text() && {
        reserveForNames();
        writeHeader();
        for (PersonId id = 1; id <= data_.personCount(); ++id) writePerson(id);
        for (FamilyId id = 1; id <= data_.familyCount(); ++id) writeFamily(id);
        for (std::size_t next = 0; next < sharedInUse_.size(); ++next) writeShared(sharedInUse_[next]);
        lines_.line(0, "TRLR");
        return std::move(lines_).take();
    }

private:
    // A name can be as long as a file, and a text that grows when it must holds what it has twice meanwhile.
    void reserveForNames() {
        constexpr std::size_t kUsualRecord = 512;
        std::size_t bytes = (data_.personCount() + 1) * kUsualRecord;
        for (PersonId id = 1; id <= data_.personCount(); ++id) {
            if (hidden_.isHidden(id)) continue;
            for (const PersonName& name : data_.names(id)) {
                bytes += name.written.size() + name.given.size() + name.surname.size();
            }
        }
        lines_.reserve(bytes);
    }

    std::string_view shown(std::string_view text) const { return hidden_.names().shownPlace(text); }
    std::string_view shownText(std::string_view text) const { return hidden_.names().shownText(text); }

    void writeHeader() {
        lines_.line(0, "HEAD");
        lines_.line(1, "SOUR", "Olvane");
        lines_.line(1, "GEDC");
        lines_.line(2, "VERS", "5.5.1");
        lines_.line(2, "FORM", "LINEAGE-LINKED");
        lines_.line(1, "CHAR", "UTF-8");
    }

    void writePerson(PersonId id) {
        const Person& person = data_.person(id);
        lines_.record(xrefs_.ofPerson(id), "INDI");
        if (hidden_.isHidden(id)) {
            lines_.line(1, "NAME", options_.hiddenName);
        } else {
            for (const PersonName& name : data_.names(id)) writeName(name);
        }
        if (person.sex != Sex::other) lines_.line(1, "SEX", person.sex == Sex::male ? "M" : "F");
        if (!hidden_.isHidden(id)) {
            for (const Fact& fact : data_.factsOfPerson(id)) writeFact(fact);
        }
        if (hidden_.isHidden(id)) {
            writeParentsAlone(id);
        } else {
            for (const FamilyLink& link : data_.parentLinks(id)) writeLink("FAMC", link);
        }
        for (const FamilyLink& link : data_.coupleLinks(id)) writeLink("FAMS", link);
        if (!hidden_.isHidden(id)) writeDetails(data_.detailsOfPerson(id), 1);
    }

    void writeName(const PersonName& name) {
        lines_.line(1, "NAME", name.written);
        lines_.piece("TYPE", name.type);
        lines_.piece("NPFX", name.prefix);
        lines_.piece("GIVN", name.given);
        lines_.piece("SURN", name.surname);
        lines_.piece("NSFX", name.suffix);
        lines_.piece("NICK", shownText(name.nickname));
        writeDetails(data_.detailsOfName(name), 2);
    }

    void writeFact(const Fact& fact) {
        const bool omitted = hidden_.names().isAnybodyHidden() && isFreeText(fact);
        const std::string_view value = omitted ? std::string_view() : shownText(fact.value);
        const std::string_view place = shown(fact.place);
        const std::string_view date = shown(fact.date.written);
        const bool bare = value.empty() && place.empty() && date.empty();
        if (bare && omitted) return;
        if (isYesOrNo(value)) {
            lines_.line(1, fact.tag);
            lines_.line(2, "TYPE", value);
        } else {
            lines_.line(1, fact.tag, bare ? std::string_view("Y") : value);
        }
        if (!date.empty()) lines_.date(date);
        lines_.piece("PLAC", place);
        writeDetails(data_.detailsOfFact(fact), 2);
    }

    // The trees of that level, which are the owner's own.
    void writeDetails(std::span<const DetailLine> lines, std::uint8_t level) {
        while (!lines.empty()) {
            const auto tree = takeDetailTree(lines);
            if (tree.front().level == level) writeDetailTree(tree);
        }
    }

    // A line that is left out takes along the lines below it.
    void writeDetailTree(std::span<const DetailLine> tree) {
        constexpr std::uint8_t kNone = 0xFF;
        std::uint8_t leftOut = kNone;
        for (const DetailLine& detail : tree) {
            if (leftOut != kNone && detail.level > leftOut) continue;
            leftOut = writeDetail(detail) ? kNone : detail.level;
        }
    }

    bool writeDetail(const DetailLine& detail) {
        if (!isWanted(detail.tag)) return false;
        if (!detail.isPointer) {
            if (!hidden_.isWritten(detail.value)) return false;
            lines_.text(detail.level, detail.tag, detail.value);
            return true;
        }
        const SharedRecord* const shared = data_.sharedByXref(detail.value);
        if (shared == nullptr || !hidden_.isWritten(shared->value)) return false;
        const auto place = static_cast<std::size_t>(shared - data_.sharedRecords().data());
        if (!sharedIsInUse_[place]) sharedInUse_.push_back(place);
        sharedIsInUse_[place] = true;
        lines_.pointer(detail.level, detail.tag, xrefs_.ofShared(place));
        return true;
    }

    bool isWanted(std::string_view tag) const {
        const std::uint64_t code = tagCode(tag);
        if (code == tagCode("NOTE") || code == tagCode("SNOTE")) return options_.notes;
        if (code == tagCode("OBJE")) return options_.media;
        return code != tagCode("SOUR") || options_.sources;
    }

    void writeShared(std::size_t place) {
        const SharedRecord& shared = data_.sharedRecords()[place];
        lines_.textRecord(xrefs_.ofShared(place), shared.tag, shared.value);
        writeDetails(data_.detailsOfShared(shared), 1);
    }

    void writeLink(std::string_view tag, const FamilyLink& link) {
        if (link.family == 0) return;
        lines_.pointer(1, tag, xrefs_.ofFamily(link.family));
        lines_.piece("PEDI", pedigreeWord(link.pedigree));
    }

    // The family that father and mother come from, as if there were no other.
    void writeParentsAlone(PersonId id) {
        const FamilyId family = data_.person(id).parentFamily;
        if (family != 0) lines_.pointer(1, "FAMC", xrefs_.ofFamily(family));
    }

    void writeFamily(FamilyId id) {
        const Family& family = data_.family(id);
        lines_.record(xrefs_.ofFamily(id), "FAM");
        if (family.husband != 0) lines_.pointer(1, "HUSB", xrefs_.ofPerson(family.husband));
        if (family.wife != 0) lines_.pointer(1, "WIFE", xrefs_.ofPerson(family.wife));
        for (const ChildLink& link : data_.childLinks(id)) {
            if (link.child == 0) continue;
            const bool omitted = hidden_.isHidden(link.child) && data_.person(link.child).parentFamily != id;
            if (!omitted) lines_.pointer(1, "CHIL", xrefs_.ofPerson(link.child));
        }
        if (hidden_.isBare(id)) return;
        for (const Fact& fact : data_.factsOfFamily(id)) writeFact(fact);
        writeDetails(data_.detailsOfFamily(id), 1);
    }

    const GedcomData& data_;
    const WriteOptions& options_;
    HiddenRecords hidden_;
    WrittenXrefs xrefs_;
    std::vector<bool> sharedIsInUse_;       // by place in the data's shared records
    std::vector<std::size_t> sharedInUse_;  // in the order in which they were pointed to
    LineWriter lines_;
};

}  // namespace

std::string writeGedcom(const GedcomData& data, const WriteOptions& options) {
    return Writer(data, options).text();
}

}  // namespace olvane::gedcom
