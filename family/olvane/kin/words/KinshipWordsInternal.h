// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string>

#include <olvane/kin/Kinship.h>
#include <olvane/kin/Language.h>

// A language's words for relatives. To add a language, derive from KinshipWords in a file beside the others, add it to
// Language and to kinshipWords; the tests over all languages then name what is missing.
namespace olvane::kin {

// A relation as a noun, and as the beginning of a chain.
struct Noun {
    std::string plain;  // "sister"
    std::string ofOne;  // "of a sister"
    std::string owner;  // "sister's", or in other languages "der Schwester", which stands behind
};

// By which parent a way begins. none: downwards, or by both at once.
enum class KinSide : std::uint8_t { none, father, mother };

// brief is for narrow rooms: repeated greats are counted, and ordinals are numerals.
enum class Wording : std::uint8_t { full, brief };

// A way by blood, adoption or fostering in all that words depend on.
struct BloodWords {
    int up = 0;
    int down = 0;
    bool half = false;
    bool doubled = false;  // cousins in two ways of the same length
    Bond bond = Bond::blood;
    KinSide side = KinSide::none;
    Sex sex = Sex::unknown;
    Wording wording = Wording::full;
};

enum class InLaw : std::uint8_t { parent, child, sibling, stepparent, stepchild, stepsibling };

class KinshipWords {
public:
    virtual ~KinshipWords() = default;

    virtual std::string self() const = 0;
    virtual Noun relative(const BloodWords& way) const = 0;
    // With the side that it is on, if any.
    virtual std::string relativeOnSide(const BloodWords& way) const = 0;
    virtual Noun spouse(UnionState state, Sex sex) const = 0;
    virtual Noun inLaw(InLaw which, Sex sex) const = 0;
    // "wife's sister"
    virtual Noun owned(const Noun& owner, const Noun& relative) const = 0;
    // "wife of a second cousin"
    virtual Noun spouseOf(const Noun& spouse, const Noun& relative) const = 0;
    // "wife and first cousin"
    virtual std::string both(const std::string& near, const std::string& far) const = 0;
    // "second cousin; related in 3 ways"
    virtual std::string inWays(const std::string& relation, const std::string& count) const = 0;
    // "related by marriage over 7 links"
    virtual std::string byMarriage(const std::string& links) const = 0;
    // The same in a few letters: "by marriage (7 links)"
    virtual std::string brieflyByMarriage(const std::string& links) const = 0;
    // "kin, 9th degree": by how many steps up and down, as laws of inheritance count
    virtual std::string ofDegree(int steps) const = 0;
};

const KinshipWords& englishKinship();
const KinshipWords& germanKinship();
const KinshipWords& spanishKinship();

inline const KinshipWords& kinshipWords(Language language) {
    if (language == Language::german) return germanKinship();
    return language == Language::spanish ? spanishKinship() : englishKinship();
}

// A word for a man, a woman, and somebody of whom the sex is not known.
template <class Word>
struct BySex {
    Word male;
    Word female;
    Word unknown;

    const Word& operator[](Sex sex) const {
        return sex == Sex::male ? male : sex == Sex::female ? female : unknown;
    }
};

}  // namespace olvane::kin
