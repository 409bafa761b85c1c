/// The words of a line of a trace.
#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "input/trace.h"

namespace brimol::pc {

/// Thrown by what reads a line, and caught where the line is known.
struct BadLine {
  std::string why;
};

/// Takes a line apart from left to right. What is not there, or wrong, is a BadLine.
class TraceWords {
 public:
  explicit TraceWords(std::string_view line);

  bool isAtEnd() const { return next == words.size(); }
  void expectEnd() const;
  /// Takes the next word if it is this one.
  bool takes(std::string_view word);
  void expect(std::string_view word);
  /// The next word as it is written; empty at the end. It stays.
  std::string_view peek() const;
  bool isTextNext() const { return peek().starts_with('"'); }

  std::string word(const char* what);
  uint64_t number(const char* what, uint64_t most);
  int signedNumber(const char* what, int most);
  std::string text(const char* what);
  TextPattern pattern();
  Coordinate coordinate();
  Coordinate distance();
  Place place();
  uint64_t hexadecimal(const char* what, std::size_t digits);
  /// The value behind an optional word, such as `for 300`.
  uint32_t milliseconds(std::string_view name, uint32_t unsaid);

 private:
  Coordinate signedCoordinate();
  [[noreturn]] void fail(const std::string& wanted) const;

  std::vector<std::string> words;  // texts with their quotes
  std::size_t next = 0;
};

}  // namespace brimol::pc
