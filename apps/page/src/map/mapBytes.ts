// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The bytes of a map as arrays of numbers. Their form is described in olvane/charts/MapIndex.h of the C++ sources;
// nothing in them is believed before it has been looked at.

const kMagic = "OLVMAP\r\n";
const kVersion = 1;
const kHeader = 28; // bytes
const kChecked = 5; // 32-bit words in front of those that the checksum is of
const kMostPlace = 2 ** 31 - 1;
export const kChildMask = 0x0fffffff;
export const kPersonLabel = 0x80000000;

const kSections = [
    "box",
    "rows",
    "places",
    "numbers",
    "births",
    "deaths",
    "flags",
    "names",
    "strings",
    "unions",
    "states",
    "starts",
    "children",
    "bands",
    "bars",
    "uprights",
    "marks",
    "levels",
    "labels",
] as const;
type Section = (typeof kSections)[number];

/** A map that ends early, was changed, or is none. */
export class MapError extends Error {
    constructor(
        readonly kind: "noMap" | "version" | "cut" | "damaged",
        readonly have = 0, // bytes, of a map that is cut
        readonly wanted = 0,
        detail = "",
    ) {
        super(kind + (detail && ": " + detail));
    }
}

/** Lists of one kind of number, in the order of MapIndex.h. Units: quarters of a point. */
export interface MapArrays {
    readonly boxWidth: number;
    readonly boxHeight: number;
    readonly rowY: Int32Array;
    readonly rowStart: Uint32Array; // and the end of the last
    readonly rowYear: Int32Array;
    readonly x: Int32Array;
    readonly numbers: Uint32Array;
    readonly births: Int16Array;
    readonly deaths: Int16Array;
    readonly flags: Uint8Array;
    readonly names: Uint32Array;
    readonly surnames: Uint32Array;
    readonly stringEnds: Uint32Array;
    readonly stringBytes: Uint8Array;
    readonly partners: Int32Array; // two of each union
    readonly childStarts: Uint32Array;
    readonly children: Uint32Array;
    readonly bandTop: Int32Array;
    readonly bandBottom: Int32Array;
    readonly barStart: Uint32Array; // by band, and the end of the last
    readonly uprightStart: Uint32Array;
    readonly bars: Lines;
    readonly uprights: Lines;
    readonly marks: Uint32Array; // person and number of each
    readonly levels: Uint32Array; // level and first label of each
    readonly labels: Int32Array; // x, y, text and weight of each
}

/** Bars from low to high along x at y = at, or uprights from low to high along y at x = at. */
export interface Lines {
    readonly low: Int32Array;
    readonly high: Int32Array;
    readonly at: Int32Array;
    readonly roles: Uint8Array;
}

/** The bytes become the arrays, and are of no other use afterwards. Throws MapError. */
export function readMap(bytes: Uint8Array<ArrayBuffer>): MapArrays {
    return new Reader(bytes).read();
}

class Reader {
    private readonly words: Uint32Array<ArrayBuffer>;
    private readonly sections = new Map<Section, Uint8Array<ArrayBuffer>>();
    private readonly persons: number;
    private readonly unions: number;

    constructor(private readonly bytes: Uint8Array<ArrayBuffer>) {
        const head = new DataView(bytes.buffer, bytes.byteOffset, bytes.byteLength);
        if (bytes.length < kHeader || [...kMagic].some((letter, i) => bytes[i] !== letter.charCodeAt(0)))
            throw new MapError("noMap");
        if (head.getUint32(8, true) !== kVersion) throw new MapError("version");
        const size = head.getUint32(12, true);
        if (size > bytes.length) throw new MapError("cut", bytes.length, size);
        require(size === bytes.length && size % 4 === 0 && bytes.byteOffset % 4 === 0, "length");
        this.words = new Uint32Array(bytes.buffer, bytes.byteOffset, size / 4);
        let sum = 2166136261;
        for (let i = kChecked; i < this.words.length; ++i) sum = Math.imul(sum ^ this.words[i]!, 16777619);
        require(sum >>> 0 === this.words[4], "checksum");
        this.persons = this.words[5]!;
        this.unions = this.words[6]!;
        this.find();
    }

    private find(): void {
        for (let at = kHeader; at < this.bytes.length;) {
            require(at + 8 <= this.bytes.length, "section");
            const kind = kSections[this.words[at / 4]! - 1];
            const size = this.words[at / 4 + 1]!;
            at += 8;
            require(size <= this.bytes.length - at, "section");
            if (kind) this.sections.set(kind, this.bytes.subarray(at, at + size));
            at += 4 * Math.ceil(size / 4);
        }
    }

