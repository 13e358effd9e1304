// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// From a file to a picture, and what the file says of those in it.

#include <cli/PictureRun.h>

#include <algorithm>
#include <span>
#include <utility>

#include <olvane/source/GedcomDataSource.h>
#include <olvane/source/GedcomKin.h>

#include <cli/FocusChoice.h>
#include <cli/PersonJson.h>

namespace olvane::cli {

namespace {

constexpr const char* kLivingJson = "{\"living\": true}";

}  // namespace

PictureRun::PictureRun(const gedcom::GedcomData& data, const LayoutRequest& request, std::vector<bool> hidden)
    : data_(data),
      view_{request.chart, request.unknownParents},
      hidden_(std::move(hidden)),
      hiddenNames_(data, hidden_),
      parents_(request.parents),
      graph_(gedcom::kinGraphOf(data, request.parents)) {
    charts::setBoxForm(view_.chart, request.boxes);
    charts::flagBeyondGenerations(view_.chart);
    if (request.view() == View::kinship) view_.chart.to = graph_.placeOf(chooseFocus(data, request.to));
}

bool PictureRun::isHidden(std::int64_t id) const {
    return id > 0 && static_cast<std::size_t>(id) <= hidden_.size() &&
           hidden_[static_cast<std::size_t>(id - 1)];
}

picture::Picture PictureRun::pictureOf(gedcom::PersonId focus) const {
    gedcom::GedcomDataSource people(data_, parents_);
    charts::ViewRequest view = view_;
    view.chart.focus = graph_.placeOf(focus);
    picture::Picture picture = charts::pictureOf(limitedSource(people), graph_, view);
    if (!hidden_.empty()) hideIn(picture);
    return picture;
}

void PictureRun::hideIn(picture::Picture& picture) const {
    const auto isHiddenBox = [&](picture::Index box) {
        return isHidden(picture.boxes[static_cast<std::size_t>(box)].id);
    };
    for (picture::Box& box : picture.boxes) {
        if (isHidden(box.id)) box.furtherParents = 0;
    }
    for (picture::Family& family : picture.families) {
        const auto parents = picture.parents(family);
        const auto children = picture.children(family);
        for (std::size_t i = 0; i < children.size(); ++i) {
            if (isHiddenBox(children[i])) {
                picture.childKinds[family.firstMember + family.parentCount + i] = kin::ChildKind::unknown;
            }
        }
        if (std::none_of(parents.begin(), parents.end(), isHiddenBox)) continue;
        family.number = 0;
        family.style = kin::UnionState::unknown;
    }
    hideWaysIn(picture);
}

// The words of a way state an adoption and whether a marriage lasts, and those at its ends state all ways.
void PictureRun::hideWaysIn(picture::Picture& picture) const {
    for (picture::Way& way : picture.ways) {
        const auto boxes = picture.boxesOf(way);
        if (std::none_of(boxes.begin(), boxes.end(), [&](picture::Index box) {
                return isHidden(picture.boxes[static_cast<std::size_t>(box)].id);
            })) {
            continue;
        }
        way.words.clear();
        if (way.kind == picture::WayKind::legal) way.kind = picture::WayKind::blood;
        picture.focusIs.clear();
        picture.otherIs.clear();
    }
}

picture::PictureFacts PictureRun::facts() const {
    picture::PictureFacts facts;
    facts.person = [this](std::int64_t id) {
        if (isHidden(id)) return std::string(kLivingJson);
        return personJson(data_, static_cast<gedcom::PersonId>(id), hiddenNames_)
            .dump(-1, ' ', false, nlohmann::ordered_json::error_handler_t::replace);
    };
    facts.familyXref = [this](std::uint32_t number) {
        return std::string(hiddenNames_.shownText(data_.family(number).xref));
    };
    facts.familyLabel = [this](std::uint32_t number) {
        const gedcom::GedcomDate& marriage = data_.family(number).marriage;
        return hiddenNames_.shownPlace(marriage.written).empty() ? std::string()
                                                                 : gedcom::displayYear(marriage);
    };
    return facts;
}

std::string PictureRun::jsonOf(gedcom::PersonId focus) const {
    return picture::pictureJson(pictureOf(focus), facts());
}

}  // namespace olvane::cli
