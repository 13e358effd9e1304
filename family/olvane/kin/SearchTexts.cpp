// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/kin/SearchTexts.h>

#include <array>
#include <string>

#include <olvane/kin/Folding.h>

namespace olvane::kin {

namespace {

FoundIn placeOfPart(NameKind kind) {
    switch (kind) {
        case NameKind::nickname:
            return FoundIn::nickname;
        case NameKind::married:
            return FoundIn::marriedName;
        case NameKind::prefix:
        case NameKind::suffix:
            return FoundIn::title;
        default:
            return FoundIn::name;
    }
}

bool isPlace(std::string_view key) {
    const std::string folded = foldedForSearch(key);
    return folded.find("plac") != std::string::npos || folded.find("residence") != std::string::npos;
}

FoundIn placeOfField(std::string_view key) {
    if (key == "xref") return FoundIn::identifier;
    return isPlace(key) ? FoundIn::place : FoundIn::other;
}

}  // namespace

const char* nameOf(FoundIn in) {
    constexpr std::array<const char*, kFoundIns> kNames{
        "identifier", "name", "nickname", "marriedName", "title", "birth", "death", "place", "other"};
    return kNames[static_cast<std::size_t>(in)];
}

void FamilySearchTexts::visit(std::size_t place, const Visitor& visitor) const {
    const std::int64_t id = ids_[place];
    visitNames(id, visitor);
    const PersonRow row = family_.person(id);
    visitor({FoundIn::birth, row.birthWritten, "BIRT", true, row.birth});
    visitor({FoundIn::death, row.deathWritten, "DEAT", true, row.death});
    for (const LabelField& field : family_.fields(id))
        visitor({placeOfField(field.key), field.text, field.key, false, {}});
}

void FamilySearchTexts::visitNames(std::int64_t id, const Visitor& visitor) const {
    for (const NamePart& part : family_.names(id))
        visitor({placeOfPart(part.kind), part.text, {}, false, {}});
    if (family_.sex(id) != Sex::female) return;
    for (const FamilyId spouse : family_.spouses(id)) {
        if (family_.sex(spouse) != Sex::female)
            visitor({FoundIn::marriedName, family_.name(spouse, NameKind::surname), {}, false, {}});
    }
}

}  // namespace olvane::kin
