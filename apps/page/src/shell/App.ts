// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The page around the viewer: the bar, the dialogs, the address and what the browser's own history keeps of it.
// Files come in through FileOpening; everything about the picture is the viewer's.

import type { GedcomFile } from "olvane";
import { html, recall, remember } from "../base/dom";
import type { ViewName } from "../base/views";
import { OlvaneTree, type OlvaneTreeEvents } from "../element/OlvaneTree";
import type { EmbeddedFamily } from "../engine/engine";
import { mapInWorker } from "../engine/mapWorker";
import { Photographs } from "../engine/photographs";
import { type UiMessages, uiMessagesFor } from "../messages/ui";
import { PictureOutput, type Subject } from "../output/PictureOutput";
import { copyText, fileNameOf } from "../output/saving";
import { Notices } from "../ui/Notices";
import type { OuterKey } from "../ui/pictureKeys";
import { OpenFamily } from "../view/OpenFamily";
import { linkOf, looksIn } from "../view/SharedLink";
import { addressOf, kUsualState, readAddress, sameState, unknownPersonIn, type ViewState } from "../view/ViewState";
import { Chrome, type ChromeActions } from "./Chrome";
import { fileInput, takeDrops } from "./dropping";
import { FileOpening, type OpenedFile } from "./FileOpening";
import { FileRemarks } from "./FileRemarks";
import { Finding } from "./Finding";
import { FirstHint } from "./FirstHint";
import { Journey } from "./Journey";
import { canKeep, keepFile, keptFile, removeKeptFile } from "./KeptFile";
import { isMapAddress, mapComplaint, MapHost } from "./MapHost";
import { PictureSwitches } from "./PictureSwitches";
import { kThemeChoices, Theme, type ThemeChoice } from "./theme";
import { CancelledError, Reading } from "./Reading";
import { Welcome } from "./Welcome";

const kNarrow = "(max-width: 720px)"; // as in styles/shell.css
const kSoonChecked = 6000; // persons
const kCheckDelay = 1500; // ms

export class App implements ChromeActions {
    private ui: UiMessages;
    private chrome!: Chrome; // made by rebuildUi()
    private welcome!: Welcome;
    private fileName = "";
    private isKept = false; // the open file, in the browser
    private encoding = ""; // that was chosen; empty for the file's own word
    private remarks: FileRemarks | null = null;
    private panelOpen = recall("panel") !== "no";
    private kinshipInBoxes = recall("kinship") !== "no";
    private remarkTimer = 0;
    // Whether the next picture is one that the history leads to.
    private arriving = false;

    private readonly tree = document.createElement("olvane-tree") as OlvaneTree;
    private readonly theme = new Theme(this.tree);
    private readonly notices = new Notices();
    private readonly cover = html("div", { class: "cover", hidden: true });
    private readonly reading = new Reading();
    private readonly input = fileInput((file) => void this.openDropped([file]));
    // In a frame, steps do not fill the history of the page around it, unless "?history" asks for that.
    private readonly journey = new Journey(
        (address) => this.arriveAt(address),
        window.self !== window.top && !new URLSearchParams(location.search).has("history"),
    );
    private readonly firstHint = new FirstHint();
    private readonly maps = new MapHost({
        openPerson: (number) => this.leaveMap({ focus: number }),
        mapSettled: (address) => this.journey.replace(address),
    });
    private readonly switches = new PictureSwitches(this.tree);
    private readonly finding = new Finding(this.tree, this.maps);
    // The family beside an embedded map, which is read when somebody leaves the map.
    private unread: EmbeddedFamily | null = null;
    private isLayingOut = false; // a map
    private readonly output = new PictureOutput(() => this.subject(), this.notices);
    private paperDialog!: HTMLDialogElement;
    private readonly files: FileOpening;

    constructor(
        private readonly root: HTMLElement,
        engine: ConstructorParameters<typeof FileOpening>[0],
    ) {
        const language = recall("language") ?? navigator.language;
        this.ui = uiMessagesFor(language);
        this.files = new FileOpening(engine);
        this.tree.setAttribute("language", language);
        this.tree.setAttribute("kinship", this.kinshipInBoxes ? "boxes" : "none");
        this.listen();
        takeDrops(this.cover, (files) => void this.openDropped(files));
        addEventListener("keydown", (event) => this.key(event));
        this.rebuildUi();
    }

    // --- families ---

