// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// count_layout SHAPE SIZE [floor]: one layout, or its floor, inside a function of its own, for tools that count
// the instructions of one function:
//
//     valgrind --tool=callgrind --toggle-collect=countedWork count_layout ego 100
//
// The work has run once before, so that nothing in it happens for the first time.

#include <cstdlib>
#include <exception>
#include <functional>
#include <iostream>
#include <string>

#include "Floor.h"
#include "MadeLayout.h"

namespace {

typedef std::function<std::string()> Work;

}  // namespace

extern "C" {
[[gnu::noinline, gnu::used]] void countedWork(const void* work, void* text);
void countedWork(const void* work, void* text) {
    *static_cast<std::string*>(text) = (*static_cast<const Work*>(work))();
}
}

namespace {

void runTwice(const Work& work) {
    const std::string before = work();
    std::string text;
    countedWork(&work, &text);
    if (text != before) throw std::logic_error("two runs, two texts");
    std::cout << text.size() << " bytes\n";
}

void count(const std::string& shape, int size, bool floorAlone) {
    const bench::MadeLayout layout(shape, size);
    if (!floorAlone) return runTwice([&layout] { return layout.text(); });
    const bench::Floor floor(layout);
    runTwice([&floor] { return floor.text(); });
}

}  // namespace

int main(int argc, char** argv) {
    const bool floorAlone = argc == 4 && std::string(argv[3]) == "floor";
    if (argc != 3 && !floorAlone) {
        std::cerr << "usage: count_layout desc|ego|ped SIZE [floor]\n";
        return 2;
    }
    try {
        count(argv[1], std::atoi(argv[2]), floorAlone);
    } catch (const std::exception& error) {
        std::cerr << "count_layout: " << error.what() << "\n";
        return 1;
    }
    return 0;
}
