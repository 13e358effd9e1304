// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// How a family comes into the page: the one that lies in it, a file that is dropped or chosen, one that the browser has
// kept, or the same file in another encoding; and what the page says then.

import type { GedcomFile } from "olvane";
import { recall, remember } from "../base/dom";
import { quoted } from "../base/quoted";
import type { EmbeddedFamily } from "../engine/engine";
import { OpenFamily } from "../view/OpenFamily";
import { addressOf, kUsualState, readAddress } from "../view/ViewState";
import type { OpenedFile } from "./FileOpening";
import { FileRemarks } from "./FileRemarks";
import { keepFile, keptFile, removeKeptFile } from "./KeptFile";
import { isMapAddress, mapComplaint } from "./MapHost";
import type { Navigation } from "./Navigation";
import type { Page } from "./Page";
import type { Panels } from "./Panels";
import { CancelledError } from "./Reading";

export class Opening {
    // The reader's last wish to keep or remove the file, until it is done.
    private keeping: Promise<void> = Promise.resolve();

    constructor(
        private readonly page: Page,
        private readonly panels: Panels,
        private readonly navigation: Navigation,
    ) {}

    openEmbedded(embedded: EmbeddedFamily): void {
        try {
            this.show(this.page.files.openEmbedded(embedded), embedded);
        } catch (error) {
            this.refuse(embedded.name, error);
        }
    }

    /** The map that lies in the page, which stands before the family is read. */
    async openMap(embedded: EmbeddedFamily, map: Promise<Uint8Array<ArrayBuffer>>): Promise<void> {
        const start = performance.now();
        const { files, journey, maps, notices, ui } = this.page;
        const hasText = embedded.bytes.length > 0;
        try {
            maps.take(await map, embedded.focus);
        } catch (error) {
            if (hasText) this.openEmbedded(embedded);
            notices.fail(mapComplaint(error, ui), []);
            return;
        }
        const { hash } = location;
        // A link may lead past the map.
        if (hash !== "" && !isMapAddress(hash) && hasText) return this.openEmbedded(embedded);
        this.page.unread = embedded;
        this.page.fileName = embedded.name;
        this.page.remarks = new FileRemarks(files.engine, null, embedded.remarks ?? []);
        document.title = embedded.title;
        this.navigation.showMap(isMapAddress(hash) ? hash : `#map=&number=${embedded.focus}`);
        journey.begin(maps.address, true);
        this.panels.showState();
        performance.measure("olvane-open", { start });
        if (embedded.livingHidden) notices.show(ui.livingHidden);
    }

    /** One family at a time: of several files the first is opened, and the page says so. */
    async openDropped([file, ...others]: readonly File[]): Promise<void> {
        if (!file) return;
        const { page } = this;
        const { reading } = this.panels;
        page.notices.clear();
        const signal = reading.begin(file.name, page.ui);
        await pause();
        try {
            const opened = await page.files.openFile(file, signal, (part) => reading.advance(part));
            // Another file than the kept one is kept only when that is asked for again.
            if (page.tree.family) page.isKept = false;
            page.encoding = "";
            this.show(opened, null);
            if (others.length > 0) page.notices.show(page.ui.firstOfFiles(quoted(file.name)));
        } catch (error) {
            this.refuse(file.name, error);
        }
        reading.end(signal);
    }

    setEncoding(encoding: string): void {
        const { page } = this;
        try {
            const opened = page.files.readAgain(encoding);
            page.encoding = encoding;
            this.show(opened, null, true);
        } catch (error) {
            this.refuse(page.fileName, error);
        }
    }

    /** Keeps the open file in the browser for the next visit, or removes it, each wish after the one before. */
    setKept(isKept: boolean): Promise<void> {
        this.keeping = this.keeping.then(() => (isKept ? this.keep() : this.remove()));
        return this.keeping;
    }

