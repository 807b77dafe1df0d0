#pragma once

#include "ui/context.h"

namespace marlowbeck {

/// Whether reports count forfeits as games played, as it is kept in `Forfeits.qz3` for all of them:
/// false for 0, true for any other number. A file that cannot be read is written anew with Yes,
/// which then holds.
[[nodiscard]] bool ReadForfeitsIncluded(const Context& context);

void WriteForfeitsIncluded(const Context& context, bool included);

}  // namespace marlowbeck
