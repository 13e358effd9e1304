// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What hidden names are recognized by.

#include <gtest/gtest.h>

#include <olvane/gedcom/UnicodeTextInternal.h>

namespace olvane::gedcom::test {
namespace {

TEST(Folding, foldingTakesCaseAccentsAndStrokesAway) {
    EXPECT_EQ(foldedForSearch("ÄÖÜ ÉÈ Çß ØŁĐÐÞÆŒ"),
              "aou ee css oldd"
              "thaeoe");
    EXPECT_EQ(foldedForSearch("Plain ASCII"), "plain ascii");
}

}  // namespace
}  // namespace olvane::gedcom::test
