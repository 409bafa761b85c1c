#include <MW/dialog.h>

#include <array>

#include "support/drawings.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MW::Dialog;
using DialogTest = WidgetTest;

struct Kind {
  int kind, number;     // of its class
  const char* answers;  // the buttons that answer releases on the right and the left
  int size;             // of the lines below the title
  const char* words;    // title, lines, captions
};

constexpr auto kKinds = std::to_array<Kind>({
    {0, 0, "21", 60, "Test Fail|Do you want to exit?|OK|CANCEL|"},
    {1, 0, "21", 60, "Check Test Result|Select PASS or FAIL|PASS|FAIL|"},
    {2, 0, "21", 60, "RETRY|Do you want to retry test?|OK|CANCEL|"},
    {3, 0, "21", 60, "Test Off|previous screen|OK|CANCEL|"},
    {4, 1, "21", 54,
     "Calibrate sensor?|Put the device on the flat place|before trying calibration.|OK|CANCEL|"},
    {5, 1, "21", 54,
     "Calibration Fail!|Put the device on the flat place|before trying calibration.|RETRY|CANCEL|"},
    {6, 4, "121", 54, "Invalid Gyro Init Value|Calibrate Gyro Sensor|OK|"},
    {7, 0, "21", 54, "Calibrate Gyro sensor?|Calibrate Gyro Sensor Using OK Button|OK|CANCEL|"},
    {8, 1, "21", 54,
     "Calibrate Gyro Sensor?|Calibration Fail!|Calibrate Gyro Sensor Using RETRY "
     "Button|RETRY|CANCEL|"},
    {9, 1, "21", 54,
     "Calibrate A+?|Push the OK button|after put the phone on the 20cm JIG|OK|CANCEL|"},
    {10, 1, "21", 54,
     "A+ Proxy Calibrate Fail!|Push the Retry button|after put the phone on the 20cm "
     "JIG|RETRY|CANCEL|"},
    {11, 1, "21", 54,
     "A+ Checksum Fail!|Push the Retry button|after put the phone on the 20cm JIG|RETRY|CANCEL|"},
    {12, 0, "21", 60, "Smart Factory Reset?|Start Factory Reset|OK|CANCEL|"},
    {13, 2, "", 60, "Hook Key Test|Please Push Hook Key !|"},
    {14, 3, "", 69, "Earjack Retry|Please reequipment Earjack,|If you want to test earjack.|"},
    {15, 4, "11", 51, "Auto Touch Test|Don't touch screen after push ok button|OK|"},
    {16, 0, "21", 60, "Reboot?|Brimol --> Normal boot|OK|CANCEL|"},
    {17, 0, "21", 60, "Reboot?|TORV --> All Auto Test|OK|CANCEL|"},
    {18, 0, "21", 60, "Warning|Power off the device|OK|CANCEL|"},
    {19, 4, "11", 60, "Key Test retry|two_key clicked at the same time|OK|"},
    {20, 0, "21", 60, "Warning|Test already Pass.|OK|CANCEL|"},
    {21, 0, "21", 60, "Warning|Test already pass.|OK|CANCEL|"},
    {22, 0, "21", 60, "||||"},
    {23, 5, "11", 60, "Auto Touch Test|Don't touch the screen!|*|"},
    {24, 6, "121", 54, "Auto Touch Test|caution|Don't touch screen after push ok button|*|"},
    {25, 0, "21", 60, "Full Retry?|Self Diagnosis|OK|CANCEL|"},
    {26, 4, "11", 60, "WIFI_TEST|Please click the ok button|OK|"},
    {27, 4, "11", 60, "Check self-d test|Self-d test is fail or running|OK|"},
    {28, 4, "11", 60, "WARNING!!|Proceed with All Tests except CapSensor|OK|"},
    {29, 4, "11", 60, "WARNING|Pre GPS Test running!!|OK|"},
    {30, 4, "11", 60, "Check self-d test|Self-d test is running|OK|"},
    {31, 4, "11", 60, "Check AIO test|CapSensor or GPS/WIFI or Touch fail|OK|"},
    {32, 4, "11", 51, "Touch Firmware Upgrade|Complete!!|OK|"},
    {33, 0, "21", 60, "SNIFF RETRANS|Do you want to sniff retrans?|OK|CANCEL|"},
    {34, 0, "21", 60, "SNIFF MID UPDATE|Do you want to mid update?|OK|CANCEL|"},
    {35, 4, "11", 60, "Slimport FW update is Finished.|Please reconnect R1.|OK|"},
    {36, 4, "11", 60, "Warning|Socket Fail, re-enter the Test!!|OK|"},
    {37, 4, "11", 60, "AUTO VR TEST|Please wait after push ok button|OK|"},
    {38, 7, "", 60, "AUTO VR TEST|Please wait for the end of test!|"},
    {39, 0, "21", 60, "Error : Light Sensor|Do you want to exit?|OK|CANCEL|"},
    {40, 0, "21", 60, "||||"},
    {INT_MIN, 0, "21", 60, "||||"},
});

