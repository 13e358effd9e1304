// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// draw_file FILE ID: the ancestors and descendants of a person of a GEDCOM file, as SVG.

#include <cstdlib>
#include <exception>
#include <iostream>
#include <memory>

#include <olvane/charts/Views.h>
#include <olvane/draw/SvgDrawing.h>
#include <olvane/source/GedcomSource.h>

int main(int argc, char** argv) {
    if (argc != 3) {
        std::cerr << "usage: draw_file FILE ID\n";
        return 2;
    }
    try {
        const olvane::gedcom::GedcomData data = olvane::gedcom::readGedcomFile(argv[1]);
        const olvane::kin::KinGraph graph = olvane::gedcom::kinGraphOf(data);
        const olvane::gedcom::GedcomLabels labels(data);

        olvane::charts::ViewRequest request;
        request.chart.view = olvane::charts::View::hourglass;
        request.chart.focus = graph.placeOf(std::atoi(argv[2]));
        setBoxForm(request.chart, olvane::charts::BoxForm::tall);

        olvane::draw::DrawingContent content;
        const auto source = std::make_shared<olvane::gedcom::GedcomDataSource>(data);
        content.picture = olvane::charts::pictureOf(source, graph, request);
        content.labelOf = [&labels](std::int64_t id) { return labels.ofPerson(id); };
        std::cout << olvane::draw::drawSvg(content, {}).svg;
    } catch (const std::exception& error) {
        std::cerr << "draw_file: " << error.what() << "\n";
        return 1;
    }
    return 0;
}
