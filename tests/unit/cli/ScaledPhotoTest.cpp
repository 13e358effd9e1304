// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <cli/ScaledPhoto.h>

#include <cstdint>
#include <string>
#include <utility>

#include <gtest/gtest.h>
#include <zlib.h>

namespace olvane::cli {
namespace {

std::string bigEndian(std::uint32_t value) {
    std::string bytes;
    for (int shift = 24; shift >= 0; shift -= 8) bytes += static_cast<char>(value >> shift);
    return bytes;
}

std::string chunk(const std::string& kind, const std::string& data) {
    const std::string body = kind + data;
    const auto sum = crc32(0, reinterpret_cast<const Bytef*>(body.data()), static_cast<uInt>(body.size()));
    return bigEndian(static_cast<std::uint32_t>(data.size())) + body +
           bigEndian(static_cast<std::uint32_t>(sum));
}

std::string deflated(const std::string& bytes) {
    std::string packed(compressBound(static_cast<uLong>(bytes.size())), '\0');
    uLongf size = static_cast<uLongf>(packed.size());
    compress(reinterpret_cast<Bytef*>(packed.data()), &size, reinterpret_cast<const Bytef*>(bytes.data()),
             static_cast<uLong>(bytes.size()));
    return packed.substr(0, size);
}

// Grey, a byte a pixel, all of one value; as many rows as are said to be there, or none.
std::string png(std::uint32_t width, std::uint32_t height, bool withRows = true) {
    const std::string row = std::string(1, '\0') + std::string(width, '\x80');
    std::string rows;
    for (std::uint32_t y = 0; withRows && y < height; ++y) rows += row;
    return "\x89PNG\r\n\x1A\n" +
           chunk("IHDR", bigEndian(width) + bigEndian(height) + std::string("\x08\0\0\0\0", 5)) +
           chunk("IDAT", deflated(rows)) + chunk("IEND", "");
}

// Width and height of a JPEG, out of the marker that begins its frame.
std::pair<int, int> sizeOf(const std::string& jpeg) {
    const auto byteAt = [&jpeg](std::size_t at) { return static_cast<unsigned char>(jpeg.at(at)); };
    for (std::size_t at = 2; at + 9 < jpeg.size();) {
        const int marker = byteAt(at + 1);
        if (marker == 0xC0 || marker == 0xC2)
            return {byteAt(at + 7) * 256 + byteAt(at + 8), byteAt(at + 5) * 256 + byteAt(at + 6)};
        at += 2U + byteAt(at + 2) * 256U + byteAt(at + 3);
    }
    return {0, 0};
}

// With a note of the camera which way up it was held.
std::string turned(const std::string& jpeg, char orientation) {
    using namespace std::string_literals;
    const std::string tiff = "MM\0*\0\0\0\x08"s;
    const std::string entry = "\x01\x12\0\x03\0\0\0\x01\0"s + orientation + "\0\0"s;
    const std::string body = "Exif\0\0"s + tiff + "\0\x01"s + entry + "\0\0\0\0"s;
    const std::size_t size = body.size() + 2;
    return jpeg.substr(0, 2) + "\xFF\xE1" + static_cast<char>(size >> 8U) + static_cast<char>(size & 0xFFU) +
           body + jpeg.substr(2);
}

TEST(ScaledPhoto, theLongerSideGetsTheSizeAndTheOtherFollows) {
    EXPECT_EQ(sizeOf(scaledPhoto(png(400, 200), 100).value()), std::pair(100, 50));
    EXPECT_EQ(sizeOf(scaledPhoto(png(30, 300), 100).value()), std::pair(10, 100));
}

TEST(ScaledPhoto, aSmallOneStaysAsItIs) {
    EXPECT_EQ(sizeOf(scaledPhoto(png(40, 20), 100).value()), std::pair(40, 20));
}

TEST(ScaledPhoto, oneThatWasHeldSidewaysIsTurned) {
    const std::string jpeg = scaledPhoto(png(40, 20), 100).value();
    EXPECT_EQ(sizeOf(scaledPhoto(turned(jpeg, 1), 100).value()), std::pair(40, 20));
    EXPECT_EQ(sizeOf(scaledPhoto(turned(jpeg, 6), 100).value()), std::pair(20, 40));
}

TEST(ScaledPhoto, aPictureThatClaimsTooManyPixelsIsNotUnpacked) {
    EXPECT_EQ(scaledPhoto(png(60000, 60000, false), 100), std::nullopt);
}

TEST(ScaledPhoto, whatIsNoPhotographGivesNone) {
    EXPECT_EQ(scaledPhoto("", 100), std::nullopt);
    EXPECT_EQ(scaledPhoto("<svg xmlns='http://www.w3.org/2000/svg'/>", 100), std::nullopt);
    EXPECT_EQ(scaledPhoto("\xFF\xD8\xFF and no more", 100), std::nullopt);
}

}  // namespace
}  // namespace olvane::cli
