// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Charts of persons of a real file, which is not ours to pass on: history/royal92.ged below the folder that
// OLVANE_GEDCOM_DIR names. Without it these tests are skipped. bench/charts.cpp does the same for everybody.

#include <gtest/gtest.h>

#include <olvane/charts/Charts.h>
#include <olvane/gedcom/GedcomReader.h>
#include <olvane/picture/Judge.h>
#include <olvane/source/GedcomDataSource.h>
#include <olvane/source/GedcomKin.h>

#include <cstdint>
#include <cstdlib>
#include <memory>
#include <set>
#include <string>

using namespace olvane::kin;
using namespace olvane::charts;

namespace {

const char* folder() {
    return std::getenv("OLVANE_GEDCOM_DIR");
}

olvane::gedcom::GedcomData royalFamilies() {
    return olvane::gedcom::readGedcomFile(std::string(folder()) + "/history/royal92.ged");
}

}  // namespace

// The engine decides independently who is in its family view.
TEST(RealCharts, nearShowsExactlyThePersonsOfTheFamilyView) {
    if (folder() == nullptr) GTEST_SKIP() << "OLVANE_GEDCOM_DIR is not set";
    const olvane::gedcom::GedcomData data = royalFamilies();
    const KinGraph graph = olvane::gedcom::kinGraphOf(data);
    const auto source = std::make_shared<olvane::gedcom::GedcomDataSource>(data);
    for (Place person = 0; person < graph.personCount(); person += 7) {
        for (const bool cousins : {true, false}) {
            ChartRequest request;
            request.view = View::near;
            request.focus = person;
            request.layout.cousins = cousins;
            request.layout.siblingSpouses = cousins;
            std::set<std::int64_t> near;
            for (const auto& box : chartOf(graph, request).boxes) near.insert(box.id);
            std::set<std::int64_t> shown;
            for (const auto& box : olvane::familyLayout(graph.id(person), source, request.layout).boxes) {
                if (box.id > 0) shown.insert(box.id);
            }
            ASSERT_EQ(near, shown) << person + 1;
        }
    }
}

TEST(RealCharts, nothingOverlapsCrossesOrMisleads) {
    if (folder() == nullptr) GTEST_SKIP() << "OLVANE_GEDCOM_DIR is not set";
    const KinGraph graph = olvane::gedcom::kinGraphOf(royalFamilies());
    for (const View view : {View::near, View::ancestors, View::descendants, View::hourglass, View::relatives,
                            View::fan, View::kinship}) {
        for (Place person = 0; person < graph.personCount(); person += 43) {
            ChartRequest request;
            request.view = view;
            request.focus = person;
            request.to = (person + 1000) % graph.personCount();
            if (view == View::relatives) request.up = request.down = 3;
            const auto judged = olvane::picture::judge(chartOf(graph, request), &graph);
            ASSERT_EQ(judged.persons, judged.boxes);
            ASSERT_EQ(judged.overlaps + judged.hits + judged.crossings + judged.tracks + judged.touches +
                          judged.unjoined + judged.untold.value_or(1) + judged.unmarked + judged.slanted,
                      0U)
                << nameOf(view) << " of person " << person + 1;
        }
    }
}
