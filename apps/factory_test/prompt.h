/// A question over everything.
#pragma once

#include <MW/button.h>
#include <MW/key.h>

#include <array>
#include <atomic>
#include <memory>
#include <optional>
#include <string>

#include "current.h"
#include "layout.h"
#include "on_top.h"
#include "press_guard.h"
#include "veil.h"

namespace factory_test {

/// What is asked, and what the two buttons say.
struct Question {
  std::string title;
  std::string words;
  const char* yes;
  const char* no;
};

struct PromptLayout {
  SKIA_Rect frame;
  SKIA_Rect title;
  SKIA_Rect words;
  std::array<SKIA_Rect, 2> buttons;
};

constexpr PromptLayout layOutPrompt(ScreenSize screen) {
  const int gap = gapOf(screen);
  const SKIA_Rect whole = {0, 0, screen.width, screen.height, 0};
  const auto middle = rowsOf<3>(whole, 0, {3, 4, 3})[1];
  const bool isWide = isLandscape(screen);
  const SKIA_Rect frame = isWide ? columnsOf<3>(middle, 0, {1, 2, 1})[1] : within(middle, gap);
  const auto [title, words, buttons] = rowsOf<3>(within(frame, gap), gap, {2, 5, 3});
  return {inColor(frame, kPanelInk.ground), inColor(title, kHeadInk.ground), words,
          columnsOf<2>(inColor(buttons, kButtonInk.ground), 2 * gap, {1, 1})};
}

/// Stands in the top layer from construction to destruction. The left button or the select key says
/// yes, the right button or the back key no. There is one at a time.
class Prompt {
 public:
  enum class Answer { None, Yes, No };

  explicit Prompt(const Question& question);
  ~Prompt();
  Prompt(const Prompt&) = delete;
  Prompt& operator=(const Prompt&) = delete;
  /// Any thread.
  Answer answer() const { return given; }

 private:
  class Panel;
  static constexpr std::size_t kButtons = 2;

  template <std::size_t index>
  void place(const SKIA_Rect& area, const char* words);
  void click(std::size_t index);

  Current<Prompt> current{this};
  std::atomic<Answer> given = Answer::None;
  std::array<PressGuard, kButtons> guards;
  std::unique_ptr<Panel> panel;
  std::array<std::optional<OnTop<MW::Button>>, kButtons> buttons;
  std::optional<Veil> veil;
  std::optional<OnTop<MW::Key>> key;
};

}  // namespace factory_test
