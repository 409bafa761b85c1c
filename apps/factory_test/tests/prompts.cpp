// Every built-in dialog, one after another.
#include <MW/dialog.h>

#include <array>
#include <atomic>
#include <cstdio>
#include <optional>

#include "current.h"
#include "page_test.h"
#include "verdict_bar.h"

namespace factory_test {

namespace {

constexpr int kFirstKind = 0;
constexpr int kLastKind = 39;

/// A touch, the right key or select shows the next kind, the left key the one before. The right
/// button, and back, end the look, and the verdict is asked for.
class PromptTest : public LookTest {
 public:
  PromptTest()
      : LookTest("Prompts", "Touch for the next dialog;\nthe right button ends.",
                 "Did all dialogs look right?") {}

 protected:
  void beginLook() override { showDialog(); }

  void endLook() override { dialog.reset(); }

  void updateLook() override {
    if (kind > kLastKind) {
      finishLook();
    } else if (kind != shown) {
      showDialog();
    }
  }

 private:
  void showDialog() {
    dialog.reset();
    shown = kind.load();
    MW::Dialog& made = dialog.emplace(shown.load());
    made.clickCallback = [](MW::mouse_event*) { Current<PromptTest>::get().move(1); };
    made.button2Callback = [](int) { Current<PromptTest>::get().finishLook(); };
    made.hookKeyCallback = [](int) { Current<PromptTest>::get().move(1); };
    made.keyPressCallback = [](MW::kbd_event* event) {
      Current<PromptTest>::get().followKey(event->code);
    };
    made.setActive(1);
    std::array<char, SKIA_TEXT_BYTES> words{};
    std::snprintf(words.data(), words.size(), "Dialog of kind %d", shown.load());
    page.say(words.data());
  }

  void followKey(unsigned int code) {
    if (code == MW::kKeyRight || code == MW::kKeyDown || code == MW::kKeySelect) move(1);
    if (code == MW::kKeyLeft || code == MW::kKeyUp) move(-1);
    if (code == kKeyBack) finishLook();
  }

  void move(int by) {
    const int wanted = shown + by;
    if (wanted >= kFirstKind) kind = wanted;
  }

  Current<PromptTest> current{this};
  std::atomic<int> kind = kFirstKind;   // wanted by the user
  std::atomic<int> shown = kFirstKind;  // on the screen
  std::optional<MW::Dialog> dialog;
};

const TestRegistration kRegistration({Group::Dialogs, 0, "prompts", "Built-in dialogs",
                                      makeTest<PromptTest>});

}  // namespace

}  // namespace factory_test
