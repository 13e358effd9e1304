// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What stands around the picture: the bar, the dialogs, the notices and the page before any family. In which words and
// colours they are, and which of them are seen.

import { html, recall, remember } from "../base/dom";
import { Photographs } from "../engine/photographs";
import { uiMessagesFor } from "../messages/ui";
import { PictureOutput, type Subject } from "../output/PictureOutput";
import { fileNameOf } from "../output/saving";
import { looksIn, type SharedLooks } from "../view/SharedLink";
import { kUsualState } from "../view/ViewState";
import { Chrome, type ChromeActions } from "./Chrome";
import { fileInput, takeDrops } from "./dropping";
import { Finding } from "./Finding";
import { canKeep } from "./KeptFile";
import type { Page } from "./Page";
import { Reading } from "./Reading";
import { kThemeChoices, Theme, type ThemeChoice } from "./theme";
import { Welcome } from "./Welcome";

const kNarrow = "(max-width: 720px)"; // as in styles/shell.css
export const kFirstHint = "first hint"; // the subject of a notice
const kSoonChecked = 6000; // persons
const kCheckDelay = 1500; // ms

export class Panels {
    readonly reading = new Reading();
    readonly output: PictureOutput;
    private chrome!: Chrome; // made by rebuild()
    private welcome!: Welcome;
    private paperDialog!: HTMLDialogElement;
    private sideIsOpen = recall("panel") !== "no";
    private kinshipInBoxes = recall("kinship") !== "no";
    private remarkTimer = 0;
    private readonly theme: Theme;
    readonly finding: Finding;
    private readonly cover = html("div", { class: "cover", hidden: true });
    private readonly input: HTMLInputElement;

    constructor(
        private readonly root: HTMLElement,
        private readonly page: Page,
        private readonly actions: ChromeActions,
        open: (files: readonly File[]) => void,
    ) {
        this.theme = new Theme(page.tree);
        this.finding = new Finding(page.tree, page.maps, () => page.messages);
        this.output = new PictureOutput(() => this.subject(), page.notices);
        this.input = fileInput((file) => open([file]));
        takeDrops(this.cover, open);
        this.showKinship(this.kinshipInBoxes);
    }

    // --- words and colours ---

    /** Makes everything that holds words. */
    rebuild(): void {
        const { ui, maps, notices, files } = this.page;
        document.documentElement.lang = ui.language;
        this.chrome = new Chrome(ui, this.actions, this.page.switches, this.finding, {
            theme: this.theme.choice,
            kinshipInBoxes: this.kinshipInBoxes,
            encodings: files.engine.encodings,
        });
        this.welcome = new Welcome(
            ui,
            () => this.actions.openFile(),
            (language) => this.actions.setLanguage(language),
        );
        notices.setDismissLabel(ui.errors.dismiss);
        this.cover.textContent = ui.welcome.dropNow;
        maps.rebuild(ui);
        this.paperDialog = this.output.rebuild(ui, files.engine.papers);
        this.arrange();
    }

    setLanguage(language: string): void {
        remember("language", language);
        this.speak(language);
        document.getElementById(this.page.tree.family ? "options-button" : "language")?.focus();
    }

    setTheme(theme: ThemeChoice): void {
        this.theme.choose(theme);
    }

    setKinshipInBoxes(shown: boolean): void {
        remember("kinship", shown ? "yes" : "no");
        this.showKinship(shown);
    }

    get looks(): Pick<SharedLooks, "language" | "theme" | "kinship"> {
        return { language: this.page.ui.language, theme: this.theme.choice, kinship: this.kinshipInBoxes };
    }

    /** What a link says of colours, language and zoom holds for this visit; what the reader chose before stays theirs. */
    applyLooks(address: string): void {
        const { tree, ui } = this.page;
        const looks = looksIn(address, tree.family!.persons);
        if (looks.language && looks.language !== ui.language) this.speak(looks.language);
        const theme = kThemeChoices.find((choice) => choice === looks.theme);
        if (theme) this.theme.show(theme);
        if (looks.kinship === false) this.showKinship(false);
        if (theme || looks.kinship === false) this.rebuild();
        if (looks.selected) tree.select(looks.selected);
        if (looks.sight) tree.sight = looks.sight;
    }

    private speak(language: string): void {
        this.page.ui = uiMessagesFor(language);
        this.page.tree.setAttribute("language", language);
        this.rebuild();
    }

