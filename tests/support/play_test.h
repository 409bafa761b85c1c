/// Tables of plays, for tests of widgets.
#pragma once

#include <filesystem>
#include <initializer_list>

#include <brimol3_widget_test/play.h>
#include "support/widget_test.h"

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
/// A table of plays, each of which becomes a test named after its row, in a suite named after its
/// file: it plays the row, and again for each of its callbacks, which then deletes the widget.
///
///     const PlayTests kPlays = {kSlide("IsGrabbed", {press(1, 1)}, "+")};
class PlayTests {
 public:
  PlayTests(std::initializer_list<Play> plays, const char* file = __builtin_FILE(),
            int line = __builtin_LINE()) {
    const std::string suite = std::filesystem::path(file).stem();
    for (const Play& play : plays) {
      testing::RegisterTest(suite.c_str(), play.name, nullptr, nullptr, file, line,
                            [play]() -> WidgetTest* { return new Test(play); });
    }
  }

 private:
  struct Test : WidgetTest {
    explicit Test(Play row) : play(std::move(row)) {}
    void TestBody() override {
      EXPECT_EQ(played(play.make, play.steps), play.journal);
      expectCallbacksMayDelete(play.make, play.steps);
    }
    Play play;
  };
};

}  // namespace brimol::test
