// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The picture of any view in C: of a table and of callbacks it is that of the library.

#include <algorithm>
#include <limits>
#include <memory>
#include <string>
#include <vector>

#include <malloc.h>

#include <gtest/gtest.h>

#include <FamilyInternal.h>
#include <olvane_picture.h>

#include <olvane/charts/Views.h>
#include <olvane/picture/Judge.h>
#include <olvane/picture/PictureJson.h>
#include <support/FamilyText.h>
#include <unit/bindings-c/CallbackHost.h>

namespace {

struct PictureDeleter {
    void operator()(olvane_picture* picture) const { olvane_picture_free(picture); }
};
typedef std::unique_ptr<olvane_picture, PictureDeleter> PicturePointer;

olvane_picture_options optionsFor(std::int32_t view) {
    olvane_picture_options options;
    EXPECT_EQ(OLVANE_OK, olvane_picture_options_default(view, &options));
    return options;
}

std::string jsonOf(const PicturePointer& picture) {
    const char* text = nullptr;
    EXPECT_EQ(OLVANE_OK, olvane_picture_json(picture.get(), &text, nullptr));
    return text;
}

// Two children of 1 and 2: 3, who has a child 7 with 4, and 5.
std::unique_ptr<olvane_family> table() {
    auto family = std::make_unique<olvane_family>();
    for (const std::int64_t id : {1, 2, 3, 4, 5, 7}) {
        olvane::PersonRow row;
        row.id = id;
        row.sex = id % 2 == 0 ? olvane::kin::Sex::female : olvane::kin::Sex::male;
        row.father = id == 3 || id == 5 ? 1 : id == 7 ? 3 : 0;
        row.mother = id == 3 || id == 5 ? 2 : id == 7 ? 4 : 0;
        if (id == 7) row.mother = 4;
        family->table.addPerson(row);
    }
    const auto join = [&](std::int64_t one, std::int64_t other, const std::vector<std::int64_t>& children) {
        const std::int64_t spouseOfOne[] = {other};
        const std::int64_t spouseOfOther[] = {one};
        family->table.setSpouses(one, spouseOfOne, other);
        family->table.setSpouses(other, spouseOfOther, one);
        family->table.setChildren(one, children);
        family->table.setChildren(other, children);
    };
    join(1, 2, {3, 5});
    join(3, 4, {7});
    return family;
}

// Null where it fails.
PicturePointer pictureOfSeven(const std::unique_ptr<olvane_family>& family,
                              const olvane_picture_options& options) {
    olvane_picture* made = nullptr;
    EXPECT_EQ(OLVANE_OK, olvane_picture_of_family(family.get(), 7, &options, &made));
    return PicturePointer(made);
}

TEST(CViews, ofATableAreThoseOfTheLibrary) {
    const auto family = table();
    for (std::int32_t view = OLVANE_PICTURE_FAMILY; view <= OLVANE_PICTURE_EVERYBODY; ++view) {
        olvane_picture_options options = optionsFor(view);
        options.other = 5;
        const PicturePointer picture = pictureOfSeven(family, options);
        ASSERT_NE(nullptr, picture) << view;
        olvane::charts::ViewRequest request;
        request.chart.view = static_cast<olvane::charts::View>(view);
        EXPECT_EQ(jsonOf(picture),
                  olvane::picture::pictureJson(olvane::charts::pictureOf(family->table, 7, request, 5)))
            << view;
    }
}

olvane_judgement judgementOf(const PicturePointer& picture, const olvane_family* known) {
    olvane_judgement judgement = {};
    judgement.struct_size = sizeof judgement;
    EXPECT_EQ(OLVANE_OK, olvane_picture_judge(picture.get(), known, &judgement));
    return judgement;
}

// Six persons in two families of two couples, and nothing wrong with the picture until more is known than it shows.
TEST(CViews, areJudged) {
    const auto family = table();
    const olvane_picture_options options = optionsFor(OLVANE_PICTURE_RELATIVES);
    const PicturePointer picture = pictureOfSeven(family, options);
    ASSERT_NE(nullptr, picture);
    const olvane_judgement alone = judgementOf(picture, nullptr);
    EXPECT_EQ(6, alone.boxes);
    EXPECT_EQ(6, alone.persons);
    EXPECT_EQ(2, alone.families);
    EXPECT_EQ(2, alone.couples);
    EXPECT_EQ(2, alone.side_by_side);
    EXPECT_EQ(0, alone.overlaps + alone.hits + alone.crossings + alone.tracks + alone.touches +
                     alone.unjoined + alone.repeats + alone.slanted);
    EXPECT_EQ(-1, alone.untold);
    EXPECT_EQ(0, judgementOf(picture, family.get()).untold);
    const std::int64_t four[] = {4};
    const std::int64_t five[] = {5};
    family->table.setSpouses(5, four, 4);
    family->table.setSpouses(4, five, 5);
    EXPECT_EQ(1, judgementOf(picture, family.get()).untold)
        << "5 and 4 are partners in no family of the picture";
}

TEST(CViews, haveTheMeasuresThatTheLibraryHas) {
    const auto family = table();
    for (std::int32_t view = OLVANE_PICTURE_FAMILY; view <= OLVANE_PICTURE_EVERYBODY; ++view) {
        olvane_picture_options options = optionsFor(view);
        options.other = 5;
        const PicturePointer picture = pictureOfSeven(family, options);
        ASSERT_NE(nullptr, picture) << view;
        olvane::charts::ViewRequest request;
        request.chart.view = static_cast<olvane::charts::View>(view);
        const auto expected = olvane::picture::judge(olvane::charts::pictureOf(family->table, 7, request, 5));
        const olvane_judgement judgement = judgementOf(picture, nullptr);
        EXPECT_EQ(static_cast<std::int64_t>(expected.boxes), judgement.boxes) << view;
        EXPECT_EQ(static_cast<std::int64_t>(expected.sideBySide), judgement.side_by_side) << view;
        EXPECT_EQ(static_cast<std::int64_t>(expected.partnersElsewhereMarks),
                  judgement.partners_elsewhere_marks)
            << view;
        EXPECT_EQ(expected.width, judgement.width) << view;
        EXPECT_EQ(expected.aspect, judgement.aspect) << view;
        EXPECT_EQ(expected.longLineLength, judgement.long_line_length) << view;
    }
}

TEST(CViews, refuseToBeJudgedIntoAStructOfAnotherVersion) {
    const auto family = table();
    olvane_picture* made = nullptr;
    ASSERT_EQ(OLVANE_OK, olvane_picture_of_family(family.get(), 7, nullptr, &made));
    const PicturePointer picture(made);
    olvane_judgement judgement = {};
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, olvane_picture_judge(picture.get(), nullptr, &judgement));
    judgement.struct_size = sizeof judgement;
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, olvane_picture_judge(nullptr, nullptr, &judgement));
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, olvane_picture_judge(picture.get(), nullptr, nullptr));
}

