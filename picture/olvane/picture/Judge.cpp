// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Each group of counts has a file of its own, since each needs another look at the picture: JudgeCouples, JudgeCollisions,
// JudgeCells and JudgeUnjoined share what one sweep finds and are one class; JudgePersons, JudgeSizes and JudgeRelations
// read the picture alone. Here they are put together.

#include <olvane/picture/Judge.h>

#include <algorithm>
#include <cmath>
#include <unordered_map>

#include <olvane/kin/shared/Index.h>
#include <olvane/picture/PictureJudgeInternal.h>

namespace olvane::picture {

using kin::at;

PictureJudge::PictureJudge(const Picture& picture)
    : picture_(picture),
      members_(picture),
      groups_(picture.lines.size() + members_.count()),
      familyOfLine_(picture.lines.size(), kNone) {
    for (std::size_t f = 0; f < picture.families.size(); ++f) {
        const Family& family = picture.families[f];
        for (std::uint32_t i = 0; i < family.lineCount; ++i) {
            familyOfLine_[family.firstLine + i] = static_cast<Index>(f);
        }
    }
}

// What is joined is known when the sweep is done.
void PictureJudge::run(Judgement& judgement) {
    listCouples();
    sweep();
    if (picture_.isRound()) judgeCells();
    listUnjoined();
    countPairs(judgement);
}

void PictureJudge::countPairs(Judgement& judgement) {
    for (auto* pairs : {&overlaps_, &hits_, &crossings_, &tracks_, &touches_, &unjoined_}) {
        keepEachOnce(*pairs);
    }
    judgement.overlaps = overlaps_.size();
    judgement.hits = hits_.size();
    judgement.crossings = crossings_.size();
    judgement.tracks = tracks_.size();
    judgement.touches = touches_.size();
    judgement.unjoined = unjoined_.size();
    judgement.couples = couples_.size();
    judgement.sideBySide = static_cast<std::size_t>(
        std::count_if(strips_.begin(), strips_.end(), [](const CoupleStrip& s) { return s.isFree; }));
}

std::vector<Finding> PictureJudge::findings() const {
    std::vector<Finding> found;
    const auto list = [&found](FindingKind kind, const std::vector<Pair>& pairs) {
        for (const auto& [one, other] : pairs) found.push_back({kind, one, other});
    };
    list(FindingKind::overlap, overlaps_);
    list(FindingKind::hit, hits_);
    list(FindingKind::crossing, crossings_);
    list(FindingKind::track, tracks_);
    list(FindingKind::touch, touches_);
    list(FindingKind::unjoined, unjoined_);
    return found;
}

namespace {

std::unordered_map<std::int64_t, Point> placesFromFocus(const Picture& picture) {
    std::unordered_map<std::int64_t, Point> places;
    Point origin;
    if (picture.focus != kNone) {
        const Box& box = picture.boxes[at(picture.focus)];
        origin = {box.x, box.y};
    }
    for (const Box& box : picture.boxes) {
        if (box.kind == BoxKind::person && box.repeat <= 1) {
            places.emplace(box.id, Point{box.x - origin.x, box.y - origin.y});
        }
    }
    return places;
}

}  // namespace

Judgement judge(const Picture& picture, const kin::KinGraph* known, std::vector<Finding>* findings) {
    Judgement judgement;
    judgement.boxes = picture.boxes.size();
    judgement.families = picture.families.size();
    PictureJudge judge(picture);
    judge.run(judgement);
    countPersons(picture, judgement);
    countMarks(picture, judgement);
    measure(picture, judgement);
    if (known != nullptr) judgement.untold = countUntold(picture, *known);
    if (findings != nullptr) *findings = judge.findings();
    return judgement;
}

double movedShare(const Picture& before, const Picture& after) {
    const auto old = placesFromFocus(before);
    std::size_t both = 0;
    std::size_t moved = 0;
    for (const auto& [id, place] : placesFromFocus(after)) {
        const auto found = old.find(id);
        if (found == old.end()) continue;
        ++both;
        const bool stands =
            std::abs(found->second.x - place.x) <= 0.5 && std::abs(found->second.y - place.y) <= 0.5;
        if (!stands) ++moved;
    }
    return both == 0 ? 0 : static_cast<double>(moved) / static_cast<double>(both);
}

}  // namespace olvane::picture
