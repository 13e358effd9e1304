// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Answers out of plain maps, with every question written down.

#include "KeyFamily.h"

#include <algorithm>

namespace views {

DataAdapter KeyFamily::adapter() {
    return DataAdapter([this](int key, SpouseSet& answer) { answerSpouses(key, answer); },
                       [this](int key, int& father, int& mother) { answerParents(key, father, mother); },
                       [this](int key, ChildrenSet& answer) { answerChildren(key, answer); },
                       [this](int key) { return men.count(key) != 0; },
                       [this](int key) { return key < 0 || addNodes.count(key) != 0; },
                       [this](int key) { touched.push_back(key); });
}

bool KeyFamily::wasAsked(const std::string& question) const {
    return std::find(questions.begin(), questions.end(), question) != questions.end();
}

void KeyFamily::answerSpouses(int key, SpouseSet& answer) {
    questions.push_back("getSpouses " + std::to_string(key));
    int place = 0;
    for (const int spouse : spouses[key]) {
        answer.insert(SpouseAdapter(spouse, false, true, "", std::to_string(spouse), ++place));
    }
}

void KeyFamily::answerParents(int key, int& father, int& mother) {
    questions.push_back("getParents " + std::to_string(key));
    const auto known = parents.find(key);
    if (known == parents.end()) return;
    if (known->second.first != -1) father = known->second.first;
    if (known->second.second != -1) mother = known->second.second;
}

void KeyFamily::answerChildren(int key, ChildrenSet& answer) {
    questions.push_back("getChildren " + std::to_string(key));
    const bool withPlaces = addNodes.count(key) == 0;
    int place = 0;
    for (const int child : children[key]) {
        answer.insert(ChildrenAdapter(child, "", std::to_string(child), withPlaces ? ++place : 0));
    }
}

}  // namespace views
