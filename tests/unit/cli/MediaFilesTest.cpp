// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <cli/MediaFiles.h>

#include <filesystem>

#include <gtest/gtest.h>

#include "ScratchFolder.h"

namespace olvane::cli {
namespace {

constexpr std::size_t kMost = 1000;

class MediaBeside : public testing::Test {
protected:
    MediaBeside() {
        std::filesystem::create_directories(scratch_.path("family/photos"));
        gedcom_ = scratch_.write("family/family.ged", "0 HEAD\n0 TRLR\n");
        scratch_.write("family/one.jpg", "ONE");
        scratch_.write("family/photos/two words.jpg", "TWO");
        scratch_.write("outside.jpg", "OUTSIDE");
    }

    std::optional<std::string> bytesOf(const std::string& file, std::size_t most = kMost) const {
        return MediaFiles(gedcom_).bytesOf(file, most);
    }

    ScratchFolder scratch_;
    std::string gedcom_;
};

TEST_F(MediaBeside, aFileInTheFolderOrBelowItIsRead) {
    EXPECT_EQ(bytesOf("one.jpg"), "ONE");
    EXPECT_EQ(bytesOf("photos/two words.jpg"), "TWO");
    EXPECT_EQ(bytesOf("photos\\two words.jpg"), "TWO");
    EXPECT_EQ(bytesOf("photos/two%20words.jpg"), "TWO");
    EXPECT_EQ(bytesOf("photos/../one.jpg"), "ONE");
}

TEST_F(MediaBeside, anAbsolutePathIsReadOnlyWithinTheFolder) {
    EXPECT_EQ(bytesOf(scratch_.path("family/one.jpg")), "ONE");
    EXPECT_EQ(bytesOf("file://" + scratch_.path("family/one.jpg")), "ONE");
    EXPECT_EQ(bytesOf(scratch_.path("outside.jpg")), std::nullopt);
}

TEST_F(MediaBeside, noPathLeadsOut) {
    EXPECT_EQ(bytesOf("../outside.jpg"), std::nullopt);
    EXPECT_EQ(bytesOf("photos/../../outside.jpg"), std::nullopt);
    EXPECT_EQ(bytesOf("%2e%2e/outside.jpg"), std::nullopt);
    EXPECT_EQ(bytesOf("..\\outside.jpg"), std::nullopt);
    EXPECT_EQ(bytesOf("/etc/passwd"), std::nullopt);
    EXPECT_EQ(bytesOf(std::string("one.jpg\0.png", 12)), std::nullopt);
}

TEST_F(MediaBeside, aSymbolicLinkLeadsNoFurtherThanAPath) {
    std::filesystem::create_symlink(scratch_.path("outside.jpg"), scratch_.path("family/out.jpg"));
    std::filesystem::create_symlink(scratch_.path("family/one.jpg"), scratch_.path("family/in.jpg"));
    std::filesystem::create_directory_symlink(scratch_.path(""), scratch_.path("family/up"));
    EXPECT_EQ(bytesOf("out.jpg"), std::nullopt);
    EXPECT_EQ(bytesOf("up/outside.jpg"), std::nullopt);
    EXPECT_EQ(bytesOf("in.jpg"), "ONE");
}

TEST_F(MediaBeside, foldersAndFilesBeyondTheLimitAreNotRead) {
    EXPECT_EQ(bytesOf("photos"), std::nullopt);
    EXPECT_EQ(bytesOf("one.jpg", 3), "ONE");
    EXPECT_EQ(bytesOf("one.jpg", 2), std::nullopt);
}

TEST(MediaFiles, theStandardInputHasNone) {
    EXPECT_EQ(MediaFiles("-").bytesOf("one.jpg", kMost), std::nullopt);
}

}  // namespace
}  // namespace olvane::cli
