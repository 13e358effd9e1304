// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Makes elements. Texts of a file reach the page through here alone, and always as text: nothing in this page
// ever parses markup.

const kSvg = "http://www.w3.org/2000/svg";

type Child = Node | string | null | undefined | false;
type Attributes = Record<string, string | number | boolean | null | undefined>;

// true is an attribute without a value; false, null and undefined leave it out.
export function setAttributes(element: Element, attributes: Attributes): void {
    for (const [name, value] of Object.entries(attributes)) {
        if (value === false || value === null || value === undefined) element.removeAttribute(name);
        else element.setAttribute(name, value === true ? "" : String(value));
    }
}

export function html<Tag extends keyof HTMLElementTagNameMap>(
    tag: Tag,
    attributes: Attributes = {},
    ...children: Child[]
): HTMLElementTagNameMap[Tag] {
    const element = document.createElement(tag);
    setAttributes(element, attributes);
    appendAll(element, children);
    return element;
}

export function svg<Tag extends keyof SVGElementTagNameMap>(
    tag: Tag,
    attributes: Attributes = {},
    ...children: Child[]
): SVGElementTagNameMap[Tag] {
    const element = document.createElementNS(kSvg, tag);
    setAttributes(element, attributes);
    appendAll(element, children);
    return element;
}

export function appendAll(element: Element, children: readonly Child[]): void {
    for (const child of children) if (child) element.append(child);
}

// Text that a file holds, kept apart from the direction of the text around it.
export function isolated(text: string, className?: string): HTMLElement {
    return html("bdi", { class: className }, text);
}

export function onClick(element: HTMLElement, action: (event: MouseEvent) => void): void {
    element.addEventListener("click", action);
}

// What other programs write to local storage may be missing, or forbidden in a file opened from disk.
export function remember(key: string, value: string): void {
    try {
        localStorage.setItem("olvane." + key, value);
    } catch {
        // The choice then lasts as long as the page is open.
    }
}

export function recall(key: string): string | null {
    try {
        return localStorage.getItem("olvane." + key);
    } catch {
        return null;
    }
}

// Asked for while pictures are drawn, when a question to the browser would have it lay out the page at once.
const stillness = matchMedia("(prefers-reduced-motion: reduce)");
let still = stillness.matches;
stillness.addEventListener("change", () => (still = stillness.matches));

export function prefersStillness(): boolean {
    return still;
}
