#include "core/life_guard.h"

#include <mutex>

namespace MW {

namespace {
constinit std::mutex guardsLock;
constinit LifeGuard* newest = nullptr;  // guarded by guardsLock
}  // namespace

LifeGuard::LifeGuard(const Widget* guarded) : widget(guarded) {
  const std::lock_guard guard(guardsLock);
  older = newest;
  if (older != nullptr) older->newer = this;
  newest = this;
}

LifeGuard::~LifeGuard() {
  const std::lock_guard guard(guardsLock);
  if (older != nullptr) older->newer = newer;
  (newer != nullptr ? newer->older : newest) = older;
}

void LifeGuard::widgetEnds(const Widget* ended) {
  const std::lock_guard guard(guardsLock);
  for (LifeGuard* each = newest; each != nullptr; each = each->older) {
    if (each->widget == ended) each->widget = nullptr;
  }
}

}  // namespace MW
