#include "core/input_thread.h"

#include <MW/event_service.h>
#include <MW/window.h>
#include <brimol/input.h>

#include "core/class_log.h"

namespace MW {

namespace {

constexpr ClassLog kLog("EVENTSERVICE");

void passOn(const Event& event) {
  if (Window::getEventService() == nullptr) {
    kLog.print(LogLevel::Error, "eventLoop Window::getEventService FAIL %d!", 1);
    return;
  }
  EventService::sendEvent(&event);
}

}  // namespace

func_eventLoop::func_eventLoop() : Thread(true) {
  kLog.print(LogLevel::Debug, "func_eventLoop start!");
}

func_eventLoop::~func_eventLoop() { kLog.print(LogLevel::Debug, "func_eventLoop destory!"); }

bool func_eventLoop::threadLoop() {
  Event event = {};
  if (PollEvent(&event) != 0) {
    passOn(event);
  } else {
    Delay(1);
  }
  if (exitPending()) {
    kLog.print(LogLevel::Debug, "func_eventLoop->threadLoop exitPending: %d", 1);
  }
  return true;
}

}  // namespace MW
