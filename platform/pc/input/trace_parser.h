/// From a trace's text to its steps.
#pragma once

#include <functional>
#include <optional>
#include <string>

#include "input/trace.h"

namespace brimol::pc {

/// The bytes of a file; nothing where it cannot be read.
using TraceFiles = std::function<std::optional<std::string>(const std::string& path)>;

struct ParsedTrace {
  Trace trace;
  std::string error;  // "FILE:LINE: what is wrong", in one line; empty: nothing is
  TraceLine wrong;    // that line, if the error names one

  /// Keeps the first error.
  void refuse(const TraceLine& line, const std::string& why);
};

/// Steps and frames, of 200 bytes each.
constexpr std::size_t kMostSteps = 4'000'000;

/// Reads `path` and what it includes. Throws nothing, whatever the files hold: more than `mostSteps`
/// steps and frames, or more items than are compared in a bearable time, are errors, and so is a
/// lack of memory.
ParsedTrace parseTrace(const std::string& path, const TraceFiles& files,
                       std::size_t mostSteps = kMostSteps);

/// The same from the file system: 256 MiB at most. What is included is a regular file in the folder
/// `root` or below it, wherever links lead; an empty root is the folder of `path`.
ParsedTrace parseTrace(const std::string& path, const std::string& root);

}  // namespace brimol::pc
