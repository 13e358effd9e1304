// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Photographs through gdk-pixbuf, which librsvg brings along. The format is found by the first bytes and the decoder is
// asked for by name, so that no other decoder of the system ever sees a file.

#include <cli/ScaledPhoto.h>

#include <algorithm>
#include <cstdint>
#include <memory>
#include <string_view>

#include <gdk-pixbuf/gdk-pixbuf.h>

#include <cli/SharedLibrary.h>

namespace olvane::cli {

namespace {

constexpr std::int64_t kMostPixels = 200'000'000;
constexpr const char* kQuality = "82";  // percent of JPEG

struct PixbufLibrary {
    decltype(&::gdk_pixbuf_loader_new_with_type) gdk_pixbuf_loader_new_with_type;
    decltype(&::gdk_pixbuf_loader_write) gdk_pixbuf_loader_write;
    decltype(&::gdk_pixbuf_loader_close) gdk_pixbuf_loader_close;
    decltype(&::gdk_pixbuf_loader_get_pixbuf) gdk_pixbuf_loader_get_pixbuf;
    decltype(&::gdk_pixbuf_loader_set_size) gdk_pixbuf_loader_set_size;
    decltype(&::gdk_pixbuf_apply_embedded_orientation) gdk_pixbuf_apply_embedded_orientation;
    decltype(&::gdk_pixbuf_get_has_alpha) gdk_pixbuf_get_has_alpha;
    decltype(&::gdk_pixbuf_get_width) gdk_pixbuf_get_width;
    decltype(&::gdk_pixbuf_get_height) gdk_pixbuf_get_height;
    decltype(&::gdk_pixbuf_composite_color_simple) gdk_pixbuf_composite_color_simple;
    decltype(&::gdk_pixbuf_save_to_buffer) gdk_pixbuf_save_to_buffer;
    decltype(&::g_signal_connect_data) g_signal_connect_data;
    decltype(&::g_object_unref) g_object_unref;
    decltype(&::g_free) g_free;
};

SharedLibrary opened(const char* name) {
    return {name, "--photos needs gdk-pixbuf 2.40", "a page can be written without photographs"};
}

PixbufLibrary openLibraries() {
    const SharedLibrary pixbuf = opened("libgdk_pixbuf-2.0.so.0");
    const SharedLibrary gobject = opened("libgobject-2.0.so.0");
    const SharedLibrary glib = opened("libglib-2.0.so.0");
    PixbufLibrary all;
#define OLVANE_LOAD(library, symbol) (library).load(all.symbol, #symbol)
    OLVANE_LOAD(pixbuf, gdk_pixbuf_loader_new_with_type);
    OLVANE_LOAD(pixbuf, gdk_pixbuf_loader_write);
    OLVANE_LOAD(pixbuf, gdk_pixbuf_loader_close);
    OLVANE_LOAD(pixbuf, gdk_pixbuf_loader_get_pixbuf);
    OLVANE_LOAD(pixbuf, gdk_pixbuf_loader_set_size);
    OLVANE_LOAD(pixbuf, gdk_pixbuf_apply_embedded_orientation);
    OLVANE_LOAD(pixbuf, gdk_pixbuf_get_has_alpha);
    OLVANE_LOAD(pixbuf, gdk_pixbuf_get_width);
    OLVANE_LOAD(pixbuf, gdk_pixbuf_get_height);
    OLVANE_LOAD(pixbuf, gdk_pixbuf_composite_color_simple);
    OLVANE_LOAD(pixbuf, gdk_pixbuf_save_to_buffer);
    OLVANE_LOAD(gobject, g_signal_connect_data);
    OLVANE_LOAD(gobject, g_object_unref);
    OLVANE_LOAD(glib, g_free);
#undef OLVANE_LOAD
    return all;
}

const PixbufLibrary& library() {
    static const PixbufLibrary kLibrary = openLibraries();
    return kLibrary;
}

// The library's name of the format; null for one that is not taken.
const char* formatOf(std::string_view bytes) {
    using namespace std::string_view_literals;
    if (bytes.starts_with("\xFF\xD8\xFF"sv)) return "jpeg";
    if (bytes.starts_with("\x89PNG\r\n\x1A\n"sv)) return "png";
    if (bytes.starts_with("GIF8"sv)) return "gif";
    if (bytes.starts_with("II*\0"sv) || bytes.starts_with("MM\0*"sv)) return "tiff";
    if (bytes.starts_with("BM"sv)) return "bmp";
    if (bytes.starts_with("RIFF"sv) && bytes.substr(8).starts_with("WEBP"sv)) return "webp";
    return nullptr;
}

struct Unref {
    template <class Object>
    void operator()(Object* object) const {
        library().g_object_unref(object);
    }
};
using Loader = std::unique_ptr<GdkPixbufLoader, Unref>;
using Pixels = std::unique_ptr<GdkPixbuf, Unref>;

// Called by the library when it knows the size, before it makes room for pixels. A size of 0 ends the loading.
void chooseSize(GdkPixbufLoader* loader, int width, int height, void* longestSide) {
    const int most = *static_cast<const int*>(longestSide);
    const int longer = std::max(width, height);
    if (static_cast<std::int64_t>(width) * height > kMostPixels) {
        library().gdk_pixbuf_loader_set_size(loader, 0, 0);
    } else if (longer > most) {
        const auto scaled = [&](int side) {
            return std::max(1, static_cast<int>(static_cast<std::int64_t>(side) * most / longer));
        };
        library().gdk_pixbuf_loader_set_size(loader, scaled(width), scaled(height));
    }
}

// Null for what cannot be decoded. A file that is cut short gives what is there.
Pixels decoded(const std::string& bytes, int longestSide) {
    const PixbufLibrary& lib = library();
    const char* const format = formatOf(bytes);
    if (format == nullptr) return {};
    const Loader loader(lib.gdk_pixbuf_loader_new_with_type(format, nullptr));
    if (!loader) return {};
    lib.g_signal_connect_data(loader.get(), "size-prepared", reinterpret_cast<GCallback>(chooseSize),
                              &longestSide, nullptr, GConnectFlags{});
    const bool isWritten =
        lib.gdk_pixbuf_loader_write(loader.get(), reinterpret_cast<const guchar*>(bytes.data()), bytes.size(),
                                    nullptr) != 0;
    const bool isClosed = lib.gdk_pixbuf_loader_close(loader.get(), nullptr) != 0;
    GdkPixbuf* const pixels =
        isWritten && isClosed ? lib.gdk_pixbuf_loader_get_pixbuf(loader.get()) : nullptr;
    return Pixels(pixels == nullptr ? nullptr : lib.gdk_pixbuf_apply_embedded_orientation(pixels));
}

Pixels onWhite(Pixels pixels) {
    const PixbufLibrary& lib = library();
    if (!lib.gdk_pixbuf_get_has_alpha(pixels.get())) return pixels;
    constexpr int kOpaque = 255;
    constexpr int kCheckSize = 16;
    constexpr guint32 kWhite = 0xFFFFFF;
    return Pixels(lib.gdk_pixbuf_composite_color_simple(
        pixels.get(), lib.gdk_pixbuf_get_width(pixels.get()), lib.gdk_pixbuf_get_height(pixels.get()),
        GDK_INTERP_NEAREST, kOpaque, kCheckSize, kWhite, kWhite));
}

}  // namespace

std::optional<std::string> scaledPhoto(const std::string& bytes, int longestSide) {
    const PixbufLibrary& lib = library();
    Pixels pixels = decoded(bytes, longestSide);
    if (pixels) pixels = onWhite(std::move(pixels));
    if (!pixels) return {};
    gchar* buffer = nullptr;
    gsize size = 0;
    if (!lib.gdk_pixbuf_save_to_buffer(pixels.get(), &buffer, &size, "jpeg", nullptr, "quality", kQuality,
                                       nullptr)) {
        return {};
    }
    const std::unique_ptr<gchar, decltype(lib.g_free)> owned(buffer, lib.g_free);
    return std::string(owned.get(), size);
}

}  // namespace olvane::cli
