/// Plan files: reading and checking. Their layout stands in docs/plans.md.
#pragma once

#include <filesystem>
#include <optional>
#include <string>
#include <string_view>

#include "plan/json_lines.h"
#include "plan/plan.h"

namespace factory_test {

/// The plan that the text holds. Nothing, and what is wrong with it first, for a text that is not
/// JSON, lacks a field, has one that is unknown, twice there, of the wrong type or out of its
/// range, or names a test that is not known, or one that was named before.
std::optional<Plan> parsePlan(std::string_view text, const std::vector<KnownTest>& known,
                              Complaint& complaint);

/// The same for a file of at most a MiB; `error` is one line, "FILE:LINE: what is wrong".
std::optional<Plan> readPlan(const std::filesystem::path& file, const std::vector<KnownTest>& known,
                             std::string& error);

}  // namespace factory_test
