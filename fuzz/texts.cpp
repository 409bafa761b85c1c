// Texts into every operation that takes one: short ones with all that a class has, and a long one
// at the end.

#include <MW/MW.h>

#include <array>
#include <string>

#include "stage.h"

namespace {

using brimol::fuzz::FuzzStage;

// Gives a widget a long text, where its class takes long ones.
void giveLong(MW::Widget& widget, const std::string& text) {
  widget.setText(text.c_str());
  if (auto* const viewer = dynamic_cast<MW::StaticText*>(&widget)) {
    viewer->line_search(text.c_str());
    viewer->get_ime_result(text.substr(0, text.size() / 8).c_str());
    viewer->line_search_point(MW::StaticText::kNext);
  }
  if (auto* const list = dynamic_cast<MW::MpdWid*>(&widget)) {
    list->cal_line(text.c_str(), static_cast<int>(text.size()));
  }
  if (auto* const shell = dynamic_cast<MW::DialogShell*>(&widget)) shell->addShell(text.c_str());
  if (auto* const keyboard = dynamic_cast<MW::Ime*>(&widget)) {
    keyboard->setResultString(text.c_str());
  }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* bytes, std::size_t count) {
  brimol::test::Arguments from({bytes, count});
  FuzzStage stage(from);
  stage.make(0);
  for (std::size_t left = from.below(16); left > 0; --left) {
    stage.operate(0);
    from.forget();
    FuzzStage::round();
  }
  giveLong(*stage.at(0), from.remaining());
  FuzzStage::round();
  return 0;
}
