#include <MW/dialog.h>

#include <memory>

#include "support/drawings.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MW::Dialog;

constexpr unsigned int kWhite = 0xFFFFFFFF;
constexpr unsigned int kBlack = 0xFF000000;
constexpr unsigned int kBlue = 0xFF87CEFA;
constexpr unsigned int kGrey = 0xFFBFBFBF;
constexpr unsigned int kShadow = 0x7F000000;
constexpr unsigned int kAlarm = 0xFFFF0000;
constexpr int kLeft = 1;
constexpr int kCentre = 5;

// On the default screen of 1440 x 2560; the lower rows of tall and low dialogs share their height.
constexpr Spot kOnLeft = {300, 1530};
constexpr Spot kOnRight = {900, 1530};

std::string calls;
std::unique_ptr<Dialog> dialog;

class DialogTest : public WidgetTest {
 protected:
  void SetUp() override {
    WidgetTest::SetUp();
    calls.clear();
    platform().ticks = 10000;
  }
  void TearDown() override {
    dialog.reset();
    WidgetTest::TearDown();
  }
  static void open(int kind) {
    dialog = std::make_unique<Dialog>(kind);
    dialog->setActive(1);
    dialog->button1Callback = [](int value) { calls += value == 0 ? '1' : '!'; };
    dialog->button2Callback = [](int value) { calls += value == 0 ? '2' : '!'; };
  }
};

struct Frame {
  int w, h;  // of the screen
  SKIA_Rect outer, titleBar, body, title;
};

struct Layout : Row {
  Frame frame;
  int kind;
  unsigned int backdrop;
  int align;
  SKIA_Rect message;
  int messageSize;
  SKIA_Rect second;  // of no width: not drawn
  int secondSize;
  std::vector<Drawing> below;
};

class DialogLayout : public DialogTest, public testing::WithParamInterface<Layout> {};

TEST_P(DialogLayout, IsDrawnInItsOrder) {
  const Layout& at = GetParam();
  const auto& [w, h, outer, titleBar, body, title] = at.frame;
  setScreen(w, h);
  open(at.kind);
  dialog->setTitle("Title");
  dialog->setDesc("Message");
  std::vector<Drawing> expected = {
      box({0, 0, w + 1, h + 1, at.backdrop}),
      box(outer),
      box(titleBar),
      box(body),
      line({body.x, body.y, body.x + body.w, body.y, kBlue, 1}),
      label(title, {"Title", kBlue, at.align, 70}),
      label(at.message, {"Message", kWhite, at.align, at.messageSize})};
  const std::vector<Drawing> drawn = shown(*dialog);
  ASSERT_GT(drawn.size(), 7U - (at.second.w == 0 ? 1 : 0));
  if (at.second.w != 0) {
    const DrawnText words = {drawn.at(7).text.text, kWhite, at.align, at.secondSize};
    expected.push_back(label(at.second, words));
  }
  expected.insert(expected.end(), at.below.begin(), at.below.end());
  EXPECT_EQ(drawn, expected);
}

// Two buttons of one size, at these places.
std::vector<Drawing> buttons(Spot left, Spot right, Spot size, int textSize) {
  std::vector<Drawing> drawn;
  for (const auto& [at, words] : {std::pair(left, "OK"), std::pair(right, "CANCEL")}) {
    drawn.push_back(roundBox({at.x - 1, at.y - 1, size.x + 2, size.y + 2, kBlack}));
    drawn.push_back(
        roundTextbox({at.x, at.y, size.x, size.y, kWhite}, {words, kBlack, kCentre, textSize}));
  }
  return drawn;
}

