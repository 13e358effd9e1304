// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The page's first script: unpacks its style, its code and the engine, which lie in it as letters, and runs the code.
// The page's policy names the hash of each of them.

import { bytesOfLetters, joinModule, unpackLzma } from "olvane-unpack";

const packed = document.getElementById("olvane-parts")!;
const whole = unpackLzma(bytesOfLetters(packed.textContent ?? ""));
const styleSize = Number(packed.dataset["style"]);
const engineStart = styleSize + Number(packed.dataset["script"]);
const textOf = (begin: number, end: number): string => new TextDecoder().decode(whole.subarray(begin, end));

const style = document.createElement("style");
style.textContent = textOf(0, styleSize);
document.head.append(style);
const script = document.createElement("script");
script.textContent = textOf(styleSize, engineStart);
self.olvanePage = { script: script.textContent, engine: joinModule(whole.subarray(engineStart)) };
// It runs as it is put in, once: a page that is saved as it stands does not hold it twice.
document.body.append(script);
script.remove();
