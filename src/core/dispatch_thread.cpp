#include "core/dispatch_thread.h"

#include <MW/event_service.h>
#include <MW/widget.h>
#include <MW/window.h>
#include <brimol/input.h>
#include <brimol/scene.h>

#include <utility>

#include "core/class_log.h"
#include "core/layer_walk.h"
#include "core/layers.h"

namespace MW {

namespace {

constexpr ClassLog kLog("WINDOW");

// What became of an event in a layer.
struct Offer {
  bool taken = false;
  bool isLast = false;  // the layers behind do not get it
};

bool offerToSelected(int type, event_data* event) {
  LayerWalk walk(Layers::layer(type));
  while (Widget* const widget = walk.next()) {
    if (widget->isSelect() != 0 && widget->onRecvEvent(event, 0)) return true;
  }
  return false;
}

Offer offerToActive(int type, event_data* event) {
  Offer offer;
  LayerWalk walk(Layers::layer(type));
  offer.isLast = walk.isRefused();
  while (Widget* const widget = walk.next()) {
    if (!widget->isActive()) continue;
    offer.isLast = true;
    offer.taken = widget->onRecvEvent(event, 0);
    if (offer.taken) break;
  }
  return offer;
}

// The top layer's active widgets keep the event from the base layer, whether they take it or not.
Offer offerToTop(event_data* event) {
  if (Layers::layer(kTopLayer).isEmpty()) return {};
  // A display that takes no input ends the search for this event.
  if (skia_live_widget_c() == 0) return {.taken = false, .isLast = true};
  return offerToActive(kTopLayer, event);
}

// A selected active widget that declines is asked once more among the active ones.
bool offerToBase(event_data* event) {
  if (Layers::layer(kBaseLayer).isEmpty()) return false;
  if (skia_live_widget_c() == 0) return false;
  return offerToSelected(kBaseLayer, event) || offerToActive(kBaseLayer, event).taken;
}

bool dispatch(event_data* event) {
  const Offer top = offerToTop(event);
  return top.taken || (!top.isLast && offerToBase(event));
}

}  // namespace

func_dispatchEvent::func_dispatchEvent(android::sp<func_dispatchEvent> replaced)
    : Thread(true), before(std::move(replaced)) {
  kLog.print(LogLevel::Debug, "func_dispatchEvent start!");
}

func_dispatchEvent::~func_dispatchEvent() {
  kLog.print(LogLevel::Debug, "func_dispatchEvent destory!");
}

bool func_dispatchEvent::isOnThisThread() const {
  return thread.load() == std::this_thread::get_id();
}

android::status_t func_dispatchEvent::readyToRun() {
  if (before != nullptr) before->join();
  before.clear();
  return android::OK;
}

bool func_dispatchEvent::threadLoop() {
  thread = std::this_thread::get_id();
  if (const event_data* const received = EventService::recvEvent(); received != nullptr) {
    // A handler may end and start the window, so that the service's record changes meanwhile.
    event_data event = *received;
    if (dispatch(&event)) isDisplayUpdate(1);
  }
  Delay(1);
  if (exitPending()) {
    kLog.print(LogLevel::Debug, "func_dispatchEvent->threadLoop exitPending: %d", 1);
  }
  return true;
}

}  // namespace MW
