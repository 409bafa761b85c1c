#include "trace_files.h"

#include <algorithm>
#include <optional>
#include <system_error>

#include "input/inside.h"
#include "input/trace_parser.h"
#include "picture.h"

namespace brimol::replay {

namespace fs = std::filesystem;

namespace {

constexpr uintmax_t kMostTraceBytes = uintmax_t{256} << 20;  // the platform refuses more

fs::path commonFolder(const fs::path& one, const fs::path& other) {
  fs::path common;
  for (auto a = one.begin(), b = other.begin(); a != one.end() && b != other.end() && *a == *b;
       ++a, ++b) {
    common /= *a;
  }
  return common;
}

}  // namespace

fs::path TraceFiles::folder() const {
  fs::path common = files.front().parent_path();
  for (const fs::path& file : files) common = commonFolder(common, file.parent_path());
  return common;
}

TraceFiles traceFiles(const fs::path& trace, const fs::path& root) {
  TraceFiles found;
  const fs::path first = fs::absolute(trace).lexically_normal();
  const fs::path allowed = root.empty() ? first.parent_path() : root;
  const auto bytes = [&](const std::string& name) -> std::optional<std::string> {
    const fs::path file = fs::path(name).lexically_normal();
    std::error_code failure;
    const bool isFit = fs::is_regular_file(file, failure) &&
                       fs::file_size(file, failure) <= kMostTraceBytes &&
                       (file == first || isInside(allowed, file));
    if (!isFit) return {};
    if (std::ranges::find(found.files, file) == found.files.end()) found.files.push_back(file);
    return bytesOf(file);
  };
  found.error = pc::parseTrace(first, bytes).error;
  return found;
}

}  // namespace brimol::replay
