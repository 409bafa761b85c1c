/// How far a run has come, and whose it is.
#pragma once

#include <brimol/scene.h>

#include <string>

#include "results/results.h"

namespace factory_test {

/// Of the tests of the run's plan.
struct RunProgress {
  int tests = 0;
  int passed = 0;
  int failed = 0;
  std::string whose = {};  // "Unit A1 · Operator Ann · REHEARSAL"; what is not known is left out

  int done() const { return passed + failed; }
  /// "3 of 5 done: 2 PASS, 1 FAIL".
  std::string words() const;
  /// The same, below whose it is.
  std::string allWords() const;
};

RunProgress progressOf(const ResultBook& book);

/// A bar of two colours for what passed and what failed. On the thread that draws.
void drawProgress(const RunProgress& progress, const SKIA_Rect& area);

}  // namespace factory_test
