// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/draw/Paper.h>

#include <array>
#include <charconv>

namespace olvane::draw {

namespace {

struct NamedPaper {
    std::string_view name;
    double width;
    double height;
};

constexpr NamedPaper kPapers[] = {{"A4", 210, 297}, {"A3", 297, 420},  {"A2", 420, 594},
                                  {"A1", 594, 841}, {"A0", 841, 1189}, {"letter", 215.9, 279.4}};

constexpr auto kNames = [] {
    std::array<std::string_view, std::size(kPapers)> names{};
    for (std::size_t i = 0; i < names.size(); ++i) names[i] = kPapers[i].name;
    return names;
}();

constexpr int kLeastSide = 50;
constexpr int kMostSide = 20'000;

// A side in whole millimetres; 0 for any other text.
int sideOf(std::string_view text) {
    int side = 0;
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), side);
    if (error != std::errc() || end != text.data() + text.size()) return 0;
    return side >= kLeastSide && side <= kMostSide ? side : 0;
}

}  // namespace

std::span<const std::string_view> paperNames() {
    return kNames;
}

std::optional<Paper> paperOf(std::string_view text) {
    for (const NamedPaper& paper : kPapers) {
        if (paper.name == text) return Paper{paper.width, paper.height, true};
    }
    const std::size_t cross = text.find('x');
    if (cross == std::string_view::npos) return std::nullopt;
    const int width = sideOf(text.substr(0, cross));
    const int height = sideOf(text.substr(cross + 1));
    if (width == 0 || height == 0) return std::nullopt;
    return Paper{static_cast<double>(width), static_cast<double>(height), false};
}

}  // namespace olvane::draw
