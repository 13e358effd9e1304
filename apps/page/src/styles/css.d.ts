// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A style sheet is imported as its text.
declare module "*.css" {
    const text: string;
    export default text;
}