    openEmbedded(embedded: EmbeddedFamily): void {
        try {
            this.show(this.files.openEmbedded(embedded), embedded);
        } catch (error) {
            this.refuse(embedded.name, error);
        }
    }

    // The map that lies in the page, which stands before the family is read.
    async openMap(embedded: EmbeddedFamily, map: Promise<Uint8Array<ArrayBuffer>>): Promise<void> {
        const start = performance.now();
        const hasText = embedded.bytes.length > 0;
        try {
            this.maps.take(await map, embedded.focus);
        } catch (error) {
            if (hasText) this.openEmbedded(embedded);
            this.notices.fail(mapComplaint(error, this.ui), []);
            return;
        }
        const { hash } = location;
        // A link may lead past the map.
        if (hash !== "" && !isMapAddress(hash) && hasText) return this.openEmbedded(embedded);
        this.unread = embedded;
        this.fileName = embedded.name;
        this.remarks = new FileRemarks(this.files.engine, null, embedded.remarks ?? []);
        document.title = embedded.title;
        this.showMap(isMapAddress(hash) ? hash : `#map=&number=${embedded.focus}`);
        this.journey.begin(this.maps.address, true);
        this.showState();
        performance.measure("olvane-open", { start });
        if (embedded.livingHidden) this.notices.show(this.ui.livingHidden);
    }

    // One family at a time: of several files the first is opened, and the page says so.
    async openDropped([file, ...others]: readonly File[]): Promise<void> {
        if (!file) return;
        this.notices.clear();
        const signal = this.reading.begin(file.name, this.ui);
        await pause();
        try {
            const opened = await this.files.openFile(file, signal, (part) => this.reading.advance(part));
            // Another file than the kept one is kept only when that is asked for again.
            if (this.tree.family) this.isKept = false;
            this.encoding = "";
            this.show(opened, null);
            if (others.length > 0) this.notices.show(this.ui.firstOfFiles(quoted(file.name)));
        } catch (error) {
            this.refuse(file.name, error);
        }
        this.reading.end();
    }

    // isSame: the file that is shown already, read in another way.
    private show(
        { file, name, title, photographs }: OpenedFile,
        embedded: EmbeddedFamily | null,
        isSame = false,
    ): void {
        const start = performance.now();
        // Of an empty page only a link as it was followed is meant for the first file; what we wrote named
        // persons of another.
        const isLinked = isSame || embedded !== null || (this.tree.family === null && history.state === null);
        const family = new OpenFamily(file, title, embedded?.livingHidden ?? false, photographs);
        if (embedded) this.maps.hide();
        else this.maps.forget();
        this.unread = null;
        this.fileName = name;
        this.remarks = new FileRemarks(this.files.engine, file, embedded?.remarks ?? null);
        this.tree.setFamily(family);
        document.title = title;
        this.arrange();
        const usual = readAddress(embedded?.address ?? "", family.persons, {
            ...kUsualState,
            focus: family.person(embedded?.focus ?? 0)?.id ?? family.bestFocus(),
        });
        const address = isLinked ? location.hash : "";
        const state = readAddress(address, family.persons, usual);
        this.journey.begin(addressOf(state, family.persons), embedded !== null);
        this.arrive(state);
        performance.measure("olvane-open", { start });
        this.wearLooks(address);
        this.greet(family);
        this.nameUnknownPerson(address);
        this.tree.warmUp();
        if (isMapAddress(address)) this.setMap(address);
        if (!embedded) this.warnOfErrors(file);
    }

    // Who was sent a page cannot fix the file behind it.
    private warnOfErrors(file: GedcomFile): void {
        if (!file.diagnostics.some((one) => one.severity === "error")) return;
        const summary = this.ui.diagnostics.summary(file.persons.length, file.diagnostics.length);
        this.notices.warn(summary, this.ui.diagnostics.show, () => this.chrome.openDiagnostics());
    }

    private greet(family: OpenFamily): void {
        if (recall("greeted") !== "yes") this.showFirstHint();
        remember("greeted", "yes");
        if (family.livingHidden) this.notices.show(this.ui.livingHidden);
    }

    // Where a notice would lie over the picture, the hint has a row of its own.
    private showFirstHint(): void {
        if (!matchMedia(kNarrow).matches) return this.notices.show(this.ui.firstHint);
        this.firstHint.show(this.ui);
        this.arrange();
    }

