// The display in one colour after another, to look for dead pixels and stains.
#include <MW/key.h>
#include <MW/screen.h>
#include <MW/window.h>

#include <atomic>
#include <optional>

#include "current.h"
#include "on_top.h"
#include "page.h"
#include "test.h"
#include "verdict_bar.h"

namespace factory_test {

namespace {

constexpr int kColours = 5;  // of MW::FullScreen

/// A tap, or the right key, shows the next colour. A double tap, or the select key, ends the look,
/// and the verdict is asked for.
class ColourTest : public Test {
 public:
  void enter() override {
    colour.emplace(0).setActive(1);
    touch.emplace();
    touch->clickCallback = [](MW::mouse_event*) { Current<ColourTest>::get().next(); };
    touch->doubleClickCallback = [](int) { Current<ColourTest>::get().looked = true; };
    touch->setActive(1);
    key.emplace();
    key->keyPressCallback = [](MW::kbd_event* event) {
      Current<ColourTest>::get().followKey(event->code);
    };
  }

  void leave() override {
    page.endAsking();
    endLook();
  }

  Outcome verdict() const override { return page.outcome(); }

  void draw() override { page.draw(); }

  void update(uint32_t) override {
    if (!looked || page.isAsking()) return;
    endLook();
    page.ask();
    page.say("Was every colour even?");
  }

 private:
  void next() { colour->setRect(++shown % kColours); }

  void followKey(unsigned int code) {
    if (code == MW::kKeyRight) next();
    if (code == MW::kKeySelect || code == kKeyBack) looked = true;
    MW::isDisplayUpdate(1);
  }

  void endLook() {
    key.reset();
    touch.reset();
    colour.reset();
  }

  Current<ColourTest> current{this};
  std::atomic<bool> looked = false;
  int shown = 0;  // dispatch thread
  Page page{"Colours", "Look for pixels and places that differ."};
  std::optional<MW::FullScreen> colour;
  std::optional<OnTop<MW::Screen>> touch;
  std::optional<OnTop<MW::Key>> key;
};

const TestRegistration kRegistration({Group::Display, 0, "colours", "Display colours",
                                      makeTest<ColourTest>});

}  // namespace

}  // namespace factory_test
