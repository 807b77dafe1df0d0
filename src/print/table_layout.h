#pragma once

#include <string>
#include <vector>

#include "print/page.h"

namespace marlowbeck {

/// Where a text stands between the edges of its column.
enum class Stand { Centred, FromLeft, FromRight };

struct ColumnLayout {
  double width = 0;
  Stand stand = Stand::Centred;
  double inset = 0;  ///< from the edge that the text stands at
};

/// A boxed table, centred on the page, once its columns have been measured. Lengths are twips.
class TableLayout {
 public:
  /// `pitch` is the height of a row.
  TableLayout(std::vector<ColumnLayout> columns, double pitch)
      : columns_(std::move(columns)), pitch_(pitch) {}

  /// The same columns with every text in the middle.
  [[nodiscard]] TableLayout AllCentred() const;

  [[nodiscard]] double Width() const;
  [[nodiscard]] double Pitch() const { return pitch_; }

  /// Prints a row at the page's height, one cell to a column: a box round it, an upright line
  /// before each column but the first, and the texts, trimmed. Moves below it.
  void PrintRow(Page& page, const std::vector<std::string>& cells) const;

 private:
  void PrintCell(Page& page, const ColumnLayout& column, double left, std::string_view cell) const;

  std::vector<ColumnLayout> columns_;
  double pitch_;
};

}  // namespace marlowbeck
