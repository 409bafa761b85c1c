/// Writes a recording.
#pragma once

#include <brimol/input.h>

#include <cstdint>
#include <optional>
#include <string>
#include <utility>
#include <vector>

#include "input/line_file.h"
#include "scene/geometry.h"

namespace brimol::pc {

/// Not guarded: Session is. Times are milliseconds since the start and do not run back. What comes
/// before begin() is kept, so that a session that never comes about leaves an older recording
/// alone.
class TraceRecorder {
 public:
  explicit TraceRecorder(std::string file) : path(std::move(file)) {}

  /// One line that says why the file cannot be written; nothing if it can.
  std::string open();
  /// The file, which is open, takes its place.
  void begin();
  /// The session did not come about this time.
  void close() { out.reset(); }

  /// The lines at the head, to be written first: of a script, whose frames are not compared, or of
  /// a recording. Time of day in milliseconds since 1970.
  void startScript(uint32_t clockStart);
  void start(uint32_t clockStart, uint64_t utcMs, uint64_t seed);
  void clockStep(uint32_t ms);
  void screen(Size size);
  void density(float dotsPerInch);
  void input(uint64_t time, const Event& record);
  void userCloses(uint64_t time);
  void figure(uint64_t time, const std::string& name, const std::string& value);
  void frame(uint64_t time, const std::vector<std::string>& items);
  void end(uint64_t time);

 private:
  void write(const std::string& lines);

  std::string path;
  std::optional<LineFile> out;
  std::vector<std::string> early;  // before begin()
  bool hasBegun = false;
  std::vector<std::string> lastItems;
};

/// The words behind the time, such as "down 0 360 640"; empty for a record that has none.
std::string textOfRecord(const Event& record);

}  // namespace brimol::pc