    private async keep(): Promise<void> {
        const { page } = this;
        const { files, notices, ui } = page;
        if (!files.opened) return;
        const isStored = await keepFile(files.opened);
        if (isStored) notices.show(ui.keep.kept);
        else notices.fail(ui.keep.failed, []);
        page.isKept = isStored;
        this.panels.showKept();
    }

    private async remove(): Promise<void> {
        const { page } = this;
        const { notices, ui } = page;
        const isRemoved = await removeKeptFile();
        if (isRemoved) notices.show(ui.keep.removed);
        else notices.fail(ui.keep.notRemoved, []);
        page.isKept = !isRemoved;
        this.panels.showKept();
    }

    /** Opens what was kept on an earlier visit. */
    async openKept(): Promise<void> {
        const { page } = this;
        const kept = await keptFile();
        if (!kept) return page.files.warmUp();
        // What is chosen while the browser looks for it counts more.
        if (page.tree.family || this.panels.reading.isUnderWay) return;
        page.isKept = true;
        await this.openDropped([new File([kept.bytes], kept.name)]);
    }

    // --- the family that was read ---

    // isSame: the file that is shown already, read in another way.
    private show(opened: OpenedFile, embedded: EmbeddedFamily | null, isSame = false): void {
        const start = performance.now();
        // Of an empty page only a link as it was followed is meant for the first file; what we wrote named
        // persons of another.
        const isFirst = this.page.tree.family === null && history.state === null;
        const address = isSame || embedded || isFirst ? location.hash : "";
        const family = this.install(opened, embedded);
        this.panels.arrange();
        this.beginAt(address, family, embedded);
        performance.measure("olvane-open", { start });
        this.panels.applyLooks(address);
        this.greet(family);
        this.navigation.nameUnknownPerson(address);
        this.page.tree.warmUp();
        this.panels.finding.prepare();
        if (isMapAddress(address)) this.navigation.setMap(address);
        if (!embedded) this.warnOfErrors(opened.file);
    }

    // In the place of the family before.
    private install({ file, name, title, photographs }: OpenedFile, embedded: EmbeddedFamily | null): OpenFamily {
        const { page } = this;
        const family = new OpenFamily(file, title, embedded?.livingHidden ?? false, photographs);
        if (embedded) page.maps.hide();
        else page.maps.forget();
        page.unread = null;
        page.fileName = name;
        page.remarks = new FileRemarks(page.files.engine, file, embedded?.remarks ?? null);
        page.tree.setFamily(family);
        document.title = title;
        return family;
    }

    private beginAt(address: string, family: OpenFamily, embedded: EmbeddedFamily | null): void {
        const usual = readAddress(embedded?.address ?? "", family.persons, {
            ...kUsualState,
            focus: family.person(embedded?.focus ?? 0)?.id ?? family.bestFocus(),
        });
        const state = readAddress(address, family.persons, usual);
        this.page.journey.begin(addressOf(state, family.persons), embedded !== null);
        this.navigation.arrive(state);
    }

    private greet(family: OpenFamily): void {
        if (recall("greeted") !== "yes") this.panels.showFirstHint();
        remember("greeted", "yes");
        if (family.livingHidden) this.page.notices.show(this.page.ui.livingHidden);
    }

    // Who was sent a page cannot fix the file behind it.
    private warnOfErrors(file: GedcomFile): void {
        if (!file.diagnostics.some((one) => one.severity === "error")) return;
        const { diagnostics } = this.page.ui;
        const summary = diagnostics.summary(file.persons.length, file.diagnostics.length);
        this.page.notices.warn(summary, diagnostics.show, () => this.panels.openDiagnostics());
    }

    private refuse(name: string, error: unknown): void {
        if (error instanceof CancelledError) return;
        const { files, notices, ui } = this.page;
        const [text, details] = files.complaint(name, error, ui);
        notices.fail(text, details);
    }
}

// Lets the browser show what was said so far.
function pause(): Promise<void> {
    return new Promise((done) => setTimeout(done, 0));
}
