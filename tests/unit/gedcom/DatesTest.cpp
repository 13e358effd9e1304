// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Dates of every form: which year is shown, and that the sortable text sorts.

#include <algorithm>
#include <sstream>
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

TEST(Dates, yearsBeforeChristInAllTheirSpellings) {
    for (const char* written :
         {"972B.C.", "972 BC", "972BC", "972 B.C.", "972 B. C.", "972 BCE", "972 b.c.e.", "972 v. Chr.",
          "972 v.Chr.", "972 av. J.-C.", "972 a.C.", "972 f.Kr.", "972 p.n.e."}) {
        EXPECT_EQ(displayYear(parseGedcomDate(written)), "972 BC") << written;
    }
    for (const char* written : {"972 A.D.", "972 AD", "AD 972", "A.D. 972", "972 n. Chr.", "972 CE"}) {
        EXPECT_EQ(displayYear(parseGedcomDate(written)), "972") << written;
    }
    expectRows({{"BET 100 B.C. AND 44 B.C.", "100 BC-44 BC", "-9899"},
                {"15 MAR 44B.C. (Ides)", "44 BC", "-9955-03-15"}});
}

TEST(Dates, numbersWithPointsHaveTheDayFirst) {
    expectRows({
        {"06.05.1900", "1900", "1900-05-06"},
        {"6.5.1900", "1900", "1900-05-06"},
        {"6. 5. 1900", "1900", "1900-05-06"},
        {"24.12.1915.", "1915", "1915-12-24"},
        {"05.1900", "1900", "1900-05"},
        {"1915.12.24", "1915", "1915-12-24"},
        {"30.02.1900", "1900", "1900-02"},
        {"ABT 06.05.1900", "~1900", "1900-05-06"},
        {"BET 06.05.1900 AND 07.05.1901", "1900-1901", "1900-05-06"},
        {"00.05.1900", "1900", "1900-05"},
        {"00.00.1900", "1900", "1900"},
    });
}

TEST(Dates, numbersWithStrokesAreReadWhereTheirOrderIsCertain) {
    expectRows({
        {"24/01/1915", "1915", "1915-01-24"},
        {"24-01-1915", "1915", "1915-01-24"},
        {"05/05/1900", "1900", "1900-05-05"},
        {"05/06/1900", "1900", "1900"},
        {"01/24/1915", "1915", "1915"},
        {"1915/01/24", "1915", "1915-01-24"},
        {"01/1915", "1915", "1915-01"},
        {"24/01/1915 B.C.", "1915 BC", "-8084-01-24"},
        {"24/13/1915", "1915", "1915"},
        {"13/13/1915", "1915", "1915"},
        {"00/01/1915", "1915", "1915"},
    });
    EXPECT_FALSE(parseGedcomDate("24/01/1915").isYearAlone);
    EXPECT_FALSE(parseGedcomDate("05/05/1900").isYearAlone);
    EXPECT_TRUE(parseGedcomDate("05/06/1900").isYearAlone);
    EXPECT_TRUE(parseGedcomDate("01/24/1915").isYearAlone);
    EXPECT_TRUE(parseGedcomDate("24/13/1915").isYearAlone);
    for (const char* written : {"32/01/1915", "24/32/1915", "1/2/3/1900", "24/01.1915", "24//1915", "13/1915",
                                "24/01/0000", "24/01/15", "1.2.3.", "1915/13/01"}) {
        EXPECT_FALSE(parseGedcomDate(written).isRead()) << written;
    }
}

