// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A picture in C is the library's own picture, entry by entry.

#include <memory>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include <olvane_picture.h>

#include <olvane/boundary/TypedLayout.h>
#include <olvane/picture/LayoutPicture.h>
#include <olvane/picture/PictureJson.h>
#include <support/CaseRun.h>
#include <support/FamilyMaker.h>
#include <support/FamilyText.h>
#include <unit/bindings-c/CallbackHost.h>

namespace {

using support::CaseFile;
using support::family;
using unit::Answer;
using unit::layoutOf;

struct PictureDeleter {
    void operator()(olvane_picture* picture) const { olvane_picture_free(picture); }
};
typedef std::unique_ptr<olvane_picture, PictureDeleter> PicturePointer;

PicturePointer pictureOf(const Answer& answer, const olvane_family* known = nullptr, int unknownParents = 1) {
    olvane_picture* picture = nullptr;
    EXPECT_EQ(OLVANE_OK, olvane_picture_create(answer.layout.get(), known, unknownParents, &picture));
    return PicturePointer(picture);
}

olvane_picture_arrays arraysOf(const PicturePointer& picture) {
    olvane_picture_arrays arrays = {};
    arrays.struct_size = sizeof arrays;
    EXPECT_EQ(OLVANE_OK, olvane_picture_read(picture.get(), &arrays));
    return arrays;
}

std::string jsonOf(const PicturePointer& picture) {
    const char* text = nullptr;
    std::size_t length = 0;
    EXPECT_EQ(OLVANE_OK, olvane_picture_json(picture.get(), &text, &length));
    return std::string(text, length);
}

// The same in C++, without the C interface.
olvane::picture::Picture libraryPictureOf(const CaseFile& input, bool unknownParents = true) {
    olvane::picture::LayoutPictureOptions options;
    options.unknownParents = unknownParents;
    return olvane::picture::pictureOf(
        olvane::familyLayout(input.focus, std::make_shared<support::CaseManager>(input)), options);
}

// A couple 1 and 2, divorced, with a son 3 and an adopted daughter 4; 1 has a son 5 by somebody unknown.
struct Couple {
    std::vector<std::int64_t> ids{1, 2, 3, 4, 5}, fathers{0, 0, 1, 1, 1}, mothers{0, 0, 2, 2, 0},
        sexes{0, 1, 0, 1, 0};
    std::vector<std::int64_t> numbers{7}, partners0{1}, partners1{2}, states{1};
    std::vector<std::int64_t> of{7, 7}, children{3, 4}, kinds{0, 1};

