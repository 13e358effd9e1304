// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Bytes as a map: as they are, and with the length and the checksum that belong to them, so that what lies behind
// these is read as well. A map that is read can be written and is the same when it is read again.

#include <olvane/charts/MapIndex.h>

#include <cstddef>
#include <cstdint>
#include <stdexcept>
#include <string>

#include "Holds.h"

namespace {

void setWord(std::string& bytes, std::size_t place, std::size_t word) {
    for (std::size_t i = 0; i < 4; ++i) bytes[place + i] = static_cast<char>(word >> (8 * i) & 0xFFU);
}

void makeConsistent(std::string& bytes) {
    bytes.resize(bytes.size() / 4 * 4);
    bytes.replace(0, 8, "OLVMAP\r\n");
    setWord(bytes, 8, 1);
    setWord(bytes, 12, bytes.size());
    std::uint32_t sum = 2166136261U;
    for (std::size_t place = 20; place + 4 <= bytes.size(); place += 4) {
        std::uint32_t word = 0;
        for (std::size_t i = 4; i-- > 0;) word = word << 8U | static_cast<std::uint8_t>(bytes[place + i]);
        sum = (sum ^ word) * 16777619U;
    }
    setWord(bytes, 16, sum);
}

void readTwice(const std::string& bytes) {
    olvane::charts::MapIndex map;
    try {
        map = olvane::charts::readMapIndex(bytes);
    } catch (const std::runtime_error&) {
        return;
    }
    HOLDS(olvane::charts::readMapIndex(olvane::charts::writeMapIndex(map)) == map);
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    std::string bytes(reinterpret_cast<const char*>(data), size);
    readTwice(bytes);
    if (size < 32) return 0;
    makeConsistent(bytes);
    readTwice(bytes);
    return 0;
}
