#include <MW/key.h>

#include "support/play.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using KeyTest = WidgetTest;
using KeyPlays = PlayTest;

const Maker kKey = makes<MW::Key>();

const std::vector<Play> kPlays = {
    {"TakesAllButTouches",
     kKey,
     {press(1, 2), moveTo(5, 5), release(3, 4), longPress(5, 6), lookAtLog(), keyDown(10),
      keyUp(11), appEvent(12), plug(13)},
     "touch- - lift- long+ <[KEY] long pressed!!> down10+ up11+ + +"},
    {"TellsTheSecondAndThirdReleaseOfAKey",
     kKey,
     {keyUp(5), later(999), keyUp(5), later(999), keyUp(5), keyUp(5), keyUp(6), keyUp(5)},
     "up5+ twice5 up5+ thrice5 up5+ up5+ up6+ up5+"},
    {"StartsAnewAfterASecond",
     kKey,
     {keyUp(5), later(1000), keyUp(5), keyUp(5)},
     "up5+ up5+ twice5 up5+"},
    {"TellsASettledPlugAfterADrawingPass",
     kKey,
     {plug(2), later(100), draw(), later(1), draw(), later(900), draw(), plug(5), draw()},
     "+ plug2 plug5+"},
    {"TellsAPassingPlugAsSettled",
     kKey,
     {plug(17), later(50), plug(18), plug(5), later(100), draw(), later(1), draw()},
     "+ + + plug2"},
    {"AnotherPlugReplacesASettledOne",
     kKey,
     {plug(5), draw(), plug(2), plug(5), later(200), draw()},
     "+ + plug5+"},
    {"HoldsNoPlugWithoutACallback",
     without(&MW::Widget::plugCallback, kKey),
     {plug(2),
      call([](MW::Widget& key) { key.plugCallback = [](MW::kbd_event*) { note("plug"); }; }),
      later(200), draw()},
     "+"},
};
TEST_P(KeyPlays, TellTheirJournal) { expectJournal(GetParam()); }
INSTANTIATE_TEST_SUITE_P(, KeyPlays, testing::ValuesIn(kPlays), kRowName);

TEST_F(KeyTest, IsActiveFromItsConstruction) {
  MW::Key key;
  EXPECT_TRUE(key.isActive());
  EXPECT_TRUE(offer(key, keyEvent(MW::kEventKeyRelease, 5))) << "before it has callbacks";
}

// The record of a callback that deletes the widget is still that of the call.
TEST_F(KeyTest, ARecordOutlivesItsWidget) {
  static std::unique_ptr<MW::Key> key;
  static unsigned int code;
  constexpr auto kDelete = [](MW::kbd_event* told) {
    key.reset();
    code += told->code;
  };
  code = 0;
  for (const auto word : {&MW::Widget::doubleKeyCallback, &MW::Widget::tripleKeyCallback}) {
    key = std::make_unique<MW::Key>();
    (*key).*word = kDelete;
    while (key != nullptr) offer(*key, keyEvent(MW::kEventKeyRelease, 5));
  }
  EXPECT_EQ(code, 10U);
}

}  // namespace
