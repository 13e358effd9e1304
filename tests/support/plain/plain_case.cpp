// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// plain-case [--graph] [--trace] CASEFILE...: prints for each case what layout-case should print, made by the
// plain layout, so that a difference between the two can be looked at by hand.

#include <exception>
#include <iostream>
#include <string>
#include <vector>

#include <support/CaseFile.h>
#include <support/plain/PlainLayout.h>

namespace {

struct Arguments {
    bool graph = false;
    bool trace = false;
    std::vector<std::string> paths;
};

Arguments readArguments(int argc, char** argv) {
    Arguments arguments;
    for (int i = 1; i < argc; ++i) {
        const std::string word = argv[i];
        if (word == "--graph") {
            arguments.graph = true;
        } else if (word == "--trace") {
            arguments.trace = true;
        } else {
            arguments.paths.push_back(word);
        }
    }
    return arguments;
}

void printCases(const Arguments& arguments) {
    for (const std::string& path : arguments.paths) {
        const support::CaseFile request = support::readCase(path);
        if (arguments.paths.size() > 1) std::cout << "case " << path << '\n';
        std::cout << plain::layOut(request, arguments.graph, arguments.trace).text();
    }
}

}  // namespace

int main(int argc, char** argv) {
    const Arguments arguments = readArguments(argc, argv);
    if (arguments.paths.empty()) {
        std::cerr << "usage: plain-case [--graph] [--trace] CASEFILE...\n";
        return 2;
    }
    try {
        printCases(arguments);
    } catch (const std::exception& failure) {
        std::cerr << "plain-case: " << failure.what() << '\n';
        return 2;
    }
    return 0;
}
