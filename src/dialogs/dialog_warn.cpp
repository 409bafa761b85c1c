#include <MW/dialog_warn.h>
#include <MW/window.h>

#include <algorithm>

#include "dialogs/page_text.h"

namespace MW {

DialogWarn::DialogWarn(unsigned int color) : ColorPage(color) { Window::registerWidget(this); }

DialogWarn::~DialogWarn() { leaveWindow(); }

void DialogWarn::setText_str(unsigned int index, const char* newText) {
  SKIA_Text* const record = textAt(index);
  const auto given = pageText(newText);
  if (record == nullptr || !given) return;
  const std::lock_guard guard(stateLock);
  const auto previousEnd = static_cast<std::size_t>(std::clamp(record->string_len, 0, kTextMax));
  putTextOpen(*record, *given);
  record->text[previousEnd] = '\0';
}

}  // namespace MW
