// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The page as a whole: holds the family that is open and the state of the view, and passes between the parts
// what a person does. Every road to another picture leads through travel(): a click, a key, the search, a
// link, the browser's buttons.

import { type Diagnostic, LayoutError, type Olvane, type Person } from "olvane";
import { ArchiveError, gedcomInArchive, isArchive, TooLargeError } from "./engine/archive";
import type { EmbeddedFamily } from "./engine/engine";
import { type Messages, messagesFor } from "./messages";
import { type UiMessages, uiMessagesFor } from "./messages/ui";
import { nameOf, yearsOf } from "./names";
import { PictureOutput, type Subject } from "./output/PictureOutput";
import { fileNameOf } from "./output/saving";
import { Scene } from "./scene/Scene";
import { Chrome, type ChromeActions } from "./ui/Chrome";
import { html, recall, remember, svg } from "./ui/dom";
import { fileInput, takeDrops } from "./ui/dropping";
import { Notices } from "./ui/Notices";
import { Overview } from "./ui/Overview";
import { pictureKey } from "./ui/pictureKeys";
import { SidePanel } from "./ui/SidePanel";
import { Theme, type ThemeChoice } from "./ui/theme";
import { Tooltip } from "./ui/Tooltip";
import { Welcome } from "./ui/Welcome";
import { uiLanguages } from "./messages/ui";
import { Journey } from "./view/Journey";
import { boxTowards, type Direction } from "./view/kinMoves";
import { OpenFamily } from "./view/OpenFamily";
import type { Box, Picture } from "./view/Picture";
import { PictureDress } from "./view/PictureDress";
import {
    addressOf,
    clampGenerations,
    kUsualGenerations,
    readAddress,
    type RelativeName,
    sameState,
    strangerIn,
    type ViewName,
    type ViewState,
} from "./view/ViewState";

const kMostBytes = 128 * 2 ** 20; // of a file
const kSoonSearched = 6000; // persons; among so many, kinship is known before a picture is drawn
const kWarmUps = 8;
const kWarmUpPause = 120; // ms
const kWarmEnough = 12; // ms; what takes less needs no warming
const kKinshipDelay = 600; // ms after the picture of a larger family, when its boxes are in their places

export class App implements ChromeActions {
    private messages: Messages;
    private ui: UiMessages;
    private chrome!: Chrome; // made by speak()
    private panel!: SidePanel;
    private welcome!: Welcome;
    private family: OpenFamily | null = null;
    private state: ViewState | null = null;
    private picture: Picture | null = null;
    private dress: PictureDress | null = null;
    private fileName = "";
    private lastProblems: readonly Diagnostic[] = [];
    private shownPerson = 0; // in the side panel
    private kinshipInBoxes = recall("kinship") !== "no";
    private panelOpen = recall("panel") !== "no";
    private kinshipTimer = 0;

    private readonly theme = new Theme();
    private readonly tooltip = new Tooltip();
    private readonly notices = new Notices();
    private readonly live = html("div", { id: "live", class: "unseen", "aria-live": "polite" });
    private readonly stage = html("main", { class: "stage" });
    private readonly cover = html("div", { class: "cover", hidden: true });
    private readonly input = fileInput((file) => void this.openDropped([file]));
    private readonly surface = svg("svg", { id: "tree", role: "application" });
    private readonly hint = html("p", { id: "tree-hint", class: "unseen" });
    private readonly scene: Scene;
    private readonly overview: Overview;
    private readonly journey = new Journey((address) => this.arriveAt(address));
    private readonly output = new PictureOutput(() => this.subject(), this.notices);

    constructor(
        private readonly root: HTMLElement,
        private readonly engine: Olvane,
    ) {
        const language = recall("language") ?? navigator.language;
        this.messages = messagesFor(language);
        this.ui = uiMessagesFor(language);
        this.scene = new Scene(this.surface, {
            chosen: (box) => this.focusOn(box.person, box),
            active: (box) => this.showInPanel(box.person || box.child),
            pointed: (box, element) => this.pointAt(box, element),
            moved: () => {
                this.tooltip.hide();
                this.overview?.follow();
            },
        });
        this.overview = new Overview(this.scene.camera);
        takeDrops(this.cover, (files) => void this.openDropped(files));
        addEventListener("keydown", (event) => this.key(event));
        new ResizeObserver(() => {
            this.scene.resized();
            this.overview.follow();
        }).observe(this.surface);
        this.speak();
    }

