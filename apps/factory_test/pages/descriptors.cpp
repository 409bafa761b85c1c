// What is nothing but data: every item and widget of the page is built from a descriptor.
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
#include "page_test.h"
#include "pages/table.h"

namespace factory_test {

namespace {

using enum MW::RcuiKind;

constexpr int kShowMs = 2000;
constexpr int kWhiteMs = 700;
constexpr int kLineWidth = 4;  // pixels
constexpr uint32_t kBarColor = 0xFFC8D2E0;
constexpr std::size_t kTexts = 5;
constexpr SKIA_Rect kNoPlace = {0, 0, 0, 0, kBarColor};  // of what places itself

/// Complete once each button was used. A slide passes or leaves, as a verdict does.
class DescriptorTest : public PageTest {
 public:
  DescriptorTest()
      : PageTest(tr("Descriptors"), tr("Try every button and slide.\nKey up shows the toast.")) {}

  void enter() override {
    page.ask().otherKey = [](unsigned int code) {
      if (code == MW::kKeyUp) showTimed(0);
    };
    MW::WidgetList::init();
    for (const Entry& entry : kEntries) build(entry);
  }

  void leave() override {
    built.clear();
    MW::WidgetList::destroy();
    page.endAsking();
  }

  Outcome verdict() const override {
    const Outcome slid = chosen;
    return slid == Outcome::Running ? PageTest::verdict() : slid;
  }

  void takeBack() override {
    chosen = Outcome::Running;
    PageTest::takeBack();
  }

  bool isComplete() const override {
    return std::ranges::all_of(used, [](const auto& each) { return each.load(); });
  }

  void draw() override {
    PageTest::draw();
    MW::WidgetList::show();
  }

  void update(uint32_t) override {
    if (!find(kRcuiFullScreen).isActive()) return;
    const uint32_t since = whiteSince;  // another thread's: the time is asked afterwards
    if (GetTicks() - since < kWhiteMs) return;
    find(kRcuiFullScreen).hide();
    MW::isDisplayUpdate(1);
  }

 private:
  struct Entry {
    MW::RcuiKind kind;
    bool isShown;
    SKIA_Rect place;  // x and w in columns of ten, y and h in per cent of the content's height
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

  // What the buttons do.
  enum Use { kTimed, kWhite, kDialog, kWords, kUses };

  static void note(Use use) { Self::get().used.at(use) = true; }

  template <Use use>
  static void open(MW::RcuiKind kind) {
    note(use);
    find(kind).setActive(1);
    MW::isDisplayUpdate(1);
  }

  static void whiten(int) {
    Self::get().whiteSince = GetTicks();
    open<kWhite>(kRcuiFullScreen);
  }

  static void showTimed(int) {
    note(kTimed);
    find(kRcuiToastbox).onHideTimer(kShowMs);
    find(kRcuiProgressbar).onProgressbar(kShowMs);
  }

  // Button 1 leaves a dialog where it is.
  static void closeDialogs(int) {
    find(kRcuiDialog).hide();
    find(kRcuiDialogNew).hide();
    MW::isDisplayUpdate(1);
  }

  // Of a place in an entry's units; a line has its second end where others have their size.
  static SKIA_Rect pixelsOf(MW::RcuiKind kind, const SKIA_Rect& place) {
    constexpr int kColumnPercent = 10;
    const SKIA_Rect area = contentArea();
    const bool isLine = kind == kRcuiLine;
    return {area.x + percentOf(area.w, place.x * kColumnPercent),
            area.y + percentOf(area.h, place.y),
            percentOf(area.w, place.w * kColumnPercent) + (isLine ? area.x : 0),
            percentOf(area.h, place.h) + (isLine ? area.y : 0), place.color};
  }

