// Long texts, and a keyboard to type short ones.
#include <MW/ime.h>
#include <MW/static_text.h>

#include <array>

#include "families/families.h"
#include "place.h"

namespace gallery {

namespace {

constexpr uint32_t kPaper = 0xFFF4F4EC;
constexpr uint32_t kKeys = 0xFF8090A4;
constexpr const char* kLog =
    "boot: 3 cores\nclock: 2026-11-22\ncamera: lens found\ncamera: lens moved by 3 steps\n"
    "display: 720 x 1280\nbattery: 87 %\nbattery: charger found\ncamera: closed\nradio: 2G 3G 4G\n"
    "radio: registered\ntouch: 10 fingers\nproximity: near\nproximity: far\nlight: 320 lux\n"
    "gyro: calibrated\nwifi: 5 networks\nbluetooth: on\nspeaker: 440 Hz\nmicrophone: 440 Hz\n"
    "vibration: felt\nend of the log\n";

constexpr auto kTexts = std::to_array<Example>({
    {"static_text", "StaticText",
     "A long text that a finger scrolls, with line numbers, a scroll bar, and the lines in red "
     "that a search has found. `setRect()` before the text makes room for the line numbers.",
     kThird,
     [](Loop& loop) {
       const SKIA_Rect area = place(5, 2, 90, 30, kPaper);
       const SKIA_Text looks = words("", MW::kColorBlack, SKIA_ALIGN_LEFT);
       MW::StaticText viewer(&area, &looks, true, true, true);
       viewer.setRect(0, &area);
       viewer.setText(kLog);
       viewer.get_ime_result("battery");
       viewer.line_search(kLog);
       viewer.setActive(1);
       loop();
     }},
    {"static_text_plain", "StaticText without extras", "With a scroll bar only.", kThird,
     [](Loop& loop) {
       const SKIA_Rect area = place(5, 2, 90, 30, kPaper);
       const SKIA_Text looks = words("", MW::kColorBlack, SKIA_ALIGN_LEFT);
       MW::StaticText viewer(&area, &looks);
       viewer.setText(kLog);
       viewer.setActive(1);
       loop();
     }},
    {"static_text_empty", "StaticText without a text", "", kThird,
     [](Loop& loop) {
       const SKIA_Rect area = place(5, 2, 90, 30, kPaper);
       const SKIA_Text looks = words("", MW::kColorBlack, SKIA_ALIGN_LEFT);
       MW::StaticText viewer(&area, &looks);
       viewer.setText("");
       viewer.setActive(1);
       loop();
     }},
    {"ime", "Ime",
     "The on-screen keyboard. Shift leads from small letters to capitals and to other characters; "
     "after enter, what was typed is there to be read.",
     kHalf,
     [](Loop& loop) {
       const SKIA_Rect area = place(0, 5, 100, 40, kKeys);
       const SKIA_Text looks = words("");
       MW::Ime keyboard(&area, &looks);
       keyboard.release_cb = [](int, MW::Ime* from) {
         const std::string entered = from->getResultString();
         if (!entered.empty()) say("Entered: " + entered);
         from->setResultString("");
       };
       keyboard.setActive(1);
       loop();
     }},
    {"ime_capitals", "Ime, capitals", "", kHalf,
     [](Loop& loop) {
       const SKIA_Rect area = place(0, 5, 100, 40, kKeys);
       const SKIA_Text looks = words("");
       MW::Ime keyboard(&area, &looks);
       keyboard.presskey_set(MW::Ime::kCapitals);
       keyboard.keyboard_change(MW::Ime::kCapitals);
       keyboard.setActive(1);
       loop();
     }},
    {"ime_special", "Ime, other characters", "", kHalf,
     [](Loop& loop) {
       const SKIA_Rect area = place(0, 5, 100, 40, kKeys);
       const SKIA_Text looks = words("");
       MW::Ime keyboard(&area, &looks);
       keyboard.presskey_set(MW::Ime::kSpecial);
       keyboard.keyboard_change(MW::Ime::kSpecial);
       keyboard.setActive(1);
       loop();
     }},
    {"ime_digits", "Ime, digits alone", "All other keys are grey, and type nothing.", kHalf,
     [](Loop& loop) {
       const SKIA_Rect area = place(0, 5, 100, 40, kKeys);
       const SKIA_Text looks = words("");
       MW::Ime keyboard(&area, &looks);
       keyboard.presskey_set(MW::Ime::kOnlyDigits);
       keyboard.keyboard_change(MW::Ime::kOnlyDigits);
       keyboard.setActive(1);
       loop();
     }},
});

}  // namespace

Family texts() {
  return {"Texts", "Long texts, and a keyboard to type short ones.", sourceOf("texts"), kTexts};
}

}  // namespace gallery
