/// Where the application's screens have what the end-to-end tests use, on the screen of the device
/// hd-4.7.
#pragma once

#include <array>
#include <string_view>

#include "layout.h"

namespace factory_test::screens {

inline constexpr ScreenSize kScreen = {720, 1280};
inline constexpr const char* kDevice = "hd-4.7";

/// The first rows of the menu that is not scrolled: how many groups and entries stand above each.
struct MenuRow {
  int groupsAbove;
  int entriesAbove;
};
inline constexpr MenuRow kColours = {1, 0};
inline constexpr MenuRow kTouch = {2, 2};
inline constexpr MenuRow kKeys = {2, 3};

constexpr SKIA_Rect areaOf(const MenuRow& row) {
  constexpr int kListTop = MW::MainList::kTitleHeight;
  constexpr int kGap = 3;
  constexpr int kGroupHeight = 42;  // one and a half of its text
  const int group = kGroupHeight + kGap;
  constexpr int kEntryHeight = 88;  // 7.1 mm
  const int entry = kEntryHeight + kGap;
  return {0, kListTop + kGap + row.groupsAbove * group + row.entriesAbove * entry, kScreen.width,
          entry - kGap, 0};
}

/// Of the ground's colour on the menu, of another on a page, wherever the list is scrolled: above
/// the words that say what to do.
inline constexpr SKIA_Rect kMenuHeader = {0, 58, kScreen.width, 8, kPageInk.ground};

inline constexpr PageLayout kPage = layOutPage(kScreen);
inline constexpr SKIA_Rect kPass = inColor(kPage.verdicts[0], kPassInk.ground);
inline constexpr SKIA_Rect kFail = inColor(kPage.verdicts[2], kFailInk.ground);

inline constexpr SKIA_Rect kCentre = {350, 630, 20, 20, 0};

/// The knob of the first switch, at its left.
inline constexpr SKIA_Rect kKnob = {36, 435, 258, 114, MW::kColorWhite};

/// The left button of a dialog that has two.
inline constexpr SKIA_Rect kDialogOk = {82, 702, 273, 105, MW::kColorWhite};

inline constexpr PageLayout kPage = layOutPage(kScreen);

// The log viewer's page.
inline constexpr SKIA_Rect kLogView = rowOf(kScreen, 34, 38, 0);
inline constexpr SKIA_Rect kSearchButton = cellOf(rowOf(kScreen, 74, 6, kButtonColor), 0, 3);
inline constexpr SKIA_Rect kKeyboard = rowOf(kScreen, 51, 29, 0);

/// Keys of the keyboard: in rows of so many half keys' indent, each key two half keys wide.
constexpr SKIA_Rect keyOf(char letter) {
  struct KeyRow {
    std::string_view letters;
    int row;
    int indent;
  };
  constexpr auto kRows = std::to_array<KeyRow>(
      {{"1234567890", 1, 0}, {"qwertyuiop", 2, 0}, {"asdfghjkl", 3, 1}, {"zxcvbnm", 4, 3}});
  constexpr int kHalf = kKeyboard.w / 20;
  constexpr int kHeight = kKeyboard.h / 6;
  for (const KeyRow& row : kRows) {
    const auto column = row.letters.find(letter);
    if (column == std::string_view::npos) continue;
    return {kKeyboard.x + (row.indent + 2 * static_cast<int>(column)) * kHalf,
            kKeyboard.y + row.row * kHeight, 2 * kHalf, kHeight, 0};
  }
  return {};
}
inline constexpr SKIA_Rect kEnterKey = {kKeyboard.x + kKeyboard.w * 3 / 4,
                                        kKeyboard.y + kKeyboard.h * 5 / 6, kKeyboard.w / 5,
                                        kKeyboard.h / 6, 0};

enum ButtonPlace {
  kPressButton,
  kClickButton,
  kLongPressButton,
  kDoubleClickButton,
  kDelayedButton,
  kLateButton
};
constexpr SKIA_Rect areaOf(ButtonPlace place) {
  return cellOf(kScreen, kButtonGrid, place, kButtonColor);
}

}  // namespace factory_test::screens
