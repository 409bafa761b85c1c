/// One archive of all that repeats a run elsewhere.
#pragma once

#include <filesystem>
#include <map>
#include <optional>
#include <string>
#include <vector>

#include "trace_files.h"

namespace brimol::replay {

/// What was run, and with what.
struct RunRecord {
  std::string version = {};                             // of brimol-replay
  std::string trace = {};                               // in a bundle: its file there
  std::vector<std::string> command = {};                // the application and its arguments
  std::map<std::string, std::string> environment = {};  // the platform's settings
  std::string verdict = {};

  bool operator==(const RunRecord&) const = default;
};

std::string jsonOf(const RunRecord& record);
/// Nothing for what is no such text.
std::optional<RunRecord> parseRecord(const std::string& text);

/// Packs the trace's files as trace/, the run's folder as run/, and the record, to a compressed tar
/// archive. False, with one line in `error`, if it cannot be written whole: what was there stays.
bool writeBundle(const std::filesystem::path& bundle, const RunRecord& record,
                 const TraceFiles& trace, const std::filesystem::path& run, std::string& error);

struct UnpackedBundle {
  RunRecord record;           // its trace named from where this program runs
  std::filesystem::path run;  // the folder of the run that was packed
};

/// Unpacks it into a new folder. What is no bundle, or would be written elsewhere, is refused, and
/// leaves no folder.
std::optional<UnpackedBundle> unpackBundle(const std::filesystem::path& bundle,
                                           const std::filesystem::path& folder, std::string& error);

/// What unpackBundle() wrote into the folder; nothing where it did not write there.
std::vector<std::filesystem::path> unpackedFiles(const std::filesystem::path& folder);

}  // namespace brimol::replay