std::string answers;

TEST_F(DialogTest, EveryKindSaysAndAnswersWhatItShould) {
  for (const Kind& row : kKinds) {
    SCOPED_TRACE(row.kind);
    Dialog dialog(row.kind);
    dialog.button1Callback = [](int value) { answers += value == 0 ? '1' : '!'; };
    dialog.button2Callback = [](int value) { answers += value == 0 ? '2' : '!'; };
    std::string words;
    for (const Drawing& each : shown(dialog)) {
      if (each.text.size == 0) continue;
      const int lineSize = words.empty() ? 70 : row.size;
      EXPECT_EQ(each.text.size, each.call == Call::Label ? lineSize : 80);
      words += each.text.text + '|';
    }
    EXPECT_EQ(words, row.words);
    EXPECT_EQ(Dialog::isType(row.kind), row.number);
    answers.clear();
    release(dialog, {900, 1530});
    release(dialog, {300, 1530});
    EXPECT_EQ(answers, row.answers);
  }
}

struct Place {
  int w, h, captionSize;
  const char* places;  // frame, message, buttons
};

constexpr auto kPlaces = std::to_array<Place>({
    {1440, 2560, 80, "144,935 1152x690|154,1175 1132x210|154,1400 561x220|725,1400 561x220|"},
    {1080, 1920, 60, "108,702 864x516|118,884 844x152|118,1051 417x162|545,1051 417x162|"},
    {720, 1280, 40, "72,467 576x345|82,592 556x95|82,702 273x105|365,702 273x105|"},
    {2560, 1440, 80, "704,375 1152x690|714,615 1132x210|714,840 561x220|1285,840 561x220|"},
    {1081, 1921, 60, "108,702 864x516|118,884 844x152|118,1051 417x162|545,1051 417x162|"},
});

TEST_F(DialogTest, StandsInTheMiddleOfItsScreen) {
  for (const Place& row : kPlaces) {
    setScreen(row.w, row.h);
    Dialog dialog(0);
    const std::vector<Drawing> all = shown(dialog);
    EXPECT_EQ(places({all.at(1), all.at(6), all.at(8), all.at(10)}), row.places);
    EXPECT_EQ(all.back().text.size, row.captionSize);
  }
}

// All dialogs share the second line, and those without one of their own inherit the last one's.
TEST_F(DialogTest, OldWordsAreKept) {
  struct Open : Dialog {
    using Dialog::Dialog;
    using Dialog::message;
    using Dialog::second;
  };
  Dialog(9).hide();
  Open dialog(0);
  EXPECT_STREQ(dialog.second.text, "after put the phone on the 20cm JIG");
  Dialog(21).hide();
  EXPECT_STREQ(Open(-1).second.text, "Are you sure to test again?");
  dialog.setDesc("No");
  dialog.setRect(14);
  EXPECT_EQ(shown(dialog).at(6).text.text, "No");
  EXPECT_STREQ(dialog.message.text, "No you want to exit?") << "the old tail";
  EXPECT_EQ(places({shown(dialog).at(6)}), "154,1290 1132x69|") << "laid out anew";
}

}  // namespace
