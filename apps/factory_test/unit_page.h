/// The question before a run: which unit is tested.
#pragma once

#include <MW/ime.h>
#include <MW/key.h>

#include <atomic>
#include <mutex>
#include <optional>
#include <string>

#include "button_row.h"
#include "current.h"
#include "language/language.h"
#include "page.h"

namespace factory_test {

/// A keyboard for the serial number, and a button to go on without one, as the back key does. On
/// the screen from construction to destruction; there is one at a time. Used on the main thread.
class UnitPage {
 public:
  UnitPage();

  void draw() { page.draw(); }
  /// What was entered since the last call; an empty text: the unit has no number. Nothing: not yet.
  std::optional<std::string> takeAnswer();
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

  void answer(std::string serial);
  void follow(Keyboard& from);

  Current<UnitPage> current{this};
  Page page;
  std::mutex lock;
  std::optional<std::string> entered;  // guarded by lock
  std::optional<Keyboard> keyboard;
  std::optional<ButtonRow> without;
  std::optional<MW::Key> key;
};

}  // namespace factory_test
