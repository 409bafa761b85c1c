// Slides that end something once their knob has come to the other end.
#include <MW/slide_e.h>

#include <memory>
#include <optional>

#include "current.h"
#include "language/language.h"
#include "layout.h"
#include "page_test.h"
#include "pages/table.h"

namespace factory_test {

namespace {

/// One slide passes the test, the other leaves it.
class ExitSlideTest : public PageTest {
 public:
  ExitSlideTest()
      : PageTest(tr("Exit slides"),
                 tr("Drag a knob to the other end:\nthe upper one passes, the lower leaves.")) {}

  void enter() override {
    page.ask();
    const auto rows = rowsOf<5>(inColor(contentArea(), kButtonInk.ground), 0, {1, 2, 1, 2, 1});
    place(passing, rows[1], MW::SlideE::kFromLeft, tr("Slide to pass"));
    place(leaving, rows[3], MW::SlideE::kFromRight, tr("Slide to leave"));
    passing->exitCallback = [](int) { Current<ExitSlideTest>::get().ended = Outcome::Pass; };
    leaving->exitCallback = [](int) { Current<ExitSlideTest>::get().ended = Outcome::Left; };
  }

  void leave() override {
    leaving.reset();
    passing.reset();
    page.endAsking();
  }

  bool isComplete() const override { return ended == Outcome::Pass; }

  Outcome verdict() const override {
    const Outcome slid = ended;
    return slid != Outcome::Running ? slid : PageTest::verdict();
  }

 private:
  static void place(std::optional<MW::SlideE>& slide, const SKIA_Rect& area,
                    MW::SlideE::State state, const char* words) {
    const SKIA_Text caption = captionOf(words, kButtonInk.text);
    slide.emplace(state, &area, &caption, "");
    slide->setActive(1);
  }

  Current<ExitSlideTest> current{this};
  std::atomic<Outcome> ended = Outcome::Running;
  std::optional<MW::SlideE> passing;
  std::optional<MW::SlideE> leaving;
};

}  // namespace

std::unique_ptr<Test> makeExitSlides(const Context&) { return std::make_unique<ExitSlideTest>(); }

}  // namespace factory_test
