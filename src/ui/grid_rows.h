#pragma once

#include <array>
#include <string>

#include "ui/controls.h"

namespace marlowbeck {

/// Puts texts into the cells of a grid's row, from its first column on.
template <std::size_t N>
void SetRow(Grid& grid, int row, const std::array<std::string, N>& cells) {
  int col = 0;
  for (const std::string& cell : cells) grid.SetCell(row, col++, cell);
}

}  // namespace marlowbeck
