/// A page over the whole screen for a test that changes it while it runs.
#pragma once

#include <MW/color_page.h>

namespace MW {

/// A page with access to its colours and texts.
class MW_API AutoCapScreen : public ColorPage {
 public:
  /// The argument is not read. The page is transparent until setBgColor(), or setBg_title() and
  /// then setRect(), gives it a colour.
  explicit AutoCapScreen(unsigned int unused);
  ~AutoCapScreen() override;

  /// The colour that is drawn, 0xAARRGGBB. It lasts until the next setRect().
  unsigned int getBgColor() override;
  void setBgColor(unsigned int color) override;

  using Widget::getText;
  using Widget::getTextColor;
  using Widget::setTextColor;
  /// Replaces a box's text. Null is the empty text. An index over 3: nothing.
  void setText_str(unsigned int index, const char* newText);
  /// A box's own text record, valid while the page lives; read it on the thread that sets it. Null
  /// for an index over 3.
  SKIA_Text* getText(unsigned int index);
  /// Sets the colour of a box's text. An index over 3: nothing.
  void setTextColor(unsigned int index, unsigned int color);
  /// The colour of a box's text; 0 for an index over 3.
  unsigned int getTextColor(unsigned int index);
};

}  // namespace MW
