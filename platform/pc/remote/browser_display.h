/// The screen in web browsers and VNC viewers.
#pragma once

#include <memory>
#include <optional>

#include "display/display.h"
#include "remote/action_queue.h"
#include "remote/listener.h"

namespace brimol::pc {

class VncServer;
class WebServer;

/// Serves the screen to those who know the password that it prints when it opens. It is never asked
/// to close: viewers come and go, and the application stays.
class BrowserDisplay : public Display {
 public:
  /// Listens at `address`, or where listenAt() does without one, and writes to the standard error
  /// where viewers find it. An error where it cannot listen.
  static OpenedDisplay open(Size screen, const std::optional<ListenAddress>& address,
                            InputTranslator& input, const InputService& service);
  ~BrowserDisplay() override;

  void present(cairo_surface_t* picture, const Region& changed) override;
  void wait(std::optional<uint32_t> ms) override;
  void wake() override { actions.wake(); }
  bool isCloseRequested() const override { return false; }

 private:
  BrowserDisplay(Size screen, Listeners listeners, const std::string& password,
                 InputTranslator& target, const InputService& clock);

  InputTranslator& input;
  const InputService& service;
  ActionQueue actions;
  std::unique_ptr<VncServer> vnc;
  std::unique_ptr<WebServer> web;  // calls vnc
};

}  // namespace brimol::pc
