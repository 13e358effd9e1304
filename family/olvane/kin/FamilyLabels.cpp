// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/kin/FamilyLabels.h>

#include <string_view>

namespace olvane::kin {

namespace {

bool isDigit(char c) {
    return c >= '0' && c <= '9';
}

std::string yearIn(std::string_view date) {
    for (std::size_t first = 0; first < date.size(); ++first) {
        if (!isDigit(date[first])) continue;
        std::size_t end = first;
        while (end < date.size() && isDigit(date[end])) ++end;
        if (end - first == 3 || end - first == 4) return std::string(date.substr(first, end - first));
        first = end;
    }
    return std::string();
}

std::string yearOf(std::string_view written, std::string_view sorting) {
    return yearIn(written.empty() ? sorting : written);
}

}  // namespace

PersonLabel labelOf(const Family& family, std::int64_t id) {
    const PersonRow row = family.person(id);
    PersonLabel label;
    label.given = family.name(id, NameKind::given);
    label.surname = family.name(id, NameKind::surname);
    if (label.given.empty() && label.surname.empty()) label.given = family.name(id, NameKind::full);
    label.birth = yearOf(row.birthWritten, row.birth);
    label.death = yearOf(row.deathWritten, row.death);
    label.sex = row.sex;
    return label;
}

}  // namespace olvane::kin
