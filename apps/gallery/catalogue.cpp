#include <algorithm>
#include <array>
#include <cstddef>
#include <limits>
#include <sstream>
#include <vector>

#include "example.h"
#include "families/families.h"

namespace gallery {

namespace {

// What stands between the brace at `open` and the one that closes it.
std::string_view insideBraces(std::string_view source, std::size_t open) {
  int depth = 0;
  for (std::size_t i = open; i < source.size(); ++i) {
    if (source[i] == '{') ++depth;
    if (source[i] == '}' && --depth == 0) return source.substr(open + 1, i - open - 1);
  }
  return {};
}

std::vector<std::string> linesOf(std::string_view text) {
  std::istringstream in{std::string(text)};
  std::vector<std::string> lines;
  for (std::string line; std::getline(in, line);) {
    if (line.find_first_not_of(' ') != std::string::npos || !lines.empty()) lines.push_back(line);
  }
  while (!lines.empty() && lines.back().find_first_not_of(' ') == std::string::npos) {
    lines.pop_back();
  }
  return lines;
}

std::size_t indentOf(const std::string& line) {
  return std::min(line.find_first_not_of(' '), line.size());
}

// Without the blanks that stand before every line.
std::string unindented(const std::vector<std::string>& lines) {
  std::size_t indent = std::numeric_limits<std::size_t>::max();
  for (const std::string& line : lines) {
    if (!line.empty()) indent = std::min(indent, indentOf(line));
  }
  std::string text;
  for (const std::string& line : lines) {
    text += line.empty() ? line : line.substr(indent);
    text += '\n';
  }
  return text;
}

}  // namespace

std::span<const Family> families() {
  static const std::array kFamilies = {buttons(), slides(), pictures(), screens(), timed(),
                                       texts(),   lists(),  dialogs(),  prompts(), descriptors()};
  return kFamilies;
}

std::string codeOf(const Family& family, const Example& example) {
  const std::size_t row = family.source.find("{\"" + std::string(example.name) + '"');
  const std::size_t lambda = family.source.find("[](Loop& loop) {", row);
  if (row == std::string_view::npos || lambda == std::string_view::npos) return {};
  return unindented(linesOf(insideBraces(family.source, family.source.find('{', lambda))));
}

std::string functionIn(std::string_view source, std::string_view beginning) {
  constexpr std::string_view kEnd = "\n}\n";
  const std::size_t from = source.find(beginning);
  const std::size_t to = source.find(kEnd, from);
  if (from == std::string_view::npos || to == std::string_view::npos) return {};
  return std::string(source.substr(from, to + kEnd.size() - from));
}

}  // namespace gallery
