// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/picture/LayoutPicture.h>

#include <algorithm>
#include <cmath>
#include <cstddef>
#include <map>
#include <utility>
#include <vector>

#include <olvane/kin/shared/Index.h>
#include <olvane/picture/PersonMarksInternal.h>
#include <olvane/picture/shared/FurtherParents.h>

namespace olvane::picture {

namespace {

constexpr kin::UnionPlace kNoUnion = -1;

using kin::at;

// As the coordinates are cut, and like them within the range of an int.
float wholeSize(float size) {
    constexpr float kGreatest = 2147483520.0F;  // the greatest float below 2^31
    return size > 0 ? std::trunc(std::min(size, kGreatest)) : 0;
}

struct FamilyChild {
    Index box = kNone;
    kin::ChildKind kind = kin::ChildKind::birth;
};

struct PictureFamily {
    std::vector<Index> parents;
    std::vector<FamilyChild> children;
    kin::UnionPlace known = kNoUnion;
};

class LayoutPainter {
public:
    LayoutPainter(const TypedLayout& layout, const LayoutPictureOptions& options)
        : layout_(layout), options_(options), known_(options.known) {}

    Picture paint() {
        picture_.view = layout_.view == TypedLayout::View::pedigree ? "pedigree" : "family";
        addBoxes();
        for (const TypedLayout::Family& family : layout_.families) addFamily(family);
        mergeSiblings();
        writeFamilies();
        numberRepeats(picture_);
        if (known_ != nullptr) {
            countHidden(*known_, picture_);
            markShownElsewhere(*known_, picture_);
        }
        RouteOptions route;
        route.direction = directionOf(layout_.view);
        routeLines(picture_, route);
        return std::move(picture_);
    }

private:
    bool isUnknown(const TypedLayout::Box& box) const { return box.kind != TypedLayout::BoxKind::person; }

    void addBoxes() {
        boxOf_.assign(layout_.boxes.size(), kNone);
        for (std::size_t i = 0; i < layout_.boxes.size(); ++i) {
            const TypedLayout::Box& box = layout_.boxes[i];
            const bool isLeftOut =
                box.repeatOf != TypedLayout::kNone || (isUnknown(box) && !options_.unknownParents);
            if (isLeftOut) continue;
            boxOf_[i] = static_cast<Index>(picture_.boxes.size());
            picture_.boxes.push_back(pictureBox(box));
        }
        for (std::size_t i = 0; i < layout_.boxes.size(); ++i) {
            if (boxOf_[i] == kNone || layout_.boxes[i].childOf == TypedLayout::kNone) continue;
            picture_.boxes[at(boxOf_[i])].childOf = boxOf(layout_.boxes[i].childOf);
        }
        if (!picture_.boxes.empty()) picture_.focus = 0;
    }

    Box pictureBox(const TypedLayout::Box& box) const {
        Box result;
        result.x = box.x;
        result.y = box.y;
        result.width = wholeSize(layout_.sizes.nodeWidth);
        result.height = wholeSize(layout_.sizes.nodeHeight);
        if (isUnknown(box)) {
            result.kind = BoxKind::unknownParent;
            result.sex = box.kind == TypedLayout::BoxKind::unknownFather ? kin::Sex::male : kin::Sex::female;
            return result;
        }
        result.id = box.id;
        result.hasFlag = true;
        result.flag = box.hasHiddenRelatives;
        const kin::Place person = placeOf(box.id);
        result.sex = person != kin::kNobody ? known_->sex(person)
                     : box.male             ? kin::Sex::male
                                            : kin::Sex::female;
        return result;
    }

    // The box of the picture, of a repeated box the one that it repeats.
    Index boxOf(TypedLayout::Index box) const {
        if (box < 0 || at(box) >= layout_.boxes.size()) return kNone;
        const TypedLayout::Index first = layout_.boxes[at(box)].repeatOf;
        if (first >= 0 && first < box) return boxOf_[at(first)];
        return boxOf_[at(box)];
    }

    kin::Place placeOf(std::int64_t id) const {
        return known_ != nullptr ? known_->placeOf(id) : kin::kNobody;
    }
    kin::Place placeOfBox(Index box) const {
        return picture_.boxes[at(box)].kind == BoxKind::person ? placeOf(picture_.boxes[at(box)].id)
                                                               : kin::kNobody;
    }

    // One family of the layout, split into the known ones.
    void addFamily(const TypedLayout::Family& family) {
        std::vector<Index> parents;
        for (const TypedLayout::Index parent : layout_.parentsOf(family)) {
            const Index box = boxOf(parent);
            if (box != kNone && (parents.empty() || parents[0] != box)) parents.push_back(box);
        }
        if (parents.empty()) return;
        std::map<kin::UnionPlace, std::size_t> parts;
        const auto partOf = [&](kin::UnionPlace u) -> PictureFamily& {
            const auto [part, isNew] = parts.emplace(u, families_.size());
            if (isNew) families_.push_back({parents, {}, u});
            return families_[part->second];
        };
        for (const TypedLayout::Index c : layout_.childrenOf(family)) {
            const Index child = boxOf(c);
            if (child == kNone) continue;
            const kin::UnionPlace u = unionOfChild(parents, child);
            std::vector<FamilyChild>& children = partOf(u).children;
            const auto isChild = [child](const FamilyChild& other) { return other.box == child; };
            if (std::none_of(children.begin(), children.end(), isChild))
                children.push_back({child, kindOf(u, child)});
        }
        for (const kin::UnionPlace u : unionsOfCouple(parents)) partOf(u);
        if (parts.empty() && parents.size() == 2) partOf(kNoUnion);
    }

