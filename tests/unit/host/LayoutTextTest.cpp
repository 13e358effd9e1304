// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The reader of result texts: what it gives, where it stops, and what it says there.

#include <gtest/gtest.h>
#include <sys/mman.h>
#include <unistd.h>

#include <algorithm>
#include <cstdint>
#include <limits>
#include <stdexcept>
#include <string>
#include <string_view>
#include <vector>

#include <olvane/host/LayoutText.h>

namespace olvane {
namespace {

const std::string kFourPersons =
    "17:0:0:0:40,-15,40,0|;-1:-40:-110:0:-40,-55,40,-55|:M:17;-2:40:-110:0::F:17;42:80:0:1:;";

TEST(LayoutText, emptyTextHoldsNobody) {
    EXPECT_TRUE(readLayoutText("").empty());
}

TEST(LayoutText, recordThatNobodyFilledHasNothing) {
    EXPECT_EQ(LayoutRecord{}, (LayoutRecord{0, 0, 0, false, {}, std::nullopt}));
    EXPECT_EQ(AddNodeSuffix{}, (AddNodeSuffix{false, 0}));
    EXPECT_EQ(LayoutSegment{}, (LayoutSegment{0, 0, 0, 0}));
    EXPECT_EQ(writeLayoutText({LayoutRecord{}}), "0:0:0:0:;");
}

TEST(LayoutText, everyFieldOfARecordIsRead) {
    const std::vector<LayoutRecord> records = readLayoutText(kFourPersons);
    ASSERT_EQ(records.size(), 4u);
    EXPECT_EQ(records[0], (LayoutRecord{17, 0, 0, false, {{40, -15, 40, 0}}, std::nullopt}));
    EXPECT_EQ(records[1],
              (LayoutRecord{-1, -40, -110, false, {{-40, -55, 40, -55}}, AddNodeSuffix{true, 17}}));
    EXPECT_EQ(records[2], (LayoutRecord{-2, 40, -110, false, {}, AddNodeSuffix{false, 17}}));
    EXPECT_EQ(records[3], (LayoutRecord{42, 80, 0, true, {}, std::nullopt}));
}

TEST(LayoutText, repeatedSegmentsAreKept) {
    const auto records = readLayoutText("5:0:0:0:1,2,1,9|1,2,1,9|;");
    ASSERT_EQ(records.size(), 1u);
    EXPECT_EQ(records[0].segments.size(), 2u);
}

TEST(LayoutText, personOfIdZeroHasNoSuffix) {
    EXPECT_EQ(readLayoutText("0:0:0:0:;").size(), 1u);
    EXPECT_THROW(readLayoutText("0:0:0:0::M:1;"), LayoutTextError);
}

TEST(LayoutText, largestNumbersAreRead) {
    const auto records = readLayoutText("9223372036854775807:-2147483648:2147483647:1:;");
    ASSERT_EQ(records.size(), 1u);
    EXPECT_EQ(records[0].id, std::numeric_limits<std::int64_t>::max());
    EXPECT_EQ(records[0].x, std::numeric_limits<int>::min());
    EXPECT_EQ(records[0].y, std::numeric_limits<int>::max());
}

TEST(LayoutText, writingWhatWasReadGivesTheSameBytes) {
    EXPECT_EQ(writeLayoutText(readLayoutText(kFourPersons)), kFourPersons);
    EXPECT_EQ(writeLayoutText({}), "");
}

struct BrokenText {
    std::string text;
    std::size_t position;
    std::string reason;
};

const std::vector<BrokenText> kBrokenTexts = {
    {"17", 2, "expected ':', found the end"},
    {"17:0:0:2:;", 7, "expected flag 0 or 1"},
    {"17:0:0:0:", 9, "expected ';', found the end"},
    {"17:0:0:0:;x", 10, "expected a person's id"},
    {"17:0:0:0::M:5;", 9, "expected ';'"},
    {"-1:0:0:0:;", 9, "expected ':'"},
    {"-1:0:0:0::X:5;", 10, "expected sex M or F"},
    {"-1:0:0:0::M:;", 12, "expected the child's id"},
    {"17:00:0:0:;", 3, "expected x"},
    {"17:+1:0:0:;", 3, "expected x"},
    {"17:-:0:0:;", 3, "expected x"},
    {"17:-0:0:0:;", 3, "expected x"},
    {" 17:0:0:0:;", 0, "expected a person's id"},
    {"17:0:0:0:1,2,3|;", 14, "expected ','"},
    {"17:0:0:0:1,2,3,4;", 16, "expected '|'"},
    {"17:2147483648:0:0:;", 3, "x is out of range"},
    {"17:0:0:0:;\n", 10, "expected a person's id"},
};

TEST(LayoutText, strictReaderReportsWhereAndWhy) {
    for (const BrokenText& broken : kBrokenTexts) {
        try {
            readLayoutText(broken.text);
            ADD_FAILURE() << "read without complaint: " << broken.text;
        } catch (const LayoutTextError& error) {
            EXPECT_EQ(error.position(), broken.position) << broken.text;
            EXPECT_EQ(error.reason(), broken.reason) << broken.text;
            EXPECT_EQ(error.what(), "byte " + std::to_string(broken.position) + ": " + broken.reason);
        }
    }
}

TEST(LayoutText, everyCutLeavesTheWholeRecordsBeforeIt) {
    const std::vector<LayoutRecord> all = readLayoutText(kFourPersons);
    for (std::size_t length = 0; length <= kFourPersons.size(); ++length) {
        const LayoutReading reading = readWholeRecords(kFourPersons.substr(0, length));
        ASSERT_LE(reading.records.size(), all.size());
        for (std::size_t i = 0; i < reading.records.size(); ++i) EXPECT_EQ(reading.records[i], all[i]);
        EXPECT_EQ(reading.cut.has_value(), reading.wholeBytes != length) << "cut at " << length;
        EXPECT_EQ(writeLayoutText(reading.records), kFourPersons.substr(0, reading.wholeBytes));
    }
}

TEST(LayoutText, recordCutBehindItsSegmentsIsLeftOut) {
    const LayoutReading reading = readWholeRecords("17:0:0:0:;-1:0:0:0::");
    EXPECT_EQ(reading.records.size(), 1u);
    ASSERT_TRUE(reading.cut.has_value());
    EXPECT_EQ(reading.cut->position(), 20u);
}

// A reading of part of a text, at the end of memory that may be read: a byte behind it ends the program.
class TextBeforeNothing {
public:
    explicit TextBeforeNothing(std::string_view text)
        : pageSize_(static_cast<std::size_t>(sysconf(_SC_PAGESIZE))),
          pages_(mmap(nullptr, 2 * pageSize_, PROT_READ | PROT_WRITE, MAP_PRIVATE | MAP_ANONYMOUS, -1, 0)) {
        if (pages_ == MAP_FAILED || text.size() > pageSize_) throw std::runtime_error("no page for the text");
        char* const end = static_cast<char*>(pages_) + pageSize_;
        mprotect(end, pageSize_, PROT_NONE);
        text_ = std::string_view(std::copy(text.begin(), text.end(), end - text.size()) - text.size(),
                                 text.size());
    }
    ~TextBeforeNothing() { munmap(pages_, 2 * pageSize_); }
    TextBeforeNothing(const TextBeforeNothing&) = delete;
    TextBeforeNothing& operator=(const TextBeforeNothing&) = delete;

    std::string_view text() const { return text_; }

private:
    std::size_t pageSize_;
    void* pages_;
    std::string_view text_;
};

TEST(LayoutText, viewThatIsCutInsideANumberEndsThere) {
    const std::string whole = "17:27:0:0:;5:123456";
    const LayoutReading reading = readWholeRecords(std::string_view(whole).substr(0, 15));
    EXPECT_EQ(reading.records.size(), 1u);
    ASSERT_TRUE(reading.cut.has_value());
    EXPECT_EQ(reading.cut->position(), 15u);
    EXPECT_EQ(reading.cut->reason(), "expected ':', found the end");
}

TEST(LayoutText, nothingBehindTheTextIsLookedAt) {
    for (std::size_t length = 0; length <= kFourPersons.size(); ++length) {
        const std::string cutText = kFourPersons.substr(0, length);
        const TextBeforeNothing atTheEdge(cutText);
        const LayoutReading reading = readWholeRecords(atTheEdge.text());
        EXPECT_EQ(reading.records, readWholeRecords(cutText).records) << "cut at " << length;
    }
}

}  // namespace
}  // namespace olvane
