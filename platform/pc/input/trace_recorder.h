/// Writes a recording.
#pragma once

#include <brimol/input.h>

#include <cstdint>
#include <string>
#include <vector>

#include "input/line_file.h"
#include "scene/geometry.h"

namespace brimol::pc {

/// Not guarded: Session is. Times are milliseconds since the start and do not run back.
class TraceRecorder {
 public:
  /// As LineFile's.
  TraceRecorder(const std::string& path, std::string& error) : file(path, error) {}

  /// The lines at the head, to be written first: of a script, whose frames are not compared, or of
  /// a recording. Time of day in milliseconds since 1970.
  void startScript(uint32_t clockStart);
  void start(uint32_t clockStart, uint64_t utcMs, uint64_t seed);
  void screen(Size size);
  void density(float dotsPerInch);
  void input(uint64_t time, const Event& record);
  void close(uint64_t time);
  void figure(uint64_t time, const std::string& name, const std::string& value);
  void frame(uint64_t time, const std::vector<std::string>& items);
  void end(uint64_t time);

 private:
  LineFile file;
  std::vector<std::string> lastItems;
};

/// The words behind the time, such as "down 0 360 640"; empty for a record that has none.
std::string textOfRecord(const Event& record);

}  // namespace brimol::pc
