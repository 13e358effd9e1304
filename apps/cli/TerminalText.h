// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string>
#include <string_view>

#include <olvane/picture/TextSink.h>

namespace olvane::cli {

// UTF-8 text as a terminal may show it: characters that command a terminal or reorder what stands around them are
// written as \u202E, the form of JSON. These are the control characters but tab and line feed, C1 controls, line and
// paragraph separators, and the embeddings, overrides and isolates of the bidirectional algorithm (UAX 9). A byte that
// is no UTF-8 stays.
std::string visibleText(std::string_view text);

// A text that comes in pieces, passed on in pieces of a handy size and as textFor has the whole; of a long text no second
// copy is made.
//
// Fails: whatever the sink throws passes on.
class TextPieces {
public:
    TextPieces(int descriptor, picture::TextSink write);
    void add(std::string_view piece);
    // Passes on what is left.
    void finish();

private:
    void pass(std::string_view text);

    picture::TextSink write_;
    bool isTerminal_;
    std::string pending_;
};

// visibleText where the descriptor is a terminal; else the text as it is, for other programs.
std::string textFor(int descriptor, std::string_view text);

}  // namespace olvane::cli
