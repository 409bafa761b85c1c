/// What the tests that have a page share.
#pragma once

#include <MW/button.h>

#include <atomic>
#include <optional>
#include <string>

#include "current.h"
#include "on_top.h"
#include "page.h"
#include "plan/plan.h"
#include "test.h"

namespace factory_test {

/// A test whose widgets stand on its page, beside the verdicts. Its kinds ask for the verdicts in
/// enter(), and end asking in leave().
class PageTest : public Test {
 public:
  Outcome verdict() const override { return page.outcome(); }
  void takeBack() override { page.takeBack(); }
  void prepare(const PlanStep& planned) override;
  void showProgress(const RunProgress& progress) override { page.showProgress(progress); }
  void showStanding(const std::string& words) override { page.showStanding(words); }
  void draw() override { page.draw(); }

 protected:
  PageTest(const char* title, const char* instructions) : page(title, instructions) {}

  /// Draws the values so far, with their limits.
  void drawValues(const SKIA_Rect& area) const;

  Page page;
  PlanStep planStep = {};  // what the plan says of the test
};

/// A test that is looked at first and judged afterwards, as what it shows takes the whole screen,
/// or all the keys.
class LookTest : public PageTest {
 public:
  void enter() final { beginLook(); }
  void leave() final;
  void update(uint32_t now) final;
  bool awaitsVerdict() const final { return page.isAsking(); }
  void draw() override;

 protected:
  using PageTest::PageTest;

  /// What to do, at the foot of what hides or darkens the page while it is looked at.
  void drawHintOverLook() const;

  /// Puts the test's own widgets on the screen, and takes them off again; also when they are off.
  virtual void beginLook() = 0;
  virtual void endLook() = 0;
  /// A round of the main loop while it is looked at.
  virtual void updateLook() {}
  /// What the verdict is asked with.
  virtual std::string question() const = 0;
  /// Draws it, with the values, once the verdict is asked for.
  void drawQuestion() const;

  /// Ends the look with the next round. Any thread.
  void finishLook() { looked = true; }
  /// The same for the select and the back key, where keys do nothing else.
  void finishLookOn(unsigned int code);

 private:
  std::atomic<bool> looked = false;
  std::string asked;
};

/// A look at one thing after another. The right, down and select keys show the next one, the left
/// and up keys the one before, the back key ends the look; so does the step after the last one.
/// Fingers stay at the last one, and end the look by holding a bar at the screen's foot.
class StepTest : public LookTest {
 public:
  bool isComplete() const override { return furthest == lastStep(); }
  void drawOver() override;

 protected:
  using LookTest::LookTest;

  void beginLook() final;
  void updateLook() final;
  void endLook() final;

  virtual int lastStep() const = 0;
  /// Puts what belongs to a step, from 0, in the place of what is there.
  virtual void showStep(int step) = 0;
  virtual void endSteps() = 0;

  /// Moves with the next round. Any thread.
  void move(int by);
  void followKey(unsigned int code);
  /// What a touch does: the next one, if there is one.
  void moveOn();

 private:
  Current<StepTest> current{this};
  std::optional<OnTop<MW::Button>> end;
  std::atomic<int> furthest = 0;
  std::atomic<int> shown = 0;   // on the screen
  std::atomic<int> wanted = 0;  // by the user
};

}  // namespace factory_test
