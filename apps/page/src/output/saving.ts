// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Hands files to the browser's downloads, and turns a drawing into pixels.

import { html } from "../base/dom";

const kMostSide = 12000; // px; beyond it some browsers hand out an empty canvas
const kMostPixels = 100e6;

export function saveFile(name: string, content: Blob): void {
    const address = URL.createObjectURL(content);
    const link = html("a", { href: address, download: name });
    document.body.append(link);
    link.click();
    link.remove();
    setTimeout(() => URL.revokeObjectURL(address), 60_000);
}

/** False where the browser lets no page write to the clipboard. */
export async function copyText(text: string): Promise<boolean> {
    try {
        await navigator.clipboard.writeText(text);
        return true;
    } catch {
        const field = html("textarea", { "aria-hidden": "true" }, text);
        document.body.append(field);
        field.select();
        const isCopied = document.execCommand("copy");
        field.remove();
        return isCopied;
    }
}

export function svgBlob(drawing: string): Blob {
    return new Blob([drawing], { type: "image/svg+xml" });
}

/** A drawing as an element of this document, with its size in px. */
export function drawingElement(drawing: string): { svg: SVGSVGElement; width: number; height: number } {
    const root = new DOMParser().parseFromString(drawing, "image/svg+xml").documentElement;
    const svg = document.importNode(root, true) as Element as SVGSVGElement;
    const [width, height] = [Number(svg.getAttribute("width")), Number(svg.getAttribute("height"))];
    return { svg, width, height };
}

export interface Size {
    readonly width: number;
    readonly height: number;
}

export interface Pixels {
    readonly blob: Blob;
    // 1 for all pixels that were asked for, less where that would be more than a browser can draw.
    readonly part: number;
}

/** size is in pixels. */
export async function pngOf(drawing: string, { width, height }: Size): Promise<Pixels> {
    const part = Math.min(1, kMostSide / Math.max(width, height), Math.sqrt(kMostPixels / (width * height)));
    const canvas = html("canvas", {
        width: Math.max(1, Math.floor(width * part)),
        height: Math.max(1, Math.floor(height * part)),
    });
    const pen = canvas.getContext("2d");
    if (!pen) throw new Error("no canvas");
    pen.drawImage(await imageOf(svgBlob(drawing)), 0, 0, canvas.width, canvas.height);
    const blob = await new Promise<Blob | null>((done) => canvas.toBlob(done, "image/png"));
    if (!blob) throw new Error("no picture");
    return { blob, part };
}

async function imageOf(blob: Blob): Promise<HTMLImageElement> {
    const address = URL.createObjectURL(blob);
    try {
        const image = new Image();
        image.src = address;
        await image.decode();
        return image;
    } finally {
        URL.revokeObjectURL(address);
    }
}

// "darwin-wedgwood - Charles Darwin"; without what file systems refuse.
export function fileNameOf(...parts: string[]): string {
    const plain = parts.map((part) =>
        part
            .replace(/[\\/:*?"<>|\p{Cc}\p{Cf}]+/gu, " ")
            .replace(/\s+/g, " ")
            .trim(),
    );
    return plain.filter(Boolean).join(" - ").slice(0, 100) || "family";
}
