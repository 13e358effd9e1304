// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// make-gedcom PERSONS [--many-words]: writes a made-up GEDCOM file of that many persons to the standard output, always the
// same one. Names and places are some 5,000 words; with --many-words about as many as there are persons, of syllables, and
// everybody has an occupation: a search has more to look through than in real files.
//
// Family f has the husband 2f - 1 and the wife 2f. Its children are the husband of family 2f and the wife of family
// 2f + 1, so every second person of a generation marries in.

#include <cstdlib>
#include <iostream>
#include <string>
#include <string_view>

namespace {

constexpr long kSurnames = 997;
constexpr long kTowns = 311;
const char* const kMonths[] = {"JAN", "FEB", "MAR", "APR", "MAY", "JUN",
                               "JUL", "AUG", "SEP", "OCT", "NOV", "DEC"};

long generationOf(long family) {
    long generation = 0;
    for (; family > 1; family /= 2) ++generation;
    return generation;
}

// A word for each number; those of near numbers resemble one another.
std::string wordOf(long number) {
    constexpr std::string_view kSyllables[] = {"an",  "ber", "co",  "dor",  "el",  "fri", "gun",
                                               "hal", "is",  "ka",  "lund", "mar", "no",  "ost",
                                               "pe",  "ri",  "san", "tho",  "vik", "wald"};
    std::string word;
    for (long rest = number + 400; rest > 0; rest /= 20) word += kSyllables[rest % 20];
    word[0] = static_cast<char>(word[0] - 'a' + 'A');
    return word;
}

// One of that many words, the first ones most often.
std::string wordAmong(long words, long person, long salt) {
    const auto mixed =
        (static_cast<unsigned long long>(person) * 64 + static_cast<unsigned long long>(salt)) *
        0x9E3779B97F4A7C15U;
    const double part = static_cast<double>(mixed >> 40U) / static_cast<double>(1U << 24U);
    return wordOf(static_cast<long>(part * part * static_cast<double>(words)));
}

// What stands in a person's record of words.
struct Words {
    std::string name;
    std::string place;
    std::string occupation;  // empty for none
};

Words fewWords(long person) {
    return {"Given" + std::to_string(person % 4001) + " /Surname" + std::to_string(person % kSurnames) + "/",
            "Town " + std::to_string(person % kTowns) + ", County, Country", ""};
}

Words manyWords(long person, long persons) {
    const std::string given = wordAmong(persons / 10, person, 1) + " " + wordAmong(persons / 10, person, 2);
    return {given + " /" + wordAmong(persons, person, 3) + "/",
            wordAmong(2 * persons, person, 4) + ", " + wordAmong(persons / 100 + 1, person, 5) + ", Country",
            wordAmong(persons / 20 + 1, person, 6)};
}

void writePerson(std::string& out, long person, const Words& words) {
    const long family = (person + 1) / 2;
    const bool isHusband = person % 2 == 1;
    const bool isChild = family > 1 && isHusband == (family % 2 == 0);
    const long year = 1400 + 25 * generationOf(family) + person % 20;
    out += "0 @I" + std::to_string(person) + "@ INDI\n1 NAME " + words.name + "\n1 SEX " +
           (isHusband ? "M" : "F") + "\n1 BIRT\n2 DATE " + std::to_string(1 + person % 28) + " " +
           kMonths[person % 12] + " " + std::to_string(year) + "\n2 PLAC " + words.place +
           "\n1 DEAT\n2 DATE " + std::to_string(year + 60) + "\n1 FAMS @F" + std::to_string(family) + "@\n";
    if (!words.occupation.empty()) out += "1 OCCU " + words.occupation + "\n";
    if (isChild) out += "1 FAMC @F" + std::to_string(family / 2) + "@\n";
}

void writeFamily(std::string& out, long family, long families, long persons) {
    out += "0 @F" + std::to_string(family) + "@ FAM\n1 HUSB @I" + std::to_string(2 * family - 1) + "@\n";
    if (2 * family <= persons) out += "1 WIFE @I" + std::to_string(2 * family) + "@\n";
    if (2 * family <= families) out += "1 CHIL @I" + std::to_string(4 * family - 1) + "@\n";
    if (2 * family + 1 <= families && 4 * family + 2 <= persons) {
        out += "1 CHIL @I" + std::to_string(4 * family + 2) + "@\n";
    }
}

}  // namespace

int main(int argc, char** argv) {
    const bool hasManyWords = argc == 3 && std::string_view(argv[2]) == "--many-words";
    const long persons = argc == 2 || hasManyWords ? std::strtol(argv[1], nullptr, 10) : 0;
    if (persons < 1) {
        std::cerr << "usage: make-gedcom PERSONS [--many-words]\n";
        return 2;
    }
    const long families = (persons + 1) / 2;
    std::cout << "0 HEAD\n1 SOUR bench\n1 GEDC\n2 VERS 5.5.1\n2 FORM LINEAGE-LINKED\n1 CHAR UTF-8\n";
    std::string record;
    for (long person = 1; person <= persons; ++person) {
        record.clear();
        writePerson(record, person, hasManyWords ? manyWords(person, persons) : fewWords(person));
        std::cout << record;
    }
    for (long family = 1; family <= families; ++family) {
        record.clear();
        writeFamily(record, family, families, persons);
        std::cout << record;
    }
    std::cout << "0 TRLR\n";
    return std::cout.flush() ? 0 : 1;
}
