/// Pictures that are looked at one after another.
#pragma once

#include <vector>

#include "measure_page.h"

namespace factory_test {

/// Begins with what to do. A tap, or the right, down or select key, confirms what is shown and
/// shows the next picture, but not before it was there for half a second; the left and up keys show
/// the one before. The operator judges at the end.
class StepPage : public MeasurePage {
 public:
  std::vector<Measure> values() const override { return {measure(valueName, confirmed)}; }

 protected:
  /// What differs between the kinds.
  struct Kind {
    const char* test;
    const char* title;
    const char* words;
    const char* value;  // its only one: how many pictures were confirmed
    const char* question;
    int count;
  };

  StepPage(const Context& program, const Kind& kind);

  /// Draws one of the pictures, from 0.
  virtual void drawStep(int picture) = 0;
  /// Comes when another picture, or the first words (-1), are to be shown.
  virtual void beginStep(int picture) { static_cast<void>(picture); }

  void follow(const Input& input) override;
  bool isDone() const override { return confirmed >= count; }
  void drawLook() override;
  bool hasWords() const override { return step < 0; }
  bool isForEyes() const override { return true; }
  std::string question() const override;

 private:
  void moveBy(int by, uint32_t now);

  const char* valueName;
  const char* finalQuestion;
  int count;
  int step = -1;
  int confirmed = 0;
  uint32_t shownSince = 0;
};

}  // namespace factory_test
