#include "factory_test.h"

#include <MW/window.h>
#include <brimol/frame.h>
#include <brimol/input.h>

#include <utility>

#include "complain.h"
#include "language/language.h"
#include "layout.h"
#include "plan/judge.h"
#include "questions.h"
#include "records/run.h"
#include "results/measure_text.h"
#include "run_progress.h"
#include "standing.h"
#include "world.h"

namespace factory_test {

FactoryTest::FactoryTest(ResultBook& results, const Context& program, const Task& chosen)
    : book(results),
      context(program),
      task(chosen),
      menu(book, chosen.isOwnPlan ? &chosen.plan : nullptr) {
  book.setPatience(Patience::kTry);
  if (task.isRun) {
    beginRun(GetTicks());
  } else {
    menu.show();
  }
}

void FactoryTest::open(std::size_t entry, uint32_t now) {
  menu.markEntry(entry);
  menu.hide();
  start(entry, now);
}

// A run that was aborted goes on.
void FactoryTest::beginRun(uint32_t now) {
  run.emplace(task.plan, book.results());
  isThrough = false;
  const RunProgress progress = progressOf(book);
  if (progress.done() == 0 || run->state() != PlanRun::State::Performing) return;
  notice.emplace(tr("The run goes on"), "", kPageInk, progress.allWords(), now);
}

void FactoryTest::askForUnits() {
  asksForUnits = true;
  askForUnit();
}

void FactoryTest::askForUnit() {
  menu.hide();
  unitPage.emplace();
  MW::isDisplayUpdate(1);
}

void FactoryTest::updateUnit(uint32_t now) {
  switch (unitPage->takeWish()) {
    case UnitPage::Wish::Leave: askToLeave(now); break;
    case UnitPage::Wish::Without:
      ask(Asked::Without,
          {tr("Which unit?"), tr("Test a unit without a serial number?"), tr("OK"), tr("CANCEL")});
      break;
    case UnitPage::Wish::None: break;
  }
  if (auto entered = unitPage->takeAnswer()) {
    serial = *std::move(entered);
    beginning.start(now);
    startUnit(now);
  } else if (beginning.takeTry(now)) {
    startUnit(now);
  }
}

void FactoryTest::startUnit(uint32_t now) {
  std::string error;
  RunStart next = book.run();
  next.unit = serial;
  next.started = presentTime();
  const bool isFit = serial.empty() || isSerial(serial, error);
  if (!isFit || !leaveUnit(error) || !book.startUnit(next, error)) {
    const bool waits = isFit && book.isBusy() && !beginning.isOver(now);
    if (!waits) beginning.end();
    unitPage->refuse(waits ? tr("Saving...") : error);
    return;
  }
  beginning.end();
  unitPage.reset();
  menu.showVerdicts();
  if (task.isRun) {
    beginRun(now);
  } else {
    menu.show();
  }
  MW::isDisplayUpdate(1);
}

// Before the next one begins, of which a first try may fail half way.
bool FactoryTest::leaveUnit(std::string& error) {
  if (!book.saveAgain(error)) return false;
  if (book.hasBegun()) earlierUnits = worse(earlierUnits, judgeRun(book, book.run().tests));
  return true;
}

void FactoryTest::stay() {
  ended = false;
  if (asksForUnits) askForUnit();
}

void FactoryTest::update(uint32_t now) {
  if (saving.takeTry(now)) saveAgain(now);
  if (running) running->clock.tick(now, !prompt && !running->test->awaitsVerdict());
  if (prompt) {
    updatePrompt(now);
  } else if (notice) {
    updateNotice(now);
  } else if (isLeaving) {
    if (!saving.isWaiting()) warnOfLeaving();
  } else if (unitPage) {
    updateUnit(now);
  } else if (running) {
    updateTest(now);
  } else if (run) {
    if (!saving.isWaiting()) updateRun(now);
  } else {
    updateMenu(now);
  }
}

void FactoryTest::updateMenu(uint32_t now) {
  menu.update(now);
  if (menu.takeLeave()) {
    askToLeave(now);
  } else if (const auto chosen = menu.takeChosen()) {
    menu.hide();
    start(*chosen, now);
  }
}

void FactoryTest::updateTest(uint32_t now) {
  showStanding();
  running->test->update(now);
  const Outcome outcome = running->test->verdict();
  if (outcome == Outcome::Running && isOverdue(running->step, running->clock.used())) {
    context.log.add("Time-out");
    finish(Outcome::Fail, now, Reason::TimeOut);
    return;
  }
  if (outcome == Outcome::Running) return;
  if (outcome == Outcome::Pass && !running->test->isComplete()) {
    ask(Asked::IncompletePass, incompletePass(*running->test, running->step));
  } else {
    finish(outcome, now);
  }
}

// What comes next waits until it was read.
void FactoryTest::updateNotice(uint32_t now) {
  if (!notice->isOver(now)) return;
  notice.reset();
  if (!run) menu.show();
  MW::isDisplayUpdate(1);
}

// Begins the next step, or asks what is to follow.
void FactoryTest::updateRun(uint32_t now) {
  const PlanStep& step = run->step();
  const char* const name = testEntries()[placeOf(step.test)].name;
  switch (run->state()) {
    case PlanRun::State::Performing: start(placeOf(step.test), now); break;
    case PlanRun::State::Asking:
      ask(Asked::Repeat,
          {tr(name), tr("The test has not passed. Repeat it?"), tr("REPEAT"), tr("NO")});
      break;
    default: endRun(now);
  }
}

void FactoryTest::endRun(uint32_t now) {
  if (!std::exchange(isThrough, true)) {
    std::string error;
    const bool isKept = book.finish(error);
    showKept(isKept, error, now);
    if (!isKept) return;  // comes back once that is settled
  }
  ask(Asked::RunEnd, endOfRun(book, asksForUnits ? tr("NEXT UNIT") : tr("MENU")));
}

// What is not saved is tried again first.
void FactoryTest::askToLeave(uint32_t now) {
  isLeaving = true;
  if (!book.isAllSaved()) saveAgain(now);
}

void FactoryTest::warnOfLeaving() {
  isLeaving = false;
  ask(Asked::Leave,
      {tr("Leave"),
       book.isAllSaved() ? tr("End the factory test?")
                         : tr("Not all results are saved. End the factory test, and lose them?"),
       tr("OK"), tr("CANCEL")});
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
  follow(isYes, now);
}

// What the answer to a question leads to.
void FactoryTest::follow(bool isYes, uint32_t now) {
  using Answer = PlanRun::Answer;
  switch (asked) {
    case Asked::Leave: ended = isYes; break;
    case Asked::Without:
      if (isYes) unitPage->goWithout();
      break;
    case Asked::IncompletePass:
      if (isYes) {
        finish(Outcome::Pass, now);
      } else {
        running->test->takeBack();
      }
      break;
    case Asked::SaveAgain:
      if (isYes) saveAgain(now);
      break;
    case Asked::Repeat:
      if (isYes) {
        run->answer(Answer::Again);
      } else {
        ask(Asked::GoOn, {tr("Go on?"), tr("The plan's other tests can still be done."),
                          tr("GO ON"), tr("STOP")});
      }
      break;
    case Asked::GoOn: run->answer(isYes ? Answer::GoOn : Answer::Stop); break;
    case Asked::RunEnd:
      ended = isYes;
      run.reset();
      if (asksForUnits && !ended) {
        askForUnit();
      } else {
        menu.show();
      }
      break;
  }
}

void FactoryTest::start(std::size_t entry, uint32_t now) {
  const TestEntry& chosen = testEntries()[entry];
  context.log.add(std::string("Test ") + chosen.id);
  running = Running{
      entry, stepOf(context, chosen.id), chosen.make(context), presentTime(), now, TestClock(now),
      ""};
  running->test->prepare(running->step);
  showStanding();
  running->test->showProgress(progressOf(book));
  running->test->enter();
  MW::isDisplayUpdate(1);
}

void FactoryTest::showStanding() {
  std::string words = standingOf(running->step, run ? run->attempt() : 1, running->clock.used());
  if (words == running->standing) return;
  running->test->showStanding(words);
  running->standing = std::move(words);
  MW::isDisplayUpdate(1);
}

// `failure`: why, where the outcome is a FAIL. An attempt that is begun anew is kept, too: retries
// are to be seen in the records.
void FactoryTest::finish(Outcome outcome, uint32_t now, Reason failure) {
  const std::size_t entry = running->entry;
  running->test->leave();
  if (outcome == Outcome::Retry) {
    keep(*running, Verdict::None, Reason::Retry, now);
    running.reset();
    start(entry, now);
    return;
  }
  const Verdict given = outcome == Outcome::Pass   ? Verdict::Pass
                        : outcome == Outcome::Fail ? Verdict::Fail
                                                   : Verdict::None;
  // Looking at a test without a verdict keeps the one that it had.
  const bool isNew = given != Verdict::None || book.find(running->step.test) == nullptr;
  const Verdict verdict =
      isNew ? keep(*running, given, given == Verdict::Fail ? failure : Reason::Unknown, now)
            : given;
  running.reset();
  if (run) {
    run->finish(verdict);
  } else if (!notice) {
    menu.show();
  }
}

int FactoryTest::attemptAt(const std::string& test) const {
  if (run) return run->attempt();
  const TestResult* const earlier = book.find(test);
  return earlier == nullptr ? 1 : earlier->attempt + 1;
}

Verdict FactoryTest::keep(const Running& done, Verdict given, Reason reason, uint32_t now) {
  std::vector<Measure> values = done.test->values();
  const PlanStep& step = done.step;
  const Verdict judged = judge(given, values, step);
  const Verdict verdict = task.simulation.rehearsed(judged, step.test, attemptAt(step.test));
  if (judged != given) reason = Reason::Limit;
  if (verdict != judged) reason = Reason::Rehearsal;
  for (const Measure& each : values) context.log.add(each.name + ": " + measureText(each));
  context.log.add(std::string("Verdict ") + verdictName(verdict));
  if (verdict == Verdict::Fail) notice = whyFailed(step, values, reason, now);
  std::string error;
  const bool isKept = book.record({.test = step.test,
                                   .verdict = verdict,
                                   .started = done.started,
                                   .duration = std::chrono::milliseconds(now - done.startTicks),
                                   .screen = screenSize(),
                                   .values = std::move(values),
                                   .reason = reason},
                                  error);
  showKept(isKept, error, now);
  return verdict;
}

void FactoryTest::saveAgain(uint32_t now) {
  std::string error;
  const bool isKept = book.saveAgain(error);
  showKept(isKept, error, now);
}

// Another program that writes into the database is waited for, while the screen goes on.
void FactoryTest::showKept(bool isKept, const std::string& error, uint32_t now) {
  const bool waits = !isKept && book.isBusy();
  if (waits && !saving.isWaiting()) saving.start(now);
  if (!waits || saving.isOver(now)) saving.end();
  menu.showVerdicts(saving.isWaiting() ? tr(", saving...") : tr(", not saved"));
  MW::isDisplayUpdate(1);
  if (isKept || saving.isWaiting()) return;
  complain(error);
  ask(Asked::SaveAgain, {tr("Not saved"), trError(error), tr("TRY AGAIN"), tr("LATER")});
}

void FactoryTest::draw() {
  skia_begin_frame_c();
  if (running) {
    running->test->draw();
  } else if (notice) {
    notice->draw();
  } else if (unitPage) {
    unitPage->draw();
  } else {
    const ScreenSize screen = screenSize();
    skia_add_box_c({0, 0, screen.width, screen.height, kPageInk.ground});
    if (run && saving.isWaiting()) {
      skia_add_textbox_c(
          {0, 0, screen.width, screen.height, kPageInk.ground},
          textOf(tr("Saving..."), kPageInk.text, SKIA_ALIGN_CENTRE, textSize(screen)));
    }
  }
  MW::Window::show();
  if (running && !prompt) running->test->drawOver();
  skia_end_frame_c();
  if (running) running->test->endFrame();
}

}  // namespace factory_test
