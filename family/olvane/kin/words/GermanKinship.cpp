// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// German words for relatives. A cousin of a parent is an "Onkel zweiten Grades", a cousin's child a "Neffe zweiten
// Grades", and only a person of one's own generation a cousin.

#include <algorithm>
#include <array>
#include <cstdlib>

#include <olvane/kin/words/KinshipWordsInternal.h>

namespace olvane::kin {

namespace {

enum class Gender : std::uint8_t { masculine, feminine, neuter };

struct Word {
    std::string word;
    std::string genitive;
    Gender gender;
};

using Words = BySex<Word>;

constexpr Gender kM = Gender::masculine;
constexpr Gender kF = Gender::feminine;
constexpr Gender kN = Gender::neuter;

const Words& parent() {
    static const Words kWords{
        {"Vater", "Vaters", kM}, {"Mutter", "Mutter", kF}, {"Elternteil", "Elternteils", kM}};
    return kWords;
}
const Words& child() {
    static const Words kWords{{"Sohn", "Sohnes", kM}, {"Tochter", "Tochter", kF}, {"Kind", "Kindes", kN}};
    return kWords;
}
const Words& grandchild() {
    static const Words kWords{
        {"Enkel", "Enkels", kM}, {"Enkelin", "Enkelin", kF}, {"Enkelkind", "Enkelkindes", kN}};
    return kWords;
}
const Words& sibling() {
    static const Words kWords{
        {"Bruder", "Bruders", kM}, {"Schwester", "Schwester", kF}, {"Geschwister", "Geschwisters", kN}};
    return kWords;
}
const Words& parentsSibling() {
    static const Words kWords{
        {"Onkel", "Onkels", kM}, {"Tante", "Tante", kF}, {"Onkel/Tante", "Onkels/Tante", kM}};
    return kWords;
}
const Words& siblingsChild() {
    static const Words kWords{
        {"Neffe", "Neffen", kM}, {"Nichte", "Nichte", kF}, {"Neffe/Nichte", "Neffen/Nichte", kM}};
    return kWords;
}
const Words& cousin() {
    static const Words kWords{
        {"Cousin", "Cousins", kM}, {"Cousine", "Cousine", kF}, {"Cousin/Cousine", "Cousins/Cousine", kM}};
    return kWords;
}
const Words& siblingInLaw() {
    static const Words kWords{{"Schwager", "Schwagers", kM},
                              {"Schwägerin", "Schwägerin", kF},
                              {"Schwager/Schwägerin", "Schwagers/Schwägerin", kM}};
    return kWords;
}
const Words& spouseWords(UnionState state) {
    static const Words kSpouse{
        {"Ehemann", "Ehemannes", kM}, {"Ehefrau", "Ehefrau", kF}, {"Ehepartner", "Ehepartners", kM}};
    static const Words kFormer{{"früherer Ehemann", "früheren Ehemannes", kM},
                               {"frühere Ehefrau", "früheren Ehefrau", kF},
                               {"früherer Ehepartner", "früheren Ehepartners", kM}};
    static const Words kPartner{
        {"Partner", "Partners", kM}, {"Partnerin", "Partnerin", kF}, {"Partner", "Partners", kM}};
    if (state == UnionState::divorced) return kFormer;
    return state == UnionState::unmarried ? kPartner : kSpouse;
}

constexpr std::array kOrdinals{"ersten",   "zweiten", "dritten", "vierten", "fünften",
                               "sechsten", "siebten", "achten",  "neunten"};
// More of them than this are counted: in full words, and in brief ones.
constexpr int kUrsInWords = 3;
constexpr int kUrsInBrief = 2;
constexpr int kLeastGenerationsForHyphen = 4;

Noun noun(const Word& word) {
    const bool isFeminine = word.gender == Gender::feminine;
    return {word.word, (isFeminine ? "einer " : "eines ") + word.genitive,
            (isFeminine ? "der " : "des ") + word.genitive};
}

// "Halb" before "Onkel/Tante" is "Halbonkel/Halbtante", in brief "Halbonkel/-tante", and before "4×Urgroßonkel"
// "4×Halburgroßonkel". The words begin with ASCII letters.
std::string compound(const std::string& prefix, const std::string& words, Wording wording) {
    std::string text;
    std::size_t start = 0;
    while (start <= words.size()) {
        const std::size_t end = std::min(words.find('/', start), words.size());
        const std::string part = words.substr(start, end - start);
        const std::size_t times = part.find("×");
        const std::size_t head = times == std::string::npos ? 0 : times + std::string_view("×").size();
        const bool isSecond = start > 0;
        start = end + 1;
        if (isSecond) text += '/';
        if (isSecond && part.front() == '-') {
            text += part;
            continue;
        }
        text += part.substr(0, head) + (isSecond && wording == Wording::brief ? "-" : prefix);
        const bool isOneWord = text.back() != '-' || isSecond;
        text += static_cast<char>(isOneWord && part[head] >= 'A' && part[head] <= 'Z' ? part[head] - 'A' + 'a'
                                                                                      : part[head]);
        text += part.substr(head + 1);
    }
    return text;
}

Word compound(const std::string& prefix, const Word& word, Wording wording = Wording::full) {
    if (prefix.empty()) return word;
    return {compound(prefix, word.word, wording), compound(prefix, word.genitive, wording), word.gender};
}

// "Ur", "Urur", "Ururur", and then "4×Ur".
Word ur(int count, const Word& word, Wording wording) {
    if (count <= 0) return word;
    if (count <= (wording == Wording::brief ? kUrsInBrief : kUrsInWords)) {
        std::string prefix = "Ur";
        for (int i = 1; i < count; ++i) prefix += "ur";
        return compound(prefix, word, wording);
    }
    Word one = compound("Ur", word, wording);
    const std::string times = std::to_string(count) + "×";
    return {times + one.word, times + one.genitive, one.gender};
}

Word great(int generations, const Word& word, Wording wording) {
    return generations == 0 ? word : ur(generations - 1, compound("Groß", word, wording), wording);
}

Word ofDegree(int degree, const Word& word, Wording wording) {
    const auto ordinal = static_cast<std::size_t>(degree - 1);
    const bool isWord = ordinal < kOrdinals.size() && wording == Wording::full;
    const std::string ending =
        " " + (isWord ? std::string(kOrdinals[ordinal]) : std::to_string(degree) + ".") + " Grades";
    return {word.word + ending, word.genitive + ending, word.gender};
}

// In brief with a hyphen before long words, at which a line may end; and what is double is not said.
std::string manner(const BloodWords& way) {
    if (way.wording == Wording::brief) {
        BloodWords full = way;
        full.wording = Wording::full;
        full.doubled = false;
        const bool isFar = std::max(way.up, way.down) >= kLeastGenerationsForHyphen;
        return manner(full) + (isFar && way.bond != Bond::blood && way.bond != Bond::other ? "-" : "");
    }
    if (way.bond == Bond::foster) return "Pflege";
    if (way.bond == Bond::adopted) return "Adoptiv";
    if (way.bond == Bond::step) return "Stief";
    if (way.doubled) return "Doppel";
    return way.half ? "Halb" : "";
}

// The common ancestors' children are siblings, of the first degree; their children cousins of the first degree, and
// so on.
Word collateral(const BloodWords& way) {
    const int later = std::abs(way.up - way.down);
    const int degree = std::min(way.up, way.down);
    const Wording wording = way.wording;
    if (later == 0) {
        if (degree == 3) return compound(manner(way), compound("Groß", cousin()[way.sex], wording), wording);
        return ofDegree(degree - 1, compound(manner(way), cousin()[way.sex], wording), wording);
    }
    const Words& words = way.up > way.down ? parentsSibling() : siblingsChild();
    Word word = compound(manner(way), great(later - 1, words[way.sex], wording), wording);
    return degree == 1 ? word : ofDegree(degree, word, wording);
}

Word relativeWord(const BloodWords& way) {
    if (way.up == 1 && way.down == 1) return compound(manner(way), sibling()[way.sex], way.wording);
    if (way.up > 0 && way.down > 0) return collateral(way);
    if (way.down == 0)
        return compound(manner(way), great(way.up - 1, parent()[way.sex], way.wording), way.wording);
    return compound(manner(way),
                    way.down == 1 ? child()[way.sex] : ur(way.down - 2, grandchild()[way.sex], way.wording),
                    way.wording);
}

class German : public KinshipWords {
public:
    std::string self() const override { return "dieselbe Person"; }
    Noun relative(const BloodWords& way) const override { return noun(relativeWord(way)); }
    std::string relativeOnSide(const BloodWords& way) const override {
        std::string word = relativeWord(way).word;
        if (way.up < 2 || way.down > 1 || way.side == KinSide::none) return word;
        return word + (way.side == KinSide::father ? " väterlicherseits" : " mütterlicherseits");
    }
    Noun spouse(UnionState state, Sex sex) const override { return noun(spouseWords(state)[sex]); }
    Noun inLaw(InLaw which, Sex sex) const override {
        switch (which) {
            case InLaw::parent:
                return noun(compound("Schwieger", parent()[sex]));
            case InLaw::child:
                return noun(compound("Schwieger", child()[sex]));
            case InLaw::sibling:
                return noun(siblingInLaw()[sex]);
            case InLaw::stepparent:
                return noun(compound("Stief", parent()[sex]));
            case InLaw::stepchild:
                return noun(compound("Stief", child()[sex]));
            case InLaw::stepsibling:
                break;
        }
        return noun(compound("Stief", sibling()[sex]));
    }
    Noun owned(const Noun& owner, const Noun& relative) const override {
        return {relative.plain + " " + owner.owner, relative.ofOne + " " + owner.owner,
                relative.owner + " " + owner.owner};
    }
    Noun spouseOf(const Noun& spouse, const Noun& relative) const override {
        return {spouse.plain + " " + relative.ofOne, spouse.ofOne + " " + relative.ofOne,
                spouse.owner + " " + relative.ofOne};
    }
    std::string both(const std::string& near, const std::string& far) const override {
        return near + " und " + far;
    }
    std::string inWays(const std::string& relation, const std::string& count) const override {
        return relation + "; verwandt auf " + count + " Wegen";
    }
    std::string byMarriage(const std::string& links) const override {
        return "verschwägert über " + links + " Verbindungen";
    }
    std::string brieflyByMarriage(const std::string& links) const override {
        return "verschwägert (" + links + " Schritte)";
    }
    std::string ofDegree(int steps) const override {
        return "verwandt im " + std::to_string(steps) + ". Grad";
    }
};

}  // namespace

const KinshipWords& germanKinship() {
    static const German kGerman;
    return kGerman;
}

}  // namespace olvane::kin
