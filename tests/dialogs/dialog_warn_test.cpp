// The coloured pages, and the one of them whose texts are cut.

#include <MW/dialog_warn.h>

#include "dialogs/dialog_plays.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MW::DialogWarn;
using DialogWarnTest = WidgetTest;

// Its third key deletes it.
std::unique_ptr<MW::Widget> warning() {
  auto made = makesOwn<DialogWarn>(0xFF112233)();
  auto& page = static_cast<DialogWarn&>(*made);
  page.doubleKeyCallback = [](MW::kbd_event* key) { note("twice" + std::to_string(key->code)); };
  page.tripleKeyCallback = [](MW::kbd_event* key) {
    stage.widget.reset();
    note("record" + std::to_string(key->code));
  };
  return made;
}

const PlaysOn kWarning = {warning};
const auto kPlays = std::to_array<Play>({
    kWarning("TouchesAreToldAndPassedOn",
             {press(1, 1), drag(1, 0), release(), longPress(1, 1), lcdOn(0), press()},
             "touch- - lift- - touch-"),
    kWarning("KeysAreTaken",
             {keyDown(323), keyUp(5), keyUp(6), later(1000), keyUp(6), plug(7), appEvent(1)},
             "down323+ up5+ up6+ up6+ - -"),
    kWarning("RepeatedKeysAreCountedAndARecordOutlivesItsPage",
             {keyUp(5), later(999), keyUp(5), keyUp(5)}, "up5+ twice5 up5+ record5+"),
});
using DialogWarnPlays = PlayTest;
TEST_P(DialogWarnPlays, TellTheirJournal) { expectJournal(GetParam()); }
INSTANTIATE_TEST_SUITE_P(, DialogWarnPlays, testing::ValuesIn(kPlays), kRowName);

TEST_F(DialogWarnTest, TakesTextsThatFitItsFourBoxes) {
  DialogWarn page(0xFF112233);
  page.setText(0, {}, textRecord(kTooLong));
  page.setText(4, {}, textRecord("no such box"));
  EXPECT_EQ(places(shown(page)), "0,0 1441x2561|");
  page.setText(3, {1, 2, 3, 4, 5}, textRecord(kTooLong.substr(5)));
  page.setText_str(0, "LONGER");
  EXPECT_EQ(words(shown(page)), std::string("LON\0ER|", 7) + "ABC|ABC|" + kTooLong.substr(5) + '|');
  EXPECT_EQ(shown(page).back().rect, (SKIA_Rect{1, 2, 3, 4, 5}));
}

TEST_F(DialogWarnTest, ShowsANewColourWithTheNextLayout) {
  DialogWarn page(0xFF112233);
  page.setBg_title(7);
  EXPECT_EQ(shown(page).front().rect.color, 0xFF112233);
  page.setRect(0, 0);
  EXPECT_EQ(shown(page).front().rect.color, 7U);
}

}  // namespace
