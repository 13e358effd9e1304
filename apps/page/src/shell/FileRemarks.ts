// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What was wrong in the file and what is odd in its data, in the reader's language. A page that came with a family has
// kept what was wrong in the file that it was made of, without words; its own text has other lines.

import type { Diagnostic, GedcomFile, Olvane, Remark } from "olvane";

export type ListedRemark = Pick<Remark, "severity" | "line" | "persons" | "text" | "hint">;

export class FileRemarks {
    private language = "";
    private listed: readonly ListedRemark[] = [];

    // kept is null for a file that was read here; file is null while that in the page has not been read.
    constructor(
        private readonly engine: Olvane,
        private readonly file: GedcomFile | null,
        private readonly kept: readonly Diagnostic[] | null,
    ) {}

    in(language: string): readonly ListedRemark[] {
        if (this.language !== language) this.listed = this.remarks(language);
        this.language = language;
        return this.listed;
    }

    private remarks(language: string): readonly ListedRemark[] {
        const remarks = this.file?.remarks(language) ?? [];
        if (!this.kept) return remarks;
        const found = this.kept.map((one) => ({
            ...this.engine.diagnosticWords(one, language),
            severity: one.severity,
            line: one.line,
            persons: [],
        }));
        const odd = remarks.filter(({ severity }) => severity === "odd").map((remark) => ({ ...remark, line: 0 }));
        return [...found.filter(({ text }) => text !== ""), ...odd];
    }
}
