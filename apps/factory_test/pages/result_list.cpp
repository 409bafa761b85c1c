// All results so far, by groups.
#include <MW/button_s.h>
#include <MW/mpd_wid.h>

#include <array>
#include <memory>
#include <optional>
#include <string>

#include "button_row.h"
#include "current.h"
#include "layout.h"
#include "page_test.h"
#include "pages/table.h"
#include "results/utc_time.h"

namespace factory_test {

namespace {

enum Level { kGroup = 1, kTest = 2, kDetail = 3 };

// A line of the list's text.
std::string lineOf(Level level, const std::string& head, const std::string& name,
                   const std::string& value) {
  constexpr std::size_t kHeadBytes = 18;  // what the list takes for the head
  std::string line("[");
  line.append(std::to_string(level)).append("] ").append(head);
  line.resize(kHeadBytes, ' ');
  return line.append("[MPDIA] ").append(name).append("]").append(value).append("\n");
}

std::string wordsOf(const TestEntry& entry, const TestResult& result) {
  const std::string screen =
      std::to_string(result.screen.width) + " x " + std::to_string(result.screen.height);
  return lineOf(kTest, entry.name, verdictName(result.verdict),
                std::to_string(result.duration.count()) + " ms") +
         lineOf(kDetail, "started", "UTC", utcText(result.started)) +
         lineOf(kDetail, "screen", "pixels", screen);
}

std::string wordsOf(Group group, const ResultBook& book) {
  int tests = 0;
  int done = 0;
  std::string words;
  for (const TestEntry& entry : testEntries()) {
    if (entry.group != group) continue;
    ++tests;
    const TestResult* const result = book.find(entry.id);
    if (result == nullptr) continue;
    ++done;
    words += wordsOf(entry, *result);
  }
  const std::string count = std::to_string(done) + " of " + std::to_string(tests);
  return lineOf(kGroup, nameOf(group), count, "tests done") + words;
}

// The list never hides its last line, nor does that one open: it closes the list.
std::string wordsOf(const ResultBook& book) {
  std::string words;
  for (const Group group : {Group::Display, Group::Input, Group::Reports, Group::Toolkit}) {
    words += wordsOf(group, book);
  }
  return words + lineOf(kGroup, "All", std::to_string(book.results().size()), "results");
}

/// Groups that open to their tests, and these to their details, by a double tap. The button in the
/// header, and the keys select and back, end the look.
class ResultListTest : public LookTest {
 public:
  explicit ResultListTest(const Context& program)
      : LookTest("Results", ""), words(wordsOf(program.results)) {}

 protected:
  void beginLook() override {
    list.emplace("Results").cal_line(words.c_str(), static_cast<int>(words.size()));
    list->key_press_cb = [](MW::kbd_event* event, MW::MpdWid*) {
      self().finishLookOn(event->code);
    };
    const SKIA_Rect header = rowOf(screenSize(), 10, 10, MW::kColorWhite);
    const SKIA_Rect left = cellOf(header, 0, 2);
    const SKIA_Text hint = captionOf("Tap a line twice");
    heading.emplace(MW::ButtonS::kTextBox, &left, &hint).setActive(1);
    done.emplace(cellOf(header, 1, 2), kFaces);
  }

  void endLook() override {
    done.reset();
    heading.reset();
    list.reset();
  }

  std::string question() const override { return "Were all results there?"; }

 private:
  static const std::array<ButtonRow::Face, 1> kFaces;

  static ResultListTest& self() { return Current<ResultListTest>::get(); }

  Current<ResultListTest> current{this};
  const std::string words;
  std::optional<MW::MpdWid> list;
  std::optional<MW::ButtonS> heading;
  std::optional<ButtonRow> done;
};

const std::array<ButtonRow::Face, 1> ResultListTest::kFaces = {{
    {"Done", [](int) { self().finishLook(); }},
}};

}  // namespace

std::unique_ptr<Test> makeResultList(const Context& context) {
  return std::make_unique<ResultListTest>(context);
}

}  // namespace factory_test
