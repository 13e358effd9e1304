// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Input made to hurt: depth, length, number and tangle. Each must be read in time and memory that follow its
// size; a quadratic reader would be killed by the test's time limit.

#include <cstdint>
#include <string>

#include <gtest/gtest.h>

#include "GedcomText.h"

namespace olvane::gedcom::test {
namespace {

constexpr int kMany = 200000;

TEST(HostileInput, depthCostsNothing) {
    std::string records = "0 @I1@ INDI\n";
    for (int level = 1; level <= kMany; ++level) records.append(std::to_string(level)).append(" _D\n");
    records.append("1 NAME Deep\n");
    EXPECT_EQ(namesOf(read(document(records))), "Deep");
}

TEST(HostileInput, aNameOfManyMegabytesIsWhole) {
    const std::string longName(20U << 20, 'x');
    const GedcomData data = read(document(std::string("0 @I1@ INDI\n1 NAME ").append(longName).append("\n")));
    EXPECT_EQ(data.firstName(1).written.size(), longName.size());
}

TEST(HostileInput, aNameInManyPiecesIsWhole) {
    std::string records = "0 @I1@ INDI\n1 NAME a\n";
    for (int piece = 0; piece < kMany; ++piece) records.append("2 CONC b\n");
    for (int piece = 0; piece < kMany; ++piece) records.append("2 GIVN c\n");
    const GedcomData data = read(document(records));
    EXPECT_EQ(data.firstName(1).written.size(), kMany + 1U);
    EXPECT_EQ(data.firstName(1).given.size(), 2U * kMany - 1);
}

TEST(HostileInput, emptyLinesByTheMillionAreCounted) {
    for (const char lineEnd : {'\n', '\r'}) {
        const GedcomData data = read(document(std::string(10000000, lineEnd)));
        EXPECT_EQ(data.diagnostics().size(), 1U);
    }
}

TEST(HostileInput, oneLineEndOfAnotherSortDoesNotSlowTheRest) {
    std::string bytes = document("");
    for (int person = 0; person < kMany; ++person) bytes.append("0 INDI\r1 NAME A\r");
    bytes.append("0 TRLR\n");
    EXPECT_EQ(read(bytes).personCount(), static_cast<std::size_t>(kMany));
}

TEST(HostileInput, aThousandWivesAreAThousandWives) {
    std::string records = "0 @I0@ INDI\n";
    for (int wife = 1; wife <= kMany; ++wife)
        records.append("1 FAMS @F").append(std::to_string(wife)).append("@\n");
    for (int wife = 1; wife <= kMany; ++wife) {
        const std::string number = std::to_string(wife);
        records.append("0 @I")
            .append(number)
            .append("@ INDI\n0 @F")
            .append(number)
            .append("@ FAM\n1 HUSB @I0@\n1 WIFE @I");
        records.append(number).append("@\n");
    }
    EXPECT_EQ(read(document(records)).spouses(1).size(), static_cast<std::size_t>(kMany));
}

TEST(HostileInput, oneFamilyNamedManyTimesIsWalkedOnce) {
    std::string records = "0 @I1@ INDI\n";
    for (int link = 0; link < kMany; ++link) records.append("1 FAMS @F1@\n");
    records.append("0 @F1@ FAM\n1 HUSB @I1@\n");
    for (int child = 0; child < kMany; ++child) records.append("1 CHIL @I1@\n");
    const GedcomData data = read(document(records));
    EXPECT_EQ(idsOf(data.children(1)), "1");
}

TEST(HostileInput, aFamilyThatAllClaimStaysSmallInMemory) {
    std::string records;
    for (int person = 1; person <= 50000; ++person) {
        records.append("0 @I").append(std::to_string(person)).append("@ INDI\n1 FAMS @F1@\n");
    }
    records.append("0 @F1@ FAM\n");
    for (int person = 1; person <= 50000; ++person)
        records.append("1 CHIL @I").append(std::to_string(person)).append("@\n");
    const GedcomData data = read(document(records));
    EXPECT_EQ(data.children(1).size(), 50000U);
    EXPECT_EQ(data.children(2).size(), 50000U);
    EXPECT_EQ(data.children(4).size(), 0U);
    EXPECT_EQ(reported(data, DiagnosticKind::wrongPointer).size(), 100U);
}

TEST(HostileInput, looseChildrenOfAFamilyThatAllClaimAreWalkedOnce) {
    std::string records;
    for (int person = 1; person <= kMany; ++person) {
        records.append("0 @I").append(std::to_string(person)).append("@ INDI\n1 FAMS @F1@\n");
    }
    records.append("0 @F1@ FAM\n");
    for (int link = 0; link < kMany; ++link) records.append("1 CHIL @LOOSE@\n");
    EXPECT_EQ(read(document(records)).children(kMany).size(), 0U);
}

TEST(HostileInput, troubleInEveryLineStaysSmallInMemory) {
    std::string records;
    for (int line = 0; line < kMany; ++line)
        records.append("9 @X FAMS\nrubbish\n0 @I1@ INDI\n1 FAMC @Q\n1 NAME \x01\n");
    EXPECT_LT(read(document(records)).diagnostics().size(), 1000U);
}

// A small generator with a fixed seed, so that a failure comes again.
class Random {
public:
    std::uint32_t below(std::uint32_t limit) {
        state_ = state_ * 6364136223846793005U + 1442695040888963407U;
        return static_cast<std::uint32_t>(state_ >> 33) % limit;
    }

private:
    std::uint64_t state_ = 1;
};

// Walks over everything that the data offer.
std::size_t touchAll(const GedcomData& data) {
    std::size_t touched = 0;
    for (PersonId id = 1; id <= data.personCount(); ++id) {
        for (const PersonName& name : data.names(id)) touched += displayName(name).size();
        for (const PersonId other : data.spouses(id)) touched += data.person(other).line;
        for (const PersonId other : data.children(id)) touched += data.person(other).line;
        touched += sortText(data.person(id).birth).size() + displayYear(data.person(id).death).size();
    }
    for (FamilyId id = 1; id <= data.familyCount(); ++id) {
        for (const ChildLink& link : data.childLinks(id)) touched += link.line;
    }
    for (const Diagnostic& diagnostic : data.diagnostics()) touched += formatDiagnostic(diagnostic).size();
    return touched;
}

TEST(HostileInput, changedBytesAreReadOrRefused) {
    const std::string sound = document(
        "0 @I1@ INDI\n1 NAME J\xC3\xBCrgen /M\xC3\xBCller/\n2 GIVN J\n1 SEX M\n1 BIRT\n2 DATE BET 1 JAN 1900 "
        "AND @#DHEBREW@ 1 TSH 5700\n"
        "1 DEAT\n2 DATE (x)\n1 FAMS @F1@\n0 @I2@ INDI\n1 FAMC @F1@\n2 PEDI birth\n0 @F1@ FAM\n1 HUSB @I1@\n1 "
        "CHIL @I2@\n");
    const char* pieces[] = {"\n",      "\r",   "@",    "/",    "0 ",     "1 ",
                            "2 CONC ", "\xFF", "\xC3", "\x1A", "99999 ", " INDI"};
    Random random;
    std::size_t read = 0;
    for (int round = 0; round < 20000; ++round) {
        std::string bytes = sound;
        for (std::uint32_t change = random.below(8); change > 0; --change) {
            const std::size_t at = random.below(static_cast<std::uint32_t>(bytes.size()));
            switch (random.below(4)) {
                case 0:
                    bytes[at] = static_cast<char>(random.below(256));
                    break;
                case 1:
                    bytes.erase(at, random.below(20));
                    break;
                case 2:
                    bytes.insert(at, pieces[random.below(12)]);
                    break;
                default:
                    bytes.insert(at, bytes.substr(random.below(static_cast<std::uint32_t>(bytes.size())),
                                                  random.below(60)));
                    break;
            }
            if (bytes.empty()) bytes.assign(1, '0');
        }
        try {
            touchAll(test::read(bytes));
            ++read;
        } catch (const GedcomError&) {
        }
    }
    EXPECT_GT(read, 15000U);
}

}  // namespace
}  // namespace olvane::gedcom::test
