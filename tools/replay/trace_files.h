/// The files that a trace consists of.
#pragma once

#include <filesystem>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace brimol::replay {

/// The name in a line `include FILE`; nothing for any other line.
std::optional<std::string> includedBy(std::string_view line);

struct TraceFiles {
  std::filesystem::path root;                // the deepest folder that all of them are in
  std::vector<std::filesystem::path> files;  // below root; the trace itself first, each once
};

/// The trace and what it includes. Nothing, with one line in `error`, if one cannot be read.
std::optional<TraceFiles> traceFiles(const std::filesystem::path& trace, std::string& error);

}  // namespace brimol::replay
