// A page that is nothing but data: every item and widget on it is built from a descriptor.
#include <MW/widget_list.h>
#include <MW/widget_rcui.h>
#include <MW/window.h>
#include <brimol/input.h>

#include <algorithm>
#include <array>
#include <atomic>
#include <memory>
#include <vector>

#include "current.h"
#include "layout.h"
#include "test.h"
#include "verdict_bar.h"

namespace factory_test {

namespace {

// MW::ref_t's kinds; the pictures are named after what they show.
enum Kind {
  kTextbox = 0,
  kBox = 2,
  kLine = 4,
  kNextInColumn = 7,
  kFirstInColumn = 8,
  kLabel = 9,
  kDialog = 10,
  kDialogNew = 14,
  kButton = 15,
  kLeftSquare = 17,
  kCentreSquare = 18,
  kRightSquare = 19,
  kSlideFromLeft = 21,
  kSlideFromRight = 22,
  kToast = 23,
  kFullScreen = 24,
  kProgress = 25,
  kKey = 26
};

constexpr int kShowMs = 2000;
constexpr int kWhiteMs = 700;
constexpr int kLineWidth = 4;  // pixels
constexpr uint32_t kBarColor = 0xFFC8D2E0;
constexpr std::size_t kTexts = 5;
constexpr SKIA_Rect kNoPlace = {0, 0, 0, 0, kBarColor};  // of what places itself

/// PASS, RETRY and FAIL are squares of the page itself; the select key passes, the back key leaves.
class DescriptorTest : public Test {
 public:
  void enter() override {
    MW::WidgetList::init();
    for (const Entry& entry : kEntries) build(entry);
  }

  void leave() override {
    while (!built.empty()) built.pop_back();
    MW::WidgetList::destroy();
  }

  Outcome verdict() const override { return chosen; }

  void draw() override { MW::WidgetList::show(); }

  void update(uint32_t now) override {
    if (!find(kFullScreen).isActive() || now - whiteSince < kWhiteMs) return;
    find(kFullScreen).hide();
    MW::isDisplayUpdate(1);
  }

 private:
  struct Entry {
    Kind kind;
    bool isShown;
    SKIA_Rect place;  // x and w in columns of ten, y and h in per cent of the screen's height
    const char* words;
    MW::ref_cb_t callbacks = {};
    std::array<const char*, kTexts> texts = {};
  };

  using Self = Current<DescriptorTest>;
  static const std::vector<Entry> kEntries;

  /// The only widget of its kind.
  static MW::Widget& find(Kind kind) {
    const auto entry = std::ranges::find(kEntries, kind, &Entry::kind);
    return *Self::get().built.at(static_cast<std::size_t>(entry - kEntries.begin()))->getPointer();
  }

  template <Outcome outcome>
  static void choose(int) {
    Self::get().chosen = outcome;
  }

  static void open(Kind kind) {
    find(kind).setActive(1);
    MW::isDisplayUpdate(1);
  }

  static void whiten(int) {
    Self::get().whiteSince = GetTicks();
    open(kFullScreen);
  }

  static void showTimed(int) {
    find(kToast).onHideTimer(kShowMs);
    find(kProgress).onProgressbar(kShowMs);
  }

  // Button 1 leaves a dialog where it is.
  static void closeDialogs(int) {
    find(kDialog).hide();
    find(kDialogNew).hide();
    MW::isDisplayUpdate(1);
  }

  static void followKey(MW::kbd_event* event) {
    if (event->code == MW::kKeyUp) showTimed(0);
    if (event->code == MW::kKeySelect) Self::get().chosen = Outcome::Pass;
    if (event->code == kKeyBack) Self::get().chosen = Outcome::Left;
  }

