#include "button_row.h"

#include "language/language.h"
#include "layout.h"

namespace factory_test {

ButtonRow::ButtonRow(const SKIA_Rect& area, std::span<const Face> faces) {
  for (std::size_t i = 0; i < faces.size(); ++i) {
    const Grid row = {1, static_cast<int>(faces.size())};
    const SKIA_Rect cell =
        inColor(cellOf(area, gapOf(screenSize()), row, static_cast<int>(i)), kButtonInk.ground);
    const SKIA_Text caption = captionIn(cell, tr(faces[i].caption), kButtonInk.text);
    buttons.push_back(std::make_unique<MW::ButtonNew>(MW::ButtonNew::kFramed, &cell, &caption));
    buttons.back()->clickCallback = faces[i].clicked;
    buttons.back()->setBdColor(MW::kColorBlack);
    buttons.back()->setActive(1);
  }
}

void ButtonRow::setActive(bool isActive) {
  for (const auto& button : buttons) button->setActive(isActive ? 1 : 0);
}

}  // namespace factory_test
