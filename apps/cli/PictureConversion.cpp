// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Renders SVG through librsvg onto surfaces of cairo.

#include <cli/PictureConversion.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <cstdio>
#include <memory>
#include <optional>
#include <stdexcept>
#include <utility>

#include <cli/FontCoverage.h>
#include <cli/PdfUserUnit.h>
#include <cli/RenderLibraries.h>

namespace olvane::cli {

namespace {

constexpr double kLongestPng = 32000;      // pixels; cairo's images end at 32,767
constexpr double kLongestPdf = 14400;      // units of a page; what viewers of PDF take
constexpr double kPointsOfPx = 72.0 / 96;  // a px is 1/96 inch, a point 1/72

// Frees what the libraries hand out.
template <class Object, class Free>
std::unique_ptr<Object, Free> owned(Object* object, Free free) {
    return std::unique_ptr<Object, Free>(object, free);
}

cairo_status_t appendBytes(void* target, const unsigned char* bytes, unsigned int length) {
    try {
        static_cast<std::string*>(target)->append(reinterpret_cast<const char*>(bytes), length);
        return CAIRO_STATUS_SUCCESS;
    } catch (...) {
        return CAIRO_STATUS_WRITE_ERROR;  // no exception may pass through the library
    }
}

void requireSuccess(cairo_status_t status) {
    if (status == CAIRO_STATUS_SUCCESS) return;
    throw std::runtime_error(std::string("the picture could not be rendered: ") +
                             renderLibraries().cairo_status_to_string(status));
}

[[noreturn]] void failWith(GError* error) {
    const std::string text = error == nullptr ? "unknown reason" : error->message;
    if (error != nullptr) renderLibraries().g_error_free(error);
    throw std::runtime_error("the picture could not be rendered: " + text);
}

void renderOnto(cairo_t* target, const draw::SvgPicture& picture) {
    const RenderLibraries& lib = renderLibraries();
    GError* error = nullptr;
    const auto handle =
        owned(lib.rsvg_handle_new_from_data(reinterpret_cast<const guint8*>(picture.svg.data()),
                                            picture.svg.size(), &error),
              lib.g_object_unref);
    if (!handle) failWith(error);
    lib.rsvg_handle_set_dpi(handle.get(), 96);
    const RsvgRectangle viewport = {0, 0, static_cast<double>(picture.width),
                                    static_cast<double>(picture.height)};
    if (!lib.rsvg_handle_render_document(handle.get(), target, &viewport, &error)) failWith(error);
    requireSuccess(lib.cairo_status(target));
}

// As ISO 8601 has it, in universal time; empty without a date.
std::string isoDate(const std::optional<std::chrono::sys_seconds>& date) {
    if (!date) return {};
    const auto day = std::chrono::floor<std::chrono::days>(*date);
    const std::chrono::year_month_day calendar(day);
    const std::chrono::hh_mm_ss time(*date - day);
    std::array<char, 32> text{};
    std::snprintf(text.data(), text.size(), "%04d-%02u-%02uT%02d:%02d:%02dZ",
                  static_cast<int>(calendar.year()), static_cast<unsigned>(calendar.month()),
                  static_cast<unsigned>(calendar.day()), static_cast<int>(time.hours().count()),
                  static_cast<int>(time.minutes().count()), static_cast<int>(time.seconds().count()));
    return text.data();
}

double longestSide(const draw::SvgPicture& picture) {
    return std::max({picture.width, picture.height, 1});
}

// How many points a unit of the pages must be, so that no side has more units than the form allows.
int userUnitFor(const std::vector<draw::SvgPicture>& pages, double scale) {
    double longest = 0;
    for (const draw::SvgPicture& page : pages)
        longest = std::max(longest, longestSide(page) * kPointsOfPx * scale);
    return std::max(1, static_cast<int>(std::ceil(longest / kLongestPdf)));
}

// The characters of all fonts together, since a renderer goes on to the next one for what a font lacks.
class FontCharacters {
public:
    FontCharacters() : lib_(renderLibraries()) {
        FcPattern* const pattern = lib_.FcPatternCreate();
        lib_.FcConfigSubstitute(nullptr, pattern, FcMatchPattern);
        lib_.FcDefaultSubstitute(pattern);
        FcResult result = FcResultMatch;
        if (FcFontSet* const fonts = lib_.FcFontSort(nullptr, pattern, FcTrue, &characters_, &result)) {
            lib_.FcFontSetDestroy(fonts);
        }
        lib_.FcPatternDestroy(pattern);
    }
    FontCharacters(const FontCharacters&) = delete;
    FontCharacters& operator=(const FontCharacters&) = delete;
    ~FontCharacters() {
        if (characters_ != nullptr) lib_.FcCharSetDestroy(characters_);
    }

