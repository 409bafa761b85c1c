#include "window_fit.h"

#include <algorithm>
#include <cstdint>

namespace brimol::pc {
namespace {

// How far a screen pixel's colour spreads beyond its own place when it is scaled, in window pixels.
constexpr int kFilterReach = 2;

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
  const int start = std::max(scaled(pixels.start, shown, screen) - kFilterReach, 0);
  const int end = scaled(pixels.start + pixels.length, shown, screen) + 1 + kFilterReach;
  return {start, std::min(end, shown) - start};
}

}  // namespace

Size fittedSize(Size screen, Size area) {
  if (screen.w <= area.w && screen.h <= area.h) return screen;
  const bool widthDecides = std::int64_t{area.w} * screen.h <= std::int64_t{area.h} * screen.w;
  const Size fitted = widthDecides ? Size{area.w, scaled(screen.h, area.w, screen.w)}
                                   : Size{scaled(screen.w, area.h, screen.h), area.h};
  return {std::max(fitted.w, 1), std::max(fitted.h, 1)};
}

WindowFit WindowFit::of(Size screen, Size window) {
  const Size area = {std::max(window.w, 1), std::max(window.h, 1)};
  const Size fitted = fittedSize(screen, area);
  return {screen, area, {(area.w - fitted.w) / 2, (area.h - fitted.h) / 2, fitted.w, fitted.h}};
}

ScreenPoint WindowFit::toScreen(WindowPoint position) const {
  return {toScreenAxis(position.x - shown.x, shown.width, screen.w),
          toScreenAxis(position.y - shown.y, shown.height, screen.h)};
}

cairo_rectangle_int_t WindowFit::toWindow(const cairo_rectangle_int_t& pixels) const {
  if (isFullSize()) {
    return {shown.x + pixels.x, shown.y + pixels.y, pixels.width, pixels.height};
  }
  const Span across = toWindowAxis({pixels.x, pixels.width}, shown.width, screen.w);
  const Span down = toWindowAxis({pixels.y, pixels.height}, shown.height, screen.h);
  return {shown.x + across.start, shown.y + down.start, across.length, down.length};
}

}  // namespace brimol::pc
