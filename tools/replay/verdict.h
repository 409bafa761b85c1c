/// What a run comes to.
#pragma once

#include <array>
#include <chrono>
#include <string>
#include <string_view>

#include "session.h"

namespace brimol::replay {

/// How the application's process ended.
struct RunEnd {
  enum class Kind { NotStarted, Exited, Signalled, Hung, Interrupted };

  Kind kind = Kind::NotStarted;
  int code = 0;  // its exit code, or the number of the signal
  std::chrono::milliseconds realTime{0};
  std::string why = {};  // it did not start
};

enum class Verdict { Passed, Failed, Unusable, Crashed, Hung, Interrupted };

struct Judgement {
  Verdict verdict = Verdict::Passed;
  std::string headline = {};  // a sentence
  std::string detail = {};    // more of them; may be empty
  Place place = {};           // the line of the trace that it happened at, if one is known
};

/// A word for reports: "passed", "failed", "unusable", "crashed", "hung", "interrupted".
const char* verdictName(Verdict verdict);

/// `differences`: how many frames differ from those of the run that it is compared with.
/// `wantedCode`: with which the application is to end.
Judgement judge(const Session& session, const RunEnd& end, std::size_t differences,
                int wantedCode = 0);

/// The exit code of brimol-replay.
int exitCodeOf(Verdict verdict);

/// The newest event or step before the end. Null: there was none.
const Happening* lastAction(const Session& session);

struct ExitRow {
  int code;
  std::string_view meaning;
};
constexpr auto kExitRows = std::to_array<ExitRow>({
    {0, "the trace was played to its end, and all that it expects was met"},
    {1,
     "an expectation failed, a frame differs, the layout has a fault, or the application failed"},
    {2, "the command line, the trace or the bundle is wrong, or a file cannot be written"},
    {3, "the application crashed or hung"},
    {130, "the run was interrupted"},
});

}  // namespace brimol::replay
