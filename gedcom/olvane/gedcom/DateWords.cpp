// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The words that dates are written with beside the standard's, in the languages that most GEDCOM files are written in.
// Names and abbreviations are those of the Unicode CLDR, in all cases that stand in dates.

#include <olvane/gedcom/DateWordsInternal.h>

#include <algorithm>
#include <iterator>

namespace olvane::gedcom {
namespace {

struct MonthName {
    std::string_view name;
    int month;
};

// Sorted by name.
constexpr MonthName kMonthNames[] = {
    {"ABR", 4},           {"ABRIL", 4},      {"AGO", 8},          {"AGOSTO", 8},     {"AOU", 8},
    {"AOUT", 8},          {"APR", 4},        {"APRIL", 4},        {"APRILE", 4},     {"AUG", 8},
    {"AUGUST", 8},        {"AUGUSTI", 8},    {"AUGUSTUS", 8},     {"AVR", 4},        {"AVRIL", 4},
    {"CZE", 6},           {"CZERWCA", 6},    {"CZERWIEC", 6},     {"DEC", 12},       {"DECEMBER", 12},
    {"DECEMBRE", 12},     {"DES", 12},       {"DESEMBER", 12},    {"DEZ", 12},       {"DEZEMBER", 12},
    {"DEZEMBRO", 12},     {"DIC", 12},       {"DICEMBRE", 12},    {"DICIEMBRE", 12}, {"ELO", 8},
    {"ELOK", 8},          {"ELOKUU", 8},     {"ELOKUUTA", 8},     {"ENE", 1},        {"ENERO", 1},
    {"FEB", 2},           {"FEBB", 2},       {"FEBBRAIO", 2},     {"FEBER", 2},      {"FEBR", 2},
    {"FEBRERO", 2},       {"FEBRUAR", 2},    {"FEBRUARI", 2},     {"FEBRUARY", 2},   {"FEV", 2},
    {"FEVEREIRO", 2},     {"FEVR", 2},       {"FEVRIER", 2},      {"GEN", 1},        {"GENN", 1},
    {"GENNAIO", 1},       {"GIU", 6},        {"GIUGNO", 6},       {"GRU", 12},       {"GRUDNIA", 12},
    {"GRUDZIEN", 12},     {"HEINA", 7},      {"HEINAK", 7},       {"HEINAKUU", 7},   {"HEINAKUUTA", 7},
    {"HELMI", 2},         {"HELMIK", 2},     {"HELMIKUU", 2},     {"HELMIKUUTA", 2}, {"HUHTI", 4},
    {"HUHTIK", 4},        {"HUHTIKUU", 4},   {"HUHTIKUUTA", 4},   {"JAENNER", 1},    {"JAN", 1},
    {"JANEIRO", 1},       {"JANNER", 1},     {"JANUAR", 1},       {"JANUARI", 1},    {"JANUARY", 1},
    {"JANV", 1},          {"JANVIER", 1},    {"JOULU", 12},       {"JOULUK", 12},    {"JOULUKUU", 12},
    {"JOULUKUUTA", 12},   {"JUIL", 7},       {"JUILL", 7},        {"JUILLET", 7},    {"JUIN", 6},
    {"JUL", 7},           {"JULHO", 7},      {"JULI", 7},         {"JULIO", 7},      {"JULY", 7},
    {"JUN", 6},           {"JUNE", 6},       {"JUNHO", 6},        {"JUNI", 6},       {"JUNIO", 6},
    {"KESA", 6},          {"KESAK", 6},      {"KESAKUU", 6},      {"KESAKUUTA", 6},  {"KWI", 4},
    {"KWIECIEN", 4},      {"KWIETNIA", 4},   {"LIP", 7},          {"LIPCA", 7},      {"LIPIEC", 7},
    {"LIS", 11},          {"LISTOPAD", 11},  {"LISTOPADA", 11},   {"LOKA", 10},      {"LOKAK", 10},
    {"LOKAKUU", 10},      {"LOKAKUUTA", 10}, {"LUG", 7},          {"LUGLIO", 7},     {"LUT", 2},
    {"LUTEGO", 2},        {"LUTY", 2},       {"MAALIS", 3},       {"MAALISK", 3},    {"MAALISKUU", 3},
    {"MAALISKUUTA", 3},   {"MAART", 3},      {"MAERZ", 3},        {"MAG", 5},        {"MAGG", 5},
    {"MAGGIO", 5},        {"MAI", 5},        {"MAIO", 5},         {"MAJ", 5},        {"MAJA", 5},
    {"MAR", 3},           {"MARCA", 3},      {"MARCH", 3},        {"MARCO", 3},      {"MARRAS", 11},
    {"MARRASK", 11},      {"MARRASKUU", 11}, {"MARRASKUUTA", 11}, {"MARS", 3},       {"MARTS", 3},
    {"MARZ", 3},          {"MARZEC", 3},     {"MARZO", 3},        {"MAY", 5},        {"MAYO", 5},
    {"MEI", 5},           {"MRT", 3},        {"MRZ", 3},          {"NOV", 11},       {"NOVEMBER", 11},
    {"NOVEMBRE", 11},     {"NOVEMBRO", 11},  {"NOVIEMBRE", 11},   {"OCT", 10},       {"OCTOBER", 10},
    {"OCTOBRE", 10},      {"OCTUBRE", 10},   {"OKT", 10},         {"OKTOBER", 10},   {"OTT", 10},
    {"OTTOBRE", 10},      {"OUT", 10},       {"OUTUBRO", 10},     {"PAZ", 10},       {"PAZDZIERNIK", 10},
    {"PAZDZIERNIKA", 10}, {"SEP", 9},        {"SEPT", 9},         {"SEPTEMBER", 9},  {"SEPTEMBRE", 9},
    {"SEPTIEMBRE", 9},    {"SET", 9},        {"SETEMBRO", 9},     {"SETIEMBRE", 9},  {"SETT", 9},
    {"SETTEMBRE", 9},     {"SIE", 8},        {"SIERPIEN", 8},     {"SIERPNIA", 8},   {"STY", 1},
    {"STYCZEN", 1},       {"STYCZNIA", 1},   {"SYYS", 9},         {"SYYSK", 9},      {"SYYSKUU", 9},
    {"SYYSKUUTA", 9},     {"TAMMI", 1},      {"TAMMIK", 1},       {"TAMMIKUU", 1},   {"TAMMIKUUTA", 1},
    {"TOUKO", 5},         {"TOUKOK", 5},     {"TOUKOKUU", 5},     {"TOUKOKUUTA", 5}, {"WRZ", 9},
    {"WRZESIEN", 9},      {"WRZESNIA", 9},   {"XBRE", 12},
};

// Names and abbreviations, between spaces. The Finnish "to" is none of them: it is the English word before a date.
constexpr std::string_view kWeekdays =
    " MON MONDAY TUE TUES TUESDAY WED WEDNESDAY THU THUR THURS THURSDAY FRI FRIDAY SAT SATURDAY SUN SUNDAY"
    " LUN LUNDI MAR MARDI MER MERCREDI JEU JEUDI VEN VENDREDI SAM SAMEDI DIM DIMANCHE"
    " MO MONTAG DI DIENSTAG MI MITTWOCH DO DONNERSTAG FR FREITAG SA SAMSTAG SONNABEND SO SONNTAG"
    " MA MAANDAG DINSDAG WO WOENSDAG DONDERDAG VR VRIJDAG ZA ZATERDAG ZO ZONDAG"
    " LUNES MARTES MIE MIERCOLES JUE JUEVES VIE VIERNES SAB SABADO DOM DOMINGO"
    " LUNEDI MARTEDI MERCOLEDI GIO GIOVEDI VENERDI SABATO DOMENICA"
    " SEG SEGUNDA-FEIRA TER TERCA-FEIRA QUA QUARTA-FEIRA QUI QUINTA-FEIRA SEX SEXTA-FEIRA"
    " PON PONIEDZIALEK WT WTOREK SR SRODA CZW CZWARTEK PT PIATEK SOB SOBOTA NIEDZ NIEDZIELA"
    " MAN MANDAG TIS TISDAG ONS ONSDAG TORS TORSDAG FRE FREDAG LOR LORDAG SON SONDAG"
    " TIR TIRS TIRSDAG TOR TY TYS TYSDAG ON LAU LAURDAG"
    " MAANANTAI MAANANTAINA TI TIISTAI TIISTAINA KE KESKIVIIKKO KESKIVIIKKONA TORSTAI TORSTAINA"
    " PE PERJANTAI PERJANTAINA LA LAUANTAI LAUANTAINA SU SUNNUNTAI SUNNUNTAINA ";

struct EraName {
    std::string_view letters;
    Era era;
};

constexpr EraName kEras[] = {
    {"BC", Era::beforeChrist},        {"BCE", Era::beforeChrist},  {"VCHR", Era::beforeChrist},
    {"VCHRISTUS", Era::beforeChrist}, {"AVJC", Era::beforeChrist}, {"AVANTJC", Era::beforeChrist},
    {"AC", Era::beforeChrist},        {"FKR", Era::beforeChrist},  {"PNE", Era::beforeChrist},
    {"EKR", Era::beforeChrist},       {"EAA", Era::beforeChrist},  {"AD", Era::afterChrist},
    {"CE", Era::afterChrist},         {"NCHR", Era::afterChrist},  {"APJC", Era::afterChrist},
    {"DC", Era::afterChrist},         {"NE", Era::afterChrist},    {"JKR", Era::afterChrist},
};

// The plain capital of a letter of Latin-1 or Latin Extended-A in UTF-8; 0 for one that is none of these languages'.
char plainCapital(unsigned char lead, unsigned char trail) {
    constexpr std::string_view kAfterC3 = "AAAAAA-CEEEEIIII-NOOOOO-OUUUUY--";
    if (lead == 0xC3) {
        const char letter = kAfterC3[static_cast<std::size_t>(trail & 0x1F)];
        return letter == '-' ? '\0' : letter;
    }
    if (lead == 0xC4) {
        if (trail == 0x84 || trail == 0x85) return 'A';
        if (trail == 0x86 || trail == 0x87) return 'C';
        return trail == 0x98 || trail == 0x99 ? 'E' : '\0';
    }
    if (lead != 0xC5) return '\0';
    if (trail == 0x81 || trail == 0x82) return 'L';
    if (trail == 0x83 || trail == 0x84) return 'N';
    if (trail == 0x9A || trail == 0x9B) return 'S';
    return trail >= 0xB9 && trail <= 0xBC ? 'Z' : '\0';
}

// One of U+0300 to U+036F in UTF-8: an accent behind its letter, as some systems write all of them.
bool isAccentApart(unsigned char lead, unsigned char trail) {
    return lead == 0xCC || (lead == 0xCD && trail <= 0xAF);
}

bool endsWord(char c) {
    return c == '.' || c == ',' || c == '-' || c == '/';
}

}  // namespace

DateWord::DateWord(std::string_view raw) {
    while (!raw.empty() && endsWord(raw.back())) raw.remove_suffix(1);
    for (std::size_t at = 0; at < raw.size(); ++at) {
        char c = raw[at];
        if (c >= 'a' && c <= 'z') c = static_cast<char>(c - 'a' + 'A');
        if (static_cast<unsigned char>(c) >= 0x80) {
            const auto trail = static_cast<unsigned char>(at + 1 < raw.size() ? raw[at + 1] : '\0');
            if (isAccentApart(static_cast<unsigned char>(c), trail)) {
                ++at;
                continue;
            }
            c = plainCapital(static_cast<unsigned char>(c), trail);
            ++at;
        }
        if (c == '\0' || length_ == kLongest) {
            length_ = 0;
            return;
        }
        letters_[length_++] = c;
    }
}

bool DateWord::isOneOf(std::initializer_list<std::string_view> choices) const {
    return std::find(choices.begin(), choices.end(), text()) != choices.end();
}

int monthNamed(const DateWord& word) {
    const auto* const found =
        std::lower_bound(std::begin(kMonthNames), std::end(kMonthNames), word.text(),
                         [](const MonthName& known, std::string_view name) { return known.name < name; });
    return found != std::end(kMonthNames) && found->name == word.text() ? found->month : 0;
}

bool isWeekday(const DateWord& word) {
    const std::string_view name = word.text();
    if (name.empty()) return false;
    std::size_t at = kWeekdays.find(name);
    while (at != std::string_view::npos && (kWeekdays[at - 1] != ' ' || kWeekdays[at + name.size()] != ' ')) {
        at = kWeekdays.find(name, at + 1);
    }
    return at != std::string_view::npos;
}

Era eraNamed(std::string_view letters) {
    const auto* const found =
        std::find_if(std::begin(kEras), std::end(kEras),
                     [&letters](const EraName& known) { return known.letters == letters; });
    return found == std::end(kEras) ? Era::none : found->era;
}

}  // namespace olvane::gedcom
