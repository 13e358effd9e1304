// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Open addressing with linear probing over places in a list, so that the list stays in the order of the file.

#include "olvane/gedcom/XrefTableInternal.h"

#include <functional>

#include "olvane/gedcom/LineScannerInternal.h"

namespace olvane::gedcom {
namespace {

constexpr std::size_t kFirstBuckets = 64;

std::uint32_t hashOf(std::string_view text) {
    const std::uint64_t hash = std::hash<std::string_view>{}(text);
    return static_cast<std::uint32_t>(hash ^ (hash >> 32));
}

}  // namespace

XrefTable::XrefTable() : entries_(1), buckets_(kFirstBuckets, 0) {}

// The bucket that holds the identifier, or the free one where it would be.
std::size_t XrefTable::bucketOf(std::string_view xref, std::uint32_t hash) const {
    const std::size_t mask = buckets_.size() - 1;
    std::size_t bucket = hash & mask;
    while (buckets_[bucket] != 0) {
        const Entry& entry = entries_[buckets_[bucket]];
        if (entry.hash == hash && entry.xref == xref) break;
        bucket = (bucket + 1) & mask;
    }
    return bucket;
}

XrefPlace XrefTable::find(std::string_view xref) const {
    return buckets_[bucketOf(xref, hashOf(xref))];
}

XrefPlace XrefTable::place(std::string_view xref) {
    const std::uint32_t hash = hashOf(xref);
    const std::size_t bucket = bucketOf(xref, hash);
    if (buckets_[bucket] != 0) return buckets_[bucket];
    const auto fresh = static_cast<XrefPlace>(entries_.size());
    entries_.push_back({xref, hash, 0, 0, 0});
    buckets_[bucket] = fresh;
    if (entries_.size() * 2 > buckets_.size()) grow();
    return fresh;
}

void XrefTable::grow() {
    std::vector<XrefPlace>(buckets_.size() * 2, 0).swap(buckets_);
    const std::size_t mask = buckets_.size() - 1;
    for (XrefPlace place = 1; place < entries_.size(); ++place) {
        std::size_t bucket = entries_[place].hash & mask;
        while (buckets_[bucket] != 0) bucket = (bucket + 1) & mask;
        buckets_[bucket] = place;
    }
}

std::string_view bareXref(std::string_view text) {
    text = trimmed(text);
    if (text.size() >= 2 && text.front() == '@' && text.back() == '@') text = text.substr(1, text.size() - 2);
    return trimmed(text);
}

}  // namespace olvane::gedcom
