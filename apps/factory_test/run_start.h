/// What the records say of a run of the program.
#pragma once

#include <optional>
#include <string>

#include "options.h"
#include "plan/plan.h"
#include "results/results.h"

namespace factory_test {

/// The places that the options name.
Keeping keepingOf(const Options& options);

/// Whether the operator has to say which unit is tested before its run begins: the database is to
/// know, and nothing else says it. A single test (--test) is nobody's question.
bool asksForUnit(const Options& options);

/// Who tests what by which plan, now. The unit is the one that the options name, else the one that
/// the system property ro.serialno names, else unknown: ResultBook::startUnit() tells it later.
RunStart runStartOf(const Options& options, const Plan& plan);

/// What is wrong with the options of the records, in one line; empty: nothing.
std::string wrongRecords(const Options& options);

}  // namespace factory_test
