// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/kin/DataCheck.h>

#include <algorithm>
#include <stdexcept>
#include <utility>

namespace olvane::kin {

namespace {

bool isByBirth(ChildKind kind) {
    return kind != ChildKind::adopted && kind != ChildKind::foster && kind != ChildKind::step;
}

class DataChecker {
public:
    DataChecker(const KinGraph& graph, const Lives& lives) : graph_(graph), lives_(lives) {
        const auto persons = static_cast<std::size_t>(graph.personCount());
        const auto unions = static_cast<std::size_t>(graph.unionCount());
        if (lives.persons.size() != persons || lives.marriages.size() != unions) {
            throw std::invalid_argument("each person has one life, and each union one marriage");
        }
        findFirstParents();
    }

    std::vector<Remark> check() {
        for (Place person = 0; person < graph_.personCount(); ++person) checkPerson(person);
        for (UnionPlace u = 0; u < graph_.unionCount(); ++u) checkMarriage(u);
        for (const Place person : ownAncestors(graph_)) add(RemarkKind::ownAncestor, person);
        return std::move(remarks_);
    }

private:
    const Life& life(Place person) const { return lives_.persons[static_cast<std::size_t>(person)]; }

    void add(RemarkKind kind, Place person, Place other = kNobody, std::uint32_t family = 0, int years = 0) {
        remarks_.push_back({kind, person, other, family, years});
    }

    // Read from the unions, so that a union with very many children is read once.
    void findFirstParents() {
        const auto persons = static_cast<std::size_t>(graph_.personCount());
        parentsByBirth_.assign(persons, {kNobody, kNobody});
        secondBirthFamily_.assign(persons, kNoUnion);
        std::vector<std::uint8_t> births(persons, 0);
        for (UnionPlace u = 0; u < graph_.unionCount(); ++u) {
            const auto children = graph_.children(u);
            for (std::size_t i = 0; i < children.size(); ++i) {
                const auto child = static_cast<std::size_t>(children[i]);
                const ChildKind kind = graph_.childKinds(u)[i];
                if (isByBirth(kind) && graph_.unionsAsChild(children[i]).front() == u)
                    parentsByBirth_[child] = graph_.partners(u);
                if (kind != ChildKind::birth) continue;
                if (graph_.unionsAsChild(children[i]).front() != u && secondBirthFamily_[child] == kNoUnion)
                    secondBirthFamily_[child] = u;
                births[child] = static_cast<std::uint8_t>(std::min(births[child] + 1, 2));
            }
        }
        for (std::size_t i = 0; i < persons; ++i) {
            if (births[i] < 2) secondBirthFamily_[i] = kNoUnion;
        }
    }

    void checkPerson(Place person) {
        const auto place = static_cast<std::size_t>(person);
        if (secondBirthFamily_[place] != kNoUnion) {
            add(RemarkKind::severalBirthFamilies, person, kNobody, graph_.family(secondBirthFamily_[place]));
        }
        checkLife(person);
        const auto& parents = parentsByBirth_[place];
        for (std::size_t slot = 0; slot < 2; ++slot) {
            const Place parent = parents[slot];
            if (parent == kNobody || parent == person) continue;
            const Sex sex = graph_.sex(parent);
            checkBirthAgainst(person, parent, sex == Sex::female || (sex == Sex::unknown && slot == 1));
        }
    }

    void checkLife(Place person) {
        const Years& birth = life(person).birth;
        const Years& death = life(person).death;
        if (!birth.isKnown() || !death.isKnown()) return;
        if (death.latest() < birth.earliest()) {
            add(RemarkKind::diedBeforeBirth, person);
        } else if (death.earliest() - birth.latest() > kLongestLife) {
            add(RemarkKind::livedTooLong, person, kNobody, 0, kLongestLife);
        }
    }

    // A father's child may be born a year after his death.
    void checkBirthAgainst(Place person, Place parent, bool isMother) {
        const Years& birth = life(person).birth;
        if (!birth.isKnown()) return;
        const Years& parentBirth = life(parent).birth;
        const Years& parentDeath = life(parent).death;
        const int oldest = isMother ? kOldestMother : kOldestFather;
        if (birth.latest() < parentBirth.earliest()) {
            add(RemarkKind::bornBeforeParent, person, parent);
        } else if (birth.latest() - parentBirth.earliest() < kYoungestParent) {
            add(RemarkKind::parentTooYoung, person, parent, 0, kYoungestParent);
        } else if (birth.earliest() - parentBirth.latest() > oldest) {
            add(RemarkKind::parentTooOld, person, parent, 0, oldest);
        } else if (birth.earliest() > parentDeath.latest() + (isMother ? 0 : 1)) {
            add(RemarkKind::bornAfterParentsDeath, person, parent);
        }
    }

    void checkMarriage(UnionPlace u) {
        const Years& marriage = lives_.marriages[static_cast<std::size_t>(u)];
        const auto& [one, other] = graph_.partners(u);
        if (!marriage.isKnown()) return;
        for (const Place partner : {one, other == one ? kNobody : other}) {
            if (partner == kNobody) continue;
            if (marriage.latest() < life(partner).birth.earliest())
                add(RemarkKind::marriedBeforeBirth, partner, kNobody, graph_.family(u));
            if (marriage.earliest() > life(partner).death.latest())
                add(RemarkKind::marriedAfterDeath, partner, kNobody, graph_.family(u));
        }
    }

    static constexpr UnionPlace kNoUnion = -1;

    const KinGraph& graph_;
    const Lives& lives_;
    std::vector<std::array<Place, 2>> parentsByBirth_;
    std::vector<UnionPlace> secondBirthFamily_;
    std::vector<Remark> remarks_;
};

}  // namespace

std::vector<Remark> checkData(const KinGraph& graph, const Lives& lives) {
    return DataChecker(graph, lives).check();
}

const char* nameOf(RemarkKind kind) {
    constexpr std::array<const char*, kRemarkKinds> kNames{
        "childNotListed",       "parentsNotNamed", "partnerNotNamed",       "marriageNotNamed",
        "severalBirthFamilies", "diedBeforeBirth", "livedTooLong",          "bornBeforeParent",
        "parentTooYoung",       "parentTooOld",    "bornAfterParentsDeath", "marriedBeforeBirth",
        "marriedAfterDeath",    "ownAncestor"};
    return kNames[static_cast<std::size_t>(kind)];
}

}  // namespace olvane::kin
