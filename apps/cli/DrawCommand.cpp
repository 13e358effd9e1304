// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Draws the layout of one person to a file.

#include <cli/Commands.h>

#include <olvane/host/LayoutText.h>

#include <cli/FileReading.h>
#include <cli/FocusChoice.h>
#include <cli/OutputFile.h>
#include <cli/PictureLabels.h>
#include <cli/UsageError.h>

namespace olvane::cli {

namespace {

void requireKnownForm(const std::string& output) {
    if (output == "-" || output.ends_with(".svg")) return;
    throw UsageError(output + ": pictures are written as .svg");
}

draw::DrawingOptions drawingOptions(const DrawOptions& options, const draw::DrawingContent& content) {
    const TreeSize size = sizeOf(options.request.boxes);
    const bool isPedigree = options.request.view == View::pedigree;
    draw::DrawingOptions drawing;
    drawing.direction = isPedigree ? draw::LineDirection::sideways : draw::LineDirection::downward;
    drawing.box = {static_cast<int>(size.nodeWidth), static_cast<int>(size.nodeHeight)};
    drawing.theme = draw::themeOfName(options.theme);
    drawing.headline = !options.title.empty();
    drawing.title = options.title;
    if (!drawing.headline) {
        drawing.title =
            (isPedigree ? "Pedigree of " : "Family of ") + draw::fullName(content.labelOf(content.focusId));
    }
    return drawing;
}

}  // namespace

int runDraw(const DrawOptions& options) {
    requireKnownForm(options.output);
    const gedcom::GedcomData data = readFile(options.file);
    const gedcom::PersonId focus = chooseFocus(data, options.focus);
    const draw::DrawingContent content =
        pictureContent(data, readLayoutText(layoutText(data, focus, options.request)), focus);
    const draw::SvgPicture picture = draw::drawSvg(content, drawingOptions(options, content));
    writeOutput(options.output, picture.svg);
    return 0;
}

}  // namespace olvane::cli
