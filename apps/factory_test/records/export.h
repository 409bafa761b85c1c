/// The history as files for other programs and for people. All texts are in UTF-8.
#pragma once

#include <span>
#include <string>

#include "records/run.h"

namespace factory_test {

/// As schema/history.schema.json says: every run with its plan, and every verdict with its values.
std::string historyJson(std::span<const RunRecord> runs);

/// As junit.h says: a suite for each run, with its tests' newest verdicts.
std::string historyJunit(std::span<const RunRecord> runs);

/// Comma-separated values as RFC 4180 says, with a heading: a line for each measured value, and one
/// for each verdict without values. A text that a spreadsheet would take for a formula begins with
/// an apostrophe.
std::string historyCsv(std::span<const RunRecord> runs);

/// A page that needs nothing else: the runs, newest first, with their verdicts and values.
std::string historyHtml(std::span<const RunRecord> runs);

}  // namespace factory_test
