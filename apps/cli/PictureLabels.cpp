// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What a GEDCOM file tells of the persons of a picture.

#include <cli/PictureLabels.h>

#include <algorithm>
#include <memory>
#include <unordered_set>
#include <utility>

namespace olvane::cli {

namespace {

using Ids = std::unordered_set<std::int64_t>;

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

int countMissing(std::span<const gedcom::PersonId> persons, const Ids& shown) {
    return static_cast<int>(std::count_if(persons.begin(), persons.end(),
                                          [&](gedcom::PersonId id) { return !shown.contains(id); }));
}

draw::HiddenRelatives countHidden(const gedcom::GedcomData& data, gedcom::PersonId id, const Ids& shown) {
    const gedcom::Person& person = data.person(id);
    draw::HiddenRelatives hidden;
    for (const gedcom::PersonId parent : {person.father, person.mother}) {
        if (parent != 0 && !shown.contains(parent)) ++hidden.parents;
    }
    hidden.spouses = countMissing(data.spouses(id), shown);
    hidden.children = countMissing(data.children(id), shown);
    return hidden;
}

void fillName(const gedcom::PersonName& name, draw::PersonLabel& label) {
    label.given = name.given;
    label.surname = name.surname;
    if (label.given.empty() && label.surname.empty()) label.given = gedcom::displayName(name);
    label.surnameFirst = name.written.starts_with('/') && !name.written.ends_with('/');
}

draw::PersonLabel labelOf(const gedcom::GedcomData& data, gedcom::PersonId id, const Ids& shown) {
    const gedcom::Person& person = data.person(id);
    draw::PersonLabel label;
    fillName(data.firstName(id), label);
    if (person.birth.isGiven()) label.birth = gedcom::displayYear(person.birth);
    if (person.death.isGiven()) label.death = gedcom::displayYear(person.death);
    label.sex = labelSex(person.sex);
    label.hidden = countHidden(data, id, shown);
    return label;
}

// Holds nothing of the person, so that nothing can get out.
draw::PersonLabel livingLabel() {
    draw::PersonLabel label;
    label.living = true;
    return label;
}

// The link to the parents who are drawn: the first by birth, or else the first of all.
draw::ParentLink parentLinkOf(const gedcom::GedcomData& data, gedcom::PersonId id) {
    const auto links = data.parentLinks(id);
    for (const gedcom::FamilyLink& link : links) {
        if (link.pedigree == gedcom::Pedigree::birth || link.pedigree == gedcom::Pedigree::notGiven) {
            return draw::ParentLink::birth;
        }
    }
    if (links.empty()) return draw::ParentLink::birth;
    switch (links.front().pedigree) {
        case gedcom::Pedigree::adopted:
            return draw::ParentLink::adopted;
        case gedcom::Pedigree::foster:
            return draw::ParentLink::foster;
        default:
            return draw::ParentLink::birth;
    }
}

bool areCouple(const gedcom::Family& family, gedcom::PersonId one, gedcom::PersonId other) {
    return (family.husband == one && family.wife == other) || (family.husband == other && family.wife == one);
}

// Divorced in each family record that the two share; a second marriage of the two undoes it.
bool areDivorced(const gedcom::GedcomData& data, gedcom::PersonId one, gedcom::PersonId other) {
    bool divorced = false;
    for (const gedcom::FamilyLink& link : data.coupleLinks(one)) {
        if (link.family == 0 || !areCouple(data.family(link.family), one, other)) continue;
        if (!data.family(link.family).divorced) return false;
        divorced = true;
    }
    return divorced;
}

gedcom::PersonId asPerson(std::int64_t id) {
    return static_cast<gedcom::PersonId>(id);
}

}  // namespace

draw::DrawingContent pictureContent(const gedcom::GedcomData& data, std::vector<LayoutRecord> records,
                                    gedcom::PersonId focus, std::vector<bool> living) {
    const auto shown = std::make_shared<Ids>();
    for (const LayoutRecord& record : records) shown->insert(record.id);
    draw::DrawingContent content;
    content.records = std::move(records);
    content.focusId = focus;
    const auto isLiving = [living = std::move(living)](gedcom::PersonId id) {
        return !living.empty() && living[id - 1];
    };
    content.labelOf = [&data, shown, isLiving](std::int64_t id) {
        return isLiving(asPerson(id)) ? livingLabel() : labelOf(data, asPerson(id), *shown);
    };
    // Of the living the lines tell no more than the boxes do.
    content.parentLinkOf = [&data, isLiving](std::int64_t id) {
        return isLiving(asPerson(id)) ? draw::ParentLink::birth : parentLinkOf(data, asPerson(id));
    };
    content.isDivorced = [&data, isLiving](std::int64_t one, std::int64_t other) {
        if (isLiving(asPerson(one)) || isLiving(asPerson(other))) return false;
        return areDivorced(data, asPerson(one), asPerson(other));
    };
    return content;
}

}  // namespace olvane::cli
