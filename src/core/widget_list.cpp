#include <MW/widget_list.h>

#include <algorithm>
#include <cstdlib>

#include "core/bounded_text.h"
#include "core/class_log.h"

namespace MW {

namespace {

constexpr ClassLog kLog("WIDGET", "BRIMOL_WIDGETLIST");
constexpr int kIndexLimit = 0x10000000;
// The shadow has one size, whatever the screen's.
constexpr SKIA_Rect kShadow = {0, 0, 539, 939, 0x7F000000};

WidgetList::Slot& slotAt(int slot) { return WidgetList::save[static_cast<std::size_t>(slot)]; }

// Index 0 marks free slots and is nobody's.
SKIA_Item* findItem(int index) {
  if (index == 0) return nullptr;
  const int slot = WidgetList::index2slot(index);
  return slot < 0 ? nullptr : slotAt(slot).item;
}

// The item of an index, or null after a log line that names the operation.
SKIA_Item* itemToChange(int index, const char* operation) {
  SKIA_Item* const item = findItem(index);
  if (item == nullptr) kLog.print(LogLevel::Debug, "%s: index is invalid %d ", operation, index);
  return item;
}

int setShown(int index, int shown) {
  if (WidgetList::is_init == 0) return 0;
  if (findItem(index) == nullptr) return WidgetList::kNotFound;
  slotAt(WidgetList::index2slot(index)).shown = shown;
  return 1;
}

// Items come from malloc: the table is public, and applications may free or replace what it holds.
SKIA_Item* allocateItem() {
  auto* const item = static_cast<SKIA_Item*>(std::malloc(sizeof(SKIA_Item)));
  if (item != nullptr) *item = {};
  return item;
}

void empty(WidgetList::Slot& slot) {
  std::free(slot.item);
  slot.item = nullptr;
  slot.index = 0;
}

void boundText(SKIA_Text& text) {
  text.string_len = std::clamp(text.string_len, 0, kTextMax);
  text.text[kTextMax] = '\0';
}

}  // namespace

std::array<WidgetList::Slot, WidgetList::kSlots> WidgetList::save = {};
int WidgetList::index_num = 0;
int WidgetList::is_init = 0;

int WidgetList::init() {
  std::ranges::for_each(save, empty);
  is_init = 1;
  return is_init;
}

int WidgetList::destroy() {
  is_init = 0;
  std::ranges::for_each(save, empty);
  return is_init;
}

int WidgetList::index2slot(int index) {
  const auto found = std::ranges::find(save, index, &Slot::index);
  return found == save.end() ? kNotFound : static_cast<int>(found - save.begin());
}

int WidgetList::findEmpty() {
  const auto found = std::ranges::find(save, 0, &Slot::index);
  return found == save.end() ? kFull : static_cast<int>(found - save.begin());
}

int WidgetList::getSlot() {
  if (is_init == 0) return kNotInitialised;
  const int slot = findEmpty();
  // The code of a full table, turned positive, is taken for a slot: slot 100 is used over and over.
  if (slot < 0) return -slot;
  if (index_num >= kIndexLimit - 1) return kIndexesUsedUp;
  SKIA_Item* const item = allocateItem();
  if (item == nullptr) return kNoMemory;
  slotAt(slot) = {++index_num, 1, item};
  return slot;
}

int WidgetList::addQueue(int kind, const SKIA_Rect* rect, const SKIA_Point* point,
                         const SKIA_Text* text) {
  const int taken = getSlot();
  if (taken < 0) return taken;
  Slot& slot = slotAt(taken);
  if (slot.item == nullptr) return kNoMemory;  // an application has emptied slot 100
  SKIA_Item& item = *slot.item;
  item = {.kind = kind, .rect = {}, .point = {}, .text = {}};
  if (rect != nullptr) item.rect = *rect;
  if (point != nullptr) item.point = *point;
  if (text != nullptr) item.text = *text;
  boundText(item.text);
  slot.shown = 1;
  return slot.index;
}

int WidgetList::remove(int) { return is_init; }

int WidgetList::show() {
  if (is_init == 0) return 0;
  for (const Slot& slot : save) {
    if (slot.index != 0 && slot.shown == 1) skia_add_widget_c(slot.item);
  }
  return 1;
}

int WidgetList::show(int index) { return setShown(index, 1); }
int WidgetList::hide(int index) { return setShown(index, 0); }

int WidgetList::hideShadow() {
  if (is_init == 0) return 0;
  show();
  skia_add_box_c(kShadow);
  return 1;
}

int WidgetList::setText(int index, const char* s, unsigned int len) {
  if (is_init == 0) return 0;
  SKIA_Item* const item = itemToChange(index, "setText");
  if (item == nullptr) return kNotFound;
  if (len != 0) putText(item->text, countedText(s, len));
  return 1;
}

int WidgetList::setColor(int index, unsigned int textColor, unsigned int fillColor,
                         unsigned int lineColor) {
  if (is_init == 0) return 0;
  SKIA_Item* const item = itemToChange(index, "setColor");
  if (item == nullptr) return kNotFound;
  item->text.color = textColor;
  item->rect.color = fillColor;
  item->point.color = lineColor;
  return 1;
}

int WidgetList::setRect(int index, SKIA_Rect newRect) {
  if (is_init == 0) return 0;
  SKIA_Item* const item = itemToChange(index, "setRect");
  if (item == nullptr) return kNotFound;
  item->rect = newRect;
  return 1;
}

int WidgetList::setFontSize(int index, int pixels) {
  if (is_init == 0) return 0;
  SKIA_Item* const item = itemToChange(index, "setFontSize");
  if (item == nullptr) return kNotFound;
  item->text.size = pixels;
  return 1;
}

}  // namespace MW
