#include "core/life_guard.h"

namespace MW {

namespace {
thread_local LifeGuard* innermost = nullptr;
}

LifeGuard::LifeGuard(const Widget* guarded) : widget(guarded), outer(innermost) {
  innermost = this;
}

LifeGuard::~LifeGuard() { innermost = outer; }

void LifeGuard::widgetEnds(const Widget* ended) {
  for (LifeGuard* guard = innermost; guard != nullptr; guard = guard->outer) {
    if (guard->widget == ended) guard->widget = nullptr;
  }
}

}  // namespace MW
