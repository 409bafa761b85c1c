#include "menu.h"

#include <MW/window.h>
#include <brimol/input.h>

#include <algorithm>
#include <array>
#include <string>

#include "layout.h"
#include "pages/table.h"
#include "verdict_bar.h"
#include "world.h"

namespace factory_test {

namespace {

constexpr uint32_t kFigureMs = 1000;
// The list's status texts: the pixels of a letter, the screens on which they have no room, and the
// widths of their columns in per cent of the screen's.
constexpr int kLetter = 32;
constexpr int kNarrow = 700;  // pixels
constexpr int kRightPercent = 40;
constexpr int kThirdPercent = 33;

struct VerdictLook {
  Verdict verdict;
  uint32_t color;
};
constexpr auto kLooks = std::to_array<VerdictLook>({
    {Verdict::None, kRowColor},
    {Verdict::Pass, kPassColor},
    {Verdict::Fail, kFailColor},
});

bool isNarrow(ScreenSize screen) { return screen.width < kNarrow; }

// Moving up may scroll a row to the very top of the list, where the list does not draw it.
int moveUpIntoView(MW::MainList& list) {
  const int row = list.move_key_up(MW::kUnused);
  MW::mouse_event belowEdge = {};
  belowEdge.y =
      (isNarrow(screenSize()) ? MW::MainList::kTitleHeight : MW::MainList::kExtendedTitleHeight) +
      1;
  MW::mouse_event aPixelDown = {};
  aPixelDown.yrel = 1;
  if (row >= 0 && list.position2index(belowEdge) == row) list.onHover(aPixelDown);
  return row;
}

enum class Keep { Head, Tail };

// Of the words what finds room in so many per cent of the screen's width, without the blank that
// keeps it from the edge. Less than one short word of them is nothing.
std::string fitting(const std::string& words, int percent, Keep keep) {
  constexpr std::size_t kShort = 6;
  const auto width = static_cast<std::size_t>(percentOf(screenSize().width, percent));
  const std::size_t room = width / kLetter - 1;
  if (words.size() <= room) return words;
  const bool isTail = keep == Keep::Tail;
  const std::size_t blank =
      isTail ? words.find(' ', words.size() - room - 1) : words.rfind(' ', room);
  if (blank != std::string::npos) return isTail ? words.substr(blank + 1) : words.substr(0, blank);
  if (room < kShort) return {};
  const std::string cut = "..";
  const std::size_t rest = room - cut.size();
  return isTail ? cut + words.substr(words.size() - rest) : words.substr(0, rest) + cut;
}

// What stands in a row.
std::string rowWords(const char* name) { return std::string("   ") + name; }

}  // namespace

Menu::Menu(const ResultBook& book)
    : list(" Factory test",
           isNarrow(screenSize()) ? MW::MainList::kPlain : MW::MainList::kExtended) {
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
  countRow = row;
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
  const std::string words = rowWords(name);
  const SKIA_Text text = textOf(words.c_str(), 0, SKIA_ALIGN_LEFT, textSize(screen));
  list.addIndex(MW::MainList::kDark, &text, percentOf(screen.height, kGroupPercent));
}

void Menu::addRow(const char* name) {
  const ScreenSize screen = screenSize();
  const std::string words = rowWords(name);
  const SKIA_Text text = textOf(words.c_str(), 0, SKIA_ALIGN_LEFT, textSize(screen));
  list.setBGColor(list.addIndex(MW::MainList::kSelectable, &text, entryHeight(screen)), kRowColor);
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

std::string Menu::verdictsText() const {
  return std::to_string(verdicts.size()) + " of " + std::to_string(rowOfEntry.size());
}

void Menu::refreshFigures() {
  const MachineFigures figures = presentFigures();
  const bool hasRoom = !isNarrow(screenSize());
  const auto put = [&](MW::MainList::StatusText place, const std::string& words) {
    // Of nothing the NUL is given, which empties its place.
    const auto length = hasRoom ? static_cast<int>(words.size()) : 0;
    list.setTextOption(place, length == 0 ? "" : words.c_str(), std::max(length, 1));
  };
  const auto putRight = [&](MW::MainList::StatusText place, const std::string& words) {
    put(place, fitting(words, kRightPercent, Keep::Tail) + " ");
  };
  const auto putLeft = [&](MW::MainList::StatusText place, const std::string& words) {
    put(place, std::string(" ").append(words));
  };
  putRight(MW::MainList::kBattery, figures.battery);
  putRight(MW::MainList::kCharger, figures.charger);
  putRight(MW::MainList::kBrightness, figures.brightness);
  putLeft(MW::MainList::kOperator, fitting(figures.hostName, kThirdPercent, Keep::Head));
  put(MW::MainList::kAddress, fitting(figures.address, kThirdPercent, Keep::Tail));
  put(MW::MainList::kSignal, verdictsText());
  const std::size_t word = std::min(figures.load.find(' '), figures.load.size());
  putLeft(MW::MainList::kTestMode, figures.load.substr(0, word));
  put(MW::MainList::kBle, fitting(figures.load.substr(word), kRightPercent, Keep::Head));
  if (!hasRoom) {
    const std::string count = rowWords(verdictsText().c_str());
    list.setText(countRow, count.c_str(), static_cast<unsigned int>(count.size()));
  }
  MW::isDisplayUpdate(1);
}

void Menu::showVerdict(std::size_t entry, Verdict verdict) {
  const auto* const look = std::ranges::find(kLooks, verdict, &VerdictLook::verdict);
  if (verdict != Verdict::None) verdicts.insert(entry);
  list.setBGColor(rowOfEntry.at(entry), look->color);
  std::string words = rowWords(testEntries()[entry].name);
  if (verdict != Verdict::None) words.append(": ").append(verdictName(verdict));
  list.setText(rowOfEntry.at(entry), words.c_str(), static_cast<unsigned int>(words.size()));
}

void Menu::markEntry(std::size_t entry) {
  while (markedRow != rowOfEntry.at(entry)) followKey(MW::kKeyDown);
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
