// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The rendering libraries, by name and version of their interfaces.

#include <cli/RenderLibraries.h>

#include <cli/SharedLibrary.h>

namespace olvane::cli {

namespace {

SharedLibrary opened(const char* name) {
    return {name, "PNG and PDF need librsvg 2.48 and cairo", "an .svg can be written without them"};
}

RenderLibraries openLibraries() {
    const SharedLibrary rsvg = opened("librsvg-2.so.2");
    const SharedLibrary cairo = opened("libcairo.so.2");
    const SharedLibrary fontconfig = opened("libfontconfig.so.1");
    const SharedLibrary gobject = opened("libgobject-2.0.so.0");
    const SharedLibrary glib = opened("libglib-2.0.so.0");
    RenderLibraries all;
#define OLVANE_LOAD(library, symbol) (library).load(all.symbol, #symbol)
    OLVANE_LOAD(rsvg, rsvg_handle_new_from_data);
    OLVANE_LOAD(rsvg, rsvg_handle_set_dpi);
    OLVANE_LOAD(rsvg, rsvg_handle_render_document);
    OLVANE_LOAD(cairo, cairo_create);
    OLVANE_LOAD(cairo, cairo_destroy);
    OLVANE_LOAD(cairo, cairo_scale);
    OLVANE_LOAD(cairo, cairo_show_page);
    OLVANE_LOAD(cairo, cairo_status);
    OLVANE_LOAD(cairo, cairo_status_to_string);
    OLVANE_LOAD(cairo, cairo_surface_destroy);
    OLVANE_LOAD(cairo, cairo_surface_finish);
    OLVANE_LOAD(cairo, cairo_surface_status);
    OLVANE_LOAD(cairo, cairo_surface_write_to_png_stream);
    OLVANE_LOAD(cairo, cairo_image_surface_create);
    OLVANE_LOAD(cairo, cairo_pdf_surface_create_for_stream);
    OLVANE_LOAD(cairo, cairo_pdf_surface_set_size);
    OLVANE_LOAD(cairo, cairo_pdf_surface_set_metadata);
    OLVANE_LOAD(fontconfig, FcPatternCreate);
    OLVANE_LOAD(fontconfig, FcPatternDestroy);
    OLVANE_LOAD(fontconfig, FcConfigSubstitute);
    OLVANE_LOAD(fontconfig, FcDefaultSubstitute);
    OLVANE_LOAD(fontconfig, FcFontSort);
    OLVANE_LOAD(fontconfig, FcFontSetDestroy);
    OLVANE_LOAD(fontconfig, FcCharSetHasChar);
    OLVANE_LOAD(fontconfig, FcCharSetDestroy);
    OLVANE_LOAD(gobject, g_object_unref);
    OLVANE_LOAD(glib, g_error_free);
#undef OLVANE_LOAD
    return all;
}

}  // namespace

const RenderLibraries& renderLibraries() {
    static const RenderLibraries kLibraries = openLibraries();
    return kLibraries;
}

}  // namespace olvane::cli
