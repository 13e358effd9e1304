// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string>
#include <string_view>
#include <utility>

#include <olvane/kin/KinJson.h>

namespace olvane::js {

// Writes JSON arrays, nothing else: objects would repeat their keys for every person.
//
// Holds: begin and end come in pairs. Texts are valid UTF-8.
class JsonText {
public:
    void begin() {
        separate();
        text_ += '[';
        first_ = true;
    }
    void end() {
        text_ += ']';
        first_ = false;
    }
    void number(long long value) {
        separate();
        text_ += std::to_string(value);
    }
    void string(std::string_view value) {
        separate();
        kin::appendJsonText(text_, value);
    }

    std::string take() && { return std::move(text_); }

private:
    void separate() {
        if (!first_) text_ += ',';
        first_ = false;
    }

    std::string text_;
    bool first_ = true;
};

}  // namespace olvane::js
