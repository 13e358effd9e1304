// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What the reader reports, in words: for each sentence and each kind one row, in the order of DiagnosticSentence and of
// DiagnosticKind, with a column for each language: English, German, Spanish. {} stands for an argument, {kind} for one
// that is the name of a kind.

#include <olvane/gedcom/GedcomDiagnostic.h>

#include <algorithm>
#include <array>

namespace olvane::gedcom {

namespace {

constexpr std::size_t kLanguages = 3;
constexpr std::array<std::string_view, kLanguages> kCodes{"en", "de", "es"};

using Words = std::array<std::string_view, kLanguages>;

struct Sentence {
    std::string_view name;
    Words words;
};

constexpr std::array<Sentence, kDiagnosticSentences> kSentences{{
    {"archiveWithoutGedcomFile",
     {"the archive has no gedcom.ged", "das Archiv hat kein gedcom.ged",
      "el archivo comprimido no contiene gedcom.ged"}},
    {"noLevelAndTag",
     {"not a line with level and tag", "keine Zeile mit Ebene und Schlüsselwort",
      "no es una línea con nivel y etiqueta"}},
    {"badlyWrittenLevel", {"level badly written", "eine schlecht geschriebene Ebene", "nivel mal escrito"}},
    {"jumpingLevel",
     {"level jumps from {} to {}", "die Ebene springt von {} auf {}", "el nivel salta de {} a {}"}},
    {"identifierWithoutEnd",
     {"identifier without its second @", "eine Kennung ohne das zweite @", "identificador sin la segunda @"}},
    {"identifierInUse",
     {"identifier already used in line {}", "die Kennung ist schon in Zeile {} vergeben",
      "identificador ya usado en la línea {}"}},
    {"onePersonTwice",
     {"one person as both partners of a family", "dieselbe Person als beide Partner einer Familie",
      "una misma persona como los dos cónyuges de una familia"}},
    {"onePersonMore",
     {"one more person in a family that names others as its partners",
      "noch eine Person in einer Familie, die andere als Partner nennt",
      "una persona más en una familia que nombra a otras como cónyuges"}},
    {"thirdPartner",
     {"a family with more than two partners", "eine Familie mit mehr als zwei Partnern",
      "una familia con más de dos cónyuges"}},
    {"noSuchRecord",
     {"a pointer to no record", "ein Verweis, zu dem es keinen Datensatz gibt",
      "una referencia a ningún registro"}},
    {"noPerson",
     {"a pointer that leads to no person", "ein Verweis, der zu keiner Person führt",
      "una referencia que no lleva a ninguna persona"}},
    {"noFamily",
     {"a pointer that leads to no family", "ein Verweis, der zu keiner Familie führt",
      "una referencia que no lleva a ninguna familia"}},
    {"pointerWithoutEnd",
     {"a pointer that does not end with @", "ein Verweis, der nicht mit @ endet",
      "una referencia que no termina en @"}},
    {"linkWithoutPointer",
     {"a link without a pointer", "eine Verknüpfung ohne Verweis", "un vínculo sin referencia"}},
    {"noHeader",
     {"the file does not begin with HEAD", "die Datei beginnt nicht mit HEAD",
      "el fichero no empieza por HEAD"}},
    {"noTrailer",
     {"the file ends without TRLR and may have been cut off",
      "die Datei endet ohne TRLR und ist vielleicht abgeschnitten",
      "el fichero termina sin TRLR y puede estar cortado"}},
    {"recordBehindTrailer",
     {"a record behind TRLR", "ein Datensatz hinter TRLR", "un registro después de TRLR"}},
    {"dateNotRead",
     {"a date that cannot be read", "ein Datum, das sich nicht lesen lässt",
      "una fecha que no se puede leer"}},
    {"dayOrMonth",
     {"a date whose day and month may be either way round",
      "ein Datum, bei dem Tag und Monat vertauscht sein können",
      "una fecha cuyo día y mes pueden estar intercambiados"}},
    {"halfCharacter",
     {"half a character at the end of the file", "ein halbes Zeichen am Ende der Datei",
      "medio carácter al final del fichero"}},
    {"encodingNotKnown",
     {"the header names an encoding that is not known", "der Kopf nennt eine unbekannte Zeichenkodierung",
      "la cabecera nombra una codificación desconocida"}},
    {"otherThanNamed",
     {"the text is not in the encoding that the header names",
      "der Text hat nicht die Zeichenkodierung, die der Kopf nennt",
      "el texto no está en la codificación que nombra la cabecera"}},
    {"unlikeNamed",
     {"the text does not look like the encoding that the header names",
      "der Text sieht nicht nach der Zeichenkodierung aus, die der Kopf nennt",
      "el texto no parece estar en la codificación que nombra la cabecera"}},
    {"systemNamed",
     {"the header names a system, not an encoding", "der Kopf nennt ein System, keine Zeichenkodierung",
      "la cabecera nombra un sistema, no una codificación"}},
    {"noneNamed",
     {"the file names no encoding", "die Datei nennt keine Zeichenkodierung",
      "el fichero no nombra ninguna codificación"}},
    {"otherThanChosen",
     {"the text is not in the encoding that was chosen", "der Text hat nicht die gewählte Zeichenkodierung",
      "el texto no está en la codificación elegida"}},
    {"faultsInUtf8",
     {"the text is UTF-8 but for {} places", "der Text ist UTF-8, bis auf Fehler an {} Stellen",
      "el texto es UTF-8 salvo en {} sitios"}},
    {"faultsInText",
     {"the text is not {} in {} places", "der Text ist nicht {}, und zwar an {} Stellen",
      "el texto no es {} en {} sitios"}},
    {"faultsInValue",
     {"{} bytes that are no character in {}", "{} Bytes, die in {} kein Zeichen sind",
      "{} bytes que no son ningún carácter en {}"}},
    {"controlCharacters", {"{} control characters", "{} Steuerzeichen", "{} caracteres de control"}},
    {"marriageOfOthers",
     {"a FAMS of a family that names two others as its partners",
      "ein FAMS zu einer Familie, die zwei andere als Partner nennt",
      "un FAMS de una familia que nombra a otras dos personas como cónyuges"}},
    {"marriageNotReturned",
     {"a FAMS of a family that does not name the person",
      "ein FAMS zu einer Familie, die die Person nicht nennt",
      "un FAMS de una familia que no nombra a la persona"}},
    {"partnerNotReturned",
     {"a partner whose own record has no FAMS for the family",
      "ein Partner, dessen eigener Datensatz kein FAMS zu der Familie hat",
      "un cónyuge cuyo registro no tiene FAMS de la familia"}},
    {"childOfOthers",
     {"a child whose own record names another family as that of the parents",
      "ein Kind, dessen eigener Datensatz eine andere Familie als die der Eltern nennt",
      "un hijo cuyo registro nombra otra familia como la de sus padres"}},
    {"childNotReturned",
     {"a child whose own record has no FAMC for the family",
      "ein Kind, dessen eigener Datensatz kein FAMC zu der Familie hat",
      "un hijo cuyo registro no tiene FAMC de la familia"}},
    {"parentsNotReturned",
     {"a FAMC of a family that does not name the child",
      "ein FAMC zu einer Familie, die das Kind nicht nennt", "un FAMC de una familia que no nombra al hijo"}},
    {"manAsWife",
     {"a man as the WIFE of a family", "ein Mann als WIFE einer Familie",
      "un hombre como WIFE de una familia"}},
    {"womanAsHusband",
     {"a woman as the HUSB of a family", "eine Frau als HUSB einer Familie",
      "una mujer como HUSB de una familia"}},
    {"oneOfKind", {"{kind}", "{kind}", "{kind}"}},
    {"firstOfKind", {"{kind}, the first of {}", "{kind}, die erste von {}", "{kind}, el primero de {}"}},
    {"moreOfKind", {"{} more of: {kind}", "{} weitere dieser Art: {kind}", "{} más de este tipo: {kind}"}},
    {"skipped", {"skipped", "übergangen", "se ha saltado"}},
    {"leftOut", {"left out", "weggelassen", "se ha omitido"}},
    {"otherMemberRead",
     {"another member is read", "ein anderer Inhalt wird gelesen", "se lee otro contenido"}},
    {"asWritten", {"shown as written", "wird gezeigt, wie es dasteht", "se muestra tal como está escrita"}},
    {"notListed", {"not listed singly", "nicht einzeln aufgeführt", "no se enumeran uno a uno"}},
    {"noOwnSpouse",
     {"not their own spouse", "niemand ist mit sich selbst verheiratet", "nadie es su propio cónyuge"}},
    {"withoutChildren",
     {"its children are left out for this person", "für diese Person sind die Kinder weggelassen",
      "se omiten sus hijos para esta persona"}},
    {"childrenOfAll",
     {"the children are kept for all of them", "die Kinder bleiben bei allen",
      "se conservan los hijos para todos"}},
    {"bothKept",
     {"both are kept, the child's own first", "beide bleiben, die des Kindes zuerst",
      "se conservan las dos, primero la del hijo"}},
    {"yearAlone", {"its year alone is read", "nur das Jahr wird gelesen", "solo se lee el año"}},
    {"asHusband", {"read as its husband", "als Ehemann gelesen", "se lee como el esposo"}},
    {"asWife", {"read as its wife", "als Ehefrau gelesen", "se lee como la esposa"}},
    {"asLastChild", {"read as its last child", "als letztes Kind gelesen", "se lee como el último hijo"}},
    {"asIfItHad", {"read as if it had", "so gelesen, als hätte er es", "se lee como si lo tuviera"}},
    {"asIfItDid", {"read as if it did", "so gelesen, als ob er es täte", "se lee como si terminara así"}},
    {"upToSpace", {"read up to the space", "bis zum Leerzeichen gelesen", "se lee hasta el espacio"}},
    {"asLevel", {"read as level {}", "gelesen als Ebene {}", "se lee como nivel {}"}},
    {"asOneBelow",
     {"read as one below the line before", "gelesen als eine Ebene unter der Zeile davor",
      "se lee un nivel por debajo de la línea anterior"}},
    {"asOwnRecord",
     {"read as a record of its own; pointers lead to the first",
      "als eigener Datensatz gelesen; Verweise führen zum ersten",
      "se lee como registro propio; las referencias llevan al primero"}},
    {"withoutIt", {"read without it", "trotzdem gelesen", "se lee sin ella"}},
    {"asFarAsItGoes", {"read as far as it goes", "gelesen, so weit sie reicht", "se lee hasta donde llega"}},
    {"likeOthers", {"read like the others", "gelesen wie die anderen", "se lee como los demás"}},
    {"asWellAsCanBe", {"read as well as can be", "gelesen, so gut es geht", "se lee lo mejor posible"}},
    {"maybeOtherEncoding",
     {"read as well as can be; if letters are wrong, choose another encoding",
      "gelesen, so gut es geht; sind Buchstaben falsch, wählen Sie eine andere Zeichenkodierung",
      "se lee lo mejor posible; si hay letras equivocadas, elija otra codificación"}},
    {"asEncoding", {"read as {}", "gelesen als {}", "se lee como {}"}},
    {"looksLike",
     {"it looks like {}: choose that encoding", "er sieht nach {} aus: wählen Sie diese Zeichenkodierung",
      "parece {}: elija esa codificación"}},
    {"chooseFarEncoding",
     {"choose an encoding, such as windows-1251, windows-1253, windows-1256, GBK, BIG5, Shift_JIS or EUC-KR",
      "wählen Sie eine Zeichenkodierung, etwa windows-1251, windows-1253, windows-1256, GBK, BIG5, Shift_JIS "
      "oder EUC-KR",
      "elija una codificación, como windows-1251, windows-1253, windows-1256, GBK, BIG5, Shift_JIS o "
      "EUC-KR"}},
    {"chooseNearEncoding",
     {"if letters are wrong, choose an encoding, such as windows-1250, windows-1251, IBM850 or macintosh",
      "sind Buchstaben falsch, wählen Sie eine Zeichenkodierung, etwa windows-1250, windows-1251, IBM850 "
      "oder macintosh",
      "si hay letras equivocadas, elija una codificación, como windows-1250, windows-1251, IBM850 o "
      "macintosh"}},
    {"listedBelow",
     {"those in names and dates are listed below", "die in Namen und Daten sind unten aufgeführt",
      "los de nombres y fechas se enumeran abajo"}},
}};

constexpr std::array<Words, kDiagnosticKinds> kKinds{{
    {"missing header", "fehlender Kopf", "cabecera ausente"},
    {"missing trailer", "fehlendes Ende", "final ausente"},
    {"record behind the trailer", "Datensatz hinter dem Ende", "registro después del final"},
    {"line without level and tag", "Zeile ohne Ebene und Schlüsselwort", "línea sin nivel y etiqueta"},
    {"empty line", "leere Zeile", "línea vacía"},
    {"wrong level", "falsche Ebene", "nivel equivocado"},
    {"level jump", "Sprung der Ebene", "salto de nivel"},
    {"broken identifier", "beschädigte Kennung", "identificador dañado"},
    {"identifier used twice", "doppelt vergebene Kennung", "identificador usado dos veces"},
    {"pointer to no record", "Verweis ohne Datensatz", "referencia a ningún registro"},
    {"wrong pointer", "falscher Verweis", "referencia equivocada"},
    {"family with a third partner", "Familie mit drittem Partner", "familia con un tercer cónyuge"},
    {"family with one person as both partners", "Familie mit derselben Person als beiden Partnern",
     "familia con una misma persona como los dos cónyuges"},
    {"encoding other than declared", "andere Zeichenkodierung als angegeben",
     "codificación distinta de la declarada"},
    {"unknown encoding", "unbekannte Zeichenkodierung", "codificación desconocida"},
    {"bytes that are no character", "Bytes, die kein Zeichen sind", "bytes que no son ningún carácter"},
    {"control character", "Steuerzeichen", "carácter de control"},
    {"unreadable date", "unlesbares Datum", "fecha ilegible"},
    {"archive member of another name", "Archivinhalt unter anderem Namen",
     "contenido del archivo con otro nombre"},
    {"more of a kind", "weitere einer Art", "más de un tipo"},
    {"link of one side alone", "Verknüpfung nur einer Seite", "vínculo de un solo lado"},
    {"links that contradict each other", "Verknüpfungen, die sich widersprechen",
     "vínculos que se contradicen"},
    {"partner in the slot of the other sex", "Partner am Platz des anderen Geschlechts",
     "cónyuge en el lugar del otro sexo"},
    {"date with day and month in doubt", "Datum mit zweifelhaftem Tag und Monat",
     "fecha con día y mes dudosos"},
}};

std::size_t columnOf(std::string_view language) {
    const auto found = std::find(kCodes.begin(), kCodes.end(), language.substr(0, 2));
    return found == kCodes.end() ? 0 : static_cast<std::size_t>(found - kCodes.begin());
}

// The name itself where there is no such kind.
std::string_view kindWords(std::string_view name, std::size_t column) {
    for (std::size_t kind = 0; kind < kDiagnosticKinds; ++kind) {
        if (kindName(static_cast<DiagnosticKind>(kind)) == name) return kKinds[kind][column];
    }
    return name;
}

}  // namespace

std::string_view sentenceName(DiagnosticSentence sentence) {
    return kSentences[static_cast<std::size_t>(sentence)].name;
}

std::optional<DiagnosticSentence> sentenceOfName(std::string_view name) {
    for (std::size_t sentence = 0; sentence < kDiagnosticSentences; ++sentence) {
        if (kSentences[sentence].name == name) return static_cast<DiagnosticSentence>(sentence);
    }
    return std::nullopt;
}

std::string phraseText(const DiagnosticPhrase& phrase, std::string_view language) {
    const std::size_t column = columnOf(language);
    std::string_view rest = kSentences[static_cast<std::size_t>(phrase.sentence)].words[column];
    std::string text;
    std::size_t next = 0;
    for (std::size_t open = rest.find('{'); open != std::string_view::npos; open = rest.find('{')) {
        const std::size_t close = rest.find('}', open);
        text += rest.substr(0, open);
        const std::string_view argument =
            next < phrase.arguments.size() ? std::string_view(phrase.arguments[next]) : std::string_view();
        ++next;
        text += close == open + 1 ? argument : kindWords(argument, column);
        rest.remove_prefix(close + 1);
    }
    return text.append(rest);
}

}  // namespace olvane::gedcom
