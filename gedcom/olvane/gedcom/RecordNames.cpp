// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Names: the value with its slashes, the pieces that have lines of their own, and further names that stand below a name or
// beside it.

#include <olvane/gedcom/RecordReaderInternal.h>

#include <cstddef>
#include <string>
#include <string_view>

#include <olvane/gedcom/GrowthEstimateInternal.h>
#include <olvane/gedcom/RecordTagsInternal.h>

namespace olvane::gedcom {
namespace {

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

void RecordReader::beginName(const GedcomLine& line) {
    name_ = {};
    nameOpen_ = true;
    name_.written = storedValue(line);
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
            if (name_.type.empty()) name_.type = storedValue(line);
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
    const std::string_view value = storedValue(line);
    if (!value.empty()) furtherNames_.push_back({value, type});
}

void RecordReader::addPiece(PieceDraft& piece, const GedcomLine& line, std::string_view separator) {
    const std::string_view more = storedValue(line);
    if (more.empty()) return;
    if (piece.first.empty()) {
        piece.first = more;
        return;
    }
    if (piece.joined.empty()) piece.joined = piece.first;
    piece.joined += separator;
    piece.joined += more;
}

std::string_view RecordReader::storedPiece(const PieceDraft& piece) {
    return piece.joined.empty() ? piece.first : interner_.keepMade(piece.joined);
}

void RecordReader::endName() {
    if (!nameOpen_) return;
    nameOpen_ = false;
    if (!name_.surname.first.empty() && !name_.surnamePrefix.first.empty()) {
        PieceDraft whole = name_.surnamePrefix;
        whole.joined = std::string(storedPiece(whole)) + " " + std::string(storedPiece(name_.surname));
        name_.surname = whole;
    }
    PersonName name;
    name.written = name_.written;
    name.prefix = storedPiece(name_.prefix);
    name.given = storedPiece(name_.given);
    name.surname = storedPiece(name_.surname);
    name.suffix = storedPiece(name_.suffix);
    name.nickname = storedPiece(name_.nickname);
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

}  // namespace olvane::gedcom
