/// The threads that the phone's thread class creates.
#pragma once

namespace brimol::pc {

class TurnClock;

/// From here on such threads take part in `clock`, which outlives them, from their creation.
void letCreatedThreadsTakePart(TurnClock& clock);

}  // namespace brimol::pc