    bool has(std::uint32_t character) const {
        return characters_ != nullptr && lib_.FcCharSetHasChar(characters_, character) != FcFalse;
    }

private:
    const RenderLibraries& lib_;
    FcCharSet* characters_ = nullptr;
};

int pixels(double length) {
    return std::max(1, static_cast<int>(std::ceil(length)));
}

}  // namespace

namespace {

// known: up to where characters are taken to have a font, so that nobody asks the libraries.
std::string missingFontsBeyond(std::uint32_t known, const std::vector<draw::SvgPicture>& pictures) {
    std::optional<FontCharacters> shown;
    const auto hasFont = [&shown, known](std::uint32_t character) {
        if (character <= known) return true;
        if (!shown) shown.emplace();
        return shown->has(character);
    };
    std::vector<MissingScript> missing;
    for (const draw::SvgPicture& picture : pictures) {
        for (MissingScript& script : missingScripts(picture.svg, hasFont)) {
            const bool isListed =
                std::any_of(missing.begin(), missing.end(),
                            [&](const MissingScript& other) { return other.script == script.script; });
            if (!isListed) missing.push_back(std::move(script));
        }
    }
    return missingFontsText(missing);
}

}  // namespace

std::string missingFonts(const std::vector<draw::SvgPicture>& pictures) {
    constexpr std::uint32_t kLastLatin = 0x024F;
    return missingFontsBeyond(kLastLatin, pictures);
}

void requireFonts(const std::vector<draw::SvgPicture>& pictures) {
    const std::string missing = missingFontsBeyond(0, pictures);
    if (missing.empty()) return;
    throw std::runtime_error(missing +
                             "; install it, or write an .svg, which is shown with the fonts of its reader");
}

double pngScale(const draw::SvgPicture& picture, double wanted) {
    return std::min(wanted, kLongestPng / longestSide(picture));
}

std::string pngOf(const draw::SvgPicture& picture, double scale) {
    const RenderLibraries& lib = renderLibraries();
    const double allowed = pngScale(picture, scale);
    const auto surface =
        owned(lib.cairo_image_surface_create(CAIRO_FORMAT_ARGB32, pixels(picture.width * allowed),
                                             pixels(picture.height * allowed)),
              lib.cairo_surface_destroy);
    requireSuccess(lib.cairo_surface_status(surface.get()));
    const auto target = owned(lib.cairo_create(surface.get()), lib.cairo_destroy);
    lib.cairo_scale(target.get(), allowed, allowed);
    renderOnto(target.get(), picture);
    std::string bytes;
    requireSuccess(lib.cairo_surface_write_to_png_stream(surface.get(), appendBytes, &bytes));
    return bytes;
}

std::string pdfOf(const std::vector<draw::SvgPicture>& pages, const std::string& title, double scale,
                  const std::optional<std::chrono::sys_seconds>& created) {
    const RenderLibraries& lib = renderLibraries();
    const int unit = userUnitFor(pages, scale);
    std::string bytes;
    {
        const auto surface = owned(lib.cairo_pdf_surface_create_for_stream(appendBytes, &bytes, 1, 1),
                                   lib.cairo_surface_destroy);
        lib.cairo_pdf_surface_set_metadata(surface.get(), CAIRO_PDF_METADATA_TITLE, title.c_str());
        // Left to itself, cairo writes the time of day.
        lib.cairo_pdf_surface_set_metadata(surface.get(), CAIRO_PDF_METADATA_CREATE_DATE,
                                           isoDate(created).c_str());
        for (const draw::SvgPicture& page : pages) {
            const double size = kPointsOfPx * scale / unit;
            lib.cairo_pdf_surface_set_size(surface.get(), page.width * size, page.height * size);
            const auto target = owned(lib.cairo_create(surface.get()), lib.cairo_destroy);
            lib.cairo_scale(target.get(), size, size);
            renderOnto(target.get(), page);
            lib.cairo_show_page(target.get());
        }
        lib.cairo_surface_finish(surface.get());
        requireSuccess(lib.cairo_surface_status(surface.get()));
    }
    return unit == 1 ? bytes : withUserUnit(std::move(bytes), unit);
}

}  // namespace olvane::cli
