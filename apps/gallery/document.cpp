#include "document.h"

#include <sstream>

#include "example.h"
#include "families/families.h"

namespace gallery {

namespace {

constexpr int kSingleWidth = 300;  // pixels of a picture on the page
constexpr int kGridWidth = 200;
constexpr std::size_t kColumns = 4;

constexpr const char* kOpening = R"(# Gallery

Every widget and every dialog with the code that makes it. Code and pictures come from the examples in
`apps/gallery/families/`, which `brimol_gallery` shows live: `build/release/apps/gallery/brimol_gallery` in the
build, with `BRIMOL_DISPLAY=browser` in a web browser.
`scripts/renew_goldens.sh` writes this page.

An example makes its widgets and runs the application's main loop, `loop()`. In each frame the loop calls
what it is given, and then `MW::Window::show()`; the README's first screen has such a loop. Where an
application does what an answer asks for, an example calls `say()`, which shows a line. Rectangles and
texts come from two functions:

)";

std::string fenced(const std::string& code) { return "```cpp\n" + code + "```\n"; }

std::string imageOf(const Example& example, int width) {
  std::ostringstream tag;
  tag << "<img src=\"../tests/golden/data/" << example.name << ".png\" width=\"" << width
      << "\" alt=\"" << example.title << "\">";
  return tag.str();
}

std::string singly(const Family& family) {
  std::string page;
  for (const Example& example : family.examples) {
    page.append("\n### ").append(example.title).append("\n\n");
    if (*example.about != '\0') page.append(example.about).append("\n\n");
    page.append(imageOf(example, kSingleWidth)).append("\n\n");
    page.append(fenced(codeOf(family, example)));
  }
  return page;
}

std::string sideBySide(const Family& family) {
  std::string page = "\n";
  for (std::size_t i = 0; i < kColumns; ++i) page.append("| ");
  page.append("|\n");
  for (std::size_t i = 0; i < kColumns; ++i) page.append("|---");
  page.append("|\n");
  for (std::size_t i = 0; i < family.examples.size(); ++i) {
    const Example& example = family.examples[i];
    std::string code = codeOf(family, example);
    code.pop_back();  // the line's end
    page.append("| ").append(imageOf(example, kGridWidth));
    page.append("<br>`").append(code).append("` ");
    if (i % kColumns == kColumns - 1 || i + 1 == family.examples.size()) page.append("|\n");
  }
  return page;
}

}  // namespace

std::string document() {
  std::string page = kOpening;
  const std::string_view helpers = sourceOf("place.h");
  page += fenced(functionIn(helpers, "inline constexpr") + '\n' +
                 functionIn(helpers, "/// A text record"));
  for (const Family& family : families()) {
    page.append("\n## ").append(family.name).append("\n\n").append(family.about).append("\n");
    if (family.shared != nullptr) {
      page.append("\n").append(fenced(functionIn(family.source, family.shared)));
    }
    page += family.shelf == Shelf::Grid ? sideBySide(family) : singly(family);
  }
  return page;
}

}  // namespace gallery
