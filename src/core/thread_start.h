/// How the toolkit's threads are created and started.
#pragma once

#include <utils/Errors.h>
#include <utils/Thread.h>

#include <new>

namespace MW {

/// Both threads run under this name, with the platform's default priority and stack.
inline constexpr const char* kEventThreadName = "event_dispatcher";

/// Null where there is no memory, which the platform's own classes tell by an exception.
template <typename Loop, typename... Arguments>
android::sp<Loop> createThread(const Arguments&... arguments) {
  try {
    return new (std::nothrow) Loop(arguments...);
  } catch (const std::bad_alloc&) {
    return nullptr;
  }
}

/// False where the platform could not start it.
inline bool startThread(android::Thread& thread) {
  return thread.run(kEventThreadName) == android::OK;
}

}  // namespace MW
