/// The files that a trace consists of.
#pragma once

#include <filesystem>
#include <string>
#include <vector>

namespace brimol::replay {

struct TraceFiles {
  // The trace first, then what it includes, each once: absolute, and without `..`.
  std::vector<std::filesystem::path> files = {};
  std::string error = {};  // one line; empty: these are all of them

  /// The deepest folder that all of them are in.
  std::filesystem::path folder() const;
};

/// Reads the trace as the platform does: only what the platform would read is among the files. What
/// is included is in `root` or below it, and an empty root is the trace's own folder. A trace that
/// is a device or a pipe is not read, since it can be read only once.
TraceFiles traceFiles(const std::filesystem::path& trace, const std::filesystem::path& root);

}  // namespace brimol::replay
