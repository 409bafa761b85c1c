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
#include "guarded_buttons.h"
#include "layout.h"
#include "on_top.h"
#include "veil.h"

namespace factory_test {

enum class Title { Usual, Huge };

/// What is asked, and what the two buttons say.
struct Question {
  std::string title;
  std::string words;
  const char* yes;
  const char* no;
  Ink ink = kHeadInk;  // of the title
  Title size = Title::Usual;
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
  const auto middle = rowsOf<3>(whole, 0, {1, 2, 1})[1];
  const bool isWide = isLandscape(screen);
  const SKIA_Rect frame = isWide ? columnsOf<3>(middle, 0, {1, 2, 1})[1] : within(middle, gap);
  const auto [title, words, buttons] = rowsOf<3>(within(frame, gap), gap, {2, 5, 3});
  return {inColor(frame, kPanelInk.ground), inColor(title, kHeadInk.ground), words,
          columnsOf<2>(inColor(buttons, kButtonInk.ground), 2 * gap, {1, 1})};
}

/// Stands in the top layer from construction to destruction. The left button or the select key says
/// yes, the right button or the back key no, but none of them at first (PressGuard). There is one
/// at a time.
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

  using Buttons = GuardedButtons<Prompt, OnTop<MW::Button>, kButtons>;
  friend Buttons;

  void choose(std::size_t index);
  void followKey(unsigned int code);

  Current<Prompt> current{this};
  std::atomic<Answer> given = Answer::None;
  std::unique_ptr<Panel> panel;
  Buttons buttons;
  std::optional<Veil> veil;
  std::optional<MW::Key> key;
};

}  // namespace factory_test
