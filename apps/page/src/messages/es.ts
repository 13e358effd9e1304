// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The Spanish table.

import type { DateMark, Messages } from "../messages";

const kMonths = [
    "enero",
    "febrero",
    "marzo",
    "abril",
    "mayo",
    "junio",
    "julio",
    "agosto",
    "septiembre",
    "octubre",
    "noviembre",
    "diciembre",
];

function yearText(year: number): string {
    return year < 0 ? `${-year} a. C.` : String(year);
}

export const spanish: Messages = {
    language: "es",
    unknownName: "nombre desconocido",
    dates: {
        day(year: number, month: number, day: number): string {
            const monthText = kMonths[month - 1];
            if (!monthText) return yearText(year);
            return `${day > 0 ? `${day} de ` : ""}${monthText} de ${yearText(year)}`;
        },
        marked(mark: DateMark, first: string, last: string): string {
            const texts: Record<DateMark, string> = {
                exact: first,
                about: `hacia ${first}`,
                before: `antes de ${first}`,
                after: `después de ${first}`,
                between: `entre ${first} y ${last}`,
                since: `desde ${first}`,
                until: `hasta ${first}`,
                lasting: `de ${first} a ${last}`,
            };
            return texts[mark];
        },
        born: (date: string): string => `nac. ${date}`,
        died: (date: string): string => `m. ${date}`,
    },
    facts: {
        ADOP: "Adopción",
        ANUL: "Anulación del matrimonio",
        BAPM: "Bautismo",
        BARM: "Bar mitzvá",
        BASM: "Bat mitzvá",
        BIRT: "Nacimiento",
        BLES: "Bendición",
        BURI: "Entierro",
        CAST: "Casta",
        CENS: "Censo",
        CHR: "Bautizo",
        CHRA: "Bautizo de adulto",
        CONF: "Confirmación",
        CREM: "Incineración",
        DEAT: "Defunción",
        DIV: "Divorcio",
        DIVF: "Demanda de divorcio",
        DSCR: "Descripción",
        EDUC: "Estudios",
        EMIG: "Emigración",
        ENGA: "Compromiso matrimonial",
        EVEN: "Acontecimiento",
        FACT: "Dato",
        FCOM: "Primera comunión",
        GRAD: "Graduación",
        IMMI: "Inmigración",
        MARB: "Amonestaciones",
        MARC: "Contrato matrimonial",
        MARL: "Licencia de matrimonio",
        MARR: "Matrimonio",
        MARS: "Capitulaciones matrimoniales",
        NATI: "Nacionalidad",
        NATU: "Naturalización",
        NCHI: "Número de hijos",
        NMR: "Número de matrimonios",
        OCCU: "Ocupación",
        ORDN: "Ordenación",
        PROB: "Validación del testamento",
        PROP: "Propiedades",
        RELI: "Religión",
        RESI: "Residencia",
        RETI: "Jubilación",
        TITL: "Título",
        WILL: "Testamento",
    },
};