TEST(CViews, ofEverybodyKeepsThePlacesOfAnEarlierOne) {
    const auto family = table();
    olvane_picture_options options = optionsFor(OLVANE_PICTURE_EVERYBODY);
    olvane_picture* made = nullptr;
    ASSERT_EQ(OLVANE_OK, olvane_picture_of_family(family.get(), 7, &options, &made));
    const PicturePointer before(made);
    olvane::PersonRow row;
    row.id = 9;
    row.father = 1;
    row.mother = 2;
    family->table.addPerson(row);
    const std::int64_t children[] = {9, 3, 5};
    family->table.setChildren(1, children);
    family->table.setChildren(2, children);
    olvane::charts::ViewRequest request;
    request.chart.view = olvane::charts::View::everybody;
    const std::string fromScratch =
        olvane::picture::pictureJson(olvane::charts::pictureOf(family->table, 7, request));
    const auto drawn = [&](std::int32_t direction) {
        olvane_picture* later = nullptr;
        options.direction = direction;
        EXPECT_EQ(OLVANE_OK, olvane_picture_of_family(family.get(), 7, &options, &later));
        return jsonOf(PicturePointer(later));
    };
    options.earlier = before.get();
    EXPECT_NE(drawn(0), fromScratch);
    const std::string sideways = drawn(3);
    options.earlier = nullptr;
    EXPECT_EQ(drawn(0), fromScratch);
    EXPECT_EQ(drawn(3), sideways);
}

struct FileDeleter {
    void operator()(olvane_file* file) const { olvane_file_free(file); }
};

