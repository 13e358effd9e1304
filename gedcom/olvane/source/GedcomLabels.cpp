// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/source/GedcomLabels.h>

#include <utility>

#include <olvane/gedcom/DateText.h>

namespace olvane::gedcom {

namespace {

kin::Sex sexOf(Sex sex) {
    switch (sex) {
        case Sex::male:
            return kin::Sex::male;
        case Sex::female:
            return kin::Sex::female;
        case Sex::other:
            break;
    }
    return kin::Sex::unknown;
}

std::string beginningOf(std::string_view text) {
    if (text.size() <= GedcomLabels::kMostLabelBytes) return std::string(text);
    std::size_t end = GedcomLabels::kMostLabelBytes;
    while (end > 0 && (static_cast<unsigned char>(text[end]) & 0xC0u) == 0x80u) --end;
    return std::string(text.substr(0, end));
}

void setName(const PersonName& name, kin::PersonLabel& label) {
    label.given = beginningOf(name.given);
    label.surname = beginningOf(name.surname);
    if (label.given.empty() && label.surname.empty())
        label.given = displayName(name, GedcomLabels::kMostLabelBytes);
    label.surnameFirst = isSurnameFirst(name);
}

}  // namespace

bool isSurnameFirst(const PersonName& name) {
    return name.written.starts_with('/') && !name.written.ends_with('/');
}

GedcomLabels::GedcomLabels(const GedcomData& data, ShownFacts shown, HiddenTexts hidden,
                           kin::Language language)
    : data_(&data), shown_(shown), hidden_(std::move(hidden)), language_(kin::languageCode(language)) {}

kin::PersonLabel GedcomLabels::ofPerson(std::int64_t id) const {
    const auto person = static_cast<PersonId>(id);
    if (hidden_.persons.empty() || !hidden_.persons.at(person - 1)) return known(person);
    // Holds nothing of the person, so that nothing can get out.
    kin::PersonLabel living;
    living.living = true;
    return living;
}

std::string GedcomLabels::ofFamily(FamilyId number) const {
    if (!shown_.marriage) return {};
    return beginningOf(displayYear(shownDate(data_->family(number).marriage), language_));
}

kin::PersonLabel GedcomLabels::known(PersonId id) const {
    const Person& person = data_->person(id);
    kin::PersonLabel label;
    setName(data_->firstName(id), label);
    addLife(person, label);
    label.sex = sexOf(person.sex);
    if (shown_.needFacts()) addDetails(id, label);
    return label;
}

void GedcomLabels::addLife(const Person& person, kin::PersonLabel& label) const {
    const GedcomDate birth = shownDate(person.birth);
    const GedcomDate death = shownDate(person.death);
    label.birth = boxText(birth);
    label.death = boxText(death);
    label.dead = person.dead;
    if (shown_.dates) {
        label.shortBirth = beginningOf(displayYear(birth, language_));
        label.shortDeath = beginningOf(displayYear(death, language_));
    }
    label.life =
        beginningOf(shown_.dates ? lifeText(birth, death, language_) : yearsText(birth, death, language_));
}

// Nothing where it must not be shown.
GedcomDate GedcomLabels::shownDate(const GedcomDate& date) const {
    return place(date.written).empty() ? GedcomDate() : date;
}

std::string GedcomLabels::boxText(const GedcomDate& date) const {
    return beginningOf(shown_.dates ? dateText(date, language_) : displayYear(date, language_));
}

// Birth and death with their places, in the order of life, then the occupation.
void GedcomLabels::addDetails(PersonId id, kin::PersonLabel& label) const {
    std::string_view birthPlace;
    std::string_view deathPlace;
    std::string_view occupation;
    for (const Fact& fact : data_->factsOfPerson(id)) {
        if (fact.tag == "BIRT" && birthPlace.empty()) birthPlace = place(fact.place);
        if (fact.tag == "DEAT" && deathPlace.empty()) deathPlace = place(fact.place);
        if (fact.tag == "OCCU" && occupation.empty()) occupation = anyText(fact.value);
    }
    if (shown_.places && !birthPlace.empty())
        label.details.push_back("* " + beginningOf(placeText(birthPlace)));
    if (shown_.places && !deathPlace.empty())
        label.details.push_back("\xE2\x80\xA0 " + beginningOf(placeText(deathPlace)));
    if (shown_.occupation && !occupation.empty()) label.details.push_back(beginningOf(occupation));
}

std::string_view GedcomLabels::place(std::string_view text) const {
    return hidden_.shownPlace ? hidden_.shownPlace(text) : text;
}

std::string_view GedcomLabels::anyText(std::string_view text) const {
    return hidden_.shownText ? hidden_.shownText(text) : text;
}

}  // namespace olvane::gedcom
