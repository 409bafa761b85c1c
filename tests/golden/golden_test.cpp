// Compares what the widgets draw with golden files: the items as text, the same on every machine,
// and the picture, the same wherever the canary's is: where BRIMOL_REFERENCE_RENDERER is set it has
// to be. With --renew DIR it writes these files.
#include <brimol/display.h>
#include <brimol/input.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <filesystem>
#include <fstream>

#include "golden/golden_cases.h"
#include "input/input_service.h"
#include "scene/frame_sink.h"
#include "scene/item.h"
#include "scene/recorder.h"
#include "testkit/records.h"

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
  static_assert(kKinds.size() == kItemKinds.size());
  std::ostringstream out;
  for (const SKIA_Item& item : frameOf(drawn)) {
    out << kKinds.at(static_cast<std::size_t>(item.kind)) << ' ' << item.rect;
    if (item.kind == SKIA_LINE || item.kind == SKIA_ARROW) out << ' ' << item.point;
    if (item.text.string_len != 0) out << ' ' << item.text;
    out << '\n';
  }
  return out.str();
}

// What the view shows of the frame, on a ground, so that black and shadows are seen.
Frame seen(Frame frame, const Case& drawn) {
  frame.insert(frame.begin(), boxItem({0, 0, drawn.screen.w, drawn.screen.h, 0xFF405060}));
  for (SKIA_Item& item : frame) {
    item.rect.y -= drawn.view.top;
    item.point.y1 -= drawn.view.top;
    item.point.y2 -= drawn.view.top;
  }
  return frame;
}

Picture drawnPicture(const Case& drawn) {
  const int bottom = std::min(drawn.view.bottom, drawn.screen.h);
  return painted(seen(frameOf(drawn), drawn), {drawn.screen.w, bottom - drawn.view.top});
}

fs::path fileOf(const Case& drawn, const char* suffix, const fs::path& folder = GOLDEN_DATA) {
  return folder / (std::string(drawn.name) + suffix);
}

std::string readText(const fs::path& file) {
  std::ifstream in(file);
  return {std::istreambuf_iterator<char>(in), {}};
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
  const Case& canary = goldenCases().front();
  const Picture reference = readPicture(fileOf(canary, ".png"));
  const Picture expected = readPicture(fileOf(GetParam(), ".png"));
  ASSERT_TRUE(reference.size.w > 0 && expected.size.w > 0) << "missing golden";
  if (drawnPicture(canary) != reference && std::getenv("BRIMOL_REFERENCE_RENDERER") == nullptr) {
    GTEST_SKIP() << "another renderer: it paints canary.png otherwise than the reference did";
  }
  const Picture actual = drawnPicture(GetParam());
  if (actual != expected) reportPicture(GetParam(), expected, actual);
}

INSTANTIATE_TEST_SUITE_P(Widgets, Golden, testing::ValuesIn(goldenCases()),
                         [](const auto& row) { return std::string(row.param.name); });

void renew(const fs::path& folder) {
  for (const Case& drawn : goldenCases()) {
    const fs::path items = fileOf(drawn, ".items.txt", folder);
    EXPECT_TRUE(std::ofstream(items) << drawnItems(drawn) << std::flush) << items;
    EXPECT_TRUE(writePicture(drawnPicture(drawn), fileOf(drawn, ".png", folder)));
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