    // --- families ---

    openEmbedded(embedded: EmbeddedFamily): void {
        try {
            this.open(embedded.bytes, embedded.name, embedded);
        } catch (error) {
            this.refuse(embedded.name, error);
        }
    }

    // One family at a time: of several files the first is opened, and the page says so.
    async openDropped([file, ...others]: readonly File[]): Promise<void> {
        if (!file) return;
        this.notices.clear();
        this.welcome.showReading(file.name);
        await pause();
        try {
            if (file.size > kMostBytes) throw new TooLargeError();
            const bytes = new Uint8Array(await file.arrayBuffer());
            this.open(isArchive(bytes) ? await gedcomInArchive(bytes, kMostBytes) : bytes, file.name, null);
            if (others.length > 0) this.notices.tell(this.ui.firstOfFiles("\u2068" + file.name + "\u2069"));
        } catch (error) {
            this.refuse(file.name, error);
        }
        this.welcome.showReading(null);
    }

    private open(bytes: Uint8Array, name: string, embedded: EmbeddedFamily | null): void {
        const start = performance.now();
        const file = this.engine.readGedcom(bytes, name);
        if (file.persons.length === 0) {
            file.close();
            throw new NoPersonsError();
        }
        // Of an empty page only a link as it was followed is meant for the first file; what we wrote named
        // persons of another.
        const isLinked = embedded !== null || (this.family === null && history.state === null);
        const title = embedded?.title || name.replace(/\.(ged|gdz|gedcom|zip)$/i, "");
        const family = new OpenFamily(file, title, embedded?.livingHidden ?? false);
        this.family?.close();
        this.family = family;
        this.fileName = name;
        this.lastProblems = embedded?.remarks ?? file.diagnostics;
        this.picture = null;
        this.scene.clear();
        this.overview.clear();
        document.title = title;
        this.arrange();
        const usual: ViewState = {
            focus: family.person(embedded?.focus ?? 0)?.id ?? family.bestFocus(),
            view: embedded?.view === "pedigree" ? "pedigree" : "family",
            generations: kUsualGenerations,
            hidden: new Set(),
        };
        const address = isLinked ? location.hash : "";
        const state = readAddress(address, family.persons, usual);
        this.journey.begin(addressOf(state, family.persons), embedded !== null);
        // Where this picture cannot be had, others can: the search leads to them.
        if (!this.arrive(state, null)) this.state = state;
        performance.measure("olvane-open", { start });
        this.greet(family);
        this.nameStranger(address);
        this.warmUp(family, state);
        // Who was sent a page cannot mend the file behind it.
        if (!embedded && file.diagnostics.some((one) => one.severity === "error")) {
            const summary = this.ui.diagnostics.summary(family.persons.length, file.diagnostics.length);
            this.notices.warn(summary, this.ui.diagnostics.show, () => this.chrome.openDiagnostics());
        }
    }

    // Browsers compile well only what has run for a while, so a large picture is laid out a few times more while
    // nobody waits for it. The first click then is as quick as those after it.
    private warmUp(family: OpenFamily, state: ViewState, times = kWarmUps): void {
        setTimeout(() => {
            if (this.family !== family || !this.picture) return;
            const start = performance.now();
            family.picture(state);
            const isSlow = performance.now() - start > kWarmEnough;
            if (isSlow && times > 1) this.warmUp(family, state, times - 1);
        }, kWarmUpPause);
    }

    private greet(family: OpenFamily): void {
        if (recall("greeted") !== "yes") this.notices.tell(this.ui.firstHint);
        remember("greeted", "yes");
        if (family.livingHidden) this.notices.tell(this.ui.livingHidden);
    }

    private nameStranger(address: string): void {
        const link = strangerIn(address, this.family!.persons);
        if (link) this.notices.fail(this.ui.errors.stranger("\u2068" + link + "\u2069"), []);
    }

