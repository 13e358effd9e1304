// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What stands in the place of a name: English, German, Spanish.

#include <olvane/kin/PersonLabel.h>

#include <array>

namespace olvane::kin {

namespace {

using Words = std::array<std::string_view, kLanguages.size()>;

constexpr Words kUnnamed{"Name not known", "Name unbekannt", "Nombre desconocido"};
constexpr Words kLiving{"Living", "Lebt", "Vive"};

}  // namespace

std::string_view unnamedText(Language language) {
    return kUnnamed[static_cast<std::size_t>(language)];
}

std::string_view livingText(Language language) {
    return kLiving[static_cast<std::size_t>(language)];
}

}  // namespace olvane::kin
