/// Which words of a trace are which steps.
#pragma once

#include "input/trace.h"
#include "input/trace_words.h"

namespace brimol::pc {

/// The step that the line's remaining words say. An unknown or wrong one is a BadLine.
TraceStep::Action readStep(TraceWords& words);

/// "2026-11-22T10:00:00.000Z" as milliseconds since 1970. Any other text is a BadLine.
uint64_t readUtc(const std::string& text);
std::string utcText(uint64_t ms);

}  // namespace brimol::pc
