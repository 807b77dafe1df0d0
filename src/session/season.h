#pragma once

#include "ui/context.h"

namespace marlowbeck {

/// Reads the season's title of the grade in hand from SeasonFile into SeasonDescription. Answers
/// false, and leaves SeasonDescription as it was, when the file cannot be read.
[[nodiscard]] bool ReadSeason(const Context& context);

/// The same for the screens that report: where there is no title yet it is asked for, until there
/// is one, and saved.
void GetSeason(const Context& context);

}  // namespace marlowbeck
