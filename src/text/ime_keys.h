/// The keys of the on-screen keyboard, and where they stand.
#pragma once

#include <MW/records.h>

#include <array>

#include "core/geometry.h"

namespace MW {

/// What a press does. Digits and the keys that no layout changes are the same in all of them.
enum class KeyRole { Bar, Digit, Letter, Space, Shift, Back, Fold, Enter };

/// Rows and columns count from 0, columns and widths in halves of a key. The bar is as wide as the
/// keyboard.
struct ImeKey {
  KeyRole role;
  int row;
  int column;
  int width;
  std::array<const char*, 3> labels;  // small letters, capitals, special characters
};

constexpr ImeKey digitKey(int column, const char* label) {
  return {KeyRole::Digit, 1, column, 2, {label, label, label}};
}
constexpr ImeKey wordKey(KeyRole role, int row, int column, int width, const char* label) {
  return {role, row, column, width, {label, label, label}};
}

// In the order of drawing, which is that of the labels.
inline constexpr auto kImeKeys = std::to_array<ImeKey>({
    wordKey(KeyRole::Bar, 0, 0, 20, ""),
    digitKey(0, "1"),
    digitKey(2, "2"),
    digitKey(4, "3"),
    digitKey(6, "4"),
    digitKey(8, "5"),
    digitKey(10, "6"),
    digitKey(12, "7"),
    digitKey(14, "8"),
    digitKey(16, "9"),
    digitKey(18, "0"),
    {KeyRole::Letter, 2, 0, 2, {"q", "Q", "["}},
    {KeyRole::Letter, 2, 2, 2, {"w", "W", "]"}},
    {KeyRole::Letter, 2, 4, 2, {"e", "E", "{"}},
    {KeyRole::Letter, 2, 6, 2, {"r", "R", "}"}},
    {KeyRole::Letter, 2, 8, 2, {"t", "T", "("}},
    {KeyRole::Letter, 2, 10, 2, {"y", "Y", ")"}},
    {KeyRole::Letter, 2, 12, 2, {"u", "U", "<"}},
    {KeyRole::Letter, 2, 14, 2, {"i", "I", ">"}},
    {KeyRole::Letter, 2, 16, 2, {"o", "O", "_"}},
    {KeyRole::Letter, 2, 18, 2, {"p", "P", "-"}},
    {KeyRole::Letter, 3, 1, 2, {"a", "A", "+"}},
    {KeyRole::Letter, 3, 3, 2, {"s", "S", "="}},
    {KeyRole::Letter, 3, 5, 2, {"d", "D", "%"}},
    {KeyRole::Letter, 3, 7, 2, {"f", "F", ":"}},
    {KeyRole::Letter, 3, 9, 2, {"g", "G", "~"}},
    {KeyRole::Letter, 3, 11, 2, {"h", "H", "#"}},
    {KeyRole::Letter, 3, 13, 2, {"j", "J", "^"}},
    {KeyRole::Letter, 3, 15, 2, {"k", "K", "&"}},
    {KeyRole::Letter, 3, 17, 2, {"l", "L", "*"}},
    wordKey(KeyRole::Shift, 4, 0, 3, "shift"),
    {KeyRole::Letter, 4, 3, 2, {"z", "Z", "\\"}},
    {KeyRole::Letter, 4, 5, 2, {"x", "X", "/"}},
    {KeyRole::Letter, 4, 7, 2, {"c", "C", ";"}},
    {KeyRole::Letter, 4, 9, 2, {"v", "V", ","}},
    {KeyRole::Letter, 4, 11, 2, {"b", "B", "."}},
    {KeyRole::Letter, 4, 13, 2, {"n", "N", "?"}},
    {KeyRole::Letter, 4, 15, 2, {"m", "M", "!"}},
    wordKey(KeyRole::Back, 4, 17, 3, "back"),
    wordKey(KeyRole::Fold, 5, 0, 5, "fold"),
    wordKey(KeyRole::Space, 5, 5, 10, "space"),
    wordKey(KeyRole::Enter, 5, 15, 5, "enter"),
});

// An odd width loses its last pixel in every half, so that some are left over at the right.
constexpr SKIA_Rect keyRect(const ImeKey& key, const SKIA_Rect& area) {
  constexpr int kColumns = 10;
  constexpr int kRows = 6;
  const int64_t w = area.w / kColumns;
  const int64_t h = area.h / kRows;
  const auto across = [w](int halves) { return halves / 2 * w + halves % 2 * (w / 2); };
  return makeRect(area.x + across(key.column), area.y + key.row * h,
                  key.role == KeyRole::Bar ? area.w : across(key.width), h, kColorWhite);
}
static_assert(keyRect(kImeKeys[29], {0, 0, 720, 600, 0}).x == 612);  // l
static_assert(keyRect(kImeKeys[38], {0, 0, 725, 600, 0}).w == 108);  // back
static_assert(keyRect(kImeKeys[41], {0, 0, 720, 600, 0}).x == 540);  // enter

/// What the layout of digits alone greys, and does not take.
constexpr bool isGreyed(KeyRole role) {
  return role == KeyRole::Letter || role == KeyRole::Shift || role == KeyRole::Space;
}

}  // namespace MW
