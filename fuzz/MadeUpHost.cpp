// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Bytes to a family. Most bytes name persons of the family, so that relations meet again, which is where
// layouts are difficult; the highest bytes name ids from the edges of the numbers. With the tidy bit the
// lists agree with the parents, as in a good data source; what the bytes list besides is added to that.

#include "MadeUpHost.h"

#include <algorithm>
#include <array>
#include <limits>
#include <new>
#include <stdexcept>
#include <utility>

namespace {

constexpr std::size_t kMostPersons = 20;
constexpr std::size_t kLongestList = 4;
constexpr std::size_t kFickleEvery = 7;
constexpr std::uint8_t kFirstOddByte = 240;

constexpr std::int64_t kNotFound = OlvaneViewerManagerWrapProtocol::kPersonNotFound;
constexpr std::int64_t kTwoTo32 = std::int64_t{1} << 32;
constexpr std::array<std::int64_t, 16> kOddIds = {0,
                                                  -1,
                                                  -2,
                                                  -3,
                                                  99,
                                                  kNotFound,
                                                  kNotFound - 1,
                                                  std::numeric_limits<std::int64_t>::min(),
                                                  std::numeric_limits<std::int32_t>::max(),
                                                  std::numeric_limits<std::int32_t>::min(),
                                                  kTwoTo32 + 1,
                                                  kTwoTo32,
                                                  kTwoTo32 - 1,
                                                  -kTwoTo32 + 2,
                                                  -100,
                                                  std::int64_t{std::numeric_limits<std::int32_t>::max()} + 1};

const std::array<std::string, 8> kDates = {
    "", "1900-01-01", "1900", "2", "\xC3\xA4", "\xE2\x82\xAC 1", "\xF0\x9F\x98", std::string("\0x", 2)};

std::uint32_t lowBits(std::int64_t id) {
    return static_cast<std::uint32_t>(static_cast<std::uint64_t>(id));
}

std::int64_t oddId(std::uint8_t byte) {
    return kOddIds[byte % kOddIds.size()];
}

// A byte of 0 is the first person in a list, and nobody as a parent.
std::int64_t idNamed(std::uint8_t byte, const std::vector<MadeUpPerson>& family) {
    return byte >= kFirstOddByte ? oddId(byte) : family[byte % family.size()].id;
}

std::int64_t nextParent(ByteSource& bytes, const std::vector<MadeUpPerson>& family) {
    const std::uint8_t byte = bytes.next();
    if (byte == 0) return kNotFound;
    return byte >= kFirstOddByte ? oddId(byte) : family[(byte - 1U) % family.size()].id;
}

std::vector<std::int64_t> nextList(ByteSource& bytes, const std::vector<MadeUpPerson>& family) {
    std::vector<std::int64_t> list(bytes.nextBelow(kLongestList + 1));
    for (std::int64_t& entry : list) entry = idNamed(bytes.next(), family);
    return list;
}

std::vector<MadeUpPerson> nameThem(ByteSource& bytes) {
    std::vector<MadeUpPerson> family(1 + bytes.nextBelow(kMostPersons));
    std::int64_t place = 0;
    for (MadeUpPerson& person : family) {
        const std::uint8_t byte = bytes.next();
        ++place;
        person.id = byte >= kFirstOddByte ? oddId(byte) : place;
    }
    return family;
}

void drawParents(ByteSource& bytes, std::vector<MadeUpPerson>& family) {
    for (MadeUpPerson& person : family) {
        person.father = nextParent(bytes, family);
        person.mother = nextParent(bytes, family);
    }
}

void drawLists(ByteSource& bytes, std::vector<MadeUpPerson>& family) {
    for (MadeUpPerson& person : family) {
        person.spouses = nextList(bytes, family);
        person.children = nextList(bytes, family);
    }
}

void describeThem(ByteSource& bytes, std::vector<MadeUpPerson>& family) {
    constexpr std::array<std::int32_t, 4> kSexes = {0, 1, 2, -1};
    for (MadeUpPerson& person : family) {
        const std::uint8_t traits = bytes.next();
        person.sex = kSexes[traits & 3U];
        person.dead = (traits & 4U) != 0;
        person.preferred = static_cast<std::uint8_t>((traits >> 3U) & 3U);
        person.date = kDates[static_cast<std::size_t>(traits >> 5U)];
    }
}

void enterOnce(std::vector<std::int64_t>& list, std::int64_t id) {
    const bool isThere = std::find(list.begin(), list.end(), id) != list.end();
    if (!isThere && list.size() < kLongestList) list.push_back(id);
}

MadeUpPerson* find(std::vector<MadeUpPerson>& family, std::int64_t id) {
    const auto found = std::find_if(family.begin(), family.end(), [id](const MadeUpPerson& person) {
        return lowBits(person.id) == lowBits(id);
    });
    return found == family.end() ? nullptr : &*found;
}

void makeListsAgreeWithParents(std::vector<MadeUpPerson>& family) {
    for (const MadeUpPerson& child : family) {
        MadeUpPerson* const father = child.father == kNotFound ? nullptr : find(family, child.father);
        MadeUpPerson* const mother = child.mother == kNotFound ? nullptr : find(family, child.mother);
        if (father != nullptr) enterOnce(father->children, child.id);
        if (mother != nullptr) enterOnce(mother->children, child.id);
        if (father == nullptr || mother == nullptr) continue;
        enterOnce(father->spouses, mother->id);
        enterOnce(mother->spouses, father->id);
    }
}

[[noreturn]] void throwSomething(std::uint8_t kind) {
    switch (kind % 3U) {
        case 0:
            throw std::runtime_error("the host's own error");
        case 1:
            throw std::bad_alloc();
        default:
            throw 17;
    }
}

}  // namespace

