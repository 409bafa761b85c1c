#include <MW/auto_cap_screen.h>
#include <MW/window.h>

#include "dialogs/page_text.h"

namespace MW {

namespace {
constexpr uint32_t kTransparent = 0;
}

AutoCapScreen::AutoCapScreen(unsigned int) : ColorPage(kTransparent) {
  Window::registerWidget(this);
}

AutoCapScreen::~AutoCapScreen() { leaveWindow(); }

unsigned int AutoCapScreen::getBgColor() { return read(rect.color); }
void AutoCapScreen::setBgColor(unsigned int color) { write(rect.color, color); }

void AutoCapScreen::setText_str(unsigned int index, const char* newText) {
  SKIA_Text* const record = textAt(index);
  const auto given = pageText(newText);
  if (record == nullptr || !given) return;
  const std::lock_guard guard(stateLock);
  putText(*record, *given);
}

SKIA_Text* AutoCapScreen::getText(unsigned int index) { return textAt(index); }

void AutoCapScreen::setTextColor(unsigned int index, unsigned int color) {
  if (SKIA_Text* const record = textAt(index)) write(record->color, color);
}

unsigned int AutoCapScreen::getTextColor(unsigned int index) {
  const SKIA_Text* const record = textAt(index);
  return record != nullptr ? read(record->color) : 0;
}

}  // namespace MW