    // Of `count` items of a size in bytes; of any number of them where count is -1.
    private section(name: Section, itemSize: number, count = -1): Uint8Array<ArrayBuffer> {
        const bytes = this.sections.get(name);
        if (!bytes || bytes.length % itemSize !== 0 || (count >= 0 && bytes.length !== count * itemSize))
            throw new MapError("damaged", 0, 0, name);
        return bytes;
    }

    private unsigned(name: Section, words = 1, count = -1): Uint32Array<ArrayBuffer> {
        const { buffer, byteOffset, length } = this.section(name, 4 * words, count);
        return new Uint32Array(buffer, byteOffset, length / 4);
    }

    private signed(name: Section, words = 1, count = -1): Int32Array<ArrayBuffer> {
        const { buffer, byteOffset, length } = this.section(name, 4 * words, count);
        return new Int32Array(buffer, byteOffset, length / 4);
    }

    private years(name: Section): Int16Array {
        const { buffer, byteOffset } = this.section(name, 2, this.persons);
        return new Int16Array(buffer, byteOffset, this.persons);
    }

    read(): MapArrays {
        const [boxWidth, boxHeight] = this.signed("box", 1, 2) as unknown as [number, number];
        require(boxWidth >= 0 && boxHeight >= 0, "box");
        return {
            boxWidth,
            boxHeight,
            ...this.rows(),
            ...this.whoIsWho(),
            ...this.names(),
            ...this.kin(),
            ...this.lines(),
            ...this.signs(),
        };
    }

    private rows() {
        const rows = this.signed("rows", 3);
        const count = rows.length / 3;
        const [rowY, rowYear] = [new Int32Array(count), new Int32Array(count)];
        const rowStart = new Uint32Array(count + 1);
        for (let i = 0; i < count; ++i) {
            rowY[i] = rows[3 * i]!;
            rowStart[i] = rows[3 * i + 1]!;
            rowYear[i] = rows[3 * i + 2]!;
            require(rowStart[i]! < this.persons, "row");
            require(i === 0 ? rowStart[0] === 0 : rowStart[i]! > rowStart[i - 1]! && rowY[i]! > rowY[i - 1]!, "rows");
        }
        require(count > 0 || this.persons === 0, "rows");
        rowStart[count] = this.persons;
        const x = this.signed("places", 1, this.persons);
        addUp(x, rowStart);
        return { rowY, rowStart, rowYear, x };
    }

    private whoIsWho() {
        const numbers = this.unsigned("numbers", 1, this.persons);
        const seen = new Uint8Array(this.persons + 1);
        for (const number of numbers) {
            require(number >= 1 && number <= this.persons && seen[number] === 0, "numbers");
            seen[number] = 1;
        }
        const flags = this.section("flags", 1, this.persons);
        require(!flags.some((flag) => (flag & 3) === 3), "sex");
        return { numbers, flags, births: this.years("births"), deaths: this.years("deaths") };
    }

    private names() {
        const strings = this.section("strings", 1);
        require(strings.length >= 4, "strings");
        const words = new Uint32Array(strings.buffer, strings.byteOffset, Math.floor(strings.length / 4));
        const count = words[0]!;
        require(count >= 1 && count < words.length, "strings");
        const stringEnds = words.subarray(1, count + 1);
        const stringBytes = strings.subarray(4 * count + 4);
        require(isRising(stringEnds) && stringEnds[0] === 0 && stringEnds[count - 1] === stringBytes.length, "strings");
        const both = this.unsigned("names", 2, this.persons);
        require(areBelow(both, count), "names");
        return {
            stringEnds,
            stringBytes,
            names: both.subarray(0, this.persons),
            surnames: both.subarray(this.persons),
        };
    }

    private kin() {
        const partners = this.signed("unions", 2, this.unions);
        require(!partners.some((person) => person < -1 || person >= this.persons), "unions");
        require(!this.section("states", 1, this.unions).some((state) => state > 3), "states");
        const childStarts = this.unsigned("starts", 1, this.unions + 1);
        const children = this.unsigned("children");
        require(isRising(childStarts) && childStarts[0] === 0, "starts");
        require(childStarts[this.unions] === children.length, "starts");
        require(!children.some((child) => (child & kChildMask) >= this.persons || child >>> 28 > 5), "children");
        return { partners, childStarts, children };
    }

