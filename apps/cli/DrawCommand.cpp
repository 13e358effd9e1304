// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Draws the layout of one person to a file, in the form that the file's name asks for, whole or on sheets of
// paper.

#include <cli/Commands.h>

#include <iomanip>
#include <sstream>

#include <olvane/charts/LaterSide.h>
#include <olvane/gedcom/HiddenNames.h>
#include <olvane/source/GedcomLabels.h>

#include <cli/FileReading.h>
#include <cli/FocusChoice.h>
#include <cli/Messages.h>
#include <cli/OutputFile.h>
#include <cli/PaperDrawing.h>
#include <cli/PictureConversion.h>
#include <cli/PictureRun.h>
#include <cli/SourceDate.h>
#include <cli/TerminalProgress.h>
#include <cli/UsageError.h>

namespace olvane::cli {

namespace {

enum class Form { svg, png, pdf };

std::string lowerCase(std::string text) {
    for (char& c : text) {
        if (c >= 'A' && c <= 'Z') c = static_cast<char>(c - 'A' + 'a');
    }
    return text;
}

// Settled before anything is read, so that a mistyped name costs no time.
Form formOf(const std::string& output) {
    const std::string name = lowerCase(output);
    if (name == "-" || name.ends_with(".svg")) return Form::svg;
    if (name.ends_with(".png")) return Form::png;
    if (name.ends_with(".pdf")) return Form::pdf;
    throw UsageError(output + ": pictures are written as .svg, .png or .pdf");
}

const char* endingOf(Form form) {
    switch (form) {
        case Form::png:
            return ".png";
        case Form::pdf:
            return ".pdf";
        case Form::svg:
            break;
    }
    return ".svg";
}

draw::DrawingOptions drawingOptions(const DrawOptions& options, const draw::DrawingContent& content) {
    draw::DrawingOptions drawing;
    if (!options.paper.onPaper() && options.paper.scale > 0) drawing.scale = options.paper.scale;
    drawing.theme = draw::themeOfName(options.theme);
    drawing.language = options.request.chart.language;
    drawing.headline = !options.title.empty();
    drawing.title = drawing.headline
                        ? options.title
                        : draw::titleOf(charts::nameOf(options.request.view()), content, drawing.language);
    return drawing;
}

draw::DrawingContent contentOf(const gedcom::GedcomData& data, const DrawOptions& options,
                               LayoutRequest request, TerminalProgress& progress) {
    request.chart.progress = progress.ofChart();
    const gedcom::PersonId focus = chooseFocus(data, options.focus);
    const std::vector<bool> hidden = hiddenPersons(data, options.hiding);
    picture::Picture picture = PictureRun(data, request, hidden).pictureOf(focus);
    progress.show("drawing");
    gedcom::HiddenTexts texts;
    if (!hidden.empty()) {
        const gedcom::HiddenNames names(data, hidden);
        texts = {hidden, [names](std::string_view text) { return names.shownPlace(text); },
                 [names](std::string_view text) { return names.shownText(text); }};
    }
    const gedcom::GedcomLabels labels(data, options.shown, std::move(texts), request.chart.language);
    draw::DrawingContent content;
    content.picture = std::move(picture);
    content.labelOf = [labels](std::int64_t id) { return labels.ofPerson(id); };
    content.familyLabelOf = [labels](std::uint32_t number) { return labels.ofFamily(number); };
    content.countsHidden = true;
    content.laterSide = charts::laterSideOf(request.chart);
    return content;
}

// "tree.svg" and sheet 3 of 12 give "tree-03.svg".
std::string sheetName(const std::string& output, std::size_t sheet, std::size_t count) {
    const std::size_t dot = output.rfind('.');
    std::ostringstream name;
    name << output.substr(0, dot) << '-' << std::setw(static_cast<int>(std::to_string(count).size()))
         << std::setfill('0') << sheet << output.substr(dot);
    return name.str();
}

std::string pngSheet(const std::string& path, const draw::SvgPicture& sheet, double scale,
                     TerminalProgress& progress) {
    if (pngScale(sheet, scale) < scale) {
        progress.clear();
        printMessage(path + ": made smaller, since a PNG cannot be that large; .svg and .pdf can");
    }
    return pngOf(sheet, scale);
}

std::string contentOfSheet(const std::string& path, Form form, const draw::SvgPicture& sheet, double scale,
                           TerminalProgress& progress) {
    return form == Form::png ? pngSheet(path, sheet, scale, progress) : sheet.svg;
}

// To turn so much text into a PNG or a PDF takes about half a second.
bool takesLong(const std::vector<draw::SvgPicture>& sheets) {
    constexpr std::size_t kLargeText = 500'000;
    std::size_t size = 0;
    for (const draw::SvgPicture& sheet : sheets) size += sheet.svg.size();
    return size >= kLargeText;
}

void reportSheet(std::size_t sheet, std::size_t count, bool isLong, TerminalProgress& progress) {
    const std::string text = "writing sheet " + std::to_string(sheet) + " of " + std::to_string(count);
    isLong ? progress.announce(text) : progress.show(text);
}

// All of them or none: half a wall of sheets is of no use.
void writeSheets(const DrawOptions& options, Form form, const std::vector<draw::SvgPicture>& sheets,
                 const OutputRules& rules) {
    TerminalProgress progress;
    const bool isLong = form == Form::png && takesLong(sheets);
    const double size = options.paper.onPaper() ? 1 : options.paper.scale > 0 ? options.paper.scale : 1;
    const double scale = size * options.paper.pixelsOfPx();
    if (sheets.size() == 1) {
        if (isLong) progress.announce("writing the PNG");
        return writeOutput(options.output,
                           contentOfSheet(options.output, form, sheets.front(), scale, progress), rules);
    }
    OutputSet set(rules);
    for (std::size_t i = 0; i < sheets.size(); ++i) {
        const std::string path = sheetName(options.output, i + 1, sheets.size());
        reportSheet(i + 1, sheets.size(), isLong, progress);
        set.add(path, contentOfSheet(path, form, sheets[i], scale, progress));
    }
    set.finish();
}

// What is drawn, and how a screen reader calls it.
struct Drawn {
    std::vector<draw::SvgPicture> sheets;
    std::string title;
};

Drawn drawWhole(const gedcom::GedcomData& data, const DrawOptions& options) {
    TerminalProgress progress;
    const draw::DrawingContent content = contentOf(data, options, options.request, progress);
    const draw::DrawingOptions drawing = drawingOptions(options, content);
    return {{draw::drawSvg(content, drawing)}, drawing.title};
}

Drawn drawOnSheets(const gedcom::GedcomData& data, const DrawOptions& options) {
    TerminalProgress progress;
    draw::PaperDrawing drawn = drawOnPaper(
        options.paper, options.request,
        [&](const LayoutRequest& request) { return contentOf(data, options, request, progress); },
        [&](const draw::DrawingContent& content) { return drawingOptions(options, content); });
    if (options.output == "-" && drawn.drawing.sheets.size() > 1) {
        throw UsageError("the picture takes " + std::to_string(drawn.drawing.sheets.size()) +
                         " sheets; name a file for them");
    }
    progress.clear();
    printMessage(sentenceOf(drawn));
    return {std::move(drawn.drawing.sheets), drawn.title};
}

// An SVG is shown with the fonts of its reader, who may have others; so it is written all the same.
void warnOfMissingFonts(const std::string& output, const std::vector<draw::SvgPicture>& sheets) {
    std::string missing;
    try {
        missing = missingFonts(sheets);
    } catch (const UsageError&) {
        return;  // without the libraries, nothing is known of this machine's fonts
    }
    if (missing.empty()) return;
    printMessage((output == kStandardOutput ? "standard output" : output) + ": " + missing +
                 "; another machine may show it");
}

}  // namespace

int runDraw(const DrawOptions& options) {
    const Form form = formOf(options.output);
    const OutputRules rules{InputFiles({options.input.file}), {endingOf(form)}};
    checkOutput(options.output, rules);
    // Before any font is looked for: Fontconfig has words of its own for a time that is none.
    const auto date = form == Form::pdf ? sourceDate() : std::nullopt;
    const gedcom::GedcomData data =
        options.shown.needFacts() ? readFileWithFacts(options.input) : readFile(options.input);
    const Drawn drawn = options.paper.onPaper() ? drawOnSheets(data, options) : drawWhole(data, options);
    if (form == Form::svg) {
        warnOfMissingFonts(options.output, drawn.sheets);
    } else {
        requireFonts(drawn.sheets);
    }
    if (form == Form::pdf) {
        const double scale = options.paper.onPaper() || options.paper.scale <= 0 ? 1 : options.paper.scale;
        TerminalProgress progress;
        if (takesLong(drawn.sheets)) progress.announce("writing the PDF");
        writeOutput(options.output, pdfOf(drawn.sheets, drawn.title, scale, date), rules);
    } else {
        writeSheets(options, form, drawn.sheets, rules);
    }
    return statusOfReading(data);
}

}  // namespace olvane::cli
