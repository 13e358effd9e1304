// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A picture, read from the run of numbers that the module writes.

const BOX_KINDS = ["person", "unknownParent"];
const SEXES = ["male", "female", "other"];
const ROLES = ["marriage", "drop", "bar", "stem", "link"];
const STYLES = ["married", "divorced", "unmarried", "unknown"];
const CHILD_KINDS = ["birth", "adopted", "foster", "step", "sealing", "unknown"];
const MARK_KINDS = ["samePerson", "parentsElsewhere", "partnersElsewhere"];
const WAY_KINDS = ["blood", "legal", "marriage"];
const LINE_STYLES = ["plain", "divorced", "unmarried", "adopted", "foster", "step", "sealing"];
const LABEL_SIDES = ["none", "above", "below", "right"];
/** In the order of the module's numbers. */
export const BRANCHES = ["up", "down", "beside"];
export const SIDES = ["top", "right", "bottom", "left"];
const HEAD = 16;

function boxAt(n, at, index) {
    return {
        index,
        id: n[at],
        kind: BOX_KINDS[n[at + 10]],
        x: n[at + 1],
        y: n[at + 2],
        width: n[at + 3],
        height: n[at + 4],
        sex: SEXES[n[at + 11]],
        childOf: n[at + 5] < 0 ? null : n[at + 5],
        repeat: n[at + 6],
        hidden: { parents: n[at + 7], partners: n[at + 8], children: n[at + 9] },
        furtherParents: n[at + 13],
        flag: n[at + 12] < 0 ? null : n[at + 12] > 0,
    };
}

function labelAt(n, at) {
    const side = LABEL_SIDES[n[at + 2]];
    if (side === undefined || side === "none") return null;
    return { x: n[at], y: n[at + 1], side, textX: n[at + 3], textY: n[at + 4] };
}

function familyAt(n, at, members, lines, label) {
    const [firstMember, firstLine, childCount, lineCount, number, parentCount, style] = n.subarray(at, at + 7);
    const firstChild = firstMember + parentCount;
    const children = members.slice(firstChild, firstChild + childCount);
    return {
        number,
        parents: members.slice(firstMember, firstChild).map((member) => member.box),
        children: children.map((member) => member.box),
        childKinds: children.map((member) => CHILD_KINDS[member.kind]),
        style: STYLES[style],
        lines: lines.slice(firstLine, firstLine + lineCount),
        label,
    };
}

function lineAt(n, at, bridges) {
    const first = n[at + 5];
    return {
        x1: n[at],
        y1: n[at + 1],
        x2: n[at + 2],
        y2: n[at + 3],
        child: n[at + 4] < 0 ? null : n[at + 4],
        role: ROLES[n[at + 7]],
        bridges: n[at + 6] === 0 ? [] : bridges.slice(first, first + n[at + 6]),
    };
}

function markAt(n, at) {
    const boxes = [n[at + 2], n[at + 3], n[at + 4]].filter((box) => box >= 0);
    return { kind: MARK_KINDS[n[at]], number: n[at + 1], boxes };
}

function wayAt(n, at, words, { wayBoxes, pieces }) {
    const [firstBox, boxCount, ancestorCount, firstPiece, pieceCount, kind] = n.subarray(at, at + 6);
    const boxes = wayBoxes + firstBox;
    return {
        kind: WAY_KINDS[kind],
        words,
        boxes: Array.from(n.subarray(boxes, boxes + boxCount)),
        ancestors: Array.from(n.subarray(boxes + boxCount, boxes + boxCount + ancestorCount)),
        lines: Array.from({ length: pieceCount }, (_, piece) => {
            const [x1, y1, x2, y2] = n.subarray(pieces + 4 * (firstPiece + piece));
            return { x1, y1, x2, y2 };
        }),
    };
}

/** What screens draw, as the module wrote it down: the styles, a line for each family, one for each cell of a round chart. */
function artFrom(text, familyCount, arcCount) {
    const [first, ...rows] = text.split("\n");
    const styles = first.split(";").map((words, i) => {
        const [dashes, meaning] = words.split("\t");
        return { name: LINE_STYLES[i], dashes, meaning };
    });
    const used = new Set();
    const pathFrom = (path) => {
        const style = styles[path[0]];
        used.add(style);
        return { style, data: path.slice(1) };
    };
    const lines = rows.slice(0, familyCount).map((row) => (row === "" ? [] : row.split(";").map(pathFrom)));
    return {
        styles: styles.filter((style) => used.has(style)),
        lines,
        cells: rows.slice(familyCount, familyCount + arcCount).map((row) => {
            const [colour, outline] = row.split(/ (.*)/);
            return { colour: colour === "-1" ? null : Number(colour), outline };
        }),
    };
}

