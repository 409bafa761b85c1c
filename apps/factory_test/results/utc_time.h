/// Points in time as the files write them.
#pragma once

#include <chrono>
#include <optional>
#include <string>

namespace factory_test {

/// "2026-11-21T07:00:00Z", for the years 1970 to 9999.
std::string utcText(std::chrono::sys_seconds time);

/// The time that utcText() writes so, or nothing for any other text.
std::optional<std::chrono::sys_seconds> parseUtc(const std::string& text);

}  // namespace factory_test
