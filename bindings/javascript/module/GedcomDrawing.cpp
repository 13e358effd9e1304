// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A picture of an open GEDCOM file as SVG, whole or on sheets of paper, the same bytes that the command draws, and what
// its boxes and lines say.

#include <array>
#include <charconv>
#include <cmath>
#include <cstddef>
#include <cstdint>
#include <exception>
#include <stdexcept>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include <olvane/charts/BoxForm.h>
#include <olvane/charts/LaterSide.h>
#include <olvane/charts/Views.h>
#include <olvane/draw/Paper.h>
#include <olvane/draw/PaperDrawing.h>
#include <olvane/draw/SvgDrawing.h>
#include <olvane/picture/TextMetrics.h>
#include <olvane/source/GedcomLabels.h>

#include "JsonText.h"
#include "OpenFile.h"
#include "PictureRequest.h"

#define OLVANE_EXPORT(name) extern "C" __attribute__((export_name(name)))

namespace olvane::js {
namespace {

gedcom::ShownFacts factsOf(unsigned bits) {
    gedcom::ShownFacts shown;
    shown.dates = (bits & 0x1u) != 0;
    shown.places = (bits & 0x2u) != 0;
    shown.occupation = (bits & 0x4u) != 0;
    shown.marriage = (bits & 0x8u) != 0;
    return shown;
}

const draw::DrawingTheme& themeOf(int number) {
    const std::array<const draw::DrawingTheme*, 3> themes = {&draw::lightTheme(), &draw::darkTheme(),
                                                             &draw::printTheme()};
    return *themes.at(static_cast<std::size_t>(number));
}

// photos lists the persons with a photograph, " 3 4 7 ", whose addresses are "photo:" and the number: JavaScript has the
// real ones. It must outlive the content.
void addPhotos(draw::DrawingContent& content, std::string_view photos) {
    if (photos.empty()) return;
    content.photoOf = [photos](std::int64_t id) {
        const std::string number = std::to_string(id);
        return photos.find(" " + number + " ") == std::string_view::npos ? std::string() : "photo:" + number;
    };
}

draw::DrawingContent contentOf(OpenFile& file, const PictureRequest& request, unsigned facts,
                               const char* photos) {
    gedcom::GedcomLabels labels(file.data, factsOf(facts), {}, request.view.chart.language);
    draw::DrawingContent content;
    content.picture = pictureOf(file, request);
    content.labelOf = [labels](std::int64_t id) { return labels.ofPerson(id); };
    content.familyLabelOf = [labels](std::uint32_t number) { return labels.ofFamily(number); };
    content.countsHidden = true;
    content.laterSide = charts::laterSideOf(request.view.chart);
    addPhotos(content, photos);
    return content;
}

std::string readable(std::string_view text) {
    return picture::cleanText(picture::cutText(text));
}

void appendTexts(JsonText& json, const std::vector<std::string>& texts) {
    json.begin();
    for (const std::string& text : texts) json.string(readable(text));
    json.end();
}

// As a drawing has it.
void appendLabel(JsonText& json, const kin::PersonLabel& label, kin::Language language) {
    const bool isUnnamed = label.given.empty() && label.surname.empty();
    json.begin();
    json.string(isUnnamed ? kin::unnamedText(language) : readable(label.given));
    json.string(readable(label.surname));
    json.number(label.surnameFirst ? 1 : 0);
    json.string(label.birth);
    json.string(label.death);
    appendTexts(json, label.details);
    appendTexts(json, kin::lifeLines(label));
    appendTexts(json, kin::shortLifeLines(label));
    json.string(readable(kin::lifeWords(label)));
    json.end();
}

kin::Language languageOf(const char* code) {
    return kin::languageOf(code).value_or(kin::Language::english);
}

gedcom::GedcomLabels labelsOf(const OpenFile& file, unsigned facts, const char* language) {
    return gedcom::GedcomLabels(file.data, factsOf(facts), {}, languageOf(language));
}

enum class Boxes : int { usual, tall, wide };

charts::BoxForm formOf(Boxes boxes, charts::BoxForm usual) {
    if (boxes == Boxes::usual) return usual;
    return boxes == Boxes::tall ? charts::BoxForm::tall : charts::BoxForm::wide;
}

PictureRequest requestInOnePiece(kin::Place focus, Boxes boxes) {
    PictureRequest request = requestOf(focus);
    charts::ChartRequest& chart = request.view.chart;
    charts::setBoxForm(chart, formOf(boxes, charts::usualBoxForm(chart.view, chart.direction)));
    return request;
}

// Folded for an aspect other than 0, on which the sizes depend.
PictureRequest requestOnPaper(kin::Place focus, Boxes boxes, double aspect = 0) {
    PictureRequest request = requestOf(focus);
    charts::ChartRequest& chart = request.view.chart;
    if (aspect > 0) charts::foldForPaper(chart, aspect);
    charts::setBoxForm(chart, formOf(boxes, charts::usualBoxFormOnPaper(chart.view, chart.direction)));
    return request;
}

// An empty title is made of the focus's name; another one stands above the picture as well.
draw::DrawingOptions drawingOf(const PictureRequest& request, const draw::DrawingContent& content, int theme,
                               const char* title) {
    draw::DrawingOptions options;
    options.language = request.view.chart.language;
    options.theme = &themeOf(theme);
    options.headline = *title != '\0';
    options.title = options.headline
                        ? title
                        : draw::titleOf(charts::nameOf(request.view.chart.view), content, options.language);
    return options;
}

// "3 4 7"
std::vector<std::int32_t> numbersIn(std::string_view text) {
    std::vector<std::int32_t> numbers;
    while (!text.empty()) {
        std::int32_t value = 0;
        const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), value);
        if (error != std::errc()) throw std::invalid_argument("no list of numbers");
        numbers.push_back(value);
        text.remove_prefix(static_cast<std::size_t>(end - text.data()));
        if (!text.empty()) text.remove_prefix(1);
    }
    return numbers;
}

