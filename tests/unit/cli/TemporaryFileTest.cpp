// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <cli/TemporaryFile.h>

#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <iterator>
#include <string>
#include <system_error>

namespace olvane::cli {
namespace {

namespace fs = std::filesystem;

class TemporaryFiles : public testing::Test {
protected:
    TemporaryFiles() : folder_(fs::temp_directory_path() / "olvane-temporary-file-test") {
        fs::remove_all(folder_);
        fs::create_directory(folder_);
    }
    ~TemporaryFiles() override { fs::remove_all(folder_); }

    fs::path place() const { return folder_ / "out.svg"; }
    void write(const std::string& text) const { std::ofstream(place()) << text; }
    std::string content() const {
        std::ifstream file(place());
        return {std::istreambuf_iterator<char>(file), std::istreambuf_iterator<char>()};
    }
    auto files() const { return std::distance(fs::directory_iterator(folder_), fs::directory_iterator()); }

private:
    fs::path folder_;
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
    EXPECT_EQ(files(), 1);
}

TEST_F(TemporaryFiles, leaveNothingWhereTheyAreNotKept) {
    { TemporaryFile file(place(), "new"); }
    EXPECT_EQ(files(), 0);
    write("old");
    {
        TemporaryFile file(place(), "new");
        file.publish();
        EXPECT_EQ(content(), "new");
    }
    EXPECT_EQ(content(), "old");
    EXPECT_EQ(files(), 1);
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
