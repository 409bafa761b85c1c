#include "prompt.h"

#include <brimol/scene.h>

#include <memory>
#include <vector>

#include "layout.h"
#include "verdict_bar.h"

namespace factory_test {

/// What stands behind the buttons.
class Prompt::Panel : public MW::Widget {
 public:
  explicit Panel(const Question& question) : words(question.words) {
    const ScreenSize screen = screenSize();
    size = textSize(screen);
    place = layOutPrompt(screen);
    ground = {0, 0, screen.width, screen.height, MW::kColorShadow};
    title = captionIn(place.title, question.title.c_str(), kHeadInk.text, percentOf(size, 120));
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
    drawWords(place.words, words, kPanelInk.text, leadingAlign(), size);
    return 1;
  }

 private:
  PromptLayout place = {};
  SKIA_Rect ground = {};
  SKIA_Text title = {};
  std::string words;
  int size = 0;  // of their letters, pixels
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
  const SKIA_Text caption = captionIn(area, words, kButtonInk.text);
  MW::Button& button = buttons.at(index).emplace(&area, &caption);
  button.pressCallback = [](int) { Current<Prompt>::get().guards.at(index).press(GetTicks()); };
  button.clickCallback = [](int) { Current<Prompt>::get().click(index); };
  button.setActive(1);
}

void Prompt::click(std::size_t index) {
  if (guards.at(index).takeClick()) given = index == 0 ? Answer::Yes : Answer::No;
}

}  // namespace factory_test
