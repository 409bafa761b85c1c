/// A warning over the whole screen.
#pragma once

#include <MW/color_page.h>

namespace MW {

/// A page in a colour of the application's choice.
class MW_API DialogWarn : public ColorPage {
 public:
  /// `color`: 0xAARRGGBB.
  explicit DialogWarn(unsigned int color);
  ~DialogWarn() override;

  /// Replaces a box's text and its length, but puts the NUL where the old text ended: a longer text
  /// is cut there ("LONGER" for "ABC" shows "LON"), and behind a shorter one the rest of the old
  /// one stays in the record. setText() replaces the whole text. Null is the empty text. An index
  /// over 3: nothing.
  void setText_str(unsigned int index, const char* newText);
};

}  // namespace MW
