// The widgets of a test menu, drawn and timed on one thread while another offers them events and a
// third one sets what they show. No drawing may show half of a change.

#include <MW/button3.h>
#include <MW/dialog.h>
#include <MW/key.h>
#include <MW/main_list.h>
#include <MW/screen.h>
#include <MW/slide.h>
#include <MW/timed.h>
#include <MW/window.h>

#include <algorithm>
#include <array>
#include <atomic>
#include <random>
#include <thread>
#include <tuple>

#include "support/drawings.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MW::Window;

constexpr int kRounds = 50'000;
constexpr uint32_t kMark = 0xFF0000AA;  // of the areas that change
constexpr auto kAreas =
    std::to_array<SKIA_Rect>({{10, 10, 200, 200, kMark}, {700, 700, 500, 500, kMark}});
// The texts that change are rows of one of these.
constexpr char kShort = '#';
constexpr char kLong = '%';
const std::array<std::string, 2> kTexts = {std::string(5, kShort), std::string(90, kLong)};

std::atomic<int> called;

struct Menu {
  SKIA_Text words = textRecord(kTexts[0]);
  MW::MainList list{kTexts[0].c_str(), 1};
  MW::Button3 button{1, &words, &words, 0};
  MW::Slide slide{2, kAreas.data(), &words, &words};
  MW::Toastbox toast{kAreas.data(), &words, &words};
  MW::Progressbar bar{0, kAreas.data(), &words};
  MW::Screen screen;
  MW::Key key;
  MW::Dialog dialog{24};
  MW::FullScreen fill{0};
  std::array<MW::Widget*, 9> all = {&list,   &button, &slide,  &toast, &bar,
                                    &screen, &key,    &dialog, &fill};

  Menu() {
    for (int i = 0; i < 40; ++i) list.addIndex(1, &words, 100);
    list.initFinish();
    button.clickCallback = slide.rightCallback = dialog.button1Callback = [](int) { ++called; };
    key.plugCallback = key.tripleKeyCallback = [](MW::kbd_event*) { ++called; };
    screen.doubleClickCallback = [](int) { ++called; };
    list.scrollCallback = [](MW::mouse_event*, MW::MainList*) { ++called; };
    for (MW::Widget* const each : all) each->setActive(1);
  }

  void set(int round) {
    const auto number = static_cast<std::size_t>(round) % 2;
    const char* const shown = kTexts.at(number).c_str();
    const SKIA_Rect& area = kAreas.at(number);
    button.setText(shown);
    button.setRect(round % 12, nullptr);
    toast.setText(shown);
    toast.setMsg(shown);
    toast.setRect(2, &area);
    toast.onHideTimer(50);
    bar.setRect(0, &area);
    bar.onProgressbar(round % 8 == 0 ? 0 : 300);
    dialog.setTitle(shown);
    dialog.setDesc(shown);
    dialog.setRect(round % 40);
    round % 16 == 0 ? dialog.hide() : (dialog.setActive(1), 1);
    fill.setRect(round % 5);
    fill.lcdOn(round % 2);
    slide.setRect(round % 4, &area);
    round % 64 < 32 ? slide.Lock() : slide.unLock();
    list.setText(round % 40, shown, static_cast<unsigned int>(kTexts.at(number).size()));
    list.setTextOption(round % 8, shown, static_cast<int>(kTexts.at(number).size()));
    round % 2 == 0 ? list.move_key_down(0) : list.move_key_up(0);
    list.lcdOn(round % 3);
    if (round % 32 == 0) button.onShowTimer(20);
  }
};

MW::event_data randomEvent(std::minstd_rand& random) {
  const auto below = [&random](unsigned int end) { return static_cast<int>(random() % end); };
  MW::event_data event = {.type = below(9), .mouse = {}};
  if (event.type >= MW::kEventKeyPress) {
    event.key = {1, static_cast<uint32_t>(below(20))};
  } else {
    event.mouse = {1,
                   static_cast<uint32_t>(below(2)),
                   below(1440),
                   below(2560),
                   below(400) - 200,
                   below(400) - 200};
  }
  return event;
}

bool isWhole(const Drawing& drawn) {
  const std::string& text = drawn.text.text;
  const char first = text.empty() ? '\0' : text.front();
  const bool isMixed =
      (first == kShort || first == kLong) &&
      std::ranges::any_of(text, [first](char each) { return each != first && each != '\0'; });
  const SKIA_Rect& area = drawn.rect;
  // The bar in an area is twice as high, but for its margin.
  const bool isArea = area.color != kMark || (area.x <= 12) == (area.h <= 400);
  return !isMixed && isArea && text != "length outside the record";
}

TEST_F(WidgetTest, MenuWidgetsAreDrawnOfferedEventsAndSetAtOnce) {
  called = 0;
  Menu menu;
  std::atomic<bool> isOver = false;
  std::thread events([&] {
    std::minstd_rand random(7);
    while (!isOver) {
      MW::event_data event = randomEvent(random);
      for (MW::Widget* const each : menu.all) each->onRecvEvent(&event, 0);
    }
  });
  std::thread setter([&] {
    for (int round = 0; round < kRounds; ++round) menu.set(round);
    isOver = true;
  });
  long broken = 0;
  while (!isOver) {
    platform().ticks += 7;
    Window::updateTimer(platform().ticks);
    Window::show(platform().ticks);
    const std::vector<Drawing> drawn = platform().takeDrawings();
    broken += std::ranges::count_if(drawn, [](const Drawing& each) { return !isWhole(each); });
  }
  events.join();
  setter.join();
  EXPECT_EQ(broken, 0);
  EXPECT_GT(called, 0);
}

}  // namespace
