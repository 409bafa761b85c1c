/// Points in time as the files write them.
#pragma once

#include <chrono>
#include <optional>
#include <string>
#include <string_view>

namespace factory_test {

constexpr std::chrono::sys_seconds kFirstSecond =
    std::chrono::sys_days(std::chrono::year(0) / 1 / 1);
constexpr std::chrono::sys_seconds kLastSecond =
    std::chrono::sys_days(std::chrono::year(9999) / 12 / 31) + std::chrono::days(1) -
    std::chrono::seconds(1);

/// "2026-11-21T07:00:00Z". Outside kFirstSecond to kLastSecond the nearer of them is written.
std::string utcText(std::chrono::sys_seconds time);

/// The time that utcText() writes so, or nothing for any other text.
std::optional<std::chrono::sys_seconds> parseUtc(std::string_view text);

}  // namespace factory_test
