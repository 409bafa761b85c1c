// The coloured pages.

#include <MW/auto_cap_screen.h>
#include <MW/dialog_warn.h>

#include "dialogs/dialog_plays.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using ColorPageTest = WidgetTest;

std::unique_ptr<MW::Widget> warning() {
  auto made = makesOwn<MW::DialogWarn>(MW::kColorRed)();
  auto& page = static_cast<MW::DialogWarn&>(*made);
  page.doubleKeyCallback = [](MW::kbd_event* key) { note("twice" + std::to_string(key->code)); };
  page.tripleKeyCallback = [](MW::kbd_event* key) { note("thrice" + std::to_string(key->code)); };
  return made;
}

const PlaysOn kWarning = {warning};
const PlayTests kPlays = {
    kWarning("TouchesAreToldAndPassedOn",
             {press(1, 1), drag(1, 0), release(), longPress(1, 1), lcdOn(0), press()},
             "touch- - lift- - touch-"),
    kWarning("KeysAreTakenAndCounted",
             {keyDown(323), keyUp(5), keyUp(5), keyUp(5), keyUp(6), plug(7), appEvent(1)},
             "down323+ up5+ twice5 up5+ thrice5 up5+ up6+ - -"),
};

TEST_F(ColorPageTest, TakesTextsThatFitItsFourBoxes) {
  MW::DialogWarn page(MW::kColorRed);
  page.setText(0, {}, textRecord(kTooLong));
  page.setText(4, {}, textRecord("no such box"));
  EXPECT_EQ(words(shown(page)), "");
  page.setText(3, {1, 2, 3, 4, 5}, textRecord(kTooLong.substr(5)));
  page.setText_str(0, "LONGER");
  EXPECT_EQ(words(shown(page)), std::string("LON\0ER|", 7) + "ABC|ABC|" + kTooLong.substr(5) + '|');
}

TEST_F(ColorPageTest, AnAutoCapScreenChangesAtOnceAndWithItsLayout) {
  MW::AutoCapScreen page(7);
  EXPECT_EQ(shown(page).front().rect.color, 0U) << "transparent";
  page.setBgColor(1);
  page.setBg_title(2);
  EXPECT_EQ(shown(page).front().rect.color, 1U);
  page.setRect(0, 0);
  EXPECT_EQ(page.getBgColor(), 2U);
  page.setText_str(3, "LONGER");
  EXPECT_STREQ(page.getText(3)->text, "LONGER");
  page.setTextColor(4, 6);
  EXPECT_EQ(page.getTextColor(4), 0U) << "no such box";
  EXPECT_EQ(page.getText(4), nullptr);
}

struct TimedPage : MW::DialogWarn {
  TimedPage() : DialogWarn(MW::kColorRed) { timerOn = 1; }
};

TEST_F(ColorPageTest, AsksForFramesFromTheLastKeyOn) {
  const auto asks = [](std::initializer_list<unsigned int> passes) {
    TimedPage page;
    platform().ticks = 0xFFFFFFF0;
    offer(page, keyEvent(MW::kEventKeyRelease, 5));
    std::string asked;
    for (const unsigned int pass : passes) {
      page.updateTimer(pass);
      asked += MW::isDisplayUpdate(0) == 1 ? '+' : '-';
    }
    return asked;
  };
  EXPECT_EQ(asks({0xFFFFFFEF, 0xFFFFFFF0, 0x10, 0x90000000}), "-+++") << "for weeks";
  EXPECT_EQ(asks({0x10}), "+") << "the clock wraps before the first pass";
}

}  // namespace
