// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The way through the family: which picture or map is shown, what the address and the browser's history keep of it, and
// how both lead back to it.

import { quoted } from "../base/quoted";
import type { ViewName } from "../base/views";
import type { OlvaneTreeEvents } from "../element/treeTypes";
import { mapInWorker } from "../engine/mapWorker";
import { copyText } from "../output/saving";
import { linkOf } from "../view/SharedLink";
import { addressOf, readAddress, sameState, unknownPersonIn, type ViewState } from "../view/ViewState";
import { isMapAddress, mapComplaint } from "./MapHost";
import type { Page } from "./Page";
import { kFirstHint, type Panels } from "./Panels";

export class Navigation {
    private isArriving = false; // the next picture is one that the history leads to
    private isLayingOut = false; // a map

    // openUnread shows the family beside the embedded map.
    constructor(
        private readonly page: Page,
        private readonly panels: Panels,
        private readonly openUnread: () => void,
    ) {
        this.listen();
    }

    // --- the tree ---

    private listen(): void {
        const { tree, notices, firstHint, journey } = this.page;
        const on = <Name extends keyof OlvaneTreeEvents>(name: Name, act: (event: OlvaneTreeEvents[Name]) => void) =>
            tree.addEventListener(name, (event) => act(event as OlvaneTreeEvents[Name]));
        const wasUsed = (): void => {
            firstHint.hide();
            notices.clear(kFirstHint);
        };
        on("select", wasUsed);
        on("focuschange", ({ detail }) => {
            if (detail.byUser) wasUsed();
            if (!this.isArriving) journey.add(addressOf(detail.state, tree.family!.persons));
            this.panels.showState();
        });
        on("refused", ({ detail }) => {
            const { errors } = this.page.ui;
            notices.fail(detail.tooLarge ? errors.pictureTooLarge : errors.layout, []);
        });
    }

    setView(view: ViewName): void {
        if (this.page.maps.isShown) this.leaveMap({ view });
        else this.page.switches.travel({ view });
    }

    /** Between the engine's two views. */
    switchView(): void {
        const { state } = this.page.tree;
        if (state) this.setView(state.view === "family" ? "pedigree" : "family");
    }

    /** Shows what an address stands for, without a step of its own in the history. */
    arrive(state: ViewState): void {
        this.isArriving = true;
        this.page.tree.show(state);
        this.isArriving = false;
        this.panels.showState();
    }

    arriveAt(address: string): void {
        const { tree, maps, unread } = this.page;
        if (isMapAddress(address) && maps.isReady) {
            this.showMap(address);
            return maps.takeKeys();
        }
        if (isMapAddress(address) && tree.family) return this.setMap(address);
        if (unread && maps.isShown) return void this.readBesideMap();
        this.hideMap();
        this.arriveAtPicture(address);
    }

    private arriveAtPicture(address: string): void {
        const { tree, journey } = this.page;
        const { family, state } = tree;
        if (!family || !state) return;
        const wanted = readAddress(address, family.persons, state);
        if (!sameState(wanted, state)) this.arrive(wanted);
        this.nameUnknownPerson(address);
        const shown = addressOf(tree.state!, family.persons);
        if (address !== shown) journey.replace(shown);
        this.panels.showState();
    }

    /** A link that leads to nobody is named; one that leads somewhere takes the notice away. */
    nameUnknownPerson(address: string): void {
        const { tree, notices, ui } = this.page;
        const link = unknownPersonIn(address, tree.family!.persons);
        if (link) notices.fail(ui.errors.unknownPerson(quoted(link)), [], "link");
        else notices.clear("link");
    }

    /** With everything that is seen: another browser shows the same. */
    async copyLink(): Promise<void> {
        const { notices, tree, ui } = this.page;
        const { state, family, sight, selected } = tree;
        if (!state || !family) return;
        const looks = { ...this.panels.looks, selected: selected?.id ?? 0, sight };
        const link = location.href.replace(/#.*$/, "") + linkOf(state, looks, family.persons);
        if (await copyText(link)) notices.show(ui.linkCopied);
        else notices.fail(ui.linkNotCopied, [link]);
    }

    // --- the map ---

    setMap(address = ""): void {
        const { tree, maps, journey } = this.page;
        if (maps.isShown) return;
        if (!maps.isReady) return void this.layOutMap(address);
        const turned = tree.state?.mirrored ? "&mirror=yes" : "";
        this.showMap(address || maps.address || `#map=&number=${tree.state?.focus ?? 0}${turned}`);
        maps.takeKeys();
        journey.add(maps.address);
        this.panels.showState();
    }

    showMap(address: string): void {
        const { maps, ui } = this.page;
        maps.reveal(ui);
        this.panels.arrange();
        maps.show(ui, address);
        this.panels.showState();
    }

    /** Exchanges right and left, of the map or of the tree. */
    setMirrored(isMirrored: boolean): void {
        const { maps, switches, journey, ui } = this.page;
        if (!maps.isShown) return switches.setMirrored(isMirrored);
        maps.setMirrored(ui, isMirrored);
        journey.add(maps.address);
        this.panels.showState();
    }

    private hideMap(): void {
        if (!this.page.maps.isShown) return;
        this.page.maps.hide();
        this.panels.arrange();
    }

    // In a worker, or where the browser has none for a page like this, here.
    private async layOutMap(address: string): Promise<void> {
        const { tree, maps, notices, ui } = this.page;
        const { family } = tree;
        const { source } = this.page.files;
        if (!family || !source || this.isLayingOut) return;
        this.isLayingOut = true;
        notices.show(ui.map.drawing, "map");
        try {
            const bytes = await mapInWorker(source).catch(() => family.file.mapIndex());
            if (tree.family !== family) return;
            maps.take(bytes, tree.state?.focus ?? 0);
            this.setMap(address);
        } catch (error) {
            notices.fail(mapComplaint(error, this.page.ui), []);
        } finally {
            this.isLayingOut = false;
            notices.clear("map");
        }
    }

    /** To a view of the tree, of the person who is chosen on the map where nobody else is named. */
    leaveMap(change: Partial<ViewState>): void {
        const { tree, maps, switches, journey, unread } = this.page;
        const focus = change.focus || maps.number;
        const wanted = focus ? { ...change, focus } : change;
        if (unread && !this.readBesideMap(focus)) return;
        const { family, state } = tree;
        if (!family || !state) return;
        this.hideMap();
        if (!sameState({ ...state, ...wanted }, state)) switches.travel(wanted);
        else if (!unread) journey.add(addressOf(state, family.persons));
        this.panels.showState();
    }

    // A step of its own in the history, so that the way back leads to the map.
    private readBesideMap(focus = 0): boolean {
        const { tree, journey, notices, unread, ui } = this.page;
        if (!unread || unread.bytes.length === 0) {
            notices.show(ui.map.alone);
            return false;
        }
        journey.add(focus ? `#number=${focus}` : "#view=family");
        this.openUnread();
        return tree.family !== null;
    }
}
