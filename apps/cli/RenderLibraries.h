// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cairo-pdf.h>
#include <cairo.h>
#include <fontconfig/fontconfig.h>
#include <librsvg/rsvg.h>

namespace olvane::cli {

// The operations of librsvg, cairo and their kin that pictures are converted with, by the names that they
// have there.
struct RenderLibraries {
    decltype(&::rsvg_handle_new_from_data) rsvg_handle_new_from_data;
    decltype(&::rsvg_handle_set_dpi) rsvg_handle_set_dpi;
    decltype(&::rsvg_handle_render_document) rsvg_handle_render_document;
    decltype(&::cairo_create) cairo_create;
    decltype(&::cairo_destroy) cairo_destroy;
    decltype(&::cairo_scale) cairo_scale;
    decltype(&::cairo_show_page) cairo_show_page;
    decltype(&::cairo_status) cairo_status;
    decltype(&::cairo_status_to_string) cairo_status_to_string;
    decltype(&::cairo_surface_destroy) cairo_surface_destroy;
    decltype(&::cairo_surface_finish) cairo_surface_finish;
    decltype(&::cairo_surface_status) cairo_surface_status;
    decltype(&::cairo_surface_write_to_png_stream) cairo_surface_write_to_png_stream;
    decltype(&::cairo_image_surface_create) cairo_image_surface_create;
    decltype(&::cairo_pdf_surface_create_for_stream) cairo_pdf_surface_create_for_stream;
    decltype(&::cairo_pdf_surface_set_size) cairo_pdf_surface_set_size;
    decltype(&::cairo_pdf_surface_set_metadata) cairo_pdf_surface_set_metadata;
    decltype(&::FcPatternCreate) FcPatternCreate;
    decltype(&::FcPatternDestroy) FcPatternDestroy;
    decltype(&::FcConfigSubstitute) FcConfigSubstitute;
    decltype(&::FcDefaultSubstitute) FcDefaultSubstitute;
    decltype(&::FcFontSort) FcFontSort;
    decltype(&::FcFontSetDestroy) FcFontSetDestroy;
    decltype(&::FcCharSetHasChar) FcCharSetHasChar;
    decltype(&::FcCharSetDestroy) FcCharSetDestroy;
    decltype(&::g_object_unref) g_object_unref;
    decltype(&::g_error_free) g_error_free;
};

// Opens them once. Fails: throws UsageError that names what is missing.
const RenderLibraries& renderLibraries();

}  // namespace olvane::cli
