#include "display/window_pixels.h"

#include <algorithm>
#include <string_view>
#include <vector>

#include "display/sdl_calls.h"

namespace brimol::pc {

namespace {

struct SdlDeleter {
  void operator()(SDL_Surface* surface) const { sdl().freeSurface(surface); }
  void operator()(SDL_Renderer* renderer) const { sdl().destroyRenderer(renderer); }
  void operator()(SDL_Texture* texture) const { sdl().destroyTexture(texture); }
};
using Surface = std::unique_ptr<SDL_Surface, SdlDeleter>;
using Renderer = std::unique_ptr<SDL_Renderer, SdlDeleter>;
using Texture = std::unique_ptr<SDL_Texture, SdlDeleter>;

constexpr Uint32 kFormat = SDL_PIXELFORMAT_RGB888;

// The pixels as SDL sees them, which stay the content's.
Surface surfaceOf(cairo_surface_t* content) {
  return Surface(sdl().createRGBSurfaceWithFormatFrom(
      cairo_image_surface_get_data(content), cairo_image_surface_get_width(content),
      cairo_image_surface_get_height(content), SDL_BITSPERPIXEL(kFormat),
      cairo_image_surface_get_stride(content), kFormat));
}

SDL_Rect toSdl(const cairo_rectangle_int_t& part) {
  return {part.x, part.y, part.width, part.height};
}

// Hands over what changed, as the X server takes it.
class SurfacePixels : public WindowPixels {
 public:
  explicit SurfacePixels(SDL_Window* shownIn) : window(shownIn) {}

  Size size() override {
    Size pixels = {};
    sdl().getWindowSize(window, &pixels.w, &pixels.h);
    return pixels;
  }

  void show(cairo_surface_t* content, const Region& parts) override {
    SDL_Surface* const shown = sdl().getWindowSurface(window);
    const Surface pixels = surfaceOf(content);
    if (shown == nullptr || !pixels || parts.empty()) return;
    std::vector<SDL_Rect> updated;
    for (const cairo_rectangle_int_t& part : parts) {
      const SDL_Rect from = toSdl(part);
      SDL_Rect to = from;
      sdl().upperBlit(pixels.get(), &from, shown, &to);  // leaves in `to` what the window has of it
      updated.push_back(to);
    }
    sdl().updateWindowSurfaceRects(window, updated.data(), static_cast<int>(updated.size()));
  }

 private:
  SDL_Window* window;
};

// Shows a texture with as many pixels as the desktop has below the window.
class TexturePixels : public WindowPixels {
 public:
  explicit TexturePixels(Renderer made) : renderer(std::move(made)) {}

  Size size() override {
    Size pixels = {};
    sdl().getRendererOutputSize(renderer.get(), &pixels.w, &pixels.h);
    return pixels;
  }

  void show(cairo_surface_t* content, const Region& parts) override {
    const Size wanted = {cairo_image_surface_get_width(content),
                         cairo_image_surface_get_height(content)};
    const bool isNew = !texture || wanted != textureSize;
    if (isNew) makeTexture(wanted);
    if (!texture) return;
    update(content, isNew ? Region{{0, 0, wanted.w, wanted.h}} : parts);
    sdl().renderCopy(renderer.get(), texture.get(), nullptr, nullptr);
    sdl().renderPresent(renderer.get());
  }

 private:
  void makeTexture(Size wanted) {
    textureSize = wanted;
    texture.reset(sdl().createTexture(renderer.get(), kFormat, SDL_TEXTUREACCESS_STREAMING,
                                      wanted.w, wanted.h));
  }

  void update(cairo_surface_t* content, const Region& parts) {
    constexpr int kPixelBytes = 4;
    const int stride = cairo_image_surface_get_stride(content);
    for (const cairo_rectangle_int_t& part : parts) {
      const SDL_Rect to = toSdl(part);
      sdl().updateTexture(texture.get(), &to,
                          cairo_image_surface_get_data(content) + std::ptrdiff_t{part.y} * stride +
                              std::ptrdiff_t{part.x} * kPixelBytes,
                          stride);
    }
  }

  Renderer renderer;
  Texture texture;  // destroyed before its renderer
  Size textureSize = {};
};

}  // namespace

// On X11 the server takes the pixels as they are. A texture brings the whole window across for
// every change, and threads and start-up time of a graphics driver; the other drivers know no other
// way, and without a renderer of our own SDL gives them no more pixels than points.
std::unique_ptr<WindowPixels> WindowPixels::of(SDL_Window* window) {
  if (std::string_view(sdl().getCurrentVideoDriver()) != "x11") {
    Renderer renderer(sdl().createRenderer(window, -1, 0));
    if (renderer) return std::make_unique<TexturePixels>(std::move(renderer));
  }
  return std::make_unique<SurfacePixels>(window);
}

}  // namespace brimol::pc