    private showKinship(shown: boolean): void {
        this.kinshipInBoxes = shown;
        this.page.tree.setAttribute("kinship", shown ? "boxes" : "none");
    }

    // --- what is seen ---

    /** Puts everything in its place, after a family, a map or the words have changed. */
    arrange(): void {
        const { tree, maps } = this.page;
        const isEmpty = !tree.family && !maps.isReady;
        this.root.classList.toggle("empty", isEmpty);
        if (isEmpty) this.root.replaceChildren(this.welcome.element, ...this.always());
        else this.arrangeViewer();
    }

    private arrangeViewer(): void {
        const { chrome, root } = this;
        const { tree, maps, firstHint } = this.page;
        // The viewer stays where it is: taken out and put back, it would lose the keys.
        const main = tree.parentElement ?? html("main", { class: "viewer-place" }, tree, maps.element);
        tree.hidden = maps.isShown;
        for (const child of [...root.children]) if (child !== main) child.remove();
        if (!main.isConnected) root.append(main);
        main.before(chrome.bar);
        if (!firstHint.element.hidden) main.before(firstHint.element);
        root.append(chrome.keys, chrome.diagnostics, this.paperDialog, ...this.always());
        this.showFamily();
        this.showRemarks();
        this.showSide();
        this.showState();
    }

    private always(): HTMLElement[] {
        return [this.reading.element, this.page.notices.element, this.cover, this.input, this.output.sheet.element];
    }

    private showFamily(): void {
        const { chrome, page } = this;
        const { family } = page.tree;
        chrome.showFamily(family?.title ?? document.title, page.ui.personCount(page.personCount));
        this.showKept();
        chrome.showPhotos(family !== null && family.photographs !== Photographs.none);
        chrome.showEncoding(page.files.canReadAgain ? page.encoding : null);
    }

    /** null where nothing can be kept: on disk, and of a family that lies in the page. */
    showKept(): void {
        const { files, isKept } = this.page;
        this.chrome.showKept(canKeep() && files.opened ? isKept : null);
    }

    // The data of a large family are looked at when its picture is shown.
    private showRemarks(): void {
        const { chrome, page } = this;
        const { remarks, ui, personCount } = page;
        clearTimeout(this.remarkTimer);
        const list = (): void => chrome.showDiagnostics(remarks?.in(ui.language) ?? [], personCount);
        if (personCount <= kSoonChecked) list();
        else this.remarkTimer = window.setTimeout(list, kCheckDelay);
    }

    /** Which view the bar shows as chosen, and where the way leads. */
    showState(): void {
        const { tree, maps, journey } = this.page;
        const { isShown } = maps;
        const state = tree.state ?? (isShown ? kUsualState : null);
        if (state) this.chrome.showState(state, journey.canGoBack, journey.canGoForward);
        this.chrome.showMap(isShown, maps.isMirrored);
    }

    toggleSide(): void {
        this.sideIsOpen = !this.sideIsOpen;
        remember("panel", this.sideIsOpen ? "yes" : "no");
        this.showSide();
    }

    private showSide(): void {
        this.page.tree.setAttribute("panel", this.sideIsOpen ? "open" : "closed");
        this.root.classList.toggle("panel-closed", !this.sideIsOpen);
        this.chrome.showPanelState(this.sideIsOpen);
    }

    // --- what is asked for ---

    chooseFile(): void {
        this.input.click();
    }

    focusSearch(): void {
        this.chrome.search.input.focus();
    }

    openKeys(): void {
        this.chrome.keys.showModal();
    }

    openDiagnostics(): void {
        this.chrome.openDiagnostics();
    }

    /** Where a notice would lie over the picture, the hint has a row of its own. */
    showFirstHint(): void {
        const { notices, firstHint, ui } = this.page;
        if (!matchMedia(kNarrow).matches) return notices.show(ui.firstHint, kFirstHint);
        firstHint.show(ui);
        this.arrange();
    }

    private subject(): Subject | null {
        const { tree, fileName } = this.page;
        const { state, family, shownTitle } = tree;
        const focus = family?.person(state?.focus ?? 0);
        if (!shownTitle || !focus) return null;
        return {
            title: shownTitle,
            name: fileNameOf(fileName.replace(/\.[^.]*$/, ""), tree.nameOf(focus)),
            drawing: (theme, inSight) => tree.drawing(theme, inSight) ?? "",
            sheets: (paper) => tree.sheets(paper),
            look: (wanted) => void tree.show(wanted, null, true),
        };
    }
}
