// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <cli/InputFiles.h>

#include <gtest/gtest.h>

#include <fcntl.h>
#include <unistd.h>

#include "ScratchFolder.h"

namespace olvane::cli {
namespace {

TEST(InputFiles, areKnownByDescriptorToo) {
    const ScratchFolder folder;
    const InputFiles inputs({folder.write("a.ged", "a")});
    const int same = ::open(folder.path("a.ged").c_str(), O_RDONLY | O_CLOEXEC);
    const int other = ::open(folder.write("b.ged", "a").c_str(), O_RDONLY | O_CLOEXEC);
    EXPECT_TRUE(inputs.hasDescriptor(same));
    EXPECT_FALSE(inputs.hasDescriptor(other));
    EXPECT_FALSE(inputs.hasDescriptor(-1));
    ::close(same);
    ::close(other);
}

TEST(InputFiles, areRegularFilesAlone) {
    const ScratchFolder folder;
    const InputFiles inputs({"/dev/null", folder.path("."), folder.path("nothing"), ""});
    EXPECT_FALSE(inputs.hasPath("/dev/null"));
    EXPECT_FALSE(inputs.hasPath(folder.path(".")));
    EXPECT_FALSE(inputs.hasPath(""));
}

}  // namespace
}  // namespace olvane::cli
