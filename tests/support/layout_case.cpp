// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// layout-case: reads case files, a family and one layout request each, and prints what the engine made of
// them. It is how golden layouts are made and how a bug is reported.
//
//     layout-case [--graph] [--trace] [--record] [--every-person] CASEFILE...
//
// --every-person lays out each person of whom the file speaks, instead of its focus, behind a line "focus ID".
//
// --record writes CASEFILE.new for each file: the case with its expected lines ("#= ...") as they are now. A person
// compares the two and renames.

#include <support/CaseFile.h>
#include <support/CaseRun.h>
#include <support/GoldenCase.h>

#include <cstdio>
#include <exception>
#include <fstream>
#include <iostream>
#include <string>
#include <vector>

namespace {

struct Request {
    bool graph = false;
    bool trace = false;
    bool record = false;
    bool everyPerson = false;
    std::vector<std::string> files;
};

constexpr const char* kUsage =
    "usage: layout-case [--graph] [--trace] [--record] [--every-person] CASEFILE...\n";

bool readArguments(int argc, char** argv, Request& request) {
    for (int i = 1; i < argc; ++i) {
        const std::string argument = argv[i];
        if (argument == "--graph") {
            request.graph = true;
        } else if (argument == "--trace") {
            request.trace = true;
        } else if (argument == "--record") {
            request.record = true;
        } else if (argument == "--every-person") {
            request.everyPerson = true;
        } else if (argument.rfind("--", 0) == 0) {
            std::cerr << "layout-case: unknown option " << argument << "\n" << kUsage;
            return false;
        } else {
            request.files.push_back(argument);
        }
    }
    if (request.files.empty()) std::cerr << kUsage;
    return !request.files.empty();
}

void recordCase(const std::string& file) {
    const std::string path = file + ".new";
    std::ofstream out(path, std::ios::binary);
    out << support::withExpectedText(support::readWhole(file), support::layoutText(support::readCase(file)));
    if (!out.flush()) throw std::runtime_error(path + ": cannot be written");
    std::cerr << "layout-case: wrote " << path << "; compare and rename\n";
}

void printLayout(const Request& request, const support::CaseFile& source) {
    std::cout << support::joinLines(support::runCase(source, request.graph, request.trace));
}

void printEveryPerson(const Request& request, support::CaseFile source) {
    for (const support::PersonId id : support::personsOf(source)) {
        source.focus = id;
        std::cout << "focus " << id << "\n";
        printLayout(request, source);
    }
}

void printCase(const Request& request, const std::string& file) {
    const support::CaseFile source = support::readCase(file);
    if (request.files.size() > 1) std::cout << "case " << file << "\n";
    if (request.everyPerson) {
        printEveryPerson(request, source);
    } else {
        printLayout(request, source);
    }
}

}  // namespace

int main(int argc, char** argv) {
    Request request;
    if (!readArguments(argc, argv, request)) return 2;
    int status = 0;
    for (const std::string& file : request.files) {
        try {
            if (request.record) {
                recordCase(file);
            } else {
                printCase(request, file);
            }
        } catch (const std::exception& failure) {
            std::cout.flush();
            std::cerr << "layout-case: " << failure.what() << "\n";
            status = 2;
        }
    }
    return status;
}
