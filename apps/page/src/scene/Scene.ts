// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The picture on the screen. Only the visible part has elements, with some room around it, so that panning
// moves one group and nothing else. Where too many boxes to be read are in sight, they are drawn in overview mode: one
// path a colour.
//
// Holds: the focus's box, and the box that the keys stand on, always have their elements.

import type { PictureFamily, Texts } from "olvane";
import { prefersStillness, setAttributes, svg } from "../base/dom";
import { encloses, grown, type Rectangle, touches } from "../base/SpatialGrid";
import type { Box, FamilyLines, Picture } from "../view/Picture";
import { type BoxLook, type BranchMark, drawBox, drawBranch, handleOf, repaintBox } from "./boxArt";
import { Camera, kReadable, type Placing } from "./Camera";
import { Glide, kGlideTime, leaveGhosts } from "./Glide";
import { LineLayer } from "./LineLayer";
import { overviewPaths } from "./overviewPaths";
import { clipped, middleOf, unionOf } from "./sceneAreas";
import { listenToSurface, type SceneEvents } from "./sceneInput";

const kMostReadable = 420; // boxes in sight
const kMostPointed = 3000; // boxes of a picture in which branches are counted at each box under the pointer
const kRoomAround = 0.4; // of the window, drawn on each side of it

// How the boxes of a picture are to be drawn.
export interface BoxContents {
    // Measures what is written; its fonts are those of the boxes.
    readonly texts: Texts;
    lookOf(box: Box): BoxLook;
    branchesOf(box: Box): readonly BranchMark[];
    // What stands at the marriage line of a family; empty for nothing.
    labelOf(family: PictureFamily): string;
}

export class Scene {
    readonly camera: Camera;
    private readonly world = svg("g", { class: "world" });
    private readonly lines = new LineLayer();
    private readonly overviewLayer = svg("g", { class: "far", "aria-hidden": "true" });
    private readonly ghosts = svg("g", { class: "ghosts", "aria-hidden": "true" });
    private readonly boxLayer = svg("g", { class: "boxes" });
    private readonly elements = new Map<Box, SVGGElement>();
    private picture: Picture | null = null;
    private contents!: BoxContents; // given with the picture
    private activeBox: Box | null = null;
    private pointedBox: Box | null = null;
    private drawn: Rectangle | null = null; // whose boxes and lines have elements
    private isFar = false; // in overview mode
    private glide: Glide | null = null;
    private frame = 0;

    constructor(
        readonly surface: SVGSVGElement,
        private readonly events: SceneEvents,
    ) {
        this.world.append(this.overviewLayer, this.lines.element, this.ghosts, this.boxLayer);
        surface.append(this.world);
        this.camera = new Camera(surface, (placing) => this.cameraMoved(placing));
        listenToSurface(surface, this, events);
    }

    // Draws another picture. Boxes of the same persons glide from where they stood, while the anchor, a box
    // of the picture so far, hands its place on the screen to the new focus.
    show(picture: Picture, contents: BoxContents, anchor: Box | null): void {
        const before = this.picture;
        const hadKeys = this.surface.contains(this.keyHolder);
        const oldElements = new Map(this.elements);
        const held = before ? (anchor ?? before.boxOfKey(picture.focusBox.key) ?? null) : null;

        this.endGlide();
        this.picture = picture;
        this.contents = contents;
        this.world.setAttribute("font-family", contents.texts.fontFamilies);
        this.activeBox = picture.focusBox;
        this.pointedBox = null;
        this.lines.pointAt(null);
        this.elements.clear();
        this.boxLayer.replaceChildren();
        this.overviewLayer.replaceChildren();
        this.drawn = null;

        if (before && held) this.arrive(before, picture, held, oldElements);
        else this.begin(picture);
        if (hadKeys) this.focusActive();
    }

    // Draws the boxes in sight again in their places, where names, labels or marks have changed.
    redraw(): void {
        for (const [box, element] of this.elements) repaintBox(element, this.contents.lookOf(box), box);
        this.markBranches();
    }

    // At the selected box and the one under the pointer stands what folds their branches.
    private markBranches(): void {
        if (!this.picture || this.glide) return;
        const { length } = this.picture.boxes;
        for (const control of this.boxLayer.querySelectorAll(".fold[role]")) control.remove();
        const boxes = new Set([this.activeBox, length <= kMostPointed ? this.pointedBox : null]);
        for (const box of boxes) {
            const element = box && this.elements.get(box);
            if (!element || this.isFar) continue;
            for (const mark of this.contents.branchesOf(box)) {
                const control = drawBranch(mark, this.contents.texts, box);
                setAttributes(control, { role: "button", "aria-label": mark.label });
                if (box === this.activeBox) control.setAttribute("tabindex", "0");
                element.append(control);
            }
        }
    }

