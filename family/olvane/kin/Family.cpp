// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Reading a table, and sharing one.

#include <olvane/kin/Family.h>

#include <cstring>
#include <stdexcept>
#include <string>
#include <utility>

#include <olvane/kin/FamilyStateInternal.h>

namespace olvane {

using detail::StoredFamily;
using detail::StoredPerson;

namespace detail {

void appendPacked(std::string& packed, PackedEntry entry, std::size_t headBytes) {
    for (std::size_t i = 0; i < headBytes; ++i) packed += static_cast<char>(entry.number >> (8 * i) & 0xFFU);
    const auto length = static_cast<std::uint32_t>(entry.text.size());
    char bytes[sizeof length];
    std::memcpy(bytes, &length, sizeof length);
    packed.append(bytes, sizeof length).append(entry.text);
}

PackedEntry takePacked(std::string_view& rest, std::size_t headBytes) {
    PackedEntry entry{0, {}};
    for (std::size_t i = 0; i < headBytes; ++i) {
        entry.number |= static_cast<std::uint32_t>(static_cast<unsigned char>(rest[i])) << (8 * i);
    }
    std::uint32_t length;
    std::memcpy(&length, rest.data() + headBytes, sizeof length);
    entry.text = rest.substr(headBytes + sizeof length, length);
    rest.remove_prefix(headBytes + sizeof length + length);
    return entry;
}

}  // namespace detail

Family::State::State(const State& other)
    : persons(other.persons),
      families(other.families),
      personIndex(other.personIndex),
      familyIndex(other.familyIndex),
      blobs(other.blobs),
      fieldKeys(other.fieldKeys),
      personCount(other.personCount),
      familyCount(other.familyCount),
      tidyWords(other.tidyWords) {}

void Family::State::release(State* state) noexcept {
    if (state != nullptr && state->owners.fetch_sub(1, std::memory_order_acq_rel) == 1) delete state;
}

const StoredPerson& Family::State::person(std::int64_t id) const {
    const std::uint32_t row = personRow(id);
    if (row == detail::IdIndex::kNoRow) throw std::out_of_range("no person has the id " + std::to_string(id));
    return persons[row];
}

const StoredFamily& Family::State::family(std::int64_t number) const {
    const std::uint32_t row = familyRow(number);
    if (row == detail::IdIndex::kNoRow)
        throw std::out_of_range("no family has the number " + std::to_string(number));
    return families[row];
}

const Family::State& Family::emptyState() {
    static const State empty;
    return empty;
}

Family::~Family() {
    State::release(state_);
}

Family::Family(const Family& other) noexcept : state_(other.state_) {
    if (state_ != nullptr) state_->owners.fetch_add(1, std::memory_order_relaxed);
}

Family::Family(Family&& other) noexcept : state_(std::exchange(other.state_, nullptr)) {}

Family& Family::operator=(const Family& other) noexcept {
    Family copy(other);
    std::swap(state_, copy.state_);
    return *this;
}

Family& Family::operator=(Family&& other) noexcept {
    std::swap(state_, other.state_);
    return *this;
}

std::size_t Family::personCount() const {
    return state().personCount;
}

std::size_t Family::familyCount() const {
    return state().familyCount;
}

bool Family::hasPerson(std::int64_t id) const {
    return state().personRow(id) != detail::IdIndex::kNoRow;
}

bool Family::hasFamily(std::int64_t number) const {
    return state().familyRow(number) != detail::IdIndex::kNoRow;
}

std::vector<FamilyId> Family::personIds() const {
    std::vector<FamilyId> ids;
    ids.reserve(personCount());
    for (std::size_t row = 0; row < state().persons.size(); ++row) {
        if (state().persons[row].id != 0) ids.push_back(state().persons[row].id);
    }
    return ids;
}

std::vector<FamilyId> Family::familyNumbers() const {
    std::vector<FamilyId> numbers;
    numbers.reserve(familyCount());
    for (std::size_t row = 0; row < state().families.size(); ++row) {
        if (state().families[row].number != 0) numbers.push_back(state().families[row].number);
    }
    return numbers;
}

PersonRow Family::person(std::int64_t id) const {
    const StoredPerson& stored = state().person(id);
    const detail::BlobStore& blobs = state().blobs;
    PersonRow row;
    row.id = stored.id;
    row.father = stored.father;
    row.mother = stored.mother;
    row.sex = stored.sex;
    row.dead = stored.dead;
    row.birth = blobs.text(stored.birth);
    row.death = blobs.text(stored.death);
    row.birthWritten = blobs.text(stored.birthWritten);
    row.deathWritten = blobs.text(stored.deathWritten);
    return row;
}

FamilyId Family::father(std::int64_t id) const {
    return state().person(id).father;
}

FamilyId Family::mother(std::int64_t id) const {
    return state().person(id).mother;
}

kin::Sex Family::sex(std::int64_t id) const {
    return state().person(id).sex;
}

bool Family::isDead(std::int64_t id) const {
    return state().person(id).dead;
}

std::string_view Family::birth(std::int64_t id) const {
    return state().blobs.text(state().person(id).birth);
}

std::string_view Family::death(std::int64_t id) const {
    return state().blobs.text(state().person(id).death);
}

std::span<const FamilyId> Family::spouses(std::int64_t id) const {
    return state().blobs.list(state().person(id).spouses);
}

FamilyId Family::preferredSpouse(std::int64_t id) const {
    return state().person(id).preferred;
}

std::span<const FamilyId> Family::children(std::int64_t id) const {
    return state().blobs.list(state().person(id).children);
}

std::vector<NamePart> Family::names(std::int64_t id) const {
    std::vector<NamePart> parts;
    for (std::string_view rest = state().blobs.text(state().person(id).names); !rest.empty();) {
        const detail::PackedEntry entry = detail::takePacked(rest, detail::kNameHeadBytes);
        parts.push_back({static_cast<NameKind>(entry.number), entry.text});
    }
    return parts;
}

std::string_view Family::name(std::int64_t id, NameKind kind) const {
    for (std::string_view rest = state().blobs.text(state().person(id).names); !rest.empty();) {
        const detail::PackedEntry entry = detail::takePacked(rest, detail::kNameHeadBytes);
        if (entry.number == static_cast<std::uint32_t>(kind)) return entry.text;
    }
    return {};
}

std::vector<LabelField> Family::fields(std::int64_t id) const {
    std::vector<LabelField> fields;
    for (std::string_view rest = state().blobs.text(state().person(id).fields); !rest.empty();) {
        const detail::PackedEntry entry = detail::takePacked(rest, detail::kFieldHeadBytes);
        fields.push_back({state().fieldKeys[entry.number], entry.text});
    }
    return fields;
}

std::string_view Family::field(std::int64_t id, std::string_view key) const {
    for (std::string_view rest = state().blobs.text(state().person(id).fields); !rest.empty();) {
        const detail::PackedEntry entry = detail::takePacked(rest, detail::kFieldHeadBytes);
        if (state().fieldKeys[entry.number] == key) return entry.text;
    }
    return {};
}

FamilyRow Family::family(std::int64_t number) const {
    const StoredFamily& stored = state().family(number);
    const detail::BlobStore& blobs = state().blobs;
    FamilyRow row;
    row.number = stored.number;
    row.partner0 = stored.partner0;
    row.partner1 = stored.partner1;
    row.state = stored.state;
    row.marriage = blobs.text(stored.marriage);
    row.marriageWritten = blobs.text(stored.marriageWritten);
    row.marriagePlace = blobs.text(stored.marriagePlace);
    return row;
}

std::vector<FamilyChild> Family::familyChildren(std::int64_t number) const {
    const StoredFamily& stored = state().family(number);
    const std::span<const FamilyId> children = state().blobs.list(stored.children);
    const std::string_view kinds = state().blobs.text(stored.kinds);
    std::vector<FamilyChild> result;
    result.reserve(children.size());
    for (std::size_t i = 0; i < children.size(); ++i) {
        result.push_back(
            {children[i], kinds.empty() ? kin::ChildKind::birth : static_cast<kin::ChildKind>(kinds[i])});
    }
    return result;
}

std::size_t Family::memoryBytes() const {
    std::size_t bytes = sizeof(State) + state().persons.memoryBytes() + state().families.memoryBytes() +
                        state().personIndex.memoryBytes() + state().familyIndex.memoryBytes() +
                        state().blobs.memoryBytes();
    for (const std::string& key : state().fieldKeys) bytes += sizeof(std::string) + key.capacity();
    return bytes;
}

}  // namespace olvane
