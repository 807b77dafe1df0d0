#pragma once

#include <string>

#include "drive/arguments.h"
#include "ui/controls.h"
#include "ui/screens.h"

namespace marlowbeck {

/// The loaded screen that the next word names. Refuses one that is not there.
[[nodiscard]] Screen& TakeScreen(Arguments& arguments, const Screens& screens);

/// The control that the next word names: "frmLadder.cmdRecord", or "cmdRecord" alone for the
/// screen in front. Refuses one that is not there.
[[nodiscard]] Control& TakeControl(Arguments& arguments, const Screens& screens);

/// As above for a word taken already.
[[nodiscard]] Screen& ScreenNamed(const std::string& name, const Screens& screens);
[[nodiscard]] Control& ControlNamed(const std::string& name, const Screens& screens);

/// Refuses when no screen can be seen.
[[nodiscard]] Screen& ScreenInFront(const Screens& screens);

}  // namespace marlowbeck
