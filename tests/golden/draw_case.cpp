// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// draw-case [--check] CASEFILE...: draws what the engine makes of each case to a picture beside it, x.case to
// x.svg. With --check nothing is written: a picture that is missing or no longer what would be drawn is
// named, and the exit status is 1. Cases of whom no box can be drawn, because their text is empty, have a
// picture that says so.

#include <olvane/draw/SvgDrawing.h>
#include <olvane/picture/LayoutPicture.h>

#include <support/CaseRun.h>
#include <support/GoldenCase.h>

#include <exception>
#include <filesystem>
#include <fstream>
#include <iostream>
#include <stdexcept>
#include <string>

namespace {

using olvane::draw::DrawingContent;
using olvane::draw::DrawingOptions;
using support::CaseFile;

olvane::kin::PersonLabel labelOf(const CaseFile& source, std::int64_t id) {
    olvane::kin::PersonLabel label;
    label.given = std::to_string(id);
    const auto sex = source.sexes.find(id);
    const bool male = sex == source.sexes.end() || sex->second == 0;
    label.sex = male ? olvane::kin::Sex::male : olvane::kin::Sex::female;
    const auto birth = source.births.find(id);
    if (birth != source.births.end()) label.birth = birth->second;
    return label;
}

std::string pictureOf(const CaseFile& source, const std::string& name) {
    DrawingContent content;
    content.picture = olvane::picture::pictureOf(support::runTypedCase(source).layout);
    content.labelOf = [&source](std::int64_t id) { return labelOf(source, id); };
    DrawingOptions options;
    options.title = name;
    return olvane::draw::drawSvg(content, options).svg;
}

bool isCurrent(const std::filesystem::path& path, const std::string& picture) {
    return std::filesystem::exists(path) && support::readWhole(path.string()) == picture;
}

void write(const std::filesystem::path& path, const std::string& picture) {
    std::ofstream out(path, std::ios::binary);
    out << picture;
    if (!out.flush()) throw std::runtime_error(path.string() + ": cannot be written");
}

}  // namespace

int main(int argc, char** argv) {
    const bool check = argc > 1 && std::string(argv[1]) == "--check";
    const int first = check ? 2 : 1;
    if (argc <= first) {
        std::cerr << "usage: draw-case [--check] CASEFILE...\n";
        return 2;
    }
    int status = 0;
    for (int i = first; i < argc; ++i) {
        try {
            const std::filesystem::path file = argv[i];
            const std::string picture = pictureOf(support::readCase(file.string()), file.stem().string());
            const std::filesystem::path path = std::filesystem::path(file).replace_extension(".svg");
            if (!check) {
                write(path, picture);
            } else if (!isCurrent(path, picture)) {
                std::cerr << path.string() << ": not what would be drawn now; look at it and draw it again\n";
                status = 1;
            }
        } catch (const std::exception& failure) {
            std::cerr << "draw-case: " << failure.what() << "\n";
            status = 2;
        }
    }
    return status;
}
