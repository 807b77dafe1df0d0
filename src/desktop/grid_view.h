#pragma once

#include <QTableWidget>

#include "desktop/entry_views.h"
#include "ui/controls.h"

namespace marlowbeck {

/// A grid: its heading row is a header that stays, names stand left and figures right. A table of
/// the form whose property `leastRows` is a number shows that many of its rows in any window, and
/// is never higher than all of them. One that is `numbered` counts its rows in the first column.
class GridView : public CaptionedView {
 public:
  GridView(Grid& control, QTableWidget* table, Windows& windows);
  bool Pressed(const QWidget& on, const QMouseEvent& event) override;
  [[nodiscard]] bool ClicksAt(const QWidget& on, QPoint at) const override;
  bool Typed(const QKeyEvent& event) override;
  [[nodiscard]] bool KeepsArrows() const override { return true; }

 protected:
  void ShowKind() override;
  void ReadKind(ControlState& state) const override;

 private:
  void ShowCells();
  void ShowHeading();
  bool eventFilter(QObject* watched, QEvent* event) override;
  void FitColumns();
  void ShareOutColumns();
  void MakeRoomForWords(int col, const std::vector<int>& others);
  bool EvenOut(const std::vector<int>& needed);
  enum class RowHeights { Alike, AsNeeded };
  void FitRows(RowHeights heights);
  [[nodiscard]] bool HasLineBreaks() const;
  /// A table hides its measures, which are every view's.
  [[nodiscard]] const QAbstractItemView& AsView() const { return table_; }
  [[nodiscard]] int WidthOfHeading(int col) const;
  [[nodiscard]] int WidthOfColumn(int col) const;
  [[nodiscard]] int LeastWidthOfNames(int col) const;
  [[nodiscard]] int WidthOfLongestWord(int col) const;
  void ShowCurrent();
  void PressCell(int row, int col);
  [[nodiscard]] Qt::Alignment AlignmentOf(int col) const;

  Grid& model_;
  QTableWidget& table_;
  int heading_rows_;  ///< 1, or 0 in a table without a heading
  int first_names_;   ///< 0, or 1 in a table whose first column counts the rows
  std::vector<std::vector<std::string>> shown_cells_;
  int shown_figures_from_ = -1;
};

}  // namespace marlowbeck