// clang-format off
constexpr Frame kTall1440 = {1440, 2560, {144, 935, 1152, 690, kGrey}, {145, 936, 1150, 230, kBlack}, {145, 1166, 1150, 228, kBlack}, {164, 945, 1112, 210, 0}};
constexpr Frame kLow1440 = {1440, 2560, {144, 1050, 1152, 460, kGrey}, {145, 1051, 1150, 230, kBlack}, {145, 1281, 1150, 228, kBlack}, {164, 1060, 1112, 210, 0}};
constexpr Frame kTall1080 = {1080, 1920, {108, 702, 864, 516, kGrey}, {109, 703, 862, 172, kBlack}, {109, 875, 862, 170, kBlack}, {128, 712, 824, 152, 0}};
constexpr Frame kTallOdd = {1081, 1921, {108, 702, 864, 516, kGrey}, {109, 703, 862, 172, kBlack}, {109, 875, 862, 170, kBlack}, {128, 712, 824, 152, 0}};
constexpr Frame kTall720 = {720, 1280, {72, 467, 576, 345, kGrey}, {73, 468, 574, 115, kBlack}, {73, 583, 574, 113, kBlack}, {92, 477, 536, 95, 0}};
constexpr Frame kLow720 = {720, 1280, {72, 525, 576, 230, kGrey}, {73, 526, 574, 115, kBlack}, {73, 641, 574, 113, kBlack}, {92, 535, 536, 95, 0}};
constexpr Frame kTallWide = {2560, 1440, {704, 375, 1152, 690, kGrey}, {705, 376, 1150, 230, kBlack}, {705, 606, 1150, 228, kBlack}, {724, 385, 1112, 210, 0}};
constexpr Frame kLowWide = {2560, 1440, {704, 490, 1152, 460, kGrey}, {705, 491, 1150, 230, kBlack}, {705, 721, 1150, 228, kBlack}, {724, 500, 1112, 210, 0}};

const auto kButtons1440 = buttons({154, 1400}, {725, 1400}, {561, 220}, 80);
const auto kButtons1080 = buttons({118, 1051}, {545, 1051}, {417, 162}, 60);
const auto kButtons720 = buttons({82, 702}, {365, 702}, {273, 105}, 40);
const auto kButtonsWide = buttons({714, 840}, {1285, 840}, {561, 220}, 80);
const std::vector<Drawing> kOneButton1080 = {roundBox({117, 1050, 846, 164, kBlack}), roundTextbox({118, 1051, 844, 162, kWhite}, {"OK", kBlack, kCentre, 60})};
const std::vector<Drawing> kProgress1440 = {box({153, 1399, 1134, 222, kBlack}), textbox({154, 1400, 1132, 220, kWhite}, {"*", kBlack, kCentre, 80})};

INSTANTIATE_TEST_SUITE_P(
    ScreensAndClasses, DialogLayout,
    testing::Values(
        Layout{{"Standard1440"}, kTall1440, 0, kShadow, kLeft, {154, 1175, 1132, 210, 0}, 60, {}, 0, kButtons1440},
        Layout{{"Standard1080"}, kTall1080, 0, kShadow, kLeft, {118, 884, 844, 152, 0}, 60, {}, 0, kButtons1080},
        Layout{{"Standard720"}, kTall720, 0, kShadow, kLeft, {82, 592, 556, 95, 0}, 60, {}, 0, kButtons720},
        Layout{{"StandardWide"}, kTallWide, 0, kShadow, kLeft, {714, 615, 1132, 210, 0}, 60, {}, 0, kButtonsWide},
        Layout{{"StandardOdd"}, kTallOdd, 0, kShadow, kLeft, {118, 884, 844, 152, 0}, 60, {}, 0, kButtons1080},
        Layout{{"TwoLine"}, kTall1440, 4, kShadow, kLeft, {154, 1175, 1132, 69, 0}, 54, {154, 1290, 1132, 69, 0}, 54, kButtons1440},
        Layout{{"Hook"}, kLow1440, 13, kShadow, kLeft, {154, 1290, 1132, 210, 0}, 60, {}, 0, {}},
        Layout{{"Earjack"}, kLow720, 14, kShadow, kLeft, {82, 650, 556, 34, 0}, 34, {82, 707, 556, 34, 0}, 34, {}},
        Layout{{"OkOnly"}, kTall1080, 15, kShadow, kCentre, {118, 884, 844, 152, 0}, 51, {}, 0, kOneButton1080},
        Layout{{"TouchWarning"}, kTall1440, 23, kAlarm, kCentre, {154, 1175, 1132, 210, 0}, 60, {}, 0, kProgress1440},
        Layout{{"TouchCaution"}, kTall1440, 24, kAlarm, kCentre, {154, 1175, 1132, 69, 0}, 54, {154, 1290, 1132, 69, 0}, 54, kProgress1440},
        Layout{{"Wait"}, kLowWide, 38, kShadow, kLeft, {714, 730, 1132, 210, 0}, 60, {}, 0, {}}),
    rowName);
// clang-format on

