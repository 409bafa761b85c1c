#include <MW/key.h>

#include "support/play_test.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using KeyTest = WidgetTest;

const PlaysOn kKey = {makes<MW::Key>()};
const PlaysOn kNoPlug = {without(&MW::Widget::plugCallback, kKey.make)};

const PlayTests kPlays = {
    kKey("TakesAllButTouches",
         {press(1, 2), moveTo(5, 5), release(3, 4), longPress(5, 6), lookAtLog(), keyDown(10),
          keyUp(11), appEvent(12), plug(13)},
         "touch- - lift- long+ <[KEY] long pressed!!> down10+ up11+ + +"),
    kKey("TellsTheSecondAndThirdReleaseOfAKey", {keyUp(5), keyUp(5), keyUp(5), keyUp(5), keyUp(6)},
         "up5+ twice5 up5+ thrice5 up5+ up5+ up6+"),
    kKey("TellsASettledPlugAfterADrawingPass",
         {plug(2), later(100), draw(), later(1), draw(), later(900), draw(), plug(5), draw()},
         "+ plug2 plug5+"),
    kKey("TellsAPassingPlugAsSettled", {plug(17), later(50), plug(18), plug(5), later(101), draw()},
         "+ + + plug2"),
    kKey("AnotherPlugReplacesASettledOne", {plug(2), plug(5), later(200), draw()}, "+ plug5+"),
    kKey(
        "TellsAPlugThatNoPassMetBeforeTheWrap",
        {at(~0x100U), plug(17), at(0x100), draw(), at(~99U), plug(2), at(0), draw(), at(1), draw()},
        "+ plug2 + plug2"),
    kKey("TellsAPlugOfTheClocksStart", {at(0), plug(2), at(100), draw(), at(101), draw()},
         "+ plug2"),
    kNoPlug("HoldsNoPlugWithoutACallback",
            {plug(2),
             call([](MW::Widget& key) { key.plugCallback = [](MW::kbd_event*) { note("plug"); }; }),
             later(200), draw()},
            "+"),
};

// A callback that deletes the widget can still read its record.
TEST_F(KeyTest, ARecordOutlivesItsWidget) {
  for (const auto word : {&MW::Widget::doubleKeyCallback, &MW::Widget::tripleKeyCallback}) {
    stage.widget = std::make_unique<MW::Key>();
    (*stage.widget).*word = [](MW::kbd_event* key) {
      stage.widget.reset();
      stage.journal = std::to_string(key->code);
    };
    while (stage.widget != nullptr) offer(*stage.widget, keyEvent(MW::kEventKeyRelease, 5));
    EXPECT_EQ(std::exchange(stage.journal, ""), "5");
  }
}

}  // namespace
