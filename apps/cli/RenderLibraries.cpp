// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Opens the rendering libraries while the command runs. Linked the usual way they would be opened at every
// start, and a listing of persons would wait for them.

#include <cli/RenderLibraries.h>

#include <string>

#include <dlfcn.h>

#include <cli/UsageError.h>

namespace olvane::cli {

namespace {

// Never closed: glib does not support that.
class Library {
public:
    explicit Library(const char* name) : name_(name), handle_(::dlopen(name, RTLD_NOW | RTLD_LOCAL)) {
        if (handle_ == nullptr) refuse("is not installed");
    }

    template <class Function>
    void load(Function& function, const char* symbol) const {
        function = reinterpret_cast<Function>(::dlsym(handle_, symbol));
        if (function == nullptr) refuse(std::string("is too old, it has no ") + symbol);
    }

private:
    [[noreturn]] void refuse(const std::string& reason) const {
        throw UsageError("PNG and PDF need librsvg 2.48 and cairo, but " + name_ + " " + reason +
                         "; an .svg can be written without them");
    }

    std::string name_;
    void* handle_;
};

RenderLibraries openLibraries() {
    const Library rsvg("librsvg-2.so.2");
    const Library cairo("libcairo.so.2");
    const Library gobject("libgobject-2.0.so.0");
    const Library glib("libglib-2.0.so.0");
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
