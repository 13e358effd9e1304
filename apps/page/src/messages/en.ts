// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The English table.

import type { DateMark, Messages } from "../messages";

const kMonths = [
    "January",
    "February",
    "March",
    "April",
    "May",
    "June",
    "July",
    "August",
    "September",
    "October",
    "November",
    "December",
];

function yearText(year: number): string {
    return year < 0 ? `${-year} BC` : String(year);
}

export const english: Messages = {
    language: "en",
    unknownName: "unknown name",
    dates: {
        day(year: number, month: number, day: number): string {
            const monthText = kMonths[month - 1];
            if (!monthText) return yearText(year);
            return `${day > 0 ? `${day} ` : ""}${monthText} ${yearText(year)}`;
        },
        marked(mark: DateMark, first: string, last: string): string {
            const texts: Record<DateMark, string> = {
                exact: first,
                about: `about ${first}`,
                before: `before ${first}`,
                after: `after ${first}`,
                between: `between ${first} and ${last}`,
                since: `from ${first}`,
                until: `until ${first}`,
                lasting: `from ${first} to ${last}`,
            };
            return texts[mark];
        },
        born: (date: string): string => `born ${date}`,
        died: (date: string): string => `died ${date}`,
    },
    facts: {
        ADOP: "Adoption",
        ANUL: "Annulment",
        BAPM: "Baptism",
        BARM: "Bar mitzvah",
        BASM: "Bat mitzvah",
        BIRT: "Birth",
        BLES: "Blessing",
        BURI: "Burial",
        CAST: "Caste",
        CENS: "Census",
        CHR: "Christening",
        CHRA: "Adult christening",
        CONF: "Confirmation",
        CREM: "Cremation",
        DEAT: "Death",
        DIV: "Divorce",
        DIVF: "Divorce filed",
        DSCR: "Description",
        EDUC: "Education",
        EMIG: "Emigration",
        ENGA: "Engagement",
        EVEN: "Event",
        FACT: "Fact",
        FCOM: "First communion",
        GRAD: "Graduation",
        IMMI: "Immigration",
        MARB: "Marriage banns",
        MARC: "Marriage contract",
        MARL: "Marriage licence",
        MARR: "Marriage",
        MARS: "Marriage settlement",
        NATI: "Nationality",
        NATU: "Naturalisation",
        NCHI: "Number of children",
        NMR: "Number of marriages",
        OCCU: "Occupation",
        ORDN: "Ordination",
        PROB: "Probate",
        PROP: "Property",
        RELI: "Religion",
        RESI: "Residence",
        RETI: "Retirement",
        TITL: "Title",
        WILL: "Will",
    },
};
