#include "input/trace_words.h"

#include <algorithm>
#include <charconv>
#include <cmath>
#include <system_error>

#include "scene/quoted_text.h"

namespace brimol::pc {

namespace {

constexpr int kMostPixels = 65535;
constexpr int kHundredths = 100;
constexpr uint64_t kMostMs = 86'400'000;  // a day
constexpr int kHexBase = 16;
constexpr std::size_t kShownBytes = 40;

bool isBlank(char letter) { return letter == ' ' || letter == '\t' || letter == '\r'; }

// One past the closing quote of the text that begins the line.
std::size_t endOfText(std::string_view line) {
  for (std::size_t i = 1; i < line.size(); ++i) {
    if (line[i] == '\\') {
      ++i;
    } else if (line[i] == '"') {
      return i + 1;
    }
  }
  throw BadLine{"a text without its closing quote"};
}

bool isComment(std::string_view rest) {
  return rest.starts_with('#') && (rest.size() == 1 || isBlank(rest[1]));
}

std::string_view insideOf(std::string_view text) { return text.substr(1, text.size() - 2); }

std::string plainText(std::string_view inside) {
  const auto text = unescaped(inside);
  if (!text) throw BadLine{R"(a text with an escape other than \" \\ \n \t \* and \xHH)"};
  return *text;
}

}  // namespace

TraceWords::TraceWords(std::string_view line) {
  while (true) {
    const auto* const first = std::ranges::find_if_not(line, isBlank);
    line.remove_prefix(static_cast<std::size_t>(first - line.begin()));
    if (line.empty() || isComment(line)) return;
    const auto* const blank = std::ranges::find_if(line, isBlank);
    const std::size_t length =
        line.front() == '"' ? endOfText(line) : static_cast<std::size_t>(blank - line.begin());
    words.emplace_back(line.substr(0, length));
    line.remove_prefix(length);
    if (!line.empty() && !isBlank(line.front())) throw BadLine{"a text that another word touches"};
  }
}

void TraceWords::fail(const std::string& wanted) const {
  if (isAtEnd()) throw BadLine{wanted + " is missing"};
  throw BadLine{"'" + words[next].substr(0, kShownBytes) + "' is not " + wanted};
}

void TraceWords::expectEnd() const {
  if (!isAtEnd()) throw BadLine{"'" + words[next].substr(0, kShownBytes) + "' is too much"};
}

std::string_view TraceWords::peek() const {
  return isAtEnd() ? std::string_view() : std::string_view(words[next]);
}

bool TraceWords::takes(std::string_view word) {
  if (isAtEnd() || words[next] != word) return false;
  ++next;
  return true;
}

void TraceWords::expect(std::string_view word) {
  if (!takes(word)) fail("'" + std::string(word) + "'");
}

std::string TraceWords::word(const char* what) {
  if (isAtEnd() || isTextNext()) fail(what);
  return words[next++];
}

uint64_t TraceWords::number(const char* what, uint64_t most) {
  uint64_t value = 0;
  const std::string_view digits = peek();
  const char* const end = digits.data() + digits.size();
  const auto [stop, failure] = std::from_chars(digits.data(), end, value);
  if (digits.empty() || failure != std::errc() || stop != end || value > most) {
    fail(std::string(what) + ", 0 to " + std::to_string(most));
  }
  ++next;
  return value;
}

int TraceWords::signedNumber(const char* what, int most) {
  if (!peek().starts_with('-')) return static_cast<int>(number(what, static_cast<uint64_t>(most)));
  words[next].erase(0, 1);
  return -static_cast<int>(number(what, static_cast<uint64_t>(most)));
}

std::string TraceWords::text(const char* what) {
  if (!isTextNext()) fail(std::string(what) + " in quotes");
  return plainText(insideOf(words[next++]));
}

TextPattern TraceWords::pattern() {
  if (!isTextNext()) fail("a text in quotes");
  std::string_view rest = insideOf(words[next]);
  if (rest.empty()) throw BadLine{"an empty text is on every screen"};
  ++next;
  std::vector<std::string> pieces;
  std::size_t length = 0;
  for (; length < rest.size(); ++length) {
    if (rest[length] == '\\') {
      ++length;
    } else if (rest[length] == '*') {
      pieces.push_back(plainText(rest.substr(0, length)));
      rest.remove_prefix(length + 1);
      length = static_cast<std::size_t>(-1);
    }
  }
  pieces.push_back(plainText(rest));
  return TextPattern(std::move(pieces));
}

Coordinate TraceWords::signedCoordinate() {
  std::string_view digits = peek();
  if (!digits.ends_with('%')) return {signedNumber("a number of pixels", kMostPixels), false};
  digits.remove_suffix(1);
  double share = 0;
  const char* const end = digits.data() + digits.size();
  const auto [stop, failure] = std::from_chars(digits.data(), end, share);
  constexpr double kWhole = 100;
  // The comparison is false for what is no number.
  if (failure != std::errc() || stop != end || !(std::abs(share) <= kWhole)) {
    fail("a part of the screen, 0% to 100%");
  }
  ++next;
  return {static_cast<int>(std::lround(share * kHundredths)), true};
}

Coordinate TraceWords::distance() { return signedCoordinate(); }

Coordinate TraceWords::coordinate() {
  const std::size_t place = next;
  const std::string written(peek());
  const Coordinate found = signedCoordinate();
  if (found.value >= 0) return found;
  next = place;
  words[next] = written;
  fail("a position, which is never negative");
}

Place TraceWords::place() {
  if (isTextNext()) return {.x = {}, .y = {}, .text = pattern()};
  if (isAtEnd()) fail("a text in quotes or a position");
  const Coordinate x = coordinate();
  return {.x = x, .y = coordinate(), .text = {}};
}

uint64_t TraceWords::hexadecimal(const char* what, std::size_t digits) {
  const std::string_view shown = peek();
  uint64_t value = 0;
  const char* const end = shown.data() + shown.size();
  const auto [stop, failure] = std::from_chars(shown.data(), end, value, kHexBase);
  if (shown.size() != digits || failure != std::errc() || stop != end) fail(what);
  ++next;
  return value;
}

uint32_t TraceWords::milliseconds(std::string_view name, uint32_t unsaid) {
  if (!takes(name)) return unsaid;
  return static_cast<uint32_t>(number("a number of milliseconds", kMostMs));
}

int Coordinate::pixels(int side) const {
  constexpr int64_t kWhole = 10'000;
  if (!isPart) return value;
  return static_cast<int>(int64_t{value} * side / kWhole);
}

}  // namespace brimol::pc