    bool has(kin::UnionPlace u, kin::Place person) const {
        const auto& partners = known_->partners(u);
        return partners[0] == person || partners[1] == person;
    }

    // The child's first known family with all parents who are drawn: with the couple alone, or of a lone
    // parent the one that the data source names first.
    kin::UnionPlace unionOfChild(const std::vector<Index>& parents, Index child) const {
        const kin::Place person = placeOfBox(child);
        if (person == kin::kNobody) return kNoUnion;
        for (const kin::UnionPlace u : known_->unionsAsChild(person)) {
            const bool fits = std::all_of(parents.begin(), parents.end(), [&](Index parent) {
                const kin::Place place = placeOfBox(parent);
                if (picture_.boxes[at(parent)].kind == BoxKind::unknownParent) return hasFreeSlot(u);
                return place != kin::kNobody && has(u, place);
            });
            if (fits) return u;
        }
        return kNoUnion;
    }

    bool hasFreeSlot(kin::UnionPlace u) const {
        const auto& partners = known_->partners(u);
        return partners[0] == kin::kNobody || partners[1] == kin::kNobody;
    }

    kin::ChildKind kindOf(kin::UnionPlace u, Index child) const {
        if (u == kNoUnion) return kin::ChildKind::birth;
        const auto children = known_->children(u);
        const auto found = std::find(children.begin(), children.end(), placeOfBox(child));
        return known_->childKinds(u)[static_cast<std::size_t>(found - children.begin())];
    }

    // All known families of two persons.
    std::vector<kin::UnionPlace> unionsOfCouple(const std::vector<Index>& parents) const {
        std::vector<kin::UnionPlace> unions;
        if (parents.size() < 2) return unions;
        const kin::Place one = placeOfBox(parents[0]);
        const kin::Place other = placeOfBox(parents[1]);
        if (one == kin::kNobody || other == kin::kNobody) return unions;
        for (const kin::UnionPlace u : known_->unionsAsPartner(one)) {
            if (known_->otherPartner(u, one) == other) unions.push_back(u);
        }
        return unions;
    }

    // Full siblings whose other parent is not known are one family, although the layout hangs the focus from both and the
    // others from the known parent alone. All join the one with the box of the unknown parent, or without it the first.
    void mergeSiblings() {
        std::map<std::pair<kin::UnionPlace, Index>, std::size_t> together;
        for (const std::size_t parents : {2U, 1U}) {
            for (std::size_t f = 0; f < families_.size(); ++f) {
                const PictureFamily& family = families_[f];
                if (family.known == kNoUnion || family.parents.size() != parents) continue;
                const Index parent = parents == 2 ? knownParent(family) : family.parents[0];
                if (parent != kNone) together.emplace(std::pair(family.known, parent), f);
            }
        }
        for (std::size_t f = 0; f < families_.size(); ++f) {
            PictureFamily& family = families_[f];
            if (family.known == kNoUnion || family.parents.size() != 1) continue;
            const std::size_t first = together.at({family.known, family.parents[0]});
            if (first == f) continue;
            std::vector<FamilyChild>& children = families_[first].children;
            children.insert(children.end(), family.children.begin(), family.children.end());
            family.children.clear();
        }
    }

    // The person of a couple whose other one is an unknown parent; kNone for other families.
    Index knownParent(const PictureFamily& family) const {
        if (family.parents.size() != 2) return kNone;
        const bool first = picture_.boxes[at(family.parents[0])].kind == BoxKind::person;
        const bool second = picture_.boxes[at(family.parents[1])].kind == BoxKind::person;
        if (first == second) return kNone;
        return family.parents[first ? 0 : 1];
    }

    void writeFamilies() {
        for (const PictureFamily& family : families_) {
            if (family.parents.size() + family.children.size() < 2) continue;
            Family result;
            result.firstMember = static_cast<std::uint32_t>(picture_.members.size());
            result.parentCount = static_cast<std::uint8_t>(family.parents.size());
            result.childCount = static_cast<std::uint32_t>(family.children.size());
            if (family.known != kNoUnion) {
                result.number = known_->family(family.known);
                result.style = known_->state(family.known);
            }
            for (const Index parent : family.parents) {
                picture_.members.push_back(parent);
                picture_.childKinds.push_back(kin::ChildKind::birth);
            }
            for (const FamilyChild& child : family.children) {
                picture_.members.push_back(child.box);
                picture_.childKinds.push_back(child.kind);
            }
            picture_.families.push_back(result);
        }
    }

    const TypedLayout& layout_;
    const LayoutPictureOptions& options_;
    const kin::KinGraph* known_;
    Picture picture_;
    std::vector<Index> boxOf_;  // by box of the layout
    std::vector<PictureFamily> families_;
};

}  // namespace

Picture pictureOf(const TypedLayout& layout, const LayoutPictureOptions& options) {
    Picture picture = LayoutPainter(layout, options).paint();
    if (options.known != nullptr) countFurtherParents(picture, *options.known);
    return picture;
}

Direction directionOf(TypedLayout::View view) {
    return view == TypedLayout::View::pedigree ? Direction::left : Direction::down;
}

}  // namespace olvane::picture
