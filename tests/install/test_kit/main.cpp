// Tests a screen without a test framework: test_kit GOLDEN_FOLDER
#include <MW/MW.h>
#include <brimol/frame.h>
#include <brimol3_widget_test/golden.h>
#include <brimol3_widget_test/screen.h>

#include <atomic>
#include <cstdlib>
#include <iostream>
#include <optional>
#include <string>

namespace {

using brimol::test::Failure;
using brimol::test::Goldens;
using brimol::test::Screen;

SKIA_Text textOf(const std::string& words) {
  return brimol::test::textRecord(words, MW::kColorBlack, SKIA_ALIGN_CENTRE, 40);
}

// A counter: a tap counts, a key starts anew, and a second after a tap a word says so.
struct Counter {
  static inline std::atomic<int> count;
  static inline std::atomic<unsigned int> tapped;

  Counter() {
    count = 0;
    tapped = 0;
    button.clickCallback = [](int) {
      ++count;
      tapped = GetTicks();
    };
    button.setActive(1);
    keys.keyPressCallback = [](MW::kbd_event*) { count = 0; };
    keys.setActive(1);
    MW::isDisplayUpdate(1);
  }

  void update() {
    if (std::exchange(shown, count) == shown && !isRested()) return;
    button.setText(("Taps: " + std::to_string(shown)).c_str());
    MW::isDisplayUpdate(1);
  }
  static bool isRested() { return tapped != 0 && GetTicks() - tapped >= 1000; }

  static void draw() {
    skia_begin_frame_c();
    MW::Window::show();
    if (isRested()) skia_add_label_c({0, 200, 400, 50, 0}, textOf("Rested"));
    skia_end_frame_c();
  }

  SKIA_Rect area = {50, 50, 300, 100, 0xFFB8C4D6};
  SKIA_Text caption = textOf("Taps: 0");
  MW::Button button{&area, &caption};
  MW::Key keys;
  int shown = 0;
};

// The message of the failure; empty: there was none.
template <typename Check>
std::string failureOf(Check check) {
  try {
    check();
  } catch (const Failure& failure) {
    return failure.what();
  }
  return {};
}

void expect(bool holds, const std::string& what,
            const brimol::test::Here& here = brimol::test::Here::now()) {
  if (!holds) throw Failure(here, what);
}

bool has(const std::string& text, const std::string& part) {
  return text.find(part) != std::string::npos;
}

// Made anew the goldens fit; once the screen has changed they say what differs.
void testGoldens(Screen& screen, const std::string& folder) {
  Goldens goldens(folder, folder + "/results");
  setenv("BRIMOL_RENEW_GOLDENS", "1", 1);
  goldens.expect("counter", screen);
  unsetenv("BRIMOL_RENEW_GOLDENS");
  expect(goldens.expect("counter", screen) == brimol::test::Compared::Same, "another renderer");

  screen.tap("Taps: *");
  const std::string items = failureOf([&] { goldens.expectItems("counter", screen.frame()); });
  expect(has(items, "item 1 of ") && has(items, "Taps: 1") && has(items, "Taps: 2"), items);
  const std::string picture =
      failureOf([&] { goldens.expectPicture("counter", screen.picture()); });
  expect(has(picture, "main.cpp:") && has(picture, " pixels differ"), picture);
  const auto marks = brimol::test::readPicture(folder + "/results/counter.difference.png");
  expect(marks.size == screen.size(), "the picture of the difference is missing");
  const std::string missing = failureOf([&] { goldens.expectItems("none", screen.frame()); });
  expect(has(missing, "no golden") && has(missing, "BRIMOL_RENEW_GOLDENS"), missing);
}

void testCounter(const std::string& folder) {
  std::optional<Counter> counter;
  Screen screen({400, 300}, {[&] { counter->update(); }, [] { Counter::draw(); }});
  counter.emplace();
  screen.expectLog("startEvent->EventInit");

  screen.tap("Taps: 0");
  screen.advance(10);
  screen.expectText("Taps: 1");
  screen.expectTextColor("Taps: 1", MW::kColorBlack);
  screen.expectBoxColor("Taps: *", 0xFFB8C4D6);
  screen.expectPixel({60, 60}, 0xB8C4D6);

  screen.advance(900);
  screen.expectNoText("Rested");
  screen.advance(100);
  screen.expectText("Rested");
  const std::string failure = failureOf([&] { screen.tap("Start"); });
  expect(has(failure, "no item shows \"Start\"") && has(failure, "\"Taps: 1\""), failure);
  testGoldens(screen, folder);

  screen.key(MW::kKeySelect);
  screen.advance(10);
  screen.expectText("Taps: 0");
  counter.reset();
}

}  // namespace

int main(int count, char** arguments) {
  if (count != 2) return EXIT_FAILURE;
  try {
    testCounter(arguments[1]);
  } catch (const std::exception& failure) {
    std::cerr << failure.what() << '\n';
    return EXIT_FAILURE;
  }
  return EXIT_SUCCESS;
}
