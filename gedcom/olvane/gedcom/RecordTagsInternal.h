// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>

#include <olvane/gedcom/TagCodeInternal.h>

namespace olvane::gedcom {

// Tags that records of persons and families are read by.
constexpr std::uint64_t kAdoption = tagCode("ADOP");
constexpr std::uint64_t kAlias = tagCode("ALIA");
constexpr std::uint64_t kAlsoKnownAs = tagCode("_AKA");
constexpr std::uint64_t kAlsoKnownAsName = tagCode("_AKAN");
constexpr std::uint64_t kBirth = tagCode("BIRT");
constexpr std::uint64_t kBurial = tagCode("BURI");
constexpr std::uint64_t kChild = tagCode("CHIL");
constexpr std::uint64_t kCremation = tagCode("CREM");
constexpr std::uint64_t kDate = tagCode("DATE");
constexpr std::uint64_t kDeath = tagCode("DEAT");
constexpr std::uint64_t kDivorce = tagCode("DIV");
constexpr std::uint64_t kFamily = tagCode("FAM");
constexpr std::uint64_t kFamilyAsChild = tagCode("FAMC");
constexpr std::uint64_t kFamilyAsSpouse = tagCode("FAMS");
constexpr std::uint64_t kFatherTie = tagCode("_FREL");
constexpr std::uint64_t kGiven = tagCode("GIVN");
constexpr std::uint64_t kHeader = tagCode("HEAD");
constexpr std::uint64_t kHusband = tagCode("HUSB");
constexpr std::uint64_t kIndividual = tagCode("INDI");
constexpr std::uint64_t kMarriage = tagCode("MARR");
constexpr std::uint64_t kMarriedName = tagCode("_MARNM");
constexpr std::uint64_t kMarriedNameInFull = tagCode("_MARNAME");
constexpr std::uint64_t kMotherTie = tagCode("_MREL");
constexpr std::uint64_t kName = tagCode("NAME");
constexpr std::uint64_t kNamePrefix = tagCode("NPFX");
constexpr std::uint64_t kNameSuffix = tagCode("NSFX");
constexpr std::uint64_t kNickname = tagCode("NICK");
constexpr std::uint64_t kNo = tagCode("NO");
constexpr std::uint64_t kPedigree = tagCode("PEDI");
constexpr std::uint64_t kPhrase = tagCode("PHRASE");
constexpr std::uint64_t kPlace = tagCode("PLAC");
constexpr std::uint64_t kProbate = tagCode("PROB");
constexpr std::uint64_t kSex = tagCode("SEX");
constexpr std::uint64_t kSurname = tagCode("SURN");
constexpr std::uint64_t kSurnamePrefix = tagCode("SPFX");
constexpr std::uint64_t kTrailer = tagCode("TRLR");
constexpr std::uint64_t kType = tagCode("TYPE");
constexpr std::uint64_t kWife = tagCode("WIFE");

}  // namespace olvane::gedcom
