// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <cli/SharedLibrary.h>

#include <utility>

#include <dlfcn.h>

#include <cli/UsageError.h>

namespace olvane::cli {

SharedLibrary::SharedLibrary(const char* name, std::string need, std::string advice)
    : name_(name),
      need_(std::move(need)),
      advice_(std::move(advice)),
      handle_(::dlopen(name, RTLD_NOW | RTLD_LOCAL)) {
    if (handle_ == nullptr) refuse("is not installed");
}

void* SharedLibrary::address(const char* symbol) const {
    void* const found = ::dlsym(handle_, symbol);
    if (found == nullptr) refuse(std::string("is too old, it has no ") + symbol);
    return found;
}

void SharedLibrary::refuse(const std::string& reason) const {
    throw UsageError(need_ + ", but " + name_ + " " + reason + "; " + advice_);
}

}  // namespace olvane::cli
