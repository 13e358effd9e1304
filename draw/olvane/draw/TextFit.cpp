// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Breaks names into the lines of a box. First into pieces that stay together: words, and the parts of a
// double name behind its hyphens. Pieces then fill line after line; one that is wider than a line is cut
// between two characters. When the lines are used up the last one is shortened until an ellipsis has room
// behind it.

#include <olvane/draw/TextFitInternal.h>

#include <utility>

namespace olvane::draw {

namespace {

constexpr std::string_view kEllipsis = "\xE2\x80\xA6";

struct Piece {
    std::string_view text;
    bool spaceBefore = false;
};

std::vector<Piece> splitIntoPieces(std::string_view text) {
    std::vector<Piece> pieces;
    bool space = false;
    std::size_t start = 0;
    const auto close = [&](std::size_t end) {
        if (end > start) {
            pieces.push_back({text.substr(start, end - start), space});
            space = false;
        }
    };
    for (std::size_t i = 0; i < text.size(); ++i) {
        if (text[i] == ' ') {
            close(i);
            space = true;
            start = i + 1;
        } else if (text[i] == '-' && i > start) {
            close(i + 1);
            start = i + 1;
        }
    }
    close(text.size());
    return pieces;
}

std::string withoutTrailingSpace(std::string line) {
    while (!line.empty() && line.back() == ' ') line.pop_back();
    return line;
}

// The longest beginning of the text that has room, never less than one character.
std::string_view widestBeginning(std::string_view text, const Font& font, double maxWidth) {
    std::size_t end = 0;
    double width = 0;
    for (const std::string_view character : readersCharacters(text)) {
        width += textWidth(character, font);
        if (end > 0 && width > maxWidth) break;
        end += character.size();
    }
    return text.substr(0, end);
}

// Fills lines from the pieces.
class LineFiller {
public:
    LineFiller(const Font& font, double maxWidth) : font_(font), maxWidth_(maxWidth) {}

    void add(const Piece& piece) {
        const std::string joint = line_.empty() || !piece.spaceBefore ? "" : " ";
        if (fits(line_ + joint + std::string(piece.text))) {
            line_ += joint;
            line_ += piece.text;
            return;
        }
        closeLine();
        addToEmptyLine(piece.text);
    }

    FittedText finish() {
        closeLine();
        return std::move(fitted_);
    }

private:
    bool fits(std::string_view text) const { return textWidth(text, font_) <= maxWidth_; }

    void addToEmptyLine(std::string_view word) {
        while (!fits(word)) {
            const std::string_view part = widestBeginning(word, font_, maxWidth_);
            if (part.size() == word.size()) break;
            fitted_.wordBroken = true;
            fitted_.lines.emplace_back(part);
            word.remove_prefix(part.size());
        }
        line_ = word;
    }

    void closeLine() {
        if (!line_.empty()) fitted_.lines.push_back(std::exchange(line_, std::string()));
    }

    Font font_;
    double maxWidth_;
    std::string line_;
    FittedText fitted_;
};

std::string shortenWithEllipsis(std::string_view text, const Font& font, double maxWidth) {
    const double room = maxWidth - textWidth(kEllipsis, font);
    std::string kept;
    double width = 0;
    for (const std::string_view character : readersCharacters(text)) {
        width += textWidth(character, font);
        if (width > room) break;
        kept += character;
    }
    if (room < 0) return std::string();
    return withoutTrailingSpace(std::move(kept)) + std::string(kEllipsis);
}

void keepLines(FittedText& fitted, std::size_t maxLines, const Font& font, double maxWidth) {
    if (fitted.lines.size() <= maxLines) return;
    fitted.lines.resize(maxLines);
    fitted.shortened = true;
    if (maxLines == 0) return;
    std::string& last = fitted.lines.back();
    last = shortenWithEllipsis(last, font, maxWidth);
}

}  // namespace

FittedText fitText(std::string_view text, const Font& font, double maxWidth, std::size_t maxLines) {
    LineFiller filler(font, maxWidth);
    for (const Piece& piece : splitIntoPieces(text)) filler.add(piece);
    FittedText fitted = filler.finish();
    keepLines(fitted, maxLines, font, maxWidth);
    return fitted;
}

std::string fitLine(std::string_view text, const Font& font, double maxWidth) {
    if (textWidth(text, font) <= maxWidth) return std::string(text);
    return shortenWithEllipsis(text, font, maxWidth);
}

}  // namespace olvane::draw
