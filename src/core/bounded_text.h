/// Texts that stay within their record, whatever is given.
#pragma once

#include <brimol/scene.h>

#include <cstddef>
#include <cstdint>
#include <string_view>

namespace MW {

/// Most bytes of text that a SKIA_Text takes; a NUL stands behind them.
inline constexpr int kTextMax = SKIA_TEXT_BYTES - 1;

/// At most the first `limit` bytes, and no character of several bytes cut in half.
std::string_view cutText(std::string_view given, std::size_t limit);

/// What a record can hold of a C string, or of its first `count` bytes: at most kTextMax bytes, up
/// to the NUL if there is one, and no character of several bytes cut in half. Null is empty.
std::string_view boundedText(const char* given);
std::string_view boundedText(const char* given, std::size_t count);
/// The first `count` bytes, NULs among them, cut to kTextMax at a whole character. Null is empty.
std::string_view countedText(const char* given, std::size_t count);

/// Puts the text and a NUL into the record and sets its length; the rest of the record stays.
void putText(SKIA_Text& record, std::string_view bounded);
/// The same without the NUL: what stood behind the new text stays there, and the length alone says
/// where it ends.
void putTextOpen(SKIA_Text& record, std::string_view bounded);

/// What a number is filled up with at its left, and to how many characters.
struct Padding {
  char fill;
  std::ptrdiff_t width;
};

/// Puts a number and what stands behind it: a pass over many rows has no time for printf.
void putNumber(SKIA_Text& record, int number, Padding padding, std::string_view behind);

/// A record of these words, at most kTextMax bytes, and looks; the rest of it is zero.
SKIA_Text makeText(std::string_view bounded, uint32_t color, int align, int size);

/// A copy of an application's record: its colour, alignment and size, and its text up to the NUL
/// with the length that this gives. Null: an empty record.
SKIA_Text copyText(const SKIA_Text* given);

}  // namespace MW
