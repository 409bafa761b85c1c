#include "dialogs/dialog_catalogue.h"

#include <algorithm>
#include <array>

#include "dialogs/dialog_parts.h"

namespace MW {

namespace {

// By DialogClassNumber.
constexpr auto kClasses = std::to_array<DialogClass>({
    {3, Buttons::Two, SecondLine::Hidden, Backdrop::Shadow, SKIA_ALIGN_LEFT},
    {3, Buttons::Two, SecondLine::Drawn, Backdrop::Shadow, SKIA_ALIGN_LEFT},
    {2, Buttons::None, SecondLine::Hidden, Backdrop::Shadow, SKIA_ALIGN_LEFT},
    {2, Buttons::None, SecondLine::Drawn, Backdrop::Shadow, SKIA_ALIGN_LEFT},
    {3, Buttons::One, SecondLine::Hidden, Backdrop::Shadow, SKIA_ALIGN_CENTRE},
    {3, Buttons::Progress, SecondLine::Hidden, Backdrop::Alarm, SKIA_ALIGN_CENTRE},
    {3, Buttons::Progress, SecondLine::Drawn, Backdrop::Alarm, SKIA_ALIGN_CENTRE},
    {2, Buttons::None, SecondLine::Hidden, Backdrop::Shadow, SKIA_ALIGN_LEFT},
});

constexpr const char* kFlatPlace = "Put the device on the flat place";
constexpr const char* kBeforeTrying = "before trying calibration.";
constexpr const char* kOnTheJig = "after put the phone on the 20cm JIG";
constexpr const char* kTestAgain = "Are you sure to test again?";
constexpr const char* kNoTouch = "Don't touch screen after push ok button";
constexpr const char* kAutoTouch = "Auto Touch Test";
constexpr const char* kOk = "OK";
constexpr const char* kCancel = "CANCEL";
constexpr const char* kRetry = "RETRY";
constexpr const char* kPushRetry = "Push the Retry button";

constexpr DialogKind kUnknown = {-1,      kStandard, nullptr, nullptr, nullptr, nullptr,
                                 nullptr, 1,         1,       0,       0};

// Ascending by kind. Kinds 6 and 24 draw no second button and yet take touches for it, and kinds 20
// and 21 have second lines that their class does not draw: meant so.
// clang-format off
constexpr auto kKinds = std::to_array<DialogKind>({
    {0, kStandard, "Test Fail", "Do you want to exit?", nullptr, kOk, kCancel, 1, 1, 0, 0},
    {1, kStandard, "Check Test Result", "Select PASS or FAIL", nullptr, "PASS", "FAIL", 1, 1, 0, 0},
    {2, kStandard, "RETRY", "Do you want to retry test?", nullptr, kOk, kCancel, 1, 1, 0, 0},
    {3, kStandard, "Test Off", "previous screen", nullptr, kOk, kCancel, 1, 1, 0, 0},
    {4, kTwoLine, "Calibrate sensor?", kFlatPlace, kBeforeTrying, kOk, kCancel, 1, 1, 54, 54},
    {5, kTwoLine, "Calibration Fail!", kFlatPlace, kBeforeTrying, kRetry, kCancel, 1, 1, 54, 54},
    {6, kOkOnly, "Invalid Gyro Init Value", "Calibrate Gyro Sensor", nullptr, kOk, nullptr, 1, 1, 54, 0},
    {7, kStandard, "Calibrate Gyro sensor?", "Calibrate Gyro Sensor Using OK Button", nullptr, kOk, kCancel, 1, 1, 54, 0},
    {8, kTwoLine, "Calibrate Gyro Sensor?", "Calibration Fail!", "Calibrate Gyro Sensor Using RETRY Button", kRetry, kCancel, 1, 1, 54, 54},
    {9, kTwoLine, "Calibrate A+?", "Push the OK button", kOnTheJig, kOk, kCancel, 1, 1, 54, 54},
    {10, kTwoLine, "A+ Proxy Calibrate Fail!", kPushRetry, kOnTheJig, kRetry, kCancel, 1, 1, 54, 54},
    {11, kTwoLine, "A+ Checksum Fail!", kPushRetry, kOnTheJig, kRetry, kCancel, 1, 1, 54, 54},
    {12, kStandard, "Smart Factory Reset?", "Start Factory Reset", nullptr, kOk, kCancel, 1, 1, 0, 0},
    {13, kHook, "Hook Key Test", "Please Push Hook Key !", nullptr, nullptr, nullptr, 0, 0, 0, 0},
    {14, kEarjack, "Earjack Retry", "Please reequipment Earjack,", "If you want to test earjack.", nullptr, nullptr, 0, 0, 0, 0},
    {15, kOkOnly, kAutoTouch, kNoTouch, nullptr, kOk, nullptr, 1, 0, 51, 0},
    {16, kStandard, "Reboot?", "Brimol --> Normal boot", nullptr, kOk, kCancel, 1, 1, 0, 0},
    {17, kStandard, "Reboot?", "TORV --> All Auto Test", nullptr, kOk, kCancel, 1, 1, 0, 0},
    {18, kStandard, "Warning", "Power off the device", nullptr, kOk, kCancel, 1, 1, 0, 0},
    {19, kOkOnly, "Key Test retry", "two_key clicked at the same time", nullptr, kOk, nullptr, 1, 0, 0, 0},
    {20, kStandard, "Warning", "Test already Pass.", kTestAgain, kOk, kCancel, 1, 1, 0, 0},
    {21, kStandard, "Warning", "Test already pass.", kTestAgain, kOk, kCancel, 1, 1, 0, 0},
    {23, kTouchWarning, kAutoTouch, "Don't touch the screen!", nullptr, nullptr, nullptr, 1, 0, 0, 0},
    {24, kTouchCaution, kAutoTouch, "caution", kNoTouch, nullptr, nullptr, 1, 1, 54, 54},
    {25, kStandard, "Full Retry?", "Self Diagnosis", nullptr, kOk, kCancel, 1, 1, 0, 0},
    {26, kOkOnly, "WIFI_TEST", "Please click the ok button", nullptr, kOk, nullptr, 1, 0, 0, 0},
    {27, kOkOnly, "Check self-d test", "Self-d test is fail or running", nullptr, kOk, nullptr, 1, 0, 0, 0},
    {28, kOkOnly, "WARNING!!", "Proceed with All Tests except CapSensor", nullptr, kOk, nullptr, 1, 0, 0, 0},
    {29, kOkOnly, "WARNING", "Pre GPS Test running!!", nullptr, kOk, nullptr, 1, 0, 0, 0},
    {30, kOkOnly, "Check self-d test", "Self-d test is running", nullptr, kOk, nullptr, 1, 0, 0, 0},
    {31, kOkOnly, "Check AIO test", "CapSensor or GPS/WIFI or Touch fail", nullptr, kOk, nullptr, 1, 0, 0, 0},
    {32, kOkOnly, "Touch Firmware Upgrade", "Complete!!", nullptr, kOk, nullptr, 1, 0, 51, 0},
    {33, kStandard, "SNIFF RETRANS", "Do you want to sniff retrans?", nullptr, kOk, kCancel, 1, 1, 0, 0},
    {34, kStandard, "SNIFF MID UPDATE", "Do you want to mid update?", nullptr, kOk, kCancel, 1, 1, 0, 0},
    {35, kOkOnly, "Slimport FW update is Finished.", "Please reconnect R1.", nullptr, kOk, nullptr, 1, 0, 0, 0},
    {36, kOkOnly, "Warning", "Socket Fail, re-enter the Test!!", nullptr, kOk, nullptr, 1, 0, 0, 0},
    {37, kOkOnly, "AUTO VR TEST", "Please wait after push ok button", nullptr, kOk, nullptr, 1, 0, 0, 0},
    {38, kWait, "AUTO VR TEST", "Please wait for the end of test!", nullptr, nullptr, nullptr, 0, 0, 0, 0},
    {39, kStandard, "Error : Light Sensor", "Do you want to exit?", nullptr, kOk, kCancel, 1, 1, 0, 0},
});
// clang-format on
static_assert(std::ranges::is_sorted(kKinds, {}, &DialogKind::kind));

}  // namespace

const DialogKind& dialogKind(int kind) {
  const auto* const row = std::ranges::lower_bound(kKinds, kind, {}, &DialogKind::kind);
  return row != kKinds.end() && row->kind == kind ? *row : kUnknown;
}

const DialogClass& dialogClass(int number) { return kClasses.at(static_cast<std::size_t>(number)); }

}  // namespace MW
