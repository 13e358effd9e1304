// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// From bytes to data: unpack an archive, settle the encoding, read the records, resolve the links. The text
// stays where it was read to, and nearly everything that is kept is a view into it.

#include <olvane/gedcom/GedcomReader.h>

#include <memory>
#include <utility>

#include <olvane/gedcom/DetailReaderInternal.h>
#include <olvane/gedcom/DiagnosticListInternal.h>
#include <olvane/gedcom/GedcomArchiveInternal.h>
#include <olvane/gedcom/LineScannerInternal.h>
#include <olvane/gedcom/LinkResolverInternal.h>
#include <olvane/gedcom/RecordReaderInternal.h>
#include <olvane/gedcom/TextEncodingInternal.h>
#include <olvane/gedcom/TextInternerInternal.h>
#include <olvane/gedcom/XrefTableInternal.h>

namespace olvane::gedcom {

GedcomData readGedcomBytes(std::string bytes, const std::string& name, const ReadOptions& options) {
    if (bytes.empty()) throw GedcomError(name, "is empty");
    DiagnosticList diagnostics(name, options.diagnosticsPerKind);
    const auto store = std::make_shared<TextStore>();
    store->bytes = looksLikeArchive(bytes) ? unpackGedcom(bytes, name, diagnostics) : std::move(bytes);
    const TextForm form = prepareText(store->bytes, name, options.encoding, diagnostics);

    const auto xrefs = std::make_shared<XrefTable>();
    GedcomTables tables;
    LineScanner scanner(store->bytes, diagnostics);
    TextInterner interner(*store, form, diagnostics);
    DetailReader details(scanner, interner, tables);
    RecordReader records(scanner, interner, tables, *xrefs, diagnostics, options.facts || options.details,
                         options.details ? &details : nullptr);
    if (!records.readAll(options.progress)) throw GedcomError(name, "holds nothing that looks like GEDCOM");
    resolveLinks(tables, *xrefs, diagnostics);

    tables.text = store;
    tables.xrefs = xrefs;
    tables.diagnostics = diagnostics.take();
    tables.file = name;
    tables.encoding = form.encoding->name;
    tables.version = form.version;
    return GedcomData(std::move(tables));
}

}  // namespace olvane::gedcom
