// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Spanish words for relatives. A cousin of a parent is a "tío segundo", a cousin's child a "sobrino segundo", and only
// a person of one's own generation a cousin.

#include <algorithm>
#include <array>
#include <cstdlib>

#include <olvane/kin/words/KinshipWordsInternal.h>

namespace olvane::kin {

namespace {

using Words = BySex<const char*>;

constexpr Words kParent{"padre", "madre", "progenitor"};
constexpr Words kChild{"hijo", "hija", "hijo/a"};
constexpr Words kSibling{"hermano", "hermana", "hermano/a"};
constexpr Words kParentsSibling{"tío", "tía", "tío/a"};
constexpr Words kSiblingsChild{"sobrino", "sobrina", "sobrino/a"};
constexpr Words kCousin{"primo", "prima", "primo/a"};
constexpr Words kSpouse{"esposo", "esposa", "cónyuge"};
constexpr Words kFormerSpouse{"exesposo", "exesposa", "excónyuge"};
constexpr Words kParentInLaw{"suegro", "suegra", "suegro/a"};
constexpr Words kChildInLaw{"yerno", "nuera", "yerno o nuera"};
constexpr Words kSiblingInLaw{"cuñado", "cuñada", "cuñado/a"};
constexpr Words kStepparent{"padrastro", "madrastra", "padrastro o madrastra"};
constexpr Words kStepchild{"hijastro", "hijastra", "hijastro/a"};
constexpr Words kStepsibling{"hermanastro", "hermanastra", "hermanastro/a"};
constexpr Words kHalf{"medio ", "media ", "medio/a "};
constexpr Words kEnding{"o", "a", "o/a"};
// Roots, to which the ending of the sex comes. The first of each is two generations away.
constexpr std::array kGrandparents{"abuel", "bisabuel", "tatarabuel"};
constexpr std::array kGrandchildren{"niet", "bisniet", "tataraniet"};
constexpr std::array kOrdinals{"primer", "segund", "tercer", "cuart", "quint",
                               "sext",   "séptim", "octav",  "noven", "décim"};

std::string ordinal(int n, Sex sex, Wording wording) {
    const auto place = static_cast<std::size_t>(n - 1);
    if (place < kOrdinals.size() && wording == Wording::full)
        return std::string(kOrdinals[place]) + kEnding[sex];
    return std::to_string(n) + (sex == Sex::female ? ".ª" : ".º");
}

// generations: 2 for a grandparent or grandchild. Beyond the three that have a name they are counted: the parent of a
// "tatarabuelo" is the "cuarto abuelo".
std::string grand(const std::array<const char*, 3>& roots, int generations, Sex sex, Wording wording) {
    const auto place = static_cast<std::size_t>(generations - 2);
    if (place < roots.size()) return std::string(roots[place]) + kEnding[sex];
    return ordinal(generations - 1, sex, wording) + " " + roots[0] + kEnding[sex];
}

// The common ancestors' children are siblings, of the first degree; their children "primos hermanos", and so on.
std::string collateral(const BloodWords& way) {
    const int later = std::abs(way.up - way.down);
    const int degree = std::min(way.up, way.down);
    if (later == 0) {
        const std::string kind = degree == 2 ? std::string("herman") + kEnding[way.sex]
                                             : ordinal(degree - 1, way.sex, way.wording);
        return std::string(kCousin[way.sex]) + " " + kind;
    }
    const bool isOlder = way.up > way.down;
    std::string word = (isOlder ? kParentsSibling : kSiblingsChild)[way.sex];
    if (later > 1) word += " " + grand(isOlder ? kGrandparents : kGrandchildren, later, way.sex, way.wording);
    return degree == 1 ? word : word + " " + ordinal(degree, way.sex, way.wording);
}

std::string wholeWord(const BloodWords& way) {
    const bool isStep = way.bond == Bond::step;
    if (way.up == 1 && way.down == 0) return (isStep ? kStepparent : kParent)[way.sex];
    if (way.up == 0 && way.down == 1) return (isStep ? kStepchild : kChild)[way.sex];
    if (way.up == 1 && way.down == 1) return (isStep ? kStepsibling : kSibling)[way.sex];
    if (way.down == 0) return grand(kGrandparents, way.up, way.sex, way.wording);
    if (way.up == 0) return grand(kGrandchildren, way.down, way.sex, way.wording);
    return collateral(way);
}

std::string relativeWord(const BloodWords& way) {
    const std::string word = wholeWord(way);
    if (way.bond == Bond::adopted) return word + " adoptiv" + kEnding[way.sex];
    if (way.bond == Bond::foster) return word + " de acogida";
    if (way.bond == Bond::step) return way.up <= 1 && way.down <= 1 ? word : word + " por padrastros";
    if (way.doubled) return word + " doble";
    return way.half ? kHalf[way.sex] + word : word;
}

Noun noun(const std::string& plain, Sex sex) {
    const bool isFeminine = sex == Sex::female;
    return {plain, (isFeminine ? "de una " : "de un ") + plain, (isFeminine ? "de la " : "del ") + plain};
}

class Spanish : public KinshipWords {
public:
    std::string self() const override { return "la misma persona"; }
    Noun relative(const BloodWords& way) const override { return noun(relativeWord(way), way.sex); }
    std::string relativeOnSide(const BloodWords& way) const override {
        std::string word = relativeWord(way);
        if (way.up < 2 || way.down > 1 || way.side == KinSide::none) return word;
        const bool endsFeminine = way.sex == Sex::female;
        const std::string side = way.side == KinSide::father ? "patern" : "matern";
        return word + " " + side + (endsFeminine ? "a" : way.sex == Sex::male ? "o" : "o/a");
    }
    Noun spouse(UnionState state, Sex sex) const override {
        if (state == UnionState::unmarried) return noun("pareja", Sex::female);
        return noun((state == UnionState::divorced ? kFormerSpouse : kSpouse)[sex], sex);
    }
    Noun inLaw(InLaw which, Sex sex) const override {
        switch (which) {
            case InLaw::parent:
                return noun(kParentInLaw[sex], sex);
            case InLaw::child:
                return noun(kChildInLaw[sex], sex);
            case InLaw::sibling:
                return noun(kSiblingInLaw[sex], sex);
            case InLaw::stepparent:
                return noun(kStepparent[sex], sex);
            case InLaw::stepchild:
                return noun(kStepchild[sex], sex);
            case InLaw::stepsibling:
                break;
        }
        return noun(kStepsibling[sex], sex);
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
        return near + " y " + far;
    }
    std::string inWays(const std::string& relation, const std::string& count) const override {
        return relation + "; parentesco por " + count + " vías";
    }
    std::string byMarriage(const std::string& links) const override {
        return "pariente por matrimonio a través de " + links + " vínculos";
    }
    std::string brieflyByMarriage(const std::string& links) const override {
        return "por matrimonio (" + links + " vínculos)";
    }
    std::string ofDegree(int steps) const override {
        return "pariente en " + ordinal(steps, Sex::male, Wording::brief) + " grado";
    }
};

}  // namespace

const KinshipWords& spanishKinship() {
    static const Spanish kSpanish;
    return kSpanish;
}

}  // namespace olvane::kin
