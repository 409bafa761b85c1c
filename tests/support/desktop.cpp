#include "support/desktop.h"

#include <X11/Xlib.h>
#include <X11/Xutil.h>

namespace brimol::test {

namespace {

constexpr std::uint32_t kColourBits = 0xFFFFFF;
constexpr int kWordBits = 32;

struct DestroyImage {
  void operator()(XImage* image) const { XDestroyImage(image); }
};

}  // namespace

void Desktop::Close::operator()(_XDisplay* display) const { XCloseDisplay(display); }

Desktop::Desktop() : server(XOpenDisplay(nullptr)) {}
Desktop::~Desktop() = default;

Desktop::Place Desktop::findWindow() const {
  Window ignored = 0;
  Window* windows = nullptr;
  unsigned int count = 0;
  Place found;
  XQueryTree(server.get(), DefaultRootWindow(server.get()), &ignored, &ignored, &windows, &count);
  for (unsigned int i = 0; i < count; ++i) {
    XWindowAttributes attributes = {};
    XGetWindowAttributes(server.get(), windows[i], &attributes);
    if (attributes.map_state != IsViewable) continue;
    found = {windows[i], attributes.x, attributes.y, attributes.width, attributes.height};
  }
  if (windows != nullptr) XFree(windows);
  return found;
}

std::vector<std::uint32_t> Desktop::row(int left, int top, int width) const {
  const std::unique_ptr<XImage, DestroyImage> image(
      XGetImage(server.get(), DefaultRootWindow(server.get()), left, top,
                static_cast<unsigned int>(width), 1, AllPlanes, ZPixmap));
  std::vector<std::uint32_t> colours;
  for (int i = 0; i < width; ++i) {
    colours.push_back(static_cast<std::uint32_t>(XGetPixel(image.get(), i, 0)) & kColourBits);
  }
  return colours;
}

void Desktop::askToClose(unsigned long window) const {
  XEvent event = {};
  event.xclient.type = ClientMessage;
  event.xclient.window = window;
  event.xclient.message_type = XInternAtom(server.get(), "WM_PROTOCOLS", False);
  event.xclient.format = kWordBits;
  event.xclient.data.l[0] = static_cast<long>(XInternAtom(server.get(), "WM_DELETE_WINDOW", False));
  XSendEvent(server.get(), window, False, NoEventMask, &event);
  XFlush(server.get());
}

}  // namespace brimol::test
