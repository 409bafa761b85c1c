#include <MW/prompt_dialog.h>

#include <algorithm>

#include "core/class_log.h"

namespace MW {

namespace {
constexpr uint32_t kMostStars = 10;
}

PromptDialog::PromptDialog(const char* logWord) : FramedDialog(logWord) {}

bool PromptDialog::onRecvEvent(event_data* event, unsigned int arg) {
  if (event == nullptr || event->type != kEventUser) return FramedDialog::onRecvEvent(event, arg);
  onPlugKey(event->key);
  return true;
}

void PromptDialog::onPlugKey(kbd_event key) {
  ClassLog(word).print(LogLevel::Debug, "key onPlugKey sym = %d", static_cast<int>(key.code));
  plugCallback(&key);
}

void PromptDialog::pressKey(const kbd_event& key, int mode) {
  if (key.code != kKeyHook) {
    onPressKey(key);
  } else if (mode == kHookMode) {
    onHookKeyPressed();
  }
}

void PromptDialog::onHookKeyPressed() {
  ClassLog(word).print(LogLevel::Debug, "Hook key pressed!!");
  hookKeyCallback(0);
}

void PromptDialog::updateProgress(unsigned int ticks) {
  const std::lock_guard guard(stateLock);
  drawProgress(ticks);
}

// One to ten stars, and one again.
void PromptDialog::drawProgress(unsigned int ticks) {
  progress.step(ticks);
  putStars(button1.caption, (std::max(progress.count(), 1U) - 1) % kMostStars + 1);
  skia_add_box_c(button1.border);
  skia_add_textbox_c(button1.face, button1.caption);
}

}  // namespace MW
