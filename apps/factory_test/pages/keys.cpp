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
#include <string_view>
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
  std::string_view id = {};  // in plans
};

// What can be asked for; the last two are no keys, and always are.
constexpr unsigned int kTwice = 1;
constexpr unsigned int kThreeTimes = 2;
constexpr auto kAsked = std::to_array<KeyName>({
    {MW::kKeyUp, msg("Up"), "up"},
    {MW::kKeyDown, msg("Down"), "down"},
    {MW::kKeyLeft, msg("Left"), "left"},
    {MW::kKeyRight, msg("Right"), "right"},
    {MW::kKeySelect, msg("Select"), "select"},
    {MW::kKeyHook, msg("Hook"), "hook"},
    {BRIMOL_CODE_VOLUME_UP, msg("Volume up"), "volume up"},
    {BRIMOL_CODE_VOLUME_DOWN, msg("Volume down"), "volume down"},
    {BRIMOL_CODE_POWER, msg("Power"), "power"},
    {BRIMOL_CODE_HOME, msg("Home"), "home"},
    {kTwice, msg("Twice")},
    {kThreeTimes, msg("Three times")},
});

/// The plan says which keys. All that was asked for passes by itself. The back key three times in a
/// row fails.
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

  void prepare(const PlanStep& planned) override {
    PageTest::prepare(planned);
    for (std::size_t row = 0; row < kAsked.size(); ++row) {
      if (kAsked.at(row).id.empty() || std::ranges::count(planned.keys, kAsked.at(row).id) > 0) {
        asked.push_back(row);
      }
    }
  }

  bool isComplete() const override {
    return std::ranges::all_of(asked, [this](std::size_t row) { return pressed.at(row).load(); });
  }

  Outcome verdict() const override {
    if (isComplete()) return Outcome::Pass;
    return failed ? Outcome::Fail : page.outcome();
  }

  void draw() override {
    page.draw();
    for (std::size_t place = 0; place < asked.size(); ++place) drawKey(place);
    drawValues(areas().back());
  }

  std::vector<Measure> values() const override {
    const auto seen = std::ranges::count_if(
        asked, [this](std::size_t row) { return !kAsked.at(row).id.empty() && pressed.at(row); });
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

  void drawKey(std::size_t place) const {
    const ScreenSize screen = screenSize();
    const int columns = isLandscape(screen) ? 4 : 3;
    const auto count = static_cast<int>(asked.size());
    const Grid grid = {(count + columns - 1) / columns, columns};
    const std::size_t row = asked.at(place);
    const bool isPressed = pressed.at(row);
    const std::string words = std::string(tr(kAsked.at(row).name)) + (isPressed ? "\nOK" : "");
    const Ink ink = isPressed ? kPassInk : kButtonInk;
    const SKIA_Rect cell =
        inColor(cellOf(areas().front(), gapOf(screen), grid, static_cast<int>(place)), ink.ground);
    skia_add_textbox_c(cell, captionIn(cell, words.c_str(), ink.text));
  }

  Current<KeyTest> current{this};
  std::atomic<bool> failed = false;
  std::vector<std::size_t> asked;  // rows of kAsked
  std::array<std::atomic<bool>, kAsked.size()> pressed = {};
  KeyBounce bounce;  // told on the dispatch thread
  std::optional<MW::Key> key;
};

}  // namespace

std::unique_ptr<Test> makeKeys(const Context&) { return std::make_unique<KeyTest>(); }

}  // namespace factory_test
