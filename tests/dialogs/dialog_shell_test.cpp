#include <MW/dialog_shell.h>

#include "dialogs/dialog_plays.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MW::DialogShell;
using DialogShellTest = WidgetTest;

TEST_F(DialogShellTest, OtherFingersNeitherPressNorMoveButMayLift) {
  const Maker shell = makes<DialogShell>("Title", 3);
  const Steps steps = {
      finger(1),           press(154, 1774), finger(0),     press(),      drag(1, 0),
      release(1285, 1993), lookAtHold(),     release(0, 0), keyDown(323), plug(17)};
  EXPECT_EQ(played(shell, steps), "press+ - - button1 click+ <held 2> click+ down323+ +");
}

struct Open : DialogShell {
  using DialogShell::DialogShell;
  using DialogShell::twoButtons;
};

TEST_F(DialogShellTest, StartsOverWithOneButton) {
  Open shell("Title", 3);
  const std::string oneButton = places(shown(shell));
  shell.twoButtons = 1;
  shell.setRect_static();
  EXPECT_NE(places(shown(shell)), oneButton);
  shell.init_DialogShell("Title");
  EXPECT_EQ(places(shown(shell)), oneButton);
}

TEST_F(DialogShellTest, DropsTheOldestLine) {
  for (const auto& [asked, room, left] :
       {std::tuple(0, 1, "f|"), {3, 3, "e|f|"}, {26, 25, "a|b|c|e|f|"}}) {
    DialogShell shell("Title", asked);
    int slot = 0;
    for (const char* const line : {"a", "b", "c", "", "e", "f"}) {
      EXPECT_EQ(shell.addShell(line), slot++ % room);
    }
    EXPECT_EQ(shell.addShell(kTooLong.c_str() + 1), DialogShell::kNoLine);
    EXPECT_EQ(shell.addShell(nullptr), DialogShell::kNoLine);
    EXPECT_EQ(words(shown(shell)), "Title|" + std::string(left) + "OK|CANCEL|") << asked;
  }
}

}  // namespace
