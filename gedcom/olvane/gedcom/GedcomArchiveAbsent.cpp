// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Stands in for the archive reader where there is no zip library.

#include <olvane/gedcom/GedcomArchiveInternal.h>
#include <olvane/gedcom/GedcomError.h>
#include <olvane/gedcom/GedcomMedia.h>

namespace olvane::gedcom {

bool looksLikeArchive(std::string_view bytes) {
    return bytes.starts_with("PK\x03\x04");
}

std::string unpackGedcom(const std::string&, const std::string& name, DiagnosticList&) {
    throw GedcomError(name, "is an archive, and this program was built without zip");
}

std::optional<std::string> readFromArchive(const std::string&, const std::string&, std::string_view,
                                           std::size_t) {
    return {};
}

}  // namespace olvane::gedcom
