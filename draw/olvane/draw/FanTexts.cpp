// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Tries numbers of lines in every size. The more lines there are, the more of them stand where a cell is narrow, so that
// the room of a line is known only when all are counted.

#include <olvane/draw/FanTextsInternal.h>

#include <algorithm>
#include <cmath>
#include <limits>
#include <utility>

namespace olvane::draw {

namespace {

using picture::FittedName;
using picture::NameLoss;

// All in px.
constexpr double kLargest = 13;
constexpr double kSmallest = 8;  // to which letters shrink before a name is cut
constexpr double kLeast = 6;     // in cells that are too thin for two lines of the smallest
constexpr double kStep = 1;
constexpr double kPitch = 1.22;       // of lines, by the size of names
constexpr double kFactsShare = 0.85;  // of the size of names
constexpr std::size_t kMostNameLines = 4;
constexpr double kPad = 4;  // from the sides of a cell to its text

std::string joinedFacts(const std::vector<std::string>& facts, std::size_t first) {
    std::string text;
    for (std::size_t i = first; i < facts.size(); ++i) {
        if (!text.empty()) text += "  ";
        text += facts[i];
    }
    return text;
}

class FanTextFitter {
public:
    FanTextFitter(const FanText& text, const FanTextRoom& room)
        : text_(text),
          room_(room),
          allFacts_(joinedFacts(text.facts, 0)),
          laterFacts_(joinedFacts(text.facts, 1)),
          mostFactLines_(std::min<std::size_t>(text.facts.size(), 2)) {}

    FanTextLines fit() {
        const std::size_t fewest = std::min<std::size_t>(mostFactLines_, 1);
        for (double size = kLargest; size >= kSmallest; size -= kStep) {
            for (std::size_t facts = fewest; facts <= mostFactLines_; ++facts) {
                if (tryLines(size, facts)) return std::move(best_);
            }
        }
        if (best_.lines.empty()) fitThin(fewest);
        return std::move(best_);
    }

private:
    // With facts in letters as small as they can be, and then without facts.
    void fitThin(std::size_t facts) {
        const double forTwo = room_.height / (1 + kPitch);
        if (facts > 0 && forTwo >= kLeast && tryLines(forTwo, facts)) return;
        const double largest = std::min(kLargest, room_.height);
        for (double size = largest; size >= std::min(kSmallest, largest) && size >= kLeast; size -= kStep) {
            if (tryLines(size, 0)) return;
        }
    }

    // How many lines of a size have room.
    std::size_t linesOf(double size) const {
        if (room_.height < size) return 0;
        return 1 + static_cast<std::size_t>((room_.height - size) / (size * kPitch) + 1e-9);
    }

    // True where nothing is lost. Else the result is kept if less is lost than before; of names that are cut, more is left
    // in more lines and smaller letters.
    bool tryLines(double size, std::size_t facts) {
        const std::size_t all = linesOf(size);
        if (all <= facts) return false;
        const std::size_t most = std::min(all - facts, kMostNameLines);
        const std::size_t parts = text_.given.empty() || text_.surname.empty() ? 1 : 2;
        bool isWhole = false;
        for (std::size_t names = std::min(parts, most); names <= most; ++names) {
            const FittedName name = nameIn(size, names, facts);
            const NameLoss loss = haveRoom(facts, size, name.lines.size()) ? name.loss : NameLoss::letters;
            if (loss == NameLoss::nothing) {
                const bool isLast = parts == 1 || setsSurnameApart(name);
                if (isLast || !isWhole) keep(name, facts, size, loss);
                isWhole = true;
                if (isLast) return true;
            } else if (!isWhole && isNotWorse(loss)) {
                keep(name, facts, size, loss);
            }
        }
        return isWhole;
    }

    bool isNotWorse(NameLoss loss) const {
        return best_.lines.empty() || loss < best_.loss || (loss == best_.loss && loss == NameLoss::letters);
    }

    // Whether a line ends where the first part of the name does.
    bool setsSurnameApart(const FittedName& name) const {
        const auto lettersOf = [](const std::string& text) {
            return text.size() - static_cast<std::size_t>(std::count(text.begin(), text.end(), ' '));
        };
        const std::size_t first = lettersOf(text_.surnameFirst ? text_.surname : text_.given);
        std::size_t letters = 0;
        for (const std::string& line : name.lines) {
            letters += lettersOf(line);
            if (letters >= first) return letters == first;
        }
        return false;
    }

    double offsetOf(std::size_t line, std::size_t count, double size) const {
        return (static_cast<double>(line) - (static_cast<double>(count) - 1) / 2) * size * kPitch;
    }

    // As narrow as the narrowest of its lines.
    FittedName nameIn(double size, std::size_t lines, std::size_t facts) const {
        picture::NameRoom room;
        room.width = std::numeric_limits<double>::max();
        for (std::size_t i = 0; i < lines; ++i) {
            room.width = std::min(room.width, room_.width(offsetOf(i, lines + facts, size), size));
        }
        room.gap = 0;
        room.height = size * (static_cast<double>(lines) + 0.5);
        room.mostLines = lines;
        room.largest = room.smallest = size;
        return picture::fitName(text_.given, text_.surname, text_.surnameFirst, room);
    }

    double factsWidth(std::size_t i, std::size_t facts, double size, std::size_t names) const {
        return room_.width(offsetOf(names + i, names + facts, size), size * kFactsShare);
    }

    const std::string& factAt(std::size_t i, std::size_t lines) const {
        if (lines == 1) return allFacts_;
        return i == 0 ? text_.facts.front() : laterFacts_;
    }

    bool haveRoom(std::size_t facts, double size, std::size_t names) const {
        for (std::size_t i = 0; i < facts; ++i) {
            const double width = picture::textWidth(factAt(i, facts), {size * kFactsShare, false});
            if (width > factsWidth(i, facts, size, names)) return false;
        }
        return true;
    }

    void keep(const FittedName& name, std::size_t facts, double size, NameLoss loss) {
        const std::size_t names = name.lines.size();
        const std::size_t count = names + facts;
        best_ = {};
        best_.loss = loss;
        for (std::size_t i = 0; i < names; ++i)
            best_.lines.push_back({name.lines[i], true, size, offsetOf(i, count, size)});
        for (std::size_t i = 0; i < facts; ++i) {
            const double used = size * kFactsShare;
            best_.lines.push_back(
                {picture::fitLine(factAt(i, facts), {used, false}, factsWidth(i, facts, size, names)), false,
                 used, offsetOf(names + i, count, size)});
        }
    }

    const FanText& text_;
    const FanTextRoom& room_;
    std::string allFacts_;    // in one line
    std::string laterFacts_;  // in the second of two
    std::size_t mostFactLines_;
    FanTextLines best_;
};

}  // namespace

double FanTextRoom::width(double offset, double lineHeight) const {
    const double half = lineHeight / 2;
    const double shift = isReversed ? offset : -offset;
    // Of a line across, the upper corners are the farthest out.
    const double reach = form == Form::across ? middle + shift + half : std::abs(offset) + half;
    if (form == Form::rectangle) return breadth;
    if (reach >= outer) return 0;
    const double end = std::sqrt(outer * outer - reach * reach);
    if (form == Form::disc) return 2 * end;
    if (form == Form::along) return std::max(0.0, 2 * std::min(middle - inner, end - middle));
    const double side = slope > 0 ? (middle + shift - half) * slope - kPad : end;
    return std::max(0.0, 2 * std::min(end, side));
}

FanTextLines fitFanText(const FanText& text, const FanTextRoom& room) {
    return FanTextFitter(text, room).fit();
}

}  // namespace olvane::draw
