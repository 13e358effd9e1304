// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <cstdint>
#include <initializer_list>
#include <string>
#include <string_view>

#include <olvane/kin/Language.h>

namespace olvane::draw {

// What a picture says beside what its data say. In words/DrawingWords.cpp in every language, in this order.
enum class Phrase : std::uint8_t {
    viewOf,
    nobody,
    legend,
    focus,
    commonAncestor,
    inBoxes,
    notShown,
    oneParent,
    parents,
    oneSpouse,
    spouses,
    oneChild,
    children,
    hiddenElsewhere,
    hiddenAnywhere,
    furtherParents,
    furtherFamilies,
    addFather,
    addMother,
    ofChild,
    childOfMarked,
    parentOfMarked,
    partnerOfMarked,
    foldedAncestors,
    foldedDescendants,
    foldedBeside,
    meansHidden,
    meansSamePerson,
    meansElsewhere,
    meansFurtherParents,
    meansFolded,
    divorced,
    unmarried,
    adopted,
    foster,
    step,
    sealing,
    mapOfSheets,
    sheet,
    toSheet,
};
inline constexpr std::size_t kPhrases = 40;

// A phrase without arguments, or with its {} as they are.
std::string_view wordsOf(Phrase phrase, kin::Language language);

// With the arguments in the places of its {}.
std::string phraseWith(Phrase phrase, kin::Language language,
                       std::initializer_list<std::string_view> arguments);

// "Family" for the view "family"; a view of another name is called by it.
std::string viewTitle(std::string_view view, kin::Language language);

}  // namespace olvane::draw
