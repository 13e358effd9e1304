// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Stands in for the conversion where the command was built without librsvg and cairo.

#include <cli/PictureConversion.h>

#include <cli/UsageError.h>

namespace olvane::cli {

namespace {

[[noreturn]] void refuse() {
    throw UsageError("this olvane was built without librsvg and cairo; it writes .svg alone");
}

}  // namespace

std::string missingFonts(const std::vector<draw::SvgPicture>&) {
    refuse();
}

void requireFonts(const std::vector<draw::SvgPicture>&) {
    refuse();
}

double pngScale(const draw::SvgPicture&, double wanted) {
    return wanted;
}

std::string pngOf(const draw::SvgPicture&, double) {
    refuse();
}

std::string pdfOf(const std::vector<draw::SvgPicture>&, const std::string&, double,
                  const std::optional<std::chrono::sys_seconds>&) {
    refuse();
}

}  // namespace olvane::cli
