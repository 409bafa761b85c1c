/// The plain push button.
#pragma once

#include <MW/push_button.h>

namespace MW {

/// A filled rectangle with a caption.
class MW_API Button : public PushButton {
 public:
  /// Copies both records; `area`'s colour is the normal colour. Null records are all zero or empty.
  Button(const SKIA_Rect* area, const SKIA_Text* caption);
  ~Button() override;

  using PushButton::show;
  /// One button box, unless a delayed show is pending. Returns 1.
  int show(unsigned int ticks) override;
};

}  // namespace MW
