// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Measuring and fitting of texts, as pictures have it; those texts are cut first, as in a picture. And their folding.

#include <algorithm>
#include <cmath>
#include <cstddef>
#include <exception>
#include <string>
#include <string_view>

#include <olvane/kin/Folding.h>
#include <olvane/picture/TextFit.h>

#include "OpenFile.h"

#define OLVANE_EXPORT(name) extern "C" __attribute__((export_name(name)))

using namespace olvane;

namespace {

std::string readable(const char* text) {
    return picture::cleanText(picture::cutText(text));
}

// The text that make gives, or null where there is no memory for it.
template <class Make>
const char* answered(const Make& make) {
    try {
        js::lastText = make();
        return js::lastText.c_str();
    } catch (const std::exception&) {
        return nullptr;
    }
}

}  // namespace

OLVANE_EXPORT("text_width") double textWidth(const char* text, double size, int bold) {
    try {
        return picture::textWidth(readable(text), {size, bold != 0});
    } catch (const std::exception&) {
        return 0;
    }
}

OLVANE_EXPORT("fit_line") const char* fitLine(const char* text, double size, int bold, double width) {
    return answered([&] { return picture::fitLine(readable(text), {size, bold != 0}, width); });
}

// 1 where nothing is cut, else 0, and the lines, each on a line of its own.
OLVANE_EXPORT("fit_lines")
const char* fitLines(const char* text, double size, int bold, double width, int mostLines) {
    return answered([&] {
        const picture::FittedText fitted = picture::fitText(readable(text), {size, bold != 0}, width,
                                                            static_cast<std::size_t>(std::max(mostLines, 0)));
        std::string answer = fitted.shortened || fitted.wordBroken ? "0" : "1";
        for (const std::string& line : fitted.lines) answer += "\n" + line;
        return answer;
    });
}

// The size of the letters in hundredths of a px, and the lines, each on a line of its own.
OLVANE_EXPORT("fit_name")
const char* fitName(const char* given, const char* surname, int surnameFirst, double width, double height,
                    double gap, int mostLines, double smallest) {
    return answered([&] {
        picture::NameRoom room{width, height, gap, static_cast<std::size_t>(mostLines)};
        room.smallest = smallest;
        const picture::FittedName name =
            picture::fitName(readable(given), readable(surname), surnameFirst != 0, room);
        std::string answer = std::to_string(static_cast<int>(std::lround(100 * name.size)));
        for (const std::string& line : name.lines) answer += "\n" + line;
        return answer;
    });
}

OLVANE_EXPORT("runs_right_to_left") int runsRightToLeft(const char* text) {
    try {
        return picture::runsRightToLeft(readable(text)) ? 1 : 0;
    } catch (const std::exception&) {
        return 0;
    }
}

// Of each line the words that a search compares, with a space between.
OLVANE_EXPORT("folded_words") const char* foldedWords(const char* text) {
    return answered([&] {
        std::string folded;
        std::string_view rest = text;
        for (;;) {
            const std::size_t end = rest.find('\n');
            const char* between = "";
            for (const kin::FoldedWord& word : kin::foldedWords(rest.substr(0, end))) {
                folded.append(between).append(word.folded);
                between = " ";
            }
            if (end == std::string_view::npos) return folded;
            folded += '\n';
            rest.remove_prefix(end + 1);
        }
    });
}

OLVANE_EXPORT("font_families") const char* fontFamilies() {
    return picture::kFontFamilies.data();
}
