// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Every line of the test files that come with Unicode, as far as they are installed.

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cstdlib>
#include <fstream>
#include <sstream>
#include <string>
#include <vector>

#include <olvane/picture/TextMetrics.h>

namespace olvane::picture {
namespace {

constexpr const char* kFolder = "/usr/share/unicode/auxiliary/";
constexpr const char* kVersion = "15.0.0";  // of the table of properties

void appendUtf8(std::string& text, unsigned long c) {
    const auto add = [&text](unsigned long byte) {
        text += static_cast<char>(static_cast<unsigned char>(byte));
    };
    if (c < 0x80) return add(c);
    if (c < 0x800) {
        add(0xC0 | (c >> 6));
    } else if (c < 0x10000) {
        add(0xE0 | (c >> 12));
        add(0x80 | ((c >> 6) & 0x3F));
    } else {
        add(0xF0 | (c >> 18));
        add(0x80 | ((c >> 12) & 0x3F));
        add(0x80 | ((c >> 6) & 0x3F));
    }
    add(0x80 | (c & 0x3F));
}

struct Sample {
    std::string line;
    std::string text;
    std::vector<std::size_t> breaks;  // within the text
};

// "÷ 0061 × 0308 ÷" before a comment: where a text breaks, and where it does not.
std::vector<Sample> samplesOf(const std::string& path) {
    std::ifstream file(path);
    std::vector<Sample> samples;
    for (std::string line; std::getline(file, line);) {
        std::istringstream words(line.substr(0, line.find('#')));
        Sample sample{line, "", {}};
        for (std::string word; words >> word;) {
            if (word == "÷") {
                sample.breaks.push_back(sample.text.size());
            } else if (word != "×") {
                appendUtf8(sample.text, std::strtoul(word.c_str(), nullptr, 16));
            }
        }
        if (sample.text.empty()) continue;
        std::erase_if(sample.breaks, [&](std::size_t at) { return at == 0 || at == sample.text.size(); });
        samples.push_back(std::move(sample));
    }
    return samples;
}

// Empty where the file is not there or of another version.
std::vector<Sample> samplesOfVersion(const std::string& name) {
    std::ifstream file(kFolder + name);
    std::string first;
    std::getline(file, first);
    if (first.find(kVersion) == std::string::npos) return {};
    return samplesOf(kFolder + name);
}

TEST(UnicodeText, graphemeClustersAreThoseOfTheTestFile) {
    const std::vector<Sample> samples = samplesOfVersion("GraphemeBreakTest.txt");
    if (samples.empty()) GTEST_SKIP() << "needs Debian's package unicode-data " << kVersion;
    EXPECT_GT(samples.size(), 500u);
    for (const Sample& sample : samples) {
        std::vector<std::size_t> breaks;
        std::size_t at = 0;
        for (const std::string_view cluster : graphemeClusters(sample.text)) {
            if (at > 0) breaks.push_back(at);
            at += cluster.size();
        }
        EXPECT_EQ(at, sample.text.size());
        EXPECT_THAT(breaks, testing::ElementsAreArray(sample.breaks)) << sample.line;
    }
}

TEST(UnicodeText, linesBreakWhereTheTestFileHasThemBreak) {
    const std::vector<Sample> samples = samplesOfVersion("LineBreakTest.txt");
    if (samples.empty()) GTEST_SKIP() << "needs Debian's package unicode-data " << kVersion;
    EXPECT_GT(samples.size(), 7000u);
    for (const Sample& sample : samples) {
        EXPECT_THAT(lineBreaks(sample.text), testing::ElementsAreArray(sample.breaks)) << sample.line;
    }
}

}  // namespace
}  // namespace olvane::picture
