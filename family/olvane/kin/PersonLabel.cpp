// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/kin/PersonLabel.h>

namespace olvane::kin {

std::string fullName(const PersonLabel& label) {
    if (label.living) return "Living";
    const std::string& first = label.surnameFirst ? label.surname : label.given;
    const std::string& second = label.surnameFirst ? label.given : label.surname;
    if (first.empty() && second.empty()) return "Name not known";
    return first.empty() || second.empty() ? first + second : first + " " + second;
}

}  // namespace olvane::kin
