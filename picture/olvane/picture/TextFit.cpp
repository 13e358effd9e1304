// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Breaks texts into lines: first into pieces that stay together, up to each line break opportunity. Pieces then fill
// line after line; one that is wider than a line is cut between two grapheme clusters. When the lines are used up
// the last one is shortened until an ellipsis has room behind it.

#include <olvane/picture/TextFit.h>

#include <utility>

namespace olvane::picture {

namespace {

constexpr std::string_view kEllipsis = "\xE2\x80\xA6";

// Without spaces at both ends, and one for each run of them.
std::string withSingleSpaces(std::string_view text) {
    std::string result;
    for (const char c : text) {
        if (c != ' ' || (!result.empty() && result.back() != ' ')) result += c;
    }
    if (!result.empty() && result.back() == ' ') result.pop_back();
    return result;
}

std::string_view withoutTrailingSpace(std::string_view line) {
    while (!line.empty() && line.back() == ' ') line.remove_suffix(1);
    return line;
}

// The longest beginning of the text that has room, in whole clusters.
std::string_view beginningWithin(std::string_view text, const Font& font, double maxWidth) {
    std::size_t end = 0;
    double width = 0;
    while (end < text.size()) {
        const std::string_view cluster = firstCluster(text.substr(end));
        width += textWidth(cluster, font);
        if (width > maxWidth) break;
        end += cluster.size();
    }
    return text.substr(0, end);
}

// Fills lines from the pieces of a text, which come one after the other and without a gap.
class LineFiller {
public:
    LineFiller(std::string_view text, const Font& font, double maxWidth, std::size_t maxLines)
        : text_(text), font_(font), maxWidth_(maxWidth), maxLines_(maxLines) {}

    // False once there are more lines than allowed.
    bool add(std::size_t end) {
        if (!fits(text_.substr(start_, end - start_))) {
            closeLine();
            breakLongPiece(end);
        }
        end_ = end;
        return fitted_.lines.size() <= maxLines_;
    }

    FittedText finish() {
        closeLine();
        return std::move(fitted_);
    }

private:
    bool fits(std::string_view text) const {
        const std::string_view line = withoutTrailingSpace(text);
        return beginningWithin(line, font_, maxWidth_).size() == line.size();
    }

    void breakLongPiece(std::size_t end) {
        while (!fits(text_.substr(start_, end - start_)) && fitted_.lines.size() <= maxLines_) {
            const std::string_view piece = withoutTrailingSpace(text_.substr(start_, end - start_));
            std::string_view part = beginningWithin(piece, font_, maxWidth_);
            if (part.empty()) part = firstCluster(piece);
            if (part.size() == piece.size()) break;
            fitted_.wordBroken = true;
            end_ = start_ + part.size();
            closeLine();
        }
    }

    void closeLine() {
        const std::string_view line = withoutTrailingSpace(text_.substr(start_, end_ - start_));
        if (!line.empty()) fitted_.lines.emplace_back(line);
        start_ = end_;
    }

    std::string_view text_;
    Font font_;
    double maxWidth_;
    std::size_t maxLines_;
    std::size_t start_ = 0;  // of the line
    std::size_t end_ = 0;    // of what is in it so far
    FittedText fitted_;
};

std::string shortenWithEllipsis(std::string_view text, const Font& font, double maxWidth) {
    const double room = maxWidth - textWidth(kEllipsis, font);
    if (room < 0) return std::string();
    const std::string_view kept = beginningWithin(text, font, room);
    return std::string(withoutTrailingSpace(kept)) + std::string(kEllipsis);
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
    const std::string spaced = withSingleSpaces(text);
    LineFiller filler(spaced, font, maxWidth, maxLines);
    bool goesOn = true;
    for (const std::size_t end : lineBreaks(spaced)) {
        goesOn = filler.add(end);
        if (!goesOn) break;
    }
    if (goesOn) filler.add(spaced.size());
    FittedText fitted = filler.finish();
    keepLines(fitted, maxLines, font, maxWidth);
    return fitted;
}

std::string fitLine(std::string_view text, const Font& font, double maxWidth) {
    if (textWidth(text, font) <= maxWidth) return std::string(text);
    return shortenWithEllipsis(text, font, maxWidth);
}

}  // namespace olvane::picture
