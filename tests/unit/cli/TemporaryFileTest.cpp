// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <cli/TemporaryFile.h>

#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <iterator>
#include <string>
#include <system_error>

#include "ScratchFolder.h"

namespace olvane::cli {
namespace {

namespace fs = std::filesystem;

class TemporaryFiles : public testing::Test {
protected:
    fs::path place() const { return folder_.path("out.svg"); }
    void write(const std::string& text) const { std::ofstream(place()) << text; }
    std::string content() const {
        std::ifstream file(place());
        return {std::istreambuf_iterator<char>(file), std::istreambuf_iterator<char>()};
    }
    std::size_t files() const { return folder_.names().size(); }

private:
    ScratchFolder folder_;
};

TEST_F(TemporaryFiles, standInTheirPlaceOncePublished) {
    {
        TemporaryFile file(place(), "new");
        EXPECT_FALSE(fs::exists(place()));
        file.publish();
        EXPECT_EQ(content(), "new");
        file.keep();
    }
    EXPECT_EQ(content(), "new");
    EXPECT_EQ(files(), 1u);
}

TEST_F(TemporaryFiles, leaveNothingWhereTheyAreNotKept) {
    { TemporaryFile file(place(), "new"); }
    EXPECT_EQ(files(), 0u);
    write("old");
    {
        TemporaryFile file(place(), "new");
        file.publish();
        EXPECT_EQ(content(), "new");
    }
    EXPECT_EQ(content(), "old");
    EXPECT_EQ(files(), 1u);
}

TEST_F(TemporaryFiles, keepThePermissionsOfWhatTheyReplace) {
    write("old");
    fs::permissions(place(), fs::perms::owner_read | fs::perms::owner_write);
    TemporaryFile file(place(), "new");
    file.publish();
    file.keep();
    EXPECT_EQ(fs::status(place()).permissions(), fs::perms::owner_read | fs::perms::owner_write);
}

TEST_F(TemporaryFiles, cannotBeMadeInAFolderThatIsNotThere) {
    EXPECT_THROW(TemporaryFile(place() / "below" / "out.svg", "new"), std::system_error);
}

}  // namespace
}  // namespace olvane::cli
