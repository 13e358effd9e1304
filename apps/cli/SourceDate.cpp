// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <cli/SourceDate.h>

#include <charconv>
#include <cstdint>
#include <cstdlib>
#include <string_view>

#include <cli/UsageError.h>

namespace olvane::cli {

std::optional<std::chrono::sys_seconds> sourceDate() {
    constexpr std::int64_t kEndOf9999 = 253402300799;
    const char* const written = std::getenv("SOURCE_DATE_EPOCH");
    if (written == nullptr || *written == '\0') return std::nullopt;
    const std::string_view text = written;
    std::int64_t seconds = -1;
    const auto [stop, error] = std::from_chars(text.data(), text.data() + text.size(), seconds);
    if (error != std::errc() || stop != text.data() + text.size() || seconds < 0 || seconds > kEndOf9999) {
        throw UsageError("SOURCE_DATE_EPOCH is no number of seconds since 1970: '" + std::string(text) + "'");
    }
    return std::chrono::sys_seconds(std::chrono::seconds(seconds));
}

}  // namespace olvane::cli
