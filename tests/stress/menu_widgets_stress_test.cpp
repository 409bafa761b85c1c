// The widgets of a test menu, drawn and timed on one thread while another offers them events and a
// third one sets what they show. No drawing may show half of a change.

#include <MW/MW.h>

#include <algorithm>
#include <array>
#include <atomic>
#include <random>
#include <thread>

#include <brimol3_widget_test/drawings.h>
#include "support/widget_test.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words

constexpr auto kAreas = std::to_array<SKIA_Rect>({{10, 10, 200, 200, 0}, {1300, 700, 90, 90, 0}});
const std::array kTexts = {std::string(5, '#'), std::string(90, '%')};
const SKIA_Text kWords = textRecord(kTexts[0]);

struct Menu {
  MW::MainList list{"Menu", 1};
  MW::Button3 button{1, &kWords, &kWords, 0};
  MW::Slide slide{2, kAreas.data(), &kWords, &kWords};
  MW::Toastbox toast{kAreas.data(), &kWords, &kWords};
  MW::Progressbar bar{0, kAreas.data(), &kWords};
  MW::Key key;
  MW::Dialog dialog{24};
  MW::StaticText log{kAreas.data(), &kWords, true, true, true};
  MW::ButtonNew framed{2, kAreas.data(), &kWords};
  MW::Button8 pad{3, kAreas.data(), &kWords};
  MW::SlideE exit{0, kAreas.data(), &kWords, "unread"};
  MW::SlideMove value{kAreas.data(), 0, 0, 100, 50};
  MW::DialogSelect choice{1};
  MW::AutoCapScreen page{0};
  MW::DialogSlide answer{3};
  MW::DialogList rows{"Rows"};
  MW::DialogShell shell{"Shell", 9};
  MW::DialogNew prompt{"Prompt", 5, 7};
  MW::Ime keyboard{kAreas.data(), &kWords};
  MW::MpdWid results{"Results"};
  std::array<MW::Widget*, 20> all = {&list,   &button, &slide, &toast,  &bar,      &key,    &dialog,
                                     &log,    &framed, &pad,   &exit,   &value,    &choice, &page,
                                     &answer, &rows,   &shell, &prompt, &keyboard, &results};

  void set(int round) {
    const std::size_t number = round % 2 == 0 ? 0 : 1;
    const std::string& words = kTexts.at(number);
    for (MW::Widget* const each : all) each->setText(words.c_str());
    for (MW::Widget* const each : all) each->setRect(2, &kAreas.at(number));
    for (MW::Widget* const each : all) {
      each->setMsg(words.c_str());
      each->onHideTimer(50);
      each->onProgressbar(round % 8 * 40);
      each->setDesc(words.c_str(), words.c_str(), nullptr, 1);
      each->setbutton(words.c_str(), round % 3 == 0 ? words.c_str() : nullptr);
      each->lcdOn(round % 5);
      if (round % 16 == 0) each->hide();
      each->setActive(1);
    }
    log.setText(std::string(words.size() * words.size(), words[0]).c_str());
    log.get_ime_result(words.c_str());
    log.line_search(words.c_str());
    keyboard.keyboard_change(number == 0 ? MW::Ime::kSmall : MW::Ime::kSpecial);
    keyboard.typing_reset();
    results.cal_line(("[1]\n[2]\n[MPDIA] " + words + "]\n").c_str(), round % 99);
    dialog.setDesc(words.c_str());
    dialog.setRect(round % 40);
    choice.setTitle(words.c_str());
    choice.setText_str(0, words.c_str());
    page.setText(0, kAreas.at(number), textRecord(words));
    page.setText_str(1, words.c_str());
    value.setRect(&kAreas.at(number));
    fillDialogs(round, words.c_str());
    list.setText(round % 40, words.c_str(), static_cast<unsigned int>(words.size()));
    number == 0 ? list.move_key_down(0) : list.move_key_up(0);
  }

  void fillDialogs(int round, const char* words) {
    answer.setTitle(words);
    answer.setSlide(words, 300 + round % 90);
    answer.setRect_init(round);
    rows.initIndex();
    while (rows.addIndex(words) < round % 8) continue;
    rows.initFinish(round % 9);
    rows.setText(round % 10, words);
    if (round % 64 == 0) shell.initShell();
    shell.addShell(words);
    shell.setRect_static();
    if (round % 4 == 0) prompt.setProgress(0);
    prompt.setDescBlink(round % 2);
    prompt.setDescColor(7);
  }
};

MW::event_data randomEvent(std::minstd_rand& random) {
  const auto below = [&random](unsigned int end) { return static_cast<int>(random() % end); };
  const auto finger = static_cast<unsigned int>(below(3));
  return {below(9), {{1, finger, below(1440), below(2560), below(99), 9}}};
}

bool isWhole(const Drawing& drawn) {
  const std::string& text = drawn.text.text;
  const bool isMixed = text.find('#') < text.size() && text.find('%') < text.size();
  const bool isArea = drawn.rect.x != kAreas[1].x || drawn.rect.w <= kAreas[1].w;
  return !isMixed && isArea && text.size() < SKIA_TEXT_BYTES;
}

TEST_F(WidgetTest, MenuWidgetsAreDrawnOfferedEventsAndSetAtOnce) {
  Menu menu;
  for (int i = 0; i < 40; ++i) menu.list.addIndex(1, &kWords, 100);
  menu.list.initFinish();
  menu.keyboard.presskey_set(MW::Ime::kOnlyDigits);
  menu.key.plugCallback = [](MW::kbd_event*) {};
  std::atomic<bool> isOver = false;
  std::thread events([&] {
    for (std::minstd_rand random(7); !isOver;) {
      MW::event_data event = randomEvent(random);
      for (MW::Widget* const each : menu.all) each->onRecvEvent(&event, 0);
    }
  });
  std::thread setter([&] {
    for (int round = 0; !isOver; ++round) menu.set(round);
  });
  for (int frame = 0; frame < 10'000; ++frame) {
    platform().ticks += 7;
    MW::Window::updateTimer(platform().ticks);
    MW::Window::show(platform().ticks);
    EXPECT_TRUE(std::ranges::all_of(platform().takeDrawings(), isWhole));
  }
  isOver = true;
  events.join();
  setter.join();
}

}  // namespace