    restyle(contents: BoxContents): void {
        this.contents = contents;
        this.redraw();
    }

    clear(): void {
        this.endGlide();
        this.picture = null;
        this.activeBox = null;
        this.elements.clear();
        this.lines.clear();
        for (const group of [this.boxLayer, this.overviewLayer, this.ghosts]) group.replaceChildren();
    }

    fit(): void {
        if (this.picture) this.camera.travelTo(this.camera.fitting(this.picture.bounds));
    }

    // To the focus, and near enough to read.
    home(): void {
        if (!this.picture) return;
        this.activate(this.picture.focusBox);
        if (this.camera.placing.k < kReadable) this.camera.travelTo(this.opening(this.picture));
    }

    get active(): Box | null {
        return this.activeBox;
    }

    // Puts the keys on a box and brings it into sight.
    activate(box: Box, takeKeys = true): void {
        const before = this.activeBox;
        this.activeBox = box;
        this.update();
        if (before) this.handle(before)?.setAttribute("tabindex", "-1");
        this.handle(box)?.setAttribute("tabindex", "0");
        if (takeKeys) this.focusActive();
        this.bringIntoSight(box);
        this.lightFamilies();
        this.markBranches();
        this.events.active(box);
    }

    // To call when the window's size has changed.
    resized(): void {
        this.camera.resized();
        this.drawn = null;
        this.update();
    }

    elementOf(box: Box): SVGGElement | undefined {
        return this.elements.get(box);
    }

    // Marks all the boxes of one person, when one of several is pointed at.
    markDuplicates(person: number): void {
        for (const [box, element] of this.elements)
            element.classList.toggle("duplicate-lit", person > 0 && box.person === person);
    }

    // Lights up the lines of a person's families: of the one under the pointer, or else of the selected one.
    pointAt(box: Box | null): void {
        if (this.pointedBox === box) return;
        this.pointedBox = box;
        this.lightFamilies();
        this.markBranches();
    }

    pointAtFamily(family: string | null): void {
        this.lines.pointAt(family);
    }

    private lightFamilies(): void {
        const box = this.pointedBox ?? this.activeBox;
        this.lines.lightFamilies(box && this.picture ? this.picture.familiesOf(box) : []);
    }

    private begin(picture: Picture): void {
        this.camera.place(this.opening(picture));
        this.update();
        this.markBranches();
    }

    private arrive(before: Picture, picture: Picture, held: Box, oldElements: Map<Box, SVGGElement>): void {
        const { k, x, y } = this.camera.placing;
        // With the same focus the box that was acted on keeps its place, else it hands it to the new one.
        const heir = (before.focus === picture.focus && picture.boxOfKey(held.key)) || picture.focusBox;
        const glide = new Glide(before, held, picture, heir, performance.now());
        const { shift } = glide;
        const start = { k, x: x - shift.x * k, y: y - shift.y * k };
        const target = this.comfortable(picture, heir, start, before.view !== picture.view);
        if (prefersStillness()) {
            this.ghosts.replaceChildren();
            this.camera.place(target);
            this.markBranches();
            return;
        }

        this.glide = glide;
        // To a person far away the picture does not travel: the way would show, and draw, all that lies between.
        const wasInSight = touches(before.areaOf(held), this.camera.window());
        if (wasInSight) leaveGhosts(this.ghosts, picture, shift, oldElements);
        else this.ghosts.replaceChildren();
        this.camera.place(wasInSight ? start : target);
        this.update(this.camera.window(target));
        this.fadeNewcomers(before);
        this.step(performance.now());
        if (wasInSight) this.camera.travelTo(target, kGlideTime);
    }

    private opening(picture: Picture): Placing {
        return this.camera.opening(picture.bounds, middleOf(picture.areaOf(picture.focusBox)));
    }

    // Near to where it starts: only so far that the box stands well in the window, and the whole picture
    // where the zoom of the moment has room for it.
    private comfortable(picture: Picture, box: Box, start: Placing, otherView: boolean): Placing {
        if (otherView) return this.opening(picture);
        const near = this.camera.including(picture.areaOf(box), 0.3, start);
        return this.camera.includingWhole(picture.bounds, near);
    }

    private fadeNewcomers(before: Picture): void {
        for (const [box, element] of this.elements) if (!before.boxOfKey(box.key)) element.classList.add("late");
        this.lines.fadeIn();
    }

    private step = (now: number): void => {
        if (!this.glide || !this.picture) return;
        for (const [box, element] of this.elements) this.put(box, element, now);
        if (this.glide.partAt(now) < 1) {
            this.frame = requestAnimationFrame(this.step);
            return;
        }
        // Now there is time for what lies around.
        this.glide = null;
        this.drawn = null;
        this.update();
        this.markBranches();
    };

