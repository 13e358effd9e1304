// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The sentences of all remarks, in the order of RemarkKind: {person}, {other}, {family} and {years} stand for what the
// remark is about.

#include <olvane/kin/DataCheck.h>

#include <string_view>

namespace olvane::kin {

namespace {

using Sentences = std::array<std::string_view, kRemarkKinds>;

constexpr Sentences kEnglish{
    "{person} names {family} as parents, which does not list the child",
    "{family} lists {person} as a child, who does not name the family",
    "{person} names {family} as marriage, which does not name the partner",
    "{family} names {person} as partner, who does not name the family",
    "{person} is a child in two families; the first one is drawn",
    "{person} died before being born",
    "{person} lived for more than {years} years",
    "{person} was born before the parent {other}",
    "{person} has a parent younger than {years}, {other}",
    "{person} has a parent older than {years}, {other}",
    "{person} was born after the death of the parent {other}",
    "{person} married before being born",
    "{person} married after dying",
    "{person} is their own ancestor",
};

constexpr Sentences kGerman{
    "{person} nennt {family} als Elternfamilie, die das Kind nicht aufführt",
    "{family} führt {person} als Kind auf, das die Familie nicht nennt",
    "{person} nennt {family} als Ehe, die den Partner nicht nennt",
    "{family} nennt {person} als Partner, der die Familie nicht nennt",
    "{person} ist Kind in zwei Familien; gezeichnet wird die erste",
    "{person} starb vor der Geburt",
    "{person} lebte mehr als {years} Jahre",
    "{person} wurde vor dem Elternteil {other} geboren",
    "{person} hat einen Elternteil unter {years} Jahren, {other}",
    "{person} hat einen Elternteil über {years} Jahren, {other}",
    "{person} wurde nach dem Tod des Elternteils {other} geboren",
    "{person} heiratete vor der Geburt",
    "{person} heiratete nach dem Tod",
    "{person} stammt von sich selbst ab",
};

constexpr Sentences kSpanish{
    "{person} nombra a {family} como sus padres, familia que no lo incluye entre los hijos",
    "{family} incluye como hijo a {person}, que no nombra a la familia",
    "{person} nombra a {family} como matrimonio, familia que no nombra al cónyuge",
    "{family} nombra como cónyuge a {person}, que no nombra a la familia",
    "{person} figura como hijo en dos familias; se dibuja la primera",
    "{person} murió antes de nacer",
    "{person} vivió más de {years} años",
    "{person} nació antes que su progenitor {other}",
    "{person} tiene un progenitor de menos de {years} años, {other}",
    "{person} tiene un progenitor de más de {years} años, {other}",
    "{person} nació después de la muerte de su progenitor {other}",
    "{person} se casó antes de nacer",
    "{person} se casó después de morir",
    "{person} desciende de sí mismo",
};

const Sentences& sentencesIn(Language language) {
    if (language == Language::german) return kGerman;
    return language == Language::spanish ? kSpanish : kEnglish;
}

std::string valueOf(std::string_view name, const Remark& remark, const RemarkNames& names) {
    if (name == "person") return names.person(remark.person);
    if (name == "other") return names.person(remark.other);
    return name == "family" ? names.family(remark.family) : std::to_string(remark.years);
}

}  // namespace

std::string remarkText(const Remark& remark, const RemarkNames& names, Language language) {
    std::string_view sentence = sentencesIn(language)[static_cast<std::size_t>(remark.kind)];
    std::string text;
    for (std::size_t open = sentence.find('{'); open != std::string_view::npos; open = sentence.find('{')) {
        const std::size_t close = sentence.find('}', open);
        text += sentence.substr(0, open);
        text += valueOf(sentence.substr(open + 1, close - open - 1), remark, names);
        sentence.remove_prefix(close + 1);
    }
    return text.append(sentence);
}

}  // namespace olvane::kin
