/// What an application asks the host of the world.
#pragma once

#include <cstdint>
#include <functional>
#include <map>
#include <optional>
#include <string>

#include "input/trace.h"

namespace brimol::pc {

/// Time of day, random numbers and figures of a played or recorded session. Not guarded: Session
/// is. Times are milliseconds of the session.
class World {
 public:
  /// Applies a line of a trace.
  void change(const WorldChange& wanted, uint64_t now);

  uint64_t utcMs(uint64_t now) const { return utcAtStart + now; }
  uint32_t random();
  /// The figure of a played session; empty where no line says it.
  std::string figure(const std::string& name) const;
  /// What a recorded session answers: `real`, but the same for all who ask at the same moment.
  /// `isNew`: it is not what was answered before.
  std::string record(const std::string& name, const std::string& real, uint64_t now, bool& isNew);

 private:
  struct Figure {
    std::string value;
    uint64_t asked = 0;
  };
  static constexpr uint64_t kUtcAtStart = 1767225600000;  // 2026-01-01T00:00:00Z

  uint64_t utcAtStart = kUtcAtStart;
  uint64_t randomState = 1;
  std::map<std::string, Figure> figures;
};

}  // namespace brimol::pc
