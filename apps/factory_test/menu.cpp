#include "menu.h"

#include <MW/window.h>
#include <brimol/input.h>

#include <algorithm>
#include <array>
#include <string>

#include "language/language.h"
#include "layout.h"
#include "pages/table.h"
#include "text_fit.h"
#include "verdict_bar.h"
#include "world.h"

namespace factory_test {

namespace {

constexpr uint32_t kFigureMs = 1000;
constexpr int kBlankPercent = 25;  // of the text's size

struct VerdictLook {
  Verdict verdict;
  Ink ink;
};
constexpr auto kLooks = std::to_array<VerdictLook>({
    {Verdict::None, kRowInk},
    {Verdict::Pass, kPassInk},
    {Verdict::Fail, kFailInk},
});

// What stands in a row: below the head's words, as blanks are the only margin that a list knows.
std::string rowWords(const char* name) {
  const ScreenSize screen = screenSize();
  const int margin = 2 * gapOf(screen);
  const int blank = percentOf(textSize(screen), kBlankPercent);
  return std::string(static_cast<std::size_t>((margin + blank - 1) / blank), ' ') + name;
}

std::string rowWords(const TestEntry& entry, const TestResult* result, const char* behind) {
  std::string words = rowWords(tr(entry.name));
  if (result == nullptr || result->verdict == Verdict::None) return words;
  words.append(": ").append(tr(verdictName(result->verdict)));
  return words.append(behind);
}

// In which it has room in a row.
int sizeInRow(const std::string& words) {
  const ScreenSize screen = screenSize();
  const int size = textSize(screen);
  return fitted(words, size, screen.width - 2 * gapOf(screen), lineHeight(size)).size;
}

struct MenuGroup {
  std::string name;
  std::vector<std::size_t> entries;  // numbers in testEntries()
};

std::vector<MenuGroup> groupsOf(const Plan* ownPlan) {
  std::vector<MenuGroup> groups;
  if (ownPlan != nullptr) {
    groups.push_back({tr("Plan: ") + ownPlan->name, {}});
    for (const PlanStep& step : ownPlan->steps) {
      groups.back().entries.push_back(placeOf(step.test));
    }
  }
  std::optional<Group> last;
  for (std::size_t i = 0; i < testEntries().size(); ++i) {
    const TestEntry& entry = testEntries()[i];
    if (ownPlan != nullptr && ownPlan->find(entry.id) != nullptr) continue;
    if (last != entry.group) {
      groups.push_back(
          {std::string(nameOf(entry.group)) + (ownPlan != nullptr ? tr(", not in the plan") : ""),
           {}});
    }
    last = entry.group;
    groups.back().entries.push_back(i);
  }
  return groups;
}

}  // namespace

Menu::Menu(const ResultBook& results, const Plan* ownPlan)
    : book(results),
      rowOfEntry(testEntries().size(), kNothing),
      faces(MW::MainList::kItems),
      list("", MenuHead::listMode()) {
  // What stands there is the head's.
  for (int text = 0; text < MW::MainList::kOptions; ++text) list.setTextOption(text, "", 1);
  // Of no height: the list does not draw a row that begins exactly at its top.
  const SKIA_Text nothing = {};
  firstRow = list.addIndex(MW::MainList::kDark, &nothing, 0) + 2;  // behind a group's name
  for (const MenuGroup& group : groupsOf(ownPlan)) {
    addGroup(group.name);
    for (const std::size_t entry : group.entries) {
      rowOfEntry.at(entry) = addRow(tr(testEntries()[entry].name));
    }
  }
  addGroup("");
  leaveRow = addRow(tr("Leave"));
  faces.at(static_cast<std::size_t>(leaveRow)) = kRowInk.ground;
  list.initFinish();
  showVerdicts();
  list.clickCallback = [](MW::mouse_event* event, MW::MainList* from) {
    Current<Menu>::get().choose(from->position2index(*event));
  };
  list.keyPressCallback = [](MW::kbd_event* event, MW::MainList*) {
    Current<Menu>::get().followKey(event->code);
  };
  refreshFigures();
}

int Menu::addGroup(const std::string& name) {
  const std::string words = rowWords(name.c_str());
  const SKIA_Text text = textOf(words.c_str(), 0, leadingAlign(), sizeInRow(words));
  return list.addIndex(MW::MainList::kDark, &text, groupHeight(screenSize()));
}

int Menu::addRow(const char* name) {
  const std::string words = rowWords(name);
  const SKIA_Text text = textOf(words.c_str(), 0, leadingAlign(), sizeInRow(words));
  const int row = list.addIndex(MW::MainList::kSelectable, &text, entryHeight(screenSize()));
  list.setBGColor(row, kRowInk.ground);
  return row;
}

void Menu::show() {
  list.setActive(1);
  head.setActive(1);
  MW::isDisplayUpdate(1);
}

void Menu::hide() {
  head.setActive(0);
  list.hide();
}

void Menu::update(uint32_t now) {
  if (now - figuresRead < kFigureMs) return;
  figuresRead = now;
  refreshFigures();
}

void Menu::refreshFigures() {
  head.tell(presentFigures());
  head.tell(book.lineStatus());
  MW::isDisplayUpdate(1);
}

void Menu::showVerdicts(const char* unsaved) {
  head.tell(progressOf(book));
  for (std::size_t i = 0; i < rowOfEntry.size(); ++i) {
    const TestEntry& entry = testEntries()[i];
    const TestResult* const result = book.find(entry.id);
    const Verdict verdict = result == nullptr ? Verdict::None : result->verdict;
    const auto* const look = std::ranges::find(kLooks, verdict, &VerdictLook::verdict);
    const int row = rowOfEntry.at(i);
    const std::string words = rowWords(entry, result, book.isSaved(entry.id) ? "" : unsaved);
    list.setText(row, words.c_str(), static_cast<unsigned int>(words.size()));
    list.setFontSize(row, sizeInRow(words));
    faces.at(static_cast<std::size_t>(row)) = look->ink.ground;
    colourRow(row);
  }
}

void Menu::colourRow(int row) {
  const bool isMarked = row == markedRow;
  list.setBGColor(row, isMarked ? kMarkInk.ground : faces.at(static_cast<std::size_t>(row)).load());
  list.setTextColor(row, isMarked ? kMarkInk.text : kLight);
}

void Menu::markEntry(std::size_t entry) {
  const int row = rowOfEntry.at(entry);
  while (markedRow != row) followKey(markedRow < row ? MW::kKeyDown : MW::kKeyUp);
}

std::optional<std::size_t> Menu::takeChosen() {
  const int row = chosenRow.exchange(kNothing);
  const auto found = std::ranges::find(rowOfEntry, row);
  if (found == rowOfEntry.end()) return {};
  return static_cast<std::size_t>(found - rowOfEntry.begin());
}

void Menu::choose(int row) {
  if (row == leaveRow) {
    leaveAsked = true;
  } else {
    chosenRow = row;
  }
}

void Menu::followKey(unsigned int code) {
  switch (code) {
    case MW::kKeyDown:
      // The list's own current item is the first one already, though nothing shows it yet.
      mark(markedRow == kNothing ? firstRow : list.move_key_down(MW::kUnused));
      break;
    case MW::kKeyUp: mark(markAbove()); break;
    case MW::kKeySelect: choose(markedRow); break;
    case kKeyBack: leaveAsked = true; break;
    default: break;
  }
}

// Moving up may scroll a row to the very top of the list, where the list does not draw it, and the
// first one's group stays above that.
int Menu::markAbove() {
  const int row = list.move_key_up(MW::kUnused);
  MW::mouse_event belowEdge = {};
  belowEdge.y = head.height() + 1;
  MW::mouse_event down = {};
  down.yrel = row == firstRow ? screenSize().height : 1;
  if (row >= 0 && list.position2index(belowEdge) == row) list.onHover(down);
  return row;
}

// A negative row: the mark could not move.
void Menu::mark(int row) {
  if (row < 0) return;
  const int before = markedRow.exchange(row);
  if (before != kNothing) colourRow(before);
  colourRow(row);
}

}  // namespace factory_test
