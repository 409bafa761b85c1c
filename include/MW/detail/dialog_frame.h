/// What every framed dialog is made of: the frame with its title, and the buttons below.
#pragma once

#include <MW/records.h>
#include <brimol/scene.h>

namespace MW {

/// A dimmed screen, a frame on it, a black title bar with the title, a line below it and a black
/// body. The dialog's lock guards it.
struct DialogFrame {
  SKIA_Rect backdrop = {0, 0, 0, 0, kColorShadow};
  SKIA_Rect frame = {};
  SKIA_Rect titleBar = {};
  SKIA_Rect titleArea = {};
  SKIA_Rect body = {};
  SKIA_Point separator = {};
  SKIA_Text title = {};
};

/// A button of a dialog. The dialog's lock guards it.
struct DialogButton {
  SKIA_Rect face = {};
  SKIA_Rect border = {};
  SKIA_Text caption = {};
  int enabled = 0;  // 1: touches on the face are taken
};

}  // namespace MW
