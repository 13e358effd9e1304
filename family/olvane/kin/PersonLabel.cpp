// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/kin/PersonLabel.h>

namespace olvane::kin {

namespace {

constexpr std::string_view kCross = "\xE2\x80\xA0";

std::string joined(const std::vector<std::string>& lines, std::string_view separator) {
    std::string text;
    for (const std::string& line : lines) text.append(text.empty() ? "" : separator).append(line);
    return text;
}

}  // namespace

std::string fullName(const PersonLabel& label, Language language) {
    if (label.living) return std::string(livingText(language));
    const std::string& first = label.surnameFirst ? label.surname : label.given;
    const std::string& second = label.surnameFirst ? label.given : label.surname;
    if (first.empty() && second.empty()) return std::string(unnamedText(language));
    return first.empty() || second.empty() ? first + second : first + " " + second;
}

std::vector<std::string> lifeLines(const PersonLabel& label) {
    std::vector<std::string> lines;
    if (label.living) return lines;
    if (!label.birth.empty()) lines.push_back("* " + label.birth);
    if (!label.death.empty()) lines.push_back(std::string(kCross) + " " + label.death);
    if (label.death.empty() && label.dead) lines.emplace_back(kCross);
    return lines;
}

std::vector<std::string> shortLifeLines(const PersonLabel& label) {
    PersonLabel shortened;
    shortened.birth = label.shortBirth.empty() ? label.birth : label.shortBirth;
    shortened.death = label.shortDeath.empty() ? label.death : label.shortDeath;
    shortened.living = label.living;
    shortened.dead = label.dead;
    return lifeLines(shortened);
}

std::string lifeLine(const PersonLabel& label, std::string_view between) {
    return joined(lifeLines(label), between);
}

std::string lifeWords(const PersonLabel& label) {
    if (label.living) return {};
    return label.life.empty() ? joined(lifeLines(label), ", ") : label.life;
}

}  // namespace olvane::kin
