#include "browser.h"

#include <MW/static_text.h>
#include <MW/window.h>

#include <span>
#include <string>
#include <vector>

#include "bar.h"
#include "chooser.h"
#include "example.h"
#include "main_loop.h"
#include "place.h"

namespace gallery {

namespace {

constexpr uint32_t kPaper = 0xFFF4F4EC;

/// Runs until the user asks for something else, with the bar above all.
class BrowserLoop : public Loop {
 public:
  explicit BrowserLoop(Bar& itsBar) : bar(itsBar) {}

  using Loop::operator();
  void operator()(const Draw& draw) override {
    runMainLoop([] { return Bar::wish() != Wish::None; },
                [&] {
                  draw();
                  MW::Window::show();
                  bar.draw();
                });
  }

 private:
  Bar& bar;
};

template <typename Named>
std::vector<std::string> namesOf(std::span<const Named> all, const char* Named::*name) {
  std::vector<std::string> names;
  for (const Named& each : all) names.emplace_back(each.*name);
  return names;
}

// Of the rows that the viewer holds, the longest line of code takes one.
void showCode(const std::string& code, BrowserLoop& loop) {
  constexpr int kTextPercent = 45;
  const SKIA_Rect area = place(1, 1, 98, 85, kPaper);
  SKIA_Text looks = words("", MW::kColorBlack, SKIA_ALIGN_LEFT);
  looks.size = atLeastMm(looks.size * kTextPercent / 100, kReadMm);
  MW::StaticText viewer(&area, &looks);
  viewer.setText(code.c_str());
  viewer.setActive(1);
  loop();
}

enum class Side { Example, Code };

Wish show(const Family& family, const Example& example, Side side) {
  const bool isCode = side == Side::Code;
  Bar bar(example.title, isCode ? "Example" : "Code", isCode ? MW::kBaseLayer : example.layer);
  BrowserLoop loop(bar);
  if (isCode) {
    showCode(codeOf(family, example), loop);
  } else {
    example.run(loop);
  }
  return Bar::wish();
}

// From the example at `index` on; returns the one that was shown last.
std::size_t showFrom(const Family& family, std::size_t index) {
  const std::size_t count = family.examples.size();
  Side side = Side::Example;
  while (!isEnded()) {
    switch (show(family, family.examples[index], side)) {
      case Wish::Previous: index = (index + count - 1) % count; break;
      case Wish::Next: index = (index + 1) % count; break;
      case Wish::Other: side = side == Side::Example ? Side::Code : Side::Example; break;
      default: return index;
    }
  }
  return index;
}

void showFamily(const Family& family) {
  std::size_t last = 0;
  while (const auto chosen = choose(family.name, namesOf(family.examples, &Example::title), last)) {
    last = showFrom(family, *chosen);
  }
}

}  // namespace

void browse() {
  std::size_t last = 0;
  while (const auto chosen = choose("Gallery", namesOf(families(), &Family::name), last)) {
    last = *chosen;
    showFamily(families()[last]);
  }
}

}  // namespace gallery
