/// The thread that polls the platform's input.
#pragma once

#include <utils/Thread.h>

namespace MW {

/// The event service starts it. Input is taken at full speed; without input it pauses for a
/// millisecond.
class func_eventLoop : public android::Thread {
 public:
  func_eventLoop();
  ~func_eventLoop() override;

  /// One poll. Returns true: go on.
  bool threadLoop() override;
};

}  // namespace MW
