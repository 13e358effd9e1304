// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// count_layout SHAPE SIZE [floor|typed]: one layout, its floor, or the layout with a typed result beside its text, inside a function of its own, for tools that count
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

void count(const std::string& shape, int size, const std::string& what) {
    const bench::MadeLayout layout(shape, size);
    if (what.empty()) return runTwice([&layout] { return layout.text(); });
    if (what == "typed") return runTwice([&layout] { return layout.typed().text; });
    const bench::Floor floor(layout);
    runTwice([&floor] { return floor.text(); });
}

}  // namespace

int main(int argc, char** argv) {
    const std::string what = argc == 4 ? argv[3] : "";
    if (argc != 3 && what != "floor" && what != "typed") {
        std::cerr << "usage: count_layout desc|ego|ped SIZE [floor|typed]\n";
        return 2;
    }
    try {
        count(argv[1], std::atoi(argv[2]), what);
    } catch (const std::exception& error) {
        std::cerr << "count_layout: " << error.what() << "\n";
        return 1;
    }
    return 0;
}
