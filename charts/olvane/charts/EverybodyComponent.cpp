// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/charts/EverybodyComponentInternal.h>

#include <algorithm>
#include <numeric>

#include <olvane/kin/shared/Index.h>
#include <olvane/kin/shared/MergeSort.h>

namespace olvane::charts {

namespace {

using kin::at;

// Which person stands for the component of each: joined with path halving, the smaller place on top.
class Joined {
public:
    explicit Joined(std::size_t count) : top_(count) { std::iota(top_.begin(), top_.end(), 0); }
    std::int32_t topOf(std::int32_t person) {
        while (top_[at(person)] != person) {
            top_[at(person)] = top_[at(top_[at(person)])];
            person = top_[at(person)];
        }
        return person;
    }
    void join(std::int32_t a, std::int32_t b) {
        a = topOf(a);
        b = topOf(b);
        if (a < b) {
            top_[at(b)] = a;
        } else {
            top_[at(a)] = b;
        }
    }

private:
    std::vector<std::int32_t> top_;
};

std::int32_t firstPartner(const kin::KinGraph& graph, kin::UnionPlace u) {
    const auto& two = graph.partners(u);
    return two[0] != kin::kNobody ? two[0] : two[1];
}

void addLists(const kin::KinGraph& graph, const std::vector<std::int32_t>& local, Component& part) {
    const auto forEachChild = [&](const auto& visit) {
        for (std::int32_t u = 0; u < part.unionCount(); ++u) {
            const auto& two = part.partners[at(u)];
            for (const kin::Place child : graph.children(part.unions[at(u)])) {
                const std::int32_t person = local[at(child)];
                if (person != two[0] && person != two[1]) visit(u, person);
            }
        }
    };
    part.children.fill(part.unions.size(), forEachChild);
    part.asChild.fill(part.persons.size(), [&](const auto& visit) {
        forEachChild([&visit](std::int32_t u, std::int32_t child) { visit(child, u); });
    });
    part.asPartner.fill(part.persons.size(), [&](const auto& visit) {
        for (std::int32_t u = 0; u < part.unionCount(); ++u) {
            for (const std::int32_t person : part.partners[at(u)]) {
                if (person >= 0) visit(person, u);
            }
        }
    });
}

Joined joinedPersons(const kin::KinGraph& graph) {
    Joined joined(static_cast<std::size_t>(graph.personCount()));
    for (kin::UnionPlace u = 0; u < graph.unionCount(); ++u) {
        const std::int32_t first = firstPartner(graph, u);
        for (const kin::Place partner : graph.partners(u)) {
            if (partner != kin::kNobody) joined.join(first, partner);
        }
        for (const kin::Place child : graph.children(u)) joined.join(first, child);
    }
    return joined;
}

void addUnion(const kin::KinGraph& graph, const std::vector<std::int32_t>& local, kin::UnionPlace u,
              Component& part) {
    std::array<std::int32_t, 2> two = {-1, -1};
    for (std::size_t side = 0; side < 2; ++side) {
        const kin::Place partner = graph.partners(u)[side];
        if (partner != kin::kNobody && (side == 0 || partner != graph.partners(u)[0])) {
            two[side] = local[at(partner)];
        }
    }
    part.unions.push_back(u);
    part.partners.push_back(two);
}

}  // namespace

std::vector<Component> componentsOf(const kin::KinGraph& graph) {
    const auto persons = static_cast<std::size_t>(graph.personCount());
    Joined joined = joinedPersons(graph);
    std::vector<Component> parts;
    std::vector<std::int32_t> partOf(persons);
    std::vector<std::int32_t> local(persons);
    for (kin::Place person = 0; person < graph.personCount(); ++person) {
        const std::int32_t top = joined.topOf(person);
        if (top == person) {
            partOf[at(person)] = static_cast<std::int32_t>(parts.size());
            parts.emplace_back();
        }
        partOf[at(person)] = partOf[at(top)];
        Component& part = parts[at(partOf[at(person)])];
        local[at(person)] = part.personCount();
        part.persons.push_back(person);
    }
    for (kin::UnionPlace u = 0; u < graph.unionCount(); ++u) {
        addUnion(graph, local, u, parts[at(partOf[at(firstPartner(graph, u))])]);
    }
    for (Component& part : parts) addLists(graph, local, part);
    kin::mergeSort(parts.begin(), parts.end(), [](const Component& a, const Component& b) {
        return a.persons.size() > b.persons.size();
    });
    return parts;
}

}  // namespace olvane::charts
