#include "prompt.h"

#include <brimol/scene.h>

#include <memory>
#include <vector>

#include "layout.h"
#include "verdict_bar.h"

namespace factory_test {

namespace {

// Lines of so many characters, cut between words where that is possible.
std::string wrapped(const std::string& words, std::size_t columns) {
  std::string lines;
  std::size_t from = 0;
  while (words.size() - from > columns) {
    const std::size_t blank = words.rfind(' ', from + columns);
    const bool isCut = blank == std::string::npos || blank <= from;
    const std::size_t end = isCut ? from + columns : blank;
    lines.append(words, from, end - from).append("\n");
    from = isCut ? end : end + 1;
  }
  return lines.append(words, from);
}

std::size_t columnsIn(int width, int size) {
  constexpr int kLetterPercent = 60;  // of the text's size: what a wide letter takes
  return static_cast<std::size_t>(
      std::max(width / std::max(percentOf(size, kLetterPercent), 1), 1));
}

}  // namespace

/// What stands behind the buttons.
class Prompt::Panel : public MW::Widget {
 public:
  explicit Panel(const Question& question) {
    const ScreenSize screen = screenSize();
    const int size = textSize(screen);
    place = layOutPrompt(screen);
    ground = {0, 0, screen.width, screen.height, MW::kColorShadow};
    title = textOf(question.title.c_str(), kHeadInk.text, SKIA_ALIGN_CENTRE, percentOf(size, 120));
    const std::string lines = wrapped(question.words, columnsIn(place.words.w, size));
    words = textOf(lines.c_str(), kPanelInk.text, SKIA_ALIGN_LEFT, size);
    setType(MW::kTopLayer);
    setActive(1);
    MW::Window::registerWidget(this);
  }
  ~Panel() override { leaveLayers(); }

  using Widget::show;
  int show(unsigned int) override {
    skia_add_box_c(ground);
    skia_add_box_c(place.frame);
    skia_add_textbox_c(place.title, title);
    skia_add_label_c(place.words, words);
    return 1;
  }

 private:
  PromptLayout place = {};
  SKIA_Rect ground = {};
  SKIA_Text title = {};
  SKIA_Text words = {};
};

Prompt::Prompt(const Question& question)
    : guards{PressGuard(GetTicks()), PressGuard(GetTicks())},
      panel(std::make_unique<Panel>(question)) {
  const auto [yes, no] = layOutPrompt(screenSize()).buttons;
  place<0>(yes, question.yes);
  place<1>(no, question.no);
  veil.emplace(SKIA_Rect{yes.x, yes.y, no.x + no.w - yes.x, yes.h, 0}, MW::kTopLayer,
               GetTicks() + PressGuard::kDeafMs);
  key.emplace().keyPressCallback = [](MW::kbd_event* event) {
    if (event->code == MW::kKeySelect) Current<Prompt>::get().given = Answer::Yes;
    if (event->code == kKeyBack) Current<Prompt>::get().given = Answer::No;
  };
  MW::isDisplayUpdate(1);
}

Prompt::~Prompt() = default;

template <std::size_t index>
void Prompt::place(const SKIA_Rect& area, const char* words) {
  const SKIA_Text caption = captionOf(words, kButtonInk.text);
  MW::Button& button = buttons.at(index).emplace(&area, &caption);
  button.pressCallback = [](int) { Current<Prompt>::get().guards.at(index).press(GetTicks()); };
  button.clickCallback = [](int) { Current<Prompt>::get().click(index); };
  button.setActive(1);
}

void Prompt::click(std::size_t index) {
  if (guards.at(index).takeClick()) given = index == 0 ? Answer::Yes : Answer::No;
}

}  // namespace factory_test
