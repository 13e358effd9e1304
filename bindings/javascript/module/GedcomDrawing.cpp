// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A picture of an open GEDCOM file as SVG, the same bytes that the command draws, and what its boxes and lines say.

#include <array>
#include <cstddef>
#include <exception>
#include <stdexcept>
#include <string>
#include <utility>

#include <olvane/charts/BoxForm.h>
#include <olvane/charts/Views.h>
#include <olvane/draw/SvgDrawing.h>
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

draw::DrawingContent contentOf(OpenFile& file, const PictureRequest& request, unsigned facts) {
    const gedcom::GedcomLabels labels(file.data, factsOf(facts));
    draw::DrawingContent content;
    content.picture = pictureOf(file, request);
    content.labelOf = [labels](std::int64_t id) { return labels.ofPerson(id); };
    content.familyLabelOf = [labels](std::uint32_t number) { return labels.ofFamily(number); };
    content.countsHidden = true;
    return content;
}

std::string labelText(const kin::PersonLabel& label) {
    JsonText json;
    json.begin();
    json.string(label.birth);
    json.string(label.death);
    json.begin();
    for (const std::string& detail : label.details) json.string(detail);
    json.end();
    json.end();
    return std::move(json).take();
}

// boxes: 0 for what suits the view, 1 for tall ones, 2 for wide ones.
PictureRequest requestOnPaper(kin::Place focus, int boxes) {
    PictureRequest request = requestOf(focus);
    charts::ChartRequest& chart = request.view.chart;
    const charts::BoxForm usual = charts::usualBoxForm(chart.view, chart.direction);
    charts::setBoxForm(chart, boxes == 0   ? usual
                              : boxes == 1 ? charts::BoxForm::tall
                                           : charts::BoxForm::wide);
    return request;
}

}  // namespace
}  // namespace olvane::js

using namespace olvane;

// With the picture's options, sizes apart. An empty title is made of the focus's name; another one stands above the
// picture as well. Null for a picture that is refused; last_text then says why.
OLVANE_EXPORT("gedcom_svg")
const char* gedcomSvg(js::OpenFile* file, std::int32_t focus, int theme, int boxes, unsigned facts,
                      const char* title) {
    try {
        const js::PictureRequest request = js::requestOnPaper(focus - 1, boxes);
        const draw::DrawingContent content = js::contentOf(*file, request, facts);
        draw::DrawingOptions options;
        options.theme = &js::themeOf(theme);
        options.headline = *title != '\0';
        options.title =
            options.headline ? title : draw::titleOf(charts::nameOf(request.view.chart.view), content);
        js::lastText = draw::drawSvg(content, options).svg;
        return js::lastText.c_str();
    } catch (const std::length_error&) {
        js::lastText = "too large";
    } catch (const std::exception& error) {
        js::lastText = error.what();
    }
    return nullptr;
}

// Birth, death and further lines of a person's box; facts as for gedcom_svg.
OLVANE_EXPORT("gedcom_person_label")
const char* gedcomPersonLabel(const js::OpenFile* file, std::uint32_t id, unsigned facts) {
    return js::textOrRefusal(
        [&] { return js::labelText(gedcom::GedcomLabels(file->data, js::factsOf(facts)).ofPerson(id)); });
}

// What stands at a marriage line, as a JSON text.
OLVANE_EXPORT("gedcom_family_label")
const char* gedcomFamilyLabel(const js::OpenFile* file, std::uint32_t number, unsigned facts) {
    return js::textOrRefusal([&] {
        js::JsonText json;
        json.string(gedcom::GedcomLabels(file->data, js::factsOf(facts)).ofFamily(number));
        return std::move(json).take();
    });
}
