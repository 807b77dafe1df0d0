#pragma once

#include "session/messages.h"
#include "ui/context.h"

namespace marlowbeck {

/// Asks how many teams a fixture is for, until the answer is from 3 to 50 or below 1, and leaves it
/// in TeamCount. Answers false for one below 1, as a cancelled or empty box is. Throws Overflow for
/// a number that is none of 16 bits.
[[nodiscard]] bool AskTeamCount(const Context& context, Beep beep);

}  // namespace marlowbeck
