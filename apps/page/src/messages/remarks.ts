// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The GEDCOM reader's remarks in another language. The reader writes English sentences with numbers and pieces of
// the file in them; a table has a sentence for each, with {} where a piece stands.

export type RemarkTable = Readonly<Record<string, string>>;

/** Says a remark in the table's language; as it is where the table has no such sentence. */
export function translatorOf(table: RemarkTable): (remark: string) => string {
    const patterns = Object.keys(table)
        .filter((sentence) => sentence.includes("{}"))
        .map((sentence) => ({ pattern: patternOf(sentence), answer: table[sentence]! }));
    const sentenceFor = (text: string): string => {
        if (Object.hasOwn(table, text)) return table[text]!;
        for (const { pattern, answer } of patterns) {
            const pieces = pattern.exec(text)?.slice(1);
            if (pieces) return filled(answer, pieces.map(sentenceFor));
        }
        return text;
    };
    return (remark) => {
        const { sentence, quoted } = parted(remark);
        return sentenceFor(sentence) + quoted;
    };
}

// What the reader quotes from the file stands behind in brackets, and stays.
function parted(remark: string): { sentence: string; quoted: string } {
    const at = remark.endsWith(")") ? remark.indexOf(" (") : -1;
    return at < 0
        ? { sentence: remark, quoted: "" }
        : { sentence: remark.slice(0, at), quoted: remark.slice(at) };
}

function patternOf(sentence: string): RegExp {
    const words = sentence.split("{}").map((part) => part.replace(/[.*+?^$()|[\]\\]/g, "\\$&"));
    return new RegExp(`^${words.join("(.+)")}$`, "su");
}

function filled(answer: string, pieces: readonly string[]): string {
    let next = 0;
    return answer.replace(/\{\}/g, () => pieces[next++] ?? "");
}
