// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Dates of every form: which year is shown, and that the sortable text sorts.

#include <algorithm>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include <olvane/gedcom/GedcomDate.h>

namespace olvane::gedcom {
namespace {

struct Row {
    const char* written;
    const char* shown;
    const char* sorted;
};

void expectRows(const std::vector<Row>& rows) {
    for (const Row& row : rows) {
        const GedcomDate date = parseGedcomDate(row.written);
        EXPECT_EQ(displayYear(date), row.shown) << row.written;
        EXPECT_EQ(sortText(date), row.sorted) << row.written;
    }
}

TEST(Dates, plainDatesKeepWhatTheyHave) {
    expectRows({
        {"24 MAY 1819", "1819", "1819-05-24"},
        {"  4 MAY 1819", "1819", "1819-05-04"},
        {"MAY 1819", "1819", "1819-05"},
        {"1819", "1819", "1819"},
        {"14", "14", "0014"},
        {"12 AUG 840", "840", "0840-08-12"},
        {"@#DGREGORIAN@ 31 DEC 1997", "1997", "1997-12-31"},
        {"GREGORIAN 31 DEC 1997", "1997", "1997-12-31"},
    });
}

TEST(Dates, customsOutsideTheStandardAreRead) {
    expectRows({
        {"24 may 1819", "1819", "1819-05-24"},
        {"24 May. 1819", "1819", "1819-05-24"},
        {"24 September 1819", "1819", "1819-09-24"},
        {"3 Sept 1819", "1819", "1819-09-03"},
        {"1819-05-24", "1819", "1819-05-24"},
        {"1819-05", "1819", "1819-05"},
        {"about 1819", "~1819", "1819"},
        {"abt. 1819", "~1819", "1819"},
        {"c. 1819", "~1819", "1819"},
        {"1819?", "~1819", "1819"},
    });
}

TEST(Dates, marksShowAndShiftTheOrder) {
    expectRows({
        {"ABT 1819", "~1819", "1819"},
        {"CAL 24 MAY 1819", "~1819", "1819-05-24"},
        {"EST MAY 1819", "~1819", "1819-05"},
        {"BEF 1819", "<1819", "1818~"},
        {"BEF MAR 1819", "<1819", "1819-02~"},
        {"BEF JAN 1819", "<1819", "1818-12~"},
        {"BEF 1 MAR 1820", "<1820", "1820-02-29~"},
        {"TO 1819", "<1819", "1818~"},
        {"AFT 1819", ">1819", "1819~"},
        {"AFT 24 MAY 1819", ">1819", "1819-05-24~"},
        {"FROM 1819", ">1819", "1819~"},
        {"INT 31 DEC 1997 (12/31/97)", "1997", "1997-12-31"},
    });
}

TEST(Dates, rangesShowBothYearsAndSortByTheFirst) {
    expectRows({
        {"BET 1819 AND 1825", "1819-1825", "1819"},
        {"BET 31 DEC 1997 AND 1 JAN 1998", "1997-1998", "1997-12-31"},
        {"BET JAN 1699/00 AND FEB 1699/00", "1700", "1700-01"},
        {"FROM 1819 TO 1825", "1819-1825", "1819"},
        {"FROM JULIAN 100 BCE TO 44 BCE", "100 BC-44 BC", "-9899"},
        {"BET 1819 AND whenever", ">1819", "1819~"},
    });
}

TEST(Dates, yearsBeforeChristRunBackwards) {
    expectRows({
        {"44 BC", "44 BC", "-9955"},
        {"44 B.C.", "44 BC", "-9955"},
        {"OCT 1401 BCE", "1401 BC", "-8598-10"},
        {"BEF 1", "<1", "-9998~"},
        {"@#DJULIAN@ 15 MAR 44 BC", "44 BC", "-9955-03-13"},
    });
}

TEST(Dates, dualYearsAreTheLaterOne) {
    expectRows({
        {"11 FEB 1731/32", "1732", "1732-02-11"},
        {"8 JAN 1699/00", "1700", "1700-01-08"},
        {"1699/1700", "1700", "1700"},
        {"FEB 1752/3", "1753", "1753-02"},
        {"@#DJULIAN@ 11 FEB 1731/32", "1732", "1732-02-22"},
        {"1699/05", "~1699", "1699"},
    });
}

TEST(Dates, otherCalendarsAreShownInTheGregorianOne) {
    expectRows({
        {"@#DJULIAN@ 25 OCT 1917", "1917", "1917-11-07"},
        {"@#DJULIAN@25 OCT 1917", "1917", "1917-11-07"},
        {"JULIAN OCT 1401", "1401", "1401-10"},
        {"@#DFRENCH R@ 11 FRIM 13", "1804", "1804-12-02"},
        {"FRENCH_R 1 VEND 1", "1792", "1792-09-22"},
        {"@#DFRENCH R@ 18 BRUM 8", "1799", "1799-11-09"},
        {"@#DFRENCH R@ 6 COMP 3", "1795", "1795-09-22"},
        {"FRENCH_R 8", "1800", "1800"},
        {"@#DHEBREW@ 1 TSH 5784", "2023", "2023-09-16"},
        {"HEBREW 14 ADS 5784", "2024", "2024-03-24"},
        {"HEBREW 15 NSN 5784", "2024", "2024-04-23"},
        {"HEBREW 14 ADR 5783", "2023", "2023-03-07"},
        {"HEBREW 29 ELL 5784", "2024", "2024-10-02"},
        {"@#DHEBREW@ TSH 4800", "1039", "1039-09"},
        {"HEBREW 5784", "2024", "2024"},
        {"ABT HEBREW 5784", "~2024", "2024"},
    });
}

TEST(Dates, whatCannotBeReadIsShownAsWritten) {
    for (const char* written : {"(about seventeen hundred)",
                                "unknown",
                                "10 JAN",
                                "1670-78",
                                "12/31/97",
                                "31 FOO 1900",
                                "JAN 1900 maybe",
                                "@#DROMAN@ 1900",
                                "@#DUNKNOWN@ 87",
                                "_CALENDAR 8 _MONTH 19",
                                "JULIAN",
                                "0",
                                "12345",
                                "5 BC BC",
                                "BET AND",
                                "HEBREW 10 TSH 20 BC",
                                "@#DJULIAN",
                                "1 2 3 4",
                                "//",
                                "/",
                                "ABT",
                                "1900/",
                                "é"}) {
        const GedcomDate date = parseGedcomDate(written);
        EXPECT_FALSE(date.isRead()) << written;
        EXPECT_EQ(displayYear(date), written);
        EXPECT_EQ(sortText(date), "") << written;
    }
}

TEST(Dates, anImpossibleDayLeavesTheMonth) {
    expectRows({
        {"31 FEB 1900", "1900", "1900-02"},
        {"29 FEB 1900", "1900", "1900-02"},
        {"29 FEB 2000", "2000", "2000-02-29"},
        {"@#DJULIAN@ 29 FEB 1900", "1900", "1900-03-13"},
        {"0 MAY 1900", "1900", "1900-05"},
    });
}

TEST(Dates, sortTextsSortAsTheDatesDo) {
    const std::vector<const char*> inOrder = {
        "100 BC",      "44 BC",           "15 MAR 44 BC", "BEF 1",
        "14",          "BEF 1819",        "1819",         "MAY 1819",
        "23 MAY 1819", "BEF 25 MAY 1819", "25 MAY 1819",  "AFT 25 MAY 1819",
        "26 MAY 1819", "JUN 1819",        "AFT 1819",     "1820",
        "2000",
    };
    std::vector<std::string> texts;
    for (const char* written : inOrder) texts.push_back(sortText(parseGedcomDate(written)));
    std::vector<std::string> sorted = texts;
    std::stable_sort(sorted.begin(), sorted.end());
    EXPECT_EQ(texts, sorted);
}

}  // namespace
}  // namespace olvane::gedcom
