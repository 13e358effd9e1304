// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <array>
#include <cstdint>
#include <optional>
#include <string_view>

namespace olvane::kin {

// Languages that words come in. docs/guide/languages.md says how to add one.
enum class Language : std::uint8_t { english, german, spanish };

constexpr std::array<Language, 3> kLanguages{Language::english, Language::german, Language::spanish};

// "en", "de", "es"
constexpr std::string_view languageCode(Language language) {
    constexpr std::array<std::string_view, 3> kCodes{"en", "de", "es"};
    return kCodes[static_cast<std::size_t>(language)];
}

// By the code, whatever follows it: "de", "de_AT.UTF-8", "es-MX".
constexpr std::optional<Language> languageOf(std::string_view code) {
    for (const Language language : kLanguages) {
        if (code.substr(0, 2) != languageCode(language)) continue;
        if (code.size() == 2 || code[2] == '-' || code[2] == '_' || code[2] == '.') return language;
    }
    return std::nullopt;
}

}  // namespace olvane::kin
