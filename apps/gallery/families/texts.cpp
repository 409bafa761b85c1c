// Long texts, and a keyboard to type short ones.
#include <MW/ime.h>
#include <MW/static_text.h>

#include <array>
#include <string>

#include "families/families.h"
#include "place.h"

namespace gallery {

namespace {

constexpr auto kTexts = std::to_array<Example>({
    {"static_text", "StaticText",
     "A long text that a finger scrolls, with line numbers, a scroll bar, and the lines in red "
     "that a search has found. `setRect()` before the text makes room for the line numbers.",
     kThird,
     [](Loop& loop) {
       std::string log;
       for (int step = 1; step <= 30; ++step) {
         log += "step " + std::to_string(step) + (step % 7 == 0 ? ": failed\n" : ": passed\n");
       }
       const SKIA_Rect area = place(5, 2, 90, 30, 0xFFF4F4EC);
       const SKIA_Text looks = words("", MW::kColorBlack, SKIA_ALIGN_LEFT);
       MW::StaticText viewer(&area, &looks, true, true, true);
       viewer.setRect(MW::kUnused, &area);
       viewer.setText(log.c_str());
       viewer.get_ime_result("failed");
       viewer.line_search(log.c_str());
       viewer.setActive(1);
       loop();
     }},
    {"static_text_plain", "StaticText without extras", "With a scroll bar only.", kThird,
     [](Loop& loop) {
       std::string log;
       for (int step = 1; step <= 30; ++step) {
         log += "step " + std::to_string(step) + (step % 7 == 0 ? ": failed\n" : ": passed\n");
       }
       const SKIA_Rect area = place(5, 2, 90, 30, 0xFFF4F4EC);
       const SKIA_Text looks = words("", MW::kColorBlack, SKIA_ALIGN_LEFT);
       MW::StaticText viewer(&area, &looks);
       viewer.setText(log.c_str());
       viewer.setActive(1);
       loop();
     }},
    {"static_text_empty", "StaticText without a text", "", kThird,
     [](Loop& loop) {
       const SKIA_Rect area = place(5, 2, 90, 30, 0xFFF4F4EC);
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
       const SKIA_Rect area = place(0, 5, 100, 40, 0xFF8090A4);
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
       const SKIA_Rect area = place(0, 5, 100, 40, 0xFF8090A4);
       const SKIA_Text looks = words("");
       MW::Ime keyboard(&area, &looks);
       keyboard.presskey_set(MW::Ime::kCapitals);
       keyboard.keyboard_change(MW::Ime::kCapitals);
       keyboard.setActive(1);
       loop();
     }},
    {"ime_special", "Ime, other characters", "", kHalf,
     [](Loop& loop) {
       const SKIA_Rect area = place(0, 5, 100, 40, 0xFF8090A4);
       const SKIA_Text looks = words("");
       MW::Ime keyboard(&area, &looks);
       keyboard.presskey_set(MW::Ime::kSpecial);
       keyboard.keyboard_change(MW::Ime::kSpecial);
       keyboard.setActive(1);
       loop();
     }},
    {"ime_digits", "Ime, digits alone", "All other keys are grey, and type nothing.", kHalf,
     [](Loop& loop) {
       const SKIA_Rect area = place(0, 5, 100, 40, 0xFF8090A4);
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
  return {"Texts", "Long texts, and a keyboard to type short ones.", sourceOf("families/texts.cpp"),
          kTexts};
}

}  // namespace gallery
