/// What the program asks between its pages, and what it says there.
#pragma once

#include <cstdint>
#include <optional>
#include <vector>

#include "notice.h"
#include "plan/plan.h"
#include "prompt.h"
#include "results/results.h"
#include "test.h"

namespace factory_test {

/// After a PASS for a test that is not complete. What is outside its limits fails, whatever the
/// operator says: the question then says so.
Question incompletePass(const Test& test, const PlanStep& step);

/// After a plan's last step: the run's verdict, whose it is, and what failed. `more`: the button
/// that goes on.
Question endOfRun(const ResultBook& book, const char* more);

/// Why a test failed, with the values that are to blame. Nothing where the operator said so.
std::optional<Notice> whyFailed(const PlanStep& step, const std::vector<Measure>& values,
                                Reason failure, uint32_t now);

}  // namespace factory_test
