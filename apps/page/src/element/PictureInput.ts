// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What keys, pointer and wheel do in the picture: keys walk from box to box, the pointer brings up a tooltip, and the wheel
// zooms where it may.

import type { Branch } from "olvane";
import type { Messages } from "../messages";
import type { UiMessages } from "../messages/ui";
import type { Scene } from "../scene/Scene";
import { type OuterKey, pictureKey } from "../ui/pictureKeys";
import { Tooltip } from "../ui/Tooltip";
import { boxTowards, type Direction } from "../view/kinMoves";
import type { Box } from "../view/Picture";
import type { ShownPicture } from "./ShownPicture";

export interface InputActions {
    words(): { readonly messages: Messages; readonly ui: UiMessages };
    openBox(box: Box): void;
    fold(box: Box, branch: Branch): void;
    home(): void;
    fit(): void;
    zoomIn(): void;
    zoomOut(): void;
    /** A key that leads out of the viewer; true where somebody took it. */
    outer(key: OuterKey): boolean;
}

export class PictureInput {
    readonly tooltip = new Tooltip();
    private isInUse = false; // by a pointer that was pressed in the picture and has not left it

    /** element has the attribute "wheel", and the keyboard focus where it or something in it has it. */
    constructor(
        private readonly element: HTMLElement,
        private readonly surface: SVGSVGElement,
        private readonly scene: Scene,
        private readonly shown: ShownPicture,
        private readonly actions: InputActions,
    ) {
        scene.camera.takesWheel = () => this.takesWheel();
        surface.addEventListener("pointerdown", () => (this.isInUse = true));
        surface.addEventListener("pointerleave", () => (this.isInUse = false));
    }

    // In a frame the wheel scrolls the page around it until the picture is used.
    private takesWheel(): boolean {
        const rule = this.element.getAttribute("wheel") ?? (window.self === window.top ? "always" : "active");
        return rule !== "active" || this.isInUse || (document.hasFocus() && this.element.matches(":focus-within"));
    }

    pointAt(box: Box | null, element: SVGGElement | null): void {
        const { picture, contents, family, state } = this.shown;
        this.scene.pointAt(box);
        const person = box ? family?.person(box.person) : undefined;
        this.scene.markDuplicates(person && picture!.boxesOf(person.id).length > 1 ? person.id : 0);
        if (!box || !person || !element || !contents || !picture || !state) return this.tooltip.hide();
        const { messages, ui } = this.actions.words();
        const hidden = contents.hiddenOf(box);
        const boxes = picture.boxesOf(person.id).length;
        this.tooltip.show(element, {
            name: messages.nameOf(person),
            lines: [
                messages.yearsOf(person),
                box === picture.focusBox ? ui.inFocus : this.shown.kinshipOf(person),
                hidden >= 0 ? ui.hiddenCount(hidden) : "",
                boxes > 1 ? ui.severalBoxes(boxes) : "",
            ],
        });
    }

    /** Acts on a key as if it had been pressed in the picture. True where it meant something. */
    press(event: KeyboardEvent): boolean {
        const target = event.composedPath()[0] as Element;
        const inPicture = target === document.body || this.surface.contains(target);
        const { home, fit, zoomIn, zoomOut, outer } = this.actions;
        return pictureKey(event, inPicture, {
            ...{ home, fit, zoomIn, zoomOut, outer },
            moveKeys: (direction) => this.moveKeys(direction),
            panBy: (dx, dy) => this.scene.camera.panBy(dx, dy),
            chooseActive: () => this.chooseActive(),
            nextBox: () => this.nextBox(),
            fold: (branch) => this.foldActive(branch),
        });
    }

    key(event: KeyboardEvent): void {
        if (!this.shown.family || event.defaultPrevented) return;
        const target = event.composedPath()[0] as Element;
        if (target.matches("input:not([type=checkbox]), select, textarea")) return;
        const branch = [" ", "Enter"].includes(event.key) && target.getAttribute("data-branch");
        if (branch && this.foldActive(branch as Branch)) return event.preventDefault();
        if (this.press(event)) event.preventDefault();
    }

    /** Puts the keys on the next of several boxes of one person: of the selected one where nobody is named. */
    nextBox(person = this.scene.active?.person ?? 0): void {
        const boxes = this.shown.picture?.boxesOf(person) ?? [];
        if (boxes.length < 2) return;
        const at = boxes.findIndex((box) => box === this.scene.active);
        this.scene.activate(boxes[(at + 1) % boxes.length]!);
    }

    private moveKeys(direction: Direction): void {
        const { picture, family } = this.shown;
        const from = this.scene.active ?? picture?.focusBox;
        if (!picture || !family || !from) return;
        const next = boxTowards(from, direction, picture, family);
        if (next) this.scene.activate(next);
    }

    private chooseActive(): void {
        if (this.scene.active) this.actions.openBox(this.scene.active);
    }

    private foldActive(branch: Branch): boolean {
        const box = this.scene.active;
        if (!box || !this.shown.contents?.branchesOf(box).some((mark) => mark.branch === branch)) return false;
        this.actions.fold(box, branch);
        return true;
    }
}
