// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A GEDCOM text line by line. Values are written as version 5.5.1 has them, every @ doubled but those of a
// calendar, on one line each however long, which every reader of ours takes.

#include <olvane/gedcom/GedcomWriter.h>

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <span>
#include <unordered_set>
#include <utility>

#include <olvane/gedcom/GedcomDetails.h>
#include <olvane/gedcom/HiddenNames.h>
#include <olvane/gedcom/TagCodeInternal.h>

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

// An identifier may hold anything but what ends it.
bool isPlainXref(std::string_view xref) {
    constexpr std::size_t kLongest = 64;
    return !xref.empty() && xref.size() <= kLongest && xref.find_first_of("@#! \t") == std::string_view::npos;
}

// The calendar at this place of a date, as "@#DJULIAN@"; empty where none stands. A reader takes one where a word
// begins, so that no @ that is text stands before it.
std::string_view calendarAt(std::string_view date, std::size_t at) {
    const std::string_view rest = date.substr(at);
    const bool beginsWord = at == 0 || date[at - 1] == ' ';
    if (!beginsWord || !(rest.starts_with("@#D") || rest.starts_with("@#d"))) return {};
    const std::size_t end = rest.find('@', 1);
    return end == std::string_view::npos ? std::string_view() : rest.substr(0, end + 1);
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
        : data_(data), options_(options), hiddenNames_(data, options.hidden) {}

    std::string text() && {
        reserveForNames();
        nameRecords();
        writeHeader();
        for (PersonId id = 1; id <= data_.personCount(); ++id) writePerson(id);
        for (FamilyId id = 1; id <= data_.familyCount(); ++id) writeFamily(id);
        for (std::size_t next = 0; next < sharedInUse_.size(); ++next) writeShared(sharedInUse_[next]);
        line(0, "TRLR");
        return std::move(text_);
    }

private:
    // A name can be as long as a file, and a text that grows when it must holds what it has twice meanwhile.
    void reserveForNames() {
        constexpr std::size_t kUsualRecord = 512;
        std::size_t bytes = (data_.personCount() + 1) * kUsualRecord;
        for (PersonId id = 1; id <= data_.personCount(); ++id) {
            if (isHidden(id)) continue;
            for (const PersonName& name : data_.names(id)) {
                bytes += name.written.size() + name.given.size() + name.surname.size();
            }
        }
        text_.reserve(bytes);
    }

    bool isHidden(PersonId id) const {
        return id != 0 && id <= options_.hidden.size() && options_.hidden[id - 1];
    }

    std::string_view shown(std::string_view text) const { return hiddenNames_.shownPlace(text); }
    std::string_view shownText(std::string_view text) const { return hiddenNames_.shownText(text); }

    bool isWritten(std::string_view text) const { return text.empty() || !shownText(text).empty(); }

    // Identifiers that stay are settled first, so that none that is made meets one of them, nor one that is hidden.
    void nameRecords() {
        personXrefs_.resize(data_.personCount());
        familyXrefs_.resize(data_.familyCount());
        for (PersonId id = 1; id <= data_.personCount(); ++id) {
            if (!isHidden(id)) keepXref(personXrefs_[id - 1], data_.person(id).xref);
        }
        for (FamilyId id = 1; id <= data_.familyCount(); ++id) {
            if (!isBare(id)) keepXref(familyXrefs_[id - 1], data_.family(id).xref);
        }
        nameSharedRecords();
        for (const Person& person : data_.persons()) taken_.insert(std::string(person.xref));
        for (const Family& family : data_.families()) taken_.insert(std::string(family.xref));
        for (PersonId id = 1; id <= data_.personCount(); ++id) makeXref(personXrefs_[id - 1], "P", id);
        for (FamilyId id = 1; id <= data_.familyCount(); ++id) makeXref(familyXrefs_[id - 1], "U", id);
        for (std::size_t i = 0; i < sharedXrefs_.size(); ++i) {
            makeXref(sharedXrefs_[i], "R", static_cast<std::uint32_t>(i + 1));
        }
    }

    void nameSharedRecords() {
        const auto shared = data_.sharedRecords();
        sharedXrefs_.resize(shared.size());
        sharedIsInUse_.resize(shared.size(), false);
        for (std::size_t i = 0; i < shared.size(); ++i) {
            if (isWritten(shared[i].value)) keepXref(sharedXrefs_[i], shared[i].xref);
        }
    }

    void keepXref(std::string& name, std::string_view xref) {
        if (isPlainXref(xref) && !shownText(xref).empty() && taken_.insert(std::string(xref)).second)
            name = xref;
    }

    void makeXref(std::string& name, const char* prefix, std::uint32_t id) {
        if (!name.empty()) return;
        name = prefix + std::to_string(id);
        while (!taken_.insert(name).second) name += 'X';
    }

    // A family of which nothing is written but who belongs to it: one with a hidden partner, or without a partner and
    // with hidden children, who alone know of it.
    bool isBare(FamilyId id) const {
        const Family& family = data_.family(id);
        if (isHidden(family.husband) || isHidden(family.wife)) return true;
        if (family.husband != 0 || family.wife != 0) return false;
        const auto links = data_.childLinks(id);
        return std::any_of(links.begin(), links.end(),
                           [this](const ChildLink& link) { return isHidden(link.child); });
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
        if (!isHidden(id)) writeDetails(data_.detailsOfPerson(id), 1);
    }

    void writeName(const PersonName& name) {
        line(1, "NAME", name.written);
        piece("TYPE", name.type);
        piece("NPFX", name.prefix);
        piece("GIVN", name.given);
        piece("SURN", name.surname);
        piece("NSFX", name.suffix);
        piece("NICK", shownText(name.nickname));
        writeDetails(data_.detailsOfName(name), 2);
    }

    void piece(std::string_view tag, std::string_view value) {
        if (!value.empty()) line(2, tag, value);
    }

    void writeFact(const Fact& fact) {
        const bool omitted = hiddenNames_.isAnybodyHidden() && isFreeText(fact);
        const std::string_view value = omitted ? std::string_view() : shownText(fact.value);
        const std::string_view place = shown(fact.place);
        const std::string_view date = shown(fact.date.written);
        const bool bare = value.empty() && place.empty() && date.empty();
        if (bare && omitted) return;
        if (isYesOrNo(value)) {
            line(1, fact.tag);
            line(2, "TYPE", value);
        } else {
            line(1, fact.tag, bare ? std::string_view("Y") : value);
        }
        if (!date.empty()) writeDate(date);
        piece("PLAC", place);
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
            if (!isWritten(detail.value)) return false;
            writeText(detail.level, detail.tag, detail.value);
            return true;
        }
        const SharedRecord* const shared = data_.sharedByXref(detail.value);
        if (shared == nullptr || !isWritten(shared->value)) return false;
        const auto place = static_cast<std::size_t>(shared - data_.sharedRecords().data());
        if (!sharedIsInUse_[place]) sharedInUse_.push_back(place);
        sharedIsInUse_[place] = true;
        pointer(detail.level, detail.tag, sharedXrefs_[place]);
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
        text_.append("0 @").append(sharedXrefs_[place]).append("@ ");
        writeValue(0, shared.tag, shared.value);
        writeDetails(data_.detailsOfShared(shared), 1);
    }

    // Lines of a text stand in lines of their own.
    void writeText(int level, std::string_view tag, std::string_view text) {
        text_ += static_cast<char>('0' + level);
        text_ += ' ';
        writeValue(level, tag, text);
    }

    void writeValue(int level, std::string_view tag, std::string_view text) {
        std::size_t end = text.find('\n');
        text_ += tag;
        appendValue(text.substr(0, end));
        while (end != std::string_view::npos) {
            const std::size_t begin = end + 1;
            end = text.find('\n', begin);
            start(level + 1, "CONT");
            appendValue(text.substr(begin, end == std::string_view::npos ? end : end - begin));
        }
    }

    void appendValue(std::string_view value) {
        if (!value.empty()) {
            text_ += ' ';
            appendDoubled(value);
        }
        text_ += '\n';
    }

    void writeDate(std::string_view date) {
        start(2, "DATE");
        text_ += ' ';
        for (std::size_t at = 0; at < date.size();) {
            const std::string_view calendar = calendarAt(date, at);
            if (calendar.empty()) appendDoubled(date.substr(at, 1));
            text_ += calendar;
            at += std::max<std::size_t>(calendar.size(), 1);
        }
        text_ += '\n';
    }

    void writeLink(std::string_view tag, const FamilyLink& link) {
        if (link.family == 0) return;
        pointer(1, tag, familyXrefs_[link.family - 1]);
        piece("PEDI", pedigreeWord(link.pedigree));
    }

    // The family that father and mother come from, as if there were no other.
    void writeParentsAlone(PersonId id) {
        const FamilyId family = data_.person(id).parentFamily;
        if (family != 0) pointer(1, "FAMC", familyXrefs_[family - 1]);
    }

    void writeFamily(FamilyId id) {
        const Family& family = data_.family(id);
        record(familyXrefs_[id - 1], "FAM");
        if (family.husband != 0) pointer(1, "HUSB", personXrefs_[family.husband - 1]);
        if (family.wife != 0) pointer(1, "WIFE", personXrefs_[family.wife - 1]);
        for (const ChildLink& link : data_.childLinks(id)) {
            if (link.child == 0) continue;
            const bool omitted = isHidden(link.child) && data_.person(link.child).parentFamily != id;
            if (!omitted) pointer(1, "CHIL", personXrefs_[link.child - 1]);
        }
        if (isBare(id)) return;
        for (const Fact& fact : data_.factsOfFamily(id)) writeFact(fact);
        writeDetails(data_.detailsOfFamily(id), 1);
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
        appendValue(value);
    }

    void start(int level, std::string_view tag) {
        text_ += static_cast<char>('0' + level);
        text_ += ' ';
        text_ += tag;
    }

    void appendDoubled(std::string_view value) {
        for (const char c : value) text_.append(c == '@' ? 2 : 1, c);
    }

    const GedcomData& data_;
    const WriteOptions& options_;
    HiddenNames hiddenNames_;
    std::unordered_set<std::string> taken_;
    std::vector<std::string> personXrefs_;
    std::vector<std::string> familyXrefs_;
    std::vector<std::string> sharedXrefs_;  // by place in the data's shared records, as all of these
    std::vector<bool> sharedIsInUse_;
    std::vector<std::size_t> sharedInUse_;  // in the order in which they were pointed to
    std::string text_;
};

}  // namespace

std::string writeGedcom(const GedcomData& data, const WriteOptions& options) {
    return Writer(data, options).text();
}

}  // namespace olvane::gedcom
