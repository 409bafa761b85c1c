#include <MW/dialog.h>

#include <memory>

#include "support/drawings.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MW::Dialog;

constexpr unsigned int kWhite = 0xFFFFFFFF;
constexpr unsigned int kBlack = 0xFF000000;
constexpr unsigned int kBlue = 0xFF87CEFA;
constexpr unsigned int kHeld = 0xFF87CEFA;
constexpr unsigned int kShadow = 0x7F000000;
constexpr unsigned int kAlarm = 0xFFFF0000;
constexpr int kLeft = 1;
constexpr int kCentre = 5;

// On the default screen of 1440 x 2560; the lower rows of tall and low dialogs share their height.
constexpr Spot kOnLeft = {300, 1530};
constexpr Spot kOnRight = {900, 1530};
constexpr Spot kBeside = {10, 10};

std::string calls;
std::unique_ptr<Dialog> dialog;

void noteButtons() {
  dialog->button1Callback = [](int value) { calls += value == 0 ? '1' : '!'; };
  dialog->button2Callback = [](int) { calls += dialog->isActive() ? '!' : '2'; };
}

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
    noteButtons();
    platform().takeLog();
  }
};

struct Layout : Row {
  int w, h, kind;
  SKIA_Rect backdrop, frame, titleBar, body;
  int lineLeft, lineRight;  // in the body's first row
  SKIA_Rect title, message;
  int messageSize, align;
  SKIA_Rect second;  // of no width: not drawn
  int secondSize;
  std::vector<Drawing> below;
};

class DialogLayout : public DialogTest, public testing::WithParamInterface<Layout> {};

TEST_P(DialogLayout, IsDrawnInItsOrder) {
  const Layout& at = GetParam();
  setScreen(at.w, at.h);
  open(at.kind);
  dialog->setTitle("Title");
  dialog->setDesc("Message");
  std::vector<Drawing> expected = {
      box(at.backdrop),
      box(at.frame),
      box(at.titleBar),
      box(at.body),
      line({at.lineLeft, at.body.y, at.lineRight, at.body.y, kBlue, 1}),
      label(at.title, {"Title", kBlue, at.align, 70}),
      label(at.message, {"Message", kWhite, at.align, at.messageSize})};
  std::vector<Drawing> drawn = shown(*dialog);
  if (at.second.w != 0) {
    ASSERT_GT(drawn.size(), 7U);
    const DrawnText words = {drawn.at(7).text.text, kWhite, at.align, at.secondSize};
    expected.push_back(label(at.second, words));
  }
  expected.insert(expected.end(), at.below.begin(), at.below.end());
  EXPECT_EQ(drawn, expected);
}

// Two buttons in row `y`, and one whose caption is a row of stars or a word.
std::vector<Drawing> twoButtons(const SKIA_Rect& left, const SKIA_Rect& right, int size) {
  return {roundBox({left.x - 1, left.y - 1, left.w + 2, left.h + 2, kBlack}),
          roundTextbox(left, {"OK", kBlack, kCentre, size}),
          roundBox({right.x - 1, right.y - 1, right.w + 2, right.h + 2, kBlack}),
          roundTextbox(right, {"CANCEL", kBlack, kCentre, size})};
}
const std::vector<Drawing> kProgress1440 = {
    box({153, 1399, 1134, 222, kBlack}),
    textbox({154, 1400, 1132, 220, kWhite}, {"*", kBlack, kCentre, 80})};

INSTANTIATE_TEST_SUITE_P(
    Standard, DialogLayout,
    testing::Values(
        Layout{"Tall1440",
               1440,
               2560,
               0,
               {0, 0, 1441, 2561, kShadow},
               {144, 935, 1152, 690, 0xFFBFBFBF},
               {145, 936, 1150, 230, kBlack},
               {145, 1166, 1150, 228, kBlack},
               145,
               1295,
               {164, 945, 1112, 210, 0},
               {154, 1175, 1132, 210, 0},
               60,
               kLeft,
               {},
               0,
               twoButtons({154, 1400, 561, 220, kWhite}, {725, 1400, 561, 220, kWhite}, 80)},
        Layout{"Tall1080",
               1080,
               1920,
               0,
               {0, 0, 1081, 1921, kShadow},
               {108, 702, 864, 516, 0xFFBFBFBF},
               {109, 703, 862, 172, kBlack},
               {109, 875, 862, 170, kBlack},
               109,
               971,
               {128, 712, 824, 152, 0},
               {118, 884, 844, 152, 0},
               60,
               kLeft,
               {},
               0,
               twoButtons({118, 1051, 417, 162, kWhite}, {545, 1051, 417, 162, kWhite}, 60)},
        Layout{"Tall720",
               720,
               1280,
               0,
               {0, 0, 721, 1281, kShadow},
               {72, 467, 576, 345, 0xFFBFBFBF},
               {73, 468, 574, 115, kBlack},
               {73, 583, 574, 113, kBlack},
               73,
               647,
               {92, 477, 536, 95, 0},
               {82, 592, 556, 95, 0},
               60,
               kLeft,
               {},
               0,
               twoButtons({82, 702, 273, 105, kWhite}, {365, 702, 273, 105, kWhite}, 40)},
        Layout{"Landscape",
               2560,
               1440,
               0,
               {0, 0, 2561, 1441, kShadow},
               {704, 375, 1152, 690, 0xFFBFBFBF},
               {705, 376, 1150, 230, kBlack},
               {705, 606, 1150, 228, kBlack},
               705,
               1855,
               {724, 385, 1112, 210, 0},
               {714, 615, 1132, 210, 0},
               60,
               kLeft,
               {},
               0,
               twoButtons({714, 840, 561, 220, kWhite}, {1285, 840, 561, 220, kWhite}, 80)},
        Layout{"Odd",
               1081,
               1921,
               0,
               {0, 0, 1082, 1922, kShadow},
               {108, 702, 864, 516, 0xFFBFBFBF},
               {109, 703, 862, 172, kBlack},
               {109, 875, 862, 170, kBlack},
               109,
               971,
               {128, 712, 824, 152, 0},
               {118, 884, 844, 152, 0},
               60,
               kLeft,
               {},
               0,
               twoButtons({118, 1051, 417, 162, kWhite}, {545, 1051, 417, 162, kWhite}, 60)}),
    rowName);

