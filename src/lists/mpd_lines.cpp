#include "lists/mpd_lines.h"

#include <algorithm>
#include <charconv>
#include <cstring>
#include <limits>
#include <memory>

#include "core/bounded_text.h"

namespace MW {

namespace {

constexpr std::string_view kMarker = "[MPDIA]";
constexpr std::string_view kNoName = "no name";
constexpr std::size_t kHeadBytes = 18;
constexpr int kTopLevel = 1;

// What stands from `place` on, if anything does.
std::string_view tailOf(std::string_view given, std::size_t place) {
  return given.substr(std::min(place, given.size()));
}

int levelOf(std::string_view line) {
  const std::size_t bracket = line.find('[');
  if (bracket == std::string_view::npos) return kTopLevel;
  const std::string_view inside = tailOf(line, bracket + 1);
  std::string_view number = tailOf(inside, inside.find_first_not_of(" \t\v\f\r"));
  if (number.starts_with('+') && !number.starts_with("+-")) number.remove_prefix(1);
  int level = 0;
  const auto result =
      std::from_chars(std::to_address(number.begin()), std::to_address(number.end()), level);
  if (result.ec == std::errc::result_out_of_range) {
    using Limits = std::numeric_limits<int>;
    level = number.starts_with('-') ? Limits::min() : Limits::max();
  }
  return level == 0 ? kTopLevel : level;
}

MpdLine parseLine(std::string_view line) {
  MpdLine parsed = {};
  parsed.level = levelOf(line);
  putField(parsed.head, cutText(line, kHeadBytes));
  const std::size_t marker = line.find(kMarker);
  const bool isMarked = marker != std::string_view::npos;
  const std::string_view rest = isMarked ? tailOf(line, marker + kMarker.size()) : line;
  const std::size_t close = isMarked ? rest.find(']', 1) : std::string_view::npos;
  if (close == std::string_view::npos) {
    putField(parsed.name, kNoName);
    putField(parsed.value, rest);  // the separator belongs to it
  } else {
    putField(parsed.name, rest.substr(1, close - 1));
    putField(parsed.value, tailOf(rest, close + 1));
  }
  return parsed;
}

}  // namespace

std::string_view mpdText(const char* lines, int length) {
  if (lines == nullptr || length <= 0) return {};
  return {lines, strnlen(lines, static_cast<std::size_t>(length) + 1)};
}

std::vector<MpdLine> parseMpdLines(std::string_view text) {
  std::vector<MpdLine> lines;
  std::size_t start = 0;
  while (lines.size() < MpdWid::kItems) {
    // The text's first byte ends no line.
    const std::size_t end = text.find('\n', std::max<std::size_t>(start, 1));
    if (end == std::string_view::npos) break;
    lines.push_back(parseLine(text.substr(start, end - start)));
    start = end + 1;
  }
  for (std::size_t i = 0; i + 1 < lines.size(); ++i) {
    lines[i].details = lines[i].level < lines[i + 1].level;
  }
  return lines;
}

void putField(MpdLine::Field& field, std::string_view given) {
  const std::string_view kept = cutText(given, field.size() - 1);
  *std::ranges::copy(kept, field.begin()).out = '\0';
}

}  // namespace MW