    // What a link says of colours, language and zoom holds for this visit; what the reader chose before stays theirs.
    private wearLooks(address: string): void {
        const looks = looksIn(address, this.tree.family!.persons);
        if (looks.language && looks.language !== this.ui.language) this.speak(looks.language);
        const theme = kThemeChoices.find((choice) => choice === looks.theme);
        if (theme) this.theme.show(theme);
        if (looks.kinship === false) this.showKinship(false);
        if (theme || looks.kinship === false) this.rebuildUi();
        if (looks.selected) this.tree.select(looks.selected);
        if (looks.sight) this.tree.sight = looks.sight;
    }

    // A link that leads to nobody is named; one that leads somewhere takes the notice away.
    private nameUnknownPerson(address: string): void {
        const link = unknownPersonIn(address, this.tree.family!.persons);
        if (link) this.notices.fail(this.ui.errors.unknownPerson(quoted(link)), [], "link");
        else this.notices.clear("link");
    }

    private refuse(name: string, error: unknown): void {
        if (error instanceof CancelledError) return;
        const [text, details] = this.files.complaint(name, error, this.ui);
        this.notices.fail(text, details);
    }

    // --- the way through the family ---

    private arrive(state: ViewState): void {
        this.arriving = true;
        this.tree.show(state);
        this.arriving = false;
        this.showState();
    }

    private arriveAt(address: string): void {
        if (isMapAddress(address) && this.maps.isReady) {
            this.showMap(address);
            return this.maps.takeKeys();
        }
        if (isMapAddress(address) && this.tree.family) return this.setMap(address);
        if (this.unread && this.maps.isShown) return void this.readBesideMap();
        this.hideMap();
        const { family, state } = this.tree;
        if (!family || !state) return;
        const wanted = readAddress(address, family.persons, state);
        if (!sameState(wanted, state)) this.arrive(wanted);
        this.nameUnknownPerson(address);
        const shown = addressOf(this.tree.state!, family.persons);
        if (address !== shown) this.journey.replace(shown);
        this.showState();
    }

    private listen(): void {
        const on = <Name extends keyof OlvaneTreeEvents>(name: Name, act: (event: OlvaneTreeEvents[Name]) => void) =>
            this.tree.addEventListener(name, (event) => act(event as OlvaneTreeEvents[Name]));
        on("select", () => this.firstHint.hide());
        on("focuschange", ({ detail }) => {
            if (detail.byUser) this.firstHint.hide();
            if (!this.arriving) this.journey.add(addressOf(detail.state, this.tree.family!.persons));
            this.showState();
        });
        on("refused", ({ detail }) =>
            this.notices.fail(detail.tooLarge ? this.ui.errors.pictureTooLarge : this.ui.errors.layout, []),
        );
        on("outerkey", (event) => {
            if (this.outerKey(event.detail.key)) event.preventDefault();
        });
    }

    // --- what the bar and the keys do ---

    setView(view: ViewName): void {
        if (this.maps.isShown) this.leaveMap({ view });
        else this.switches.travel({ view });
    }

    // --- the map ---

    setMap(address = ""): void {
        const { state } = this.tree;
        if (this.maps.isShown) return;
        if (!this.maps.isReady) return void this.layOutMap(address);
        this.showMap(address || this.maps.address || `#map=&number=${state?.focus ?? 0}`);
        this.maps.takeKeys();
        this.journey.add(this.maps.address);
        this.showState();
    }

    private showMap(address: string): void {
        this.maps.reveal(this.ui);
        this.arrange();
        this.maps.show(this.ui, address);
    }

    // In a worker, or where the browser has none for a page like this, here.
    private async layOutMap(address: string): Promise<void> {
        const { family } = this.tree;
        const { source } = this.files;
        if (!family || !source || this.isLayingOut) return;
        this.isLayingOut = true;
        this.notices.show(this.ui.map.drawing, "map");
        try {
            const bytes = await mapInWorker(source).catch(() => family.file.mapIndex());
            if (this.tree.family !== family) return;
            this.maps.take(bytes, this.tree.state?.focus ?? 0);
            this.setMap(address);
        } catch (error) {
            this.notices.fail(mapComplaint(error, this.ui), []);
        } finally {
            this.isLayingOut = false;
            this.notices.clear("map");
        }
    }

    private hideMap(): void {
        if (!this.maps.isShown) return;
        this.maps.hide();
        this.arrange();
    }

