#include "core/class_log.h"

#include <android/log.h>

#include <array>
#include <cstdarg>
#include <cstdio>

namespace MW {

namespace {
constexpr std::size_t kMessageBytes = 256;
}

void ClassLog::print(LogLevel level, const char* format, ...) const {
  std::array<char, kMessageBytes> message{};
  std::va_list arguments;
  va_start(arguments, format);
  std::vsnprintf(message.data(), message.size(), format, arguments);
  va_end(arguments);
  __android_log_print(static_cast<int>(level), tag, "[%s]%s%s", word, gap, message.data());
}

}  // namespace MW
