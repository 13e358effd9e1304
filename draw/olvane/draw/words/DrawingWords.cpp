// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A row for each phrase, in the order of Phrase, and for each view, with a column for each language: English, German,
// Spanish. {} stands for an argument.

#include <olvane/draw/DrawingWordsInternal.h>

#include <algorithm>
#include <array>

namespace olvane::draw {

namespace {

using Words = std::array<std::string_view, kin::kLanguages.size()>;

constexpr std::array<Words, kPhrases> kWords{{
    {"{} of {}", "{}: {}", "{}: {}"},
    {"Nobody to show", "Niemand zu zeigen", "Nadie que mostrar"},
    {"Legend", "Legende", "Leyenda"},
    {" (focus of this picture)", " (Mittelpunkt dieses Bildes)", " (centro de esta imagen)"},
    {"Common ancestor", "Gemeinsamer Vorfahr", "Antepasado común"},
    {"Stands in {} boxes, all marked {}", "Steht in {} Kästen, alle mit der Marke {}",
     "Aparece en {} recuadros, todos con la marca {}"},
    {"Not shown: {}", "Nicht gezeigt: {}", "Sin mostrar: {}"},
    {"{} parent", "{} Elternteil", "{} padre o madre"},
    {"{} parents", "{} Eltern", "{} padres"},
    {"{} spouse", "{} Ehepartner", "{} cónyuge"},
    {"{} spouses", "{} Ehepartner", "{} cónyuges"},
    {"{} child", "{} Kind", "{} hijo"},
    {"{} children", "{} Kinder", "{} hijos"},
    {"Has relatives who stand elsewhere in this picture",
     "Hat Verwandte, die an anderer Stelle dieses Bildes stehen",
     "Tiene parientes que están en otro lugar de esta imagen"},
    {"Has relatives who are not shown", "Hat Verwandte, die nicht gezeigt sind",
     "Tiene parientes que no se muestran"},
    {"Has further parents, who are not shown", "Hat weitere Eltern, die nicht gezeigt sind",
     "Tiene otros padres, que no se muestran"},
    {"Has further parents in {} families, who are not shown",
     "Hat weitere Eltern in {} Familien, die nicht gezeigt sind",
     "Tiene otros padres en {} familias, que no se muestran"},
    {"add father", "Vater ergänzen", "añadir padre"},
    {"add mother", "Mutter ergänzen", "añadir madre"},
    {"{} of {}", "{} (zu {})", "{} de {}"},
    {"Child of those marked {}", "Kind der mit {} Bezeichneten", "Hijo de quienes llevan la marca {}"},
    {"Parent of who is marked {}", "Elternteil von wem {} trägt", "Padre o madre de quien lleva la marca {}"},
    {"Partner of who is marked {} as well", "Partner von wem auch {} trägt",
     "Pareja de quien también lleva la marca {}"},
    {"Folded ancestors: {}", "Eingeklappte Vorfahren: {}", "Antepasados plegados: {}"},
    {"Folded descendants: {}", "Eingeklappte Nachkommen: {}", "Descendientes plegados: {}"},
    {"Folded partners and siblings: {}", "Eingeklappte Partner und Geschwister: {}",
     "Parejas y hermanos plegados: {}"},
    {"relatives not drawn here", "Verwandte, hier nicht gezeichnet", "parientes no dibujados aquí"},
    {"person with several boxes", "Person mit mehreren Kästen", "persona con varios recuadros"},
    {"goes on at the same number", "weiter bei derselben Zahl", "sigue en el mismo número"},
    {"further parents", "weitere Eltern", "otros padres"},
    {"folded branch", "eingeklappter Zweig", "rama plegada"},
    {"divorced", "geschieden", "divorciados"},
    {"not married", "nicht verheiratet", "no casados"},
    {"adopted child", "adoptiert", "hijo adoptado"},
    {"foster child", "Pflegekind", "hijo de acogida"},
    {"step child", "Stiefkind", "hijastro"},
    {"sealed child", "gesiegelt", "hijo sellado"},
    {"Map of the sheets", "Plan der Blätter", "Mapa de las hojas"},
    {"sheet {} of {}: row {} of {}, column {} of {}", "Blatt {} von {}: Zeile {} von {}, Spalte {} von {}",
     "hoja {} de {}: fila {} de {}, columna {} de {}"},
    {"to sheet {}", "zu Blatt {}", "a la hoja {}"},
}};

struct ViewWords {
    std::string_view view;
    Words words;
};

constexpr std::array<ViewWords, 10> kViews{{
    {"family", {"Family", "Familie", "Familia"}},
    {"pedigree", {"Pedigree", "Ahnen", "Genealogía"}},
    {"near", {"Near", "Nahe Familie", "Familia cercana"}},
    {"ancestors", {"Ancestors", "Vorfahren", "Antepasados"}},
    {"descendants", {"Descendants", "Nachkommen", "Descendientes"}},
    {"hourglass", {"Hourglass", "Sanduhr", "Reloj de arena"}},
    {"relatives", {"Relatives", "Verwandte", "Parientes"}},
    {"fan", {"Fan", "Fächer", "Abanico"}},
    {"kinship", {"Kinship", "Verwandtschaft", "Parentesco"}},
    {"everybody", {"Everybody", "Alle", "Todos"}},
}};

std::string_view inLanguage(const Words& words, kin::Language language) {
    return words[static_cast<std::size_t>(language)];
}

}  // namespace

std::string_view wordsOf(Phrase phrase, kin::Language language) {
    return inLanguage(kWords[static_cast<std::size_t>(phrase)], language);
}

std::string phraseWith(Phrase phrase, kin::Language language,
                       std::initializer_list<std::string_view> arguments) {
    const std::string_view words = wordsOf(phrase, language);
    std::string text;
    std::size_t done = 0;
    for (const std::string_view argument : arguments) {
        const std::size_t place = words.find("{}", done);
        if (place == std::string_view::npos) break;
        text.append(words, done, place - done).append(argument);
        done = place + 2;
    }
    return text.append(words, done);
}

std::string viewTitle(std::string_view view, kin::Language language) {
    const auto* const found =
        std::find_if(kViews.begin(), kViews.end(), [view](const ViewWords& one) { return one.view == view; });
    return std::string(found == kViews.end() ? view : inLanguage(found->words, language));
}

}  // namespace olvane::draw
