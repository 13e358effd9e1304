// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The German table.

import type { DateMark, Messages } from "../messages";

const kMonths = [
    "Januar",
    "Februar",
    "März",
    "April",
    "Mai",
    "Juni",
    "Juli",
    "August",
    "September",
    "Oktober",
    "November",
    "Dezember",
];

function yearText(year: number): string {
    return year < 0 ? `${-year} v. Chr.` : String(year);
}

export const german: Messages = {
    language: "de",
    unknownName: "Name unbekannt",
    dates: {
        day(year: number, month: number, day: number): string {
            const monthText = kMonths[month - 1];
            if (!monthText) return yearText(year);
            return `${day > 0 ? `${day}. ` : ""}${monthText} ${yearText(year)}`;
        },
        marked(mark: DateMark, first: string, last: string): string {
            const texts: Record<DateMark, string> = {
                exact: first,
                about: `um ${first}`,
                before: `vor ${first}`,
                after: `nach ${first}`,
                between: `zwischen ${first} und ${last}`,
                since: `ab ${first}`,
                until: `bis ${first}`,
                lasting: `von ${first} bis ${last}`,
            };
            return texts[mark];
        },
        born: (date: string): string => `geboren ${date}`,
        died: (date: string): string => `gestorben ${date}`,
    },
    facts: {
        ADOP: "Adoption",
        ANUL: "Annullierung der Ehe",
        BAPM: "Taufe",
        BARM: "Bar Mizwa",
        BASM: "Bat Mizwa",
        BIRT: "Geburt",
        BLES: "Segnung",
        BURI: "Bestattung",
        CAST: "Kaste",
        CENS: "Volkszählung",
        CHR: "Kindstaufe",
        CHRA: "Erwachsenentaufe",
        CONF: "Konfirmation",
        CREM: "Einäscherung",
        DEAT: "Tod",
        DIV: "Scheidung",
        DIVF: "Scheidung eingereicht",
        DSCR: "Beschreibung",
        EDUC: "Ausbildung",
        EMIG: "Auswanderung",
        ENGA: "Verlobung",
        EVEN: "Ereignis",
        FACT: "Angabe",
        FCOM: "Erstkommunion",
        GRAD: "Abschluss",
        IMMI: "Einwanderung",
        MARB: "Aufgebot",
        MARC: "Ehevertrag",
        MARL: "Heiratserlaubnis",
        MARR: "Heirat",
        MARS: "Güterregelung",
        NATI: "Staatsangehörigkeit",
        NATU: "Einbürgerung",
        NCHI: "Zahl der Kinder",
        NMR: "Zahl der Ehen",
        OCCU: "Beruf",
        ORDN: "Ordination",
        PROB: "Testamentseröffnung",
        PROP: "Besitz",
        RELI: "Religion",
        RESI: "Wohnort",
        RETI: "Ruhestand",
        TITL: "Titel",
        WILL: "Testament",
    },
};
