/// What pages share that measure over the whole screen.
#pragma once

#include <optional>
#include <set>
#include <string>
#include <vector>

#include "context.h"
#include "input_watch.h"
#include "page_test.h"
#include "plan/plan.h"

namespace factory_test {

/// A look that passes by itself once it has seen all that it must: its values are judged then. A
/// finger that is held still for two seconds, or the back key, ends it before, and the verdict is
/// asked for. Its kinds work on the main thread alone.
class MeasurePage : public LookTest {
 public:
  Outcome verdict() const final { return hasPassed ? Outcome::Pass : page.outcome(); }
  bool isComplete() const final { return hasPassed || isDone(); }
  void draw() final;
  void showProgress(const RunProgress& sofar) final;
  void prepare(const PlanStep& planned) final;

 protected:
  /// `usualWords`: what to do, unless the plan says it.
  MeasurePage(const Context& program, const char* test, const char* title,
              const std::string& usualWords);

  /// Tells of an input, at the moment that it names.
  virtual void follow(const Input& input) = 0;
  /// A round of the main loop, after the inputs.
  virtual void updateAt(uint32_t now) { static_cast<void>(now); }
  /// Whether it has seen all that it must.
  virtual bool isDone() const = 0;
  /// Draws the whole screen while it is looked at, but for the words.
  virtual void drawLook() = 0;
  /// Where the card with the words stands, in per cent of the screen's height; whether it is there.
  virtual int wordsAt() const;
  virtual bool hasWords() const { return true; }
  /// Whether it goes on while a finger is down, which would move the menu that comes next.
  virtual bool waitsForLift() const { return true; }
  /// Whether follow() is told of fingers that came down before the page, such as the one that chose
  /// it.
  virtual bool followsOldTouches() const { return false; }
  /// Whether only the operator can say if what was seen is right: he is asked then.
  virtual bool isForEyes() const { return false; }
  /// Words with a "%d" in them, which becomes the count.
  static std::string counted(const char* words, double count);
  std::string question() const override;
  void endLook() override { watch.reset(); }

  double parameter(std::string_view name) const { return planStep.parameter(name); }
  Measure measure(std::string_view name, double value) const;
  std::vector<Measure> measure(std::initializer_list<Figure> figures) const;
  /// Not measured where the display's density is unknown.
  static double millimetres(double pixels);
  /// Whether two places lie no farther apart, by the density of a usual phone where it is unknown.
  static bool isWithinMm(double pixels, double most);
  /// Of a finger that came down before the page.
  bool isOfAnOldTouch(const Input& input) const;

 private:
  /// Where a finger came down, and has stayed since.
  struct Still {
    uint32_t finger;
    int x;
    int y;
    uint32_t since;
  };

  void beginLook() final { watch.emplace(); }
  void updateLook() final;
  void followStill(const Input& input);
  bool isWhereItWas(const Input& input) const;
  struct CardLine {
    std::string words;
    int size;
  };
  std::vector<CardLine> linesOfCard(int width) const;
  void drawCard() const;

  RunProgress progress;
  std::string instructions;
  bool hasPassed = false;
  std::set<uint32_t> fingers;  // that are down
  std::optional<Still> still;  // the only one of them
  std::optional<InputWatch> watch;
};

}  // namespace factory_test