// 1 and 2 have a child 3, born in 1990.
std::unique_ptr<olvane_file, FileDeleter> fileOfThree() {
    const std::string bytes =
        "0 HEAD\n1 GEDC\n2 VERS 5.5.1\n1 CHAR UTF-8\n"
        "0 @I1@ INDI\n1 NAME A\n1 SEX M\n1 DEAT Y\n1 FAMS @F1@\n"
        "0 @I2@ INDI\n1 NAME B\n1 SEX F\n1 DEAT Y\n1 FAMS @F1@\n"
        "0 @I3@ INDI\n1 NAME C\n1 SEX M\n1 BIRT\n2 DATE 1990\n1 FAMC @F1@\n2 PEDI adopted\n"
        "0 @F1@ FAM\n1 HUSB @I1@\n1 WIFE @I2@\n1 CHIL @I3@\n0 TRLR\n";
    olvane_file* file = nullptr;
    EXPECT_EQ(OLVANE_OK, olvane_file_read(bytes.data(), bytes.size(), "here.ged", 0, &file, nullptr));
    return std::unique_ptr<olvane_file, FileDeleter>(file);
}

TEST(CViews, ofAFileAreThoseOfItsTable) {
    const auto file = fileOfThree();
    olvane_family* table = nullptr;
    ASSERT_EQ(OLVANE_OK, olvane_file_family(file.get(), &table));
    for (std::int32_t view = OLVANE_PICTURE_FAMILY; view <= OLVANE_PICTURE_EVERYBODY; ++view) {
        olvane_picture_options options = optionsFor(view);
        options.other = 2;
        olvane_picture* ofFile = nullptr;
        olvane_picture* ofTable = nullptr;
        EXPECT_EQ(OLVANE_OK, olvane_picture_of_file(file.get(), 3, &options, &ofFile)) << view;
        EXPECT_EQ(OLVANE_OK, olvane_picture_of_family(table, 3, &options, &ofTable)) << view;
        EXPECT_EQ(jsonOf(PicturePointer(ofFile)), jsonOf(PicturePointer(ofTable))) << view;
    }
    olvane_family_free(table);
}

TEST(CViews, ofAFileStateNothingOfTheLiving) {
    const auto file = fileOfThree();
    olvane_picture_options options = optionsFor(OLVANE_PICTURE_ANCESTORS);
    options.hide_living = 1;
    options.year = 2020;
    olvane_picture* made = nullptr;
    ASSERT_EQ(OLVANE_OK, olvane_picture_of_file(file.get(), 3, &options, &made));
    const PicturePointer picture(made);
    olvane_picture_arrays arrays = {};
    arrays.struct_size = sizeof arrays;
    ASSERT_EQ(OLVANE_OK, olvane_picture_read(picture.get(), &arrays));
    ASSERT_EQ(3U, arrays.box_count);
    for (std::size_t i = 0; i < arrays.box_count; ++i) {
        EXPECT_EQ(arrays.boxes[i].id == 3 ? 1 : 0, arrays.boxes[i].living) << arrays.boxes[i].id;
    }
    ASSERT_EQ(1U, arrays.family_count);
    const olvane_picture_family& family = arrays.families[0];
    EXPECT_EQ(5, arrays.child_kinds[family.first_member + family.parent_count]);  // not that he is adopted
}

TEST(CViews, ofNobodyAreRefused) {
    const auto file = fileOfThree();
    const auto family = table();
    olvane_picture* made = nullptr;
    EXPECT_EQ(OLVANE_INVALID_PERSON, olvane_picture_of_file(file.get(), 4, nullptr, &made));
    olvane_picture_free(made);
    olvane_picture_options options = optionsFor(OLVANE_PICTURE_KINSHIP);
    options.other = 4294967297;
    EXPECT_EQ(OLVANE_INVALID_PERSON, olvane_picture_of_file(file.get(), 3, &options, &made));
    olvane_picture_free(made);
    options = optionsFor(OLVANE_PICTURE_FAMILY);
    options.hide_living = 1;  // a table says nothing of years
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, olvane_picture_of_family(family.get(), 3, &options, &made));
    EXPECT_EQ(nullptr, made);
}