struct KindCase {
  int kind, number;  // of its class
  const char *title, *message;
  int size;
  const char* second;  // null: not drawn
  int secondSize;
  std::vector<const char*> captions;
  const char *left, *right;  // what a release on the left and on the right half answers
};

std::string kindName(const testing::TestParamInfo<KindCase>& info) {
  const long long kind = info.param.kind;
  return (kind < 0 ? "Minus" : "Kind") + std::to_string(kind < 0 ? -kind : kind);
}

class DialogKinds : public DialogTest, public testing::WithParamInterface<KindCase> {};

TEST_P(DialogKinds, SayAndAnswerWhatTheyShould) {
  const KindCase& row = GetParam();
  open(row.kind);
  EXPECT_EQ(Dialog::isType(row.kind), row.number);
  std::vector<std::pair<std::string, int>> expected = {{row.title, 70}, {row.message, row.size}};
  if (row.second != nullptr) expected.emplace_back(row.second, row.secondSize);
  for (const char* const caption : row.captions) expected.emplace_back(caption, 80);
  std::vector<std::pair<std::string, int>> drawn;
  for (const Drawing& each : shown(*dialog)) {
    if (each.text.size != 0) drawn.emplace_back(each.text.text, each.text.size);
  }
  EXPECT_EQ(drawn, expected);
  release(*dialog, kOnLeft);
  EXPECT_EQ(calls, row.left);
  calls.clear();
  release(*dialog, kOnRight);
  EXPECT_EQ(calls, row.right);
}

constexpr const char* kJig = "after put the phone on the 20cm JIG";
const std::vector<const char*> kOkCancel = {"OK", "CANCEL"};
const std::vector<const char*> kRetryCancel = {"RETRY", "CANCEL"};
const std::vector<const char*> kOk = {"OK"};
const std::vector<const char*> kStar = {"*"};