TEST(Dates, monthsAreKnownInTwelveLanguages) {
    struct Months {
        const char* language;
        std::vector<const char*> names;
    };
    const Months rows[] = {
        {"en",
         {"January", "February", "March", "April", "May", "June", "July", "August", "September", "October",
          "November", "December"}},
        {"fr",
         {"janvier", "février", "mars", "avril", "mai", "juin", "juillet", "août", "septembre", "octobre",
          "novembre", "décembre"}},
        {"fr abbreviated",
         {"janv.", "févr.", "mars", "avr.", "mai", "juin", "juil.", "août", "sept.", "oct.", "nov.", "déc."}},
        {"de",
         {"Januar", "Februar", "März", "April", "Mai", "Juni", "Juli", "August", "September", "Oktober",
          "November", "Dezember"}},
        {"de abbreviated",
         {"Jan.", "Feb.", "Mrz.", "Apr.", "Mai", "Jun.", "Jul.", "Aug.", "Sep.", "Okt.", "Nov.", "Dez."}},
        {"nl",
         {"januari", "februari", "maart", "april", "mei", "juni", "juli", "augustus", "september", "oktober",
          "november", "december"}},
        {"nl abbreviated",
         {"jan.", "feb.", "mrt.", "apr.", "mei", "jun.", "jul.", "aug.", "sep.", "okt.", "nov.", "dec."}},
        {"es",
         {"enero", "febrero", "marzo", "abril", "mayo", "junio", "julio", "agosto", "septiembre", "octubre",
          "noviembre", "diciembre"}},
        {"es abbreviated",
         {"ene.", "feb.", "mar.", "abr.", "may.", "jun.", "jul.", "ago.", "sept.", "oct.", "nov.", "dic."}},
        {"it",
         {"gennaio", "febbraio", "marzo", "aprile", "maggio", "giugno", "luglio", "agosto", "settembre",
          "ottobre", "novembre", "dicembre"}},
        {"it abbreviated",
         {"gen", "feb", "mar", "apr", "mag", "giu", "lug", "ago", "set", "ott", "nov", "dic"}},
        {"pt",
         {"janeiro", "fevereiro", "março", "abril", "maio", "junho", "julho", "agosto", "setembro", "outubro",
          "novembro", "dezembro"}},
        {"pt abbreviated",
         {"jan.", "fev.", "mar.", "abr.", "mai.", "jun.", "jul.", "ago.", "set.", "out.", "nov.", "dez."}},
        {"pl",
         {"stycznia", "lutego", "marca", "kwietnia", "maja", "czerwca", "lipca", "sierpnia", "września",
          "października", "listopada", "grudnia"}},
        {"pl nominative",
         {"styczeń", "luty", "marzec", "kwiecień", "maj", "czerwiec", "lipiec", "sierpień", "wrzesień",
          "październik", "listopad", "grudzień"}},
        {"pl abbreviated",
         {"sty", "lut", "mar", "kwi", "maj", "cze", "lip", "sie", "wrz", "paź", "lis", "gru"}},
        {"sv",
         {"januari", "februari", "mars", "april", "maj", "juni", "juli", "augusti", "september", "oktober",
          "november", "december"}},
        {"no",
         {"januar", "februar", "mars", "april", "mai", "juni", "juli", "august", "september", "oktober",
          "november", "desember"}},
        {"da",
         {"januar", "februar", "marts", "april", "maj", "juni", "juli", "august", "september", "oktober",
          "november", "december"}},
        {"fi",
         {"tammikuuta", "helmikuuta", "maaliskuuta", "huhtikuuta", "toukokuuta", "kesäkuuta", "heinäkuuta",
          "elokuuta", "syyskuuta", "lokakuuta", "marraskuuta", "joulukuuta"}},
        {"fi nominative",
         {"tammikuu", "helmikuu", "maaliskuu", "huhtikuu", "toukokuu", "kesäkuu", "heinäkuu", "elokuu",
          "syyskuu", "lokakuu", "marraskuu", "joulukuu"}},
        {"fi abbreviated",
         {"tammik.", "helmik.", "maalisk.", "huhtik.", "toukok.", "kesäk.", "heinäk.", "elok.", "syysk.",
          "lokak.", "marrask.", "jouluk."}},
        {"accents apart",
         {"stycze\u0144", "fe\u0301vrier", "ma\u0308rz", "APRIL", "mai", "kesa\u0308kuu", "juil.",
          "aou\u0302t", "wrzes\u0301nia", "paz\u0301dziernik", "nov.", "DE\u0301CEMBRE"}},
        {"old",
         {"Jänner", "Feber", "Maerz", "APR", "MAI", "JUN", "JUL", "AUG", "7bre", "8bre", "9bre", "Xbre"}},
    };
    for (const Months& row : rows) {
        ASSERT_EQ(row.names.size(), 12U);
        for (std::size_t month = 0; month < row.names.size(); ++month) {
            const GedcomDate date =
                parseGedcomDate(std::string("24 ").append(row.names[month]).append(" 1819"));
            EXPECT_EQ(date.month, month + 1) << row.language << " " << row.names[month];
            EXPECT_EQ(date.day, 24) << row.language << " " << row.names[month];
        }
    }
}

