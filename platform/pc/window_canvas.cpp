#include "window_canvas.h"

namespace brimol::pc {
namespace {

// Disjoint, though the parts of `changed` may meet in one window pixel.
Region toWindow(const WindowFit& fit, const Region& changed) {
  const CairoRegion touched(cairo_region_create());
  for (const cairo_rectangle_int_t& part : changed) {
    const cairo_rectangle_int_t inWindow = fit.toWindow(part);
    cairo_region_union_rectangle(touched.get(), &inWindow);
  }
  Region parts(static_cast<std::size_t>(cairo_region_num_rectangles(touched.get())));
  int index = 0;
  for (cairo_rectangle_int_t& part : parts) {
    cairo_region_get_rectangle(touched.get(), index++, &part);
  }
  return parts;
}

void clipTo(cairo_t* context, const Region& parts) {
  for (const cairo_rectangle_int_t& part : parts) {
    cairo_rectangle(context, part.x, part.y, part.width, part.height);
  }
  cairo_clip(context);
}

// The scale belongs to the whole picture, so that a part gets the same pixels as the whole.
void setScaledSource(cairo_t* context, cairo_surface_t* picture, const WindowFit& fit) {
  cairo_translate(context, fit.shown.x, fit.shown.y);
  cairo_scale(context, static_cast<double>(fit.shown.width) / fit.screen.w,
              static_cast<double>(fit.shown.height) / fit.screen.h);
  cairo_set_source_surface(context, picture, 0, 0);
  cairo_pattern_t* const source = cairo_get_source(context);
  cairo_pattern_set_filter(source, fit.isFullSize() ? CAIRO_FILTER_NEAREST : CAIRO_FILTER_GOOD);
  cairo_pattern_set_extend(source, CAIRO_EXTEND_PAD);
}

}  // namespace

WindowCanvas::WindowCanvas(Size screen, Size window)
    : placement(WindowFit::of(screen, window)),
      content(
          cairo_image_surface_create(CAIRO_FORMAT_RGB24, placement.window.w, placement.window.h)) {}

Region WindowCanvas::update(cairo_surface_t* picture, const Region& changed) {
  Region parts = toWindow(placement, changed);
  const CairoContext context(cairo_create(content.get()));
  clipTo(context.get(), parts);
  setScaledSource(context.get(), picture, placement);
  cairo_set_operator(context.get(), CAIRO_OPERATOR_SOURCE);
  cairo_paint(context.get());
  cairo_surface_flush(content.get());
  return parts;
}

}  // namespace brimol::pc
