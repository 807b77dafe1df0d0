#pragma once

#include "ui/context.h"

namespace marlowbeck {

/// Whether reports count forfeits as games played, as it is kept in `Forfeits.qz3` for all of them:
/// false for 0, true for any other number. A file that is missing, or does not hold a number, is
/// written anew with Yes, which then holds. Throws when a file that is there cannot be read.
[[nodiscard]] bool ReadForfeitsIncluded(const Context& context);

void WriteForfeitsIncluded(const Context& context, bool included);

}  // namespace marlowbeck
