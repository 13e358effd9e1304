// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Judges who may be living, in doubt for the person's privacy. First those whose birth says so, then from each of them
// two steps to their kin, through whomever they lead, to those whose dates do not decide it.

#include <olvane/kin/Lives.h>

#include <cstdint>
#include <stdexcept>

namespace olvane::kin {

namespace {

constexpr int kSteps = 2;

enum class Sign : std::uint8_t { living, dead, unknown };

// "Before 1950" may be any year before, and "after 1900" any year after: the one counts as living where 1950 would,
// the other says nothing unless 1900 would.
Sign signOf(const Life& life, int thisYear) {
    const int oldestBirth = thisYear - kLongestLife;
    const bool hasEnd = life.birth.last != Years::kOpenEnd;
    if (life.isDead || (hasEnd && life.birth.last <= oldestBirth)) return Sign::dead;
    const int year = hasEnd ? life.birth.last : life.birth.first;
    return life.birth.isKnown() && year > oldestBirth ? Sign::living : Sign::unknown;
}

void addKin(const KinGraph& graph, Place person, std::vector<Place>& kin) {
    for (const UnionPlace u : graph.unionsAsChild(person)) {
        for (const Place parent : graph.partners(u)) kin.push_back(parent);
    }
    for (const UnionPlace u : graph.unionsAsPartner(person)) {
        kin.push_back(graph.otherPartner(u, person));
        kin.insert(kin.end(), graph.children(u).begin(), graph.children(u).end());
    }
}

// Marks everybody within kSteps links of those marked; each person is looked at once.
void markWithin(const KinGraph& graph, std::vector<bool>& near) {
    std::vector<Place> ring;
    for (Place person = 0; person < graph.personCount(); ++person) {
        if (near[static_cast<std::size_t>(person)]) ring.push_back(person);
    }
    for (int step = 0; step < kSteps; ++step) {
        std::vector<Place> kin;
        for (const Place person : ring) addKin(graph, person, kin);
        ring.clear();
        for (const Place person : kin) {
            if (person == kNobody || near[static_cast<std::size_t>(person)]) continue;
            near[static_cast<std::size_t>(person)] = true;
            ring.push_back(person);
        }
    }
}

}  // namespace

std::vector<bool> livingPersons(const KinGraph& graph, const Lives& lives, int thisYear) {
    const auto count = static_cast<std::size_t>(graph.personCount());
    if (lives.persons.size() != count) throw std::invalid_argument("each person has one life");
    std::vector<Sign> signs;
    std::vector<bool> near;
    signs.reserve(count);
    near.reserve(count);
    for (const Life& life : lives.persons) {
        signs.push_back(signOf(life, thisYear));
        near.push_back(signs.back() == Sign::living);
    }
    markWithin(graph, near);
    std::vector<bool> living(count, false);
    for (std::size_t i = 0; i < count; ++i) {
        living[i] = signs[i] == Sign::living || (signs[i] == Sign::unknown && near[i]);
    }
    return living;
}

}  // namespace olvane::kin
