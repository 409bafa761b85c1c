// All results so far, by groups.
#include <MW/button_s.h>
#include <MW/mpd_wid.h>

#include <algorithm>
#include <array>
#include <memory>
#include <optional>
#include <string>

#include "button_row.h"
#include "current.h"
#include "language/language.h"
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

enum class Details { Shown, LeftOut };

// The last column is the widest: names stand there.
std::string wordsOf(const TestEntry& entry, const TestResult& result, Details details) {
  std::string words = lineOf(kTest, tr(verdictName(result.verdict)),
                             std::to_string(result.duration.count()) + " ms", tr(entry.name));
  if (details == Details::LeftOut) return words;
  const std::string started = utcText(result.started);
  constexpr std::size_t kDateBytes = 10;
  constexpr std::size_t kTimeBytes = 8;
  return words + lineOf(kDetail, started.substr(0, kDateBytes),
                        started.substr(kDateBytes + 1, kTimeBytes),
                        "UTC, " + std::to_string(result.screen.width) + " x " +
                            std::to_string(result.screen.height));
}

std::string wordsOf(Group group, const ResultBook& book, Details details) {
  int tests = 0;
  int done = 0;
  std::string words;
  for (const TestEntry& entry : testEntries()) {
    if (entry.group != group) continue;
    ++tests;
    const TestResult* const result = book.find(entry.id);
    if (result == nullptr) continue;
    if (result->verdict != Verdict::None) ++done;
    words += wordsOf(entry, *result, details);
  }
  const std::string count = filled(tr("%1 of %2"), {std::to_string(done), std::to_string(tests)});
  return lineOf(kGroup, count, tr("done"), nameOf(group)) + words;
}

// The list never hides its last line, nor does that one open: it closes the list.
std::string wordsOf(const ResultBook& book, Details details) {
  std::string words;
  for (const Group group : {Group::Display, Group::Input, Group::Reports, Group::Toolkit}) {
    words += wordsOf(group, book, details);
  }
  const auto done = std::ranges::count_if(
      book.results(), [](const TestResult& result) { return result.verdict != Verdict::None; });
  return words + lineOf(kGroup, std::to_string(done), tr("verdicts"), tr("All"));
}

// What the list has room for.
std::string wordsOf(const ResultBook& book) {
  const std::string words = wordsOf(book, Details::Shown);
  const bool hasRoom = std::ranges::count(words, '\n') <= MW::MpdWid::kItems;
  return hasRoom ? words : wordsOf(book, Details::LeftOut);
}

/// Groups that open to their tests, and these to their details, by a double tap. The button in the
/// header, and the keys select and back, end the look.
class ResultListTest : public LookTest {
 public:
  explicit ResultListTest(const Context& program)
      : LookTest(tr("Results"), tr("Say whether all results were there.")),
        words(wordsOf(program.results)) {}

  void draw() override {
    if (list) {
      page.drawGround();
    } else {
      LookTest::draw();
    }
  }

 protected:
  void beginLook() override {
    list.emplace(tr("Results")).cal_line(words.c_str(), static_cast<int>(words.size()));
    list->key_press_cb = [](MW::kbd_event* event, MW::MpdWid*) {
      self().finishLookOn(event->code);
    };
    const auto [left, right] = header();
    const char* const usual = tr("Tap a line twice");
    const SKIA_Text hint = captionIn(left, planStep.text.empty() ? usual : planStep.text.c_str());
    heading.emplace(MW::ButtonS::kTextBox, &left, &hint).setActive(1);
    done.emplace(right, kFaces);
  }

  void endLook() override {
    done.reset();
    heading.reset();
    list.reset();
  }

  std::string question() const override { return tr("Were all results there?"); }

 private:
  static const std::array<ButtonRow::Face, 1> kFaces;

  // In the list's empty box.
  static std::array<SKIA_Rect, 2> header() {
    constexpr int kAbove = 13;  // parts of the screen's height
    constexpr int kHeight = 7;
    const ScreenSize screen = screenSize();
    const int gap = gapOf(screen);
    const SKIA_Rect box = {gap, screen.height / kAbove, screen.width - 2 * gap,
                           screen.height / kHeight, MW::kColorWhite};
    return columnsOf<2>(within(box, 2 * gap), gap, {1, 1});
  }

  static ResultListTest& self() { return Current<ResultListTest>::get(); }

  Current<ResultListTest> current{this};
  const std::string words;
  std::optional<MW::MpdWid> list;
  std::optional<MW::ButtonS> heading;
  std::optional<ButtonRow> done;
};

const std::array<ButtonRow::Face, 1> ResultListTest::kFaces = {{
    {msg("Done"), [](int) { self().finishLook(); }},
}};

}  // namespace

std::unique_ptr<Test> makeResultList(const Context& context) {
  return std::make_unique<ResultListTest>(context);
}

}  // namespace factory_test
