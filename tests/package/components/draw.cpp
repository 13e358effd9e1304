// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A drawing of one person.

#include <iostream>

#include <olvane/draw/SvgDrawing.h>

int main() {
    olvane::draw::DrawingContent content;
    content.picture.boxes.push_back({.id = 17, .width = 55, .height = 80});
    content.labelOf = [](std::int64_t) { return olvane::kin::PersonLabel{.given = "Ada"}; };
    std::cout << olvane::draw::drawSvg(content, {}).svg;
}
