#include "plan/plan_run.h"

#include <algorithm>
#include <cassert>

namespace factory_test {

PlanRun::PlanRun(const Plan& performed, std::span<const TestResult> earlier) : plan(performed) {
  const TestResult* last = nullptr;  // of the steps from the first one on that were performed
  bool isUnbroken = true;
  for (std::size_t number = 0; number < plan.steps.size(); ++number) {
    const auto found = std::ranges::find(earlier, plan.steps[number].test, &TestResult::test);
    const bool isThere = found != earlier.end();
    if (!isThere || found->verdict == Verdict::None) open.insert(number);
    isUnbroken = isUnbroken && isThere;
    if (!isUnbroken) continue;
    last = &*found;
    index = number;
  }
  if (last != nullptr && last->verdict == Verdict::Fail) {
    tries = last->attempt;
    finish(Verdict::Fail);
  } else {
    goOn();
  }
}

void PlanRun::finish(Verdict verdict) {
  assert(now == State::Performing);
  const bool hasFailed = verdict == Verdict::Fail;
  if (hasFailed && tries <= step().retries) {
    ++tries;
  } else if (verdict == Verdict::None || (hasFailed && step().onFailure == OnFailure::Ask)) {
    now = State::Asking;
  } else if (hasFailed && step().onFailure == OnFailure::Stop) {
    now = State::Stopped;
  } else {
    goOn();
  }
}

void PlanRun::answer(Answer said) {
  assert(now == State::Asking);
  switch (said) {
    case Answer::GoOn: goOn(); break;
    case Answer::Again:
      ++tries;
      now = State::Performing;
      break;
    case Answer::Stop: now = State::Stopped; break;
  }
}

void PlanRun::goOn() {
  now = open.empty() ? State::Done : State::Performing;
  if (open.empty()) return;
  index = *open.begin();
  open.erase(open.begin());
  tries = 1;
}

bool isOverdue(const PlanStep& step, uint32_t milliseconds) {
  constexpr uint32_t kSecond = 1000;
  return step.timeout > 0 && milliseconds >= kSecond * static_cast<uint32_t>(step.timeout);
}

}  // namespace factory_test
