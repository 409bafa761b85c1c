#include "menu.h"

#include <MW/window.h>
#include <brimol/input.h>

#include <algorithm>
#include <array>
#include <string>

#include "layout.h"
#include "test.h"
#include "verdict_bar.h"
#include "world.h"

namespace factory_test {

namespace {

constexpr uint32_t kFigureMs = 1000;
constexpr uint32_t kRowColor = 0xFF787878;

struct VerdictLook {
  Verdict verdict;
  uint32_t color;
};
constexpr auto kLooks = std::to_array<VerdictLook>({
    {Verdict::None, kRowColor},
    {Verdict::Pass, kPassColor},
    {Verdict::Fail, kFailColor},
});

// Moving up may scroll a row to the very top of the list, where the list does not draw it.
int moveUpIntoView(MW::MainList& list) {
  const int row = list.move_key_up(MW::kUnused);
  MW::mouse_event belowEdge = {};
  belowEdge.y = MW::MainList::kExtendedTitleHeight + 1;
  MW::mouse_event aPixelDown = {};
  aPixelDown.yrel = 1;
  if (row >= 0 && list.position2index(belowEdge) == row) list.onHover(aPixelDown);
  return row;
}

// What stands in an entry's row.
std::string rowWords(const char* name) { return std::string("   ") + name; }

}  // namespace

Menu::Menu(const ResultBook& book) : list("Factory test", MW::MainList::kExtended) {
  const auto& entries = testEntries();
  std::optional<Group> group;
  // Of no height: the list does not draw a row that begins exactly at its top.
  const SKIA_Text nothing = {};
  int row = list.addIndex(MW::MainList::kDark, &nothing, 0) + 1;
  for (const TestEntry& entry : entries) {
    if (group != entry.group) {
      addGroup(nameOf(entry.group));
      ++row;
    }
    group = entry.group;
    addRow(entry.name);
    rowOfEntry.push_back(row++);
  }
  addGroup("");
  addRow("Leave");
  leaveRow = row + 1;
  list.initFinish();
  for (std::size_t i = 0; i < entries.size(); ++i) {
    const TestResult* const result = book.find(entries[i].id);
    if (result != nullptr) showVerdict(i, result->verdict);
  }
  list.clickCallback = [](MW::mouse_event* event, MW::MainList* from) {
    Current<Menu>::get().choose(from->position2index(*event));
  };
  list.keyPressCallback = [](MW::kbd_event* event, MW::MainList*) {
    Current<Menu>::get().followKey(event->code);
  };
  refreshFigures();
}

void Menu::addGroup(const char* name) {
  const ScreenSize screen = screenSize();
  const SKIA_Text text = textOf(name, 0, SKIA_ALIGN_LEFT, textSize(screen));
  list.addIndex(MW::MainList::kDark, &text, percentOf(screen.height, kGroupPercent));
}

void Menu::addRow(const char* name) {
  const ScreenSize screen = screenSize();
  const std::string words = rowWords(name);
  const SKIA_Text text = textOf(words.c_str(), 0, SKIA_ALIGN_LEFT, textSize(screen));
  list.addIndex(MW::MainList::kSelectable, &text, percentOf(screen.height, kEntryPercent));
}

void Menu::show() {
  list.setActive(1);
  MW::isDisplayUpdate(1);
}

void Menu::hide() { list.hide(); }

void Menu::update(uint32_t now) {
  if (now - figuresRead < kFigureMs) return;
  figuresRead = now;
  refreshFigures();
}

void Menu::refreshFigures() {
  const MachineFigures figures = presentFigures();
  const auto put = [this](MW::MainList::StatusText place, const std::string& words) {
    // Of an unknown figure the NUL is given, which empties its place.
    list.setTextOption(place, words.c_str(), std::max(static_cast<int>(words.size()), 1));
  };
  put(MW::MainList::kBattery, figures.battery);
  put(MW::MainList::kCharger, figures.charger);
  put(MW::MainList::kBrightness, figures.brightness);
  put(MW::MainList::kOperator, " " + figures.hostName);
  put(MW::MainList::kAddress, figures.address);
  put(MW::MainList::kSignal,
      std::to_string(verdicts.size()) + " of " + std::to_string(rowOfEntry.size()) + " ");
  put(MW::MainList::kTestMode, " " + figures.load);
  put(MW::MainList::kBle, "");
  MW::isDisplayUpdate(1);
}

void Menu::showVerdict(std::size_t entry, Verdict verdict) {
  const auto* const look = std::ranges::find(kLooks, verdict, &VerdictLook::verdict);
  if (verdict != Verdict::None) verdicts.insert(entry);
  list.setBGColor(rowOfEntry.at(entry), look->color);
  std::string words = rowWords(testEntries().at(entry).name);
  if (verdict != Verdict::None) words.append(": ").append(verdictName(verdict));
  list.setText(rowOfEntry.at(entry), words.c_str(), static_cast<unsigned int>(words.size()));
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
      mark(markedRow == kNothing ? rowOfEntry.front() : list.move_key_down(MW::kUnused));
      break;
    case MW::kKeyUp: mark(moveUpIntoView(list)); break;
    case MW::kKeySelect: choose(markedRow); break;
    case kKeyBack: leaveAsked = true; break;
    default: break;
  }
}

// A negative row: the mark could not move.
void Menu::mark(int row) {
  if (row < 0) return;
  if (markedRow != kNothing) list.setTextColor(markedRow, MW::kColorWhite);
  markedRow = row;
  list.setTextColor(row, MW::kColorHighlight);
}

}  // namespace factory_test