    private lines() {
        const count = this.sections.get("rows")!.length / 12 + 2;
        const bands = this.signed("bands", 4, count);
        const barWords = this.signed("bars", 3);
        const uprightWords = this.signed("uprights", 3);
        const [bandTop, bandBottom] = [new Int32Array(count), new Int32Array(count)];
        const [barStart, uprightStart] = [new Uint32Array(count + 1), new Uint32Array(count + 1)];
        for (let i = 0; i < count; ++i) {
            bandTop[i] = bands[4 * i]!;
            bandBottom[i] = bands[4 * i + 1]!;
            barStart[i] = bands[4 * i + 2]!;
            uprightStart[i] = bands[4 * i + 3]!;
        }
        barStart[count] = barWords.length / 3;
        uprightStart[count] = uprightWords.length / 3;
        require(isRising(barStart) && isRising(uprightStart) && barStart[0] === 0 && uprightStart[0] === 0, "bands");
        const bars = linesOf(barWords, barStart, true);
        const uprights = linesOf(uprightWords, uprightStart, false);
        for (let i = 0; i < count; ++i) {
            const [top, bottom] = [bandTop[i]!, bandBottom[i]!];
            for (let b = barStart[i]!; b < barStart[i + 1]!; ++b)
                require(bars.at[b]! >= top && bars.at[b]! <= bottom, "band");
            for (let u = uprightStart[i]!; u < uprightStart[i + 1]!; ++u)
                require(uprights.low[u]! >= top && uprights.high[u]! <= bottom, "band");
        }
        return { bandTop, bandBottom, barStart, uprightStart, bars, uprights };
    }

    private signs() {
        const marks = this.unsigned("marks", 2);
        for (let i = 0; i < marks.length; i += 2)
            require(marks[i]! < this.persons && (i === 0 || marks[i]! >= marks[i - 2]!), "marks");
        const levels = this.unsigned("levels", 2);
        const labels = this.signed("labels", 4);
        const count = labels.length / 4;
        for (let i = 0; i < levels.length; i += 2) {
            require(levels[i]! < 32 && levels[i + 1]! <= count, "levels");
            const isNext = () => levels[i] === levels[i - 2]! + 1 && levels[i + 1]! >= levels[i - 1]!;
            require(i === 0 ? levels[1] === 0 : isNext(), "levels");
        }
        require(count === 0 || levels.length > 0, "levels");
        const strings = new Uint32Array(this.section("strings", 1).slice(0, 4).buffer)[0]!;
        for (let i = 2; i < labels.length; i += 4)
            require(labels[i]! < 0 ? (labels[i]! & 0x7fffffff) < this.persons : labels[i]! < strings, "labels");
        return { marks, levels, labels };
    }
}

// Differences become places, in the memory where they are: from each start on, none lies before the one before it.
function addUp(values: Int32Array, starts: Uint32Array): void {
    for (let run = 0; run + 1 < starts.length; ++run) {
        for (let i = starts[run]! + 1; i < starts[run + 1]!; ++i) {
            const place = values[i - 1]! + (values[i]! >>> 0);
            require(place <= kMostPlace, "place");
            values[i] = place;
        }
    }
}

// Three lists: of bars x1, length, y; of uprights x, y, length. A role lies in the lowest bits of each y.
function linesOf(words: Int32Array<ArrayBuffer>, starts: Uint32Array, areBars: boolean): Lines {
    const count = words.length / 3;
    const first = words.subarray(0, count);
    const [levels, lengths] = areBars
        ? [words.subarray(2 * count), words.subarray(count, 2 * count)]
        : [words.subarray(count, 2 * count), words.subarray(2 * count)];
    addUp(first, starts);
    const roles = new Uint8Array(count);
    for (let i = 0; i < count; ++i) {
        require((levels[i]! & 7) <= 3, "role");
        roles[i] = levels[i]! & 7;
        levels[i] = levels[i]! >> 3;
    }
    const low = areBars ? first : levels;
    for (let i = 0; i < count; ++i) {
        const high = low[i]! + (lengths[i]! >>> 0);
        require(high <= kMostPlace, "length");
        lengths[i] = high;
    }
    return { low, high: lengths, at: areBars ? levels : first, roles };
}

function isRising(values: Uint32Array): boolean {
    for (let i = 1; i < values.length; ++i) if (values[i]! < values[i - 1]!) return false;
    return true;
}

function areBelow(values: Uint32Array, end: number): boolean {
    for (let i = 0; i < values.length; ++i) if (values[i]! >= end) return false;
    return true;
}

function require(holds: boolean, what: string): asserts holds {
    if (!holds) throw new MapError("damaged", 0, 0, what);
}
