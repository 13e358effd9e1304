// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <functional>
#include <string_view>

#include <nlohmann/json.hpp>

#include <olvane/picture/TextSink.h>

namespace olvane::cli {

// JSON that is written while it is made, so that a long text is never in memory a second time.
//
// Holds: the bytes are those of nlohmann's dump of the same values, with an indent of one space or, compact, without
//        spaces; a byte that is no UTF-8 becomes U+FFFD. Begins and ends are balanced by the caller.
// Fails: whatever the sink throws passes on.
class JsonOutput {
public:
    enum class Form { indented, compact };

    // The sink must live as long as this.
    JsonOutput(const picture::TextSink& write, Form form) : write_(write), form_(form) {}

    void beginObject() { begin("{"); }
    void endObject() { end("}"); }
    void beginList() { begin("["); }
    void endList() { end("]"); }

    // The name of the next value, in an object.
    void key(std::string_view name);
    void text(std::string_view text);
    // What make writes, in pieces of whole characters.
    void text(const std::function<void(const picture::TextSink& write)>& make);
    // A number, a truth value, or anything short.
    void value(const nlohmann::ordered_json& value);

    void field(std::string_view name, std::string_view text);
    void field(std::string_view name, const nlohmann::ordered_json& value);

private:
    void addText(std::string_view text);
    void begin(std::string_view bracket);
    void end(std::string_view bracket);
    void separate();
    void startLine();

    const picture::TextSink& write_;
    Form form_;
    int depth_ = 0;
    bool isFirst_ = true;  // nothing stands behind the last opening bracket
    bool hasKey_ = false;  // the next value stands behind its name
};

}  // namespace olvane::cli