    private refuse(name: string, error: unknown): void {
        const { errors } = this.ui;
        const file = "\u2068" + name + "\u2069";
        if (error instanceof TooLargeError) return this.notices.fail(errors.notGedcom(file), [errors.tooLarge]);
        if (error instanceof ArchiveError) return this.notices.fail(errors.archive, []);
        if (error instanceof NoPersonsError) return this.notices.fail(errors.noPersons(file), []);
        const detail = error instanceof Error ? error.message : "";
        this.notices.fail(errors.notGedcom(file), [this.ui.diagnostics.remark(detail), errors.hint]);
    }

    // --- the way through the family ---

    focusOn(person: number, from: Box | null = null): void {
        if (!this.state || !person) return;
        if (person === this.state.focus) {
            if (this.picture) this.scene.activate(from ?? this.picture.focusBox, false);
            return;
        }
        this.travel({ ...this.state, focus: person }, from);
        this.panel.draw(false);
    }

    private travel(state: ViewState, from: Box | null = null): void {
        if (!this.family || (this.state && sameState(state, this.state))) return;
        if (!this.arrive(state, from)) return;
        this.journey.add(addressOf(state, this.family.persons));
        this.showState();
    }

    private arriveAt(address: string): void {
        if (!this.family || !this.state) return;
        const state = readAddress(address, this.family.persons, this.state);
        if (!sameState(state, this.state)) this.arrive(state, null);
        this.nameStranger(address);
        const shown = addressOf(this.state, this.family.persons);
        if (address !== shown) this.journey.replace(shown);
        this.showState();
    }

    // Lays out and draws. False where that was not possible; then everything is as before.
    private arrive(state: ViewState, from: Box | null): boolean {
        const { family } = this;
        if (!family) return false;
        const start = performance.now();
        let picture: Picture;
        try {
            picture = family.picture(state);
        } catch (error) {
            const isTooLarge = error instanceof LayoutError && error.status === "tooLarge";
            this.notices.fail(isTooLarge ? this.ui.errors.pictureTooLarge : this.ui.errors.layout, []);
            return false;
        }
        const isNewFocus = this.state?.focus !== state.focus;
        this.state = state;
        this.picture = picture;
        this.tooltip.hide();
        this.dress = this.newDress(family, picture);
        this.dress.kinshipKnown = family.persons.length <= kSoonSearched;
        this.scene.show(picture, this.dress, from);
        this.overview.show(picture, this.dress);
        this.nameTree();
        this.showState();
        this.learnKinships();
        const focus = family.person(state.focus)!;
        if (isNewFocus) this.live.textContent = this.ui.focusNow(this.nameOf(focus), picture.boxes.length);
        this.shownPerson = state.focus;
        this.refreshPanel();
        performance.measure("olvane-picture", { start });
        return true;
    }

    private newDress(family: OpenFamily, picture: Picture): PictureDress {
        return new PictureDress(family, picture, {
            messages: this.messages,
            ui: this.ui,
            kinshipInBoxes: this.kinshipInBoxes,
        });
    }

    // In a large family the boxes come first; what is written into them of kinship follows when there is
    // time.
    private learnKinships(): void {
        clearTimeout(this.kinshipTimer);
        if (this.dress?.kinshipKnown) return;
        this.kinshipTimer = window.setTimeout(() => {
            if (!this.dress || !this.family || !this.state) return;
            const start = performance.now();
            this.family.kinshipsTo(this.state.focus);
            this.dress.kinshipKnown = true;
            this.scene.redraw();
            performance.measure("olvane-kinship", { start });
        }, kKinshipDelay);
    }

    // --- what the bar and the keys do ---

    setView(view: ViewName): void {
        if (this.state) this.travel({ ...this.state, view });
    }

    setRelative(name: RelativeName, shown: boolean): void {
        if (!this.state) return;
        const hidden = new Set(this.state.hidden);
        if (shown) hidden.delete(name);
        else hidden.add(name);
        this.travel({ ...this.state, hidden });
    }

    setGenerations(generations: number): void {
        if (this.state) this.travel({ ...this.state, generations: clampGenerations(generations) });
    }

    setKinshipInBoxes(shown: boolean): void {
        this.kinshipInBoxes = shown;
        remember("kinship", shown ? "yes" : "no");
        this.dressAnew();
    }

    setTheme(theme: ThemeChoice): void {
        this.theme.choose(theme);
    }

