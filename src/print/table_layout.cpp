#include "print/table_layout.h"

#include "data/text.h"

namespace marlowbeck {
namespace {

double PlaceOf(const ColumnLayout& column, double left, double text_width) {
  switch (column.stand) {
    case Stand::FromLeft:
      return left + column.inset;
    case Stand::FromRight:
      return left + column.width - column.inset - text_width;
    case Stand::Centred:
      break;
  }
  return left + (column.width - text_width) / 2;
}

}  // namespace

TableLayout TableLayout::AllCentred() const {
  TableLayout centred = *this;
  for (ColumnLayout& column : centred.columns_) column.stand = Stand::Centred;
  return centred;
}

double TableLayout::Width() const {
  double width = 0;
  for (const ColumnLayout& column : columns_) width += column.width;
  return width;
}

void TableLayout::PrintRow(Page& page, const std::vector<std::string>& cells) const {
  double left = page.Middle() - Width() / 2;
  const double top = page.Y();
  page.Box(left, top, left + Width(), top + pitch_);
  for (std::size_t i = 0; i < columns_.size(); ++i) {
    if (i > 0) page.Line(left, top, left, top + pitch_);
    PrintCell(page, columns_[i], left, cells.at(i));
    left += columns_[i].width;
  }
  page.MoveDown(pitch_);
}

/// A cell without a text is left alone.
void TableLayout::PrintCell(Page& page, const ColumnLayout& column, double left,
                            std::string_view cell) const {
  const std::string text = Trim(cell);
  if (text.empty()) return;
  const double y = page.Y() + (pitch_ - page.TextHeight()) / 2;
  page.PrintAt(PlaceOf(column, left, page.WidthOf(text)), y, text);
}

}  // namespace marlowbeck
