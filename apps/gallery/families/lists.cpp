// Lists over the whole screen.
#include <MW/main_list.h>
#include <MW/mpd_wid.h>

#include <array>
#include <climits>

#include "families/families.h"
#include "place.h"

namespace gallery {

namespace {

// The result list's letters are as small on every screen.
constexpr ScreenSize kSmallPhone = {720, 1280};

constexpr auto kLists = std::to_array<Example>({
    {"main_list",
     "MainList",
     "A menu under a title. The first row has no height: a row that stands exactly at the list's "
     "top is not drawn.",
     {0, 65},
     [](Loop& loop) {
       MW::MainList list(" Menu", MW::MainList::kPlain);
       const SKIA_Text nothing = {};
       const SKIA_Text group = words(" Sensors", 0, SKIA_ALIGN_LEFT);
       list.addIndex(MW::MainList::kDark, &nothing, 0);
       list.addIndex(MW::MainList::kDark, &group, place(0, 0, 0, 5).h);
       for (const char* const name : {"   Light", "   Proximity", "   Gyro", "   Compass"}) {
         const SKIA_Text row = words(name, 0, SKIA_ALIGN_LEFT);
         list.addIndex(MW::MainList::kSelectable, &row, place(0, 0, 0, 8).h);
       }
       const SKIA_Text absent = words("   Barometer", 0, SKIA_ALIGN_LEFT);
       list.addIndex(MW::MainList::kGrey, &absent, place(0, 0, 0, 8).h);
       list.initFinish();
       list.setTextBattery("BAT 87% ", 8);
       list.setTextBrightness("LCD 120 ", 8);
       list.clickCallback = [](MW::mouse_event* mouse, MW::MainList* from) {
         say("Row", from->position2index(*mouse));
       };
       list.setActive(1);
       loop();
     }},
    {"main_list_extended",
     "MainList with all status texts",
     "A verdict is told by the colour of a row. An item of the kind `kEnd` would end the list.",
     {0, 60},
     [](Loop& loop) {
       MW::MainList list(" Menu", MW::MainList::kExtended);
       const SKIA_Text nothing = {};
       list.addIndex(MW::MainList::kDark, &nothing, 0);
       for (const char* const name : {"   Light", "   Proximity", "   Gyro", "   Compass"}) {
         const SKIA_Text row = words(name, 0, SKIA_ALIGN_LEFT);
         list.addIndex(MW::MainList::kSelectable, &row, place(0, 0, 0, 9).h);
       }
       list.initFinish();
       list.setBGColor(1, 0xFF107010);
       list.setText(1, "   Light: PASS", 14);
       list.setTextColor(2, 0xFFFFE060);
       list.setTextOption(MW::MainList::kOperator, " Carrier", 8);
       list.setTextOption(MW::MainList::kAddress, "00:11:22", 8);
       list.setTextOption(MW::MainList::kSignal, "-71 dBm ", 8);
       list.setActive(1);
       loop();
     }},
    {"mpd_wid",
     "MpdWid",
     "Results in levels, from lines of text. A double tap on a line that is marked \"[>]\" shows "
     "those below it.",
     {7, 60},
     [](Loop& loop) {
       MW::MpdWid list("Results");
       list.cal_line(
           "[1] 10:01 Board   [MPDIA] Board]PASS\n"
           "[2] 10:01 Power   [MPDIA] Power]3.9 V\n"
           "[3] 10:02 Charger [MPDIA] Charger]500 mA\n"
           "[1] 10:03 Camera  [MPDIA] Camera]FAIL\n"
           "[2] 10:04 Front   [MPDIA] Front]no lens\n"
           "[1] 10:05 Radio   [MPDIA] Radio]PASS\n",
           INT_MAX);
       loop();
     },
     MW::kBaseLayer,
     0,
     kSmallPhone},
});

}  // namespace

Family lists() {
  return {"Lists", "Lists over the whole screen, which a finger scrolls.",
          sourceOf("families/lists.cpp"), kLists};
}

}  // namespace gallery
