#pragma once

#include "ui/context.h"
#include "ui/screens.h"

namespace marlowbeck {

/// Registers every screen that there is under its name.
void RegisterScreens(Screens& screens, const Context& context);

}  // namespace marlowbeck
