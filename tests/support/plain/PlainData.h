// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <set>
#include <string>
#include <unordered_map>
#include <vector>

#include <support/CaseFile.h>
#include <support/plain/PlainPerson.h>

namespace plain {

// A parent that the host does not know, standing on the chart with a negative id.
struct UnknownParent {
    bool male = false;
    std::string childText;
};

// The host's answers in terms of keys: dense numbers from 0 in order of first sight.
//
// Holds: nothing is remembered but the keys and the unknown parents, so each question goes to the host
//        again, and each question for the parents of a person who lacks one makes new unknown parents.
// Fails: std::out_of_range for a key never handed out, or an id below 1 that is no unknown parent; what the
//        host throws passes through.
class Data {
public:
    Data(support::CaseHost& source, support::CaseAdapter adapterKind) : host(source), adapter(adapterKind) {}

    int keyOf(const std::string& idText);
    const std::string& textOf(int key) const;
    const UnknownParent& unknownParent(const std::string& idText) const;

    void spouses(int key, std::set<SpouseRecord>& records);
    void parents(int key, int& father, int& mother);  // writes neither for an unknown parent
    void children(int key, std::set<ChildRecord>& records);
    bool isMale(int key);
    bool isAddNode(int key) const;
    void touch(int key) const;

private:
    int parentKey(std::int64_t answer, std::string& idText);
    void enterUnknownParent(const std::string& idText, bool male, const std::string& childText);

    support::CaseHost& host;
    support::CaseAdapter adapter;
    std::vector<std::string> texts;  // by key
    std::unordered_map<std::string, int> keys;
    std::unordered_map<std::string, UnknownParent> unknownParents;
    int nextNegativeId = -1;
};

// The low 32 bits of the number at the head of the text, 0 where there is none.
int idOf(const std::string& text);

// A host's number as an id: its low 32 bits.
int cutId(std::int64_t hostId);

// The first character of a UTF-8 text, its first byte where that is no well-formed character.
std::string firstCharacter(const std::string& text);

}  // namespace plain