    // To a view of the tree, of the person who is chosen on the map where nobody else is named.
    private leaveMap(change: Partial<ViewState>): void {
        const focus = change.focus || this.maps.number;
        const wanted = focus ? { ...change, focus } : change;
        const isNew = this.unread !== null;
        if (isNew && !this.readBesideMap(focus)) return;
        const { family, state } = this.tree;
        if (!family || !state) return;
        this.hideMap();
        if (!sameState({ ...state, ...wanted }, state)) this.switches.travel(wanted);
        else if (!isNew) this.journey.add(addressOf(state, family.persons));
        this.showState();
    }

    // A step of its own in the history, so that the way back leads to the map.
    private readBesideMap(focus = 0): boolean {
        const { unread } = this;
        if (!unread || unread.bytes.length === 0) {
            this.notices.show(this.ui.map.alone);
            return false;
        }
        this.journey.add(focus ? `#number=${focus}` : "#view=family");
        this.openEmbedded(unread);
        return this.tree.family !== null;
    }

    setKinshipInBoxes(shown: boolean): void {
        remember("kinship", shown ? "yes" : "no");
        this.showKinship(shown);
    }

    private showKinship(shown: boolean): void {
        this.kinshipInBoxes = shown;
        this.tree.setAttribute("kinship", shown ? "boxes" : "none");
    }

    setEncoding(encoding: string): void {
        try {
            const opened = this.files.readAgain(encoding);
            this.encoding = encoding;
            this.show(opened, null, true);
        } catch (error) {
            this.refuse(this.fileName, error);
        }
    }

    setTheme(theme: ThemeChoice): void {
        this.theme.choose(theme);
    }

    setLanguage(language: string): void {
        remember("language", language);
        this.speak(language);
        document.getElementById(this.tree.family ? "options-button" : "language")?.focus();
    }

    private speak(language: string): void {
        this.ui = uiMessagesFor(language);
        this.tree.setAttribute("language", language);
        this.rebuildUi();
    }

    back(): void {
        this.journey.back();
    }

