// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The family that is open: its persons, its pictures, and how everybody is related to the focus.

import type {
    BranchSize,
    DrawingOptions,
    DrawingTheme,
    GedcomFamily as Family,
    GedcomFile,
    PaperOptions,
    PaperSheets,
    Person,
    PictureOptions,
} from "olvane";
import { Photographs } from "../engine/photographs";
import { KinshipTexts } from "./KinshipTexts";
import { Picture } from "./Picture";
import { kLabelSize, optionsOf, type Reader, type ViewState } from "./ViewState";

// What is on the screen stays where it is when somebody is added; what is printed is laid out for its paper.
function keeping(options: PictureOptions): PictureOptions {
    return options.view === "everybody" ? { ...options, keepPlaces: true } : options;
}

export class OpenFamily {
    readonly persons: readonly Person[];
    readonly families: readonly Family[];
    private readonly portraits = new Map<number, string | null>();
    private kinships: KinshipTexts | null = null;

    constructor(
        readonly file: GedcomFile,
        readonly title: string,
        readonly livingHidden: boolean,
        readonly photographs: Photographs = Photographs.none,
    ) {
        this.persons = file.persons;
        this.families = file.families;
    }

    person(id: number): Person | undefined {
        return this.persons[id - 1];
    }

    // Throws LayoutError.
    picture(state: ViewState, reader: Reader): Picture {
        const options = keeping(this.optionsOf(state, reader));
        const labelSize = state.show.has("marriage") ? kLabelSize : 0;
        const values = this.file.picture(state.focus, { ...options, labelSize });
        return new Picture(state.view, state.direction, state.focus, values, options.mirrored);
    }

    // What hangs from a person in the picture. Throws LayoutError.
    branches(state: ViewState, person: number, reader: Reader): readonly BranchSize[] {
        return this.file.branches(state.focus, person, this.optionsOf(state, reader));
    }

    // The picture as the text of an SVG file, as the command draws it. Throws LayoutError.
    // part names boxes by their index, around which the drawing ends.
    svg(state: ViewState, theme: DrawingTheme, reader: Reader, part?: DrawingOptions["part"]): string {
        return this.file.svg(state.focus, keeping(this.optionsOf(state, reader)), { theme, show: state.show, part });
    }

    sheets(state: ViewState, paper: PaperOptions, reader: Reader): PaperSheets {
        return this.file.sheets(
            state.focus,
            this.optionsOf(state, reader),
            { theme: "print", show: state.show },
            paper,
        );
    }

    // The first photograph of a person, null where there is none; late is called when one of an archive is unpacked.
    portraitOf(id: number, late: () => void): string | null {
        const known = this.portraits.get(id);
        if (known !== undefined) return known;
        this.portraits.set(id, null);
        for (const { file } of this.file.detailsOfPerson(id).media) {
            const url = this.photographs.urlOf(file);
            if (typeof url === "string") {
                this.portraits.set(id, url);
                return url;
            }
            void url?.then((found) => {
                if (!found || this.portraits.get(id)) return;
                this.portraits.set(id, found);
                late();
            });
        }
        return null;
    }

    // The focus stands first among all who could be one: whoever has the most relatives near.
    bestFocus(): number {
        let best = 1;
        let most = -1;
        for (const person of this.persons) {
            const near = this.nearness(person);
            if (near > most) [best, most] = [person.id, near];
        }
        return best;
    }

    // Asked for again and again with one focus, whose answers are kept.
    kinshipsTo(focus: number, language: string): KinshipTexts {
        const { kinships } = this;
        if (kinships?.focus === focus && kinships.language === language) return kinships;
        return (this.kinships = new KinshipTexts(this.file, focus, language));
    }

    siblingsOf(person: Person): number[] {
        const siblings = new Set<number>();
        for (const parent of [person.father, person.mother]) {
            for (const child of this.person(parent)?.children ?? []) if (child !== person.id) siblings.add(child);
        }
        return [...siblings];
    }

    close(): void {
        this.photographs.close();
        this.file.close();
    }

    private optionsOf(state: ViewState, reader: Reader): PictureOptions {
        return optionsOf(state, this.file.usualBoxes(state.view, state.direction), reader);
    }

    // Two generations up and down and across, with parents worth most: a picture with all its parts.
    private nearness(person: Person): number {
        const parents = [person.father, person.mother]
            .map((id) => this.person(id))
            .filter((parent) => parent !== undefined);
        const grandparents = parents.reduce((n, parent) => n + (parent.father ? 1 : 0) + (parent.mother ? 1 : 0), 0);
        const siblings = Math.min(6, parents[0]?.children.length ?? 0);
        const children = Math.min(6, person.children.length);
        const grandchildren = person.children.some((child) => (this.person(child)?.children.length ?? 0) > 0) ? 2 : 0;
        const named = person.name === "" ? -10 : 0;
        return (
            named +
            3 * parents.length +
            2 * grandparents +
            siblings +
            children +
            grandchildren +
            Math.min(2, person.spouses.length)
        );
    }
}
