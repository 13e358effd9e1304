// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A person's edges. The first partner who is asked for the edge of a couple makes it and owns it; the other
// keeps the same pointer among the unowned ones, so that either side finds one and the same object from then
// on.

#include <olvane/graph/TreeViewPerson.h>

#include <memory>
#include <utility>

TreeViewSpouseEdge* TreeViewPerson::spouseEdge(TreeViewPerson* spouse, TreeLine line) {
    const int spouseKey = spouse->personId;
    const auto unowned = unownedSpouseEdges.find(spouseKey);
    if (unowned != unownedSpouseEdges.end()) return unowned->second;
    const auto owned = spouseEdges.find(spouseKey);
    if (owned != spouseEdges.end()) return owned->second;

    TreeViewPerson* const first = gender ? this : spouse;
    TreeViewPerson* const second = gender ? spouse : this;
    std::unique_ptr<TreeViewSpouseEdge> edge(
        arena() != nullptr ? new (arena()->slabs()) TreeViewSpouseEdge(std::move(line), first, second)
                           : new TreeViewSpouseEdge(std::move(line), first, second));
    spouseEdges.emplace(spouseKey, edge.get());
    TreeViewSpouseEdge* const made = edge.release();
    spouse->addUnownedSpouseEdge(made, personId);
    return made;
}

void TreeViewPerson::addUnownedSpouseEdge(TreeViewSpouseEdge* edge, int spouseKey) {
    unownedSpouseEdges[spouseKey] = edge;
}

void TreeViewPerson::addGenerationEdge(boost::shared_ptr<TreeViewGenerationEdge> edge) {
    generationEdges.push_back(std::move(edge));
}

void TreeViewPerson::generationEdgeIterator(GenerationEdgeVisitor visitor) {
    for (const auto& entry : generationEdges) {
        const boost::shared_ptr<TreeViewGenerationEdge> heldDuringTheCall = entry;
        visitor(heldDuringTheCall.get());
    }
}

void TreeViewPerson::spouseEdgeIterator(const SpouseEdgeVisitor& visitor) {
    for (const auto& owned : spouseEdges) visitor(owned.second);
}
