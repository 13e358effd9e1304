// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <cstdint>
#include <memory>
#include <span>
#include <string>
#include <vector>

#include <olvane/Export.h>
#include <olvane/boundary/OlvaneViewerManagerWrapProtocol.h>
#include <olvane/host/LayoutText.h>
#include <olvane/layouter/LineRole.h>
#include <olvane/layouter/TreeSize.h>

namespace olvane {

// The sizes that the family view has in every request of the entry call, in points.
OLVANE_API TreeSize familyTreeSize();

// What a layout shows. Each view reads its own part.
struct LayoutOptions {
    TreeSize sizes = familyTreeSize();

    // Family view: which relatives are shown. Cousins need aunts and uncles; nieces and nephews, and the
    // spouses of siblings, need siblings.
    bool auntsUncles = true;
    bool cousins = true;
    bool siblings = true;
    bool siblingSpouses = true;
    bool niecesNephews = true;
    bool grandchildren = true;
    bool greatGrandparents = true;
    bool spousesOfChildren = true;

    // Pedigree: columns, the focus's own included, 1 to kMostGenerations. Full ancestry of n is 2^n - 1 boxes.
    int generations = 5;
    // Pedigree: generations, the focus's own included, in which a parent's partners who have no box raise the
    // flag; 0 for none.
    int flagDepth = 4;

    bool withText = true;  // TypedLayout::text is written too

    // A pedigree takes a few hundred bytes of stack for each generation.
    static constexpr int kMostGenerations = 1000;
};

// A finished layout as values: the boxes and lines of the result text, and what each line is for.
//
// Units: points; x grows right, y grows down. (x, y) is a box's upper-left corner, and every box has the size
//        that the options gave. All numbers are those that the text writes, cut toward zero.
// Holds: boxes stand in the order of the text, the focus first. Places are valid or kNone. One person may have
//        several boxes. A value: copies are deep.
struct TypedLayout {
    typedef std::int32_t Index;
    static constexpr Index kNone = -1;

    enum class View : std::uint8_t { family, pedigree };
    enum class BoxKind : std::uint8_t { person, unknownFather, unknownMother };

    struct Box {
        std::int64_t id = 0;  // the host's id; negative for an unknown parent
        int x = 0;
        int y = 0;
        // Of an unknown parent: the person whose parent is not known, and that person's box.
        std::int64_t childId = 0;
        Index childOf = kNone;
        // The box that this one repeats, or kNone. A host that lists a spouse twice gets the couple's children
        // twice: at the same place, with the same lines. Lines and families name the first of such boxes.
        Index repeatOf = kNone;
        std::uint32_t firstLine = 0;  // the lines that the text writes with this box
        std::uint32_t lineCount = 0;
        BoxKind kind = BoxKind::person;
        bool male = false;                // as the view takes it: a spouse has the other sex than the person
        bool hasHiddenRelatives = false;  // the flag of the text

        bool operator==(const Box&) const = default;
    };

    // One segment of the text. A couple's drop is there once for each child.
    struct Line {
        int x1 = 0;
        int y1 = 0;
        int x2 = 0;
        int y2 = 0;
        Index holder = kNone;  // the box with which the text writes it
        Index family = kNone;  // whose line it is
        Index child = kNone;   // the child to whom it leads; kNone for a marriage line
        LineRole role = LineRole::marriage;

        bool operator==(const Line&) const = default;
    };

    // Persons whom lines join: a couple with the children below it, or a lone parent with children. Every
    // couple and every parent and child that the layout joins are in one.
    struct Family {
        Index parents[2] = {kNone, kNone};  // the man or the father first; the second kNone for a lone parent
        std::uint32_t firstChild = 0;       // into children, in the order of the drawing
        std::uint32_t childCount = 0;

        bool operator==(const Family&) const = default;
    };

    View view = View::family;
    TreeSize sizes = familyTreeSize();
    std::vector<Box> boxes;
    std::vector<Line> lines;  // by box, each box's in the order of the text
    std::vector<Family> families;
    std::vector<Index> children;  // boxes, by family
    std::string text;             // the result text; empty where the options left it out

    std::span<const Line> linesOf(const Box& box) const {
        return {lines.data() + box.firstLine, box.lineCount};
    }
    std::span<const Index> childrenOf(const Family& family) const {
        return {children.data() + family.firstChild, family.childCount};
    }
    std::span<const Index> parentsOf(const Family& family) const {
        return {family.parents, family.parents[1] == kNone ? 1u : 2u};
    }
};

// Lays out one view around one person. The focus is asked for by the host's id, 1 to 2147483647.
//
// Host operations are called on this thread, within the call. Unlike the entry call, a failure is not
// swallowed, and a layout may be asked for within an operation of another one.
// Fails: std::invalid_argument for a focus or options out of their range and for a null manager;
//        std::out_of_range where the data leave no picture, as ids below 1 among a person's relatives may;
//        std::bad_alloc; and whatever the host's operations throw.
OLVANE_API TypedLayout familyLayout(std::int64_t focusId,
                                    const std::shared_ptr<OlvaneViewerManagerWrapProtocol>& manager,
                                    const LayoutOptions& options = LayoutOptions());
OLVANE_API TypedLayout pedigreeLayout(std::int64_t focusId,
                                      const std::shared_ptr<OlvaneViewerManagerWrapProtocol>& manager,
                                      const LayoutOptions& options = LayoutOptions());

// The same for the view that is named, into a layout that after a failure holds what was laid out so far: whole
// boxes, and a text whose last record may be cut.
OLVANE_API void layOut(TypedLayout::View view, std::int64_t focusId,
                       const std::shared_ptr<OlvaneViewerManagerWrapProtocol>& manager,
                       const LayoutOptions& options, TypedLayout& result);

// The records that readLayoutText reads from the layout's text.
OLVANE_API std::vector<LayoutRecord> recordsOf(const TypedLayout& layout);

}  // namespace olvane
