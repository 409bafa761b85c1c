#include "golden/golden_cases.h"

#include <brimol/frame.h>

#include <algorithm>
#include <iterator>

#include "support/widget_test.h"

namespace brimol::test {

namespace {

SKIA_Text textOf(const std::string& words, int32_t size, uint32_t color = MW::kColorWhite,
                 int32_t align = SKIA_ALIGN_LEFT) {
  return textRecord(words, color, align, size);
}

constexpr ScreenSize kSmall = {360, 240};
constexpr ScreenSize kStrip = {720, 160};
constexpr ScreenSize kPhone = {720, 1280};

constexpr SKIA_Rect kArea = {40, 60, 280, 80, 0xFF00A000};
constexpr SKIA_Rect kTrack = {60, 20, 600, 120, 0xFF808000};
constexpr SKIA_Rect kPage = {0, 0, 360, 240, 0xFFE0E0E0};
constexpr SKIA_Rect kPad = {20, 20, 200, 400, 0xFFB0C0D0};
constexpr Spot kInside = {100, 100};  // the area and the left end of the track
constexpr Spot kOnThumb = {720, 940};
const SKIA_Text kTitle = textOf("Saved", 40, MW::kColorWhite, SKIA_ALIGN_CENTRE);
const SKIA_Text kLetters = textOf("", 20, MW::kColorBlack);
constexpr const char* kLog = "1\nin a long list, still filling two rows\n한국어\n\n\n\n\n\n\n\n";
constexpr const char* kResults =
    "[1] 10:01 [MPDIA] Board]PASS\n[2] 10:02 [MPDIA] Power]3.9 V\n[1] 10:03\n"
    "[1] 10:04\n[1] 10:05 [MPDIA] Camera]FAIL\n[3] 10:06\n[1] 10:07\n";

// While a finger holds it where it was pressed, or has moved it from there.
void showHeld(MW::Widget&& held, Spot spot, int by = 0) {
  press(held, spot);
  if (by != 0) offer(held, {.type = MW::kEventMotion, .mouse = {1, 0, 0, 0, by, 0}});
  held.show(kNow);
}

void drawMainList(int mode) {
  MW::MainList list("Menu", mode);
  for (int row = 0; row < 5; ++row) {
    const SKIA_Text words = textOf("Row " + std::to_string(row), 50);
    list.addIndex(row % 3 + MW::MainList::kSelectable, &words, 260);
  }
  list.initFinish();
  list.setTextBattery("BAT 87%", 7);
  list.setTextBrightness("LCD 120", 7);
  list.onHover({.state = 1, .finger = 0, .x = 0, .y = 0, .xrel = 0, .yrel = -150});
  list.show(kNow);
}

// A found line stands at the top, and its rows are red.
void drawViewer() {
  MW::StaticText viewer(&kPage, &kLetters, true, true, true);
  viewer.setText(kLog);
  viewer.get_ime_result("long");
  viewer.line_search(kLog);
  viewer.show(kNow);
}

// Types a digit, a letter and the digit again.
void drawKeyboard() {
  MW::Ime keyboard(&kPage, &kLetters);
  for (const int y : {60, 100, 60}) press(keyboard, {50, y});
  keyboard.show(kNow);
}

// From the frame before, the list knows where its rows stand.
void drawResults(int tapped, int scroll) {
  MW::MpdWid list("");
  list.cal_line(kResults, INT_MAX);
  list.show(kNow);
  skia_begin_frame_c();
  MW::event_data tap = pointerEvent(MW::kEventRelease, {100, tapped});
  list.depth_cal(&tap);
  list.onHover({1, 0, 0, 0, 0, -scroll});
  list.show(kNow);
}

void drawWide() {
  MW::DialogNew dialog("Sensor", SKIA_ALIGN_CENTRE, -1);
  dialog.setDesc("Cover the sensor", "with a finger", "and look at it");
  dialog.setbutton("FAIL", "PASS");
  dialog.show(kNow);
}

void drawSelect() {
  MW::DialogSelect choice(0);
  choice.setTitle("Which side?");
  for (unsigned int i = 0; i < 5; ++i) choice.setText_str(i, std::to_string(i).c_str());
  showHeld(std::move(choice), {200, 384});
}

void drawPad() {
  MW::Button8 pad(3, &kPad, nullptr);
  press(pad, {70, 70});
  showHeld(std::move(pad), {170, 270});
}

const auto kStates = std::to_array<Case>({
    {"button_held", kSmall, [] { showHeld(MW::Button(&kArea, &kTitle), kInside); }},
    {"button8_held", {240, 440}, drawPad},
    {"slide_e_held", kStrip, [] { showHeld(MW::SlideE(0, &kTrack, &kTitle, ""), kInside, 250); }},
    {"main_list_scrolled", kPhone, [] { drawMainList(MW::MainList::kPlain); }},
    {"main_list_extended_scrolled", kPhone, [] { drawMainList(MW::MainList::kExtended); }},
    {"mpd_wid_expanded", {480, 800}, [] { drawResults(200, 0); }},
    {"mpd_wid_scrolled", {480, 800}, [] { drawResults(0, 50); }},
    {"static_text_wrapped", kSmall, drawViewer},
    {"ime_typed", kSmall, drawKeyboard},
    {"dialog_new_wide", {1280, 720}, drawWide},
    {"dialog_slide_held", {1440, 1440}, [] { showHeld(MW::DialogSlide(3), kOnThumb, -200); }},
    {"dialog_select_held", kPhone, drawSelect},
});

}  // namespace

const std::vector<Case>& goldenCases() {
  static const std::vector<Case> kCases = [] {
    std::vector<Case> cases(kStates.begin(), kStates.end());
    std::ranges::move(galleryCases(), std::back_inserter(cases));
    return cases;
  }();
  return kCases;
}

}  // namespace brimol::test
