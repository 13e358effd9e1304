// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string>
#include <string_view>
#include <vector>

#include <olvane/kin/KinGraph.h>
#include <olvane/kin/Language.h>

namespace olvane::kin {

// What a box says about its person. UTF-8; any text is allowed, it is data and never markup.
struct PersonLabel {
    std::string given;
    std::string surname;
    // Written and read with the surname in front.
    bool surnameFirst = false;
    std::string
        birth;  // a year or a date as it is to be read: "1819", "~1819", "3 May 1819"; empty if not known
    std::string death;
    Sex sex = Sex::unknown;
    // Drawn as "Living", with nothing else of this label in the picture.
    bool living = false;
    // Further lines below the years, each shortened to its box: places, an occupation.
    std::vector<std::string> details;
    // Birth and death for a sentence, in the language of the reader: "1819–1880", "born about 1819"; where it is empty,
    // lifeWords makes it of the two.
    std::string life;
    // Known to be dead, perhaps without a date.
    bool dead = false;
    // Birth and death in fewer letters, for a box in which they have no room; empty where there is no shorter form.
    std::string shortBirth;
    std::string shortDeath;
};

// What stands in the place of a name: "Name not known", and "Living" of who is hidden.
std::string_view unnamedText(Language language = Language::english);
std::string_view livingText(Language language = Language::english);

// A person's name for a sentence, or one of these two.
std::string fullName(const PersonLabel& label, Language language = Language::english);

// What a box says of birth and death, in a line each or in one: "* 1819", "† 1880"; a cross alone for a death of which no
// date is known, nothing of who is hidden.
std::vector<std::string> lifeLines(const PersonLabel& label);

// The same lines, each in fewer letters where there is a shorter form.
std::vector<std::string> shortLifeLines(const PersonLabel& label);

// The lines in one: "* 1819  † 1880".
std::string lifeLine(const PersonLabel& label, std::string_view between = "  ");

// The same for a sentence: label.life, or "* 1819, † 1880".
std::string lifeWords(const PersonLabel& label);

}  // namespace olvane::kin
