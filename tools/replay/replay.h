/// A run from its options to its report.
#pragma once

#include "options.h"

namespace brimol::replay {

/// Says on stdout what came of it, and on stderr why it failed. The program's exit code.
int replay(Options options);

}  // namespace brimol::replay
