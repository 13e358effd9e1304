// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <chrono>
#include <optional>
#include <string>
#include <vector>

#include <olvane/draw/SvgDrawing.h>

namespace olvane::cli {

// Other forms of finished pictures. The libraries that do it are opened at the first use, since opening them
// takes longer than drawing most families does.
//
// Fails: throws UsageError where the libraries are not installed, std::runtime_error where they fail.

// Which letters no font of this machine shows: "no font shows Thai (in Debian: fonts-thai-tlwg)"; empty where there are
// none. Every font is taken to have Latin letters, so that the libraries are opened for others alone.
std::string missingFonts(const std::vector<draw::SvgPicture>& pictures);

// Refuses pictures with letters that no font of this machine shows, which would come out as empty boxes.
// Fails: throws std::runtime_error that names the scripts and packages of Debian that have fonts for them.
void requireFonts(const std::vector<draw::SvgPicture>& pictures);

// The pixels that a PNG has for each px: as many as wanted, or fewer where a side would be too long.
double pngScale(const draw::SvgPicture& picture, double wanted);

// A PNG of `scale` pixels for each px; smaller where a side would be too long.
std::string pngOf(const draw::SvgPicture& picture, double scale);

// A PDF with one page for each picture, of its size at 96 px an inch times scale, in vectors and with its text as
// text. Where a page has more than 14,400 points, the unit of all pages is a multiple of a point. The same pages give the same bytes; created is the
// time of creation that it states, none where empty.
std::string pdfOf(const std::vector<draw::SvgPicture>& pages, const std::string& title, double scale,
                  const std::optional<std::chrono::sys_seconds>& created);

}  // namespace olvane::cli
