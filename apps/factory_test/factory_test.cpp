#include "factory_test.h"

#include <MW/window.h>
#include <brimol/frame.h>

#include <utility>

#include "complain.h"
#include "layout.h"
#include "world.h"

namespace factory_test {

FactoryTest::FactoryTest(ResultBook& results, const Context& program)
    : book(results), context(program), menu(book) {
  menu.show();
}

void FactoryTest::open(std::size_t entry, uint32_t now) {
  menu.markEntry(entry);
  menu.hide();
  start(entry, now);
}

void FactoryTest::update(uint32_t now) {
  if (prompt) {
    updatePrompt();
  } else if (running) {
    updateTest(now);
  } else {
    updateMenu(now);
  }
}

void FactoryTest::updateMenu(uint32_t now) {
  menu.update(now);
  if (menu.takeLeave()) {
    prompt.emplace();
  } else if (const auto chosen = menu.takeChosen()) {
    menu.hide();
    start(*chosen, now);
  }
}

void FactoryTest::updateTest(uint32_t now) {
  running->test->update(now);
  const Outcome outcome = running->test->verdict();
  if (outcome != Outcome::Running) finish(outcome, now);
}

void FactoryTest::updatePrompt() {
  const LeavePrompt::Answer answer = prompt->answer();
  if (answer == LeavePrompt::Answer::None) return;
  ended = answer == LeavePrompt::Answer::Yes;
  prompt.reset();
  MW::isDisplayUpdate(1);
}

void FactoryTest::start(std::size_t entry, uint32_t now) {
  const TestEntry& chosen = testEntries()[entry];
  context.log.add(std::string("Test ") + chosen.id);
  running = Running{entry, chosen.make(context), presentTime(), now};
  running->test->enter();
  MW::isDisplayUpdate(1);
}

void FactoryTest::finish(Outcome outcome, uint32_t now) {
  const std::size_t entry = running->entry;
  running->test->leave();
  if (outcome == Outcome::Retry) {
    running.reset();
    start(entry, now);
    return;
  }
  if (outcome == Outcome::Pass) keep(*running, Verdict::Pass, now);
  if (outcome == Outcome::Fail) keep(*running, Verdict::Fail, now);
  // Looking at a test without a verdict keeps the one that it had.
  if (outcome == Outcome::Left && book.find(testEntries()[entry].id) == nullptr) {
    keep(*running, Verdict::None, now);
  }
  running.reset();
  menu.show();
}

void FactoryTest::keep(const Running& done, Verdict verdict, uint32_t now) {
  context.log.add(std::string("Verdict ") + verdictName(verdict));
  std::string error;
  if (!book.record({.test = testEntries()[done.entry].id,
                    .verdict = verdict,
                    .started = done.started,
                    .duration = std::chrono::milliseconds(now - done.startTicks),
                    .screen = screenSize(),
                    .values = done.test->values()},
                   error)) {
    complain(error);
  }
  menu.showVerdict(done.entry, verdict);
}

void FactoryTest::draw() {
  skia_begin_frame_c();
  if (running) {
    running->test->draw();
  } else {
    const ScreenSize screen = screenSize();
    skia_add_box_c({0, 0, screen.width, screen.height, kGroundColor});
  }
  MW::Window::show();
  skia_end_frame_c();
}

}  // namespace factory_test