    forward(): void {
        this.journey.forward();
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

    /** With everything that is seen: another browser shows the same. */
    async copyLink(): Promise<void> {
        const { state, family, sight, selected } = this.tree;
        if (!state || !family) return;
        const looks = {
            selected: selected?.id ?? 0,
            sight,
            language: this.ui.language,
            theme: this.theme.choice,
            kinship: this.kinshipInBoxes,
        };
        const link = location.href.replace(/#.*$/, "") + linkOf(state, looks, family.persons);
        if (await copyText(link)) this.notices.show(this.ui.linkCopied);
        else this.notices.fail(this.ui.linkNotCopied, [link]);
    }

    /** Keeps the open file in the browser for the next visit, or removes it. */
    async setKept(isKept: boolean): Promise<void> {
        if (!isKept) {
            await removeKeptFile();
            this.notices.show(this.ui.keep.removed);
        } else if (this.files.opened && !(await keepFile(this.files.opened))) {
            this.notices.fail(this.ui.keep.failed, []);
            isKept = false;
        }
        this.isKept = isKept;
        this.showKept();
    }

    /** Opens what was kept on an earlier visit. */
    async openKept(): Promise<void> {
        const kept = await keptFile();
        if (!kept) return this.files.warmUp();
        if (this.tree.family) return;
        this.isKept = true;
        await this.openDropped([new File([kept.bytes], kept.name)]);
    }

    // null where nothing can be kept: on disk, and of a family that lies in the page.
    private showKept(): void {
        this.chrome.showKept(canKeep() && this.files.opened ? this.isKept : null);
    }

    print(): void {
        window.print();
    }

    choosePaper(): void {
        this.output.choosePaper();
    }

    togglePanel(): void {
        this.panelOpen = !this.panelOpen;
        remember("panel", this.panelOpen ? "yes" : "no");
        this.showPanelState();
    }

    private switchView(): void {
        const { state } = this.tree;
        if (state) this.setView(state.view === "family" ? "pedigree" : "family");
    }

    private outerKey(key: OuterKey): boolean {
        if (key === "search") this.chrome.search.input.focus();
        else if (key === "keys") this.chrome.keys.showModal();
        else if (key === "back") this.back();
        else if (key === "forward") this.forward();
        else if (key === "switchView") this.switchView();
        else {
            this.notices.clear();
            this.tree.closeSheets();
        }
        return true;
    }

    // Keys pressed outside the viewer; those inside it have been acted on by the time they come here.
    private key(event: KeyboardEvent): void {
        if (event.defaultPrevented) return;
        if (document.querySelector("dialog[open]") || event.composedPath().includes(this.tree)) return;
        const target = event.target as Element;
        if (target.matches("input:not([type=checkbox]), select, textarea")) return;
        if (
            this.maps.isShown
                ? event.key === "/" && this.outerKey("search")
                : this.tree.family && this.tree.press(event)
        )
            event.preventDefault();
    }

    // --- showing ---

    // Makes everything that holds words.
    private rebuildUi(): void {
        const { ui } = this;
        document.documentElement.lang = ui.language;
        this.chrome = new Chrome(ui, this, this.switches, this.finding, {
            theme: this.theme.choice,
            kinshipInBoxes: this.kinshipInBoxes,
        });
        this.welcome = new Welcome(
            ui,
            () => this.openFile(),
            (language) => this.setLanguage(language),
        );
        this.notices.setDismissLabel(ui.errors.dismiss);
        this.cover.textContent = ui.welcome.dropNow;
        this.maps.rebuild(ui);
        this.paperDialog = this.output.rebuild(ui);
        this.arrange();
    }

    private arrange(): void {
        const { chrome, tree } = this;
        const { family } = tree;
        const always = [this.reading.element, this.notices.element, this.cover, this.input, this.output.sheet.element];
        const isEmpty = !family && !this.maps.isReady;
        this.root.classList.toggle("empty", isEmpty);
        if (isEmpty) {
            this.root.replaceChildren(this.welcome.element, ...always);
            return;
        }
        // The viewer stays where it is: taken out and put back, it would lose the keys.
        const main = tree.parentElement ?? html("main", { class: "viewer-place" }, tree, this.maps.element);
        tree.hidden = this.maps.isShown;
        for (const child of [...this.root.children]) if (child !== main) child.remove();
        if (!main.isConnected) this.root.append(main);
        main.before(chrome.bar);
        if (!this.firstHint.element.hidden) main.before(this.firstHint.element);
        this.root.append(chrome.keys, chrome.diagnostics, this.paperDialog, ...always);
        const count = family?.persons.length ?? this.maps.count;
        chrome.showFamily(family?.title ?? document.title, this.ui.personCount(count));
        this.showKept();
        chrome.showPhotos(family !== null && family.photographs !== Photographs.none);
        chrome.showEncoding(this.files.canReadAgain ? this.encoding : null);
        this.showRemarks();
        this.showPanelState();
        this.showState();
    }

    // The data of a large family are looked at when its picture is shown.
    private showRemarks(): void {
        const { chrome, remarks, ui } = this;
        const count = this.tree.family?.persons.length ?? this.maps.count;
        clearTimeout(this.remarkTimer);
        const list = (): void => chrome.showDiagnostics(remarks?.in(ui.language) ?? [], count);
        if (count <= kSoonChecked) list();
        else this.remarkTimer = window.setTimeout(list, kCheckDelay);
    }

    private showState(): void {
        const { isShown } = this.maps;
        const state = this.tree.state ?? (isShown ? kUsualState : null);
        if (state) this.chrome.showState(state, this.journey.canGoBack, this.journey.canGoForward);
        this.chrome.showMap(isShown);
    }

    private showPanelState(): void {
        this.tree.setAttribute("panel", this.panelOpen ? "open" : "closed");
        this.root.classList.toggle("panel-closed", !this.panelOpen);
        this.chrome.showPanelState(this.panelOpen);
    }

    private subject(): Subject | null {
        const { state, family, shownTitle } = this.tree;
        const focus = family?.person(state?.focus ?? 0);
        if (!shownTitle || !focus) return null;
        return {
            title: shownTitle,
            name: fileNameOf(this.fileName.replace(/\.[^.]*$/, ""), this.tree.nameOf(focus)),
            drawing: (theme) => this.tree.drawing(theme) ?? "",
            sheets: (paper) => this.tree.sheets(paper),
            look: (wanted) => void this.tree.show(wanted, null, true),
        };
    }
}

// Kept apart from the direction of the text around it.
function quoted(text: string): string {
    return "\u2068" + text + "\u2069";
}

// Lets the browser show what was said so far.
function pause(): Promise<void> {
    return new Promise((done) => setTimeout(done, 0));
}
