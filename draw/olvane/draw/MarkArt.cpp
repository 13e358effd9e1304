// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// An arrow to earlier generations stands at a child whose parents are elsewhere, one to later generations at those
// parents, and an arrow to both sides at partners, each with the number of its mark.

#include <olvane/draw/MarkArtInternal.h>

#include <algorithm>
#include <cstddef>

#include <olvane/draw/DrawingWordsInternal.h>
#include <olvane/draw/SvgTextInternal.h>

namespace olvane::draw {

namespace {

using picture::Index;
using picture::Mark;
using picture::MarkKind;
using picture::Side;

constexpr std::size_t kMostMarks = 3;
constexpr const char* kUp = "\xE2\x86\x91";
constexpr const char* kRight = "\xE2\x86\x92";
constexpr const char* kDown = "\xE2\x86\x93";
constexpr const char* kLeft = "\xE2\x86\x90";
constexpr const char* kBothSides = "\xE2\x86\x94";
constexpr const char* kUpAndDown = "\xE2\x86\x95";

const char* arrowTo(Side side) {
    switch (side) {
        case Side::top:
            return kUp;
        case Side::right:
            return kRight;
        case Side::bottom:
            return kDown;
        case Side::left:
            return kLeft;
    }
    return kDown;
}

// The arrows of a picture, and the edges where they stand: where text lies beside the silhouette, as in a chart that runs
// sideways, the sides of a box have no room for them.
struct Signs {
    explicit Signs(Side laterSide)
        : toChildren(arrowTo(laterSide)),
          toParents(arrowTo(opposite(laterSide))),
          toPartners(laterSide == Side::left || laterSide == Side::right ? kUpAndDown : kBothSides),
          children(laterSide == Side::top ? Side::top : Side::bottom),
          parents(opposite(children)) {}

    const char* toChildren;
    const char* toParents;
    const char* toPartners;
    Side children;
    Side parents;
};

class MarkList {
public:
    MarkList(const picture::Picture& picture, kin::Language language, Side laterSide)
        : language_(language), signs_(laterSide), marks_(picture.boxes.size()) {
        for (const Mark& mark : picture.marks) {
            if (mark.kind == MarkKind::parentsElsewhere) addParents(mark);
            if (mark.kind == MarkKind::partnersElsewhere) addPartners(mark);
        }
        for (std::vector<BoxMark>& marks : marks_) shorten(marks);
        for (const picture::FoldedBranch& folded : picture.folded) addFolded(folded);
    }

    std::vector<std::vector<BoxMark>> take() { return std::move(marks_); }

private:
    // Once, however many children of one family are elsewhere.
    void add(Index box, const char* sign, const Mark& mark, const std::string& title, Side place) {
        if (box == picture::kNone) return;
        std::vector<BoxMark>& marks = marks_[static_cast<std::size_t>(box)];
        const std::string text = joined(sign, whole(mark.number));
        const auto isThere = [&text](const BoxMark& one) { return one.text == text; };
        if (std::none_of(marks.begin(), marks.end(), isThere)) marks.push_back({text, title, place});
    }

    std::string marked(Phrase phrase, const char* sign, const Mark& mark) const {
        return phraseWith(phrase, language_, {joined(sign, whole(mark.number))});
    }

    void addParents(const Mark& mark) {
        add(mark.boxes[0], signs_.toParents, mark, marked(Phrase::childOfMarked, signs_.toChildren, mark),
            signs_.parents);
        for (const Index parent : {mark.boxes[1], mark.boxes[2]}) {
            add(parent, signs_.toChildren, mark, marked(Phrase::parentOfMarked, signs_.toParents, mark),
                signs_.children);
        }
    }

    void addPartners(const Mark& mark) {
        for (const Index partner : {mark.boxes[0], mark.boxes[1]}) {
            add(partner, signs_.toPartners, mark, marked(Phrase::partnerOfMarked, signs_.toPartners, mark),
                signs_.children);
        }
    }

    void addFolded(const picture::FoldedBranch& folded) {
        const std::string count = joined(whole(folded.count));
        const Phrase phrase = folded.branch == picture::Branch::up     ? Phrase::foldedAncestors
                              : folded.branch == picture::Branch::down ? Phrase::foldedDescendants
                                                                       : Phrase::foldedBeside;
        marks_[static_cast<std::size_t>(folded.box)].push_back(
            {"+" + count, phraseWith(phrase, language_, {count}), folded.side, true});
    }

    static void shorten(std::vector<BoxMark>& marks) {
        for (const Side place : {Side::top, Side::bottom}) {
            std::size_t count = 0;
            for (const BoxMark& mark : marks) {
                if (mark.place == place) ++count;
            }
            if (count <= kMostMarks) continue;
            std::string title;
            std::size_t kept = 0;
            std::erase_if(marks, [&](const BoxMark& mark) {
                if (mark.place != place || ++kept < kMostMarks) return false;
                put(title, (title.empty() ? "" : "; "), mark.title);
                return true;
            });
            const std::size_t left = count - kMostMarks + 1;
            marks.push_back({joined("+", whole(static_cast<long long>(left))), title, place});
        }
    }

    kin::Language language_;
    Signs signs_;
    std::vector<std::vector<BoxMark>> marks_;
};

}  // namespace

std::vector<std::vector<BoxMark>> boxMarksOf(const picture::Picture& picture, kin::Language language,
                                             Side laterSide) {
    return MarkList(picture, language, laterSide).take();
}

}  // namespace olvane::draw
