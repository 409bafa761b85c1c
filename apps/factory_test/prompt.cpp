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
    place.title = inColor(place.title, question.ink.ground);
    title = captionIn(place.title, question.title.c_str(), question.ink.text,
                      percentOf(size, question.size == Title::Huge ? 250 : 120));
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

Prompt::Prompt(const Question& question) : panel(std::make_unique<Panel>(question)) {
  const auto [yes, no] = layOutPrompt(screenSize()).buttons;
  buttons.place<0>(yes, captionIn(yes, question.yes, kButtonInk.text));
  buttons.place<1>(no, captionIn(no, question.no, kButtonInk.text));
  veil.emplace(SKIA_Rect{yes.x, yes.y, no.x + no.w - yes.x, yes.h, 0}, MW::kTopLayer,
               GetTicks() + PressGuard::kDeafMs);
  moveToTop(key.emplace());
  key->keyPressCallback = [](MW::kbd_event* event) {
    Current<Prompt>::get().followKey(event->code);
  };
  MW::isDisplayUpdate(1);
}

Prompt::~Prompt() = default;

void Prompt::followKey(unsigned int code) {
  if (buttons.isDeaf()) return;
  if (code == MW::kKeySelect) given = Answer::Yes;
  if (code == kKeyBack) given = Answer::No;
}

void Prompt::choose(std::size_t index) { given = index == 0 ? Answer::Yes : Answer::No; }

}  // namespace factory_test
