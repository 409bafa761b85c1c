/// The main menu: all tests by groups, with their verdicts, under figures of the machine.
#pragma once

#include <MW/main_list.h>

#include <atomic>
#include <cstdint>
#include <optional>
#include <set>
#include <string>
#include <vector>

#include "current.h"
#include "results/results.h"

namespace factory_test {

/// Stands in the window from construction to destruction; there is one. Used on the main thread;
/// its list's callbacks come on the dispatch thread. A click, or the select key, chooses an entry;
/// up and down move the mark; the back key, and the last row, ask to leave.
class Menu {
 public:
  /// Shows the verdicts that the book holds.
  explicit Menu(const ResultBook& book);

  void show();
  void hide();
  /// Reads the machine's figures anew when a second has passed.
  void update(uint32_t now);
  void showVerdict(std::size_t entry, Verdict verdict);
  /// Marks an entry as keys do, before the menu is shown first.
  void markEntry(std::size_t entry);

  /// The number in testEntries() of what was chosen since the last call, if anything was.
  std::optional<std::size_t> takeChosen();
  /// Whether leaving was asked for since the last call.
  bool takeLeave() { return leaveAsked.exchange(false); }

 private:
  static constexpr int kNothing = -1;

  void addGroup(const char* name);
  void addRow(const char* name);
  void mark(int row);
  void choose(int row);
  void followKey(unsigned int code);
  void refreshFigures();
  /// How many entries have a verdict.
  std::string verdictsText() const;

  Current<Menu> current{this};
  std::vector<int> rowOfEntry;  // the list's rows; neither changes once the constructor is done
  int leaveRow = kNothing;
  int countRow = kNothing;
  std::atomic<int> chosenRow = kNothing;
  std::atomic<bool> leaveAsked = false;
  int markedRow = kNothing;        // dispatch thread
  std::set<std::size_t> verdicts;  // entries that have one
  uint32_t figuresRead = 0;        // GetTicks() milliseconds
  MW::MainList list;
};

}  // namespace factory_test
