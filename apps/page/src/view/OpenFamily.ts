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
        const values = this.file.picture(state.focus, { ...options, labelSize, paths: true });
        const laterSide = this.file.laterSide(state.view, state.direction, options.mirrored);
        return new Picture(state.view, laterSide, state.focus, values);
    }

    // What hangs from a person in the picture. Throws LayoutError.
    branches(state: ViewState, person: number, reader: Reader): readonly BranchSize[] {
        return this.file.branches(state.focus, person, this.optionsOf(state, reader));
    }

    // The picture as the text of an SVG file, as the command draws it. Throws LayoutError.
    // part names boxes by their index, around which the drawing ends.
    svg(state: ViewState, theme: DrawingTheme, reader: Reader, part?: DrawingOptions["part"]): string {
        const drawing = { theme, show: state.show, photos: this.photosIn(state, reader), part };
        return this.file.svg(state.focus, keeping(this.optionsOf(state, reader)), drawing);
    }

    sheets(state: ViewState, paper: PaperOptions, reader: Reader): PaperSheets {
        const drawing = { theme: "print", show: state.show, photos: this.photosIn(state, reader) } as const;
        return this.file.sheets(state.focus, this.optionsOf(state, reader), drawing, paper);
    }

    // Photographs of the persons in a picture, as data: those that are unpacked.
    private photosIn(state: ViewState, reader: Reader): Map<number, string> {
        const photos = new Map<number, string>();
        if (!state.photos) return photos;
        for (const { person } of this.picture(state, reader).boxes) {
            const url = person && this.portraitOf(person, () => undefined);
            const data = url && this.photographs.dataOf(url);
            if (data) photos.set(person, data);
        }
        return photos;
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

    // Whom to begin with where nobody said.
    bestFocus(): number {
        return this.file.bestFocus || 1;
    }

    // Asked for again and again with one focus, whose answers are kept.
    kinshipsTo(focus: number, language: string): KinshipTexts {
        const { kinships } = this;
        if (kinships?.focus === focus && kinships.language === language) return kinships;
        return (this.kinships = new KinshipTexts(this.file, focus, language));
    }

    close(): void {
        this.photographs.close();
        this.file.close();
    }

    private optionsOf(state: ViewState, reader: Reader): PictureOptions {
        return optionsOf(state, this.file.usualBoxes(state.view, state.direction), reader);
    }
}
