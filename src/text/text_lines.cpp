#include <MW/detail/text_lines.h>

#include <algorithm>

#include "core/bounded_text.h"

namespace MW {

namespace {

constexpr bool isDropped(char byte) { return byte == '\x02' || byte == '\x03' || byte == '\r'; }

}  // namespace

TextLines::TextLines(std::string_view source, std::size_t rowBytes, std::size_t expectedRows) {
  if (source.ends_with('\n')) source.remove_suffix(1);
  bytes.resize(source.size());
  bytes.erase(std::remove_copy_if(source.begin(), source.end(), bytes.begin(), isDropped),
              bytes.end());
  rows.reserve(expectedRows);
  auto begin = bytes.cbegin();
  for (int lineNumber = 1;; ++lineNumber) {
    const auto end = std::find(begin, bytes.cend(), '\n');
    addLine({begin, end}, rowBytes, lineNumber);
    if (end == bytes.cend()) break;
    begin = end + 1;
  }
}

void TextLines::addLine(std::string_view line, std::size_t rowBytes, int lineNumber) {
  int number = lineNumber;
  while (line.size() >= rowBytes) {
    const std::size_t whole = cutText(line, rowBytes).size();
    addRow(line, number);
    number = kContinued;
    line.remove_prefix(whole != 0 ? whole : rowBytes);
  }
  addRow(line, number);
}

void TextLines::addRow(std::string_view rest, int number) {
  rows.push_back({static_cast<int>(rest.data() - bytes.data()), number});
}

std::string_view TextLines::text(int64_t row) const {
  if (!isRow(row)) return "";
  const auto index = static_cast<std::size_t>(row);
  const auto begin = static_cast<std::size_t>(rows[index].begin);
  const std::size_t end =
      index + 1 < rows.size() ? static_cast<std::size_t>(rows[index + 1].begin) : bytes.size();
  std::string_view found = std::string_view(bytes).substr(begin, end - begin);
  if (found.ends_with('\n')) found.remove_suffix(1);
  return found;
}

int TextLines::number(int64_t row) const {
  return isRow(row) ? rows[static_cast<std::size_t>(row)].number : kContinued;
}

int TextLines::find(int lineNumber, int begin, int end) const {
  int row = begin;
  while (row < end && number(row) != lineNumber) ++row;
  return std::min(row, end);
}

}  // namespace MW
