// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What an output may replace, and what is left when it fails.

#include <cli/OutputFile.h>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cli/UsageError.h>

#include "ScratchFolder.h"

namespace olvane::cli {
namespace {

using ::testing::ElementsAre;
using ::testing::HasSubstr;

const OutputRules kPictures{InputFiles(), {".svg"}};

std::string refusalOf(const std::string& path, const OutputRules& rules) {
    try {
        checkOutput(path, rules);
    } catch (const UsageError& error) {
        return error.what();
    }
    return "";
}

mode_t permissionsOf(const std::string& path) {
    struct stat status = {};
    EXPECT_EQ(::stat(path.c_str(), &status), 0);
    return status.st_mode & 07777;
}

TEST(OutputFile, isRefusedInThePlaceOfAnInputWhateverItsName) {
    const ScratchFolder folder;
    const std::string input = folder.write("tree.svg", "input");
    std::filesystem::create_symlink(input, folder.path("link.svg"));
    std::filesystem::create_hard_link(input, folder.path("hard.svg"));
    const OutputRules rules{InputFiles({input}), {".svg"}};
    for (const char* name : {"tree.svg", "link.svg", "hard.svg"}) {
        EXPECT_THAT(refusalOf(folder.path(name), rules), HasSubstr("is the input file")) << name;
        EXPECT_THROW(writeOutput(folder.path(name), "picture", rules), UsageError) << name;
    }
    EXPECT_EQ(folder.read("tree.svg"), "input");
    EXPECT_EQ(refusalOf(folder.path("other.svg"), rules), "");
}

TEST(OutputFile, replacesAnExistingFileOfItsOwnEndingAlone) {
    const ScratchFolder folder;
    for (const char* name : {"a.ged", "a", ".svg", "a.svg.ged", "a.svgx"}) {
        const std::string path = folder.write(name, "before");
        EXPECT_THAT(refusalOf(path, kPictures), HasSubstr("is not replaced")) << name;
        EXPECT_THROW(writeOutput(path, "picture", kPictures), UsageError) << name;
        EXPECT_EQ(folder.read(name), "before");
    }
    writeOutput(folder.write("a.SVG", "before"), "picture", kPictures);
    EXPECT_EQ(folder.read("a.SVG"), "picture");
    writeOutput(folder.path("new"), "picture", kPictures);
    EXPECT_EQ(folder.read("new"), "picture");
}

TEST(OutputFile, isWrittenToWhereALinkLeadsEvenIfNothingIsThere) {
    const ScratchFolder folder;
    std::filesystem::create_symlink("real.svg", folder.path("link.svg"));
    writeOutput(folder.path("link.svg"), "picture", kPictures);
    EXPECT_TRUE(std::filesystem::is_symlink(folder.path("link.svg")));
    EXPECT_EQ(folder.read("real.svg"), "picture");
}

TEST(OutputFile, keepsThePermissionsOfTheFileThatItReplaces) {
    const ScratchFolder folder;
    for (const mode_t mode : {0600U, 0640U, 0444U, 0755U}) {
        const std::string path = folder.write("a.svg", "before");
        ASSERT_EQ(::chmod(path.c_str(), mode), 0);
        if (::faccessat(AT_FDCWD, path.c_str(), W_OK, AT_EACCESS) != 0) {
            EXPECT_THROW(writeOutput(path, "picture", kPictures), UsageError);
        } else {
            writeOutput(path, "picture", kPictures);
            EXPECT_EQ(folder.read("a.svg"), "picture");
        }
        EXPECT_EQ(permissionsOf(path), mode);
        std::filesystem::remove(path);
    }
}

TEST(OutputFile, hasThePermissionsThatTheUmaskLeavesWhereItIsNew) {
    const ScratchFolder folder;
    const mode_t before = ::umask(027);
    writeOutput(folder.path("a.svg"), "picture", kPictures);
    ::umask(before);
    EXPECT_EQ(permissionsOf(folder.path("a.svg")), 0640U);
}

// A device has no ending and nothing to lose: it is written to as it is, and no file takes its place.
TEST(OutputFile, goesStraightIntoADevice) {
    writeOutput("/dev/null", "picture", kPictures);
    struct stat status = {};
    ASSERT_EQ(::stat("/dev/null", &status), 0);
    EXPECT_TRUE(S_ISCHR(status.st_mode));
}

TEST(OutputFile, goesStraightIntoAPipe) {
    const ScratchFolder folder;
    const std::string path = folder.path("pipe");
    ASSERT_EQ(::mkfifo(path.c_str(), 0600), 0);
    const int reader = ::open(path.c_str(), O_RDONLY | O_NONBLOCK);
    ASSERT_GE(reader, 0);
    writeOutput(path, "picture", kPictures);
    char content[16] = {};
    EXPECT_EQ(::read(reader, content, sizeof content), 7);
    ::close(reader);
    EXPECT_STREQ(content, "picture");
    EXPECT_THAT(folder.names(), ElementsAre("pipe"));
}

TEST(OutputFile, saysThatADeviceIsFull) {
    if (!std::filesystem::exists("/dev/full")) GTEST_SKIP() << "this system has no /dev/full";
    try {
        writeOutput("/dev/full", "picture", kPictures);
        FAIL() << "nothing is refused";
    } catch (const UsageError& error) {
        EXPECT_THAT(error.what(), HasSubstr("/dev/full: cannot be written: No space left"));
    }
}

// A name of 255 bytes has no room for more.
TEST(OutputFile, mayHaveTheLongestNameThatThereIs) {
    const ScratchFolder folder;
    const std::string name = std::string(251, 'n') + ".svg";
    writeOutput(folder.path(name), "picture", kPictures);
    writeOutput(folder.path(name), "again", kPictures);
    EXPECT_EQ(folder.read(name), "again");
    EXPECT_THAT(folder.names(), ElementsAre(name));
}

TEST(OutputFile, overwritesNoFileWithATemporaryName) {
    const ScratchFolder folder;
    const std::string name = ".olvane-" + std::to_string(::getpid()) + "-0.part";
    folder.write(name, "somebody else's");
    writeOutput(folder.path("a.svg"), "picture", kPictures);
    EXPECT_EQ(folder.read(name), "somebody else's");
    EXPECT_THAT(folder.names(), ElementsAre(name, "a.svg"));
}

TEST(OutputSet, leavesEverythingAsItWasWhenTheLastFileCannotBePutInPlace) {
    const ScratchFolder folder;
    folder.write("1.svg", "before");
    {
        OutputSet set(kPictures);
        set.add(folder.path("1.svg"), "first");
        set.add(folder.path("2.svg"), "second");
        set.add(folder.path("3.svg"), "third");
        std::filesystem::create_directory(folder.path("3.svg"));
        EXPECT_THROW(set.finish(), UsageError);
    }
    EXPECT_EQ(folder.read("1.svg"), "before");
    EXPECT_THAT(folder.names(), ElementsAre("1.svg", "3.svg"));
}

TEST(OutputSet, changesNothingBeforeItIsFinished) {
    const ScratchFolder folder;
    folder.write("1.svg", "before");
    {
        OutputSet set(kPictures);
        set.add(folder.path("1.svg"), "first");
        EXPECT_EQ(folder.read("1.svg"), "before");
    }
    EXPECT_THAT(folder.names(), ElementsAre("1.svg"));
    EXPECT_EQ(folder.read("1.svg"), "before");
}

}  // namespace
}  // namespace olvane::cli
