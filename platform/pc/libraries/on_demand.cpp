#include "libraries/on_demand.h"

#include <dlfcn.h>

namespace brimol::pc {

OnDemand::OnDemand(const char* file) : handle(dlopen(file, RTLD_LAZY | RTLD_LOCAL)) {
  if (handle == nullptr) problem = dlerror();
}

OnDemand::Found OnDemand::function(const char* name) {
  if (handle == nullptr) return Found(nullptr);
  void* const address = dlsym(handle, name);
  if (address == nullptr) problem = dlerror();
  return Found(address);
}

}  // namespace brimol::pc
