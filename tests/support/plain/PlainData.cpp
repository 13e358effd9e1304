// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What the plain layout asks of a host, and how ids become keys. The order of the questions is the point:
// each first sight of a person takes the next key, and keys order the children of a chart.

#include <support/plain/PlainData.h>

#include <cstdlib>
#include <stdexcept>

namespace plain {

int idOf(const std::string& text) {
    return cutId(std::strtoll(text.c_str(), nullptr, 10));
}

int cutId(std::int64_t hostId) {
    return static_cast<int>(static_cast<std::uint32_t>(static_cast<std::uint64_t>(hostId)));
}

namespace {

constexpr int kNoKey = -1;

unsigned byteAt(const std::string& text, std::size_t index) {
    return index < text.size() ? static_cast<unsigned char>(text[index]) : 0U;
}

bool within(unsigned byte, unsigned least, unsigned greatest) {
    return byte >= least && byte <= greatest;
}

// Only the second byte has a range of its own: it rules out long forms, surrogates and what lies past the
// last code point. A missing byte reads as 0 and so is in no range.
std::size_t firstCharacterLength(const std::string& text) {
    const unsigned lead = byteAt(text, 0);
    const unsigned second = byteAt(text, 1);
    const bool third = within(byteAt(text, 2), 0x80, 0xbf);
    const bool fourth = within(byteAt(text, 3), 0x80, 0xbf);
    const unsigned least = lead == 0xe0 ? 0xa0 : lead == 0xf0 ? 0x90 : 0x80;
    const unsigned greatest = lead == 0xed ? 0x9f : lead == 0xf4 ? 0x8f : 0xbf;
    if (!within(second, least, greatest)) return 1;
    if (within(lead, 0xc2, 0xdf)) return 2;
    if (within(lead, 0xe0, 0xef) && third) return 3;
    if (within(lead, 0xf0, 0xf4) && third && fourth) return 4;
    return 1;
}

}  // namespace

std::string firstCharacter(const std::string& text) {
    return text.empty() ? text : text.substr(0, firstCharacterLength(text));
}

int Data::keyOf(const std::string& idText) {
    const auto found = keys.find(idText);
    if (found != keys.end()) return found->second;
    const int key = static_cast<int>(texts.size());
    texts.push_back(idText);
    keys[idText] = key;
    return key;
}

const std::string& Data::textOf(int key) const {
    if (key < 0) throw std::out_of_range("unknown key");
    return texts.at(static_cast<std::size_t>(key));
}

const UnknownParent& Data::unknownParent(const std::string& idText) const {
    return unknownParents.at(idText);
}

void Data::spouses(int key, std::set<SpouseRecord>& records) {
    const int id = idOf(textOf(key));
    if (id < 1) return;
    int place = 0;
    for (const std::int64_t entry : host.spousesForPersonWithID(id)) {
        const int spouseId = cutId(entry);
        SpouseRecord record;
        record.idText = std::to_string(spouseId);
        record.key = keyOf(record.idText);
        record.preferred = host.isPreferredSpouse(id, spouseId);
        record.alive = !host.isPersonDead(spouseId);
        record.date = firstCharacter(host.dateForPersonWithID(spouseId, false));
        record.hostOrder = ++place;
        records.insert(record);
    }
}

// An unknown parent's key is taken between the two questions, so that it lies before the mother's.
void Data::parents(int key, int& father, int& mother) {
    const std::string text = textOf(key);
    const int id = idOf(text);
    if (id < 1) return;

    std::string madeFather;
    std::string madeMother;
    const int fatherKey = parentKey(host.fatherForPersonWithID(id), madeFather);
    if (fatherKey != kNoKey) father = fatherKey;
    const int motherKey = parentKey(host.motherForPersonWithID(id), madeMother);
    if (motherKey != kNoKey) mother = motherKey;

    if (!madeFather.empty()) enterUnknownParent(madeFather, true, text);
    if (!madeMother.empty()) enterUnknownParent(madeMother, false, text);
}

// idText is written only for an unknown parent; the result is kNoKey where the parent stays unset.
int Data::parentKey(std::int64_t answer, std::string& idText) {
    if (answer != support::kNotFound) return keyOf(std::to_string(cutId(answer)));
    if (adapter == support::CaseAdapter::bare) return kNoKey;
    idText = std::to_string(nextNegativeId);
    --nextNegativeId;
    return keyOf(idText);
}

// The first record of an id stands.
void Data::enterUnknownParent(const std::string& idText, bool male, const std::string& childText) {
    unknownParents.emplace(idText, UnknownParent{male, childText});
}

void Data::children(int key, std::set<ChildRecord>& records) {
    const std::string text = textOf(key);
    const int id = idOf(text);
    if (id < 1) {
        const std::string childText = unknownParent(text).childText;
        if (!childText.empty()) records.insert(ChildRecord{keyOf(childText), "", childText, 0});
        return;
    }
    int place = 0;
    for (const std::int64_t entry : host.childrenForPersonWithID(id)) {
        const int childId = cutId(entry);
        ChildRecord record;
        record.idText = std::to_string(childId);
        record.key = keyOf(record.idText);
        record.date = firstCharacter(host.dateForPersonWithID(childId, true));
        record.hostOrder = ++place;
        records.insert(record);
    }
}

bool Data::isMale(int key) {
    const std::string text = textOf(key);
    const int id = idOf(text);
    return id >= 1 ? host.sexOfPersonWithID(id) == 0 : unknownParent(text).male;
}

bool Data::isAddNode(int key) const {
    return key < 0 || idOf(textOf(key)) < 1;
}

void Data::touch(int key) const {
    textOf(key);
}

}  // namespace plain
