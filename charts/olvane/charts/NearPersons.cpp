// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The engine is asked itself, so that both views always agree on who is near.

#include <olvane/charts/NearPersonsInternal.h>

#include <algorithm>
#include <memory>
#include <string>

#include <olvane/boundary/TypedLayout.h>
#include <olvane/kin/shared/MergeSort.h>

namespace olvane::charts {

namespace {

// The eight answers about a graph. Ids are places.
class GraphDataSource : public OlvaneViewerManagerWrapProtocol {
public:
    explicit GraphDataSource(const kin::KinGraph& graph) : graph_(graph) {}

    std::int64_t fatherForPersonWithID(std::int64_t person) override { return parent(person, 0); }
    std::int64_t motherForPersonWithID(std::int64_t person) override { return parent(person, 1); }

    std::vector<std::int64_t> spousesForPersonWithID(std::int64_t person) override {
        std::vector<std::int64_t> spouses;
        for (const kin::UnionPlace u : graph_.unionsAsPartner(placeOf(person))) {
            const kin::Place other = graph_.otherPartner(u, placeOf(person));
            if (other != kin::kNobody) addOnce(spouses, other);
        }
        return spouses;
    }

    std::vector<std::int64_t> childrenForPersonWithID(std::int64_t person) override {
        std::vector<std::int64_t> children;
        for (const kin::UnionPlace u : graph_.unionsAsPartner(placeOf(person))) {
            for (const kin::Place child : graph_.children(u)) addOnce(children, child);
        }
        return children;
    }

    bool isPreferredSpouse(std::int64_t, std::int64_t) override { return false; }
    bool isPersonDead(std::int64_t) override { return false; }
    std::string dateForPersonWithID(std::int64_t, bool) override { return {}; }
    std::int32_t sexOfPersonWithID(std::int64_t person) override {
        return graph_.sex(placeOf(person)) == kin::Sex::male ? 0 : 1;
    }

private:
    static kin::Place placeOf(std::int64_t id) { return static_cast<kin::Place>(id - 1); }

    static void addOnce(std::vector<std::int64_t>& ids, kin::Place person) {
        const std::int64_t id = std::int64_t{person} + 1;
        if (ids.size() > 64 || std::find(ids.begin(), ids.end(), id) == ids.end()) ids.push_back(id);
    }

    std::int64_t parent(std::int64_t person, std::size_t slot) const {
        const auto unions = graph_.unionsAsChild(placeOf(person));
        const kin::Place found = unions.empty() ? kin::kNobody : graph_.partners(unions[0])[slot];
        return found == kin::kNobody ? kPersonNotFound : std::int64_t{found} + 1;
    }

    const kin::KinGraph& graph_;
};

}  // namespace

std::vector<kin::Place> nearPersons(const kin::KinGraph& graph, kin::Place focus, LayoutOptions options) {
    options.sizes = familyTreeSize();
    options.withText = false;
    const TypedLayout layout =
        familyLayout(std::int64_t{focus} + 1, std::make_shared<GraphDataSource>(graph), options);
    std::vector<kin::Place> persons;
    for (const TypedLayout::Box& box : layout.boxes) {
        if (box.id > 0) persons.push_back(static_cast<kin::Place>(box.id - 1));
    }
    kin::mergeSort(persons.begin(), persons.end());
    persons.erase(std::unique(persons.begin(), persons.end()), persons.end());
    return persons;
}

}  // namespace olvane::charts