// Lengths and sizes are in thousandths, as JavaScript divides them.
std::string sheetsJson(const draw::PaperDrawing& drawn) {
    const draw::SheetPlan& plan = drawn.drawing.plan;
    JsonText json;
    json.begin();
    for (const double value :
         {plan.paper.width, plan.paper.height, drawn.scale, drawn.points.smallestName, drawn.points.smallest})
        json.number(std::llround(value * 1000));
    json.number(static_cast<long long>(plan.cutBoxes));
    json.begin();
    for (std::size_t i = 0; i < plan.sheets.size(); ++i) {
        json.begin();
        json.number(plan.sheets[i].row);
        json.number(plan.sheets[i].column);
        json.string(drawn.drawing.sheets[i].svg);
        json.end();
    }
    json.end();
    json.end();
    return std::move(json).take();
}

// What a failed drawing has to say; null in its place.
const char* refusal() {
    try {
        throw;
    } catch (const draw::TooManySheets&) {
        lastText = "too many sheets";
    } catch (const std::length_error&) {
        lastText = "too large";
    } catch (const std::exception& error) {
        lastText = error.what();
    }
    return nullptr;
}

}  // namespace
}  // namespace olvane::js

using namespace olvane;

// One of Boxes: what they are where nobody chose. view and direction are numbers of the picture's options.
OLVANE_EXPORT("usual_boxes") int usualBoxes(int view, int direction) {
    const auto form =
        charts::usualBoxForm(static_cast<charts::View>(view), static_cast<charts::Direction>(direction));
    return static_cast<int>(form == charts::BoxForm::tall ? js::Boxes::tall : js::Boxes::wide);
}