TEST(Dates, wordsAroundADateAreNoTrouble) {
    for (const char* written : {"24. Mai 1819",
                                "24.Mai 1819",
                                "24.Mai.1819",
                                "24-MAY-1819",
                                "24MAY1819",
                                "24-mai.-1819",
                                "24/May/1819",
                                "May 24, 1819",
                                "May 24 1819",
                                "May 24th, 1819",
                                "24th of May 1819",
                                "24 de mayo de 1819",
                                "Mon 24 MAY 1819",
                                "Monday, 24 May 1819",
                                "Montag, 24. Mai 1819",
                                "Montag, den 24. Mai 1819",
                                "lundi 24 mai 1819",
                                "poniedziałek 24 maja 1819",
                                "måndag 24 maj 1819",
                                "segunda-feira 24 maio 1819",
                                "24º mayo 1819"}) {
        EXPECT_EQ(sortText(parseGedcomDate(written)), "1819-05-24") << written;
    }
    EXPECT_EQ(sortText(parseGedcomDate("1er mai 1819")), "1819-05-01");
    EXPECT_EQ(sortText(parseGedcomDate("MAY 14")), "0014-05");
    EXPECT_FALSE(parseGedcomDate("Monday").isRead());
    EXPECT_FALSE(parseGedcomDate("Monday May").isRead());
}

TEST(Dates, aWeekdayMayBeAbbreviatedInEveryLanguage) {
    // The names of the Unicode CLDR, of one week from Monday; a Finnish Thursday is an English word.
    for (const char* week :
         {"Mon Tue Wed Thu Fri Sat Sun", "lun. mar. mer. jeu. ven. sam. dim.", "Mo. Di. Mi. Do. Fr. Sa. So.",
          "ma di wo do vr za zo", "lun mar mié jue vie sáb dom", "lun mar mer gio ven sab dom",
          "seg. ter. qua. qui. sex. sáb. dom.", "pon. wt. śr. czw. pt. sob. niedz.",
          "mån tis ons tors fre lör sön", "man. tir. ons. tor. fre. lør. søn.",
          "man. tirs. ons. tors. fre. lør. søn.", "ma ti ke pe la su",
          "maanantaina tiistaina keskiviikkona torstaina perjantaina lauantaina sunnuntaina"}) {
        std::istringstream days(week);
        for (std::string day; days >> day;) {
            for (const char* rest : {" 24 MAY 1819", ", 24. Mai 1819", " 24.05.1819"}) {
                EXPECT_EQ(sortText(parseGedcomDate(day + rest)), "1819-05-24") << day << rest;
            }
        }
    }
    EXPECT_EQ(sortText(parseGedcomDate("lør. den 24. maj 1819")), "1819-05-24");
    EXPECT_EQ(sortText(parseGedcomDate("mar, 24 de mayo de 1819")), "1819-05-24");
    EXPECT_EQ(sortText(parseGedcomDate("mar. 24, 1819")), "1819-03-24");
    EXPECT_EQ(sortText(parseGedcomDate("MAR 1819")), "1819-03");
}

TEST(Dates, signsAroundAYearSayHowFirmItIs) {
    expectRows({
        {"<1590>", "~1590", "1590"},
        {"< 1590 >", "~1590", "1590"},
        {"<12 MAY 1590>", "~1590", "1590-05-12"},
        {"[1590]", "~1590", "1590"},
        {"~1590", "~1590", "1590"},
        {"<1590", "<1590", "1589~"},
        {">1590", ">1590", "1590~"},
        {"c1590", "~1590", "1590"},
        {"ca.1590", "~1590", "1590"},
        {"abt1590", "~1590", "1590"},
        {"um 1590", "~1590", "1590"},
        {"vor 1590", "<1590", "1589~"},
        {"1850-1860", "1850-1860", "1850"},
    });
    for (const char* written : {"<>", "<", "[]", "<<1590>>", "1860-1850", "1850-1860-1870", "<1590)"}) {
        EXPECT_FALSE(parseGedcomDate(written).isRead()) << written;
    }
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