    setLanguage(language: string): void {
        remember("language", language);
        this.messages = messagesFor(language);
        this.ui = uiMessagesFor(language);
        this.speak();
        document.getElementById(this.family ? "options-button" : "language")?.focus();
    }

    back(): void {
        this.journey.back();
    }

    forward(): void {
        this.journey.forward();
    }

    zoomIn(): void {
        this.scene.camera.zoomBy(1.35);
    }

    zoomOut(): void {
        this.scene.camera.zoomBy(1 / 1.35);
    }

    fit(): void {
        this.scene.fit();
    }

    home(): void {
        this.scene.home();
    }

    openFile(): void {
        this.input.click();
    }

    saveSvg(): void {
        this.output.saveSvg(this.ui);
    }

    savePng(): void {
        void this.output.savePng(this.ui);
    }

    print(): void {
        window.print();
    }

    togglePanel(): void {
        this.panelOpen = !this.panelOpen;
        remember("panel", this.panelOpen ? "yes" : "no");
        this.showPanelState();
    }

    moveKeys(direction: Direction): void {
        const { picture, family } = this;
        const from = this.scene.active ?? picture?.focusBox;
        if (!picture || !family || !from) return;
        const next = boxTowards(from, direction, picture, family);
        if (next) this.scene.activate(next);
    }

    panBy(dx: number, dy: number): void {
        this.scene.camera.panBy(dx, dy);
    }

    chooseActive(): void {
        const box = this.scene.active;
        if (box?.person) this.focusOn(box.person, box);
    }

    nextBox(person = this.scene.active?.person ?? 0): void {
        const boxes = this.picture?.boxesOf(person) ?? [];
        if (boxes.length < 2) return;
        const at = boxes.findIndex((box) => box === this.scene.active);
        this.scene.activate(boxes[(at + 1) % boxes.length]!);
    }

    switchView(): void {
        if (this.state) this.setView(this.state.view === "family" ? "pedigree" : "family");
    }

    startSearch(): void {
        this.chrome.search.input.focus();
    }

    escape(): void {
        this.tooltip.hide();
        this.notices.clear();
        this.chrome.closeLegend();
        this.panel.draw(false);
    }

    showKeys(): void {
        this.chrome.keys.showModal();
    }

    private key(event: KeyboardEvent): void {
        if (!this.family || event.defaultPrevented) return;
        if (document.querySelector("dialog[open]")) return;
        const target = event.target as Element;
        if (target.matches("input:not([type=checkbox]), select, textarea")) return;
        const inPicture = target === document.body || this.surface.contains(target);
        if (pictureKey(event, inPicture, this)) event.preventDefault();
    }

    // --- the search's questions ---

    find(text: string, limit: number): readonly Person[] {
        return this.family?.index.find(text, limit) ?? [];
    }

    nameOf(person: Person): string {
        return nameOf(person, this.messages);
    }

    yearsOf(person: Person): string {
        return yearsOf(person, this.messages);
    }

    kinshipOf(person: Person): string {
        return this.dress?.kinshipKnown ? this.dress.kinshipOf(person.id) : "";
    }

    choose(person: Person): void {
        this.focusOn(person.id, this.picture?.boxesOf(person.id)[0] ?? null);
        this.scene.active && this.scene.activate(this.scene.active);
    }

    // --- showing ---

    // Makes everything that holds words.
    private speak(): void {
        const { ui } = this;
        document.documentElement.lang = ui.language;
        this.chrome = new Chrome(ui, this, { theme: this.theme.choice, kinshipInBoxes: this.kinshipInBoxes });
        this.panel = new SidePanel(this.messages, ui, {
            choose: (person) => this.choose(this.family!.person(person)!),
            nextBox: (person) => this.nextBox(person),
            addressOf: (person) => addressOf({ ...this.state!, focus: person }, this.family!.persons),
        });
        this.welcome = new Welcome(ui, () => this.openFile(), this.languageChooser());
        this.notices.speak(ui.errors.dismiss);
        this.hint.textContent = ui.treeHint;
        this.cover.textContent = ui.welcome.dropNow;
        this.arrange();
        this.dressAnew();
    }

