/// A plan performed from its first step to its last one.
#pragma once

#include <cstddef>
#include <cstdint>
#include <set>
#include <span>

#include "plan/plan.h"
#include "results/test_result.h"

namespace factory_test {

/// Says which step is next. It is told what became of each attempt, and reads no clock.
class PlanRun {
 public:
  enum class State { Performing, Asking, Done, Stopped };
  /// What the operator answers while it is Asking.
  enum class Answer { GoOn, Again, Stop };

  /// `performed` has a step and outlives the run. `earlier` is what a run left that was aborted: it
  /// goes on where that one was, also with a retry or the end that its last failure leads to, and
  /// performs no step that has a verdict.
  explicit PlanRun(const Plan& performed, std::span<const TestResult> earlier = {});

  State state() const { return now; }
  /// The step to perform, or the one that was performed last.
  const PlanStep& step() const { return plan.steps[index]; }
  std::size_t stepNumber() const { return index; }  // from 0
  int attempt() const { return tries; }             // from 1

  /// An attempt at the step has ended. A FAIL with retries left begins it anew; None (it was left
  /// without a verdict) always asks.
  void finish(Verdict verdict);
  void answer(Answer said);

 private:
  void goOn();

  const Plan& plan;
  std::set<std::size_t> open = {};  // steps to perform, by their numbers
  State now = State::Performing;
  std::size_t index = 0;
  int tries = 1;
};

/// Whether a test has had its time.
bool isOverdue(const PlanStep& step, uint32_t milliseconds);

}  // namespace factory_test
