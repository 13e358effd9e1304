// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/gedcom/LifeOrder.h>

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <string_view>

namespace olvane::gedcom {

namespace {

enum class Rank : unsigned char { birth, dated, undated, end };

Rank rankOf(const Fact& fact) {
    if (fact.tag == "BIRT") return Rank::birth;
    for (const std::string_view last : {"DEAT", "BURI", "CREM", "PROB"}) {
        if (fact.tag == last) return Rank::end;
    }
    return fact.date.isRead() ? Rank::dated : Rank::undated;
}

// Grows with the rank, then with time, then with the place; a month or day that is not given comes before all others.
std::uint64_t keyOf(const Fact& fact, std::size_t place) {
    constexpr int kYears = 10000;  // before Christ
    constexpr int kNever = (1 << 28) - 1;
    const GedcomDate& date = fact.date;
    const int time = date.isRead() ? ((date.year + kYears) * 13 + date.month) * 32 + date.day : kNever;
    return static_cast<std::uint64_t>(rankOf(fact)) << 60 | static_cast<std::uint64_t>(time) << 32 | place;
}

}  // namespace

// One number for each fact, since those need no order of their own.
std::vector<const Fact*> inLifeOrder(std::span<const Fact> facts) {
    std::vector<std::uint64_t> keys;
    keys.reserve(facts.size());
    for (std::size_t i = 0; i < facts.size(); ++i) keys.push_back(keyOf(facts[i], i));
    std::sort(keys.begin(), keys.end());
    std::vector<const Fact*> order;
    order.reserve(facts.size());
    for (const std::uint64_t key : keys) order.push_back(&facts[static_cast<std::uint32_t>(key)]);
    return order;
}

}  // namespace olvane::gedcom
