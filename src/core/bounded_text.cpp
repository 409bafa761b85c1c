#include "core/bounded_text.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cstring>

namespace MW {

namespace {

constexpr unsigned char kContinuationMask = 0xC0;
constexpr unsigned char kContinuation = 0x80;

bool continuesCharacter(char byte) {
  return (static_cast<unsigned char>(byte) & kContinuationMask) == kContinuation;
}

}  // namespace

std::string_view cutText(std::string_view given, std::size_t limit) {
  if (given.size() <= limit) return given;
  constexpr std::size_t kLongestTail = 3;
  std::size_t cut = limit;
  while (cut > 0 && limit - cut <= kLongestTail && continuesCharacter(given[cut])) --cut;
  // Bytes that are no character at all are cut where the limit is.
  return given.substr(0, continuesCharacter(given[cut]) ? limit : cut);
}

std::string_view boundedText(const char* given) { return boundedText(given, SKIA_TEXT_BYTES); }

std::string_view boundedText(const char* given, std::size_t count) {
  if (given == nullptr) return "";
  return cutText({given, strnlen(given, std::min<std::size_t>(count, SKIA_TEXT_BYTES))}, kTextMax);
}

std::string_view countedText(const char* given, std::size_t count) {
  if (given == nullptr) return "";
  return cutText({given, std::min<std::size_t>(count, SKIA_TEXT_BYTES)}, kTextMax);
}

void putTextOpen(SKIA_Text& record, std::string_view bounded) {
  // An empty view may point nowhere.
  if (!bounded.empty()) std::memmove(record.text, bounded.data(), bounded.size());
  record.string_len = static_cast<int32_t>(bounded.size());
}

void putText(SKIA_Text& record, std::string_view bounded) {
  putTextOpen(record, bounded);
  record.text[bounded.size()] = '\0';
}

void putNumber(SKIA_Text& record, int number, Padding padding, std::string_view behind) {
  constexpr std::size_t kMostDigits = 11;  // with the sign
  std::array<char, kMostDigits> digits = {};
  char* const end = std::to_chars(digits.begin(), digits.end(), number).ptr;
  const auto missing = std::max<std::ptrdiff_t>(padding.width - (end - digits.begin()), 0);
  char* next = std::fill_n(record.text, missing, padding.fill);
  next = std::copy(digits.begin(), end, next);
  next = std::ranges::copy(behind, next).out;
  *next = '\0';
  record.string_len = static_cast<int32_t>(next - record.text);
}

SKIA_Text makeText(std::string_view bounded, uint32_t color, int align, int size) {
  SKIA_Text record = {};
  record.color = color;
  record.align = align;
  record.size = size;
  putText(record, bounded);
  return record;
}

SKIA_Text copyText(const SKIA_Text* given) {
  if (given == nullptr) return {};
  return makeText(boundedText(given->text), given->color, given->align, given->size);
}

}  // namespace MW
