#include <MW/static_text.h>

#include <algorithm>
#include <exception>
#include <utility>

#include "core/bounded_text.h"
#include "core/geometry.h"
#include "text/text_parts.h"

namespace MW {

namespace {

constexpr int kNoRow = -1;
constexpr std::size_t kShortestWanted = 2;  // bytes; a single one is found nowhere

// The line of every match, in the text's order; a line with two is listed twice. Where the wanted
// text begins with the end of a line, all matches are of line 1.
std::vector<int> findLines(std::string_view source, std::string_view wanted) {
  std::vector<int> found;
  if (wanted.size() < kShortestWanted) return found;
  const bool countsLines = wanted.front() != '\n';
  int line = 1;
  std::size_t counted = 0;
  std::size_t at = source.find(wanted);
  while (at != std::string_view::npos) {
    const std::string_view between = source.substr(counted, at - counted);
    if (countsLines) line += static_cast<int>(std::ranges::count(between, '\n'));
    found.push_back(line);
    counted = at;
    at = source.find(wanted, at + 1);
  }
  return found;
}

}  // namespace

void StaticText::get_ime_result(const char* wanted) {
  const std::string_view given = wholeText(wanted);
  kViewerLog.print(LogLevel::Debug, "str : %s (get_ime_result)", given.data());
  kViewerLog.print(LogLevel::Debug, "strlen(str) : %d (get_ime_result)",
                   static_cast<int>(given.size()));
  const auto kept = shortText(wanted);
  write(str_searched, kept);
  kViewerLog.print(LogLevel::Debug, "str_searched : %s (get_ime_result)", kept.data());
}

void StaticText::line_search(const char* source) {
  kViewerLog.print(LogLevel::Debug, "line_search start");
  const auto wanted = read(str_searched);
  kViewerLog.print(LogLevel::Debug, "str_searched : %s (line_search)", wanted.data());
  std::vector<int> numbers;
  std::vector<int> rows;
  try {
    numbers = findLines(wholeText(source), wanted.data());
    rows.resize(numbers.size());
  } catch (const std::exception&) {
    numbers.clear();
    rows.clear();
  }
  takeMatches(numbers, rows);
  kViewerLog.print(LogLevel::Debug, "line_search end");
}

// One walk over the rows: matches and rows both ascend. The last row is not looked at, and a line
// that is not met counts as row 0.
void StaticText::takeMatches(std::vector<int>& numbers, std::vector<int>& rows) {
  const std::lock_guard guard(stateLock);
  const int end = line_count - 1;
  int row = 0;
  for (std::size_t i = 0; i < numbers.size(); ++i) {
    row = lines.find(numbers[i], row, end);
    if (row >= end) break;
    rows[i] = row;
  }
  std::swap(found_lines, numbers);
  std::swap(found_index, rows);
  if (!found_index.empty()) top_index = found_index.front();
}

void StaticText::line_search_point(unsigned int direction) {
  int previous = kNoRow;
  int next = kNoRow;
  {
    const std::lock_guard guard(stateLock);
    for (const int row : found_index) {
      if (row < top_index) previous = row;
      if (row <= top_index) continue;
      next = row;
      break;
    }
    const int64_t last = lastTop();
    if (direction == kPrevious && previous != kNoRow) {
      top_index = last >= 0 ? toPixels(std::min<int64_t>(previous, last)) : previous;
    } else if (direction == kNext && next != kNoRow && last >= 0) {
      top_index = toPixels(std::min<int64_t>(next, last));
    }
  }
  kViewerLog.withoutGap().print(LogLevel::Debug, "prev_index : %d", previous);
  kViewerLog.withoutGap().print(LogLevel::Debug, "next_index : %d", next);
}

int StaticText::find_real_num(int real) {
  kViewerLog.withoutGap().print(LogLevel::Debug, "find_real_num");
  const std::lock_guard guard(stateLock);
  const int row = lines.find(real, 0, last_index);
  if (row == last_index) return top_index;
  const int64_t last = lastTop();
  return last >= 0 ? toPixels(std::min<int64_t>(row, last)) : row;
}

}  // namespace MW
