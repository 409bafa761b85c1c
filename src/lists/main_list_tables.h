/// What the main menu's items and status texts look like, and where these stand.
#pragma once

#include <MW/main_list.h>

#include <algorithm>
#include <array>

#include "core/geometry.h"

namespace MW {

constexpr uint32_t kStatusColor = 0xFFFFFF00;
constexpr int kStatusSize = 65;  // pixels

struct ItemColors {
  int kind;
  uint32_t background;
  uint32_t text;
};

// Any kind that is not here looks like the first one.
constexpr auto kItemColors = std::to_array<ItemColors>({
    {MainList::kSelectable, 0xFF787878, kColorWhite},
    {MainList::kGrey, 0xFF787878, 0xFF353535},
    {MainList::kDark, 0xFF0F0F0F, kColorWhite},
});

constexpr const ItemColors& colorsOf(int kind) {
  const auto* const row = std::ranges::find(kItemColors, kind, &ItemColors::kind);
  return row != kItemColors.end() ? *row : kItemColors.front();
}

// The place of a status text counts columns of so many per cent of the screen's width; one that is
// no column wide reaches to the screen's edge.
struct StatusRow {
  const char* initial;
  int columnPercent;
  int left;
  int columns;
  int y;
  int height;
  int align;
};

// By MainList::StatusText.
constexpr auto kStatusRows = std::to_array<StatusRow>({
    {"", 60, 1, 0, 102, 130, SKIA_ALIGN_RIGHT},
    {"", 60, 1, 0, 187, 130, SKIA_ALIGN_RIGHT},
    {" uVOR", 33, 0, 1, 340, 65, SKIA_ALIGN_LEFT},
    {"192.168.100.1", 33, 1, 1, 340, 65, SKIA_ALIGN_CENTRE},
    {"-120 dbm", 33, 2, 1, 340, 65, SKIA_ALIGN_RIGHT},
    {"Testmode: ", 40, 0, 1, 425, 65, SKIA_ALIGN_LEFT},
    {"BLE: ", 40, 1, 1, 425, 65, SKIA_ALIGN_LEFT},
    {"", 60, 1, 0, 17, 130, SKIA_ALIGN_RIGHT},
});
static_assert(kStatusRows.size() == MainList::kOptions);

// The order of drawing; the second group in the extended mode alone.
constexpr auto kAlwaysDrawn =
    std::to_array({MainList::kBrightness, MainList::kBattery, MainList::kCharger});
constexpr auto kExtendedDrawn =
    std::to_array({MainList::kOperator, MainList::kAddress, MainList::kSignal, MainList::kTestMode,
                   MainList::kBle});

constexpr SKIA_Rect statusRect(const StatusRow& row, int screenWidth) {
  const int64_t column = percentOf(screenWidth, row.columnPercent);
  const int64_t x = row.left * column;
  return makeRect(x, row.y, row.columns > 0 ? row.columns * column : screenWidth - x, row.height,
                  0);
}
static_assert(statusRect(kStatusRows[MainList::kSignal], 1440).x == 950);
static_assert(statusRect(kStatusRows[MainList::kBattery], 1440).w == 576);

}  // namespace MW
