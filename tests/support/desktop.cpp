#include "support/desktop.h"

#include <X11/Xlib.h>
#include <X11/Xutil.h>

#include <stdexcept>

namespace brimol::test {

namespace {

constexpr std::uint32_t kColourBits = 0xFFFFFF;
constexpr int kWordBits = 32;

struct DestroyImage {
  void operator()(XImage* image) const { XDestroyImage(image); }
};

}  // namespace

struct Desktop::Server {
  struct Close {
    void operator()(Display* opened) const { XCloseDisplay(opened); }
  };
  std::unique_ptr<Display, Close> display{XOpenDisplay(nullptr)};
};

Desktop::Desktop() : server(std::make_unique<Server>()) {
  if (!server->display) throw std::runtime_error("there is no X server");
}
Desktop::~Desktop() = default;

Desktop::Place Desktop::findWindow() const {
  Window ignored = 0;
  Window* windows = nullptr;
  unsigned int count = 0;
  Place found;
  XQueryTree(server->display.get(), DefaultRootWindow(server->display.get()), &ignored, &ignored,
             &windows, &count);
  for (unsigned int i = 0; i < count; ++i) {
    XWindowAttributes attributes = {};
    XGetWindowAttributes(server->display.get(), windows[i], &attributes);
    if (attributes.map_state != IsViewable) continue;
    found = {windows[i], attributes.x, attributes.y, attributes.width, attributes.height};
  }
  if (windows != nullptr) XFree(windows);
  return found;
}

std::vector<std::uint32_t> Desktop::row(int left, int top, int width) const {
  const std::unique_ptr<XImage, DestroyImage> image(
      XGetImage(server->display.get(), DefaultRootWindow(server->display.get()), left, top,
                static_cast<unsigned int>(width), 1, AllPlanes, ZPixmap));
  std::vector<std::uint32_t> colours;
  colours.reserve(static_cast<std::size_t>(width));
  for (int i = 0; i < width; ++i) {
    colours.push_back(static_cast<std::uint32_t>(XGetPixel(image.get(), i, 0)) & kColourBits);
  }
  return colours;
}

void Desktop::askToClose(unsigned long window) const {
  XEvent event = {};
  event.xclient.type = ClientMessage;
  event.xclient.window = window;
  event.xclient.message_type = XInternAtom(server->display.get(), "WM_PROTOCOLS", False);
  event.xclient.format = kWordBits;
  event.xclient.data.l[0] =
      static_cast<long>(XInternAtom(server->display.get(), "WM_DELETE_WINDOW", False));
  XSendEvent(server->display.get(), window, False, NoEventMask, &event);
  XFlush(server->display.get());
}

}  // namespace brimol::test
