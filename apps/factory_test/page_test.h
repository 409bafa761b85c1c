/// What the tests that have a page share.
#pragma once

#include <atomic>

#include "page.h"
#include "test.h"

namespace factory_test {

/// A test whose widgets stand on its page, beside the verdicts. Its kinds ask for the verdicts in
/// enter(), and end asking in leave().
class PageTest : public Test {
 public:
  Outcome verdict() const override { return page.outcome(); }
  void draw() override { page.draw(); }

 protected:
  PageTest(const char* title, const char* instructions) : page(title, instructions) {}

  Page page;
};

/// A test that is looked at first and judged afterwards, as what it shows takes the whole screen,
/// or all the keys.
class LookTest : public PageTest {
 public:
  void enter() final { beginLook(); }
  void leave() final;
  void update(uint32_t now) final;

 protected:
  /// `wanted`: what the verdict is asked with.
  LookTest(const char* title, const char* instructions, const char* wanted)
      : PageTest(title, instructions), question(wanted) {}

  /// Puts the test's own widgets on the screen, and takes them off again; also when they are off.
  virtual void beginLook() = 0;
  virtual void endLook() = 0;
  /// A round of the main loop while it is looked at.
  virtual void updateLook() {}

  /// Ends the look with the next round. Any thread.
  void finishLook() { looked = true; }

 private:
  const char* question;
  std::atomic<bool> looked = false;
};

}  // namespace factory_test
