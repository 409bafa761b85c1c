#include "trace_files.h"

#include <algorithm>
#include <fstream>

namespace brimol::replay {

namespace fs = std::filesystem;

namespace {

constexpr std::string_view kBlanks = " \t\r";

std::string_view trimmed(std::string_view text) {
  const auto first = text.find_first_not_of(kBlanks);
  if (first == std::string_view::npos) return {};
  return text.substr(first, text.find_last_not_of(kBlanks) - first + 1);
}

bool isTime(std::string_view word) {
  if (word.starts_with('+')) word.remove_prefix(1);
  return !word.empty() && word.find_first_not_of("0123456789") == std::string_view::npos;
}

// Takes the first word away from the line.
std::string_view takeWord(std::string_view& line) {
  line = trimmed(line);
  const std::string_view word = line.substr(0, line.find_first_of(kBlanks));
  line = trimmed(line.substr(word.size()));
  return word;
}

fs::path commonFolder(const fs::path& one, const fs::path& other) {
  fs::path common;
  for (auto a = one.begin(), b = other.begin(); a != one.end() && b != other.end() && *a == *b;
       ++a, ++b) {
    common /= *a;
  }
  return common;
}

}  // namespace

std::optional<std::string> includedBy(std::string_view line) {
  std::string_view word = takeWord(line);
  if (isTime(word)) word = takeWord(line);
  if (word != "include") return {};
  // A # with a blank on either side begins a comment.
  std::string_view name = line.substr(0, std::min(line.find(" # "), line.find("\t# ")));
  name = trimmed(name);
  if (name.size() >= 2 && name.front() == '"' && name.back() == '"') {
    name = name.substr(1, name.size() - 2);
  }
  return name.empty() ? std::nullopt : std::optional<std::string>(name);
}

std::optional<TraceFiles> traceFiles(const fs::path& trace, std::string& error) {
  TraceFiles all;
  all.files.push_back(fs::absolute(trace).lexically_normal());
  all.root = all.files.front().parent_path();
  for (std::size_t next = 0; next < all.files.size(); ++next) {
    const fs::path file = all.files[next];
    std::ifstream stream(file);
    if (!stream || !fs::is_regular_file(file)) {
      error = file.native() + ": cannot be read";
      return {};
    }
    std::string line;
    if (!std::getline(stream, line) || !line.starts_with("brimol-trace")) {
      error = file.native() + ": is not a trace";
      return {};
    }
    while (std::getline(stream, line)) {
      const auto name = includedBy(line);
      if (!name) continue;
      const fs::path included = (file.parent_path() / *name).lexically_normal();
      if (std::ranges::find(all.files, included) != all.files.end()) continue;
      all.files.push_back(included);
      all.root = commonFolder(all.root, included.parent_path());
    }
  }
  for (fs::path& file : all.files) file = file.lexically_relative(all.root);
  return all;
}

}  // namespace brimol::replay
