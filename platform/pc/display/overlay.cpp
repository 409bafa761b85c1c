#include "display/overlay.h"

#include <algorithm>
#include <iomanip>
#include <numbers>
#include <sstream>
#include <string>
#include <utility>

#include "display/info_table.h"
#include "scene/item.h"

namespace brimol::pc {

namespace {

struct Colour {
  double red;
  double green;
  double blue;
};
constexpr Colour kRepaintedColour = {1.0, 0.75, 0.0};
constexpr Colour kBoxColour = {0.25, 0.65, 1.0};
constexpr Colour kTextColour = {0.2, 0.9, 0.4};
constexpr Colour kDrawingColour = {1.0, 0.35, 0.6};  // pictures, lines and arrows

// In pixels of the window.
int letterFor(const WindowFit& fit) {
  constexpr int kLettersAcross = 34;
  constexpr int kLeast = 11;
  constexpr int kMost = 40;
  return std::clamp(std::min(fit.window.w, fit.window.h) / kLettersAcross, kLeast, kMost);
}

int lineWidthFor(const WindowFit& fit) {
  constexpr int kLinesPerLetter = 12;
  return std::max(letterFor(fit) / kLinesPerLetter, 1);
}

void setColour(cairo_t* context, const Colour& colour, double alpha) {
  cairo_set_source_rgba(context, colour.red, colour.green, colour.blue, alpha);
}

// Just inside the rectangle's edges.
void strokeInside(cairo_t* context, const Pixels& area, int width) {
  cairo_set_line_width(context, width);
  cairo_rectangle(context, area.x + width / 2.0, area.y + width / 2.0,
                  std::max(area.width - width, 0), std::max(area.height - width, 0));
  cairo_stroke(context);
}

void drawRepainted(cairo_t* context, const Region& changed, const WindowFit& fit) {
  constexpr double kFillAlpha = 0.18;
  for (const Pixels& part : changed) {
    const Pixels area = fit.toWindow(part);
    setColour(context, kRepaintedColour, kFillAlpha);
    cairo_rectangle(context, area.x, area.y, area.width, area.height);
    cairo_fill(context);
    setColour(context, kRepaintedColour, 1);
    strokeInside(context, area, 2 * lineWidthFor(fit));
  }
}

const Colour& colourOf(const SKIA_Item& item) {
  switch (figureOf(item)) {
    case Figure::Text: return kTextColour;
    case Figure::None: return kBoxColour;
    default: return kDrawingColour;
  }
}

// A line has no rectangle.
Pixels outlineOf(const SKIA_Item& item, Size screen) {
  return figureOf(item) == Figure::Line ? boundsOf(item, wholeOf(screen))
                                        : within(edgesOf(item.rect), wholeOf(screen));
}

void drawOutlines(cairo_t* context, const Frame& items, const WindowFit& fit) {
  constexpr double kAlpha = 0.85;
  for (const SKIA_Item& item : items) {
    const Pixels outline = outlineOf(item, fit.screen);
    if (isEmpty(outline)) continue;
    setColour(context, colourOf(item), kAlpha);
    strokeInside(context, fit.toWindow(outline), lineWidthFor(fit));
  }
}

std::string withOneDecimal(double number) {
  std::ostringstream text;
  text << std::fixed << std::setprecision(1) << number;
  return text.str();
}

std::string inMs(std::chrono::microseconds time) {
  constexpr double kUsPerMs = 1000;
  return withOneDecimal(static_cast<double>(time.count()) / kUsPerMs) + " ms";
}

std::string shareOf(const Region& changed, Size screen) {
  constexpr double kWhole = 100;
  double pixels = 0;
  for (const Pixels& part : changed) pixels += double{1} * part.width * part.height;
  return withOneDecimal(pixels * kWhole / (double{1} * screen.w * screen.h)) + " % in " +
         std::to_string(changed.size()) + (changed.size() == 1 ? " part" : " parts");
}

void drawFinger(cairo_t* context, ScreenPoint at, const WindowFit& fit, bool isDown) {
  constexpr double kRadius = 1.4;  // letters
  constexpr double kDownAlpha = 0.7;
  constexpr double kUpAlpha = 0.25;
  const Pixels pixel = fit.toWindow({at.x, at.y, 1, 1});
  cairo_new_path(context);
  cairo_arc(context, pixel.x + pixel.width / 2.0, pixel.y + pixel.height / 2.0,
            kRadius * letterFor(fit), 0, 2 * std::numbers::pi);
  cairo_set_source_rgba(context, 1, 1, 1, isDown ? kDownAlpha : kUpAlpha);
  cairo_fill_preserve(context);
  cairo_set_line_width(context, 2.0 * lineWidthFor(fit));
  cairo_set_source_rgb(context, 0.1, 0.3, 0.6);
  cairo_stroke(context);
}

void drawFingers(cairo_t* context, const TwoFingerMouse::Fingers& fingers, const WindowFit& fit) {
  const Pixels middle = fit.toWindow({fingers.middle.x, fingers.middle.y, 1, 1});
  const int arm = letterFor(fit) / 2;
  cairo_set_source_rgb(context, 0.1, 0.3, 0.6);
  cairo_rectangle(context, middle.x - arm, middle.y - 1, 2 * arm + 1, 3);
  cairo_rectangle(context, middle.x - 1, middle.y - arm, 3, 2 * arm + 1);
  cairo_fill(context);
  drawFinger(context, fingers.opposite, fit, fingers.areDown);
  drawFinger(context, fingers.mouse, fit, fingers.areDown);
}

}  // namespace

bool Overlay::setFingers(const std::optional<TwoFingerMouse::Fingers>& now) {
  return std::exchange(fingers, now) != now;
}

void Overlay::note(const FrameFigures& figures) {
  items = &figures.items;
  changed = figures.changed;
  painting = figures.painting;
  if (figures.sinceInput) sinceInput = figures.sinceInput;
  ++frames;
}

cairo_surface_t* Overlay::drawOver(cairo_surface_t* shown, const WindowFit& fit) {
  picture.reset(cairo_image_surface_create(CAIRO_FORMAT_RGB24, fit.window.w, fit.window.h));
  if (cairo_surface_status(picture.get()) != CAIRO_STATUS_SUCCESS) return nullptr;
  const CairoContext context(cairo_create(picture.get()));
  cairo_surface_mark_dirty(shown);
  cairo_set_source_surface(context.get(), shown, 0, 0);
  cairo_paint(context.get());
  if (hasFigures) drawFigures(context.get(), fit);
  if (fingers) drawFingers(context.get(), *fingers, fit);
  if (hasKeys) drawKeys(context.get(), fit);
  cairo_surface_flush(picture.get());
  return picture.get();
}

Fonts& Overlay::fonts() {
  if (!borrowed) borrowed = borrowFonts();
  return *borrowed;
}

void Overlay::drawFigures(cairo_t* context, const WindowFit& fit) {
  drawRepainted(context, changed, fit);
  if (items != nullptr) drawOutlines(context, *items, fit);
  const std::size_t count = items == nullptr ? 0 : items->size();
  const InfoTable table(fonts(),
                        {{"Frame", std::to_string(frames)},
                         {"Items", std::to_string(count)},
                         {"Repainted", shareOf(changed, fit.screen)},
                         {"Painting", inMs(painting)},
                         {"Event to frame", sinceInput ? inMs(*sinceInput) : "no event yet"}},
                        letterFor(fit), {fit.shown.width, fit.shown.height});
  const int margin = letterFor(fit) / 2;
  table.draw(context, fit.shown.x + margin, fit.shown.y + margin);
}

void Overlay::drawKeys(cairo_t* context, const WindowFit& fit) {
  const int letter = letterFor(fit);
  const InfoTable table(fonts(), helpRows(), letter,
                        {fit.window.w - letter, fit.window.h - letter});
  table.draw(context, (fit.window.w - table.size().w) / 2, (fit.window.h - table.size().h) / 2);
}

}  // namespace brimol::pc
