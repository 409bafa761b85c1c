#include "verdict.h"

#include <algorithm>
#include <cstring>

namespace brimol::replay {

namespace {

using Kind = Happening::Kind;

constexpr int kTraceRefused = 2;  // the platform's exit code for a trace that cannot be read

struct VerdictRow {
  Verdict verdict;
  const char* name;
  int exitCode;
};
constexpr auto kVerdicts = std::to_array<VerdictRow>({
    {Verdict::Passed, "passed", 0},
    {Verdict::Failed, "failed", 1},
    {Verdict::Unusable, "unusable", 2},
    {Verdict::Crashed, "crashed", 3},
    {Verdict::Hung, "hung", 3},
    {Verdict::Interrupted, "interrupted", 130},
});

const VerdictRow& rowOf(Verdict verdict) {
  return *std::ranges::find(kVerdicts, verdict, &VerdictRow::verdict);
}

// Null: there is none.
const Happening* findLast(const Session& session, auto isWanted) {
  const auto found = std::find_if(session.happenings.rbegin(), session.happenings.rend(), isWanted);
  return found == session.happenings.rend() ? nullptr : &*found;
}

const Happening* firstFailed(const Session& session) {
  const auto found = std::ranges::find(session.happenings, false, &Happening::passed);
  return found == session.happenings.end() ? nullptr : &*found;
}

std::string secondsText(int64_t ms) {
  constexpr int kSecond = 1000;
  std::string rest = std::to_string(ms % kSecond);
  rest.insert(0, 3 - std::min<std::size_t>(rest.size(), 3), '0');
  return std::to_string(ms / kSecond) + "." + rest + " s";
}

// Where it stood when it ended, for a crash or a hang.
Judgement stoppedAt(Verdict verdict, std::string headline, const Session& session) {
  Judgement judgement{verdict, std::move(headline)};
  const Happening* const last = lastAction(session);
  if (last == nullptr) {
    judgement.detail = "It had not come to the first step of its trace.";
    return judgement;
  }
  judgement.place = last->place;
  judgement.detail = "The last that happened, at " + secondsText(last->time) + ": " + last->text;
  if (last->kind == Kind::Event) {
    const Happening* const step =
        findLast(session, [](const Happening& one) { return one.kind == Kind::Step; });
    if (step != nullptr) judgement.detail += ", of the step " + step->text;
  }
  return judgement;
}

// It exited without having come to a session's end.
Judgement judgeEarlyExit(const Session& session, int code) {
  const std::string ended = ", with exit code " + std::to_string(code) + ".";
  if (session.wasRead()) {
    return stoppedAt(Verdict::Failed, "The application ended before its trace did" + ended,
                     session);
  }
  if (code == kTraceRefused) {
    return {Verdict::Unusable, "The trace or the application's command line was refused.",
            "The application ended before it opened a screen" + ended};
  }
  return {Verdict::Failed, "The application ended before it opened a screen" + ended,
          code == 0 ? "It wrote no session: is it built on the toolkit's PC platform?" : ""};
}

// It came to a session's end.
Judgement judgeFailure(const Session& session, const SessionEnd& sessionEnd, int code) {
  const Happening* const error =
      findLast(session, [](const Happening& one) { return one.kind == Kind::Error; });
  const Happening* const expectation = firstFailed(session);
  if (sessionEnd.reason == "error" || code == kTraceRefused) {
    const bool isTrace = error != nullptr && !error->place.file.empty();
    return {isTrace || code == kTraceRefused ? Verdict::Unusable : Verdict::Failed,
            isTrace ? "The trace cannot be played." : "The session failed.",
            error != nullptr ? error->text : "", error != nullptr ? error->place : Place()};
  }
  if (expectation != nullptr) {
    return {Verdict::Failed, "An expectation failed: " + expectation->text, expectation->why,
            expectation->place};
  }
  if (error != nullptr) {
    const auto end = std::min(error->text.find('\n'), error->text.size());
    return {Verdict::Failed, "A step failed: " + error->text.substr(0, end),
            error->text.substr(end + (end < error->text.size() ? 1 : 0)), error->place};
  }
  return {Verdict::Failed, "The application failed, with exit code " + std::to_string(code) + "."};
}

Judgement judgeExit(const Session& session, int code, int wantedCode) {
  if (!session.end) return judgeEarlyExit(session, code);
  const bool hasFailed = code != wantedCode || session.end->exit != 0 ||
                         session.end->reason != "closed" || firstFailed(session) != nullptr;
  if (hasFailed) return judgeFailure(session, *session.end, code);
  return {Verdict::Passed, "The trace was played to its end, and all that it expects was met."};
}

Judgement judgeEnd(const Session& session, const RunEnd& end, int wantedCode) {
  switch (end.kind) {
    case RunEnd::Kind::Exited: return judgeExit(session, end.code, wantedCode);
    case RunEnd::Kind::Signalled:
      return stoppedAt(Verdict::Crashed,
                       std::string("The application crashed: ") + ::strsignal(end.code) + ".",
                       session);
    case RunEnd::Kind::Hung:
      return stoppedAt(Verdict::Hung, "The application hung and was ended.", session);
    case RunEnd::Kind::Interrupted:
      return stoppedAt(Verdict::Interrupted, "The run was interrupted.", session);
    default: return {Verdict::Unusable, "The application could not be started.", end.why};
  }
}

}  // namespace

const char* verdictName(Verdict verdict) { return rowOf(verdict).name; }

int exitCodeOf(Verdict verdict) { return rowOf(verdict).exitCode; }

const Happening* lastAction(const Session& session) {
  return findLast(session, [](const Happening& one) {
    return one.kind == Kind::Step || one.kind == Kind::Event || one.kind == Kind::Expectation;
  });
}

Judgement judge(const Session& session, const RunEnd& end, std::size_t differences,
                int wantedCode) {
  Judgement judgement = judgeEnd(session, end, wantedCode);
  if (judgement.verdict != Verdict::Passed || differences == 0) return judgement;
  return {Verdict::Failed, std::to_string(differences) +
                               (differences == 1 ? " frame differs" : " frames differ") +
                               " from the run that it was compared with."};
}

}  // namespace brimol::replay