    private arrange(): void {
        const { family, chrome, panel, stage } = this;
        const always = [this.live, this.notices.element, this.cover, this.input, this.output.sheet.element];
        this.root.classList.toggle("empty", !family);
        if (!family) {
            this.root.replaceChildren(this.welcome.element, ...always);
            return;
        }
        chrome.corner.insertBefore(this.overview.element, chrome.corner.lastChild);
        stage.replaceChildren(this.hint, this.surface, chrome.corner, this.tooltip.element);
        this.root.replaceChildren(
            chrome.bar,
            stage,
            panel.element,
            chrome.keys,
            chrome.diagnostics,
            ...always,
        );
        chrome.showFamily(family.title, this.ui.personCount(family.persons.length));
        chrome.showDiagnostics(this.lastProblems, family.persons.length);
        this.showPanelState();
    }

    private dressAnew(): void {
        if (!this.family || !this.picture || !this.state) return;
        const known = this.dress?.kinshipKnown ?? false;
        this.dress = this.newDress(this.family, this.picture);
        this.dress.kinshipKnown = known;
        this.scene.dressAnew(this.dress);
        this.nameTree();
        this.showState();
        this.refreshPanel();
    }

    private showState(): void {
        if (this.state) this.chrome.showState(this.state, this.journey.canGoBack, this.journey.canGoForward);
    }

    private showPanelState(): void {
        this.root.classList.toggle("panel-closed", !this.panelOpen);
        this.chrome.showPanelState(this.panelOpen);
    }

    private showInPanel(person: number): void {
        if (!person || person === this.shownPerson) return;
        this.shownPerson = person;
        this.refreshPanel();
    }

    private refreshPanel(): void {
        const { family, state, picture } = this;
        const person = family?.person(this.shownPerson);
        if (!family || !state || !picture || !person) return;
        const isFocus = person.id === state.focus;
        this.panel.show(person, family, {
            focus: family.person(state.focus)!,
            kinship: isFocus ? "" : (this.dress?.kinshipOf(person.id) ?? ""),
            boxes: picture.boxesOf(person.id).length,
        });
    }

    private pointAt(box: Box | null, element: SVGGElement | null): void {
        const person = box ? this.family?.person(box.person) : undefined;
        this.scene.markTwins(person && this.picture!.boxesOf(person.id).length > 1 ? person.id : 0);
        if (!box || !person || !element || !this.dress) return this.tooltip.hide();
        const hidden = this.dress.hiddenOf(box);
        const boxes = this.picture!.boxesOf(person.id).length;
        this.tooltip.show(element, {
            name: this.nameOf(person),
            lines: [
                this.yearsOf(person),
                box === this.picture!.focusBox ? this.ui.inFocus : this.kinshipOf(person),
                hidden >= 0 ? this.ui.hiddenCount(hidden) : "",
                boxes > 1 ? this.ui.severalBoxes(boxes) : "",
            ],
        });
    }

    private nameTree(): void {
        if (!this.state) return;
        this.surface.setAttribute("aria-label", this.pictureTitle());
        this.surface.setAttribute("aria-describedby", "tree-hint");
    }

    private pictureTitle(): string {
        const focus = this.family?.person(this.state?.focus ?? 0);
        return focus ? this.ui.treeLabel(this.nameOf(focus), this.ui.views[this.state!.view]) : "";
    }

    private subject(): Subject | null {
        const { picture, dress, state } = this;
        const focus = this.family?.person(state?.focus ?? 0);
        if (!picture || !dress || !focus) return null;
        return {
            picture,
            dress,
            title: this.pictureTitle(),
            name: fileNameOf(this.fileName.replace(/\.[^.]*$/, ""), this.nameOf(focus)),
        };
    }

    private languageChooser(): HTMLElement {
        const select = html("select", { id: "language", "aria-label": this.ui.languageLabel });
        for (const { language, languageName } of uiLanguages) {
            select.append(
                html("option", { value: language, selected: language === this.ui.language }, languageName),
            );
        }
        select.addEventListener("change", () => this.setLanguage(select.value));
        return select;
    }
}

// What was read is GEDCOM, with nobody in it.
class NoPersonsError extends Error {}

// Lets the browser show what was said so far.
function pause(): Promise<void> {
    return new Promise((done) => setTimeout(done, 0));
}
