/// The layout lint of a session.
#pragma once

#include <brimol3_widget_test/lint.h>

#include "session.h"
#include "verdict.h"

namespace brimol::replay {

/// The frames of the session that rest for 100 ms or get input, and that input.
std::vector<test::Moment> momentsOf(const Session& session);

/// The session's screen; its name is that of the device, or else its size.
test::Profile profileOf(const Session& session);

/// What a run that passed comes to once its layout is looked at; `judgement` for another.
Judgement judgeLayout(const Judgement& judgement, const Session& session,
                      const test::AcceptedFindings& accepted);

}  // namespace brimol::replay