INSTANTIATE_TEST_SUITE_P(OtherClasses, DialogLayout,
                         testing::Values(Layout{"TwoLine",
                                                1440,
                                                2560,
                                                4,
                                                {0, 0, 1441, 2561, kShadow},
                                                {144, 935, 1152, 690, 0xFFBFBFBF},
                                                {145, 936, 1150, 230, kBlack},
                                                {145, 1166, 1150, 228, kBlack},
                                                145,
                                                1295,
                                                {164, 945, 1112, 210, 0},
                                                {154, 1175, 1132, 69, 0},
                                                54,
                                                kLeft,
                                                {154, 1290, 1132, 69, 0},
                                                54,
                                                twoButtons({154, 1400, 561, 220, kWhite},
                                                           {725, 1400, 561, 220, kWhite}, 80)},
                                         Layout{"Hook",
                                                1440,
                                                2560,
                                                13,
                                                {0, 0, 1441, 2561, kShadow},
                                                {144, 1050, 1152, 460, 0xFFBFBFBF},
                                                {145, 1051, 1150, 230, kBlack},
                                                {145, 1281, 1150, 228, kBlack},
                                                145,
                                                1295,
                                                {164, 1060, 1112, 210, 0},
                                                {154, 1290, 1132, 210, 0},
                                                60,
                                                kLeft,
                                                {},
                                                0,
                                                {}},
                                         Layout{"Earjack",
                                                720,
                                                1280,
                                                14,
                                                {0, 0, 721, 1281, kShadow},
                                                {72, 525, 576, 230, 0xFFBFBFBF},
                                                {73, 526, 574, 115, kBlack},
                                                {73, 641, 574, 113, kBlack},
                                                73,
                                                647,
                                                {92, 535, 536, 95, 0},
                                                {82, 650, 556, 34, 0},
                                                34,
                                                kLeft,
                                                {82, 707, 556, 34, 0},
                                                34,
                                                {}},
                                         Layout{"OkOnly",
                                                1080,
                                                1920,
                                                15,
                                                {0, 0, 1081, 1921, kShadow},
                                                {108, 702, 864, 516, 0xFFBFBFBF},
                                                {109, 703, 862, 172, kBlack},
                                                {109, 875, 862, 170, kBlack},
                                                109,
                                                971,
                                                {128, 712, 824, 152, 0},
                                                {118, 884, 844, 152, 0},
                                                51,
                                                kCentre,
                                                {},
                                                0,
                                                {roundBox({117, 1050, 846, 164, kBlack}),
                                                 roundTextbox({118, 1051, 844, 162, kWhite},
                                                              {"OK", kBlack, kCentre, 60})}},
                                         Layout{"TouchWarning",
                                                1440,
                                                2560,
                                                23,
                                                {0, 0, 1441, 2561, kAlarm},
                                                {144, 935, 1152, 690, 0xFFBFBFBF},
                                                {145, 936, 1150, 230, kBlack},
                                                {145, 1166, 1150, 228, kBlack},
                                                145,
                                                1295,
                                                {164, 945, 1112, 210, 0},
                                                {154, 1175, 1132, 210, 0},
                                                60,
                                                kCentre,
                                                {},
                                                0,
                                                kProgress1440},
                                         Layout{"TouchCaution",
                                                1440,
                                                2560,
                                                24,
                                                {0, 0, 1441, 2561, kAlarm},
                                                {144, 935, 1152, 690, 0xFFBFBFBF},
                                                {145, 936, 1150, 230, kBlack},
                                                {145, 1166, 1150, 228, kBlack},
                                                145,
                                                1295,
                                                {164, 945, 1112, 210, 0},
                                                {154, 1175, 1132, 69, 0},
                                                54,
                                                kCentre,
                                                {154, 1290, 1132, 69, 0},
                                                54,
                                                kProgress1440},
                                         Layout{"Wait",
                                                2560,
                                                1440,
                                                38,
                                                {0, 0, 2561, 1441, kShadow},
                                                {704, 490, 1152, 460, 0xFFBFBFBF},
                                                {705, 491, 1150, 230, kBlack},
                                                {705, 721, 1150, 228, kBlack},
                                                705,
                                                1855,
                                                {724, 500, 1112, 210, 0},
                                                {714, 730, 1132, 210, 0},
                                                60,
                                                kLeft,
                                                {},
                                                0,
                                                {}}),
                         rowName);

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
