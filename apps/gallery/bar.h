/// The bar at the foot of the screen, with which the user goes from one example to another.
#pragma once

#include <MW/button.h>
#include <MW/primitives.h>

#include <string>

namespace gallery {

enum class Wish { None, Back, Previous, Other, Next };

/// A button of the bar in a layer of its choice.
class BarButton : public MW::Button {
 public:
  BarButton(const SKIA_Rect& area, const SKIA_Text& caption, MW::LayerNumber layer,
            void (*clicked)(int));
  ~BarButton() override;
};

/// The keys left, right, select and back do what the buttons do. Draws nothing.
class BarKeys : public MW::Widget {
 public:
  explicit BarKeys(MW::LayerNumber layer);
  ~BarKeys() override;
  bool onRecvEvent(MW::event_data* event, unsigned int arg) override;
};

/// There is one. It gets events before the widgets that are made after it, and is drawn above them.
class Bar {
 public:
  /// `other`: what stands on the button that leads from the example to its code, or back.
  Bar(const std::string& title, const std::string& other, MW::LayerNumber layer);

  /// What was asked for since the bar was made. Any thread.
  static Wish wish();
  /// After the window's widgets, in each frame.
  void draw();

 private:
  MW::Textbox ground;
  MW::Label heading;
  MW::Label line;  // what was said
  BarButton back;
  BarButton previous;
  BarButton switcher;
  BarButton next;
  BarKeys keys;
};

}  // namespace gallery
