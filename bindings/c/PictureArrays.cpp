// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A picture's values for C: copied once into structs whose layout never changes, then read as arrays.

#include "PictureArrays.h"

#include <cstddef>
#include <utility>

namespace {

namespace picture = olvane::picture;

olvane_picture_box boxOf(const picture::Box& box) {
    return {box.id,
            box.x,
            box.y,
            box.width,
            box.height,
            static_cast<std::int32_t>(box.kind),
            static_cast<std::int32_t>(box.sex),
            box.childOf,
            box.repeat,
            box.flag ? 1 : 0,
            box.hiddenParents,
            box.hiddenPartners,
            box.hiddenChildren,
            box.furtherParents,
            0};
}

olvane_picture_family familyOf(const picture::Family& family) {
    return {family.firstMember,
            family.parentCount,
            family.childCount,
            family.firstLine,
            family.lineCount,
            family.number,
            static_cast<std::int32_t>(family.style)};
}

olvane_picture_line lineOf(const picture::Line& line) {
    return {line.x1,    line.y1,          line.x2,         line.y2, static_cast<std::int32_t>(line.role),
            line.child, line.firstBridge, line.bridgeCount};
}

olvane_picture_mark markOf(const picture::Mark& mark) {
    return {static_cast<std::int32_t>(mark.kind), mark.number, {mark.boxes[0], mark.boxes[1], mark.boxes[2]}};
}

template <class Target, class Source, class Convert>
void copyAll(const std::vector<Source>& from, std::vector<Target>& to, const Convert& convert) {
    to.reserve(from.size());
    for (const Source& entry : from) to.push_back(convert(entry));
}

void fillKinship(const picture::Picture& from, olvane_picture& to) {
    to.other = from.other;
    to.focusIs = from.focusIs;
    to.otherIs = from.otherIs;
    copyAll(from.ways, to.words, [](const picture::Way& way) { return way.words; });
    for (std::size_t i = 0; i < from.ways.size(); ++i) {
        const picture::Way& way = from.ways[i];
        to.ways.push_back({way.firstBox, way.boxCount, way.ancestorCount, way.firstPiece, way.pieceCount,
                           static_cast<std::int32_t>(way.kind), to.words[i].c_str()});
    }
    to.wayBoxes = from.wayBoxes;
    copyAll(from.wayPieces, to.wayPieces, [](const picture::WayPiece& piece) {
        return olvane_picture_piece{piece.x1, piece.y1, piece.x2, piece.y2};
    });
}

template <class Entry>
const Entry* dataOrNull(const std::vector<Entry>& entries) {
    return entries.empty() ? nullptr : entries.data();
}

}  // namespace

void olvane::c::fill(picture::Picture from, olvane_picture& to) {
    copyAll(from.boxes, to.boxes, boxOf);
    copyAll(from.families, to.families, familyOf);
    copyAll(from.lines, to.lines, lineOf);
    copyAll(from.marks, to.marks, markOf);
    to.members = from.members;
    copyAll(from.childKinds, to.childKinds,
            [](olvane::kin::ChildKind kind) { return static_cast<std::int32_t>(kind); });
    to.bridges = from.bridges;
    to.focus = from.focus;
    copyAll(from.arcs, to.arcs, [](const picture::Arc& arc) {
        return olvane_picture_arc{arc.from, arc.to, arc.ring, arc.line};
    });
    to.ringRadii = from.ringRadii;
    to.middleX = from.middleX;
    to.middleY = from.middleY;
    fillKinship(from, to);
    copyAll(from.folded, to.folded, [](const picture::FoldedBranch& folded) {
        return olvane_picture_folded{folded.box, folded.count, static_cast<std::int32_t>(folded.branch),
                                     static_cast<std::int32_t>(folded.side)};
    });
    to.source = std::move(from);
}

olvane_status olvane_picture_read(const olvane_picture* picture, olvane_picture_arrays* arrays) {
    if (!picture || !arrays || arrays->struct_size != sizeof(olvane_picture_arrays)) {
        return OLVANE_INVALID_ARGUMENT;
    }
    *arrays = {sizeof(olvane_picture_arrays),
               dataOrNull(picture->boxes),
               picture->boxes.size(),
               dataOrNull(picture->families),
               picture->families.size(),
               dataOrNull(picture->members),
               dataOrNull(picture->childKinds),
               picture->members.size(),
               dataOrNull(picture->lines),
               picture->lines.size(),
               dataOrNull(picture->bridges),
               picture->bridges.size(),
               dataOrNull(picture->marks),
               picture->marks.size(),
               picture->focus,
               picture->other,
               dataOrNull(picture->arcs),
               picture->arcs.size(),
               dataOrNull(picture->ringRadii),
               picture->ringRadii.size(),
               picture->middleX,
               picture->middleY,
               dataOrNull(picture->ways),
               picture->ways.size(),
               dataOrNull(picture->wayBoxes),
               picture->wayBoxes.size(),
               dataOrNull(picture->wayPieces),
               picture->wayPieces.size(),
               picture->focusIs.c_str(),
               picture->otherIs.c_str(),
               dataOrNull(picture->folded),
               picture->folded.size()};
    return OLVANE_OK;
}
