// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <functional>
#include <string>
#include <string_view>
#include <vector>

#include <olvane/gedcom/GedcomData.h>
#include <olvane/kin/PersonCaption.h>
#include <olvane/kin/PersonLabel.h>

namespace olvane::gedcom {

// What boxes and lines say beside names and years.
struct ShownFacts {
    bool dates = false;       // whole, instead of years
    bool places = false;      // of birth and death
    bool occupation = false;  // the first one
    bool marriage = false;    // its year, at the marriage line

    // Whether the file has to be read with its facts.
    bool needFacts() const { return places || occupation; }
};

// What must not be shown.
//
// Holds: persons has an entry for each person, entry 0 for person 1, or is empty for nobody. The functions give what
//        is shown of a text that may name one of them, a place or date and any other text, as HiddenNames does; not
//        set, they give all of it.
struct HiddenTexts {
    std::vector<bool> persons;
    std::function<std::string_view(std::string_view)> shownPlace;
    std::function<std::string_view(std::string_view)> shownText;
};

// Whether a name is written, and so read, with the surname first: "/Nagy/ Ilona".
bool isSurnameFirst(const PersonName& name);

// What a file says of the persons and families of a picture, in the language of its reader.
//
// Holds: refers to the data, which must outlive it. Safe to ask on several threads. Texts are at most kMostLabelBytes
//        long, and cut between two characters: a name in a file may be of any length.
// Fails: std::out_of_range for a number of nobody.
class GedcomLabels {
public:
    static constexpr std::size_t kMostLabelBytes = 4000;

    explicit GedcomLabels(const GedcomData& data, ShownFacts shown = {}, HiddenTexts hidden = {},
                          kin::Language language = kin::Language::english);

    // Of a hidden person, that they are living and nothing else.
    kin::PersonLabel ofPerson(std::int64_t id) const;
    // The year of the marriage, where it is shown; else empty.
    std::string ofFamily(FamilyId number) const;

private:
    kin::PersonLabel known(PersonId id) const;
    void addLife(const Person& person, kin::PersonLabel& label) const;
    GedcomDate shownDate(const GedcomDate& date) const;
    std::string boxText(const GedcomDate& date) const;
    void addDetails(PersonId id, kin::PersonLabel& label) const;
    std::string_view place(std::string_view text) const;
    std::string_view anyText(std::string_view text) const;

    const GedcomData* data_;
    ShownFacts shown_;
    HiddenTexts hidden_;
    std::string_view language_;
};

// What the map of a population says of each person of a file, by place: the first name, and the years of birth and death.
//
// Holds: names longer than kMostCaptionBytes are cut, in whole characters.
constexpr std::size_t kMostCaptionBytes = 200;
std::vector<kin::PersonCaption> captionsOf(const GedcomData& data);

}  // namespace olvane::gedcom
