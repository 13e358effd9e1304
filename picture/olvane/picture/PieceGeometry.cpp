// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/picture/PieceGeometryInternal.h>

#include <algorithm>
#include <cmath>

namespace olvane::picture {

namespace {

constexpr double kEndRoom = 1e-6;   // points; nearer to an end than this is the end
constexpr double kParallel = 0.01;  // sine of the angle up to which pieces count as parallel

// Without overflow protection, which coordinates do not need; the same result from every library.
double root(double x, double y) {
    return std::sqrt(x * x + y * y);
}

double length(const Line& line) {
    return root(line.x2 - line.x1, line.y2 - line.y1);
}

double cross(double ax, double ay, double bx, double by) {
    return ax * by - ay * bx;
}

// Narrows [from, to], the part of p + t * d that is kept, to low < p + t * d < high.
bool clip(double p, double d, double low, double high, double& from, double& to) {
    if (d == 0) return p > low && p < high;
    const double a = (low - p) / d;
    const double b = (high - p) / d;
    from = std::max(from, std::min(a, b));
    to = std::min(to, std::max(a, b));
    return from < to;
}

}  // namespace

bool boxHolds(const Box& box, const Point& p, double margin) {
    return p.x >= box.x - margin && p.x <= box.x + static_cast<double>(box.width) + margin &&
           p.y >= box.y - margin && p.y <= box.y + static_cast<double>(box.height) + margin;
}

double distance(const Point& p, const Line& line) {
    const double dx = line.x2 - line.x1;
    const double dy = line.y2 - line.y1;
    const double square = dx * dx + dy * dy;
    double t = 0;
    if (square > 0) t = std::clamp(((p.x - line.x1) * dx + (p.y - line.y1) * dy) / square, 0.0, 1.0);
    return root(p.x - (line.x1 + t * dx), p.y - (line.y1 + t * dy));
}

double distance(const Line& a, const Line& b) {
    if (crossInside(a, b)) return 0;
    return std::min(
        {distance(startOf(a), b), distance(endOf(a), b), distance(startOf(b), a), distance(endOf(b), a)});
}

bool crossInside(const Line& a, const Line& b) {
    const double ax = a.x2 - a.x1;
    const double ay = a.y2 - a.y1;
    const double bx = b.x2 - b.x1;
    const double by = b.y2 - b.y1;
    const double lengthA = root(ax, ay);
    const double lengthB = root(bx, by);
    const double turn = cross(ax, ay, bx, by);
    if (std::abs(turn) <= 1e-12 * lengthA * lengthB) return false;
    const double t = cross(b.x1 - a.x1, b.y1 - a.y1, bx, by) / turn * lengthA;
    const double s = cross(b.x1 - a.x1, b.y1 - a.y1, ax, ay) / turn * lengthB;
    return t > kEndRoom && t < lengthA - kEndRoom && s > kEndRoom && s < lengthB - kEndRoom;
}

bool runBeside(const Line& a, const Line& b, double apart, double least) {
    const double lengthA = length(a);
    const double lengthB = length(b);
    if (lengthA <= least || lengthB <= least) return false;
    const double ux = (a.x2 - a.x1) / lengthA;
    const double uy = (a.y2 - a.y1) / lengthA;
    const double vx = (b.x2 - b.x1) / lengthB;
    const double vy = (b.y2 - b.y1) / lengthB;
    if (std::abs(cross(ux, uy, vx, vy)) > kParallel) return false;
    const auto along = [&](const Point& p) { return (p.x - a.x1) * ux + (p.y - a.y1) * uy; };
    const auto beside = [&](const Point& p) { return cross(ux, uy, p.x - a.x1, p.y - a.y1); };
    const double from = std::max(0.0, std::min(along(startOf(b)), along(endOf(b))));
    const double to = std::min(lengthA, std::max(along(startOf(b)), along(endOf(b))));
    if (to - from <= least) return false;
    return std::abs(beside(startOf(b))) < apart && std::abs(beside(endOf(b))) < apart;
}

bool runsThrough(const Line& line, const Rect& rect) {
    if (rect.x1 >= rect.x2 || rect.y1 >= rect.y2) return false;
    double from = 0;
    double to = 1;
    return clip(line.x1, line.x2 - line.x1, rect.x1, rect.x2, from, to) &&
           clip(line.y1, line.y2 - line.y1, rect.y1, rect.y2, from, to);
}

}  // namespace olvane::picture