std::vector<MadeUpPerson> makeUpFamily(ByteSource& bytes) {
    const bool isTidy = bytes.nextBit();
    std::vector<MadeUpPerson> family = nameThem(bytes);
    drawParents(bytes, family);
    describeThem(bytes, family);
    drawLists(bytes, family);
    if (isTidy) makeListsAgreeWithParents(family);
    return family;
}

MadeUpHost::MadeUpHost(std::vector<MadeUpPerson> family, Mischief mischief)
    : family_(std::move(family)), mischief_(mischief) {
    stranger_.father = kNotFound;
    stranger_.mother = kNotFound;
}

// Ids count by their low 32 bits alone, as the engine has them.
const MadeUpPerson& MadeUpHost::answer(std::int64_t personId) {
    countCall();
    const MadeUpPerson* const person = find(family_, personId);
    if (person == nullptr) return stranger_;
    if (!mischief_.isFickle || calls_ % kFickleEvery != 0) return *person;
    return family_[calls_ / kFickleEvery % family_.size()];
}

void MadeUpHost::countCall() {
    ++calls_;
    if (calls_ == mischief_.throwsAtCall) throwSomething(mischief_.kindOfThrow);
    if (calls_ > kMostCalls) throw std::length_error("asked too often");
}

std::int64_t MadeUpHost::fatherForPersonWithID(std::int64_t personId) {
    return answer(personId).father;
}

std::int64_t MadeUpHost::motherForPersonWithID(std::int64_t personId) {
    return answer(personId).mother;
}

std::vector<std::int64_t> MadeUpHost::spousesForPersonWithID(std::int64_t personId) {
    return answer(personId).spouses;
}

std::vector<std::int64_t> MadeUpHost::childrenForPersonWithID(std::int64_t personId) {
    return answer(personId).children;
}

bool MadeUpHost::isPreferredSpouse(std::int64_t personId, std::int64_t spouseId) {
    const MadeUpPerson& person = answer(personId);
    if (person.preferred == 1 || person.spouses.empty()) return false;
    if (person.preferred == 2) return true;
    const std::int64_t chosen = person.preferred == 0 ? person.spouses.front() : person.spouses.back();
    return lowBits(chosen) == lowBits(spouseId);
}

bool MadeUpHost::isPersonDead(std::int64_t personId) {
    return answer(personId).dead;
}

std::string MadeUpHost::dateForPersonWithID(std::int64_t personId, bool isBirth) {
    const std::string& date = answer(personId).date;
    return isBirth ? date : date + date;
}

std::int32_t MadeUpHost::sexOfPersonWithID(std::int64_t personId) {
    return answer(personId).sex;
}
