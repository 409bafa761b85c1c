/// What goes on: the menu, the test that runs, the question before the end.
#pragma once

#include <chrono>
#include <cstdint>
#include <memory>
#include <optional>
#include <string>

#include "exit_code.h"
#include "menu.h"
#include "notice.h"
#include "pages/table.h"
#include "patience.h"
#include "plan/plan_run.h"
#include "prompt.h"
#include "results/results.h"
#include "task.h"
#include "test_clock.h"
#include "unit_page.h"

namespace factory_test {

/// Used on the main thread.
class FactoryTest {
 public:
  /// Keeps verdicts in `results`, which outlives it, as do the context and the task. A task that is
  /// a run begins with the plan's first step.
  FactoryTest(ResultBook& results, const Context& program, const Task& chosen);

  /// Asks for the unit's serial number first, and again for the next unit after a plan's run.
  void askForUnits();
  /// What became of the units before the present one.
  ExitCode earlier() const { return earlierUnits; }
  /// Shows a page of testEntries() in the place of the menu.
  void open(std::size_t entry, uint32_t now);
  /// One round of the main loop, at GetTicks() milliseconds.
  void update(uint32_t now);
  /// Draws one frame.
  void draw();
  bool isEnded() const { return ended; }
  /// Goes on after the end: with the next unit, or with the menu.
  void stay();

 private:
  struct Running {
    std::size_t entry;
    PlanStep step;
    std::unique_ptr<Test> test;
    std::chrono::sys_seconds started;
    uint32_t startTicks;
    TestClock clock;
    std::string standing;  // as it is shown
  };

  enum class Asked { Leave, Without, IncompletePass, SaveAgain, Repeat, GoOn, RunEnd };

  void beginRun(uint32_t now);
  void askForUnit();
  void updateUnit(uint32_t now);
  void startUnit(uint32_t now);
  bool leaveUnit(std::string& error);
  void askToLeave(uint32_t now);
  void warnOfLeaving();
  void updateMenu(uint32_t now);
  void updateTest(uint32_t now);
  void updateNotice(uint32_t now);
  void showStanding();
  void updateRun(uint32_t now);
  void updatePrompt(uint32_t now);
  void follow(bool isYes, uint32_t now);
  void ask(Asked what, const Question& question);
  void start(std::size_t entry, uint32_t now);
  void finish(Outcome outcome, uint32_t now, Reason failure = Reason::Operator);
  int attemptAt(const std::string& test) const;
  Verdict keep(const Running& done, Verdict given, Reason reason, uint32_t now);
  void endRun(uint32_t now);
  void saveAgain(uint32_t now);
  void showKept(bool isKept, const std::string& error, uint32_t now);

  ResultBook& book;
  const Context& context;
  const Task& task;
  bool ended = false;
  bool asksForUnits = false;
  Menu menu;
  std::optional<UnitPage> unitPage;
  std::string serial;      // that was entered last
  Patience beginning;      // of its run
  Patience saving;         // of what is not saved yet
  bool isLeaving = false;  // what is not saved is tried again before the question
  ExitCode earlierUnits = ExitCode::Passed;
  std::optional<Running> running;
  std::optional<PlanRun> run;  // while a plan is performed without the menu
  bool isThrough = false;      // the book was told that it is
  Asked asked = Asked::Leave;
  std::optional<Prompt> prompt;
  std::optional<Notice> notice;
};

}  // namespace factory_test
