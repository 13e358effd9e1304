// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// From a file to a picture, and what the file says of those in it.

#include <cli/PictureRun.h>

#include <utility>

#include <olvane/picture/HiddenPersons.h>
#include <olvane/picture/PictureNames.h>
#include <olvane/source/GedcomDataSource.h>
#include <olvane/source/GedcomKin.h>

#include <cli/FocusChoice.h>
#include <cli/PersonJson.h>

namespace olvane::cli {

namespace {

constexpr const char* kLivingJson = "{\"living\": true}";

// "Ann Berg:down"; without a branch, all three of the person.
std::vector<charts::Fold> foldsOf(const gedcom::GedcomData& data, const std::string& word) {
    constexpr picture::Branch kBranches[] = {picture::Branch::up, picture::Branch::down,
                                             picture::Branch::beside};
    for (const picture::Branch branch : kBranches) {
        const std::string end = ":" + std::string(picture::nameOf(branch));
        if (!word.ends_with(end)) continue;
        return {{chooseFocus(data, word.substr(0, word.size() - end.size())), branch}};
    }
    const gedcom::PersonId person = chooseFocus(data, word);
    std::vector<charts::Fold> folds;
    for (const picture::Branch branch : kBranches) folds.push_back({person, branch});
    return folds;
}

}  // namespace

PictureRun::PictureRun(const gedcom::GedcomData& data, const LayoutRequest& request, std::vector<bool> hidden)
    : data_(data),
      view_(request),
      hidden_(std::move(hidden)),
      hiddenNames_(data, hidden_),
      parents_(request.parents),
      graph_(gedcom::kinGraphOf(data, request.parents)) {
    charts::setBoxForm(view_.chart, request.boxes);
    charts::flagBeyondGenerations(view_.chart);
    for (const std::string& word : request.folds) {
        for (const charts::Fold& fold : foldsOf(data, word)) folds_.push_back(fold);
    }
    if (request.view() == View::kinship) view_.chart.to = graph_.placeOf(chooseFocus(data, request.to));
}

picture::Picture PictureRun::pictureOf(gedcom::PersonId focus) const {
    gedcom::GedcomDataSource people(data_, parents_);
    charts::ViewRequest view = view_;
    view.chart.focus = graph_.placeOf(focus);
    view.chart.folded = folds_;
    picture::Picture picture = charts::pictureOf(limitedSource(people), graph_, view);
    picture::hidePersons(hidden_, picture);
    return picture;
}

picture::PictureFacts PictureRun::facts() const {
    picture::PictureFacts facts;
    facts.person = [this](std::int64_t id, const picture::TextSink& write) {
        if (picture::isHidden(hidden_, id)) return write(kLivingJson);
        JsonOutput json(write, JsonOutput::Form::compact);
        json.beginObject();
        writePersonFields(data_, static_cast<gedcom::PersonId>(id), hiddenNames_, json);
        json.endObject();
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

void PictureRun::writeJson(const picture::Picture& picture, const picture::TextSink& write) const {
    picture::writePictureJson(picture, facts(), write);
}

}  // namespace olvane::cli
