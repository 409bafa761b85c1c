/// The toolkit's log lines.
#pragma once

namespace MW {

enum class LogLevel { Debug = 3, Warning = 5, Error = 6 };

/// Writes lines that begin with the word of the class that speaks. Any thread.
class ClassLog {
 public:
  explicit constexpr ClassLog(const char* className, const char* logTag = "BRIMOL_WIDGET")
      : word(className), tag(logTag) {}

  /// One line, "[WORD] " and the message, cut to 255 bytes.
  [[gnu::format(printf, 3, 4)]] void print(LogLevel level, const char* format, ...) const;
  /// The same log without the blank: "[WORD]" and the message.
  constexpr ClassLog withoutGap() const {
    ClassLog log = *this;
    log.gap = "";
    return log;
  }

 private:
  const char* word;
  const char* tag;
  const char* gap = " ";
};

}  // namespace MW
