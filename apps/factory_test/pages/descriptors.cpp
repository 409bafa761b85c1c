// A page that is nothing but data: every item and widget on it is built from a descriptor.
#include <MW/dialog.h>
#include <MW/widget_list.h>
#include <MW/widget_rcui.h>
#include <MW/window.h>
#include <brimol/input.h>

#include <algorithm>
#include <array>
#include <atomic>
#include <memory>
#include <string>
#include <vector>

#include "current.h"
#include "language/language.h"
#include "layout.h"
#include "pages/table.h"
#include "plan/plan.h"
#include "test.h"
#include "verdict_bar.h"

namespace factory_test {

namespace {

using enum MW::RcuiKind;

constexpr int kShowMs = 2000;
constexpr int kWhiteMs = 700;
constexpr int kLineWidth = 4;  // pixels
constexpr uint32_t kBarColor = 0xFFC8D2E0;
constexpr std::size_t kTexts = 5;
constexpr SKIA_Rect kNoPlace = {0, 0, 0, 0, kBarColor};  // of what places itself

/// PASS, RETRY and FAIL are the page's own: squares, and buttons on a wide screen, where these
/// squares would be too high. The select key passes, the back key leaves.
class DescriptorTest : public Test {
 public:
  void prepare(const PlanStep& step) override { plans = step.text; }

  void enter() override {
    MW::WidgetList::init();
    for (const Entry& entry : kEntries) build(entry);
  }

  void leave() override {
    built.clear();
    MW::WidgetList::destroy();
  }

  Outcome verdict() const override { return chosen; }

  void draw() override {
    MW::WidgetList::show();
    if (plans.empty()) return;
    const SKIA_Rect area = pixelsOf({1, 10, 8, 15, kBarColor});
    skia_add_box_c(area);
    drawWords(within(area, gapOf(screenSize()) / 2), plans, MW::kColorBlack, SKIA_ALIGN_CENTRE,
              textSize(screenSize()));
  }

  void update(uint32_t now) override {
    if (!find(kRcuiFullScreen).isActive() || now - whiteSince < kWhiteMs) return;
    find(kRcuiFullScreen).hide();
    MW::isDisplayUpdate(1);
  }

 private:
  enum class Shown { AtOnce, OnTall, OnWide, Later };
  using enum Shown;
  struct Entry {
    MW::RcuiKind kind;
    Shown shown;
    SKIA_Rect place;  // x and w in columns of ten, y and h in per cent of the screen's height
    const char* words;
    MW::ref_cb_t callbacks = {};
    std::array<const char*, kTexts> texts = {};
  };

  using Self = Current<DescriptorTest>;
  static const std::vector<Entry> kEntries;

  /// The only widget of its kind.
  static MW::Widget& find(MW::RcuiKind kind) {
    const auto entry = std::ranges::find(kEntries, kind, &Entry::kind);
    return *Self::get().built.at(static_cast<std::size_t>(entry - kEntries.begin()))->getPointer();
  }

  template <Outcome outcome>
  static void choose(int) {
    Self::get().chosen = outcome;
  }

  static void open(MW::RcuiKind kind) {
    find(kind).setActive(1);
    MW::isDisplayUpdate(1);
  }

  static void whiten(int) {
    Self::get().whiteSince = GetTicks();
    open(kRcuiFullScreen);
  }

  static void showTimed(int) {
    find(kRcuiToastbox).onHideTimer(kShowMs);
    find(kRcuiProgressbar).onProgressbar(kShowMs);
  }

  // Button 1 leaves a dialog where it is.
  static void closeDialogs(int) {
    find(kRcuiDialog).hide();
    find(kRcuiDialogNew).hide();
    MW::isDisplayUpdate(1);
  }

  static void followKey(MW::kbd_event* event) {
    if (event->code == MW::kKeyUp) showTimed(0);
    if (event->code == MW::kKeySelect) Self::get().chosen = Outcome::Pass;
    if (event->code == kKeyBack) Self::get().chosen = Outcome::Left;
  }

  // Of a place in an entry's units.
  static SKIA_Rect pixelsOf(const SKIA_Rect& place) {
    constexpr int kColumnPercent = 10;
    const ScreenSize screen = screenSize();
    return {percentOf(screen.width, place.x * kColumnPercent), percentOf(screen.height, place.y),
            percentOf(screen.width, place.w * kColumnPercent), percentOf(screen.height, place.h),
            place.color};
  }

