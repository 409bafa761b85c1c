#include "painter/picture_cache.h"

#include "painter/png_reader.h"

namespace brimol::pc {

namespace {

bool isBounded(Size size) {
  return size.w <= PictureCache::kMostSide && size.h <= PictureCache::kMostSide &&
         int64_t{size.w} * size.h <= PictureCache::kMostPixels;
}

CairoSurface scaledTo(cairo_surface_t* picture, Size size) {
  CairoSurface result(cairo_image_surface_create(CAIRO_FORMAT_ARGB32, size.w, size.h));
  const CairoContext context(cairo_create(result.get()));
  cairo_scale(context.get(), static_cast<double>(size.w) / cairo_image_surface_get_width(picture),
              static_cast<double>(size.h) / cairo_image_surface_get_height(picture));
  cairo_set_source_surface(context.get(), picture, 0, 0);
  // Past the picture's edge lies its edge, so that it does not fade out there.
  cairo_pattern_set_extend(cairo_get_source(context.get()), CAIRO_EXTEND_PAD);
  cairo_paint(context.get());
  if (cairo_status(context.get()) != CAIRO_STATUS_SUCCESS) return nullptr;
  return result;
}

}  // namespace

cairo_surface_t* PictureCache::scaled(std::string_view name, Size size) {
  if (!isBounded(size)) return nullptr;
  Key key{std::string(name), size.w, size.h};
  if (const CairoSurface* const known = pictures.find(key)) return known->get();
  const CairoSurface picture = readPng(key.name, isBounded);
  if (!picture) return nullptr;
  CairoSurface result = scaledTo(picture.get(), size);
  if (!result) return nullptr;
  const auto cost = static_cast<std::size_t>(cairo_image_surface_get_stride(result.get())) *
                    static_cast<std::size_t>(size.h);
  return pictures.put(std::move(key), std::move(result), cost).get();
}

}  // namespace brimol::pc
