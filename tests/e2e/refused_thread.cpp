// Preloaded into a program, whose BRIMOL_REFUSED_THREAD-th thread then cannot be started.
#include <dlfcn.h>
#include <pthread.h>

#include <atomic>
#include <cerrno>
#include <cstdlib>

namespace {

bool isRefused() {
  static std::atomic<int> asked = 0;
  const char* const refused = std::getenv("BRIMOL_REFUSED_THREAD");
  return refused != nullptr && ++asked == std::atoi(refused);
}

}  // namespace

extern "C" [[gnu::visibility("default")]] int pthread_create(pthread_t* thread,
                                                             const pthread_attr_t* attributes,
                                                             void* (*routine)(void*),
                                                             void* argument) {
  static const auto create =
      reinterpret_cast<decltype(&pthread_create)>(dlsym(RTLD_NEXT, "pthread_create"));
  return isRefused() ? EAGAIN : create(thread, attributes, routine, argument);
}
