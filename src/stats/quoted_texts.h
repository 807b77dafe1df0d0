#pragma once

#include <string>
#include <vector>

#include "data/side_file.h"

namespace marlowbeck {

/// Reads `count` quoted texts that stand side by side and are the only ones of their line. A name
/// may hold quotes and commas itself: only a comma between two quotes parts texts, and of more of
/// those than there should be the last ones do. Throws TypeMismatch where there are fewer.
[[nodiscard]] std::vector<std::string> ReadTextsSideBySide(SideFileReader& reader,
                                                           std::size_t count);

}  // namespace marlowbeck
