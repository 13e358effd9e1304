// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What is refused, and in which words.

#include <olvane/kin/FamilyChecksInternal.h>

#include <algorithm>
#include <utility>

#include <olvane/boundary/HostText.h>
#include <olvane/boundary/OlvaneViewerManagerWrapProtocol.h>
#include <olvane/kin/shared/MergeSort.h>

namespace olvane::detail {

namespace {

bool isAscii(char byte) {
    return static_cast<unsigned char>(byte) < 0x80;
}

// Nothing where the text is well-formed, else the byte at which it is not.
std::optional<std::size_t> badByte(std::string_view text) {
    for (std::size_t at = 0; at < text.size();) {
        if (isAscii(text[at])) {
            if (text[at] == '\0') return at;
            ++at;
            continue;
        }
        const std::size_t length = firstCharacterOf(text.substr(at)).size();
        if (length < 2) return at;
        at += length;
    }
    return std::nullopt;
}

constexpr std::size_t kShortList = 16;

}  // namespace

FamilyId checkedId(const RowPlace& place, std::string_view field, std::int64_t id) {
    if (id < 1 || id > kMostId) {
        place.fail(field, std::to_string(id) + " is not a whole number of 1 to " + std::to_string(kMostId));
    }
    return static_cast<FamilyId>(id);
}

FamilyId checkedIdOrNobody(const RowPlace& place, std::string_view field, std::int64_t id) {
    const bool isNobody = id == 0 || id == OlvaneViewerManagerWrapProtocol::kPersonNotFound;
    return isNobody ? 0 : checkedId(place, field, id);
}

void checkText(const RowPlace& place, std::string_view field, std::string_view text) {
    if (text.size() > Family::kMostTextBytes) {
        place.fail(field, "the text has " + std::to_string(text.size()) + " bytes, and at most " +
                              std::to_string(Family::kMostTextBytes) + " are stored");
    }
    if (const auto bad = badByte(text)) {
        place.fail(field, "the text is not valid UTF-8 at byte " + std::to_string(*bad));
    }
}

std::uint8_t checkedChoice(const RowPlace& place, std::string_view field, std::int64_t choice,
                           std::uint8_t most) {
    if (choice < 0 || choice > most) {
        place.fail(field, std::to_string(choice) + " is not a whole number of 0 to " + std::to_string(most));
    }
    return static_cast<std::uint8_t>(choice);
}

void findRepeats(std::span<const FamilyId> list, std::vector<std::size_t>& repeats) {
    repeats.clear();
    if (list.size() <= kShortList) {
        for (std::size_t i = 1; i < list.size(); ++i) {
            const auto end = list.begin() + static_cast<std::ptrdiff_t>(i);
            if (std::find(list.begin(), end, list[i]) != end) repeats.push_back(i);
        }
        return;
    }
    std::vector<std::pair<FamilyId, std::size_t>> sorted;
    sorted.reserve(list.size());
    for (std::size_t i = 0; i < list.size(); ++i) sorted.emplace_back(list[i], i);
    kin::mergeSort(sorted.begin(), sorted.end());
    for (std::size_t i = 1; i < sorted.size(); ++i) {
        if (sorted[i].first == sorted[i - 1].first) repeats.push_back(sorted[i].second);
    }
    kin::mergeSort(repeats.begin(), repeats.end());
}

}  // namespace olvane::detail
