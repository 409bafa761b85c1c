#include "page_test.h"

namespace factory_test {

void LookTest::leave() {
  page.endAsking();
  endLook();
}

void LookTest::update(uint32_t) {
  if (page.isAsking()) return;
  if (!looked) {
    updateLook();
    return;
  }
  endLook();
  page.ask();
  page.say(question);
}

}  // namespace factory_test
