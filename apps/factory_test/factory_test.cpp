#include "factory_test.h"

#include <MW/window.h>
#include <brimol/frame.h>

#include <utility>

#include "complain.h"
#include "layout.h"
#include "run_progress.h"
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
    updatePrompt(now);
  } else if (running) {
    updateTest(now);
  } else {
    updateMenu(now);
  }
}

void FactoryTest::updateMenu(uint32_t now) {
  menu.update(now);
  if (menu.takeLeave()) {
    ask(Asked::Leave, {"Leave", "End the factory test?", "OK", "CANCEL"});
  } else if (const auto chosen = menu.takeChosen()) {
    menu.hide();
    start(*chosen, now);
  }
}

void FactoryTest::updateTest(uint32_t now) {
  running->test->update(now);
  const Outcome outcome = running->test->verdict();
  if (outcome == Outcome::Running) return;
  if (outcome == Outcome::Pass && !running->test->isComplete()) {
    ask(Asked::IncompletePass,
        {"Not all was tested", "The test has not shown or asked all that it must. Pass anyway?",
         "PASS", "GO ON"});
    return;
  }
  finish(outcome, now);
}

void FactoryTest::ask(Asked what, const Question& question) {
  asked = what;
  prompt.emplace(question);
}

void FactoryTest::updatePrompt(uint32_t now) {
  const Prompt::Answer answer = prompt->answer();
  if (answer == Prompt::Answer::None) return;
  const bool isYes = answer == Prompt::Answer::Yes;
  prompt.reset();
  MW::isDisplayUpdate(1);
  switch (asked) {
    case Asked::Leave: ended = isYes; break;
    case Asked::IncompletePass:
      if (isYes) {
        finish(Outcome::Pass, now);
      } else {
        running->test->takeBack();
      }
      break;
    case Asked::SaveAgain:
      if (std::string error; isYes) showKept(book.saveAgain(error), error);
  }
}

void FactoryTest::start(std::size_t entry, uint32_t now) {
  const TestEntry& chosen = testEntries()[entry];
  context.log.add(std::string("Test ") + chosen.id);
  running = Running{entry, chosen.make(context), presentTime(), now};
  running->test->showProgress(progressOf(book));
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
  const bool isKept = book.record({.test = testEntries()[done.entry].id,
                                   .verdict = verdict,
                                   .started = done.started,
                                   .duration = std::chrono::milliseconds(now - done.startTicks),
                                   .screen = screenSize(),
                                   .values = done.test->values()},
                                  error);
  showKept(isKept, error);
}

void FactoryTest::showKept(bool isKept, const std::string& error) {
  menu.showVerdicts();
  if (isKept) return;
  complain(error);
  ask(Asked::SaveAgain, {"Not saved", error, "TRY AGAIN", "LATER"});
}

void FactoryTest::draw() {
  skia_begin_frame_c();
  if (running) {
    running->test->draw();
  } else {
    const ScreenSize screen = screenSize();
    skia_add_box_c({0, 0, screen.width, screen.height, kPageInk.ground});
  }
  MW::Window::show();
  if (running && !prompt) running->test->drawOver();
  skia_end_frame_c();
}

}  // namespace factory_test