    // Where the box is at that time of performance.now().
    private put(box: Box, element: SVGGElement, now: number): void {
        const { x, y } = this.glide?.placeOf(box, now) ?? box;
        element.setAttribute("transform", `translate(${x.toFixed(1)} ${y.toFixed(1)})`);
    }

    private endGlide(): void {
        cancelAnimationFrame(this.frame);
        this.glide = null;
    }

    private cameraMoved(placing: Placing): void {
        const { k, x, y } = placing;
        this.world.setAttribute("transform", `translate(${x.toFixed(2)} ${y.toFixed(2)}) scale(${k.toFixed(5)})`);
        if (this.picture) this.update();
        this.thickenLines();
        this.events.moved(placing);
    }

    // Sees to it that everything in sight, and in another window that is on its way, has its elements.
    private update(alsoWindow?: Rectangle): void {
        const { picture } = this;
        if (!picture) return;
        const sight = this.camera.window();
        const needed = alsoWindow ? unionOf(sight, alsoWindow) : sight;
        const isFar = picture.boxes.length > kMostReadable && picture.boxesWithin(sight).length > kMostReadable;
        const far = this.drawn && this.drawn.right - this.drawn.left > 6 * (sight.right - sight.left);
        if (
            this.drawn &&
            isFar === this.isFar &&
            !far &&
            encloses(this.drawn, clipped(needed, this.drawn, picture.bounds))
        ) {
            this.keepAlways(picture);
            return;
        }
        this.isFar = isFar;
        const around = this.glide ? 0 : kRoomAround;
        this.drawn = grown(needed, (sight.right - sight.left) * around, (sight.bottom - sight.top) * around);
        this.drawLines(picture);
        this.drawOverview(picture);
        this.drawBoxes(isFar ? [] : picture.boxesWithin(this.drawn), picture);
    }

    private drawLines(picture: Picture): void {
        const families = this.isFar ? picture.families : picture.familiesWithin(this.drawn!);
        const label = this.isFar ? null : ({ family }: FamilyLines) => this.contents.labelOf(family);
        this.lines.draw(families, picture.kinship?.ways ?? [], label);
        this.thickenLines();
        this.lightFamilies();
    }

    private thickenLines(): void {
        this.lines.thicken(this.camera.placing.k);
    }

    private drawOverview(picture: Picture): void {
        this.overviewLayer.classList.toggle("shown", this.isFar);
        if (!this.isFar || this.overviewLayer.firstChild) return;
        this.overviewLayer.append(...overviewPaths(picture));
    }

    private drawBoxes(boxes: readonly Box[], picture: Picture): void {
        const wanted = new Set(boxes);
        wanted.add(picture.focusBox);
        if (this.activeBox) wanted.add(this.activeBox);
        for (const [box, element] of this.elements) {
            if (wanted.has(box)) continue;
            element.remove();
            this.elements.delete(box);
        }
        const added = document.createDocumentFragment();
        for (const box of wanted) if (!this.elements.has(box)) added.append(this.newElement(box));
        this.boxLayer.append(added);
        const focus = this.elements.get(picture.focusBox);
        if (focus && this.boxLayer.lastChild !== focus && !focus.contains(this.keyHolder)) this.boxLayer.append(focus);
    }

    private keepAlways(picture: Picture): void {
        for (const box of [picture.focusBox, this.activeBox]) {
            if (box && !this.elements.has(box)) this.boxLayer.append(this.newElement(box));
        }
    }

    private newElement(box: Box): SVGGElement {
        const element = drawBox(this.contents.lookOf(box), box);
        element.setAttribute("data-box", String(box.index));
        if (box === this.activeBox) handleOf(element).setAttribute("tabindex", "0");
        this.elements.set(box, element);
        this.put(box, element, -Infinity);
        return element;
    }

    private bringIntoSight(box: Box): void {
        const placing = this.camera.including(grown(this.picture!.areaOf(box), 12, 12), 0.08);
        const { x, y } = this.camera.placing;
        if (Math.abs(placing.x - x) > 1 || Math.abs(placing.y - y) > 1) this.camera.travelTo(placing, 220);
    }

    private focusActive(): void {
        if (this.activeBox) this.handle(this.activeBox)?.focus({ preventScroll: true });
    }

    private handle(box: Box): SVGElement | undefined {
        const element = this.elements.get(box);
        return element && handleOf(element);
    }

    // What has the keys in the tree of elements that the surface stands in.
    private get keyHolder(): Element | null {
        return (this.surface.getRootNode() as Document | ShadowRoot).activeElement ?? null;
    }

    boxAt(target: EventTarget | null): Box | null {
        const index = (target as Element | null)?.closest?.("[data-box]")?.getAttribute("data-box");
        return index ? (this.picture?.boxes[Number(index)] ?? null) : null;
    }
}
