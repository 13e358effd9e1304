// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Measuring and fitting of texts, as pictures have it; those texts are cut first, as in a picture. Their folding, and dates
// and places in words.

#include <algorithm>
#include <cmath>
#include <cstddef>
#include <cstdint>
#include <exception>
#include <string>
#include <string_view>

#include <olvane/gedcom/DateText.h>
#include <olvane/kin/Folding.h>
#include <olvane/kin/PersonLabel.h>
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

// As dateText; language is a code.
OLVANE_EXPORT("date_text") const char* dateText(const char* written, const char* language) {
    return answered(
        [&] { return readable(gedcom::dateText(gedcom::parseGedcomDate(written), language).c_str()); });
}

OLVANE_EXPORT("place_text") const char* placeText(const char* place) {
    return answered([&] { return readable(gedcom::placeText(place).c_str()); });
}

// As yearsText; marks are numbers of DateMark, and a year of 0 is not known.
OLVANE_EXPORT("years_text")
const char* yearsText(int birth, int birthLast, int birthMark, int death, int deathLast, int deathMark,
                      const char* language) {
    const auto date = [](int year, int last, int mark) {
        gedcom::GedcomDate read;
        read.year = static_cast<std::int16_t>(year);
        read.lastYear = static_cast<std::int16_t>(last);
        read.mark = static_cast<gedcom::DateMark>(mark);
        return read;
    };
    return answered([&] {
        return gedcom::yearsText(date(birth, birthLast, birthMark), date(death, deathLast, deathMark),
                                 language);
    });
}

OLVANE_EXPORT("unnamed_text") const char* unnamedText(const char* language) {
    return answered([&] {
        return std::string(kin::unnamedText(kin::languageOf(language).value_or(kin::Language::english)));
    });
}

OLVANE_EXPORT("font_families") const char* fontFamilies() {
    return picture::kFontFamilies.data();
}
