#pragma once

#include <string>

#include "data/date.h"
#include "ladder/print_tables.h"

namespace marlowbeck {

/// The results and the ladder of the tab as text for a spreadsheet: a tab behind each cell,
/// carriage return and line feed at the end of each line.
[[nodiscard]] std::string LadderClipboardText(const Session& session, Date up_to,
                                              const LadderTab& tab);

}  // namespace marlowbeck
