/// The toolkit's log lines.
#pragma once

#include <cstdarg>

namespace MW {

enum class LogLevel { Debug = 3, Warning = 5, Error = 6 };

/// Writes lines that begin with the word of the class that speaks. Any thread.
class ClassLog {
 public:
  explicit constexpr ClassLog(const char* className, const char* logTag = "BRIMOL_WIDGET")
      : word(className), tag(logTag) {}

  /// One line, "[WORD] " and the message, cut to 255 bytes.
  [[gnu::format(printf, 3, 4)]] void print(LogLevel level, const char* format, ...) const;
  /// The same without the blank, "[WORD]" and the message.
  [[gnu::format(printf, 3, 4)]] void printClose(LogLevel level, const char* format, ...) const;

 private:
  void write(LogLevel level, const char* head, const char* format, std::va_list arguments) const;

  const char* word;
  const char* tag;
};

}  // namespace MW
