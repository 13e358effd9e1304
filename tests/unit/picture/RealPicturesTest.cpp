// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Pictures of a real family of 3,010 persons, both views of everybody: what no line may do, it does in none.

#include <gtest/gtest.h>

#include <cstdio>
#include <cstdlib>
#include <memory>
#include <string>

#include <olvane/boundary/TypedLayout.h>
#include <olvane/gedcom/GedcomReader.h>
#include <olvane/picture/Judge.h>
#include <olvane/picture/LayoutPicture.h>
#include <olvane/source/GedcomDataSource.h>
#include <olvane/source/GedcomKin.h>

using olvane::TypedLayout;
using olvane::picture::judge;
using olvane::picture::Judgement;
using olvane::picture::Picture;
using olvane::picture::pictureOf;

namespace {

struct Sums {
    std::size_t pictures = 0;
    std::size_t boxes = 0;
    std::size_t overlapping = 0;  // pictures of which boxes overlap
    std::size_t crossings = 0;
    std::size_t hits = 0;
    std::size_t tracks = 0;
    std::size_t touches = 0;
    std::size_t unjoined = 0;
    std::size_t untold = 0;
    std::size_t elsewhere = 0;  // marks that stand for lines

    void add(const Judgement& j) {
        ++pictures;
        boxes += j.boxes;
        if (j.overlaps > 0) ++overlapping;
        crossings += j.crossings;
        hits += j.hits;
        tracks += j.tracks;
        touches += j.touches;
        unjoined += j.unjoined;
        untold += j.untold.value_or(0);
        elsewhere += j.parentsElsewhereMarks + j.partnersElsewhereMarks;
    }
    void print(const char* view) const {
        std::printf(
            "%s: %zu pictures, %zu boxes, %zu with overlapping boxes, %zu crossings, %zu hits, %zu tracks, "
            "%zu touches, %zu unjoined, %zu untold, %zu elsewhere marks\n",
            view, pictures, boxes, overlapping, crossings, hits, tracks, touches, unjoined, untold,
            elsewhere);
    }
};

}  // namespace

class RealPictures : public testing::TestWithParam<TypedLayout::View> {};

TEST_P(RealPictures, everyLineKeepsClearOfEverythingElse) {
    const char* folder = std::getenv("OLVANE_GEDCOM_DIR");
    if (folder == nullptr) GTEST_SKIP() << "OLVANE_GEDCOM_DIR names no folder of GEDCOM files";
    const olvane::gedcom::GedcomData data =
        olvane::gedcom::readGedcomFile(std::string(folder) + "/history/royal92.ged");
    const auto manager = std::make_shared<olvane::gedcom::GedcomDataSource>(data);
    const olvane::kin::KinGraph known = olvane::gedcom::kinGraphOf(data);
    olvane::picture::LayoutPictureOptions options;
    options.known = &known;
    olvane::LayoutOptions layoutOptions;
    layoutOptions.withText = false;
    Sums sums;
    for (std::size_t id = 1; id <= data.personCount(); ++id) {
        TypedLayout layout;
        olvane::layOut(GetParam(), static_cast<std::int64_t>(id), manager, layoutOptions, layout);
        const Judgement j = judge(pictureOf(layout, options), &known);
        EXPECT_EQ(j.untold, 0u) << "person " << id;
        EXPECT_EQ(j.unmarked, 0u) << "person " << id;
        EXPECT_EQ(j.hits + j.tracks + j.touches + j.unjoined, 0u)
            << "person " << id << ": overlaps " << j.overlaps << ", hits " << j.hits << ", tracks "
            << j.tracks << ", touches " << j.touches << ", unjoined " << j.unjoined;
        sums.add(j);
    }
    sums.print(GetParam() == TypedLayout::View::family ? "family" : "pedigree");
}

INSTANTIATE_TEST_SUITE_P(BothViews, RealPictures,
                         testing::Values(TypedLayout::View::family, TypedLayout::View::pedigree),
                         [](const auto& view) {
                             return view.param == TypedLayout::View::family ? "family" : "pedigree";
                         });