TEST(CViews, ofKinshipHaveWaysAndWords) {
    const auto family = table();
    olvane_picture_options options = optionsFor(OLVANE_PICTURE_KINSHIP);
    options.other = 5;
    const PicturePointer picture = pictureOfSeven(family, options);
    ASSERT_NE(nullptr, picture);
    olvane_picture_arrays arrays = {};
    arrays.struct_size = sizeof arrays;
    ASSERT_EQ(OLVANE_OK, olvane_picture_read(picture.get(), &arrays));
    EXPECT_EQ(arrays.boxes[arrays.other].id, 5);
    ASSERT_EQ(arrays.way_count, 1U);
    EXPECT_STREQ(arrays.ways[0].words, "uncle (father's brother)");
    EXPECT_STREQ(arrays.focus_is, "nephew");
    EXPECT_EQ(arrays.ways[0].box_count, 4U);
    EXPECT_EQ(arrays.ways[0].ancestor_count, 2U);
    EXPECT_EQ(arrays.boxes[arrays.way_boxes[3]].id, 5);
    EXPECT_GT(arrays.way_piece_count, 3U);
}

TEST(CViews, foldBranchesAndAreMirrored) {
    const auto family = table();
    const olvane_fold folds[] = {{7, 0}};  // the ancestors of the focus
    olvane_picture_options options = optionsFor(OLVANE_PICTURE_ANCESTORS);
    options.folds = folds;
    options.fold_count = 1;
    options.mirrored = 1;
    const PicturePointer picture = pictureOfSeven(family, options);
    ASSERT_NE(nullptr, picture);
    olvane::charts::ViewRequest request;
    const olvane::charts::Fold fold{7, olvane::picture::Branch::up};
    request.chart.view = olvane::charts::View::ancestors;
    request.chart.mirrored = true;
    request.chart.folded = {&fold, 1};
    EXPECT_EQ(jsonOf(picture),
              olvane::picture::pictureJson(olvane::charts::pictureOf(family->table, 7, request)));
    olvane_picture_arrays arrays = {};
    arrays.struct_size = sizeof arrays;
    ASSERT_EQ(OLVANE_OK, olvane_picture_read(picture.get(), &arrays));
    EXPECT_EQ(arrays.box_count, 1U);
    ASSERT_EQ(arrays.folded_count, 1U);
    EXPECT_EQ(arrays.folded[0].box, 0);
    EXPECT_EQ(arrays.folded[0].branch, 0);
    EXPECT_GT(arrays.folded[0].count, 1);
    options.folds = nullptr;
    olvane_picture* made = nullptr;
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, olvane_picture_of_family(family.get(), 7, &options, &made));
}

TEST(CViews, haveBoxesOfTheirOwnSizesAndFoldForAPaper) {
    const auto family = table();
    const olvane_box_size sizes[] = {{7, 120, 40}, {1, 30, 90}};
    olvane_picture_options options = optionsFor(OLVANE_PICTURE_ANCESTORS);
    options.box_sizes = sizes;
    options.box_size_count = 2;
    options.aspect = 0.1;
    const PicturePointer picture = pictureOfSeven(family, options);
    ASSERT_NE(nullptr, picture);
    olvane::charts::ViewRequest request;
    const olvane::charts::SizedBox sized[] = {{7, {120, 40}}, {1, {30, 90}}};
    request.chart.view = olvane::charts::View::ancestors;
    request.chart.sizedBoxes = sized;
    request.chart.aspect = 0.1;
    EXPECT_EQ(jsonOf(picture),
              olvane::picture::pictureJson(olvane::charts::pictureOf(family->table, 7, request)));
    olvane_picture_arrays arrays = {};
    arrays.struct_size = sizeof arrays;
    ASSERT_EQ(OLVANE_OK, olvane_picture_read(picture.get(), &arrays));
    EXPECT_EQ(arrays.boxes[0].id, 7);
    EXPECT_EQ(arrays.boxes[0].width, 120);
    EXPECT_EQ(arrays.boxes[0].height, 40);
}

TEST(CViews, refuseSizesOfBoxesThatAreNone) {
    const auto family = table();
    olvane_picture* made = nullptr;
    const float none = std::numeric_limits<float>::quiet_NaN();
    for (const olvane_box_size size : {olvane_box_size{7, -1, 40}, {7, 40, none}, {7, 2e6F, 40}}) {
        olvane_picture_options options = optionsFor(OLVANE_PICTURE_ANCESTORS);
        options.box_sizes = &size;
        options.box_size_count = 1;
        EXPECT_EQ(OLVANE_INVALID_ARGUMENT, olvane_picture_of_family(family.get(), 7, &options, &made));
        options.box_sizes = nullptr;
        EXPECT_EQ(OLVANE_INVALID_ARGUMENT, olvane_picture_of_family(family.get(), 7, &options, &made));
    }
    olvane_picture_options options = optionsFor(OLVANE_PICTURE_EVERYBODY);
    options.aspect = std::numeric_limits<double>::infinity();
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, olvane_picture_of_family(family.get(), 7, &options, &made));
}

