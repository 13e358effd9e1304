// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Charts of persons of a real file, which is not ours to pass on: history/royal92.ged below the folder that
// OLVANE_GEDCOM_DIR names. Without it these tests are skipped. bench/charts.cpp does the same for everybody.

#include <gtest/gtest.h>

#include <olvane/charts/Charts.h>
#include <olvane/gedcom/GedcomReader.h>
#include <olvane/picture/Judge.h>
#include <olvane/source/GedcomKin.h>

#include <cstdlib>
#include <string>

using namespace olvane::kin;
using namespace olvane::charts;

TEST(RealCharts, nothingOverlapsCrossesOrMisleads) {
    const char* folder = std::getenv("OLVANE_GEDCOM_DIR");
    if (folder == nullptr) GTEST_SKIP() << "OLVANE_GEDCOM_DIR is not set";
    const KinGraph graph = olvane::gedcom::kinGraphOf(
        olvane::gedcom::readGedcomFile(std::string(folder) + "/history/royal92.ged"));
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
