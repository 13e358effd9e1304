// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// One layout of the engine, with the options and the view that the user chose.

#include <cli/LayoutRun.h>

#include <cstddef>
#include <memory>

#include <olvane/source/GedcomDataSource.h>
#include <olvane/source/LimitedDataSource.h>

namespace olvane::cli {

namespace {

// A thousand times what charts of real families ask for. A layout at the limit takes about a gigabyte, and up to a
// quarter of a minute where one person has a hundred thousand children, which are looked up in a set that large.
constexpr std::size_t kMostRelatives = 5000000;

}  // namespace

std::shared_ptr<OlvaneViewerManagerWrapProtocol> limitedSource(OlvaneViewerManagerWrapProtocol& people) {
    return std::make_shared<gedcom::LimitedDataSource>(people, kMostRelatives);
}

std::string layoutText(const gedcom::GedcomData& data, gedcom::PersonId focus, const LayoutRequest& request) {
    gedcom::GedcomDataSource people(data, request.parents);
    olvane::LayoutOptions options = request.chart.layout;
    options.sizes = charts::treeSizeOf(request.boxes);
    const auto source = limitedSource(people);
    return request.view() == View::pedigree ? pedigreeLayout(focus, source, options).text
                                            : familyLayout(focus, source, options).text;
}

}  // namespace olvane::cli
