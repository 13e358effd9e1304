// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Extended grapheme clusters, by the rules GB3 to GB13 of UAX 29 (https://www.unicode.org/reports/tr29/), version 15.0.

#include <olvane/picture/TextMetrics.h>

#include <olvane/picture/TextPropertiesInternal.h>

namespace olvane::picture {

namespace {

using G = GraphemeClass;

bool isControl(G c) {
    return c == G::cr || c == G::lf || c == G::control;
}

// Goes from character to character and says before which of them a cluster ends.
class ClusterEnds {
public:
    bool endsBefore(G next) {
        const bool ends = breaks(next);
        indicators_ = next == G::regionalIndicator ? (ends ? 1 : indicators_ + 1) : 0;
        emoji_ = next == G::pictographic                         ? Emoji::picture
                 : next == G::extend && emoji_ == Emoji::picture ? Emoji::picture
                 : next == G::zwj && emoji_ == Emoji::picture    ? Emoji::joined
                                                                 : Emoji::none;
        previous_ = next;
        return ends;
    }

private:
    // What stands at the end of a picture of emoji, by GB11.
    enum class Emoji : std::uint8_t { none, picture, joined };

    bool breaks(G next) const {
        if (previous_ == G::cr && next == G::lf) return false;                            // GB3
        if (isControl(previous_) || isControl(next)) return true;                         // GB4, GB5
        if (joinsSyllable(next)) return false;                                            // GB6 to GB8
        if (next == G::extend || next == G::zwj || next == G::spacingMark) return false;  // GB9, GB9a
        if (previous_ == G::prepend) return false;                                        // GB9b
        if (emoji_ == Emoji::joined && next == G::pictographic) return false;             // GB11
        return !(next == G::regionalIndicator && indicators_ % 2 == 1);                   // GB12, GB13
    }

    bool joinsSyllable(G next) const {
        switch (previous_) {
            case G::l:
                return next == G::l || next == G::v || next == G::lv || next == G::lvt;
            case G::lv:
            case G::v:
                return next == G::v || next == G::t;
            case G::lvt:
            case G::t:
                return next == G::t;
            default:
                return false;
        }
    }

    G previous_ = G::control;
    Emoji emoji_ = Emoji::none;
    int indicators_ = 0;
};

}  // namespace

std::string_view firstCluster(std::string_view text) {
    ClusterEnds ends;
    std::size_t position = 0;
    while (position < text.size()) {
        std::size_t size = 1;
        const std::int32_t character = decodeFront(text.substr(position), size);
        if (ends.endsBefore(textPropertiesOf(character).grapheme) && position > 0) break;
        position += size;
    }
    return text.substr(0, position);
}

std::vector<std::string_view> graphemeClusters(std::string_view text) {
    std::vector<std::string_view> clusters;
    while (!text.empty()) {
        clusters.push_back(firstCluster(text));
        text.remove_prefix(clusters.back().size());
    }
    return clusters;
}

}  // namespace olvane::picture
