// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <cstdint>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

#include <olvane/gedcom/GedcomData.h>

namespace olvane::gedcom {

// A source that something is known from.
struct Citation {
    std::string_view
        title;  // of the source record, else its short title; else what stands at the place itself
    std::string_view author;
    std::string_view publication;
    std::string_view page;       // where in the source
    std::string_view text;       // what the source says
    std::optional<int> quality;  // 0 unreliable to 3 primary evidence, as the file has it
    LineNumber line = 0;
};

// A picture, recording or document.
struct MediaFile {
    std::string_view title;
    std::string_view
        file;  // a path, a name in the archive or an address, as the file has it: nothing is opened
    std::string_view format;  // "jpeg", "image/jpeg"; empty where not given
};

// What a file knows beyond names and facts, of a person, a family, a fact or a name. Shared records are followed.
//
// Lifetime: views of the data that they come from.
struct Details {
    std::string_view type;  // what sort of event, in the file's own words
    std::string_view cause;
    std::string_view age;  // of the person
    std::string_view husbandAge;
    std::string_view wifeAge;
    std::string_view agency;  // who was responsible: a church, an office
    std::string address;      // its lines, joined by line ends
    std::vector<std::string_view> notes;
    std::vector<Citation> citations;
    std::vector<MediaFile> media;
    std::vector<std::string_view> links;  // addresses of pages, as written: they begin with anything

    bool isEmpty() const;
};

// Of the person or family itself, without those of its facts and names. Empty unless details were read.
Details personDetails(const GedcomData& data, PersonId id);
Details familyDetails(const GedcomData& data, FamilyId id);
Details factDetails(const GedcomData& data, const Fact& fact);
Details nameDetails(const GedcomData& data, const PersonName& name);

// The line in front with all lines below it; they are dropped from rest, which is not empty.
std::span<const DetailLine> takeDetailTree(std::span<const DetailLine>& rest);

// Whether the address is one that a page may offer as a link: http, https, and nothing else.
bool isWebAddress(std::string_view address);

}  // namespace olvane::gedcom
