// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <cstdint>
#include <functional>
#include <string>
#include <string_view>

#include <olvane/gedcom/GedcomDate.h>

namespace olvane::gedcom {

// Persons and families count from 1 in the order of the file, each by its own; 0 is nobody.
using PersonId = std::uint32_t;
using FamilyId = std::uint32_t;
// Lines count from 1.
using LineNumber = std::uint32_t;

enum class Sex : std::uint8_t { male = 0, female = 1, other = 2 };

enum class Pedigree : std::uint8_t { notGiven, birth, adopted, foster, sealing, other, step };

// One NAME of a person. Pieces come from the record's own pieces (GIVN, SURN with SPFX, NPFX, NSFX, NICK);
// given name, surname and suffix come from the slashes of the value where the record has none. A married name or an alias
// that stands in a line of its own (_MARNM, _AKA, ALIA) is a name too, behind the one it stands with.
//
// Holds: valid UTF-8 without control characters, trimmed; empty where not given.
struct PersonName {
    std::string_view written;  // the value with its slashes
    std::string_view prefix;
    std::string_view given;
    std::string_view surname;
    std::string_view suffix;
    std::string_view nickname;
    std::string_view type;  // "birth", "married", "aka" and so on, as the file has it; empty where not given
};

// The whole name for a person to read: the value without its slashes, or else the pieces in order.
std::string displayName(const PersonName& name);

// The same, of a longer name the beginning that has at most mostBytes bytes, in whole characters. Time and memory grow
// with what comes back, not with the name.
std::string displayName(const PersonName& name, std::size_t mostBytes);

// The whole name in pieces of whole characters, so that a long one is not copied.
void writeDisplayName(const PersonName& name, const std::function<void(std::string_view piece)>& write);

// A run of a list that all records share.
struct Slice {
    std::uint32_t first = 0;
    std::uint32_t count = 0;
};

// A person, with relatives as a tree wants them.
//
// Holds: father and mother are the partners of parentFamily: of the first parent link of birth (or without a pedigree),
//        else of the first one; they are never outside 1 to personCount(), or 0. A person may be their own relative:
//        data, not ours.
struct Person {
    std::string_view xref;  // without its @; empty if the record has none
    GedcomDate birth;       // of the first BIRT that has a date
    GedcomDate death;       // of the first DEAT that has a date
    PersonId father = 0;
    PersonId mother = 0;
    FamilyId parentFamily = 0;  // which father and mother come from; 0 for none
    Slice nameSlice;
    Slice spouseSlice;
    Slice childSlice;
    Slice parentLinkSlice;
    Slice coupleLinkSlice;
    LineNumber line = 0;
    Sex sex = Sex::other;
    bool dead = false;  // DEAT, BURI, CREM or PROB is there
};

// A person's tie to a family, as child or as partner: a FAMC or FAMS of their own, or the family's CHIL, HUSB or WIFE
// where their own record does not name the family. family is 0 for a void pointer and for one that leads to no family.
struct FamilyLink {
    FamilyId family = 0;
    LineNumber line = 0;
    Pedigree pedigree =
        Pedigree::notGiven;  // of a child: of the PEDI, else of an ADOP or of the family's _FREL and _MREL
    bool isNamedByFamilyOnly = false;  // the family names the person, not the other way round
};

// A family's child: a CHIL, or the child's FAMC where the family does not name the child. child is 0 for a void pointer
// and for one that leads to no person.
struct ChildLink {
    PersonId child = 0;
    LineNumber line = 0;
    Pedigree pedigree = Pedigree::notGiven;  // of a CHIL: what its _FREL and _MREL say
    bool isNamedByChildOnly = false;         // the child names the family, not the other way round
};

// A family. The first two partners alone count; husband is the father, wife the mother. Two HUSB, or two WIFE, stand in
// the order of the record: the first as husband, the second as wife. A slot that the record leaves free is taken by the
// first person whose FAMS names the family. A man alone is the husband and a woman alone the wife, whatever slot the
// record gives them; so are a woman and a man who stand in each other's slot.
struct Family {
    std::string_view xref;  // without its @
    GedcomDate marriage;    // of the first MARR that has a date
    PersonId husband = 0;
    PersonId wife = 0;
    Slice childLinkSlice;
    LineNumber line = 0;
    LineNumber husbandLine = 0;  // of the HUSB, or of the person's FAMS
    LineNumber wifeLine = 0;
    bool married = false;     // MARR is there, and not as one that did not happen
    bool divorced = false;    // DIV is there, and no second MARR after it
    bool notMarried = false;  // the record says that there was no marriage, and has none
};

// Something that a file states of a person or a couple: an event or an attribute.
//
// Holds: tag is in capitals and one of the standard's, and valid until the program ends. value is what stands behind the
//        tag, or else the TYPE below it; the texts are as those of a name. An event that the file says did not
//        happen is no fact.
struct Fact {
    std::string_view tag;
    std::string_view value;
    std::string_view place;
    GedcomDate date;
    LineNumber line = 0;
};

// A line of the file that is in no other table: a note, a source, a page, a media file and so on, with the lines below it
// behind it.
//
// Holds: tag is as written, in ASCII. value is valid UTF-8 without control characters but line ends: of several lines
//        where the file has it so. Of a pointer value is the identifier, without its @.
struct DetailLine {
    std::string_view tag;
    std::string_view value;
    LineNumber line = 0;
    std::uint8_t level = 0;  // below the record: 1 for a line of its own, 2 for one of a fact or name
    bool isPointer = false;
    bool isOfPart = false;  // below a fact or a name, not below the record itself
};

// A record that others point to: a NOTE, SNOTE, SOUR, OBJE or REPO.
struct SharedRecord {
    std::string_view xref;  // without its @
    std::string_view tag;
    std::string_view value;  // the text of a note
    Slice detailSlice;
    LineNumber line = 0;
};

}  // namespace olvane::gedcom
