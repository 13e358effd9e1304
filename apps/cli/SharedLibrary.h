// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string>

namespace olvane::cli {

// A shared library that is opened while the command runs. Linked the usual way it would be opened at every start, and a
// listing of persons would wait for it.
//
// Holds: stays open until the process ends, since glib does not support closing.
// Fails: the constructor and load throw UsageError: what needs the library ("PNG and PDF need librsvg"), what is wrong
//        with it, and advice.
class SharedLibrary {
public:
    SharedLibrary(const char* name, std::string need, std::string advice);

    template <class Function>
    void load(Function& function, const char* symbol) const {
        function = reinterpret_cast<Function>(address(symbol));
    }

private:
    void* address(const char* symbol) const;
    [[noreturn]] void refuse(const std::string& reason) const;

    std::string name_;
    std::string need_;
    std::string advice_;
    void* handle_;
};

}  // namespace olvane::cli
