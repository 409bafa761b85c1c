#include "dialogs/dialog_catalogue.h"

#include <algorithm>
#include <array>

#include "dialogs/dialog_parts.h"

namespace MW {

namespace {

using enum Dialog::Kind;
using enum Dialog::Layout;

constexpr auto kLayouts = std::to_array<DialogLayout>({
    {kStandard, 3, Buttons::Two, SecondLine::Hidden, SKIA_ALIGN_LEFT, kColorShadow},
    {kTwoLine, 3, Buttons::Two, SecondLine::Drawn, SKIA_ALIGN_LEFT, kColorShadow},
    {kHook, 2, Buttons::None, SecondLine::Hidden, SKIA_ALIGN_LEFT, kColorShadow},
    {kEarjack, 2, Buttons::None, SecondLine::Drawn, SKIA_ALIGN_LEFT, kColorShadow},
    {kOkOnly, 3, Buttons::One, SecondLine::Hidden, SKIA_ALIGN_CENTRE, kColorShadow},
    {kTouchWarning, 3, Buttons::Progress, SecondLine::Hidden, SKIA_ALIGN_CENTRE, kColorRed},
    {kTouchCaution, 3, Buttons::Progress, SecondLine::Drawn, SKIA_ALIGN_CENTRE, kColorRed},
    {kWait, 2, Buttons::None, SecondLine::Hidden, SKIA_ALIGN_LEFT, kColorShadow},
});
static_assert(std::ranges::is_sorted(kLayouts, {}, &DialogLayout::number) &&
                  kLayouts.front().number == 0 && kLayouts.back().number == kLayouts.size() - 1,
              "a layout's number is its place");

constexpr ButtonRow kNoButtons = {nullptr, nullptr, Touches::None};
constexpr ButtonRow kStars = {nullptr, nullptr, Touches::Left};
constexpr ButtonRow kStarsAndHidden = {nullptr, nullptr, Touches::Both};
constexpr ButtonRow kOk = {"OK", nullptr, Touches::Left};
constexpr ButtonRow kOkAndHidden = {"OK", nullptr, Touches::Both};
constexpr ButtonRow kOkCancel = {"OK", "CANCEL", Touches::Both};
constexpr ButtonRow kPassFail = {"PASS", "FAIL", Touches::Both};
constexpr ButtonRow kRetryCancel = {"RETRY", "CANCEL", Touches::Both};
constexpr const char* kFlatPlace = "Put the device on the flat place";
constexpr const char* kBeforeTrying = "before trying calibration.";
constexpr const char* kOnTheJig = "after put the phone on the 20cm JIG";
constexpr const char* kTestAgain = "Are you sure to test again?";
constexpr const char* kNoTouch = "Don't touch screen after push ok button";
constexpr const char* kAutoTouch = "Auto Touch Test";
constexpr const char* kPushRetry = "Push the Retry button";
constexpr int kSmall = 54;  // pixels
constexpr int kSmaller = 51;

constexpr CatalogueEntry kUnknown = {-1, kStandard, nullptr, {}, {}};

// Ascending by kind, a row in one line or two. The layout of kRepeatPassedTest and the next kind
// draws no second line: theirs only goes to later dialogs that have none of their own.
// clang-format off
constexpr auto kCatalogue = std::to_array<CatalogueEntry>({
    {kLeaveFailedTest, kStandard, "Test Fail", {"Do you want to exit?"}, kOkCancel},
    {kPassOrFail, kStandard, "Check Test Result", {"Select PASS or FAIL"}, kPassFail},
    {kRetryTest, kStandard, "RETRY", {"Do you want to retry test?"}, kOkCancel},
    {kLeaveTest, kStandard, "Test Off", {"previous screen"}, kOkCancel},
    {kCalibrateSensor, kTwoLine, "Calibrate sensor?",
     {kFlatPlace, kBeforeTrying}, kOkCancel, kSmall},
    {kRecalibrateSensor, kTwoLine, "Calibration Fail!",
     {kFlatPlace, kBeforeTrying}, kRetryCancel, kSmall},
    {kBadGyroValue, kOkOnly, "Invalid Gyro Init Value",
     {"Calibrate Gyro Sensor"}, kOkAndHidden, kSmall},
    {kCalibrateGyro, kStandard, "Calibrate Gyro sensor?",
     {"Calibrate Gyro Sensor Using OK Button"}, kOkCancel, kSmall},
    {kRecalibrateGyro, kTwoLine, "Calibrate Gyro Sensor?",
     {"Calibration Fail!", "Calibrate Gyro Sensor Using RETRY Button"}, kRetryCancel, kSmall},
    {kCalibrateAPlus, kTwoLine, "Calibrate A+?",
     {"Push the OK button", kOnTheJig}, kOkCancel, kSmall},
    {kRecalibrateAPlus, kTwoLine, "A+ Proxy Calibrate Fail!",
     {kPushRetry, kOnTheJig}, kRetryCancel, kSmall},
    {kBadAPlusChecksum, kTwoLine, "A+ Checksum Fail!",
     {kPushRetry, kOnTheJig}, kRetryCancel, kSmall},
    {kFactoryReset, kStandard, "Smart Factory Reset?", {"Start Factory Reset"}, kOkCancel},
    {kPushHookKey, kHook, "Hook Key Test", {"Please Push Hook Key !"}, kNoButtons},
    {kReinsertEarjack, kEarjack, "Earjack Retry",
     {"Please reequipment Earjack,", "If you want to test earjack."}, kNoButtons},
    {kStartTouchTest, kOkOnly, kAutoTouch, {kNoTouch}, kOk, kSmaller},
    {kBootNormally, kStandard, "Reboot?", {"Brimol --> Normal boot"}, kOkCancel},
    {kBootToTests, kStandard, "Reboot?", {"TORV --> All Auto Test"}, kOkCancel},
    {kPowerOff, kStandard, "Warning", {"Power off the device"}, kOkCancel},
    {kTwoKeysAtOnce, kOkOnly, "Key Test retry", {"two_key clicked at the same time"}, kOk},
    {kRepeatPassedTest, kStandard, "Warning", {"Test already Pass.", kTestAgain}, kOkCancel},
    {kRepeatPassedTestAgain, kStandard, "Warning", {"Test already pass.", kTestAgain}, kOkCancel},
    {kDoNotTouch, kTouchWarning, kAutoTouch, {"Don't touch the screen!"}, kStars},
    {kCautionDoNotTouch, kTouchCaution, kAutoTouch, {"caution", kNoTouch}, kStarsAndHidden, kSmall},
    {kFullRetry, kStandard, "Full Retry?", {"Self Diagnosis"}, kOkCancel},
    {kWifiTest, kOkOnly, "WIFI_TEST", {"Please click the ok button"}, kOk},
    {kSelfTestFailsOrRuns, kOkOnly, "Check self-d test", {"Self-d test is fail or running"}, kOk},
    {kAllButCapSensor, kOkOnly, "WARNING!!", {"Proceed with All Tests except CapSensor"}, kOk},
    {kGpsTestRuns, kOkOnly, "WARNING", {"Pre GPS Test running!!"}, kOk},
    {kSelfTestRuns, kOkOnly, "Check self-d test", {"Self-d test is running"}, kOk},
    {kAllInOneFails, kOkOnly, "Check AIO test", {"CapSensor or GPS/WIFI or Touch fail"}, kOk},
    {kTouchFirmwareDone, kOkOnly, "Touch Firmware Upgrade", {"Complete!!"}, kOk, kSmaller},
    {kSniffRetransmission, kStandard, "SNIFF RETRANS",
     {"Do you want to sniff retrans?"}, kOkCancel},
    {kSniffUpdate, kStandard, "SNIFF MID UPDATE", {"Do you want to mid update?"}, kOkCancel},
    {kReconnect, kOkOnly, "Slimport FW update is Finished.", {"Please reconnect R1."}, kOk},
    {kSocketFails, kOkOnly, "Warning", {"Socket Fail, re-enter the Test!!"}, kOk},
    {kStartVoiceTest, kOkOnly, "AUTO VR TEST", {"Please wait after push ok button"}, kOk},
    {kWaitVoiceTest, kWait, "AUTO VR TEST", {"Please wait for the end of test!"}, kNoButtons},
    {kLeaveLightSensor, kStandard, "Error : Light Sensor", {"Do you want to exit?"}, kOkCancel},
});
// clang-format on
static_assert(std::ranges::is_sorted(kCatalogue, {}, &CatalogueEntry::kind));

}  // namespace

const CatalogueEntry& catalogueEntry(int kind) {
  const auto* const entry = std::ranges::lower_bound(kCatalogue, kind, {}, &CatalogueEntry::kind);
  return entry != kCatalogue.end() && entry->kind == kind ? *entry : kUnknown;
}

const DialogLayout& dialogLayout(int kind) {
  return kLayouts.at(static_cast<std::size_t>(catalogueEntry(kind).layout));
}

}  // namespace MW
