#include "first_screen.h"

#include <MW/widget_list.h>
#include <MW/window.h>
#include <brimol/frame.h>

#include <cstdio>
#include <cstring>

namespace factory_test {

namespace {

using MW::Button;
using MW::Callback;
using MW::Widget;

constexpr int kLateMs = 1000;
constexpr uint32_t kBoxColor = 0xFF3FA66B;

// Callbacks are plain functions: this is how they find the screen. It is set while no button is
// active.
FirstScreen* onScreen = nullptr;

SKIA_Text textOf(const char* words, uint32_t color, int align, int size) {
  SKIA_Text text = {};
  std::snprintf(text.text, sizeof text.text, "%s", words);
  text.string_len = static_cast<int32_t>(std::strlen(text.text));
  text.color = color;
  text.align = align;
  text.size = size;
  return text;
}

MW::Textbox statusLine(const Layout& layout) {
  const SKIA_Text text =
      textOf("Use a button", MW::kColorBlack, SKIA_ALIGN_CENTRE, layout.textSize);
  return {&layout.status, &text};
}

}  // namespace

struct FirstScreen::ButtonRow {
  const char* caption;
  Callback Widget::*callback;
  void (*handler)(int);
};

// In the order of Entry.
const std::array<FirstScreen::ButtonRow, kButtonCount> FirstScreen::kButtons = {{
    {"Press", &Widget::pressCallback, [](int) { onScreen->report(kPress); }},
    {"Click", &Widget::clickCallback, [](int) { onScreen->report(kClick); }},
    {"Long press", &Widget::longPressCallback, [](int) { onScreen->report(kLongPress); }},
    {"Double click", &Widget::doubleClickCallback, [](int) { onScreen->report(kDoubleClick); }},
    {"Delayed show", &Widget::clickCallback, [](int) { onScreen->showLate(); }},
    {"Hide me", &Widget::clickCallback, [](int) { onScreen->hideLate(); }},
}};

FirstScreen::FirstScreen(ScreenSize screen, const char* picture)
    : status(statusLine(layOut(screen))) {
  onScreen = this;
  const Layout layout = layOut(screen);
  placePrimitives(layout, picture);
  placeButtons(layout);
}

FirstScreen::~FirstScreen() { MW::WidgetList::destroy(); }

// What never changes goes to the display-item table, which keeps copies.
void FirstScreen::placePrimitives(const Layout& layout, const char* picture) {
  const SKIA_Text title =
      textOf("Factory test", MW::kColorWhite, SKIA_ALIGN_CENTRE, layout.titleSize);
  const SKIA_Text caption =
      textOf("Label,\npicture,\nbox, line", MW::kColorWhite, SKIA_ALIGN_LEFT, layout.textSize);
  const SKIA_Text name = textOf(picture, 0, 0, 0);
  SKIA_Rect box = layout.box;
  box.color = kBoxColor;
  MW::WidgetList::init();
  MW::Box(&layout.ground).add_MWWList();
  MW::Textbox(&layout.title, &title).add_MWWList();
  MW::Label(&layout.label, &caption).add_MWWList();
  MW::Image(&layout.picture, &name).add_MWWList();
  MW::Box(&box).add_MWWList();
  MW::Line(&layout.line).add_MWWList();
}

void FirstScreen::placeButtons(const Layout& layout) {
  for (std::size_t i = 0; i < kButtonCount; ++i) {
    const ButtonRow& row = kButtons.at(i);
    const SKIA_Text caption =
        textOf(row.caption, MW::kColorBlack, SKIA_ALIGN_CENTRE, layout.textSize);
    Button& button = buttons.at(i).emplace(&layout.buttons.at(i), &caption);
    button.*row.callback = row.handler;
    if (i != kLate) button.setActive(1);
  }
  const SKIA_Text caption = textOf("End", MW::kColorBlack, SKIA_ALIGN_CENTRE, layout.textSize);
  endButton.emplace(&layout.end, &caption);
  endButton->clickCallback = [](int) { onScreen->ended = true; };
  endButton->setActive(1);
}

void FirstScreen::draw() {
  skia_begin_frame_c();
  MW::WidgetList::show();
  status.show();
  MW::Window::show();
  skia_end_frame_c();
}

void FirstScreen::report(Entry entry) {
  std::array<char, SKIA_TEXT_BYTES> line{};
  std::snprintf(line.data(), line.size(), "%s: %u", kButtons.at(entry).caption, ++counts.at(entry));
  status.setText(line.data());
}

void FirstScreen::showLate() {
  report(kDelayedShow);
  buttons.at(kLate)->onShowTimer(kLateMs);
}

void FirstScreen::hideLate() {
  report(kLate);
  buttons.at(kLate)->hide();
}

}  // namespace factory_test
