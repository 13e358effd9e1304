// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <olvane/boundary/TypedLayout.h>
#include <olvane/kin/KinGraph.h>
#include <olvane/picture/LineRouter.h>
#include <olvane/picture/Picture.h>

namespace olvane::picture {

struct LayoutPictureOptions {
    // Who is related to whom, with the ids of the layout: gives families their number, state and kinds of
    // children, and boxes the number of their hidden relatives. Read during the call only.
    const kin::KinGraph* known = nullptr;
    // Boxes for parents who are not known.
    bool unknownParents = true;
};

// The picture of one of the engine's two views. Boxes stand where the engine put them; lines are routed again
// from the families.
//
// With what is known, there is a family for each known one, by the link to the parents who are drawn: children
// of one couple from two of its families, and children of one parent with different partners who are not
// shown, are families of their own; full siblings whose other parent is not known are one, with the box of
// that unknown parent if there is one. Without it, families are those of the layout.
//
// Holds: boxes stand in the order of the layout, without those that repeat another at the same place, and
//        without unknown parents where the options leave them out. Persons with several boxes have marks, and so
//        have known relations between shown persons of which the view draws nothing.
// Fails: never, whatever the layout holds.
Picture pictureOf(const TypedLayout& layout, const LayoutPictureOptions& options = LayoutPictureOptions());

// Which way the generations of a view of the engine run.
Direction directionOf(TypedLayout::View view);

}  // namespace olvane::picture
