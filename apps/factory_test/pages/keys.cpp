// Every key once, and one of them twice and three times in a row.
#include <MW/key.h>
#include <MW/primitives.h>
#include <MW/window.h>
#include <brimol/input.h>

#include <algorithm>
#include <array>
#include <atomic>
#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "current.h"
#include "key_bounce.h"
#include "language/language.h"
#include "layout.h"
#include "page_test.h"
#include "pages/table.h"
#include "plan/catalog.h"
#include "verdict_bar.h"

namespace factory_test {

namespace {

struct KeyName {
  unsigned int code;
  const char* name;
};

// What is asked for; the last two are no keys.
constexpr unsigned int kTwice = 1;
constexpr unsigned int kThreeTimes = 2;
constexpr auto kAsked = std::to_array<KeyName>({
    {MW::kKeyUp, msg("Up")},
    {MW::kKeyDown, msg("Down")},
    {MW::kKeyLeft, msg("Left")},
    {MW::kKeyRight, msg("Right")},
    {MW::kKeySelect, msg("Select")},
    {MW::kKeyHook, msg("Hook")},
    {BRIMOL_CODE_VOLUME_UP, msg("Volume up")},
    {BRIMOL_CODE_VOLUME_DOWN, msg("Volume down")},
    {BRIMOL_CODE_POWER, msg("Power")},
    {BRIMOL_CODE_HOME, msg("Home")},
    {kTwice, msg("Twice")},
    {kThreeTimes, msg("Three times")},
});
constexpr auto kKeys = static_cast<std::ptrdiff_t>(kAsked.size()) - 2;

/// All that was asked for passes by itself. The back key three times in a row fails.
class KeyTest : public PageTest {
 public:
  KeyTest()
      : PageTest(
            tr("Keys"),
            tr("Press every key once, one twice and one\nthree times. Back three times: FAIL.")) {}

  void enter() override {
    page.ask(VerdictBar::Keys::Free);
    key.emplace();
    key->keyPressCallback = [](MW::kbd_event* event) {
      Current<KeyTest>::get().press(event->code);
    };
    key->keyReleaseCallback = [](MW::kbd_event* event) {
      Current<KeyTest>::get().bounce.release(event->code, GetTicks());
    };
    key->doubleKeyCallback = [](MW::kbd_event*) { Current<KeyTest>::get().mark(kTwice); };
    key->tripleKeyCallback = [](MW::kbd_event* event) {
      if (event->code == kKeyBack) Current<KeyTest>::get().failed = true;
      Current<KeyTest>::get().mark(kThreeTimes);
    };
  }

  void leave() override {
    key.reset();
    page.endAsking();
  }

  bool isComplete() const override {
    return std::ranges::all_of(pressed, [](const auto& each) { return each.load(); });
  }

  Outcome verdict() const override {
    if (isComplete()) return Outcome::Pass;
    return failed ? Outcome::Fail : page.outcome();
  }

  void draw() override {
    page.draw();
    for (std::size_t i = 0; i < kAsked.size(); ++i) drawKey(static_cast<int>(i), pressed.at(i));
    drawValues(areas().back());
  }

  std::vector<Measure> values() const override {
    const auto seen = std::count(pressed.begin(), pressed.begin() + kKeys, true);
    return measured("keys",
                    {{"keys seen", static_cast<double>(seen)},
                     {"bounces", bounce.count()},
                     {"longest bounce", bounce.count() > 0 ? bounce.longestMs() : kNotMeasured}});
  }

 private:
  void press(unsigned int code) {
    bounce.press(code, GetTicks());
    mark(code);
    MW::isDisplayUpdate(1);
  }

  void mark(unsigned int code) {
    const auto* const row = std::ranges::find(kAsked, code, &KeyName::code);
    if (row == kAsked.end()) return;
    pressed.at(static_cast<std::size_t>(row - kAsked.begin())) = true;
    page.say(tr(row->name));
  }

  // For the keys and the values.
  static std::array<SKIA_Rect, 2> areas() {
    return rowsOf<2>(contentArea(), gapOf(screenSize()), {4, 1});
  }

  static void drawKey(int index, bool isPressed) {
    const ScreenSize screen = screenSize();
    const Grid grid = isLandscape(screen) ? Grid{3, 4} : Grid{4, 3};
    const std::string words = std::string(tr(kAsked.at(static_cast<std::size_t>(index)).name)) +
                              (isPressed ? "\nOK" : "");
    const Ink ink = isPressed ? kPassInk : kButtonInk;
    const SKIA_Rect cell = inColor(cellOf(areas().front(), gapOf(screen), grid, index), ink.ground);
    skia_add_textbox_c(cell, captionIn(cell, words.c_str(), ink.text));
  }

  Current<KeyTest> current{this};
  std::atomic<bool> failed = false;
  std::array<std::atomic<bool>, kAsked.size()> pressed = {};
  KeyBounce bounce;  // told on the dispatch thread
  std::optional<MW::Key> key;
};

}  // namespace

std::unique_ptr<Test> makeKeys(const Context&) { return std::make_unique<KeyTest>(); }

}  // namespace factory_test