TEST(CViews, ofARoundChartHaveArcs) {
    const auto family = table();
    const olvane_picture_options options = optionsFor(OLVANE_PICTURE_FAN);
    const PicturePointer picture = pictureOfSeven(family, options);
    ASSERT_NE(nullptr, picture);
    olvane_picture_arrays arrays = {};
    arrays.struct_size = sizeof arrays;
    ASSERT_EQ(OLVANE_OK, olvane_picture_read(picture.get(), &arrays));
    ASSERT_EQ(arrays.arc_count, arrays.box_count);
    EXPECT_EQ(arrays.arcs[arrays.focus].ring, 0);
    EXPECT_GE(arrays.ring_radius_count, 3U);
}

TEST(CViews, refuseWhatIsOutOfRangeAndWhoIsNotThere) {
    const auto family = table();
    olvane_picture* picture = nullptr;
    olvane_picture_options options;
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, olvane_picture_options_default(10, &options));
    options = optionsFor(OLVANE_PICTURE_FAN);
    options.fan_angle = 89;
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, olvane_picture_of_family(family.get(), 7, &options, &picture));
    options = optionsFor(OLVANE_PICTURE_NEAR);
    options.struct_size = 8;
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, olvane_picture_of_family(family.get(), 7, &options, &picture));
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, olvane_picture_of_family(nullptr, 7, nullptr, &picture));
    EXPECT_EQ(nullptr, picture);
    options = optionsFor(OLVANE_PICTURE_KINSHIP);
    EXPECT_EQ(OLVANE_INVALID_PERSON, olvane_picture_of_family(family.get(), 7, &options, &picture));
    const PicturePointer empty(picture);
    const char* why = nullptr;
    EXPECT_EQ(OLVANE_OK, olvane_picture_failure(empty.get(), &why));
    EXPECT_STREQ(why, "The focus, or the other person, is not there.");
}

olvane_picture_option optionAt(std::size_t index) {
    olvane_picture_option option = {};
    option.struct_size = sizeof option;
    EXPECT_EQ(OLVANE_OK, olvane_picture_option_at(index, &option));
    return option;
}

TEST(CViews, nameTheFieldThatIsOutOfRange) {
    const char* refused = nullptr;
    olvane_picture_options options = optionsFor(OLVANE_PICTURE_FAN);
    EXPECT_EQ(OLVANE_OK, olvane_picture_options_check(&options, &refused));
    EXPECT_EQ(nullptr, refused);
    options.effort = 101;
    options.fan_angle = 89;
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, olvane_picture_options_check(&options, &refused));
    EXPECT_STREQ("fan_angle", refused);
    options.fan_angle = 90.5;
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, olvane_picture_options_check(&options, &refused));
    EXPECT_STREQ("effort", refused);
    options = optionsFor(OLVANE_PICTURE_FAN);
    options.layout.generations = 0;
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, olvane_picture_options_check(&options, &refused));
    EXPECT_STREQ("layout.generations", refused);
    options = optionsFor(OLVANE_PICTURE_FAN);
    options.year = -1;
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, olvane_picture_options_check(&options, &refused));
    EXPECT_STREQ("year", refused);
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, olvane_picture_options_check(nullptr, &refused));
}

// The defaults are what the table says, and the check refuses what is just beyond its bounds.
TEST(CViews, listWhatEachFieldTakes) {
    std::vector<std::string> names;
    for (std::size_t i = 0; i < olvane_picture_option_count(); ++i) {
        const olvane_picture_option option = optionAt(i);
        names.emplace_back(option.name);
        EXPECT_LE(option.least, option.usual) << option.name;
        EXPECT_LE(option.usual, option.most) << option.name;
        EXPECT_NE(0U, option.views) << option.name;
        const auto words = static_cast<std::size_t>(option.kind == OLVANE_OPTION_WORD ? option.most + 1 : 0);
        for (std::size_t word = 0; word < words; ++word)
            EXPECT_NE(nullptr, olvane_picture_option_word(i, word)) << option.name;
        EXPECT_EQ(nullptr, olvane_picture_option_word(i, words)) << option.name;
    }
    for (const char* name : {"view", "up", "fan_of", "most_ways", "layout.shown", "aspect"})
        EXPECT_EQ(1, std::count(names.begin(), names.end(), name)) << name;
    olvane_picture_option direction = optionAt(3);
    EXPECT_STREQ("direction", direction.name);
    EXPECT_STREQ("left", olvane_picture_option_word(3, 2));
    EXPECT_EQ(0U, direction.views & (1U << OLVANE_PICTURE_FAMILY));
    EXPECT_NE(0U, direction.views & (1U << OLVANE_PICTURE_NEAR));
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, olvane_picture_option_at(names.size(), &direction));
    direction.struct_size = 1;
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, olvane_picture_option_at(0, &direction));
    EXPECT_EQ(nullptr, olvane_picture_option_word(names.size(), 0));
}

