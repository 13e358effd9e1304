// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A picture in C: the library's own picture, copied once into structs whose layout never changes.

#include <olvane_picture.h>

#include <cstddef>
#include <memory>
#include <new>
#include <string>
#include <vector>

#include "FamilyInternal.h"
#include "LayoutInternal.h"

#include <olvane/picture/LayoutPicture.h>
#include <olvane/picture/PictureJson.h>

// The opaque picture.
struct olvane_picture {
    std::vector<olvane_picture_box> boxes;
    std::vector<olvane_picture_family> families;
    std::vector<std::int32_t> members;
    std::vector<std::int32_t> childKinds;
    std::vector<olvane_picture_line> lines;
    std::vector<double> bridges;
    std::vector<olvane_picture_mark> marks;
    std::int32_t focus = OLVANE_NO_PLACE;
    std::string json;
};

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
            box.hiddenChildren};
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

void fill(const picture::Picture& from, olvane_picture& to) {
    copyAll(from.boxes, to.boxes, boxOf);
    copyAll(from.families, to.families, familyOf);
    copyAll(from.lines, to.lines, lineOf);
    copyAll(from.marks, to.marks, markOf);
    to.members = from.members;
    copyAll(from.childKinds, to.childKinds,
            [](olvane::kin::ChildKind kind) { return static_cast<std::int32_t>(kind); });
    to.bridges = from.bridges;
    to.focus = from.focus;
    to.json = picture::pictureJson(from);
}

template <class Entry>
const Entry* dataOrNull(const std::vector<Entry>& entries) {
    return entries.empty() ? nullptr : entries.data();
}

}  // namespace

olvane_status olvane_picture_create(const olvane_layout* layout, const olvane_family* family,
                                    int unknown_parents, olvane_picture** picture) {
    if (!picture) return OLVANE_INVALID_ARGUMENT;
    *picture = nullptr;
    if (!layout) return OLVANE_INVALID_ARGUMENT;
    try {
        olvane::kin::KinGraph known;
        picture::LayoutPictureOptions options;
        options.unknownParents = unknown_parents != 0;
        if (family) {
            known = olvane::kinGraphOf(family->table);
            options.known = &known;
        }
        auto made = std::make_unique<olvane_picture>();
        fill(picture::pictureOf(layout->typed, options), *made);
        *picture = made.release();
    } catch (...) {
        return OLVANE_OUT_OF_MEMORY;  // nothing else can fail here
    }
    return OLVANE_OK;
}

void olvane_picture_free(olvane_picture* picture) {
    delete picture;
}

olvane_status olvane_picture_read(const olvane_picture* picture, olvane_picture_arrays* arrays) {
    if (!picture || !arrays || arrays->struct_size != sizeof(olvane_picture_arrays)) {
        return OLVANE_INVALID_ARGUMENT;
    }
    *arrays = {sizeof(olvane_picture_arrays),   dataOrNull(picture->boxes),   picture->boxes.size(),
               dataOrNull(picture->families),   picture->families.size(),     dataOrNull(picture->members),
               dataOrNull(picture->childKinds), picture->members.size(),      dataOrNull(picture->lines),
               picture->lines.size(),           dataOrNull(picture->bridges), picture->bridges.size(),
               dataOrNull(picture->marks),      picture->marks.size(),        picture->focus};
    return OLVANE_OK;
}

olvane_status olvane_picture_json(const olvane_picture* picture, const char** text, size_t* length) {
    if (!picture || !text) return OLVANE_INVALID_ARGUMENT;
    *text = picture->json.c_str();
    if (length) *length = picture->json.size();
    return OLVANE_OK;
}
