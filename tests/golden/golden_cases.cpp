#include "golden/golden_cases.h"

#include <brimol/frame.h>

#include "support/widget_test.h"

namespace brimol::test {

namespace {

constexpr uint32_t kBlack = MW::kColorBlack;
constexpr uint32_t kWhite = MW::kColorWhite;
constexpr uint32_t kRed = 0xFFFF0000;
constexpr uint32_t kBlue = 0xFF0000FF;

SKIA_Text textOf(const std::string& words, int32_t size = 20, uint32_t color = kWhite,
                 int32_t align = SKIA_ALIGN_LEFT) {
  return textRecord(words, color, align, size);
}

constexpr ScreenSize kSmall = {360, 240};
constexpr ScreenSize kStrip = {720, 160};
constexpr ScreenSize kPhone = {720, 1280};

constexpr int kLongMs = 60000;
constexpr SKIA_Rect kArea = {40, 60, 280, 80, 0xFF00A000};
constexpr SKIA_Rect kTrack = {60, 20, 600, 120, 0xFF808000};
constexpr SKIA_Point kSlope = {30, 200, 330, 40, kRed, 6};
constexpr SKIA_Rect kPage = {0, 0, 360, 240, 0xFFE0E0E0};
constexpr SKIA_Rect kPad = {20, 20, 200, 400, 0xFFB0C0D0};
constexpr Spot kInside = {100, 100};  // the area and the left end of the track
constexpr Spot kOnThumb = {720, 940};
const SKIA_Text kSentence = textOf("Déjà vu 한국어 שלום", 30, kWhite, SKIA_ALIGN_RIGHT);
const SKIA_Text kTitle = textOf("Saved", 40, kWhite, SKIA_ALIGN_CENTRE);
const SKIA_Text kDetail = textOf("3 of 5 tests passed", 26, kWhite, SKIA_ALIGN_CENTRE);
const SKIA_Text kVerdict = textOf("PASS", 40, kBlack, SKIA_ALIGN_CENTRE);
const SKIA_Text kLetters = textOf("", 20, kBlack);
constexpr const char* kLog = "1\nin a long list, still filling two rows\n한국어\n\n\n\n\n\n\n\n";
constexpr const char* kResults =
    "[1] 10:01 [MPDIA] Board]PASS\n[2] 10:02 [MPDIA] Power]3.9 V\n[1] 10:03\n"
    "[1] 10:04\n[1] 10:05 [MPDIA] Camera]FAIL\n[3] 10:06\n[1] 10:07\n";
const SKIA_Text kHint = textOf("hold it", 30, kBlue, SKIA_ALIGN_CENTRE);

// While a finger holds it where it was pressed, or has moved it from there.
void showHeld(MW::Widget&& held, Spot spot, int by = 0) {
  press(held, spot);
  if (by != 0) offer(held, {.type = MW::kEventMotion, .mouse = {1, 0, 0, 0, by, 0}});
  held.show(kNow);
}

// By way of the display-item table: on its own it draws its name.
void drawImage() {
  const SKIA_Text name = textOf("test_card.png");
  const SKIA_Rect area = {80, 30, 200, 180, 0};
  MW::WidgetList::init();
  MW::WidgetList::show(MW::Image(&area, &name).add_MWWList());
  MW::WidgetList::show();
  MW::WidgetList::destroy();
}

void drawToastbox(MW::Toastbox&& toast) {
  toast.onHideTimer(kLongMs);
  toast.show(kNow);
}

// The frames before the last one are dropped.
void drawProgressbar() {
  MW::Progressbar bar(0, &kArea, &kTitle);
  bar.onProgressbar(kLongMs);
  for (const unsigned int ms : {0U, 101U, 202U}) {
    skia_begin_frame_c();
    bar.show(kNow + ms);
  }
}

void drawLockedSlide() {
  MW::Slide slide(0, &kTrack, &kVerdict, nullptr);
  slide.Lock();
  slide.show();
}

void drawMainList(int mode, int scroll) {
  MW::MainList list("Menu", mode);
  for (int row = 0; row < 5; ++row) {
    const SKIA_Text words = textOf("Row " + std::to_string(row), 50);
    list.addIndex(row % 3 + MW::MainList::kSelectable, &words, 260);
  }
  list.initFinish();
  list.setTextBattery("BAT 87%", 7);
  list.setTextBrightness("LCD 120", 7);
  list.onHover({.state = 1, .finger = 0, .x = 0, .y = 0, .xrel = 0, .yrel = -scroll});
  list.show(kNow);
}

// A found line stands at the top, and its rows are red.
void drawViewer(const char* log) {
  MW::StaticText viewer(&kPage, &kLetters, true, true, true);
  viewer.setText(log);
  viewer.get_ime_result("long");
  viewer.line_search(log);
  viewer.show(kNow);
}

// Types digits, and letters where the layout takes them.
void drawKeyboard(unsigned int layout) {
  MW::Ime keyboard(&kPage, &kLetters);
  keyboard.presskey_set(layout);
  keyboard.keyboard_change(layout);
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

void drawNew(const char* second, const char* left, const char* right, bool isBusy = false) {
  MW::DialogNew dialog("Sensor", SKIA_ALIGN_CENTRE, -1);
  dialog.setDesc("Cover the sensor", second, "and look at it");
  dialog.setbutton(left, right);
  if (isBusy) dialog.setProgress(0);
  dialog.show(kNow);
}

void drawList() {
  MW::DialogList list("Which lens?");
  for (const char* const lens : {"Main", "Wide", "Tele", "Front"}) list.addIndex(lens);
  list.initFinish(2);
  list.show(kNow);
}

void drawShell() {
  MW::DialogShell shell("uname -a");
  for (const char* const line : {"Linux phone 4.9", "aarch64", "한국어"}) shell.addShell(line);
  shell.show(kNow);
}

void drawWarn() {
  MW::DialogWarn page(0xFFC00000);
  page.setText(0, kArea, kTitle);
  page.show(kNow);
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

void drawFramed() {
  MW::ButtonNew button(2, &kArea, &kTitle);
  button.setBdColor(kRed);
  button.setBdWidth(6);
  button.show();
}

// One below the other; the column's second one stands below the first, whatever its own place.
void drawDescriptors() {
  MW::ref_t ref = {.visible = 1, .rect = {20, 20, 320, 50, 0xFF00A000}, .text = kVerdict};
  MW::WidgetList::init();
  for (const int kind : {18, 0, 8, 7, 15, 22}) {
    ref.kind = kind;
    const MW::WidgetRcui built(&ref, nullptr, 0);
    MW::Window::show(kNow);
    ref.rect.y += 60;
  }
  MW::WidgetList::show();
  MW::WidgetList::destroy();
}

const auto kCases = std::to_array<Case>({
    {"label", kSmall, [] { MW::Label(&kArea, &kSentence).show(); }},
    {"textbox", kSmall, [] { MW::Textbox(&kArea, &kSentence).show(); }},
    {"image", kSmall, drawImage},
    {"box", kSmall, [] { MW::Box(&kArea).show(); }},
    {"line", kSmall, [] { MW::Line(&kSlope).show(); }},
    {"button_idle", kSmall, [] { MW::Button(&kArea, &kTitle).show(); }},
    {"button_held", kSmall, [] { showHeld(MW::Button(&kArea, &kTitle), kInside); }},
    {"button3_one_caption", kSmall, [] { MW::Button3(1, &kVerdict, 10).show(); }},
    {"button3_two_captions", kSmall, [] { MW::Button3(8, &kVerdict, &kHint, 0).show(); }},
    {"toastbox_one_line", kSmall, [] { drawToastbox(MW::Toastbox(&kArea, &kTitle)); }},
    {"toastbox_two_lines", kSmall, [] { drawToastbox(MW::Toastbox(&kArea, &kTitle, &kDetail)); }},
    {"progressbar_three_steps", kSmall, drawProgressbar},
    {"slide_left", kStrip, [] { MW::Slide(0, &kTrack, &kVerdict, nullptr).show(); }},
    {"slide_right", kStrip, [] { MW::Slide(1, &kTrack, &kVerdict, &kHint).show(); }},
    {"slide_locked", kStrip, drawLockedSlide},
    {"slide_v", kStrip, [] { MW::SlideV(0, &kTrack, &kVerdict, &kHint).show(); }},
    {"full_screen_red", kSmall, [] { MW::FullScreen(1).show(); }},
    {"main_list", kPhone, [] { drawMainList(0, 0); }},
    {"main_list_scrolled", kPhone, [] { drawMainList(0, 150); }},
    {"main_list_extended", kPhone, [] { drawMainList(1, 0); }},
    {"main_list_extended_scrolled", kPhone, [] { drawMainList(1, 150); }},
    {"dialog_0", kPhone, [] { MW::Dialog(0).show(kNow); }},
    {"dialog_8", kPhone, [] { MW::Dialog(8).show(kNow); }},
    {"dialog_13", kPhone, [] { MW::Dialog(13).show(kNow); }},
    {"dialog_15", kPhone, [] { MW::Dialog(15).show(kNow); }},
    {"dialog_24", kPhone, [] { MW::Dialog(24).show(kNow); }},
    {"dialog_38", kPhone, [] { MW::Dialog(38).show(kNow); }},
    {"dialog_new_lines", kPhone, [] { drawNew("with a finger", nullptr, nullptr); }},
    {"dialog_new_one_button", kPhone, [] { drawNew(nullptr, "OK", nullptr); }},
    {"dialog_new_two_buttons", kPhone, [] { drawNew("with a finger", "FAIL", "PASS"); }},
    {"dialog_new_wide", {1280, 720}, [] { drawNew("with a finger", "FAIL", "PASS"); }},
    {"dialog_new_progress", kPhone, [] { drawNew(nullptr, nullptr, nullptr, true); }},
    {"dialog_list", {1440, 1440}, drawList},
    {"dialog_shell", kPhone, drawShell},
    {"dialog_slide", {1440, 1440}, [] { showHeld(MW::DialogSlide(3), kOnThumb, -200); }},
    {"dialog_warn", kSmall, drawWarn},
    {"dialog_select", kPhone, drawSelect},
    {"static_text", kSmall, [] { drawViewer(kLog); }},
    {"static_text_empty", kSmall, [] { drawViewer(""); }},
    {"ime_small", kSmall, [] { drawKeyboard(MW::Ime::kSmall); }},
    {"ime_capitals", kSmall, [] { drawKeyboard(MW::Ime::kCapitals); }},
    {"ime_special", kSmall, [] { drawKeyboard(MW::Ime::kSpecial); }},
    {"ime_digits", kSmall, [] { drawKeyboard(MW::Ime::kOnlyDigits); }},
    {"mpd_wid", {480, 800}, [] { drawResults(0, 0); }},
    {"mpd_wid_expanded", {480, 800}, [] { drawResults(200, 0); }},
    {"mpd_wid_scrolled", {480, 800}, [] { drawResults(0, 50); }},
    {"button_s_text_box", kSmall, [] { MW::ButtonS(1, &kArea, &kTitle).show(); }},
    {"button_new_button_box", kSmall, [] { MW::ButtonNew(0, &kArea, &kTitle).show(); }},
    {"button_new_framed", kSmall, drawFramed},
    {"button8", {240, 440}, drawPad},
    {"slide_e_left", kStrip, [] { MW::SlideE(0, &kTrack, &kTitle, "").show(kNow); }},
    {"slide_e_right", kStrip, [] { MW::SlideE(1, &kTrack, &kTitle, "").show(kNow); }},
    {"slide_e_held", kStrip, [] { showHeld(MW::SlideE(0, &kTrack, &kTitle, ""), kInside, 250); }},
    {"slide_move_value", kStrip, [] { MW::SlideMove(&kTrack, 0, 0, 200, 150).show(kNow); }},
    {"slide_move_plain", kStrip, [] { MW::SlideMove(&kTrack, 10, 0, 100, 30).show(kNow); }},
    {"widget_rcui", {360, 560}, drawDescriptors},
});

}  // namespace

std::span<const Case> goldenCases() { return kCases; }

}  // namespace brimol::test