int refuse(void*, std::int64_t, olvane_person_list*) {
    return 5;
}
int nobody(void*, std::int64_t, std::int64_t*) {
    return 0;
}
int nobodies(void*, std::int64_t, olvane_person_list*) {
    return 0;
}
int notPreferred(void*, std::int64_t, std::int64_t, int*) {
    return 0;
}
int alive(void*, std::int64_t, int*) {
    return 0;
}
int noDate(void*, std::int64_t, int, olvane_date*) {
    return 0;
}
int male(void*, std::int64_t, std::int32_t*) {
    return 0;
}

TEST(CViews, nameTheCallbackAndThePersonOfAFailure) {
    olvane_host host = {sizeof host, nullptr,      nobody, nobody, refuse,
                        nobodies,    notPreferred, alive,  noDate, male};
    for (std::int32_t view = OLVANE_PICTURE_FAMILY; view <= OLVANE_PICTURE_EVERYBODY; ++view) {
        olvane_picture_options options = optionsFor(view);
        options.other = 17;
        if (view == OLVANE_PICTURE_PEDIGREE) options.layout.flag_depth = 4;
        olvane_picture* made = nullptr;
        const olvane_status status = olvane_picture_of_host(&host, 17, &options, &made);
        const PicturePointer picture(made);
        if (view == OLVANE_PICTURE_PEDIGREE && status == OLVANE_OK) continue;  // it may ask nobody's spouses
        EXPECT_EQ(OLVANE_HOST_FAILED, status) << view;
        const char* why = nullptr;
        ASSERT_EQ(OLVANE_OK, olvane_picture_failure(picture.get(), &why));
        EXPECT_STREQ(why, "spouses_of(17) returned 5") << view;
    }
    host.spouses_of = nobodies;
    olvane_picture* made = nullptr;
    const olvane_picture_options options = optionsFor(OLVANE_PICTURE_HOURGLASS);
    EXPECT_EQ(OLVANE_OK, olvane_picture_of_host(&host, 17, &options, &made));
    const PicturePointer picture(made);
    olvane_picture_arrays arrays = {};
    arrays.struct_size = sizeof arrays;
    EXPECT_EQ(OLVANE_OK, olvane_picture_read(picture.get(), &arrays));
    EXPECT_EQ(arrays.box_count, 1U);
}

#if defined(__GLIBC__)
// Memory in use is counted by the C library alone; under a sanitizer it is 0, and the sanitizer itself looks for leaks.
TEST(CViews, asManyAsOneLikesLeaveNoMemoryBehind) {
    const auto family = table();
    const auto layOutAll = [&family](int rounds) {
        for (int round = 0; round < rounds; ++round) {
            for (std::int32_t view = OLVANE_PICTURE_FAMILY; view <= OLVANE_PICTURE_EVERYBODY; ++view) {
                olvane_picture_options options = optionsFor(view);
                options.other = 5;
                olvane_family* copy = nullptr;
                ASSERT_EQ(OLVANE_OK, olvane_family_copy(family.get(), &copy));
                olvane_picture* made = nullptr;
                EXPECT_EQ(OLVANE_OK, olvane_picture_of_family(copy, 7, &options, &made));
                olvane_picture_free(made);
                olvane_layout* layout = nullptr;
                EXPECT_EQ(OLVANE_OK, olvane_view(copy, round % 2, 7, nullptr, &layout));
                olvane_layout_free(layout);
                olvane_family_free(copy);
            }
        }
    };
    layOutAll(20);
    const std::size_t before = mallinfo2().uordblks;
    layOutAll(60);
    EXPECT_EQ(mallinfo2().uordblks, before);
}
#endif

}  // namespace
