/// How the toolkit's threads are started.
#pragma once

namespace MW {

/// Both threads run under this name, with the platform's default priority and stack.
inline constexpr const char* kEventThreadName = "event_dispatcher";

}  // namespace MW
