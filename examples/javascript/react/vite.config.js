// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
export default { base: "./", esbuild: { jsx: "automatic" }, build: { chunkSizeWarningLimit: 1000 } };
