// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// One request from the public pieces, as a host that builds its own layouter would make it, with nothing
// swallowed.

#include "LaidOutCase.h"

#include <stdexcept>

#include <olvane/boundary/HostText.h>

namespace views {

using SharedTreeViewer::OptionMap;

LaidOutCase::LaidOutCase(std::string_view caseText) {
    const support::CaseFile request = support::parseCase(caseText);
    manager = std::make_shared<support::CaseManager>(request, true);
    const std::shared_ptr<OlvaneViewerManagerWrapProtocol> source = manager;
    olvane::HostCallbacks callbacks(glue, source);
    if (request.adapter == support::CaseAdapter::bare) {
        callbacks.getParents = support::bareParents(glue, *manager);
    }
    adapter = std::make_unique<DataAdapter>(callbacks.dataAdapter());
    olvane::resetAddParentId();
    const int focusKey = glue.getKeyFromPerson(std::to_string(request.focus));
    lay(request, focusKey, adapter->isMale(focusKey) ? 1 : 0);
}

LaidOutCase::~LaidOutCase() = default;

void LaidOutCase::lay(const support::CaseFile& request, int focusKey, int isMale) {
    OptionMap options;
    for (const auto& [key, value] : request.options) options[key] = value;
    const TreeSize size = support::treeSizeOf(request);
    if (request.view == support::CaseView::pedigree) {
        base = &pedigreeLayouter.emplace(adapter.get(), focusKey, isMale, options, size,
                                         request.maxGenerations, request.maxStackDepth);
    } else {
        base = &familyLayouter.emplace(adapter.get(), focusKey, isMale, options, size);
    }
    base->layoutForFocusNID();
}

int LaidOutCase::idOf(const TreeViewPerson& person) const {
    return std::stoi(glue.personOfKey(person.personId));
}

std::vector<TreeViewPerson*> LaidOutCase::nodesOf(int id) {
    std::vector<TreeViewPerson*> nodes;
    base->graphIterator([&](TreeViewPerson& person) {
        if (idOf(person) == id) nodes.push_back(&person);
    });
    return nodes;
}

TreeViewPerson& LaidOutCase::person(int id) {
    const std::vector<TreeViewPerson*> nodes = nodesOf(id);
    if (nodes.empty()) throw std::out_of_range("nobody of id " + std::to_string(id) + " on the chart");
    return *nodes.front();
}

bool LaidOutCase::shows(int id) {
    return !nodesOf(id).empty();
}

std::vector<int> LaidOutCase::walk() {
    std::vector<int> ids;
    base->graphIterator([&](TreeViewPerson& person) { ids.push_back(idOf(person)); });
    return ids;
}

std::set<int> LaidOutCase::realPersons() {
    std::set<int> ids;
    for (const int id : walk()) {
        if (id > 0) ids.insert(id);
    }
    return ids;
}

}  // namespace views
