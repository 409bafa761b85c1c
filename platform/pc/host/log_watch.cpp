#include "host/log_watch.h"

#include <android/log.h>
#include <dlfcn.h>

#include <atomic>
#include <cstring>

namespace brimol::pc {

namespace {

constexpr const char* kSetLogger = "__android_log_set_logger";

constinit std::atomic<__android_logger_function> applicationLogger = nullptr;
constinit std::atomic<LogWatcher> logWatcher = nullptr;

void hear(const __android_logger_data* data, const char* message) {
  if (const LogWatcher watcher = logWatcher) {
    watcher(data->priority, data->tag == nullptr ? "" : data->tag, message);
  }
  const __android_logger_function logger = applicationLogger;
  logger != nullptr ? logger(data, message) : __android_log_stderr_logger(data, message);
}

using SetLogger = void (*)(__android_logger_function logger);

SetLogger setLoggerFrom(void* library) {
  void* const address = dlsym(library, kSetLogger);
  SetLogger found = nullptr;
  std::memcpy(&found, &address, sizeof found);
  return found;
}

}  // namespace

bool watchLog(LogWatcher watcher) {
  const SetLogger logs = setLoggerFrom(RTLD_NEXT);
  if (setLoggerFrom(RTLD_DEFAULT) != &__android_log_set_logger || logs == nullptr) return false;
  logWatcher = watcher;
  logs(hear);
  return true;
}

}  // namespace brimol::pc

// Stands in front of the log's own: the log has one logger, and the application may set it.
// NOLINTNEXTLINE(bugprone-reserved-identifier,cert-dcl37-c,cert-dcl51-cpp): the log's name
__attribute__((visibility("default"))) void __android_log_set_logger(
    __android_logger_function logger) {
  using namespace brimol::pc;
  applicationLogger = logger;
  const SetLogger logs = setLoggerFrom(RTLD_NEXT);
  if (logs != nullptr) logs(logWatcher.load() != nullptr ? hear : logger);
}
