/// What the tests' screens have in common.
#pragma once

#include <MW/primitives.h>

#include <atomic>
#include <optional>
#include <string>

#include "run_progress.h"
#include "verdict_bar.h"

namespace factory_test {

/// A ground, a title, instructions, a line that tells what happens, and, once they are asked for,
/// the verdicts. Hold it before the test's own widgets: the verdicts then go after them.
class Page {
 public:
  /// Instructions begin with what to do. They are wrapped to the page.
  Page(const char* title, const char* instructions);

  /// On the main thread, before the window's widgets are drawn: all of it, or in two steps.
  void draw();
  void drawGround();
  void drawFront();
  /// How much of the title's bar is full.
  void showProgress(const RunProgress& newProgress) { progress = newProgress; }
  /// What stands below the instructions; may be empty.
  void showStanding(const std::string& words) { standing = words; }
  const std::string& shownStanding() const { return standing; }
  /// Changes the instructions.
  void instruct(const std::string& words) { hint = words; }
  void drawHint(const SKIA_Rect& area) const;
  /// Changes the line, which is not there while it is empty; the next frame shows it. Any thread.
  void say(const char* words);

  /// Puts the verdicts on the screen, on the main thread.
  VerdictBar& ask(VerdictBar::Keys keys = VerdictBar::Keys::Choose) { return bar.emplace(keys); }
  bool isAsking() const { return bar.has_value(); }
  /// Takes them off again.
  void endAsking() { bar.reset(); }
  /// What was chosen; Running while nothing was, or was not asked for.
  Outcome outcome() const { return bar ? bar->outcome() : Outcome::Running; }
  /// Nothing was chosen.
  void takeBack() {
    if (bar) bar->takeBack();
  }

 private:
  void drawWhose() const;

  RunProgress progress;
  MW::Box ground;
  MW::Box head;
  MW::Label titleText;
  std::string hint;
  std::string standing;
  MW::Textbox line;
  std::atomic<bool> hasLine = false;
  std::optional<VerdictBar> bar;
};

}  // namespace factory_test
