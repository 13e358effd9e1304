// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Kinship in a real file, beside a plain second implementation. The file is history/royal92.ged below the folder that
// OLVANE_GEDCOM_DIR names. With OLVANE_LONG_TESTS set, the coefficients of all pairs and the ways of 10,000 are
// compared, which takes a minute; otherwise those of one person in 61, and of 100 pairs.

#include <olvane/gedcom/GedcomReader.h>
#include <olvane/kin/Kinship.h>
#include <olvane/source/GedcomKin.h>

#include <gtest/gtest.h>

#include <cmath>
#include <cstdlib>
#include <fstream>
#include <iostream>
#include <memory>
#include <random>
#include <string>

#include "PlainKinship.h"

using namespace olvane::kin;

namespace {

class KinshipInAFile : public testing::Test {
protected:
    void SetUp() override {
        const char* folder = std::getenv("OLVANE_GEDCOM_DIR");
        const std::string path = folder == nullptr ? "" : std::string(folder) + "/history/royal92.ged";
        if (path.empty() || !std::ifstream(path))
            GTEST_SKIP() << "OLVANE_GEDCOM_DIR names no folder with the file";
        data_ = std::make_unique<olvane::gedcom::GedcomData>(olvane::gedcom::readGedcomFile(path));
        graph_ = olvane::gedcom::kinGraphOf(*data_);
    }

    std::unique_ptr<olvane::gedcom::GedcomData> data_;
    KinGraph graph_;
};

bool isLong() {
    return std::getenv("OLVANE_LONG_TESTS") != nullptr;
}

std::string text(const std::vector<KinWay>& ways) {
    std::string out;
    for (const KinWay& way : ways) {
        out += std::to_string(way.up) + "+" + std::to_string(way.down) + ":";
        for (const Place person : way.persons) out += " " + std::to_string(person);
        out += " over";
        for (const Place person : way.ancestors) out += " " + std::to_string(person);
        out += "\n";
    }
    return out;
}

}  // namespace

TEST_F(KinshipInAFile, coefficientsOfAllPairsEqualThoseOfATable) {
    const plain::Kinship judge(graph_);
    const auto phi = judge.coefficients();
    ASSERT_TRUE(phi.has_value());
    KinshipFinder finder(graph_);
    double worst = 0;
    std::size_t related = 0;
    for (Place a = 0; a < graph_.personCount(); a += isLong() ? 1 : 61) {
        for (Place b = a; b < graph_.personCount(); ++b) {
            const auto found = finder.coefficient(a, b);
            ASSERT_TRUE(found.has_value());
            worst = std::max(
                worst, std::abs(*found - (*phi)[static_cast<std::size_t>(a)][static_cast<std::size_t>(b)]));
            if (*found > 0) ++related;
        }
    }
    EXPECT_LE(worst, 1e-12);
    if (isLong()) {
        std::cout << "coefficients of all " << graph_.personCount() << " persons with one another, "
                  << related << " pairs above 0: " << worst << " from those of the plain table at most\n";
    }
    EXPECT_GT(related, isLong() ? 100'000u : 1'000u);
}

TEST_F(KinshipInAFile, waysOfRandomPairsEqualAPlainList) {
    const plain::Kinship judge(graph_);
    KinshipFinder finder(graph_);
    std::mt19937 random(92);
    const auto pick = [&random, this] {
        return static_cast<Place>(random() % static_cast<unsigned>(graph_.personCount()));
    };
    std::size_t related = 0;
    const std::size_t pairs = isLong() ? 10'000 : 100;
    for (std::size_t i = 0; i < pairs; ++i) {
        const Place a = pick();
        const Place b = pick();
        const auto expected = judge.ways(a, b, true);
        const Kinship found = finder.between(a, b, {expected.size() + 1});
        ASSERT_EQ(text(found.blood), text(expected)) << graph_.id(a) << " and " << graph_.id(b);
        ASSERT_EQ(found.bloodCount, expected.size()) << graph_.id(a) << " and " << graph_.id(b);
        if (!expected.empty()) ++related;
    }
    EXPECT_GT(related, pairs / 50);
    if (isLong()) {
        std::cout << "ways by blood of " << pairs << " random pairs, " << related
                  << " of them related: all as in the plain list\n";
    }
}