// clang-format off
INSTANTIATE_TEST_SUITE_P(
    Catalogue, DialogKinds,
    testing::Values(
        KindCase{0, 0, "Test Fail", "Do you want to exit?", 60, nullptr, 0, kOkCancel, "1", "2"},
        KindCase{1, 0, "Check Test Result", "Select PASS or FAIL", 60, nullptr, 0, {"PASS", "FAIL"}, "1", "2"},
        KindCase{2, 0, "RETRY", "Do you want to retry test?", 60, nullptr, 0, kOkCancel, "1", "2"},
        KindCase{3, 0, "Test Off", "previous screen", 60, nullptr, 0, kOkCancel, "1", "2"},
        KindCase{4, 1, "Calibrate sensor?", "Put the device on the flat place", 54, "before trying calibration.", 54, kOkCancel, "1", "2"},
        KindCase{5, 1, "Calibration Fail!", "Put the device on the flat place", 54, "before trying calibration.", 54, kRetryCancel, "1", "2"},
        KindCase{6, 4, "Invalid Gyro Init Value", "Calibrate Gyro Sensor", 54, nullptr, 0, kOk, "1", "12"},
        KindCase{7, 0, "Calibrate Gyro sensor?", "Calibrate Gyro Sensor Using OK Button", 54, nullptr, 0, kOkCancel, "1", "2"},
        KindCase{8, 1, "Calibrate Gyro Sensor?", "Calibration Fail!", 54, "Calibrate Gyro Sensor Using RETRY Button", 54, kRetryCancel, "1", "2"},
        KindCase{9, 1, "Calibrate A+?", "Push the OK button", 54, kJig, 54, kOkCancel, "1", "2"},
        KindCase{10, 1, "A+ Proxy Calibrate Fail!", "Push the Retry button", 54, kJig, 54, kRetryCancel, "1", "2"},
        KindCase{11, 1, "A+ Checksum Fail!", "Push the Retry button", 54, kJig, 54, kRetryCancel, "1", "2"},
        KindCase{12, 0, "Smart Factory Reset?", "Start Factory Reset", 60, nullptr, 0, kOkCancel, "1", "2"},
        KindCase{13, 2, "Hook Key Test", "Please Push Hook Key !", 60, nullptr, 0, {}, "", ""},
        KindCase{14, 3, "Earjack Retry", "Please reequipment Earjack,", 69, "If you want to test earjack.", 69, {}, "", ""},
        KindCase{15, 4, "Auto Touch Test", "Don't touch screen after push ok button", 51, nullptr, 0, kOk, "1", "1"},
        KindCase{16, 0, "Reboot?", "Brimol --> Normal boot", 60, nullptr, 0, kOkCancel, "1", "2"},
        KindCase{17, 0, "Reboot?", "TORV --> All Auto Test", 60, nullptr, 0, kOkCancel, "1", "2"},
        KindCase{18, 0, "Warning", "Power off the device", 60, nullptr, 0, kOkCancel, "1", "2"},
        KindCase{19, 4, "Key Test retry", "two_key clicked at the same time", 60, nullptr, 0, kOk, "1", "1"},
        KindCase{20, 0, "Warning", "Test already Pass.", 60, nullptr, 0, kOkCancel, "1", "2"},
        KindCase{21, 0, "Warning", "Test already pass.", 60, nullptr, 0, kOkCancel, "1", "2"},
        KindCase{23, 5, "Auto Touch Test", "Don't touch the screen!", 60, nullptr, 0, kStar, "1", "1"},
        KindCase{24, 6, "Auto Touch Test", "caution", 54, "Don't touch screen after push ok button", 54, kStar, "1", "12"},
        KindCase{25, 0, "Full Retry?", "Self Diagnosis", 60, nullptr, 0, kOkCancel, "1", "2"},
        KindCase{26, 4, "WIFI_TEST", "Please click the ok button", 60, nullptr, 0, kOk, "1", "1"},
        KindCase{27, 4, "Check self-d test", "Self-d test is fail or running", 60, nullptr, 0, kOk, "1", "1"},
        KindCase{28, 4, "WARNING!!", "Proceed with All Tests except CapSensor", 60, nullptr, 0, kOk, "1", "1"},
        KindCase{29, 4, "WARNING", "Pre GPS Test running!!", 60, nullptr, 0, kOk, "1", "1"},
        KindCase{30, 4, "Check self-d test", "Self-d test is running", 60, nullptr, 0, kOk, "1", "1"},
        KindCase{31, 4, "Check AIO test", "CapSensor or GPS/WIFI or Touch fail", 60, nullptr, 0, kOk, "1", "1"},
        KindCase{32, 4, "Touch Firmware Upgrade", "Complete!!", 51, nullptr, 0, kOk, "1", "1"},
        KindCase{33, 0, "SNIFF RETRANS", "Do you want to sniff retrans?", 60, nullptr, 0, kOkCancel, "1", "2"},
        KindCase{34, 0, "SNIFF MID UPDATE", "Do you want to mid update?", 60, nullptr, 0, kOkCancel, "1", "2"},
        KindCase{35, 4, "Slimport FW update is Finished.", "Please reconnect R1.", 60, nullptr, 0, kOk, "1", "1"},
        KindCase{36, 4, "Warning", "Socket Fail, re-enter the Test!!", 60, nullptr, 0, kOk, "1", "1"},
        KindCase{37, 4, "AUTO VR TEST", "Please wait after push ok button", 60, nullptr, 0, kOk, "1", "1"},
        KindCase{38, 7, "AUTO VR TEST", "Please wait for the end of test!", 60, nullptr, 0, {}, "", ""},
        KindCase{39, 0, "Error : Light Sensor", "Do you want to exit?", 60, nullptr, 0, kOkCancel, "1", "2"}),
    kindName);

INSTANTIATE_TEST_SUITE_P(
    Unknown, DialogKinds,
    testing::Values(
        KindCase{22, 0, "", "", 60, nullptr, 0, {"", ""}, "1", "2"},
        KindCase{40, 0, "", "", 60, nullptr, 0, {"", ""}, "1", "2"},
        KindCase{-1, 0, "", "", 60, nullptr, 0, {"", ""}, "1", "2"},
        KindCase{INT_MIN, 0, "", "", 60, nullptr, 0, {"", ""}, "1", "2"},
        KindCase{INT_MAX, 0, "", "", 60, nullptr, 0, {"", ""}, "1", "2"}),
    kindName);
// clang-format on

TEST_F(DialogTest, TakesAnyScreen) {
  for (const int w : kHostileSizes) {
    for (const int h : kHostileSizes) {
      setScreen(w, h);
      Dialog standard(0);
      EXPECT_EQ(shown(standard).size(), 11U);
      Dialog progress(24);
      EXPECT_EQ(shown(progress).back().text.text, "*") << w << ' ' << h;
    }
  }
}

}  // namespace