    olvane_family* table() const {
        const auto column = [](const std::vector<std::int64_t>& list) {
            return olvane_numbers{list.data(), list.size(), OLVANE_INT64};
        };
        olvane_family_columns columns = {};
        columns.persons.id = column(ids);
        columns.persons.father = column(fathers);
        columns.persons.mother = column(mothers);
        columns.persons.sex = column(sexes);
        columns.families.number = column(numbers);
        columns.families.partner0 = column(partners0);
        columns.families.partner1 = column(partners1);
        columns.families.state = column(states);
        columns.family_children.family = column(of);
        columns.family_children.child = column(children);
        columns.family_children.kind = column(kinds);
        olvane_family* family = nullptr;
        EXPECT_EQ(OLVANE_OK, olvane_family_create(&columns, &family, nullptr));
        return family;
    }
};

TEST(CPicture, isTheLibrarysPictureForManyFamilies) {
    for (std::uint64_t seed = 1; seed <= 100; ++seed) {
        const CaseFile input = support::FamilyMaker(seed, 25).any();
        const Answer answer = layoutOf(input);
        ASSERT_EQ(OLVANE_OK, answer.status) << support::formatCase(input);
        const olvane::picture::Picture expected = libraryPictureOf(input);
        const PicturePointer picture = pictureOf(answer);
        const olvane_picture_arrays arrays = arraysOf(picture);
        EXPECT_EQ(olvane::picture::pictureJson(expected), jsonOf(picture));
        ASSERT_EQ(expected.boxes.size(), arrays.box_count);
        ASSERT_EQ(expected.lines.size(), arrays.line_count);
        ASSERT_EQ(expected.families.size(), arrays.family_count);
        for (std::size_t i = 0; i < arrays.box_count; ++i) {
            EXPECT_EQ(expected.boxes[i].id, arrays.boxes[i].id);
            EXPECT_EQ(expected.boxes[i].x, arrays.boxes[i].x);
            EXPECT_EQ(expected.boxes[i].y, arrays.boxes[i].y);
            EXPECT_EQ(expected.boxes[i].flag, arrays.boxes[i].flag != 0);
        }
        for (std::size_t i = 0; i < arrays.line_count; ++i) {
            EXPECT_EQ(expected.lines[i].y2, arrays.lines[i].y2);
            EXPECT_EQ(expected.lines[i].child, arrays.lines[i].child);
            EXPECT_EQ(static_cast<int>(expected.lines[i].role), arrays.lines[i].role);
        }
        for (std::size_t i = 0; i < arrays.family_count; ++i) {
            EXPECT_EQ(expected.families[i].firstMember, arrays.families[i].first_member);
            EXPECT_EQ(expected.families[i].childCount, arrays.families[i].child_count);
            EXPECT_EQ(expected.families[i].lineCount, arrays.families[i].line_count);
        }
        EXPECT_EQ(expected.members,
                  (std::vector<std::int32_t>(arrays.members, arrays.members + arrays.member_count)));
        EXPECT_EQ(expected.bridges,
                  (std::vector<double>(arrays.bridges, arrays.bridges + arrays.bridge_count)));
        EXPECT_EQ(expected.marks.size(), arrays.mark_count);
    }
}

TEST(CPicture, hasTheNumbersStatesAndKindsOfTheFamilyThatItIsOf) {
    olvane_family* const family = Couple().table();
    olvane_layout* layout = nullptr;
    ASSERT_EQ(OLVANE_OK, olvane_view(family, OLVANE_VIEW_FAMILY, 2, nullptr, &layout));
    const Answer answer{OLVANE_OK, unit::LayoutPointer(layout)};
    const PicturePointer picture = pictureOf(answer, family);
    olvane_family_free(family);
    const olvane_picture_arrays arrays = arraysOf(picture);
    const olvane_picture_family* couple = nullptr;
    for (std::size_t i = 0; i < arrays.family_count; ++i) {
        if (arrays.families[i].number == 7) couple = &arrays.families[i];
    }
    ASSERT_NE(nullptr, couple);
    EXPECT_EQ(1, couple->state);
    ASSERT_EQ(2u, couple->parent_count);
    ASSERT_EQ(2u, couple->child_count);
    const std::int32_t* const members = arrays.members + couple->first_member;
    const std::int32_t* const kinds = arrays.child_kinds + couple->first_member;
    EXPECT_EQ(1, arrays.boxes[members[0]].id);
    EXPECT_EQ(2, arrays.boxes[members[1]].id);
    for (std::size_t i = 2; i < 4; ++i) EXPECT_EQ(arrays.boxes[members[i]].id == 4 ? 1 : 0, kinds[i]);
    EXPECT_EQ(2, arrays.boxes[arrays.focus].id);
}

// In the pedigree of 3 the father's other children, 4 and 5, have no boxes.
TEST(CPicture, countsTheRelativesWithoutABoxInTheFamilyThatItIsOf) {
    olvane_family* const family = Couple().table();
    olvane_layout* layout = nullptr;
    ASSERT_EQ(OLVANE_OK, olvane_view(family, OLVANE_VIEW_PEDIGREE, 3, nullptr, &layout));
    const PicturePointer picture = pictureOf({OLVANE_OK, unit::LayoutPointer(layout)}, family);
    olvane_family_free(family);
    const olvane_picture_arrays arrays = arraysOf(picture);
    std::int32_t hidden = -1;
    for (std::size_t i = 0; i < arrays.box_count; ++i) {
        if (arrays.boxes[i].id == 1) hidden = arrays.boxes[i].hidden_children;
    }
    EXPECT_EQ(2, hidden);
}

TEST(CPicture, leavesUnknownParentsOutOnRequest) {
    const CaseFile input = family("17+42: 5");
    const Answer answer = layoutOf(input);
    const PicturePointer without = pictureOf(answer, nullptr, 0);
    EXPECT_EQ(3u, arraysOf(without).box_count);
    EXPECT_EQ(olvane::picture::pictureJson(libraryPictureOf(input, false)), jsonOf(without));
    const PicturePointer with = pictureOf(answer);
    const olvane_picture_arrays arrays = arraysOf(with);
    ASSERT_EQ(5u, arrays.box_count);
    int unknown = 0;
    for (std::size_t i = 0; i < arrays.box_count; ++i) {
        if (arrays.boxes[i].kind != OLVANE_BOX_UNKNOWN_PARENT) continue;
        EXPECT_EQ(17, arrays.boxes[arrays.boxes[i].child_of].id);
        ++unknown;
    }
    EXPECT_EQ(2, unknown);
}

TEST(CPicture, ofALayoutThatHoldsNothingIsEmpty) {
    CaseFile input = family("17");
    input.failures[support::HostOperation::sexOfPersonWithID] = {1};
    const PicturePointer picture = pictureOf(layoutOf(input));
    const olvane_picture_arrays arrays = arraysOf(picture);
    EXPECT_EQ(0u, arrays.box_count);
    EXPECT_EQ(nullptr, arrays.boxes);
    EXPECT_EQ(nullptr, arrays.lines);
    EXPECT_EQ(OLVANE_NO_PLACE, arrays.focus);
}

TEST(CPicture, refusesNullsAndStructsOfNoVersion) {
    const Answer answer = layoutOf(family("17"));
    olvane_picture* picture = nullptr;
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, olvane_picture_create(nullptr, nullptr, 1, &picture));
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, olvane_picture_create(answer.layout.get(), nullptr, 1, nullptr));
    const PicturePointer made = pictureOf(answer);
    olvane_picture_arrays arrays = {};
    for (const std::size_t size : {std::size_t{0}, sizeof arrays - 1, sizeof arrays + 8}) {
        arrays.struct_size = size;
        EXPECT_EQ(OLVANE_INVALID_ARGUMENT, olvane_picture_read(made.get(), &arrays));
    }
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, olvane_picture_read(made.get(), nullptr));
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, olvane_picture_json(made.get(), nullptr, nullptr));
    olvane_picture_free(nullptr);
}

}  // namespace
