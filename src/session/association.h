#pragma once

#include "ui/context.h"

namespace marlowbeck {

/// Reads the association's name from `Association.qz3` into the session; none where there is no
/// such file.
void LoadAssociationName(const Context& context);

/// Asks for the name and keeps it, in the session and in the file; an empty answer changes nothing.
void AskAssociationName(const Context& context);

}  // namespace marlowbeck
