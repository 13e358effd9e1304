// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Most files number their records: I1, I2, F1 and so on. Such identifiers are found by their number in a
// list, which keeps neighbours of the file neighbours in memory; a million random places would cost more than
// all the rest of the reading. Everything else, and numbers too far ahead for a list to be filled, goes by
// hash with open addressing. An identifier stays where it was first put, so one looks in the list and then by
// hash. The hash has a seed that no file can know; nothing that is read depends on it.

#include <olvane/gedcom/XrefTableInternal.h>

#include <algorithm>
#include <cstring>

#ifdef __EMSCRIPTEN__
#include <unistd.h>
#else
#include <random>
#endif

#include <olvane/gedcom/LineScannerInternal.h>

namespace olvane::gedcom {
namespace {

constexpr std::size_t kFirstBuckets = 64;
constexpr std::size_t kMostSeries = 8;
constexpr std::size_t kMostDigits = 9;
constexpr std::size_t kNoNumber = static_cast<std::size_t>(-1);

bool isDigit(char c) {
    return c >= '0' && c <= '9';
}

std::uint64_t mixed(std::uint64_t a, std::uint64_t b) {
    __extension__ using Wide = unsigned __int128;
    const Wide product = static_cast<Wide>(a) * b;
    return static_cast<std::uint64_t>(product) ^ static_cast<std::uint64_t>(product >> 64);
}

std::uint64_t randomSeed() {
#ifdef __EMSCRIPTEN__
    // The standard's device brings the words of all errors of a system along, and printf.
    std::uint64_t seed = 0;
    return getentropy(&seed, sizeof seed) == 0 ? seed : 0;
#else
    std::random_device device;
    return std::uint64_t{device()} << 32 | device();
#endif
}

}  // namespace

XrefTable::XrefTable() : entries_(1), buckets_(kFirstBuckets, 0), seed_(randomSeed()) {
    series_.reserve(kMostSeries);
}

std::uint32_t XrefTable::hashOf(std::string_view text) const {
    constexpr std::uint64_t kFactor = 0x9E3779B97F4A7C15U;
    std::uint64_t hash = seed_ ^ text.size();
    for (std::size_t at = 0; at < text.size(); at += sizeof hash) {
        std::uint64_t piece = 0;
        std::memcpy(&piece, text.data() + at, std::min(sizeof piece, text.size() - at));
        hash = mixed(hash ^ piece, seed_ ^ kFactor);
    }
    return static_cast<std::uint32_t>(hash ^ (hash >> 32));
}

XrefTable::Serial XrefTable::serialOf(std::string_view xref) {
    std::size_t start = xref.size();
    while (start > 0 && isDigit(xref[start - 1])) --start;
    const std::size_t digits = xref.size() - start;
    if (digits == 0 || digits > kMostDigits) return {{}, 0, kNoNumber};
    std::size_t number = 0;
    for (const char c : xref.substr(start)) number = number * 10 + static_cast<std::size_t>(c - '0');
    const bool padded = xref[start] == '0';
    return {xref.substr(0, start), padded ? digits : 0, number};
}

// The number of series if there is no such one yet.
std::size_t XrefTable::seriesOf(const Serial& serial) const {
    std::size_t at = 0;
    while (at < series_.size() &&
           (series_[at].digits != serial.digits || series_[at].beginning != serial.beginning)) {
        ++at;
    }
    return at;
}

XrefPlace XrefTable::findInSeries(const Serial& serial) const {
    if (serial.number == kNoNumber) return 0;
    const std::size_t at = seriesOf(serial);
    const bool listed = at < series_.size() && serial.number < series_[at].places.size();
    return listed ? series_[at].places[serial.number] : 0;
}

XrefPlace XrefTable::findByHash(std::string_view xref) const {
    if (hashed_ == 0) return 0;
    const std::uint32_t hash = hashOf(xref);
    const std::size_t mask = buckets_.size() - 1;
    for (std::size_t bucket = hash & mask; buckets_[bucket] != 0; bucket = (bucket + 1) & mask) {
        const Entry& entry = entries_[buckets_[bucket]];
        if (entry.hash == hash && entry.xref == xref) return buckets_[bucket];
    }
    return 0;
}

XrefPlace XrefTable::find(std::string_view xref) const {
    const XrefPlace place = findInSeries(serialOf(xref));
    return place != 0 ? place : findByHash(xref);
}

XrefPlace XrefTable::place(std::string_view xref) {
    const Serial serial = serialOf(xref);
    if (const XrefPlace known = findInSeries(serial); known != 0) return known;
    if (const XrefPlace known = findByHash(xref); known != 0) return known;
    const auto fresh = static_cast<XrefPlace>(entries_.size());
    entries_.push_back({xref, 0, 0, 0, 0});
    if (!addToSeries(serial, fresh)) addByHash(fresh);
    return fresh;
}

// A list may have some numbers that are not there, but in the end not many more than all identifiers of the
// file.
bool XrefTable::addToSeries(const Serial& serial, XrefPlace place) {
    constexpr std::size_t kAlwaysListed = 1024;
    if (serial.number == kNoNumber || serial.number >= 2 * entries_.size() + kAlwaysListed) return false;
    const std::size_t at = seriesOf(serial);
    if (at == kMostSeries) return false;
    if (at == series_.size()) series_.push_back({serial.beginning, serial.digits, {}});
    std::vector<XrefPlace>& places = series_[at].places;
    if (serial.number >= places.size()) places.resize(serial.number + 1, 0);
    places[serial.number] = place;
    return true;
}

void XrefTable::addByHash(XrefPlace place) {
    Entry& entry = entries_[place];
    entry.hash = hashOf(entry.xref);
    if (++hashed_ * 2 > buckets_.size()) grow();
    putIntoBucket(place);
}

void XrefTable::putIntoBucket(XrefPlace place) {
    const std::size_t mask = buckets_.size() - 1;
    std::size_t bucket = entries_[place].hash & mask;
    while (buckets_[bucket] != 0) bucket = (bucket + 1) & mask;
    buckets_[bucket] = place;
}

void XrefTable::grow() {
    std::vector<XrefPlace> places(buckets_.size() * 2, 0);
    places.swap(buckets_);
    for (const XrefPlace place : places) {
        if (place != 0) putIntoBucket(place);
    }
}

std::string_view bareXref(std::string_view text) {
    text = trimmed(text);
    if (text.size() >= 2 && text.front() == '@' && text.back() == '@') text = text.substr(1, text.size() - 2);
    return trimmed(text);
}

}  // namespace olvane::gedcom