  void build(const Entry& entry) {
    std::array<SKIA_Text, kTexts> texts;
    std::ranges::transform(entry.texts, texts.begin(), [](const char* words) {
      return captionOf(words != nullptr ? tr(words) : "", MW::kColorWhite);
    });
    MW::ref_t ref;
    ref.kind = entry.kind;
    ref.dialogKind = MW::Dialog::kRetryTest;
    const Shown here = isLandscape(screenSize()) ? OnWide : OnTall;
    const bool isHint = entry.kind == kRcuiFirstInColumn || entry.kind == kRcuiNextInColumn;
    const bool isShown = entry.shown == AtOnce || entry.shown == here;
    ref.visible = isShown && !(isHint && !plans.empty()) ? 1 : 0;
    ref.cbIndex = 1;
    ref.rect = pixelsOf(entry.place);
    ref.lineWidth = kLineWidth;
    ref.text = captionOf(tr(entry.words),
                         entry.place.color == kBarColor ? MW::kColorBlack : MW::kColorWhite);
    ref.desc = entry.texts.front() != nullptr ? texts.data() : nullptr;
    built.push_back(std::make_unique<MW::WidgetRcui>(&ref, &entry.callbacks, MW::kUnused));
    if (ref.index > 0) MW::WidgetList::show(ref.index);
  }

  Current<DescriptorTest> current{this};
  std::string plans;  // what the plan tells the operator
  std::atomic<Outcome> chosen = Outcome::Running;
  std::atomic<uint32_t> whiteSince = 0;  // GetTicks() milliseconds
  std::vector<std::unique_ptr<MW::WidgetRcui>> built;
};

// Widgets come after the pictures, dialogs last.
const std::vector<DescriptorTest::Entry> DescriptorTest::kEntries = {
    {kRcuiTextbox, AtOnce, {0, 0, 10, 100, kPageInk.ground}, ""},
    {kRcuiBox, AtOnce, {0, 0, 10, 8, kHeadInk.ground}, ""},
    {kRcuiLabel, AtOnce, {0, 0, 10, 8, 0}, msg("Built from descriptors")},
    {kRcuiLine, AtOnce, {1, 9, 9, 9, kBarColor}, ""},
    {kRcuiFirstInColumn, AtOnce, {1, 10, 8, 5, kBarColor}, msg("Try every button and slide:")},
    {kRcuiNextInColumn, AtOnce, kNoPlace, msg("each of them does something.")},
    {kRcuiNextInColumn, AtOnce, kNoPlace, msg("Then leave, or give a verdict.")},
    {kRcuiButton, AtOnce, {1, 26, 3, 9, kBarColor}, msg("Toast"), {.cbClick = showTimed}},
    {kRcuiButton, AtOnce, {6, 26, 3, 9, kBarColor}, msg("White"), {.cbClick = whiten}},
    {kRcuiButton,
     AtOnce,
     {1, 36, 3, 9, kBarColor},
     msg("Dialog"),
     {.cbClick = [](int) { open(kRcuiDialog); }}},
    {kRcuiButton,
     AtOnce,
     {6, 36, 3, 9, kBarColor},
     msg("Words"),
     {.cbClick = [](int) { open(kRcuiDialogNew); }}},
    {kRcuiSlideFromLeft,
     AtOnce,
     {1, 47, 8, 6, kBarColor},
     msg("Slide to pass"),
     {.cbTouchRelease = choose<Outcome::Pass>}},
    {kRcuiSlideFromRight,
     AtOnce,
     {1, 54, 8, 6, kBarColor},
     msg("Slide to leave"),
     {.cbTouchRelease = choose<Outcome::Left>}},
    {kRcuiButton3Left, OnTall, kNoPlace, msg("PASS"), {.cbClick = choose<Outcome::Pass>}},
    {kRcuiButton3Centre, OnTall, kNoPlace, msg("RETRY"), {.cbClick = choose<Outcome::Retry>}},
    {kRcuiButton3Right, OnTall, kNoPlace, msg("FAIL"), {.cbClick = choose<Outcome::Fail>}},
    {kRcuiButton,
     OnWide,
     {1, 83, 2, 12, kPassInk.ground},
     msg("PASS"),
     {.cbClick = choose<Outcome::Pass>}},
    {kRcuiButton,
     OnWide,
     {4, 83, 2, 12, kRowInk.ground},
     msg("RETRY"),
     {.cbClick = choose<Outcome::Retry>}},
    {kRcuiButton,
     OnWide,
     {7, 83, 2, 12, kFailInk.ground},
     msg("FAIL"),
     {.cbClick = choose<Outcome::Fail>}},
    {kRcuiToastbox,
     Later,
     {1, 61, 8, 8, kHeadInk.ground},
     msg("A toast"),
     {},
     {msg("with a second line")}},
    {kRcuiProgressbar, Later, {1, 70, 8, 5, kHeadInk.ground}, msg("Two seconds")},
    {kRcuiKey, AtOnce, {}, "", {.cbKeyPress = followKey}},
    {kRcuiDialog, Later, {}, "", {.cbTouchRelease = closeDialogs}},
    {kRcuiDialogNew,
     Later,
     {},
     msg("Words of its own"),
     {.cbTouchRelease = closeDialogs},
     {msg("from a descriptor"), msg("in two lines"), "", msg("OK"), ""}},
    {kRcuiFullScreen, Later, {}, ""},
};

}  // namespace

std::unique_ptr<Test> makeDescriptors(const Context&) { return std::make_unique<DescriptorTest>(); }

}  // namespace factory_test
