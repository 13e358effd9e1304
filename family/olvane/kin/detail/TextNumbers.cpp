// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/kin/detail/TextNumbers.h>

#include <array>
#include <stdexcept>

#ifdef __EMSCRIPTEN__
#include <unistd.h>
#else
#include <random>
#endif

namespace olvane::kin {

namespace {

constexpr std::size_t kFirstSlots = 64;

std::uint64_t randomNumber() {
#ifdef __EMSCRIPTEN__
    // The standard's device brings the words of all errors of a system along, and printf.
    std::uint64_t number = 0;
    return getentropy(&number, sizeof number) == 0 ? number : 0;
#else
    std::random_device device;
    return (std::uint64_t{device()} << 32U) | device();
#endif
}

// Odd, so that no bit of a text is lost. Where a system has no random numbers, the golden ratio's digits spread texts.
std::uint64_t randomFactor() {
    return (randomNumber() ^ 0x9E3779B97F4A7C15U) | 1U;
}

// Eight bytes of a text, or those that are left.
std::uint64_t pieceAt(std::string_view text, std::size_t at) {
    std::uint64_t piece = 0;
    const std::size_t end = text.size() - at < sizeof piece ? text.size() : at + sizeof piece;
    for (; at < end; ++at) piece = (piece << 8U) | static_cast<unsigned char>(text[at]);
    return piece;
}

}  // namespace

TextNumbers::TextNumbers() : factor_(randomFactor()), slots_(kFirstSlots) {}

std::uint32_t TextNumbers::hashOf(std::string_view text) const {
    std::uint64_t hash = text.size();
    for (std::size_t at = 0; at < text.size(); at += sizeof hash) {
        hash = (hash ^ pieceAt(text, at)) * factor_;
        hash ^= hash >> 32U;
    }
    return static_cast<std::uint32_t>(hash);
}

std::size_t TextNumbers::slotOf(std::string_view text, std::uint32_t hash) const {
    const std::size_t mask = slots_.size() - 1;
    for (std::size_t at = hash & mask;; at = (at + 1) & mask) {
        const Slot& slot = slots_[at];
        if (slot.number == kNone || (slot.hash == hash && (*this)[slot.number] == text)) return at;
    }
}

std::uint32_t TextNumbers::find(std::string_view text) const {
    return slots_[slotOf(text, hashOf(text))].number;
}

// Steps through all bytes by the length of the part, or less where the last byte of a step stands in the part (R. N.
// Horspool, "Practical fast searching in strings", 1980).
void TextNumbers::visitHolding(std::string_view part, const Use& use) const {
    const std::size_t last = part.size() - 1;
    std::array<std::size_t, 256> steps;
    steps.fill(part.size());
    for (std::size_t i = 0; i < last; ++i) steps[static_cast<unsigned char>(part[i])] = last - i;
    std::uint32_t number = 0;
    for (std::size_t at = 0; number < ends_.size() && at + last < ends_.back();) {
        const char behind = bytes_[at + last];
        if (behind != part[last] || std::string_view(bytes_).substr(at, last) != part.substr(0, last)) {
            at += steps[static_cast<unsigned char>(behind)];
            continue;
        }
        while (ends_[number] <= at) ++number;
        if (at + last < ends_[number]) {
            use(number);
            at = ends_[number++];
        } else {
            ++at;  // begins in one text and ends in the next
        }
    }
}

void TextNumbers::visitBeginning(std::string_view part, const Use& use) const {
    std::size_t start = 0;
    for (std::uint32_t number = 0; number < ends_.size(); ++number) {
        const std::size_t end = ends_[number];
        if (end - start >= part.size() && bytes_[start] == part.front() && (*this)[number].starts_with(part))
            use(number);
        start = end;
    }
}

std::uint32_t TextNumbers::numberOf(std::string_view text) {
    const std::uint32_t hash = hashOf(text);
    const std::uint32_t known = slots_[slotOf(text, hash)].number;
    if (known != kNone) return known;
    const auto number = static_cast<std::uint32_t>(ends_.size());
    if (ends_.size() >= kNone - 1) throw std::length_error("too many different texts");
    if ((ends_.size() + 1) * 2 > slots_.size()) grow();
    bytes_.resize(ends_.empty() ? 0 : ends_.back());  // without a text for whose end there was no memory
    bytes_ += text;
    ends_.push_back(bytes_.size());
    slots_[slotOf(text, hash)] = {hash, number};
    return number;
}

void TextNumbers::grow() {
    std::vector<Slot> filled(slots_.size() * 2);
    filled.swap(slots_);
    const std::size_t mask = slots_.size() - 1;
    for (const Slot& slot : filled) {
        if (slot.number == kNone) continue;
        std::size_t at = slot.hash & mask;
        while (slots_[at].number != kNone) at = (at + 1) & mask;
        slots_[at] = slot;
    }
}

}  // namespace olvane::kin
