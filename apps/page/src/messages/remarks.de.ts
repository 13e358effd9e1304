// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// German. check-remarks holds that every sentence of the reader is here, letter by letter.

import type { RemarkTable } from "./remarks";

export const germanRemarks: RemarkTable = {
    // what was wrong
    "not a line with level and tag": "keine Zeile mit Ebene und Schlüsselwort",
    "level badly written": "eine schlecht geschriebene Ebene",
    "level jumps from {} to {}": "die Ebene springt von {} auf {}",
    "identifier without its second @": "eine Kennung ohne das zweite @",
    "identifier already used in line {}": "die Kennung ist schon in Zeile {} vergeben",
    "one person as both partners of a family": "dieselbe Person als beide Partner einer Familie",
    "one more person in a family that names others as its partners":
        "noch eine Person in einer Familie, die andere als Partner nennt",
    "a family with more than two partners": "eine Familie mit mehr als zwei Partnern",
    "a pointer to no record": "ein Verweis, zu dem es keinen Datensatz gibt",
    "a pointer that leads to no person": "ein Verweis, der zu keiner Person führt",
    "a pointer that leads to no family": "ein Verweis, der zu keiner Familie führt",
    "a pointer that does not end with @": "ein Verweis, der nicht mit @ endet",
    "a link without a pointer": "eine Verknüpfung ohne Verweis",
    "the file does not begin with HEAD": "die Datei beginnt nicht mit HEAD",
    "the file ends without TRLR and may have been cut off":
        "die Datei endet ohne TRLR und ist vielleicht abgeschnitten",
    "a record behind TRLR": "ein Datensatz hinter TRLR",
    "a date that cannot be read": "ein Datum, das sich nicht lesen lässt",
    "half a character at the end of the file": "ein halbes Zeichen am Ende der Datei",
    "the header names an encoding that is not known": "der Kopf nennt eine unbekannte Zeichenkodierung",
    "the text is not in the encoding that the header names":
        "der Text hat nicht die Zeichenkodierung, die der Kopf nennt",
    "the header names a system, not an encoding": "der Kopf nennt ein System, keine Zeichenkodierung",
    "the text is UTF-8 but for {} places": "der Text ist UTF-8, bis auf Fehler an {} Stellen",
    "the file names no encoding": "die Datei nennt keine Zeichenkodierung",
    "the text does not look like the encoding that the header names":
        "der Text sieht nicht nach der Zeichenkodierung aus, die der Kopf nennt",
    "the text is not in the encoding that was chosen": "der Text hat nicht die gewählte Zeichenkodierung",
    "the text is not {} in {} places": "der Text ist nicht {}, und zwar an {} Stellen",
    "a FAMS of a family that names two others as its partners":
        "ein FAMS zu einer Familie, die zwei andere als Partner nennt",
    "a child whose own record names another family as that of the parents":
        "ein Kind, dessen eigener Datensatz eine andere Familie als die der Eltern nennt",
    "a date whose day and month may be either way round": "ein Datum, bei dem Tag und Monat vertauscht sein können",
    "a man as the WIFE of a family": "ein Mann als WIFE einer Familie",
    "a woman as the HUSB of a family": "eine Frau als HUSB einer Familie",
    "{} bytes that are no character in {}": "{} Bytes, die in {} kein Zeichen sind",
    "{} control characters": "{} Steuerzeichen",
    "{}, the first of {}": "{}, die erste von {}",
    "{} more of: {}": "{} weitere dieser Art: {}",

    // what was done
    skipped: "übergangen",
    "left out": "weggelassen",
    "shown as written": "wird gezeigt, wie es dasteht",
    "not listed singly": "nicht einzeln aufgeführt",
    "not their own spouse": "niemand ist mit sich selbst verheiratet",
    "its children are left out for this person": "für diese Person sind die Kinder weggelassen",
    "read up to the space": "bis zum Leerzeichen gelesen",
    "both are kept, the child's own first": "beide bleiben, die des Kindes zuerst",
    "its year alone is read": "nur das Jahr wird gelesen",
    "read as its husband": "als Ehemann gelesen",
    "read as its wife": "als Ehefrau gelesen",
    "read as well as can be; if letters are wrong, choose another encoding":
        "gelesen, so gut es geht; sind Buchstaben falsch, wählen Sie eine andere Zeichenkodierung",
    "the children are kept for all of them": "die Kinder bleiben bei allen",
    "{}; {}": "{}; {}",
    "it looks like {}: choose that encoding": "er sieht nach {} aus: wählen Sie diese Zeichenkodierung",
    "choose an encoding, such as GBK, BIG5, Shift_JIS, EUC-KR, TIS-620 or windows-1256":
        "wählen Sie eine Zeichenkodierung, etwa GBK, BIG5, Shift_JIS, EUC-KR, TIS-620 oder windows-1256",
    "if letters are wrong, choose an encoding, such as windows-1250, windows-1251, IBM850 or macintosh":
        "sind Buchstaben falsch, wählen Sie eine Zeichenkodierung, etwa windows-1250, windows-1251, IBM850 oder macintosh",
    "read as if it did": "so gelesen, als ob er es täte",
    "read as well as can be": "gelesen, so gut es geht",
    "read as far as it goes": "gelesen, so weit sie reicht",
    "read without it": "trotzdem gelesen",
    "read like the others": "gelesen wie die anderen",
    "read as one below the line before": "gelesen als eine Ebene unter der Zeile davor",
    "read as a record of its own; pointers lead to the first":
        "als eigener Datensatz gelesen; Verweise führen zum ersten",
    "read as level {}": "gelesen als Ebene {}",
    "read as {}": "gelesen als {}",
    "those in names and dates are listed below": "die in Namen und Daten sind unten aufgeführt",

    // why nothing was read
    "{}: is empty": "{}: ist leer",
    "{}: holds nothing that looks like GEDCOM": "{}: enthält nichts, was nach GEDCOM aussieht",

    // kinds, where they are only counted
    "missing header": "fehlender Kopf",
    "missing trailer": "fehlendes Ende",
    "record behind the trailer": "Datensatz hinter dem Ende",
    "line without level and tag": "Zeile ohne Ebene und Schlüsselwort",
    "empty line": "leere Zeile",
    "wrong level": "falsche Ebene",
    "level jump": "Sprung der Ebene",
    "broken identifier": "beschädigte Kennung",
    "identifier used twice": "doppelt vergebene Kennung",
    "pointer to no record": "Verweis ohne Datensatz",
    "wrong pointer": "falscher Verweis",
    "family with a third partner": "Familie mit drittem Partner",
    "family with one person as both partners": "Familie mit derselben Person als beiden Partnern",
    "encoding other than declared": "andere Zeichenkodierung als angegeben",
    "unknown encoding": "unbekannte Zeichenkodierung",
    "bytes that are no character": "Bytes, die kein Zeichen sind",
    "control character": "Steuerzeichen",
    "unreadable date": "unlesbares Datum",
    "date with day and month in doubt": "Datum mit zweifelhaftem Tag und Monat",
    "link of one side alone": "Verknüpfung nur einer Seite",
    "links that contradict each other": "Verknüpfungen, die sich widersprechen",
    "partner in the slot of the other sex": "Partner am Platz des anderen Geschlechts",
    "archive member of another name": "Archivinhalt unter anderem Namen",
    "more of a kind": "weitere einer Art",
};
