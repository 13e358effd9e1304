// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A worker for Olvane.readGedcomIn: new Worker(new URL("readingWorker.mjs", import.meta.url), { type: "module" })

import { serveReading } from "./reading.mjs";

serveReading(globalThis);
