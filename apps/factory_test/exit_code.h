/// How the program ends.
#pragma once

#include <span>
#include <string>

#include "results/results.h"

namespace factory_test {

enum class ExitCode { Passed, Trouble, WrongUse, Failed, Incomplete, NotSaved };

struct ExitRow {
  ExitCode code;
  const char* meaning;
};

/// What --help says of each, by their numbers.
std::span<const ExitRow> exitRows();

/// What became of the tests of these ids. What is worst for a line wins: a result that is not kept,
/// then a FAIL, then a test without a verdict.
ExitCode judgeRun(const ResultBook& book, std::span<const std::string> tests);

/// The one of two that judgeRun() returned that is worse for a line.
ExitCode worse(ExitCode one, ExitCode other);

}  // namespace factory_test
