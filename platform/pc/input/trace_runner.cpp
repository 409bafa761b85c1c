#include "input/trace_runner.h"

#include <algorithm>
#include <utility>

#include "scene/item_text.h"

namespace brimol::pc {

namespace {

constexpr uint64_t kRestMs = 100;      // after an input step, before one without a time
constexpr uint64_t kCloseMs = 10'000;  // from the wish to close to the end

// What leaves a finger or a key down is meant to be followed at once.
struct RestAfter {
  uint64_t operator()(const Touch& touch) const {
    const bool goesOn = touch.kind == Touch::Kind::Press || touch.kind == Touch::Kind::Move ||
                        touch.kind == Touch::Kind::MoveBy;
    return goesOn ? 0 : kRestMs;
  }
  uint64_t operator()(const KeyStroke& stroke) const {
    return stroke.kind == KeyStroke::Kind::Down ? 0 : kRestMs;
  }
  uint64_t operator()(const Typing&) const { return kRestMs; }
  uint64_t operator()(const CloseWish&) const { return kRestMs; }
  template <typename Other>
  uint64_t operator()(const Other&) const {
    return 0;
  }
};

}  // namespace

std::vector<WorldChange> worldAtStart(const Trace& trace) {
  std::vector<WorldChange> changes;
  for (const TraceStep& step : trace.steps) {
    const auto* const change = std::get_if<WorldChange>(&step.action);
    if (change == nullptr || step.timing != TraceStep::Timing::AsSoonAsPossible) break;
    changes.push_back(*change);
  }
  return changes;
}

TraceRunner::TraceRunner(const Trace& played, TraceStage target)
    : trace(played), stage(std::move(target)), fingers(stage.screen, stage.post) {
  next = worldAtStart(trace).size();
}

// None: it waits for the first frame.
std::optional<uint64_t> TraceRunner::startOfStep() const {
  const TraceStep& wanted = step();
  switch (wanted.timing) {
    case TraceStep::Timing::At: return std::max(wanted.time, stepDone.value_or(0));
    case TraceStep::Timing::After:
      return stepDone ? std::optional(*stepDone + wanted.time) : std::nullopt;
    case TraceStep::Timing::AsSoonAsPossible: break;
  }
  return stepDone ? std::optional(*stepDone + restMs) : std::nullopt;
}

std::optional<uint64_t> TraceRunner::due(uint64_t soonest) const {
  if (failed) return std::nullopt;
  std::optional<uint64_t> moment = fingers.due(present);
  const auto consider = [&moment](std::optional<uint64_t> other) {
    if (other && (!moment || *other < *moment)) moment = other;
  };
  if (!planned.empty()) {
    consider(planned.front().time);
  } else if (isOver()) {
    if (!trace.leavesRunning || !closedBy) {
      consider(closedBy.value_or(endOfTrace()));
    }
  } else if (lookUntil) {
    consider(hasSeen ? std::min(soonest, *lookUntil) : *lookUntil);
  } else {
    consider(startOfStep());
  }
  return moment;
}

void TraceRunner::act(uint64_t now) {
  present = now;
  fingers.tick(now);
  while (!failed && advance(now)) {
  }
  hasSeen = false;
}

// False: nothing more can be done at this time.
bool TraceRunner::advance(uint64_t now) {
  if (!planned.empty()) {
    if (planned.front().time > now) return false;
    const Planned due = std::move(planned.front());
    planned.pop_front();
    due.action(now);
    return true;
  }
  missFrames(now);
  if (failed) return false;
  if (isOver()) {
    finishTrace(now);
    return false;
  }
  if (!begin(now)) return false;
  const auto outcome =
      std::visit([&](const auto& each) { return attempt(each, now); }, step().action);
  if (outcome == Outcome::Done && !failed) finishStep(now);
  return outcome == Outcome::Done || !planned.empty();
}

bool TraceRunner::begin(uint64_t now) {
  if (begun) return true;
  const std::optional<uint64_t> start = startOfStep();
  if (!start || *start > now) return false;
  begun = now;
  stage.begin(step().line);
  return true;
}

void TraceRunner::finishStep(uint64_t now) {
  restMs = std::visit(RestAfter(), step().action);
  stepDone = now;
  begun = std::nullopt;
  lookUntil = std::nullopt;
  hasActed = false;
  typed = 0;
  shifts = 0;
  ++next;
}

void TraceRunner::finishTrace(uint64_t now) {
  if (!closedBy && endOfTrace() > now) return;
  if (!closedBy) {
    closedBy = now + kCloseMs;
    if (!trace.leavesRunning) stage.close();
  } else if (now >= *closedBy && !trace.leavesRunning) {
    const TraceLine line = trace.steps.empty() ? TraceLine() : trace.steps.back().line;
    fail(line, "the application still runs 10 seconds after it was asked to close");
  }
}

void TraceRunner::fail(const std::string& why) { fail(step().line, why); }

void TraceRunner::fail(const TraceLine& line, const std::string& why) {
  if (!failed) failed = TraceFailure{line, why};
}

void TraceRunner::plan(uint64_t time, std::function<void(uint64_t now)> action) {
  planned.push_back({time, std::move(action)});
}

void TraceRunner::seeFrame(uint64_t now, const Frame& shown,
                           const std::vector<std::string>& items) {
  if (failed) return;
  newest = shown;
  hasSeen = true;
  if (!stepDone) {
    stepDone = now;
    restMs = kRestMs;
  }
  compareFrame(now, items);
}

void TraceRunner::seeLog(const std::string& line) {
  log.push_back(line);
  hasSeen = true;
}

void TraceRunner::seeEnd() {
  if (failed || isOver() || std::holds_alternative<SessionEnd>(step().action)) return;
  fail("the application ended before this step");
}

void TraceRunner::compareFrame(uint64_t now, const std::vector<std::string>& items) {
  const std::size_t number = frames++;
  if (trace.frames.empty()) return;
  if (number >= trace.frames.size()) {
    // A recording that was cut may go on with frames that it did not keep.
    if (!trace.cutAt.empty() || !trace.isRecording) return;
    return fail(trace.frames.back().line, "one more frame follows, at " + std::to_string(now) +
                                              " ms:\n" + differenceOf({}, items));
  }
  const RecordedFrame& recorded = trace.frames[number];
  const bool isSame = hashOf(items) == recorded.hash;
  if (isSame && now == recorded.time) return;
  fail(recorded.line, "frame " + std::to_string(number + 1) +
                          (isSame ? " came at another time: " : " differs: ") + "recorded at " +
                          std::to_string(recorded.time) + " ms, played at " + std::to_string(now) +
                          " ms\n" + differenceOf(itemsOf(trace, number), items));
}

void TraceRunner::missFrames(uint64_t now) {
  if (frames >= trace.frames.size() || trace.frames[frames].time >= now) return;
  const RecordedFrame& missed = trace.frames[frames];
  fail(missed.line, "frame " + std::to_string(frames + 1) + " did not come, recorded at " +
                        std::to_string(missed.time) + " ms\n" +
                        differenceOf(itemsOf(trace, frames), textOfFrame(newest)));
}

std::string differenceOf(const std::vector<std::string>& recorded,
                         const std::vector<std::string>& played) {
  std::string text;
  const auto add = [&text](const char* mark, std::size_t number, const std::string& item) {
    text.append(mark).append(std::to_string(number)).append(" ").append(item).append("\n");
  };
  for (std::size_t i = 0; i < std::max(recorded.size(), played.size()); ++i) {
    const bool isRecorded = i < recorded.size();
    const bool isPlayed = i < played.size();
    if (isRecorded && isPlayed && recorded[i] == played[i]) {
      add("    ", i, played[i]);
      continue;
    }
    if (isRecorded) add("  - ", i, recorded[i].empty() ? "(not known)" : recorded[i]);
    if (isPlayed) add("  + ", i, played[i]);
  }
  return text;
}

}  // namespace brimol::pc
