/// The question before a run: which unit is tested.
#pragma once

#include <MW/ime.h>
#include <MW/key.h>

#include <atomic>
#include <mutex>
#include <optional>
#include <string>

#include "current.h"
#include "guarded_buttons.h"
#include "language/language.h"
#include "page.h"

namespace factory_test {

/// A keyboard for the serial number, a button to go on without one, and one to leave. They do
/// nothing at first (PressGuard). The select key asks for the first of them, the back key and
/// "fold" for the other. On the screen from construction to destruction; there is one at a time.
/// Used on the main thread.
class UnitPage {
 public:
  UnitPage();

  void draw() { page.draw(); }
  /// What was entered since the last call; an empty text: the unit has no number. Nothing: not yet.
  std::optional<std::string> takeAnswer();
  /// What the keys asked for since the last call, or the button to leave.
  enum class Wish { None, Without, Leave };
  Wish takeWish() { return wish.exchange(Wish::None); }
  /// The unit has no number.
  void goWithout() { answer(""); }
  /// Why another one is needed.
  void refuse(const std::string& why) { page.say(trError(why).c_str()); }

 private:
  /// Tells of the enter key, whatever was typed.
  class Keyboard : public MW::Ime {
   public:
    using Ime::Ime;
    ~Keyboard() override { leaveLayers(); }
    bool onRecvEvent(MW::event_data* event, unsigned int unused) override;
    /// Whether enter was pressed last.
    bool isEntered() const { return hasEnter; }

   private:
    bool hasEnter = false;  // dispatch thread
  };

  static constexpr std::size_t kButtons = 2;
  using Buttons = GuardedButtons<UnitPage, MW::Button, kButtons>;
  friend Buttons;

  void choose(std::size_t index);
  void followKey(unsigned int code);
  void answer(std::string serial);
  void follow(Keyboard& from);

  Current<UnitPage> current{this};
  Page page;
  std::mutex lock;
  std::optional<std::string> entered;  // guarded by lock
  std::optional<Keyboard> keyboard;
  std::atomic<Wish> wish = Wish::None;
  Buttons buttons;
  std::optional<MW::Key> key;
};

}  // namespace factory_test
