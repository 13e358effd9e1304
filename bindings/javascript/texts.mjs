// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Measures and fits texts as the module's pictures do, so that a screen breaks lines where a file does, and folds them
// as its searches do. Puts dates and places into words.

import { MARKS } from "./rows.mjs";

const MOST_REMEMBERED = 20000;

export class Texts {
    #instance;
    #known = new Map();

    constructor(instance) {
        this.#instance = instance;
    }

    get fontFamilies() {
        return this.#instance.text(this.#instance.exports.font_families());
    }

    width(text, size, bold = false) {
        return this.#remembered(`w/${size}/${bold}/${text}`, () =>
            this.#instance.withText(text, (pointer) => this.#instance.exports.text_width(pointer, size, bold ? 1 : 0)),
        );
    }

    fitLine(text, size, width, bold = false) {
        return this.#remembered(`l/${size}/${bold}/${width}/${text}`, () =>
            this.#instance.withText(text, (pointer) =>
                this.#answer(this.#instance.exports.fit_line(pointer, size, bold ? 1 : 0, width)),
            ),
        );
    }

    fitLines(text, size, width, lines, bold = false) {
        return this.#remembered(`t/${size}/${bold}/${width}/${lines}/${text}`, () => {
            const answer = this.#instance.withText(text, (pointer) =>
                this.#answer(this.#instance.exports.fit_lines(pointer, size, bold ? 1 : 0, width, lines)),
            );
            const [whole, ...fitted] = answer.split("\n");
            return { lines: fitted, whole: whole === "1" };
        });
    }

    fitName({ given, surname, surnameFirst = false }, { width, height, gap = 3, lines = 4, smallest = 10 }) {
        const room = [surnameFirst ? 1 : 0, width, height, gap, lines, smallest];
        return this.#remembered(`n/${room.join("/")}/${given}\n${surname}`, () => {
            const answer = this.#instance.withText(given, (first) =>
                this.#instance.withText(surname, (second) =>
                    this.#answer(this.#instance.exports.fit_name(first, second, ...room)),
                ),
            );
            const [size, ...fitted] = answer.split("\n");
            return { size: Number(size) / 100, lines: fitted };
        });
    }

    placeInCell({ given, surname, surnameFirst = false }, facts, { from, to, inner, outer, isCentre }) {
        const cell = [from, to, inner, outer, isCentre ? 1 : 0];
        return this.#remembered(`c/${cell.join("/")}/${surnameFirst}/${given}\n${surname}\n${facts.join("\n")}`, () => {
            const answer = this.#instance.withText(given, (first) =>
                this.#instance.withText(surname, (second) =>
                    this.#instance.withText(facts.join("\n"), (others) =>
                        this.#answer(
                            this.#instance.exports.fan_text(first, second, surnameFirst ? 1 : 0, others, ...cell),
                        ),
                    ),
                ),
            );
            return JSON.parse(answer).map(([text, isName, rightToLeft, ...numbers]) => {
                const [size, x, y, turn, baseline] = numbers.map((number) => number / 100);
                return { text, isName: isName === 1, rightToLeft: rightToLeft === 1, size, x, y, turn, baseline };
            });
        });
    }

    runsRightToLeft(text) {
        return this.#remembered(`d/${text}`, () =>
            this.#instance.withText(text, (pointer) => this.#instance.exports.runs_right_to_left(pointer) !== 0),
        );
    }

    foldedWords(texts) {
        const lines = Array.from(texts, (text) => text.replace(/[\n\0]/g, " "));
        if (lines.length === 0) return [];
        return this.#instance
            .withText(lines.join("\n"), (pointer) => this.#answer(this.#instance.exports.folded_words(pointer)))
            .split("\n");
    }

    dateText(written, language = "en") {
        return this.#instance.withText(written, (value) =>
            this.#instance.withText(String(language), (code) =>
                this.#answer(this.#instance.exports.date_text(value, code)),
            ),
        );
    }

    placeText(place) {
        return this.#instance.withText(place, (pointer) => this.#answer(this.#instance.exports.place_text(pointer)));
    }

    yearsText(birth, death, language = "en") {
        const dates = [birth, death].flatMap((date) => [
            date?.year ?? 0,
            date?.lastYear ?? 0,
            date ? MARKS.indexOf(date.mark) : 0,
        ]);
        return this.#remembered(`y/${dates.join("/")}/${language}`, () =>
            this.#instance.withText(String(language), (code) =>
                this.#answer(this.#instance.exports.years_text(...dates, code)),
            ),
        );
    }

    unnamedText(language = "en") {
        return this.#instance.withText(String(language), (code) =>
            this.#answer(this.#instance.exports.unnamed_text(code)),
        );
    }

    #answer(pointer) {
        if (pointer === 0) throw new Error("the module found no memory for a text");
        return this.#instance.text(pointer);
    }

    // The same texts are asked for again and again while a picture moves.
    #remembered(key, ask) {
        const known = this.#known.get(key);
        if (known !== undefined) return known;
        if (this.#known.size >= MOST_REMEMBERED) this.#known.clear();
        const answer = ask();
        if (key.length < 1000) this.#known.set(key, answer);
        return answer;
    }
}
