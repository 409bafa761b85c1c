/// What a test of the menu is.
#pragma once

#include <cstdint>
#include <string>
#include <vector>

#include "results/test_result.h"

namespace factory_test {

struct PlanStep;
struct RunProgress;

/// What became of a test so far.
enum class Outcome { Running, Pass, Fail, Retry, Left };

/// One test, one file in pages/. All operations are called on the main thread; what callbacks,
/// which come on the dispatch thread, leave behind is atomic or stands in widgets.
class Test {
 public:
  virtual ~Test() = default;

  /// How far the run had come before; asked for by a page that shows it.
  virtual void showProgress(const RunProgress&) {}
  /// What the plan says of the test, such as words for the operator in the place of the page's own;
  /// before enter().
  virtual void prepare(const PlanStep& step) { static_cast<void>(step); }
  /// How the attempt stands in the plan, such as its number and the time left; may be empty. Comes
  /// before enter(), and with each change.
  virtual void showStanding(const std::string& words) { static_cast<void>(words); }
  /// Puts the test's widgets on the screen.
  virtual void enter() = 0;
  /// Takes them off again. No callback runs any more when it returns.
  virtual void leave() = 0;
  /// Anything but Running ends the test, unless it is taken back.
  virtual Outcome verdict() const = 0;
  /// A PASS was not taken: the test goes on.
  virtual void takeBack() {}

  /// Whether it has ended but for the operator's verdict.
  virtual bool awaitsVerdict() const { return false; }

  /// What it measured so far.
  virtual std::vector<Measure> values() const { return {}; }
  /// Whether it has shown and asked all that it must.
  virtual bool isComplete() const { return true; }

  /// Draws what stands under the window's widgets.
  virtual void draw() = 0;
  /// Draws what stands over them.
  virtual void drawOver() {}
  /// The frame is on its way to the screen.
  virtual void endFrame() {}
  /// Comes in every round of the main loop, at GetTicks() milliseconds.
  virtual void update(uint32_t now) { static_cast<void>(now); }
};

}  // namespace factory_test
