// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What a GEDCOM file says of the persons of a picture.

#include <cli/PictureLabels.h>

#include <string_view>
#include <utility>

#include <olvane/gedcom/HiddenNames.h>

namespace olvane::cli {

namespace {

draw::LabelSex labelSex(gedcom::Sex sex) {
    switch (sex) {
        case gedcom::Sex::male:
            return draw::LabelSex::male;
        case gedcom::Sex::female:
            return draw::LabelSex::female;
        case gedcom::Sex::other:
            break;
    }
    return draw::LabelSex::other;
}

void fillName(const gedcom::PersonName& name, draw::PersonLabel& label) {
    label.given = name.given;
    label.surname = name.surname;
    if (label.given.empty() && label.surname.empty()) label.given = gedcom::displayName(name);
    label.surnameFirst = name.written.starts_with('/') && !name.written.ends_with('/');
}

std::string dateText(const gedcom::GedcomDate& date, const ShownFacts& shown,
                     const gedcom::HiddenNames& hiddenNames) {
    if (hiddenNames.shownPlace(date.written).empty()) return std::string();
    return shown.dates ? std::string(date.written) : gedcom::displayYear(date);
}

// Birth and death with their places, in the order of life, then the occupation.
void fillDetails(const gedcom::GedcomData& data, gedcom::PersonId id, const ShownFacts& shown,
                 const gedcom::HiddenNames& hiddenNames, draw::PersonLabel& label) {
    std::string birthPlace;
    std::string deathPlace;
    std::string occupation;
    for (const gedcom::Fact& fact : data.factsOfPerson(id)) {
        if (fact.tag == "BIRT" && birthPlace.empty()) birthPlace = hiddenNames.shownPlace(fact.place);
        if (fact.tag == "DEAT" && deathPlace.empty()) deathPlace = hiddenNames.shownPlace(fact.place);
        if (fact.tag == "OCCU" && occupation.empty()) occupation = hiddenNames.shownText(fact.value);
    }
    if (shown.places && !birthPlace.empty()) label.details.push_back("* " + birthPlace);
    if (shown.places && !deathPlace.empty()) label.details.push_back("\xE2\x80\xA0 " + deathPlace);
    if (shown.occupation && !occupation.empty()) label.details.push_back(occupation);
}

draw::PersonLabel labelOf(const gedcom::GedcomData& data, gedcom::PersonId id, const ShownFacts& shown,
                          const gedcom::HiddenNames& hiddenNames) {
    const gedcom::Person& person = data.person(id);
    draw::PersonLabel label;
    fillName(data.firstName(id), label);
    label.birth = dateText(person.birth, shown, hiddenNames);
    label.death = dateText(person.death, shown, hiddenNames);
    label.sex = labelSex(person.sex);
    if (shown.needFacts()) fillDetails(data, id, shown, hiddenNames, label);
    return label;
}

// Holds nothing of the person, so that nothing can get out.
draw::PersonLabel livingLabel() {
    draw::PersonLabel label;
    label.living = true;
    return label;
}

}  // namespace

draw::DrawingContent pictureContent(const gedcom::GedcomData& data, picture::Picture picture,
                                    const ShownFacts& shown, std::vector<bool> hidden) {
    draw::DrawingContent content;
    content.picture = std::move(picture);
    content.countsHidden = true;
    const gedcom::HiddenNames hiddenNames(data, hidden);
    content.labelOf = [&data, shown, hiddenNames, hidden = std::move(hidden)](std::int64_t id) {
        const auto person = static_cast<gedcom::PersonId>(id);
        const bool isHidden = !hidden.empty() && hidden[person - 1];
        return isHidden ? livingLabel() : labelOf(data, person, shown, hiddenNames);
    };
    if (shown.marriage) {
        content.familyLabelOf = [&data, hiddenNames](std::uint32_t number) {
            const gedcom::GedcomDate& marriage = data.family(number).marriage;
            return hiddenNames.shownPlace(marriage.written).empty() ? std::string()
                                                                    : gedcom::displayYear(marriage);
        };
    }
    return content;
}

}  // namespace olvane::cli
