/// Where the application's screens have what the end-to-end tests use, on the screen of the device
/// hd-4.7.
#pragma once

#include <MW/main_list.h>

#include <array>
#include <string_view>

#include "layout.h"
#include "prompt.h"

namespace factory_test::screens {

inline constexpr ScreenSize kScreen = {720, 1280};
inline constexpr const char* kDevice = "hd-4.7";

/// The first rows of the menu that is not scrolled: how many groups and entries stand above each.
struct MenuRow {
  int groupsAbove;
  int entriesAbove;
};
inline constexpr MenuRow kColours = {1, 0};
inline constexpr MenuRow kTouch = {2, 4};
inline constexpr MenuRow kKeys = {2, 5};

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

/// Of the ground's colour on the menu, wherever its list is scrolled, and of another on a page.
inline constexpr SKIA_Rect kMenuHeader = {0, 70, kScreen.width, 4, kPageInk.ground};

inline constexpr PageLayout kPage = layOutPage(kScreen);
inline constexpr SKIA_Rect kPass = inColor(kPage.verdicts[0], kPassInk.ground);
inline constexpr SKIA_Rect kFail = inColor(kPage.verdicts[2], kFailInk.ground);

inline constexpr SKIA_Rect kCentre = {350, 630, 20, 20, 0};

inline constexpr int kGap = gapOf(kScreen);

/// The knob of the first switch, at its left: two fifths of it.
inline constexpr SKIA_Rect kSwitch = rowsOf<5>(kPage.content, 2 * kGap, {1, 2, 2, 2, 1})[1];
inline constexpr SKIA_Rect kKnob = {kSwitch.x, kSwitch.y, kSwitch.w * 2 / 5, kSwitch.h,
                                    MW::kColorWhite};

/// The left button of one of the toolkit's dialogs that has two, and of the application's own.
inline constexpr SKIA_Rect kDialogOk = {82, 702, 273, 105, MW::kColorWhite};
inline constexpr SKIA_Rect kPromptYes = layOutPrompt(kScreen).buttons[0];

// The log viewer's page.
inline constexpr auto kLogRows = rowsOf<2>(kPage.content, kGap, {7, 1});
inline constexpr SKIA_Rect kLogView = kLogRows[0];
inline constexpr SKIA_Rect kSearchButton =
    inColor(cellOf(kLogRows[1], kGap, {1, 3}, 0), kButtonInk.ground);
inline constexpr SKIA_Rect kKeyboard = rowsOf<2>(kPage.content, kGap, {2, 3})[1];

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
  const SKIA_Rect buttons = rowsOf<3>(kPage.content, kGap, {12, 1, 30})[2];
  return inColor(cellOf(buttons, kGap, {2, 3}, place), kButtonInk.ground);
}

}  // namespace factory_test::screens
