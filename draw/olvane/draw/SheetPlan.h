// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <vector>

#include <olvane/draw/Paper.h>
#include <olvane/draw/detail/PictureArea.h>

namespace olvane::draw {

// What is laid out on paper: how large it is, and what stands where in it.
//
// Units: any, the same for all; x and y count from its upper left corner.
struct SheetSubject {
    double width = 0;
    double height = 0;
    std::vector<PictureArea> boxes;
    std::vector<PictureArea> others;  // lines and all else that a sheet without boxes may show
};

struct SheetRequest {
    Paper paper;
    // The number of sheets; the picture is as large as they allow. Ignored where there is a scale.
    int rows = 1;
    int columns = 1;
    // Millimetres of paper for each unit of the picture, on as many sheets as that takes; 0 for what fits.
    double scale = 0;
    double margin = 10;  // printers leave as much white
    double strip = 15;   // stands on two neighbours
    // Left free above the picture, on the first row of sheets.
    double headRoom = 0;
};

// One sheet: what it shows of the picture, and where its neighbours begin.
struct SheetWindow {
    int row = 0;
    int column = 0;
    PictureArea window;  // in units of the picture
};

// Where the picture lies on which sheets.
//
// Units: millimetres on paper.
// Holds: sheets come row by row, without those that would be blank, the first one always among them. Neighbours share
//        a strip; the seam, along which they are put together, is in its middle. The sheets of one row have one
//        upper edge; where their seams are, each row has chosen for itself.
struct SheetPlan {
    Paper paper;       // as it lies
    double scale = 1;  // millimetres for each unit of the picture
    double margin = 10;
    double strip = 15;
    int rows = 1;
    int columns = 1;  // the most of any row
    std::vector<int> columnsOfRow;
    std::vector<double> tops;                 // by row: where its windows begin
    std::vector<std::vector<double>> starts;  // by row and column; blank sheets too
    std::vector<SheetWindow> sheets;
    std::size_t cutBoxes = 0;  // that no sheet shows whole

    double roomWidth() const { return paper.width - 2 * margin; }
    double roomHeight() const { return paper.height - 2 * margin; }
};

// Lays a picture out on paper. Between two sheets, within the last seventh of the first, the seam is where it cuts the
// fewest boxes; of such places, the one that leaves most on the first sheet. Where a number of sheets is given, the picture is
// up to a sixth smaller than they allow, if fewer boxes are cut so. Paper that may turn lies as the picture
// is larger, or takes fewer sheets, and upright where that makes no difference.
//
// Fails: std::length_error where a scale would take more than mostSheets; std::invalid_argument for sheets without
//        room, numbers of sheets below 1, or lengths that are not finite.
SheetPlan planSheets(const SheetSubject& subject, const SheetRequest& request, double mostSheets = 1000);

// Width by height of what that many sheets hold together.
double aspectOf(const SheetRequest& request);

}  // namespace olvane::draw
