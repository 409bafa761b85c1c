#include "plan/plan_run.h"

#include <cassert>

namespace factory_test {

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
  if (index + 1 == plan.steps.size()) {
    now = State::Done;
    return;
  }
  ++index;
  tries = 1;
  now = State::Performing;
}

bool isOverdue(const PlanStep& step, uint32_t milliseconds) {
  constexpr uint32_t kSecond = 1000;
  return step.timeout > 0 && milliseconds >= kSecond * static_cast<uint32_t>(step.timeout);
}

}  // namespace factory_test