  void build(const Entry& entry) {
    const ScreenSize screen = screenSize();
    const auto& [left, top, columns, height, color] = entry.place;
    constexpr int kColumnPercent = 10;
    std::array<SKIA_Text, kTexts> texts;
    std::ranges::transform(entry.texts, texts.begin(), [](const char* words) {
      return captionOf(words != nullptr ? words : "", MW::kColorWhite);
    });
    MW::ref_t ref;
    ref.kind = entry.kind;
    ref.dialogKind = 2;
    ref.visible = entry.isShown ? 1 : 0;
    ref.cbIndex = 1;
    ref.rect = {percentOf(screen.width, left * kColumnPercent), percentOf(screen.height, top),
                percentOf(screen.width, columns * kColumnPercent), percentOf(screen.height, height),
                color};
    ref.lineWidth = kLineWidth;
    ref.text = captionOf(entry.words, color == kBarColor ? MW::kColorBlack : MW::kColorWhite);
    ref.desc = entry.texts.front() != nullptr ? texts.data() : nullptr;
    built.push_back(std::make_unique<MW::WidgetRcui>(&ref, &entry.callbacks, 0));
    if (ref.index > 0) MW::WidgetList::show(ref.index);
  }

  Current<DescriptorTest> current{this};
  std::atomic<Outcome> chosen = Outcome::Running;
  std::atomic<uint32_t> whiteSince = 0;  // GetTicks() milliseconds
  std::vector<std::unique_ptr<MW::WidgetRcui>> built;
};

// Widgets come after the pictures, dialogs last.
const std::vector<DescriptorTest::Entry> DescriptorTest::kEntries = {
    {kTextbox, true, {0, 0, 10, 100, kGroundColor}, ""},
    {kBox, true, {0, 2, 10, 7, kTitleColor}, ""},
    {kLabel, true, {0, 2, 10, 7, 0}, "Built from descriptors"},
    {kLine, true, {1, 10, 9, 10, kBarColor}, ""},
    {kFirstInColumn, true, {1, 11, 8, 4, kBarColor}, "A column of text boxes:"},
    {kNextInColumn, true, kNoPlace, "each stands below the one before,"},
    {kNextInColumn, true, kNoPlace, "wherever its own rectangle is."},
    {kButton, true, {1, 25, 3, 7, kBarColor}, "Toast", {.cbClick = showTimed}},
    {kButton, true, {6, 25, 3, 7, kBarColor}, "White", {.cbClick = whiten}},
    {kButton, true, {1, 34, 3, 7, kBarColor}, "Dialog", {.cbClick = [](int) { open(kDialog); }}},
    {kButton, true, {6, 34, 3, 7, kBarColor}, "Words", {.cbClick = [](int) { open(kDialogNew); }}},
    {kSlideFromLeft,
     true,
     {1, 44, 8, 6, kBarColor},
     "Slide to pass",
     {.cbTouchRelease = choose<Outcome::Pass>}},
    {kSlideFromRight,
     true,
     {1, 52, 8, 6, kBarColor},
     "Slide to leave",
     {.cbTouchRelease = choose<Outcome::Left>}},
    {kLeftSquare, true, kNoPlace, "PASS", {.cbClick = choose<Outcome::Pass>}},
    {kCentreSquare, true, kNoPlace, "RETRY", {.cbClick = choose<Outcome::Retry>}},
    {kRightSquare, true, kNoPlace, "FAIL", {.cbClick = choose<Outcome::Fail>}},
    {kToast, false, {1, 60, 8, 8, kTitleColor}, "A toast", {}, {"with a second line"}},
    {kProgress, false, {1, 70, 8, 5, kTitleColor}, "Two seconds"},
    {kKey, true, {}, "", {.cbKeyPress = followKey}},
    {kDialog, false, {}, "", {.cbTouchRelease = closeDialogs}},
    {kDialogNew,
     false,
     {},
     "Words of its own",
     {.cbTouchRelease = closeDialogs},
     {"from a descriptor", "in two lines", "", "OK", ""}},
    {kFullScreen, false, {}, ""},
};

const TestRegistration kRegistration({Group::Widgets, 5, "descriptors", "Descriptors",
                                      makeTest<DescriptorTest>});

}  // namespace

}  // namespace factory_test
