// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A GEDCOM text line by line. Values are written as version 5.5.1 has them, a leading @ doubled, on one line
// each however long, which every reader of ours takes.

#include <olvane/gedcom/GedcomWriter.h>

#include <cstddef>
#include <unordered_set>

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
        case Pedigree::notGiven:
            break;
    }
    return {};
}

// An identifier may hold anything but what ends it.
bool isPlainXref(std::string_view xref) {
    constexpr std::size_t kLongest = 64;
    return !xref.empty() && xref.size() <= kLongest && xref.find_first_of("@#! \t") == std::string_view::npos;
}

class Writer {
public:
    Writer(const GedcomData& data, const WriteOptions& options) : data_(data), options_(options) {}

    std::string text() && {
        nameRecords();
        writeHeader();
        for (PersonId id = 1; id <= data_.personCount(); ++id) writePerson(id);
        for (FamilyId id = 1; id <= data_.familyCount(); ++id) writeFamily(id);
        line(0, "TRLR");
        return std::move(text_);
    }

private:
    bool isHidden(PersonId id) const {
        return id != 0 && id <= options_.hidden.size() && options_.hidden[id - 1];
    }

    // Identifiers that stay are settled first, so that none that is made meets one of them.
    void nameRecords() {
        personXrefs_.resize(data_.personCount());
        familyXrefs_.resize(data_.familyCount());
        for (PersonId id = 1; id <= data_.personCount(); ++id) {
            if (!isHidden(id)) keepXref(personXrefs_[id - 1], data_.person(id).xref);
        }
        for (FamilyId id = 1; id <= data_.familyCount(); ++id) {
            if (!hasHiddenPartner(id)) keepXref(familyXrefs_[id - 1], data_.family(id).xref);
        }
        for (PersonId id = 1; id <= data_.personCount(); ++id) makeXref(personXrefs_[id - 1], "P", id);
        for (FamilyId id = 1; id <= data_.familyCount(); ++id) makeXref(familyXrefs_[id - 1], "U", id);
    }

    void keepXref(std::string& name, std::string_view xref) {
        if (isPlainXref(xref) && taken_.insert(std::string(xref)).second) name = xref;
    }

    void makeXref(std::string& name, const char* prefix, std::uint32_t id) {
        if (!name.empty()) return;
        name = prefix + std::to_string(id);
        while (!taken_.insert(name).second) name += 'X';
    }

    bool hasHiddenPartner(FamilyId id) const {
        const Family& family = data_.family(id);
        return isHidden(family.husband) || isHidden(family.wife);
    }

    void writeHeader() {
        line(0, "HEAD");
        line(1, "SOUR", "Olvane");
        line(1, "GEDC");
        line(2, "VERS", "5.5.1");
        line(2, "FORM", "LINEAGE-LINKED");
        line(1, "CHAR", "UTF-8");
    }

    void writePerson(PersonId id) {
        const Person& person = data_.person(id);
        record(personXrefs_[id - 1], "INDI");
        if (isHidden(id)) {
            line(1, "NAME", options_.hiddenName);
        } else {
            for (const PersonName& name : data_.names(id)) writeName(name);
        }
        if (person.sex != Sex::other) line(1, "SEX", person.sex == Sex::male ? "M" : "F");
        if (!isHidden(id)) {
            for (const Fact& fact : data_.factsOfPerson(id)) writeFact(fact);
        }
        if (isHidden(id)) {
            writeParentsAlone(id);
        } else {
            for (const FamilyLink& link : data_.parentLinks(id)) writeLink("FAMC", link);
        }
        for (const FamilyLink& link : data_.coupleLinks(id)) writeLink("FAMS", link);
    }

    void writeName(const PersonName& name) {
        line(1, "NAME", name.written);
        piece("NPFX", name.prefix);
        piece("GIVN", name.given);
        piece("SURN", name.surname);
        piece("NSFX", name.suffix);
        piece("NICK", name.nickname);
    }

    void piece(std::string_view tag, std::string_view value) {
        if (!value.empty()) line(2, tag, value);
    }

    void writeFact(const Fact& fact) {
        const bool bare = fact.value.empty() && fact.place.empty() && !fact.date.isGiven();
        line(1, fact.tag, bare ? std::string_view("Y") : fact.value);
        piece("DATE", fact.date.written);
        piece("PLAC", fact.place);
    }

    void writeLink(std::string_view tag, const FamilyLink& link) {
        if (link.family == 0) return;
        pointer(1, tag, familyXrefs_[link.family - 1]);
        piece("PEDI", pedigreeWord(link.pedigree));
    }

    // The family that father and mother come from, as if there were no other.
    void writeParentsAlone(PersonId id) {
        const Person& person = data_.person(id);
        for (const FamilyLink& link : data_.parentLinks(id)) {
            if (link.family == 0) continue;
            const Family& family = data_.family(link.family);
            if (family.husband != person.father || family.wife != person.mother) continue;
            return pointer(1, "FAMC", familyXrefs_[link.family - 1]);
        }
    }

    void writeFamily(FamilyId id) {
        const Family& family = data_.family(id);
        record(familyXrefs_[id - 1], "FAM");
        if (family.husband != 0) pointer(1, "HUSB", personXrefs_[family.husband - 1]);
        if (family.wife != 0) pointer(1, "WIFE", personXrefs_[family.wife - 1]);
        for (const ChildLink& link : data_.childLinks(id)) {
            if (link.child != 0) pointer(1, "CHIL", personXrefs_[link.child - 1]);
        }
        if (hasHiddenPartner(id)) return;
        for (const Fact& fact : data_.factsOfFamily(id)) writeFact(fact);
    }

    void record(std::string_view xref, std::string_view tag) {
        text_ += "0 @";
        text_ += xref;
        text_ += "@ ";
        text_ += tag;
        text_ += '\n';
    }

    void pointer(int level, std::string_view tag, std::string_view xref) {
        start(level, tag);
        text_ += " @";
        text_ += xref;
        text_ += "@\n";
    }

    void line(int level, std::string_view tag, std::string_view value = {}) {
        start(level, tag);
        if (!value.empty()) {
            text_ += ' ';
            appendDoubled(value);
        }
        text_ += '\n';
    }

    void start(int level, std::string_view tag) {
        text_ += static_cast<char>('0' + level);
        text_ += ' ';
        text_ += tag;
    }

    // A calendar's escape is no text, and stays as it is.
    void appendDoubled(std::string_view value) {
        if (value.starts_with("@#")) {
            text_ += value;
            return;
        }
        for (const char c : value) text_.append(c == '@' ? 2 : 1, c);
    }

    const GedcomData& data_;
    const WriteOptions& options_;
    std::unordered_set<std::string> taken_;
    std::vector<std::string> personXrefs_;
    std::vector<std::string> familyXrefs_;
    std::string text_;
};

}  // namespace

std::string writeGedcom(const GedcomData& data, const WriteOptions& options) {
    return Writer(data, options).text();
}

}  // namespace olvane::gedcom
