// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Records of persons and families, line by line. A line means something by its own tag, the tag of the fact
// above it and the sort of record it lies in; that is all the state there is. Names and links of one record
// lie together in lists that all records share, so a record that has few of them is small.

#include <olvane/gedcom/RecordReaderInternal.h>

#include <algorithm>
#include <array>
#include <cstddef>
#include <iterator>
#include <span>
#include <string>
#include <vector>

#include <olvane/gedcom/TagCodeInternal.h>

namespace olvane::gedcom {
namespace {

constexpr std::string_view kVoid = "VOID";

constexpr std::uint64_t kAdoption = tagCode("ADOP");
constexpr std::uint64_t kAlias = tagCode("ALIA");
constexpr std::uint64_t kAlsoKnownAs = tagCode("_AKA");
constexpr std::uint64_t kAlsoKnownAsName = tagCode("_AKAN");
constexpr std::uint64_t kBirth = tagCode("BIRT");
constexpr std::uint64_t kBurial = tagCode("BURI");
constexpr std::uint64_t kChild = tagCode("CHIL");
constexpr std::uint64_t kCremation = tagCode("CREM");
constexpr std::uint64_t kDate = tagCode("DATE");
constexpr std::uint64_t kDeath = tagCode("DEAT");
constexpr std::uint64_t kDivorce = tagCode("DIV");
constexpr std::uint64_t kFamily = tagCode("FAM");
constexpr std::uint64_t kFamilyAsChild = tagCode("FAMC");
constexpr std::uint64_t kFamilyAsSpouse = tagCode("FAMS");
constexpr std::uint64_t kFatherTie = tagCode("_FREL");
constexpr std::uint64_t kGiven = tagCode("GIVN");
constexpr std::uint64_t kHeader = tagCode("HEAD");
constexpr std::uint64_t kHusband = tagCode("HUSB");
constexpr std::uint64_t kIndividual = tagCode("INDI");
constexpr std::uint64_t kMarriage = tagCode("MARR");
constexpr std::uint64_t kMarriedName = tagCode("_MARNM");
constexpr std::uint64_t kMarriedNameInFull = tagCode("_MARNAME");
constexpr std::uint64_t kMotherTie = tagCode("_MREL");
constexpr std::uint64_t kName = tagCode("NAME");
constexpr std::uint64_t kNamePrefix = tagCode("NPFX");
constexpr std::uint64_t kNameSuffix = tagCode("NSFX");
constexpr std::uint64_t kNickname = tagCode("NICK");
constexpr std::uint64_t kNo = tagCode("NO");
constexpr std::uint64_t kPedigree = tagCode("PEDI");
constexpr std::uint64_t kPhrase = tagCode("PHRASE");
constexpr std::uint64_t kPlace = tagCode("PLAC");
constexpr std::uint64_t kProbate = tagCode("PROB");
constexpr std::uint64_t kSex = tagCode("SEX");
constexpr std::uint64_t kSurname = tagCode("SURN");
constexpr std::uint64_t kSurnamePrefix = tagCode("SPFX");
constexpr std::uint64_t kTrailer = tagCode("TRLR");
constexpr std::uint64_t kType = tagCode("TYPE");
constexpr std::uint64_t kWife = tagCode("WIFE");

bool isKnownRecord(std::uint64_t tag) {
    switch (tag) {
        case kHeader:
        case kIndividual:
        case kFamily:
        case kTrailer:
        case tagCode("NOTE"):
        case tagCode("SNOTE"):
        case tagCode("SOUR"):
        case tagCode("SUBM"):
        case tagCode("SUBN"):
        case tagCode("REPO"):
        case tagCode("OBJE"):
            return true;
        default:
            return false;
    }
}

struct FactTag {
    std::uint64_t code;
    std::string_view name;
};

// What is stated of persons and couples, but for numbers by which an office knows them, which are nobody's
// business.
constexpr std::string_view kFactNames[] = {
    "ADOP", "ANUL", "BAPM", "BARM", "BASM", "BIRT", "BLES", "BURI", "CAST", "CENS", "CHR",
    "CHRA", "CONF", "CREM", "DEAT", "DIV",  "DIVF", "DSCR", "EDUC", "EMIG", "ENGA", "EVEN",
    "FACT", "FCOM", "GRAD", "IMMI", "MARB", "MARC", "MARL", "MARR", "MARS", "NATI", "NATU",
    "NCHI", "NMR",  "OCCU", "ORDN", "PROB", "PROP", "RELI", "RESI", "RETI", "TITL", "WILL"};

constexpr auto kFactTags = [] {
    std::array<FactTag, std::size(kFactNames)> tags{};
    for (std::size_t i = 0; i < tags.size(); ++i) tags[i] = {tagCode(kFactNames[i]), kFactNames[i]};
    std::sort(tags.begin(), tags.end(), [](const FactTag& a, const FactTag& b) { return a.code < b.code; });
    return tags;
}();

// Empty for a tag that states no fact.
std::string_view factName(std::uint64_t tag) {
    const auto* const found =
        std::lower_bound(kFactTags.begin(), kFactTags.end(), tag,
                         [](const FactTag& fact, std::uint64_t code) { return fact.code < code; });
    return found != kFactTags.end() && found->code == tag ? found->name : std::string_view();
}

Sex sexOf(std::string_view value) {
    if (value == "M" || value == "m") return Sex::male;
    if (value == "F" || value == "f") return Sex::female;
    return Sex::other;
}

// Before 7.0, the value N negates the event.
bool didNotHappen(const GedcomLine& line) {
    return trimmed(line.value) == "N";
}

Pedigree pedigreeOf(std::string_view value) {
    switch (tagCode(value)) {
        case tagCode(""):
            return Pedigree::notGiven;
        case tagCode("BIRTH"):
            return Pedigree::birth;
        case tagCode("ADOPTED"):
            return Pedigree::adopted;
        case tagCode("FOSTER"):
            return Pedigree::foster;
        case tagCode("SEALING"):
            return Pedigree::sealing;
        case tagCode("STEP"):
            return Pedigree::step;
        default:
            return Pedigree::other;
    }
}

// What a program says of a child's tie to father or mother alone: "Natural", "Adopted", "Step".
Pedigree tieOf(std::string_view value) {
    const std::uint64_t word = tagCode(value.substr(0, 7));
    if (word == tagCode("NATURAL") || word == tagCode("BIOLOGI")) return Pedigree::birth;
    return word == tagCode("UNKNOWN") ? Pedigree::notGiven : pedigreeOf(value);
}

// Adds to a list that is read from a text of which this share is behind. A full list grows to what the whole
// text will take if it goes on so, and at least to twice its size: a big list moves once instead of many
// times.
template <typename Item>
void appendWithGrowthEstimate(std::vector<Item>& list, const Item& item, double share) {
    constexpr double kEnoughToJudge = 1.0 / 64;
    constexpr double kMargin = 1.05;
    if (list.size() == list.capacity() && share > kEnoughToJudge) {
        const auto foreseen = static_cast<std::size_t>(static_cast<double>(list.size()) / share * kMargin);
        list.reserve(std::max(foreseen, list.size() * 2));
    }
    list.push_back(item);
}

// The parts of a value at its slashes: before, between and behind them.
struct SlashParts {
    std::string_view before;
    std::string_view between;
    std::string_view behind;
};

SlashParts cutAtSlashes(std::string_view value) {
    const std::size_t first = value.find('/');
    if (first == std::string_view::npos) return {value, {}, {}};
    const std::size_t second = value.find('/', first + 1);
    if (second == std::string_view::npos)
        return {trimmed(value.substr(0, first)), trimmed(value.substr(first + 1)), {}};
    return {trimmed(value.substr(0, first)), trimmed(value.substr(first + 1, second - first - 1)),
            trimmed(value.substr(second + 1))};
}

// Fills the pieces that have no line of their own from the value. Where the surname comes first, what follows
// it is the given name; where both sides are there, it is a suffix.
void fillFromSlashes(PersonName& name) {
    SlashParts parts = cutAtSlashes(name.written);
    if (!name.prefix.empty() && parts.before.starts_with(name.prefix)) {
        parts.before = trimmed(parts.before.substr(name.prefix.size()));
    }
    const bool surnameFirst = parts.before.empty();
    if (name.given.empty()) name.given = surnameFirst ? parts.behind : parts.before;
    if (name.surname.empty()) name.surname = parts.between;
    if (name.suffix.empty() && !surnameFirst) name.suffix = parts.behind;
}

}  // namespace

bool RecordReader::readAll(void (*progress)(std::size_t done, std::size_t all)) {
    constexpr std::uint32_t kLinesBetween = 1U << 14U;
    const std::size_t all = scanner_.bytesLeft();
    GedcomLine line;
    while (scanner_.next(line)) {
        readLine(line);
        if (progress != nullptr && line.number % kLinesBetween == 0)
            progress(all - scanner_.bytesLeft(), all);
    }
    endRecord();
    if (anyRecord_ && !trailerSeen_) {
        diagnostics_.add(DiagnosticKind::missingTrailer, Severity::warning, scanner_.lineNumber(),
                         DiagnosticSentence::noTrailer, DiagnosticSentence::asFarAsItGoes);
    }
    return anyRecord_;
}

void RecordReader::readLine(const GedcomLine& line) {
    if (!anyLine_) checkBeginning(line);
    anyLine_ = true;
    if (details_ != nullptr && line.level > 0 && record_ == Record::other)
        details_->add(line, tagCode(line.tag));
    if (line.level > 0 && record_ == Record::other) return;
    const std::uint64_t tag = tagCode(line.tag);
    if (line.level > 3) {
        if (details_ != nullptr) details_->add(line, tag);
        return;
    }
    if (line.level == 0) return beginRecord(line);
    if (line.level == 1) {
        endName();
        openDate_ = nullptr;
        fact_ = tag;
        if (keepsFacts_) beginFact(line, tag);
        record_ == Record::person ? readPersonFact(line, tag) : readFamilyFact(line, tag);
        if (details_ != nullptr) beginDetails(line, tag);
        return;
    }
    if (line.level == 2) {
        openDate_ = nullptr;
        record_ == Record::person ? readPersonDetail(line, tag) : readFamilyDetail(line, tag);
        if (factOpen_) readFactDetail(line, tag);
        if (details_ != nullptr) keepDetail(line, tag);
        return;
    }
    if (details_ != nullptr) details_->add(line, tag);
    if (tag == kPhrase && openDate_ != nullptr) readDatePhrase(line);
}

void RecordReader::beginDetails(const GedcomLine& line, std::uint64_t tag) {
    if (nameOpen_) {
        details_->beginName();
    } else if (factOpen_) {
        details_->beginFact();
    } else {
        details_->beginOwn(line, tag);
    }
}

// What the tables of names and facts have is not kept again.
void RecordReader::keepDetail(const GedcomLine& line, std::uint64_t tag) {
    const bool keptWithFact =
        factOpen_ && (tag == kDate || tag == kPlace || (tag == kType && valueFromType_));
    const bool keptWithName = nameOpen_ && tag == kType;
    keptWithFact || keptWithName ? details_->leaveOut(line) : details_->add(line, tag);
}

void RecordReader::beginRecord(const GedcomLine& line) {
    endRecord();
    const std::uint64_t tag = tagCode(line.tag);
    checkEnd(line, tag);
    anyRecord_ = anyRecord_ || isKnownRecord(tag);
    fact_ = 0;
    if (tag == kIndividual) {
        beginPerson(line);
    } else if (tag == kFamily) {
        beginFamily(line);
    } else {
        record_ = Record::other;
        claimXref(line);
        if (details_ != nullptr) details_->beginShared(line, tag);
    }
}

void RecordReader::checkBeginning(const GedcomLine& line) {
    if (line.level == 0 && tagCode(line.tag) == kHeader) return;
    diagnostics_.add(DiagnosticKind::missingHeader, Severity::warning, line.number,
                     DiagnosticSentence::noHeader, DiagnosticSentence::withoutIt, line.tag);
}

void RecordReader::checkEnd(const GedcomLine& line, std::uint64_t tag) {
    if (trailerSeen_) {
        diagnostics_.add(DiagnosticKind::afterTrailer, Severity::warning, line.number,
                         DiagnosticSentence::recordBehindTrailer, DiagnosticSentence::likeOthers, line.tag);
    }
    trailerSeen_ = trailerSeen_ || tag == kTrailer;
}

void RecordReader::endRecord() {
    endName();
    openDate_ = nullptr;
    factOpen_ = false;
    if (record_ == Record::person) endPerson();
    if (record_ == Record::family) endFamily();
    record_ = Record::other;
}

// The place of the record's identifier, which is now known to have a record; null if it has none.
XrefTable::Entry* RecordReader::claimXref(const GedcomLine& line) {
    if (line.xref.empty()) return nullptr;
    XrefTable::Entry& entry = xrefs_.at(xrefs_.place(interner_.keep(line.xref, line.number)));
    if (entry.line != 0) {
        diagnostics_.add(DiagnosticKind::duplicateXref, Severity::warning, line.number,
                         DiagnosticPhrase{DiagnosticSentence::identifierInUse, {std::to_string(entry.line)}},
                         DiagnosticSentence::asOwnRecord, line.xref);
    } else {
        entry.line = line.number;
    }
    return &entry;
}

void RecordReader::beginPerson(const GedcomLine& line) {
    record_ = Record::person;
    sexRead_ = false;
    Person fresh;
    fresh.line = line.number;
    fresh.xref = interner_.keep(line.xref, line.number);
    fresh.nameSlice.first = static_cast<std::uint32_t>(tables_.names.size());
    fresh.parentLinkSlice.first = static_cast<std::uint32_t>(tables_.parentLinks.size());
    fresh.coupleLinkSlice.first = static_cast<std::uint32_t>(tables_.coupleLinks.size());
    appendWithGrowthEstimate(tables_.persons, fresh, scanner_.share());
    if (keepsFacts_) tables_.factsOfPersons.push_back({static_cast<std::uint32_t>(tables_.facts.size()), 0});
    if (details_ != nullptr) details_->beginPerson();
    XrefTable::Entry* entry = claimXref(line);
    if (entry != nullptr && entry->person == 0) entry->person = static_cast<PersonId>(tables_.persons.size());
}

std::string_view RecordReader::givenNameOfPerson() const {
    const Person& last = tables_.persons.back();
    return last.nameSlice.count == 0 ? std::string_view() : tables_.names[last.nameSlice.first].given;
}

// An adoption says of a link to the adoptive family what its PEDI did not.
void RecordReader::endPerson() {
    if (!furtherNames_.empty()) addFurtherNames(givenNameOfPerson());
    if (adoptiveFamilies_.empty()) return;
    const Slice slice = person().parentLinkSlice;
    for (FamilyLink& link : std::span(tables_.parentLinks).subspan(slice.first, slice.count)) {
        const auto& adoptive = adoptiveFamilies_;
        const bool isAdoptive = std::find(adoptive.begin(), adoptive.end(), link.family) != adoptive.end();
        if (isAdoptive && link.pedigree == Pedigree::notGiven) link.pedigree = Pedigree::adopted;
    }
    adoptiveFamilies_.clear();
}

void RecordReader::beginFamily(const GedcomLine& line) {
    record_ = Record::family;
    marriages_ = 0;
    marriedLast_ = false;
    husbands_ = {};
    wives_ = {};
    Family fresh;
    fresh.line = line.number;
    fresh.xref = interner_.keep(line.xref, line.number);
    fresh.childLinkSlice.first = static_cast<std::uint32_t>(tables_.childLinks.size());
    appendWithGrowthEstimate(tables_.families, fresh, scanner_.share());
    if (keepsFacts_) tables_.factsOfFamilies.push_back({static_cast<std::uint32_t>(tables_.facts.size()), 0});
    if (details_ != nullptr) details_->beginFamily();
    XrefTable::Entry* entry = claimXref(line);
    if (entry != nullptr && entry->family == 0)
        entry->family = static_cast<FamilyId>(tables_.families.size());
}

void RecordReader::readPersonFact(const GedcomLine& line, std::uint64_t tag) {
    switch (tag) {
        case kName:
            return beginName(line);
        case kSex:
            if (!sexRead_) person().sex = sexOf(trimmed(line.value));
            sexRead_ = true;
            return;
        case kBirth:
            passOverIfNot(line);
            return;
        case kDeath:
        case kBurial:
        case kCremation:
        case kProbate:
            person().dead = !passOverIfNot(line) || person().dead;
            return;
        case kAlias:
        case kAlsoKnownAs:
        case kAlsoKnownAsName:
            if (!trimmed(line.value).starts_with('@')) addFurtherName(line, "aka");
            return;
        case kMarriedName:
        case kMarriedNameInFull:
            return addFurtherName(line, "married");
        case kFamilyAsChild:
            tables_.parentLinks.push_back({readPointer(line), line.number});
            ++person().parentLinkSlice.count;
            return;
        case kFamilyAsSpouse:
            tables_.coupleLinks.push_back({readPointer(line), line.number});
            ++person().coupleLinkSlice.count;
            return;
        default:
            return;
    }
}

// Whatever stands below what did not happen did not happen either.
bool RecordReader::passOverIfNot(const GedcomLine& line) {
    if (!didNotHappen(line)) return false;
    fact_ = 0;
    return true;
}

void RecordReader::readPersonDetail(const GedcomLine& line, std::uint64_t tag) {
    if (fact_ == kName) return readNamePiece(line, tag);
    if (fact_ == kBirth && tag == kDate) return readDate(line, person().birth);
    if (fact_ == kDeath && tag == kDate) return readDate(line, person().death);
    if (fact_ == kFamilyAsChild && tag == kPedigree && !trimmed(line.value).empty()) {
        tables_.parentLinks.back().pedigree = pedigreeOf(trimmed(line.value));
    }
    if (fact_ == kAdoption && tag == kFamilyAsChild) adoptiveFamilies_.push_back(readPointer(line));
}

void RecordReader::readFamilyFact(const GedcomLine& line, std::uint64_t tag) {
    switch (tag) {
        case kHusband:
            return addPartner(line, husbands_);
        case kWife:
            return addPartner(line, wives_);
        case kChild:
            tables_.childLinks.push_back({readPointer(line), line.number});
            tiesOfChild_ = 0;
            ++family().childLinkSlice.count;
            return;
        case kNo:
            if (tagCode(trimmed(line.value)) == kMarriage) family().notMarried = true;
            return;
        case kMarriage:
            if (passOverIfNot(line)) {
                family().notMarried = true;
                return;
            }
            family().married = true;
            marriedLast_ = true;
            ++marriages_;
            return;
        case kDivorce:
            if (didNotHappen(line)) return;
            family().divorced = true;
            marriedLast_ = false;
            return;
        default:
            return;
    }
}

void RecordReader::readFamilyDetail(const GedcomLine& line, std::uint64_t tag) {
    if (fact_ == kMarriage && tag == kDate) return readDate(line, family().marriage);
    if (fact_ == kChild && (tag == kFatherTie || tag == kMotherTie)) readChildTie(tieOf(trimmed(line.value)));
}

// A child by birth of either parent is the family's by birth.
void RecordReader::readChildTie(Pedigree tie) {
    if (tie == Pedigree::notGiven) return;
    Pedigree& pedigree = tables_.childLinks.back().pedigree;
    if (tiesOfChild_++ == 0 || tie == Pedigree::birth) pedigree = tie;
}

void RecordReader::beginName(const GedcomLine& line) {
    name_ = {};
    nameOpen_ = true;
    name_.written = keptValue(line);
}

void RecordReader::readNamePiece(const GedcomLine& line, std::uint64_t tag) {
    switch (tag) {
        case kGiven:
            return addPiece(name_.given, line, " ");
        case kSurname:
            return addPiece(name_.surname, line, " ");
        case kSurnamePrefix:
            return addPiece(name_.surnamePrefix, line, " ");
        case kNamePrefix:
            return addPiece(name_.prefix, line, " ");
        case kNameSuffix:
            return addPiece(name_.suffix, line, " ");
        case kNickname:
            return addPiece(name_.nickname, line, ", ");
        case kType:
            if (name_.type.empty()) name_.type = keptValue(line);
            return;
        case kMarriedName:
        case kMarriedNameInFull:
            return addFurtherName(line, "married");
        case kAlsoKnownAs:
        case kAlsoKnownAsName:
            return addFurtherName(line, "aka");
        default:
            return;
    }
}

void RecordReader::addFurtherName(const GedcomLine& line, std::string_view type) {
    const std::string_view value = keptValue(line);
    if (!value.empty()) furtherNames_.push_back({value, type});
}

void RecordReader::addPiece(PieceDraft& piece, const GedcomLine& line, std::string_view separator) {
    const std::string_view more = keptValue(line);
    if (more.empty()) return;
    if (piece.first.empty()) {
        piece.first = more;
        return;
    }
    if (piece.joined.empty()) piece.joined = piece.first;
    piece.joined += separator;
    piece.joined += more;
}

std::string_view RecordReader::keptPiece(const PieceDraft& piece) {
    return piece.joined.empty() ? piece.first : interner_.keepMade(piece.joined);
}

void RecordReader::endName() {
    if (!nameOpen_) return;
    nameOpen_ = false;
    if (!name_.surname.first.empty() && !name_.surnamePrefix.first.empty()) {
        PieceDraft whole = name_.surnamePrefix;
        whole.joined = std::string(keptPiece(whole)) + " " + std::string(keptPiece(name_.surname));
        name_.surname = whole;
    }
    PersonName name;
    name.written = name_.written;
    name.prefix = keptPiece(name_.prefix);
    name.given = keptPiece(name_.given);
    name.surname = keptPiece(name_.surname);
    name.suffix = keptPiece(name_.suffix);
    name.nickname = keptPiece(name_.nickname);
    name.type = name_.type;
    fillFromSlashes(name);
    appendWithGrowthEstimate(tables_.names, name, scanner_.share());
    ++person().nameSlice.count;
    addFurtherNames(name.given);
}

// A married name is often the surname alone; the given name is that of the name it stands with then.
void RecordReader::addFurtherNames(std::string_view given) {
    for (const FurtherName& further : furtherNames_) {
        PersonName name;
        name.type = further.type;
        const bool surnameAlone =
            further.type == "married" && further.value.find_first_of("/ ") == std::string_view::npos;
        if (surnameAlone) {
            name.given = given;
            name.surname = further.value;
        } else {
            name.written = further.value;
            fillFromSlashes(name);
        }
        appendWithGrowthEstimate(tables_.names, name, scanner_.share());
        ++person().nameSlice.count;
    }
    furtherNames_.clear();
}

void RecordReader::beginFact(const GedcomLine& line, std::uint64_t tag) {
    const std::string_view name = factName(tag);
    factOpen_ = !name.empty() && !didNotHappen(line);
    if (!factOpen_) return;
    Fact fact;
    fact.tag = name;
    fact.line = line.number;
    if (trimmed(line.value) != "Y") fact.value = keptValue(line);
    valueFromType_ = fact.value.empty();
    tables_.facts.push_back(fact);
    ++factsInHand().count;
}

Slice& RecordReader::factsInHand() {
    return record_ == Record::person ? tables_.factsOfPersons.back() : tables_.factsOfFamilies.back();
}

// Of several dates, places and types the first stands. A date that the record has kept is taken from there, so
// that its trouble is reported once.
void RecordReader::readFactDetail(const GedcomLine& line, std::uint64_t tag) {
    Fact& fact = tables_.facts.back();
    if (tag == kPlace && fact.place.empty()) fact.place = keptValue(line);
    if (tag == kType && valueFromType_ && fact.value.empty()) fact.value = keptValue(line);
    if (tag != kDate || fact.date.isGiven()) return;
    fact.date = lastDate_.line == line.number ? lastDate_ : parseGedcomDate(keptValue(line));
    fact.date.line = line.number;
}

// Of several dates the first stands.
void RecordReader::readDate(const GedcomLine& line, GedcomDate& date) {
    if (date.isGiven()) return;
    const std::string_view value = keptValue(line);
    if (value.empty()) {
        openDate_ = &date;
        return;
    }
    date = parseGedcomDate(value);
    date.line = line.number;
    lastDate_ = date;
    if (date.isYearAlone) {
        diagnostics_.add(DiagnosticKind::ambiguousDate, Severity::note, line.number,
                         DiagnosticSentence::dayOrMonth, DiagnosticSentence::yearAlone, value);
    }
    if (date.isRead() || value.front() == '(') return;
    diagnostics_.add(DiagnosticKind::unreadableDate, Severity::note, line.number,
                     DiagnosticSentence::dateNotRead, DiagnosticSentence::asWritten, value);
}

// A phrase that is a date is as good as one.
void RecordReader::readDatePhrase(const GedcomLine& line) {
    *openDate_ = parseGedcomDate(keptValue(line));
    openDate_->line = line.number;
    if (factOpen_ && !tables_.facts.back().date.isGiven()) tables_.facts.back().date = *openDate_;
    openDate_ = nullptr;
}

void RecordReader::addPartner(const GedcomLine& line, PartnerDraft& draft) {
    const XrefPlace place = readPointer(line);
    if (place == 0) return;
    if (draft.count == draft.mentions.size()) return refusePartner(line.number);
    draft.mentions[draft.count++] = {place, line.number};
}

void RecordReader::refusePartner(LineNumber line) {
    diagnostics_.add(DiagnosticKind::tooManyPartners, Severity::error, line, DiagnosticSentence::thirdPartner,
                     DiagnosticSentence::leftOut, family().xref);
}

void RecordReader::endFamily() {
    settlePartners();
    if (marriages_ > 1 && marriedLast_) family().divorced = false;
    if (family().married) family().notMarried = false;
}

// One HUSB and one WIFE if there are both; else two of one tag in their order.
void RecordReader::settlePartners() {
    const bool couple = husbands_.count > 0 && wives_.count > 0;
    if (couple && husbands_.count > 1) refusePartner(husbands_.mentions[1].line);
    if (couple && wives_.count > 1) refusePartner(wives_.mentions[1].line);
    const bool twoWives = !couple && wives_.count == 2;
    const bool twoHusbands = !couple && husbands_.count == 2;
    const auto husband = twoWives ? wives_.mentions[0] : husbands_.mentions[0];
    const auto wife = twoHusbands ? husbands_.mentions[1] : wives_.mentions[twoWives ? 1 : 0];
    family().husband = husband.place;
    family().husbandLine = husband.line;
    family().wife = wife.place;
    family().wifeLine = wife.line;
}

XrefPlace RecordReader::readPointer(const GedcomLine& line) {
    const std::string_view xref = pointedXref(line);
    return xref.empty() || xref == kVoid ? 0 : xrefs_.place(interner_.keep(xref, line.number));
}

// Empty if there is none. A void pointer is as good as none, and needs no word.
std::string_view RecordReader::pointedXref(const GedcomLine& line) {
    const std::string_view value = trimmed(line.value);
    if (value.empty() || value.front() != '@') {
        diagnostics_.add(DiagnosticKind::wrongPointer, Severity::error, line.number,
                         DiagnosticSentence::linkWithoutPointer, DiagnosticSentence::leftOut,
                         value.empty() ? line.tag : value);
        return {};
    }
    const std::size_t end = std::min(value.find('@', 1), value.size());
    if (end + 1 != value.size()) {
        diagnostics_.add(DiagnosticKind::brokenXref, Severity::warning, line.number,
                         DiagnosticSentence::pointerWithoutEnd, DiagnosticSentence::asIfItDid, value);
    }
    return trimmed(value.substr(1, end - 1));
}

}  // namespace olvane::gedcom