// With the picture's options, sizes apart; boxes is one of Boxes. photos lists the persons with a photograph, " 3 4 7 ".
// Where part lists boxes by their places, "3 4 7", the picture ends around them.
// Null for a picture that is refused; last_text then says why.
OLVANE_EXPORT("gedcom_svg")
const char* gedcomSvg(js::OpenFile* file, std::int32_t focus, int theme, int boxes, unsigned facts,
                      const char* title, const char* photos, const char* part) {
    try {
        const js::PictureRequest request = js::requestInOnePiece(focus - 1, static_cast<js::Boxes>(boxes));
        const draw::DrawingContent content = js::contentOf(*file, request, facts, photos);
        const draw::DrawingOptions options = js::drawingOf(request, content, theme, title);
        draw::SvgPicture picture = draw::drawSvg(content, options);
        const std::vector<std::int32_t> shown = js::numbersIn(part);
        if (!shown.empty())
            picture = draw::partOf(picture, draw::areaAround(content.picture, shown), options.title);
        js::lastText = std::move(picture.svg);
        return js::lastText.c_str();
    } catch (...) {
        return js::refusal();
    }
}

// The same on sheets of paper, as JSON: width and height of a sheet in millimetres, the scale, the sizes of the
// smallest name and of the smallest text in points, all in thousandths; how many boxes are on no sheet whole; and of
// each sheet its row, its column and its SVG. scale is by the size at 96 px an inch, 0 for what fits rows and columns.
OLVANE_EXPORT("gedcom_sheets")
const char* gedcomSheets(js::OpenFile* file, std::int32_t focus, int theme, int boxes, unsigned facts,
                         const char* title, const char* photos, const char* paper, int rows, int columns,
                         double scale) {
    try {
        const auto size = draw::paperOf(paper);
        if (!size) throw std::invalid_argument(std::string(paper) + " is no paper");
        draw::SheetRequest sheets;
        sheets.paper = *size;
        sheets.rows = rows;
        sheets.columns = columns;
        sheets.scale = scale * draw::kMillimetresOfPx;
        draw::PaperSubject subject;
        const auto form = static_cast<js::Boxes>(boxes);
        const js::PictureRequest request = js::requestOnPaper(focus - 1, form);
        subject.folded = charts::foldsForPaper(request.view.chart.view);
        subject.contentOf = [&](double aspect) {
            return js::contentOf(*file, js::requestOnPaper(focus - 1, form, aspect), facts, photos);
        };
        subject.optionsOf = [&](const draw::DrawingContent& content) {
            return js::drawingOf(request, content, theme, title);
        };
        js::lastText = js::sheetsJson(draw::drawOnPaper(sheets, subject));
        return js::lastText.c_str();
    } catch (...) {
        return js::refusal();
    }
}

// The papers that have a name, each on a line of its own.
OLVANE_EXPORT("paper_names") const char* paperNames() {
    return js::textOrRefusal([] { return js::linesOf(draw::paperNames()); });
}

// What the boxes of some persons say beside their names; facts as for gedcom_svg, language is a code. JSON: birth, death,
// further lines, birth and death as lines, and in words; before them the parts of the name and whether the surname is first.
OLVANE_EXPORT("gedcom_person_labels")
const char* gedcomPersonLabels(const js::OpenFile* file, const std::uint32_t* ids, std::uint32_t count,
                               unsigned facts, const char* language) {
    return js::textOrRefusal([&] {
        const gedcom::GedcomLabels labels = js::labelsOf(*file, facts, language);
        js::JsonText json;
        json.begin();
        for (std::uint32_t i = 0; i < count; ++i)
            js::appendLabel(json, labels.ofPerson(ids[i]), js::languageOf(language));
        json.end();
        return std::move(json).take();
    });
}

// What stands at a marriage line, as a JSON text.
OLVANE_EXPORT("gedcom_family_label")
const char* gedcomFamilyLabel(const js::OpenFile* file, std::uint32_t number, unsigned facts,
                              const char* language) {
    return js::textOrRefusal([&] {
        js::JsonText json;
        json.string(js::labelsOf(*file, facts, language).ofFamily(number));
        return std::move(json).take();
    });
}
