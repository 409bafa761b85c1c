/// The main menu: all tests by groups, with their verdicts, under figures of the machine.
#pragma once

#include <MW/main_list.h>

#include <atomic>
#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "current.h"
#include "look.h"
#include "menu_head.h"
#include "plan/plan.h"
#include "results/results.h"

namespace factory_test {

/// Stands in the window from construction to destruction; there is one. Used on the main thread;
/// its list's callbacks come on the dispatch thread. A click, or the select key, chooses an entry;
/// up and down move the mark; the back key, and the last row, ask to leave.
class Menu {
 public:
  /// Shows the verdicts of `results`, which outlives it. The tests of `ownPlan` come first, in its
  /// order, and the groups hold the others; without one (null) the groups hold all.
  Menu(const ResultBook& results, const Plan* ownPlan);

  void show();
  void hide();
  /// Reads the machine's figures anew when a second has passed.
  void update(uint32_t now);
  /// Shows the book's verdicts anew, with `unsaved` behind those that are not kept.
  void showVerdicts(const char* unsaved = "");
  /// Marks an entry as keys do, before the menu is shown first.
  void markEntry(std::size_t entry);

  /// The number in testEntries() of what was chosen since the last call, if anything was.
  std::optional<std::size_t> takeChosen();
  /// Whether leaving was asked for since the last call.
  bool takeLeave() { return leaveAsked.exchange(false); }

 private:
  static constexpr int kNothing = -1;

  int addGroup(const std::string& name);
  int addRow(const char* name);
  void mark(int row);
  int markAbove();
  void choose(int row);
  void followKey(unsigned int code);
  void refreshFigures();
  void colourRow(int row);

  Current<Menu> current{this};
  const ResultBook& book;
  std::vector<int> rowOfEntry;  // the list's rows; none changes once the constructor is done
  int firstRow = kNothing;
  int leaveRow = kNothing;
  std::atomic<int> chosenRow = kNothing;
  std::atomic<bool> leaveAsked = false;
  std::atomic<int> markedRow = kNothing;     // dispatch thread; others only read it
  std::vector<std::atomic<uint32_t>> faces;  // of the rows where no mark is; written by one thread
  uint32_t figuresRead = 0;                  // GetTicks() milliseconds
  MW::MainList list;
  MenuHead head;
};

}  // namespace factory_test
