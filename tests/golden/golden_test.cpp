// Compares what the widgets draw with golden files: the items as text, the same on every machine,
// and the picture, the same wherever the canary's is: where BRIMOL_REFERENCE_RENDERER is set it has
// to be. With --renew DIR it writes these files.
#include <MW/MW.h>
#include <brimol/display.h>
#include <brimol/input.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <iomanip>

#include "cairo_handles.h"
#include "frame_sink.h"
#include "input/input_service.h"
#include "painting.h"
#include "recorder.h"
#include "support/records.h"

// What the library asks of a platform only when it opens a window or takes input.
int EventInit(unsigned int) { return 0; }
void EventQuit() {}
void getDpi(float*, float*) {}
int skia_live_widget_c() { return 0; }

namespace brimol::pc {

static Frame recorded;
void submitFrame(Frame&& frame) { recorded = std::move(frame); }

namespace {

namespace fs = std::filesystem;

struct Case {
  const char* name;  // of its files
  Size screen;       // pixels
  void (*draw)();    // into the frame that is recorded, while GetTicks() stands at kNow
};
std::ostream& operator<<(std::ostream& out, const Case& drawn) { return out << drawn.name; }
constexpr unsigned int kNow = 1000;  // milliseconds

constexpr Size kSmall = {360, 240};
constexpr Size kStrip = {720, 160};
constexpr Size kPhone = {720, 1280};

constexpr int kLongMs = 60000;
constexpr SKIA_Rect kArea = {40, 60, 280, 80, 0xFF00A000};
constexpr SKIA_Rect kTrack = {60, 20, 600, 120, 0};
constexpr SKIA_Point kSlope = {30, 200, 330, 40, kRed, 6};
const SKIA_Text kSentence = textOf("Déjà vu 한국어 שלום", 30, kWhite, SKIA_ALIGN_RIGHT);
const SKIA_Text kTitle = textOf("Saved", 40, kWhite, SKIA_ALIGN_CENTRE);
const SKIA_Text kDetail = textOf("3 of 5 tests passed", 26, kWhite, SKIA_ALIGN_CENTRE);
const SKIA_Text kVerdict = textOf("PASS", 40, kBlack, SKIA_ALIGN_CENTRE);
const SKIA_Text kHint = textOf("hold it", 30, kBlue, SKIA_ALIGN_CENTRE);

void drawCanary() {
  skia_add_roundbox_c({6, 6, 60, 40, kRed});
  skia_add_roundbox_c({40, 20, 51, 33, 0x8000FF00});
  skia_add_line_c({70, 50, 150, 22, kBlue, 5});
  skia_add_label_c({4, 54, 90, 40, 0}, textOf("Rag 47%", 22));
  skia_add_label_c({94, 54, 64, 40, 0}, textOf("한국어", 20));
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

void drawHeldButton() {
  MW::event_data press = {.type = MW::kEventPress, .mouse = {1, 0, 100, 100, 0, 0}};
  MW::Button button(&kArea, &kTitle);
  button.onPress(&press);
  button.show();
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
    beginRecording();
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

// First the canary: it tells whether this machine renders as the one that made the pictures did.
const auto kCases = std::to_array<Case>({
    {"canary", {160, 96}, drawCanary},
    {"label", kSmall, [] { MW::Label(&kArea, &kSentence).show(); }},
    {"textbox", kSmall, [] { MW::Textbox(&kArea, &kSentence).show(); }},
    {"image", kSmall, drawImage},
    {"box", kSmall, [] { MW::Box(&kArea).show(); }},
    {"line", kSmall, [] { MW::Line(&kSlope).show(); }},
    {"button_idle", kSmall, [] { MW::Button(&kArea, &kTitle).show(); }},
    {"button_held", kSmall, drawHeldButton},
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
});

std::ostream& operator<<(std::ostream& out, const SKIA_Text& text) {
  const auto length = std::clamp<int32_t>(text.string_len, 0, SKIA_TEXT_BYTES);
  return out << std::quoted(std::string(text.text, static_cast<std::size_t>(length))) << " length "
             << text.string_len << " 0x" << std::hex << text.color << std::dec << " align "
             << text.align << " size " << text.size;
}

Frame frameOf(const Case& drawn) {
  MW::Window::width = drawn.screen.w;
  MW::Window::height = drawn.screen.h;
  inputService().takeHand(kNow);
  beginRecording();
  drawn.draw();
  endRecording();
  return recorded;
}

std::string drawnItems(const Case& drawn) {
  constexpr auto kKinds =
      std::to_array<const char*>({"label", "textbox", "buttonbox", "box", "roundbox", "staticbox",
                                  "line", "image", "roundtextbox", "roundbuttonbox", "arrow"});
  std::ostringstream out;
  for (const SKIA_Item& item : frameOf(drawn)) {
    out << kKinds.at(static_cast<std::size_t>(item.kind)) << ' ' << item.rect;
    if (item.kind == SKIA_LINE || item.kind == SKIA_ARROW) out << ' ' << item.point;
    if (item.text.string_len != 0) out << ' ' << item.text;
    out << '\n';
  }
  return out.str();
}

// On a ground, so that black and shadows are seen.
Picture drawnPicture(const Case& drawn) {
  Frame frame = frameOf(drawn);
  frame.insert(frame.begin(), boxItem({0, 0, drawn.screen.w, drawn.screen.h, 0xFF405060}));
  return painted(frame, drawn.screen);
}

fs::path fileOf(const Case& drawn, const char* suffix, const fs::path& folder = GOLDEN_DATA) {
  return folder / (std::string(drawn.name) + suffix);
}

std::string readText(const fs::path& file) {
  std::ifstream in(file);
  return {std::istreambuf_iterator<char>(in), {}};
}

// Without a size where there is no such picture.
Picture readPicture(const fs::path& file) {
  return pictureOf(CairoSurface(cairo_image_surface_create_from_png(file.c_str())).get());
}

void writePicture(Picture picture, const fs::path& file) {
  const CairoSurface surface(cairo_image_surface_create_for_data(
      reinterpret_cast<unsigned char*>(picture.pixels.data()), CAIRO_FORMAT_RGB24, picture.size.w,
      picture.size.h, picture.size.w * static_cast<int>(sizeof(uint32_t))));
  ASSERT_EQ(cairo_surface_write_to_png(surface.get(), file.c_str()), CAIRO_STATUS_SUCCESS) << file;
}

// Red where two pixels differ, and faint where they do not.
uint32_t marked(uint32_t one, uint32_t other) { return one == other ? one >> 2 & 0x3F3F3F : kRed; }

void reportPicture(const Case& drawn, const Picture& expected, const Picture& actual) {
  const fs::path folder = fs::path(GOLDEN_WORK) / "failed";
  fs::create_directories(folder);
  writePicture(expected, fileOf(drawn, ".expected.png", folder));
  writePicture(actual, fileOf(drawn, ".actual.png", folder));
  ASSERT_TRUE(actual.size == expected.size) << "pictures in " << folder;
  Picture marks = expected;
  std::ranges::transform(expected.pixels, actual.pixels, marks.pixels.begin(), marked);
  writePicture(marks, fileOf(drawn, ".difference.png", folder));
  const auto first = std::ranges::find(marks.pixels, kRed) - marks.pixels.begin();
  const auto [y, x] = std::div(static_cast<int>(first), actual.size.w);
  FAIL() << std::ranges::count(marks.pixels, kRed) << " pixels differ, first " << x << ',' << y
         << std::hex << ": expected 0x" << expected.at(x, y) << ", got 0x" << actual.at(x, y)
         << "; pictures in " << folder;
}

class Golden : public testing::TestWithParam<Case> {};

TEST_P(Golden, AddsItsItems) {
  const std::string expected = readText(fileOf(GetParam(), ".items.txt"));
  ASSERT_NE(expected, "") << "missing golden";
  EXPECT_EQ(expected, drawnItems(GetParam()));
}

TEST_P(Golden, LooksAsBefore) {
  const Case& canary = kCases.front();
  const Picture reference = readPicture(fileOf(canary, ".png"));
  const Picture expected = readPicture(fileOf(GetParam(), ".png"));
  ASSERT_TRUE(reference.size.w > 0 && expected.size.w > 0) << "missing golden";
  if (drawnPicture(canary) != reference && std::getenv("BRIMOL_REFERENCE_RENDERER") == nullptr) {
    GTEST_SKIP() << "another renderer: it paints canary.png otherwise than the reference did";
  }
  const Picture actual = drawnPicture(GetParam());
  if (actual != expected) reportPicture(GetParam(), expected, actual);
}

INSTANTIATE_TEST_SUITE_P(Widgets, Golden, testing::ValuesIn(kCases),
                         [](const auto& row) { return std::string(row.param.name); });

void renew(const fs::path& folder) {
  for (const Case& drawn : kCases) {
    const fs::path items = fileOf(drawn, ".items.txt", folder);
    EXPECT_TRUE(std::ofstream(items) << drawnItems(drawn) << std::flush) << items;
    writePicture(drawnPicture(drawn), fileOf(drawn, ".png", folder));
  }
}

}  // namespace
}  // namespace brimol::pc

int main(int argc, char** argv) {
  testing::InitGoogleTest(&argc, argv);
  if (argc != 3 || std::string_view(argv[1]) != "--renew") return RUN_ALL_TESTS();
  brimol::pc::renew(argv[2]);
  return testing::Test::HasFailure() ? 1 : 0;
}
