/// Tables of plays, for tests of widgets.
#pragma once

#include "support/widget_test.h"
#include <brimol3_widget_test/play.h>

namespace brimol::test {

/// Plays the steps once for each callback that they cause, which then deletes the widget: nothing
/// is told after that.
inline void expectCallbacksMayDelete(const Maker& make, const Steps& steps) {
  played(make, steps);
  for (int deleting = stage.calls; deleting > 0; --deleting) {
    played(make, steps, deleting);
    EXPECT_EQ(stage.calls, deleting) << "calls once the widget was deleted";
  }
}

/// A row of a table of plays.
struct Play : Row {
  Maker make;
  Steps steps;
  std::string journal;
};
/// Makes rows of plays on one widget.
struct PlaysOn {
  Maker make;
  Play operator()(const char* name, const Steps& steps, const char* journal) const {
    return {name, make, steps, journal};
  }
};
/// Plays a row, and again for each of its callbacks, which then deletes the widget.
inline void expectJournal(const Play& play) {
  EXPECT_EQ(played(play.make, play.steps), play.journal);
  expectCallbacksMayDelete(play.make, play.steps);
}
/// The fixture of such a table:
///
///     using SlidePlays = PlayTest;
///     TEST_P(SlidePlays, TellTheirJournal) { expectJournal(GetParam()); }
///     INSTANTIATE_TEST_SUITE_P(, SlidePlays, testing::ValuesIn(kPlays), kRowName);
class PlayTest : public WidgetTest, public testing::WithParamInterface<Play> {};

}  // namespace brimol::test
