// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Dates in English, German and Spanish. Months of other calendars have the names that genealogists of the language use;
// those of the French Republic stay French where the language has no own ones.

#include <olvane/gedcom/DateLanguageInternal.h>

#include <algorithm>

namespace olvane::gedcom {

const std::array<DateLanguage, kDateLanguages> kAllDateLanguages{{
    {"en", "Jan|Feb|Mar|Apr|May|Jun|Jul|Aug|Sep|Oct|Nov|Dec",
     "Vendémiaire|Brumaire|Frimaire|Nivôse|Pluviôse|Ventôse|Germinal|Floréal|Prairial|Messidor|Thermidor|"
     "Fructidor|Sansculottides",
     "Tishrei|Cheshvan|Kislev|Tevet|Shevat|Adar|Adar II|Nisan|Iyar|Sivan|Tammuz|Av|Elul", " ", " BC",
     " Julian", "Year ", "|about |calculated |estimated |before |after |between |from |until |from ",
     "|about |calculated |estimated |before |after |between |from |until |from ", " and | to ", " and | to ",
     "born ", "died "},
    {"de", "Jan.|Feb.|März|Apr.|Mai|Juni|Juli|Aug.|Sept.|Okt.|Nov.|Dez.",
     "Vendémiaire|Brumaire|Frimaire|Nivôse|Pluviôse|Ventôse|Germinal|Floréal|Prairial|Messidor|Thermidor|"
     "Fructidor|Ergänzungstag",
     "Tischri|Cheschwan|Kislew|Tewet|Schwat|Adar|Adar II|Nisan|Ijjar|Siwan|Tammus|Aw|Elul", ". ", " v. Chr.",
     " julianisch", "Jahr ",
     "|um den |errechnet |geschätzt |vor dem |nach dem |zwischen dem |ab dem |bis zum |vom ",
     "|um |errechnet |geschätzt |vor |nach |zwischen |ab |bis |von ", " und dem | bis zum ", " und | bis ",
     "geboren ", "gestorben "},
    {"es", "ene|feb|mar|abr|may|jun|jul|ago|sept|oct|nov|dic",
     "vendimiario|brumario|frimario|nivoso|pluvioso|ventoso|germinal|floreal|pradial|mesidor|termidor|"
     "fructidor|complementario",
     "tishrei|jeshván|kislev|tevet|shevat|adar|adar II|nisán|iyar|siván|tamuz|av|elul", " ", " a. C.",
     " juliano", "año ",
     "|hacia el |calculado |estimado |antes del |después del |entre el |desde el |hasta el |del ",
     "|hacia |calculado |estimado |antes de |después de |entre |desde |hasta |de ", " y el | al ", " y | a ",
     "nac. ", "m. "},
}};

std::string_view wordIn(std::string_view list, std::size_t place) {
    for (; place > 0 && !list.empty(); --place)
        list.remove_prefix(std::min(list.find('|'), list.size() - 1) + 1);
    return list.substr(0, list.find('|'));
}

const DateLanguage& dateLanguageOf(std::string_view code) {
    const auto isMeant = [code](const DateLanguage& language) { return language.code == code.substr(0, 2); };
    const auto* const found = std::find_if(kAllDateLanguages.begin(), kAllDateLanguages.end(), isMeant);
    return found == kAllDateLanguages.end() ? kAllDateLanguages.front() : *found;
}

}  // namespace olvane::gedcom
