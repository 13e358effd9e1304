// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <algorithm>
#include <array>
#include <cstdlib>

#include <olvane/kin/words/KinshipWordsInternal.h>

namespace olvane::kin {

namespace {

using Words = BySex<const char*>;

constexpr Words kParent{"father", "mother", "parent"};
constexpr Words kChild{"son", "daughter", "child"};
constexpr Words kSibling{"brother", "sister", "sibling"};
constexpr Words kParentsSibling{"uncle", "aunt", "aunt or uncle"};
constexpr Words kSiblingsChild{"nephew", "niece", "niece or nephew"};
constexpr Words kSpouse{"husband", "wife", "spouse"};
constexpr std::array kOrdinals{"first", "second",  "third",  "fourth", "fifth",
                               "sixth", "seventh", "eighth", "ninth",  "tenth"};
constexpr std::array kTimes{"", "once", "twice"};
// More greats than this are counted: in full words, and in brief ones.
constexpr int kGreatsInWords = 3;
constexpr int kGreatsInBrief = 1;

// 1st, 2nd, 3rd, 4th, 11th, 21st
std::string numeral(int n) {
    const int lastTwo = n % 100;
    constexpr std::array kEndings{"th", "st", "nd", "rd"};
    const bool isPlain = (lastTwo >= 11 && lastTwo <= 13) || n % 10 > 3;
    return std::to_string(n) + (isPlain ? "th" : kEndings[static_cast<std::size_t>(n % 10)]);
}

std::string greats(int count, const std::string& word, Wording wording) {
    if (count > (wording == Wording::brief ? kGreatsInBrief : kGreatsInWords))
        return numeral(count) + " great-" + word;
    std::string text;
    for (int i = 0; i < count; ++i) text += "great-";
    return text + word;
}

// "1st cousin 3× removed"
std::string briefCousin(int degree, std::size_t removed) {
    const std::string word = numeral(degree) + " cousin";
    return removed == 0 ? word : word + " " + std::to_string(removed) + "× removed";
}

std::string cousin(const BloodWords& way) {
    const int degree = std::min(way.up, way.down) - 1;
    const auto removed = static_cast<std::size_t>(std::abs(way.up - way.down));
    if (way.wording == Wording::brief) return briefCousin(degree, removed);
    const auto ordinal = static_cast<std::size_t>(degree - 1);
    std::string word =
        (ordinal < kOrdinals.size() ? std::string(kOrdinals[ordinal]) : numeral(degree)) + " cousin";
    if (removed == 0) return word;
    return word + " " + (removed < kTimes.size() ? kTimes[removed] : std::to_string(removed) + " times") +
           " removed";
}

std::string wholeWord(const BloodWords& way) {
    if (way.up == 1 && way.down == 0) return kParent[way.sex];
    if (way.up == 0 && way.down == 1) return kChild[way.sex];
    if (way.up == 1 && way.down == 1) return kSibling[way.sex];
    if (way.down == 0) return greats(way.up - 2, std::string("grand") + kParent[way.sex], way.wording);
    if (way.up == 0) return greats(way.down - 2, std::string("grand") + kChild[way.sex], way.wording);
    if (way.down == 1) return greats(way.up - 2, kParentsSibling[way.sex], way.wording);
    if (way.up == 1) return greats(way.down - 2, kSiblingsChild[way.sex], way.wording);
    return cousin(way);
}

std::string manner(const BloodWords& way) {
    const bool isNear = way.up <= 1 && way.down <= 1;
    if (way.bond == Bond::foster) return "foster ";
    if (way.bond == Bond::adopted) return way.up == 0 ? "adopted " : "adoptive ";
    if (way.bond == Bond::step) return isNear ? "step" : "step-";
    if (way.doubled) return "double ";
    return way.half ? "half " : "";
}

Noun noun(const std::string& plain) {
    const bool hasVowel = std::string_view("aeiou8").find(plain.front()) != std::string_view::npos ||
                          plain.rfind("11th", 0) == 0 || plain.rfind("18th", 0) == 0;
    return {plain, (hasVowel ? "of an " : "of a ") + plain, plain + "'s"};
}

// Exactly for grandparents, uncles and aunts; beyond them the side says enough.
std::string sideOf(const BloodWords& way) {
    if (way.side == KinSide::none || way.up < 2 || way.down > 1) return "";
    const std::string side = way.side == KinSide::father ? "father's" : "mother's";
    if (way.up > 2 || way.bond != Bond::blood) return side + " side";
    BloodWords fromParent = way;
    fromParent.up = 1;
    return side + " " + manner(fromParent) + wholeWord(fromParent);
}

class English : public KinshipWords {
public:
    std::string self() const override { return "the same person"; }
    Noun relative(const BloodWords& way) const override { return noun(manner(way) + wholeWord(way)); }
    std::string relativeOnSide(const BloodWords& way) const override {
        const std::string side = sideOf(way);
        return relative(way).plain + (side.empty() ? "" : " (" + side + ")");
    }
    Noun spouse(UnionState state, Sex sex) const override {
        if (state == UnionState::unmarried) return noun("partner");
        return noun(std::string(state == UnionState::divorced ? "former " : "") + kSpouse[sex]);
    }
    Noun inLaw(InLaw which, Sex sex) const override {
        switch (which) {
            case InLaw::parent:
                return noun(std::string(kParent[sex]) + "-in-law");
            case InLaw::child:
                return noun(std::string(kChild[sex]) + "-in-law");
            case InLaw::sibling:
                return noun(std::string(kSibling[sex]) + "-in-law");
            case InLaw::stepparent:
                return noun(std::string("step") + kParent[sex]);
            case InLaw::stepchild:
                return noun(std::string("step") + kChild[sex]);
            case InLaw::stepsibling:
                break;
        }
        return noun(std::string("step") + kSibling[sex]);
    }
    Noun owned(const Noun& owner, const Noun& relative) const override {
        const std::string plain = owner.owner + " " + relative.plain;
        return {plain, "of " + plain, plain + "'s"};
    }
    Noun spouseOf(const Noun& spouse, const Noun& relative) const override {
        return noun(spouse.plain + " " + relative.ofOne);
    }
    std::string both(const std::string& near, const std::string& far) const override {
        return near + " and " + far;
    }
    std::string inWays(const std::string& relation, const std::string& count) const override {
        return relation + "; related in " + count + " ways";
    }
    std::string byMarriage(const std::string& links) const override {
        return "related by marriage over " + links + " links";
    }
    std::string brieflyByMarriage(const std::string& links) const override {
        return "by marriage (" + links + " links)";
    }
    std::string ofDegree(int steps) const override { return "kin, " + numeral(steps) + " degree"; }
};

}  // namespace

const KinshipWords& englishKinship() {
    static const English kEnglish;
    return kEnglish;
}

}  // namespace olvane::kin
