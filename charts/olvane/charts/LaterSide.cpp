// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/charts/LaterSide.h>

namespace olvane::charts {

using picture::Side;

picture::Side laterSideOf(const ChartRequest& request) {
    Direction direction = request.direction;
    if (request.view == View::family) direction = Direction::down;
    if (request.view == View::pedigree) direction = Direction::left;
    switch (direction) {
        case Direction::down:
            return Side::bottom;
        case Direction::up:
            return Side::top;
        case Direction::left:
            return request.mirrored ? Side::right : Side::left;
        case Direction::right:
            return request.mirrored ? Side::left : Side::right;
    }
    return Side::bottom;
}

}  // namespace olvane::charts
