/// A long text, cut into rows.
#pragma once

#include <MW/api.h>

#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

namespace MW {

/// The rows of a fixed width that a text's lines fill, one buffer for all. The holder's lock guards
/// it.
class MW_API TextLines {
 public:
  static constexpr int kContinued = -1;  ///< a row that goes on with the line of the one before

  TextLines() = default;
  /// Rows of `rowBytes`, at least 1. A row ends before a character of several bytes that it cannot
  /// take whole, unless the row is shorter than that. A line that fills its last row is followed by
  /// an empty one. 0x02, 0x03 and "\r" are dropped, and a "\n" at the end begins no line. Room for
  /// `expectedRows` is put aside at once. Throws where there is no memory, and where a vector does
  /// not take as many.
  TextLines(std::string_view source, std::size_t rowBytes, std::size_t expectedRows);

  /// 0 only without a text.
  int count() const { return static_cast<int>(rows.size()); }
  /// The row's bytes, without its "\n". None beyond the rows.
  std::string_view text(int64_t row) const;
  /// The number, from 1, of the line that begins with this row, else kContinued.
  int number(int64_t row) const;
  /// The first row from `begin` on and before `end` of that number, else `end`.
  int find(int lineNumber, int begin, int end) const;

 private:
  struct Row {
    int begin;  // in `bytes`
    int number;
  };

  void addLine(std::string_view line, std::size_t rowBytes, int lineNumber);
  void addRow(std::string_view rest, int number);
  bool isRow(int64_t row) const { return row >= 0 && row < count(); }

  std::string bytes;  // what is not dropped, with the "\n"s between the lines
  std::vector<Row> rows;
};

}  // namespace MW
