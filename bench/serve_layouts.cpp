// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// serve_layouts SHAPE SIZE: lays one made family out whenever it is asked, so that peers/compare can time it in turn
// with others. For each line with a number on its input it lays out that many times and answers with a line: the
// milliseconds of each layout with its result text, and behind a bar the persons shown.

#include <chrono>
#include <cstdlib>
#include <exception>
#include <iostream>
#include <string>

#include "FreedMemory.h"
#include "MadeLayout.h"

namespace {

double millisecondsOf(const bench::MadeLayout& layout, std::string& text) {
    const auto start = std::chrono::steady_clock::now();
    text = layout.text();
    return std::chrono::duration<double, std::milli>(std::chrono::steady_clock::now() - start).count();
}

void serve(const bench::MadeLayout& layout) {
    std::cout << "ready" << std::endl;
    std::string text;
    for (int layouts = 0; std::cin >> layouts;) {
        for (int i = 0; i < layouts; ++i) std::cout << millisecondsOf(layout, text) << ' ';
        std::cout << "| " << bench::shownPersons(text) << std::endl;
    }
}

}  // namespace

int main(int argc, char** argv) {
    bench::keepFreedMemory();
    if (argc != 3) {
        std::cerr << "usage: serve_layouts desc|ego|ped SIZE\n";
        return 2;
    }
    try {
        serve(bench::MadeLayout(argv[1], std::atoi(argv[2])));
    } catch (const std::exception& error) {
        std::cerr << "serve_layouts: " << error.what() << "\n";
        return 1;
    }
    return 0;
}