/** The picture of a view; numbers may be memory of the module's, which is not kept. texts gives its words. */
export function pictureFrom(view, numbers, texts, art) {
    const [
        boxCount,
        arcCount,
        familyCount,
        memberCount,
        lineCount,
        bridgeCount,
        markCount,
        focus,
        ringCount,
        middleX,
        middleY,
    ] = numbers;
    const [other, wayCount, wayBoxCount, pieceCount, foldedCount] = numbers.subarray(11, HEAD);
    // Lists refer to those behind them, so each is read where it lies before any is put together.
    const starts = {};
    let at = HEAD;
    const place = (name, count, size) => {
        starts[name] = at;
        at += count * size;
    };
    place("boxes", boxCount, 14);
    place("arcs", arcCount, 4);
    place("rings", ringCount, 1);
    place("families", familyCount, 7);
    place("members", memberCount, 2);
    place("lines", lineCount, 8);
    place("bridges", bridgeCount, 1);
    place("marks", markCount, 5);
    place("ways", wayCount, 6);
    place("wayBoxes", wayBoxCount, 1);
    place("pieces", pieceCount, 4);
    place("folded", foldedCount, 4);
    place("labels", familyCount, 5); // where they were asked for
    const list = (name, count, size, make) =>
        Array.from({ length: count }, (_, index) => make(starts[name] + index * size, index));
    const bridges = Array.from(numbers.subarray(starts.bridges, starts.bridges + bridgeCount));
    const members = list("members", memberCount, 2, (start) => ({ box: numbers[start], kind: numbers[start + 1] }));
    const [focusIs, otherIs, plates, ...words] = other < 0 ? [] : texts();
    const lines = list("lines", lineCount, 8, (start) => lineAt(numbers, start, bridges));
    return {
        view,
        focus,
        boxes: list("boxes", boxCount, 14, (start, index) => boxAt(numbers, start, index)),
        arcs: list("arcs", arcCount, 4, (start) => ({
            ring: numbers[start],
            from: numbers[start + 1],
            to: numbers[start + 2],
            line: numbers[start + 3] < 0 ? null : numbers[start + 3],
        })),
        rings:
            ringCount === 0
                ? null
                : { radii: Array.from(numbers.subarray(starts.rings, starts.rings + ringCount)), middleX, middleY },
        families: list("families", familyCount, 7, (start, index) =>
            familyAt(numbers, start, members, lines, labelAt(numbers, starts.labels + 5 * index)),
        ),
        marks: list("marks", markCount, 5, (start) => markAt(numbers, start)),
        folded: list("folded", foldedCount, 4, (start) => ({
            box: numbers[start],
            count: numbers[start + 1],
            branch: BRANCHES[numbers[start + 2]],
            side: SIDES[numbers[start + 3]],
        })),
        art: art === null ? null : artFrom(art, familyCount, arcCount),
        kinship:
            other < 0
                ? null
                : {
                      other,
                      focusIs,
                      otherIs,
                      plates: plates.map(([box, x, y, width, height, lines]) => ({
                          box,
                          x: x / 100,
                          y: y / 100,
                          width: width / 100,
                          height: height / 100,
                          lines,
                      })),
                      ways: list("ways", wayCount, 6, (start, i) => wayAt(numbers, start, words[i], starts)),
                  },
    };
}

/** Hands options over as numbers, for the next picture. */
export function usePictureOptions({ exports }, numbers) {
    const head = exports.picture_options(numbers.length);
    new Float64Array(exports.memory.buffer, head >>> 0, numbers.length).set(numbers);
}

/** Reads what the module answered, and releases it; null for a picture that was refused. art is where its drawn form is. */
export function readPicture(instance, options, answer, art = 0) {
    if (answer === 0) return null;
    const { exports } = instance;
    try {
        const count = exports.picture_count(answer) >>> 0;
        const values = new Float64Array(exports.memory.buffer, exports.picture_numbers(answer) >>> 0, count);
        const texts = () => JSON.parse(instance.text(exports.last_text()));
        return pictureFrom(
            options.view ?? "family",
            values,
            texts,
            options.paths && art !== 0 ? instance.text(art) : null,
        );
    } finally {
        exports.picture_free(answer);
    }
}
