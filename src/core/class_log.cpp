#include "core/class_log.h"

#include <android/log.h>

#include <array>
#include <cstdio>

namespace MW {

namespace {
constexpr std::size_t kMessageBytes = 256;
}

void ClassLog::print(LogLevel level, const char* format, ...) const {
  std::va_list arguments;
  va_start(arguments, format);
  write(level, "[%s] %s", format, arguments);
  va_end(arguments);
}

void ClassLog::printClose(LogLevel level, const char* format, ...) const {
  std::va_list arguments;
  va_start(arguments, format);
  write(level, "[%s]%s", format, arguments);
  va_end(arguments);
}

void ClassLog::write(LogLevel level, const char* head, const char* format,
                     std::va_list arguments) const {
  std::array<char, kMessageBytes> message{};
  std::vsnprintf(message.data(), message.size(), format, arguments);
  __android_log_print(static_cast<int>(level), tag, head, word, message.data());
}

}  // namespace MW
