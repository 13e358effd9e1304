// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <cstdint>
#include <span>
#include <string>
#include <vector>

#include <olvane/boundary/OlvaneViewerManagerWrapProtocol.h>

// Bytes that are read one after the other.
//
// Holds: behind the end stand zeros, so that every input means something, a short one too.
class ByteSource {
public:
    explicit ByteSource(std::span<const std::uint8_t> bytes) : bytes_(bytes) {}

    std::uint8_t next() { return at_ < bytes_.size() ? bytes_[at_++] : std::uint8_t{0}; }
    bool nextBit() { return (next() & 1U) != 0; }
    // 0 to count - 1.
    std::size_t nextBelow(std::size_t count) { return next() % count; }

private:
    std::span<const std::uint8_t> bytes_;
    std::size_t at_ = 0;
};

// One person as the bytes make it; the lists may name anybody, any number of times.
struct MadeUpPerson {
    std::int64_t id = 0;
    std::int64_t father = 0;
    std::int64_t mother = 0;
    std::vector<std::int64_t> spouses;
    std::vector<std::int64_t> children;
    std::int32_t sex = 0;
    bool dead = false;
    std::uint8_t preferred = 0;  // 0 the first spouse, 1 none, 2 everyone, 3 the last
    std::string date;
};

// How the host misbehaves, beyond what its family says.
struct Mischief {
    bool isFickle = false;         // now and then answers with another person's lists
    std::size_t throwsAtCall = 0;  // counted from 1; 0 for never
    std::uint8_t kindOfThrow = 0;
};

// Persons, at least one.
std::vector<MadeUpPerson> makeUpFamily(ByteSource& bytes);

// A data source that says what it was made of, in any contradiction.
//
// Holds: no layout goes on for ever: the call behind kMostCalls throws, whatever the mischief says. A spouse
//        listed twice is drawn with all children twice, so the questions can grow with a power of the list's
//        length.
class MadeUpHost final : public OlvaneViewerManagerWrapProtocol {
public:
    static constexpr std::size_t kMostCalls = 5'000;

    MadeUpHost(std::vector<MadeUpPerson> family, Mischief mischief);

    std::int64_t fatherForPersonWithID(std::int64_t personId) override;
    std::int64_t motherForPersonWithID(std::int64_t personId) override;
    std::vector<std::int64_t> spousesForPersonWithID(std::int64_t personId) override;
    std::vector<std::int64_t> childrenForPersonWithID(std::int64_t personId) override;
    bool isPreferredSpouse(std::int64_t personId, std::int64_t spouseId) override;
    bool isPersonDead(std::int64_t personId) override;
    std::string dateForPersonWithID(std::int64_t personId, bool isBirth) override;
    std::int32_t sexOfPersonWithID(std::int64_t personId) override;

private:
    const MadeUpPerson& answer(std::int64_t personId);
    void countCall();

    std::vector<MadeUpPerson> family_;
    MadeUpPerson stranger_;
    Mischief mischief_;
    std::size_t calls_ = 0;
};
