/// The thread that polls the platform's input.
#pragma once

#include <MW/api.h>
#include <utils/Thread.h>

namespace MW {

/// The event service starts it. Input is taken at full speed; without input it pauses for a
/// millisecond.
class MW_API func_eventLoop : public android::Thread {
 public:
  func_eventLoop();
  ~func_eventLoop() override;

  /// One poll. Returns true: go on.
  bool threadLoop() override;
};

}  // namespace MW
