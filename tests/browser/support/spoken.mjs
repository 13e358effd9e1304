// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What a screen reader gets, as a text to read: the accessibility tree of Chromium, line by line.

const kWholeNames = new Set([
    "button",
    "link",
    "heading",
    "option",
    "switch",
    "checkbox",
    "combobox",
    "textbox",
    "searchbox",
    "slider",
    "image",
    "img",
    "DisclosureTriangle",
    "ListBoxOption",
]);
const kAreas = new Set([
    "region",
    "complementary",
    "main",
    "banner",
    "dialog",
    "group",
    "application",
    "navigation",
    "search",
    "listbox",
    "list",
    "ListBox",
    "status",
    "alert",
]);

const nameOf = (node) =>
    (node.name?.value ?? "")
        .replace(/[\u2066-\u2069]/g, "")
        .replace(/\s+/g, " ")
        .trim();

function statesOf(node) {
    const states = Object.fromEntries((node.properties ?? []).map(({ name, value }) => [name, value.value]));
    const words = [];
    if (states.pressed === "true") words.push("pressed");
    if (states.checked === "true") words.push("on");
    if (states.checked === "false") words.push("off");
    if (states.expanded === true) words.push("expanded");
    if (states.expanded === false) words.push("collapsed");
    if (states.selected === true) words.push("selected");
    if (states.disabled === true) words.push("not available");
    if (states.focused === true) words.push("has the keys");
    return words.length > 0 ? ` (${words.join(", ")})` : "";
}

/** The part of the page that a selector finds, in it or in the viewer, as lines. */
export async function spoken(visit, selector) {
    const session = await visit.context.newCDPSession(visit.page);
    const { nodes } = await session.send("Accessibility.getFullAXTree");
    const { result } = await session.send("Runtime.evaluate", { expression: `one(${JSON.stringify(selector)})` });
    const { node: wanted } = await session.send("DOM.describeNode", { objectId: result.objectId });
    await session.detach();
    const byId = new Map(nodes.map((node) => [node.nodeId, node]));
    const children = (node) => (node.childIds ?? []).map((id) => byId.get(id)).filter(Boolean);
    const textOf = (node) => {
        if (!node.ignored && node.role?.value === "StaticText") return nameOf(node);
        return children(node).map(textOf).filter(Boolean).join(" ");
    };
    const lines = [];
    const read = (node, depth) => {
        const role = node.role?.value ?? "";
        const add = (text) => lines.push("  ".repeat(depth) + text);
        if (node.ignored || role === "generic" || role === "none")
            return children(node).forEach((child) => read(child, depth));
        if (role === "StaticText" || role === "paragraph") return textOf(node) && add(textOf(node));
        if (role === "heading") return add(`== ${nameOf(node)} ==`);
        if (role === "term") return add(textOf(node) + ":");
        if (role === "definition") return children(node).forEach((child) => read(child, depth + 1));
        if (kWholeNames.has(role))
            return (
                nameOf(node) &&
                add(`${role === "DisclosureTriangle" ? "button" : role}: ${nameOf(node)}${statesOf(node)}`)
            );
        const isArea = kAreas.has(role) && nameOf(node) !== "";
        if (isArea) add(`[${role}: ${nameOf(node)}]${statesOf(node)}`);
        children(node).forEach((child) => read(child, isArea ? depth + 1 : depth));
    };
    const root = nodes.find(({ backendDOMNodeId }) => backendDOMNodeId === wanted.backendNodeId);
    if (root) read(root, 0);
    return lines;
}

/** Of whatever has the keys: what is read out when they come to it. */
export async function announced(visit) {
    return visit.page.evaluate(() => {
        const part = holder();
        const label = part?.getAttribute("aria-label") ?? part?.textContent ?? "";
        const isCurrent = part?.getAttribute("aria-current") === "true" ? " (current)" : "";
        return label.replace(/[\u2066-\u2069]/g, "") + isCurrent;
    });
}
