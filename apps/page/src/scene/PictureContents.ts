// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What stands in each box and what is read out for it. Kinship is stated only once it is known, since a search
// through a large family must not hold up the picture.

import type { BranchSize, Person, PersonLabel, PictureFamily, ShownFact, Texts } from "olvane";
import type { Messages } from "../messages";
import type { UiMessages } from "../messages/ui";
import type { BoxLook, BranchMark } from "./boxArt";
import type { BoxContents } from "./Scene";
import type { KinshipTexts } from "../view/KinshipTexts";
import type { OpenFamily } from "../view/OpenFamily";
import type { Box, Picture } from "../view/Picture";
import { factHeight } from "../view/ViewState";

export interface Wording {
    readonly messages: Messages;
    readonly ui: UiMessages;
    readonly kinshipInBoxes: boolean;
    /** What boxes and lines say beside names and years. */
    readonly show: ReadonlySet<ShownFact>;
    /** The address of somebody's photograph, null where there is none; null where boxes show none. */
    readonly render: ((person: Person, box: Box) => SVGElement | null) | null;
    readonly portraitOf: ((person: number) => string | null) | null;
    /** The branches of a person in the picture. */
    readonly branchesOf: (person: number) => readonly BranchSize[];
}

const kLabelsAtOnce = 16; // boxes

export class PictureContents implements BoxContents {
    kinshipKnown = false;
    private readonly labels = new Map<number, PersonLabel>();

    constructor(
        private readonly family: OpenFamily,
        private readonly picture: Picture,
        private readonly wording: Wording,
    ) {}

    get texts(): Texts {
        return this.family.file.texts;
    }

    // Empty where none is known, and for the focus.
    kinshipOf(id: number): string {
        return this.kinships.of(id).text;
    }

    // As kinshipOf, without the words that say by which side, and then in fewer and fewer letters.
    kinshipWordings(id: number): readonly string[] {
        const { short, shorter } = this.kinships.of(id);
        return short === "" ? [] : [short, ...shorter];
    }

    // Finds out what the persons of the picture are to the focus, for the given time in ms; true where all is known then.
    learnKinships(time: number): boolean {
        this.kinshipKnown ||= this.kinships.learn(this.persons(), time);
        return this.kinshipKnown;
    }

    private get kinships(): KinshipTexts {
        return this.family.kinshipsTo(this.picture.focus, this.wording.ui.language);
    }

    private persons(): number[] {
        return [...new Set(this.picture.boxes.map((box) => box.person))].filter((person) => person !== 0);
    }

    // How many relatives of a box are off the picture: -1 for none, 0 for an unknown number. The pedigree's flags
    // state ancestors alone, and its last column has none; so only the family view uses its flag.
    hiddenOf(box: Box): number {
        const { parents, partners, children } = box.hidden;
        const hidden = parents + partners + children;
        if (this.picture.view === "family") return box.flag ? hidden : -1;
        return hidden > 0 ? hidden : -1;
    }

    lookOf(box: Box): BoxLook {
        const person = this.family.person(box.person);
        return person ? this.personLook(person, box) : this.missingLook(box);
    }

    // What can be folded or unfolded at a box.
    branchesOf(box: Box): BranchMark[] {
        const branches = box.person ? this.wording.branchesOf(box.person) : [];
        return branches.filter(({ count }) => count > 0).map((size) => this.branchMark(box, size));
    }

    private branchMark(box: Box, size: BranchSize): BranchMark {
        const { ui, messages } = this.wording;
        const isFolded = box.folded.some(({ branch }) => branch === size.branch);
        const name = messages.nameOf(this.family.person(box.person)!);
        const label = (isFolded ? ui.unfold : ui.fold)(ui.branches[size.branch], name, size.count);
        return { ...size, isFolded, label };
    }

    labelOf(family: PictureFamily): string {
        const { show, ui } = this.wording;
        return show.has("marriage") && family.number > 0
            ? this.family.file.labelOfFamily(family.number, show, ui.language)
            : "";
    }

    // Asked for many boxes at a time, since most of them are seen together.
    private labelOfBox(box: Box): PersonLabel {
        const known = this.labels.get(box.person);
        if (known) return known;
        const { boxes } = this.picture;
        const first = Math.max(0, boxes.indexOf(box));
        const persons = boxes.slice(first, first + kLabelsAtOnce).map(({ person }) => person);
        const missing = [...new Set(persons)].filter((person) => person !== 0 && !this.labels.has(person));
        const { show, ui } = this.wording;
        const labels = this.family.file.labelsOfPersons(missing, show, ui.language);
        missing.forEach((person, i) => this.labels.set(person, labels[i]!));
        return this.labels.get(box.person)!;
    }

    private personLook(person: Person, box: Box): BoxLook {
        const isFocus = box === this.picture.focusBox;
        const boxes = this.picture.boxesOf(person.id).length;
        const kinship = this.kinshipKnown ? this.kinshipOf(person.id) : "";
        const hidden = this.hiddenOf(box);
        const { ui, messages, show } = this.wording;
        const says = this.labelOfBox(box);
        const label = [
            messages.nameOf(person),
            says.life,
            ...says.details,
            isFocus ? ui.inFocus : kinship,
            boxes > 1 && ui.severalBoxes(boxes),
            hidden >= 0 && box.folded.length === 0 && ui.hiddenCount(hidden),
            ...box.folded.map(({ branch, count }) => ui.folded(ui.branches[branch], count)),
            box.caption,
            box.kinshipPlace === "ancestor" && ui.commonAncestor,
            box.furtherParents > 0 && ui.furtherParents,
            box.marks.length > 0 && ui.marked(box.marks.join(", ")),
        ];
        return {
            person: person.id,
            xref: person.xref,
            sex: person.sex,
            name: says,
            texts: this.texts,
            rightToLeft: this.texts.runsRightToLeft(person.name),
            inside: this.wording.render?.(person, box) ?? null,
            photo: this.wording.portraitOf?.(person.id) ?? null,
            years: says.lines.join("  "),
            dates: says.lines,
            shortDates: says.shortLines,
            details: says.details,
            factHeight: factHeight(show),
            kinship: this.wording.kinshipInBoxes ? (this.kinshipKnown ? this.kinshipWordings(person.id) : []) : null,
            hidden,
            folded: box.folded.map((branch) => this.branchMark(box, branch)),
            further: box.furtherParents > 0 ? ui.furtherParents : "",
            kinshipPlace: box.kinshipPlace,
            marks: box.marks,
            repeated: boxes > 1,
            isFocus,
            label: label.filter(Boolean).join(", "),
        };
    }

    private missingLook(box: Box): BoxLook {
        const { ui, messages } = this.wording;
        const child = this.family.person(box.child);
        const what = box.sex === "male" ? ui.missingFather : ui.missingMother;
        return {
            person: 0,
            xref: "",
            sex: box.sex,
            name: { given: what, surname: "" },
            texts: this.texts,
            rightToLeft: false,
            inside: null,
            photo: null,
            years: "",
            dates: [],
            shortDates: [],
            details: [],
            factHeight: factHeight(this.wording.show),
            kinship: null,
            hidden: -1,
            folded: [],
            further: "",
            kinshipPlace: null,
            marks: [],
            repeated: false,
            isFocus: false,
            label: child ? ui.missingOf(what, messages.nameOf(child)) : what,
        };
    }
}
