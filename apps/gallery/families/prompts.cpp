// The built-in prompts, a row for each kind.
#include <MW/dialog.h>

#include <array>

#include "families/families.h"
#include "place.h"

namespace gallery {

namespace {

void prompt(MW::Dialog::Kind kind, Loop& loop) {
  MW::Dialog dialog(kind);
  dialog.button1Callback = [](int) { say("The left button"); };
  dialog.button2Callback = [](int) { say("The right button"); };
  dialog.setActive(1);
  loop();
}

constexpr auto kPrompts = std::to_array<Example>({
    {"prompt_leave_failed_test", "kLeaveFailedTest", "", kMiddle,
     [](Loop& loop) { prompt(MW::Dialog::kLeaveFailedTest, loop); }, MW::kTopLayer},
    {"prompt_pass_or_fail", "kPassOrFail", "", kMiddle,
     [](Loop& loop) { prompt(MW::Dialog::kPassOrFail, loop); }, MW::kTopLayer},
    {"prompt_retry_test", "kRetryTest", "", kMiddle,
     [](Loop& loop) { prompt(MW::Dialog::kRetryTest, loop); }, MW::kTopLayer},
    {"prompt_leave_test", "kLeaveTest", "", kMiddle,
     [](Loop& loop) { prompt(MW::Dialog::kLeaveTest, loop); }, MW::kTopLayer},
    {"prompt_calibrate_sensor", "kCalibrateSensor", "", kMiddle,
     [](Loop& loop) { prompt(MW::Dialog::kCalibrateSensor, loop); }, MW::kTopLayer},
    {"prompt_recalibrate_sensor", "kRecalibrateSensor", "", kMiddle,
     [](Loop& loop) { prompt(MW::Dialog::kRecalibrateSensor, loop); }, MW::kTopLayer},
    {"prompt_bad_gyro_value", "kBadGyroValue", "", kMiddle,
     [](Loop& loop) { prompt(MW::Dialog::kBadGyroValue, loop); }, MW::kTopLayer},
    {"prompt_calibrate_gyro", "kCalibrateGyro", "", kMiddle,
     [](Loop& loop) { prompt(MW::Dialog::kCalibrateGyro, loop); }, MW::kTopLayer},
    {"prompt_recalibrate_gyro", "kRecalibrateGyro", "", kMiddle,
     [](Loop& loop) { prompt(MW::Dialog::kRecalibrateGyro, loop); }, MW::kTopLayer},
    {"prompt_calibrate_a_plus", "kCalibrateAPlus", "", kMiddle,
     [](Loop& loop) { prompt(MW::Dialog::kCalibrateAPlus, loop); }, MW::kTopLayer},
    {"prompt_recalibrate_a_plus", "kRecalibrateAPlus", "", kMiddle,
     [](Loop& loop) { prompt(MW::Dialog::kRecalibrateAPlus, loop); }, MW::kTopLayer},
    {"prompt_bad_a_plus_checksum", "kBadAPlusChecksum", "", kMiddle,
     [](Loop& loop) { prompt(MW::Dialog::kBadAPlusChecksum, loop); }, MW::kTopLayer},
    {"prompt_factory_reset", "kFactoryReset", "", kMiddle,
     [](Loop& loop) { prompt(MW::Dialog::kFactoryReset, loop); }, MW::kTopLayer},
    {"prompt_push_hook_key", "kPushHookKey", "", kMiddle,
     [](Loop& loop) { prompt(MW::Dialog::kPushHookKey, loop); }, MW::kTopLayer},
    {"prompt_reinsert_earjack", "kReinsertEarjack", "", kMiddle,
     [](Loop& loop) { prompt(MW::Dialog::kReinsertEarjack, loop); }, MW::kTopLayer},
    {"prompt_start_touch_test", "kStartTouchTest", "", kMiddle,
     [](Loop& loop) { prompt(MW::Dialog::kStartTouchTest, loop); }, MW::kTopLayer},
    {"prompt_boot_normally", "kBootNormally", "", kMiddle,
     [](Loop& loop) { prompt(MW::Dialog::kBootNormally, loop); }, MW::kTopLayer},
    {"prompt_boot_to_tests", "kBootToTests", "", kMiddle,
     [](Loop& loop) { prompt(MW::Dialog::kBootToTests, loop); }, MW::kTopLayer},
    {"prompt_power_off", "kPowerOff", "", kMiddle,
     [](Loop& loop) { prompt(MW::Dialog::kPowerOff, loop); }, MW::kTopLayer},
    {"prompt_two_keys_at_once", "kTwoKeysAtOnce", "", kMiddle,
     [](Loop& loop) { prompt(MW::Dialog::kTwoKeysAtOnce, loop); }, MW::kTopLayer},
    {"prompt_repeat_passed_test", "kRepeatPassedTest", "", kMiddle,
     [](Loop& loop) { prompt(MW::Dialog::kRepeatPassedTest, loop); }, MW::kTopLayer},
    {"prompt_repeat_passed_test_again", "kRepeatPassedTestAgain", "", kMiddle,
     [](Loop& loop) { prompt(MW::Dialog::kRepeatPassedTestAgain, loop); }, MW::kTopLayer},
    {"prompt_do_not_touch", "kDoNotTouch", "", kMiddle,
     [](Loop& loop) { prompt(MW::Dialog::kDoNotTouch, loop); }, MW::kTopLayer, 600},
    {"prompt_caution_do_not_touch", "kCautionDoNotTouch", "", kMiddle,
     [](Loop& loop) { prompt(MW::Dialog::kCautionDoNotTouch, loop); }, MW::kTopLayer, 600},
    {"prompt_full_retry", "kFullRetry", "", kMiddle,
     [](Loop& loop) { prompt(MW::Dialog::kFullRetry, loop); }, MW::kTopLayer},
    {"prompt_wifi_test", "kWifiTest", "", kMiddle,
     [](Loop& loop) { prompt(MW::Dialog::kWifiTest, loop); }, MW::kTopLayer},
    {"prompt_self_test_fails_or_runs", "kSelfTestFailsOrRuns", "", kMiddle,
     [](Loop& loop) { prompt(MW::Dialog::kSelfTestFailsOrRuns, loop); }, MW::kTopLayer},
    {"prompt_all_but_cap_sensor", "kAllButCapSensor", "", kMiddle,
     [](Loop& loop) { prompt(MW::Dialog::kAllButCapSensor, loop); }, MW::kTopLayer},
    {"prompt_gps_test_runs", "kGpsTestRuns", "", kMiddle,
     [](Loop& loop) { prompt(MW::Dialog::kGpsTestRuns, loop); }, MW::kTopLayer},
    {"prompt_self_test_runs", "kSelfTestRuns", "", kMiddle,
     [](Loop& loop) { prompt(MW::Dialog::kSelfTestRuns, loop); }, MW::kTopLayer},
    {"prompt_all_in_one_fails", "kAllInOneFails", "", kMiddle,
     [](Loop& loop) { prompt(MW::Dialog::kAllInOneFails, loop); }, MW::kTopLayer},
    {"prompt_touch_firmware_done", "kTouchFirmwareDone", "", kMiddle,
     [](Loop& loop) { prompt(MW::Dialog::kTouchFirmwareDone, loop); }, MW::kTopLayer},
    {"prompt_sniff_retransmission", "kSniffRetransmission", "", kMiddle,
     [](Loop& loop) { prompt(MW::Dialog::kSniffRetransmission, loop); }, MW::kTopLayer},
    {"prompt_sniff_update", "kSniffUpdate", "", kMiddle,
     [](Loop& loop) { prompt(MW::Dialog::kSniffUpdate, loop); }, MW::kTopLayer},
    {"prompt_reconnect", "kReconnect", "", kMiddle,
     [](Loop& loop) { prompt(MW::Dialog::kReconnect, loop); }, MW::kTopLayer},
    {"prompt_socket_fails", "kSocketFails", "", kMiddle,
     [](Loop& loop) { prompt(MW::Dialog::kSocketFails, loop); }, MW::kTopLayer},
    {"prompt_start_voice_test", "kStartVoiceTest", "", kMiddle,
     [](Loop& loop) { prompt(MW::Dialog::kStartVoiceTest, loop); }, MW::kTopLayer},
    {"prompt_wait_voice_test", "kWaitVoiceTest", "", kMiddle,
     [](Loop& loop) { prompt(MW::Dialog::kWaitVoiceTest, loop); }, MW::kTopLayer},
    {"prompt_leave_light_sensor", "kLeaveLightSensor", "", kMiddle,
     [](Loop& loop) { prompt(MW::Dialog::kLeaveLightSensor, loop); }, MW::kTopLayer},
});

}  // namespace

Family prompts() {
  return {"Built-in prompts",
          "The kind alone says what is asked, and which buttons there are.",
          sourceOf("families/prompts.cpp"),
          kPrompts,
          Shelf::Grid,
          "void prompt("};
}

}  // namespace gallery
