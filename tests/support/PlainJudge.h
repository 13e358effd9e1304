// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <olvane/picture/Judge.h>

namespace olvane::test {

// The counts of a picture by comparing everything with everything: slow and plain, from the definitions
// alone, for pictures whose lines are horizontal or vertical. Sets the counts of pairs, unjoined, untold,
// couples, repeats and slanted pieces; no measures.
picture::Judgement plainJudgement(const picture::Picture& picture, const kin::KinGraph* known = nullptr);

}  // namespace olvane::test
