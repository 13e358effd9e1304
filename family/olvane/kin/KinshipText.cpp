// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Chooses the words for a kinship: which way is named first, and which ways over marriages have a word of their own.

#include <olvane/kin/KinshipText.h>

#include <algorithm>
#include <limits>

#include <olvane/kin/words/KinshipWordsInternal.h>

namespace olvane::kin {

namespace {

// Chains of more steps than this are counted, not named.
constexpr std::size_t kMostStepsInWords = 4;

BloodWords wordsOf(const KinGraph& graph, const KinWay& way) {
    BloodWords words;
    words.up = way.up;
    words.down = way.down;
    words.half = way.half;
    words.bond = way.bond;
    words.sex = graph.sex(way.persons.back());
    if (way.up >= 1) {
        const Sex parent = graph.sex(way.persons[1]);
        words.side = parent == Sex::male     ? KinSide::father
                     : parent == Sex::female ? KinSide::mother
                                             : KinSide::none;
    }
    return words;
}

BloodWords wordsOf(const KinGraph& graph, const KinStep& step, Wording wording) {
    BloodWords words;
    words.wording = wording;
    words.up = step.up;
    words.down = step.down;
    words.half = step.half;
    words.bond = step.bond;
    words.sex = graph.sex(step.to);
    return words;
}

bool isNear(const KinStep& step) {
    return !step.isCouple && ((step.up == 1 && step.down <= 1) || (step.up == 0 && step.down == 1));
}

Noun nounOf(const KinGraph& graph, const KinStep& step, const KinshipWords& words, Wording wording) {
    return step.isCouple ? words.spouse(step.state, graph.sex(step.to))
                         : words.relative(wordsOf(graph, step, wording));
}

// "wife's sister's husband"; of a far relative rather "wife of a second cousin".
Noun chain(const KinGraph& graph, const std::vector<KinStep>& steps, const KinshipWords& words,
           Wording wording = Wording::full) {
    const auto nounAt = [&](std::size_t i) { return nounOf(graph, steps[i], words, wording); };
    if (steps.size() == 2 && !steps[0].isCouple && steps[1].isCouple && !isNear(steps[0])) {
        return words.spouseOf(nounAt(1), nounAt(0));
    }
    Noun noun = nounAt(0);
    for (std::size_t i = 1; i < steps.size(); ++i) noun = words.owned(noun, nounAt(i));
    return noun;
}

std::optional<InLaw> inLawOf(const KinStep& relative, bool isOfSpouse) {
    if (!isNear(relative) || relative.bond != Bond::blood) return std::nullopt;
    if (relative.up == 1 && relative.down == 1) return InLaw::sibling;
    if (relative.up == 1) return isOfSpouse ? InLaw::parent : InLaw::stepparent;
    return isOfSpouse ? InLaw::stepchild : InLaw::child;
}

// The words that a language has for the near relatives of a spouse and the spouses of near relatives. Of a marriage
// that ended, only the chain is said.
std::string specialText(const KinGraph& graph, const std::vector<KinStep>& steps, const KinshipWords& words) {
    const auto isHolding = [](const KinStep& step) {
        return step.isCouple && step.state != UnionState::divorced && step.state != UnionState::unmarried;
    };
    const Sex sex = graph.sex(steps.back().to);
    if (steps.size() == 2 && steps[0].isCouple != steps[1].isCouple) {
        const bool isOfSpouse = steps[0].isCouple;
        const auto which = inLawOf(steps[isOfSpouse ? 1 : 0], isOfSpouse);
        if (!which || !isHolding(steps[isOfSpouse ? 0 : 1])) return "";
        const std::string word = words.inLaw(*which, sex).plain;
        return *which == InLaw::sibling ? word + " (" + chain(graph, steps, words).plain + ")" : word;
    }
    const bool isStepsibling = steps.size() == 3 && isNear(steps[0]) && steps[0].up == 1 &&
                               steps[0].down == 0 && isHolding(steps[1]) && isNear(steps[2]) &&
                               steps[2].up == 0;
    return isStepsibling ? words.inLaw(InLaw::stepsibling, sex).plain : "";
}

// Whether a way over marriages has a word of its own: that of a spouse, a relative in law or a step relative.
bool hasOwnWord(const KinGraph& graph, const std::vector<KinStep>& steps, const KinshipWords& words) {
    return steps.size() == 1 || !specialText(graph, steps, words).empty();
}

// All nearest ways that have the same words but for the side: two of them by different sides name neither.
BloodWords nearestWords(const KinGraph& graph, const std::vector<KinWay>& ways) {
    BloodWords words = wordsOf(graph, ways.front());
    std::size_t alike = 1;
    for (std::size_t i = 1; i < ways.size() && ways[i].length() == ways[0].length(); ++i) {
        const BloodWords other = wordsOf(graph, ways[i]);
        if (other.up != words.up) continue;
        if (other.side != words.side) words.side = KinSide::none;
        if (other.half == words.half && other.bond == words.bond) ++alike;
    }
    words.doubled =
        alike == 2 && words.up >= 2 && words.down >= 2 && !words.half && words.bond == Bond::blood;
    return words;
}

// At least two, or empty where nobody can say.
std::string countedWays(const std::vector<KinWay>& ways, const std::optional<std::uint64_t>& count) {
    const std::uint64_t number = count.value_or(0);
    return ways.empty() || number < 2 ? "" : std::to_string(number);
}

std::string textOfWays(const KinGraph& graph, const std::vector<KinWay>& ways,
                       const std::optional<std::uint64_t>& count, const KinshipWords& words) {
    const BloodWords nearest = nearestWords(graph, ways);
    const std::string text = words.relativeOnSide(nearest);
    const std::string number = countedWays(ways, count);
    const bool isSaid = nearest.doubled && count == std::uint64_t{2};
    return number.empty() || isSaid ? text : words.inWays(text, number);
}

int lengthOf(const std::vector<KinWay>& ways) {
    return ways.empty() ? std::numeric_limits<int>::max() : ways.front().length();
}

// Whether the nearest way over marriages is said: where it is all there is, or nearer than any other and has a word.
bool namesMarriage(const KinGraph& graph, const Kinship& kinship, const KinshipWords& words) {
    if (kinship.marriage.empty()) return false;
    if (kinship.blood.empty() && kinship.legal.empty()) return true;
    const MarriageWay& way = kinship.marriage.front();
    return way.links() < std::min(lengthOf(kinship.blood), lengthOf(kinship.legal)) &&
           hasOwnWord(graph, way.steps, words);
}

std::string shortText(const KinGraph& graph, const MarriageWay& way, Language language) {
    const KinshipWords& words = kinshipWords(language);
    const bool isInLaw = way.steps.size() == 2 && !specialText(graph, way.steps, words).empty();
    const auto isSibling = [](const KinStep& step) {
        return !step.isCouple && step.up == 1 && step.down == 1;
    };
    if (isInLaw && std::any_of(way.steps.begin(), way.steps.end(), isSibling))
        return words.inLaw(InLaw::sibling, graph.sex(way.steps.back().to)).plain;
    return wayText(graph, way, language);
}

// Both are shorter than the full words of most ways, the second one than those of any.
std::vector<std::string> briefTexts(const KinGraph& graph, const MarriageWay& way,
                                    const KinshipWords& words) {
    std::vector<std::string> texts;
    if (hasOwnWord(graph, way.steps, words)) return texts;
    if (way.steps.size() <= kMostStepsInWords)
        texts.push_back(chain(graph, way.steps, words, Wording::brief).plain);
    texts.push_back(words.brieflyByMarriage(std::to_string(way.links())));
    return texts;
}

std::vector<std::string> briefTexts(BloodWords nearest, const KinshipWords& words) {
    nearest.wording = Wording::brief;
    return {words.relative(nearest).plain, words.ofDegree(nearest.up + nearest.down)};
}

}  // namespace

std::string wayText(const KinGraph& graph, const KinWay& way, Language language) {
    return kinshipWords(language).relativeOnSide(wordsOf(graph, way));
}

std::string wayText(const KinGraph& graph, const MarriageWay& way, Language language) {
    const KinshipWords& words = kinshipWords(language);
    if (way.steps.empty()) return words.self();
    if (way.steps.size() > kMostStepsInWords) return words.byMarriage(std::to_string(way.links()));
    const std::string special = specialText(graph, way.steps, words);
    return special.empty() ? chain(graph, way.steps, words).plain : special;
}

std::string kinshipText(const KinGraph& graph, const Kinship& kinship, Language language) {
    const KinshipWords& words = kinshipWords(language);
    if (kinship.a == kinship.b) return words.self();
    const int blood = lengthOf(kinship.blood);
    const int legal = lengthOf(kinship.legal);
    std::string text;
    const auto add = [&text, &words](const std::string& more) {
        text = text.empty() ? more : words.both(text, more);
    };
    if (namesMarriage(graph, kinship, words)) add(wayText(graph, kinship.marriage.front(), language));
    if (legal < blood) add(textOfWays(graph, kinship.legal, kinship.legalCount, words));
    if (!kinship.blood.empty()) add(textOfWays(graph, kinship.blood, kinship.bloodCount, words));
    return text;
}

std::string shortKinshipText(const KinGraph& graph, const Kinship& kinship, Language language) {
    const KinshipWords& words = kinshipWords(language);
    if (kinship.a == kinship.b) return words.self();
    if (!kinship.isRelated()) return "";
    if (namesMarriage(graph, kinship, words)) return shortText(graph, kinship.marriage.front(), language);
    const bool isLegal = lengthOf(kinship.legal) < lengthOf(kinship.blood);
    return words.relative(nearestWords(graph, isLegal ? kinship.legal : kinship.blood)).plain;
}

std::vector<std::string> kinshipWordings(const KinGraph& graph, const Kinship& kinship, Language language) {
    std::vector<std::string> wordings{shortKinshipText(graph, kinship, language)};
    if (kinship.a == kinship.b || !kinship.isRelated()) return wordings;
    const KinshipWords& words = kinshipWords(language);
    const bool isLegal = lengthOf(kinship.legal) < lengthOf(kinship.blood);
    const std::vector<std::string> briefs =
        namesMarriage(graph, kinship, words)
            ? briefTexts(graph, kinship.marriage.front(), words)
            : briefTexts(nearestWords(graph, isLegal ? kinship.legal : kinship.blood), words);
    for (const std::string& brief : briefs) {
        if (brief != wordings.back()) wordings.push_back(brief);
    }
    return wordings;
}

}  // namespace olvane::kin