  void build(const Entry& entry) {
    std::array<SKIA_Text, kTexts> texts;
    std::ranges::transform(entry.texts, texts.begin(), [](const char* words) {
      return captionOf(words != nullptr ? tr(words) : "", MW::kColorWhite);
    });
    MW::ref_t ref;
    ref.kind = entry.kind;
    ref.dialogKind = MW::Dialog::kRetryTest;
    ref.visible = entry.isShown ? 1 : 0;
    ref.cbIndex = 1;
    ref.rect = pixelsOf(entry.kind, entry.place);
    ref.lineWidth = kLineWidth;
    ref.text = captionOf(tr(entry.words),
                         entry.place.color == kBarColor ? MW::kColorBlack : MW::kColorWhite);
    ref.desc = entry.texts.front() != nullptr ? texts.data() : nullptr;
    built.push_back(std::make_unique<MW::WidgetRcui>(&ref, &entry.callbacks, MW::kUnused));
    if (ref.index > 0) MW::WidgetList::show(ref.index);
  }

  Current<DescriptorTest> current{this};
  std::atomic<Outcome> chosen = Outcome::Running;
  std::array<std::atomic<bool>, kUses> used = {};
  std::atomic<uint32_t> whiteSince = 0;  // GetTicks() milliseconds
  std::vector<std::unique_ptr<MW::WidgetRcui>> built;
};

// Widgets come after the pictures, dialogs last.
const std::vector<DescriptorTest::Entry> DescriptorTest::kEntries = {
    {kRcuiTextbox, true, {0, 0, 10, 100, kPanelInk.ground}, ""},
    {kRcuiBox, true, {0, 0, 10, 7, kHeadInk.ground}, ""},
    {kRcuiLabel, true, {0, 0, 10, 7, 0}, msg("Built from descriptors")},
    {kRcuiLine, true, {1, 8, 9, 8, kBarColor}, ""},
    {kRcuiFirstInColumn, true, {1, 9, 8, 8, kBarColor}, msg("Each of them does something.")},
    {kRcuiNextInColumn, true, kNoPlace, msg("Then leave, or give a verdict.")},
    {kRcuiButton, true, {1, 27, 3, 16, kBarColor}, msg("Toast"), {.cbClick = showTimed}},
    {kRcuiButton, true, {6, 27, 3, 16, kBarColor}, msg("White"), {.cbClick = whiten}},
    {kRcuiButton,
     true,
     {1, 45, 3, 16, kBarColor},
     msg("Dialog"),
     {.cbClick = [](int) { open<kDialog>(kRcuiDialog); }}},
    {kRcuiButton,
     true,
     {6, 45, 3, 16, kBarColor},
     msg("Words"),
     {.cbClick = [](int) { open<kWords>(kRcuiDialogNew); }}},
    {kRcuiSlideFromLeft,
     true,
     {1, 62, 8, 10, kBarColor},
     msg("Slide to pass"),
     {.cbTouchRelease = choose<Outcome::Pass>}},
    {kRcuiSlideFromRight,
     true,
     {1, 73, 8, 10, kBarColor},
     msg("Slide to leave"),
     {.cbTouchRelease = choose<Outcome::Left>}},
    {kRcuiToastbox,
     false,
     {1, 84, 8, 7, kHeadInk.ground},
     msg("A toast"),
     {},
     {msg("with a second line")}},
    {kRcuiProgressbar, false, {1, 92, 8, 4, kHeadInk.ground}, msg("Two seconds")},
    {kRcuiDialog, false, {}, "", {.cbTouchRelease = closeDialogs}},
    {kRcuiDialogNew,
     false,
     {},
     msg("Words of its own"),
     {.cbTouchRelease = closeDialogs},
     {msg("from a descriptor"), msg("in two lines"), "", msg("OK"), ""}},
    {kRcuiFullScreen, false, {}, ""},
};

}  // namespace

std::unique_ptr<Test> makeDescriptors(const Context&) { return std::make_unique<DescriptorTest>(); }

}  // namespace factory_test
