#include "display/window_fit.h"

#include <algorithm>
#include <cstdint>

namespace brimol::pc {
namespace {

// Both sides are at most some ten thousands, so products need 64 bits.
int scaled(int value, int multiplier, int divisor) {
  return static_cast<int>(std::int64_t{value} * multiplier / divisor);
}

int toScreenAxis(int offset, int shown, int screen) {
  if (shown <= 1) return 0;
  const int last = shown - 1;
  const std::int64_t nearest = std::clamp(offset, 0, last);
  return static_cast<int>((nearest * (screen - 1) * 2 + last) / (std::int64_t{last} * 2));
}

struct Span {
  int start;
  int length;
};

Span toWindowAxis(Span pixels, int shown, int screen) {
  const std::int64_t end = std::int64_t{pixels.start} + pixels.length;
  const int start = scaled(pixels.start, shown, screen);
  return {start, static_cast<int>((end * shown + screen - 1) / screen) - start};
}

int sideFor(int otherSide, int screenSide, int otherScreenSide) {
  return std::max(scaled(screenSide, otherSide, otherScreenSide), 1);
}

// But for the rounding of one side.
bool hasProportionsOf(Size screen, Size window) {
  return window.w == sideFor(window.h, screen.w, screen.h) ||
         window.h == sideFor(window.w, screen.h, screen.w);
}

}  // namespace

Size fittedSize(Size screen, Size area) {
  const bool widthDecides = std::int64_t{area.w} * screen.h <= std::int64_t{area.h} * screen.w;
  return widthDecides ? Size{area.w, sideFor(area.w, screen.h, screen.w)}
                      : Size{sideFor(area.h, screen.w, screen.h), area.h};
}

WindowFit WindowFit::of(Size screen, Size window) {
  const Size area = {std::max(window.w, 1), std::max(window.h, 1)};
  const Size fitted = hasProportionsOf(screen, area) ? area : fittedSize(screen, area);
  return {screen, area, {(area.w - fitted.w) / 2, (area.h - fitted.h) / 2, fitted.w, fitted.h}};
}

ScreenPoint WindowFit::toScreen(WindowPoint position) const {
  return {toScreenAxis(position.x - shown.x, shown.width, screen.w),
          toScreenAxis(position.y - shown.y, shown.height, screen.h)};
}

cairo_rectangle_int_t WindowFit::toWindow(const cairo_rectangle_int_t& pixels) const {
  const Span across = toWindowAxis({pixels.x, pixels.width}, shown.width, screen.w);
  const Span down = toWindowAxis({pixels.y, pixels.height}, shown.height, screen.h);
  return {shown.x + across.start, shown.y + down.start, across.length, down.length};
}

}  // namespace brimol::pc
