#include "desktop/grid_view.h"

#include <algorithm>
#include <numeric>

#include <QHeaderView>
#include <QPainter>
#include <QRegularExpression>
#include <QScrollBar>
#include <QStyledItemDelegate>

#include "desktop/encoding.h"

namespace marlowbeck {
namespace {

/// The column that is current while the heading row is.
constexpr const char* kHeadingColumn = "headingColumn";
/// A property of the form: how many rows are seen, as far as there are that many, in the smallest
/// window.
constexpr const char* kLeastRows = "leastRows";
/// A property of the form: the first row is one like the others, and there is no heading.
constexpr const char* kHeadless = "headless";
/// A property of the form: the room is parted among the columns in these shares.
constexpr const char* kColumnShares = "columnShares";
/// A property of the form: the columns are alike as long as every cell has room, and their headings
/// stand in the middle.
constexpr const char* kEvenColumns = "evenColumns";
/// A property of the form: the first column counts the rows, and is one of figures.
constexpr const char* kNumbered = "numbered";

constexpr int kRowHeight = 24;  // pixels
constexpr int kAir = 8;         ///< between columns, at the least
constexpr int kLeastNames = 120;

/// Rules between rows only.
class RuledDelegate : public QStyledItemDelegate {
 public:
  using QStyledItemDelegate::QStyledItemDelegate;
  void paint(QPainter* painter, const QStyleOptionViewItem& option,
             const QModelIndex& index) const override {
    QStyledItemDelegate::paint(painter, option, index);
    painter->setPen(option.palette.color(QPalette::Disabled, QPalette::Highlight));
    painter->drawLine(option.rect.bottomLeft(), option.rect.bottomRight());
  }
};

std::size_t AsIndex(int number) { return static_cast<std::size_t>(number); }

std::vector<std::vector<std::string>> CellsOf(const Grid& grid) {
  std::vector<std::vector<std::string>> cells(static_cast<std::size_t>(grid.Rows()));
  for (int row = 0; row < grid.Rows(); ++row) {
    for (int col = 0; col < grid.Cols(); ++col) {
      cells[static_cast<std::size_t>(row)].push_back(grid.Cell(row, col));
    }
  }
  return cells;
}

template <typename Item>
std::string TextOf(const Item* item) {
  return item == nullptr ? std::string() : FromQt(item->text());
}

}  // namespace

GridView::GridView(Grid& control, QTableWidget* table, Windows& windows)
    : CaptionedView(control, table, windows),
      model_(control),
      table_(*table),
      heading_rows_(table->property(kHeadless).toBool() ? 0 : 1),
      first_names_(table->property(kNumbered).toBool() ? 1 : 0) {
  table_.setItemDelegate(new RuledDelegate(table));
  table_.setShowGrid(false);
  table_.setAlternatingRowColors(true);
  table_.setEditTriggers(QAbstractItemView::NoEditTriggers);
  table_.setSelectionBehavior(QAbstractItemView::SelectRows);
  table_.setSelectionMode(heading_rows_ == 0 ? QAbstractItemView::NoSelection
                                             : QAbstractItemView::SingleSelection);
  table_.setHorizontalScrollMode(QAbstractItemView::ScrollPerPixel);
  table_.verticalHeader()->hide();
  table_.verticalHeader()->setSectionResizeMode(QHeaderView::Fixed);
  table_.verticalHeader()->setMinimumSectionSize(kRowHeight);
  table_.verticalHeader()->setDefaultSectionSize(kRowHeight);
  table_.horizontalHeader()->setHighlightSections(false);
  table_.horizontalHeader()->setFocusPolicy(Qt::NoFocus);
  table_.viewport()->installEventFilter(this);
}

Qt::Alignment GridView::AlignmentOf(int col) const {
  const bool figures = col < first_names_ || col >= model_.FiguresFrom();
  return Qt::AlignVCenter | (figures ? Qt::AlignRight : Qt::AlignLeft);
}

void GridView::ShowKind() {
  auto cells = CellsOf(model_);
  const bool same = cells == shown_cells_ && table_.columnCount() == model_.Cols() &&
                    shown_figures_from_ == model_.FiguresFrom();
  if (!same) {
    shown_cells_ = std::move(cells);
    shown_figures_from_ = model_.FiguresFrom();
    ShowHeading();
    ShowCells();
    FitColumns();
  }
  ShowCurrent();
}

/// As wide as the widest cell, and what is left is shared out, but not to numbers. Where the room
/// is short, names are broken into two lines before anything has to be scrolled.
void GridView::FitColumns() {
  const int cols = table_.columnCount();
  if (cols == 0) return;
  if (table_.property(kColumnShares).isValid()) return ShareOutColumns();
  std::vector<int> widths;
  widths.reserve(static_cast<std::size_t>(cols));
  for (int col = 0; col < cols; ++col) widths.push_back(WidthOfColumn(col));
  if (EvenOut(widths)) return;
  int spare = table_.viewport()->width() - std::accumulate(widths.begin(), widths.end(), 0);
  const bool whole = spare >= 0;
  const int sharing = cols - first_names_;
  for (int col = first_names_; spare > 0 && col < cols; ++col) {
    widths[AsIndex(col)] += spare / sharing + (col - first_names_ < spare % sharing);
  }
  for (int col = first_names_; spare < 0 && col < std::min(cols, model_.FiguresFrom()); ++col) {
    int& width = widths[AsIndex(col)];
    const int full = width;
    width = std::max(full + spare, std::min(full, LeastWidthOfNames(col)));
    spare += full - width;
  }
  for (int col = 0; col < cols; ++col) table_.setColumnWidth(col, widths[AsIndex(col)]);
  FitRows(whole && !HasLineBreaks() ? RowHeights::Alike : RowHeights::AsNeeded);
}

/// Answers whether all columns have been made alike.
bool GridView::EvenOut(const std::vector<int>& needed) {
  const int cols = table_.columnCount();
  const int room = table_.viewport()->width();
  const bool even = table_.property(kEvenColumns).toBool() &&
                    *std::max_element(needed.begin(), needed.end()) <= room / cols;
  if (!even) return false;
  for (int col = 0; col < cols; ++col) {
    table_.setColumnWidth(col, room / cols + (col < room % cols ? 1 : 0));
  }
  FitRows(RowHeights::Alike);
  return true;
}

bool GridView::HasLineBreaks() const {
  return std::any_of(shown_cells_.begin(), shown_cells_.end(), [this](const auto& row) {
    return &row - shown_cells_.data() >= heading_rows_ &&
           std::any_of(row.begin(), row.end(), [](const std::string& cell) {
             return cell.find('\r') != std::string::npos;
           });
  });
}

/// A column of figures is no narrower than they are; the others part what is left, as told unless
/// one of them would cut a word that another has room for.
void GridView::ShareOutColumns() {
  const QStringList shares = table_.property(kColumnShares).toString().split(',');
  const int cols = std::min(table_.columnCount(), static_cast<int>(shares.size()));
  const auto share = [&](int col) { return shares[col].toInt(); };
  int widest = 0;
  int all = 0;
  for (int col = 0; col < cols; ++col) {
    widest = std::max(widest, share(col));
    all += share(col);
  }
  int room = table_.viewport()->width();
  int parts = all;
  for (int col = 0; col < cols; ++col) {
    if (share(col) == widest) continue;
    const int width = std::max(WidthOfColumn(col), table_.viewport()->width() * share(col) / all);
    table_.setColumnWidth(col, width);
    room -= width;
    parts -= share(col);
  }
  std::vector<int> names;
  for (int col = 0; col < cols; ++col) {
    if (share(col) != widest) continue;
    table_.setColumnWidth(col, room * widest / parts);
    names.push_back(col);
  }
  for (const int col : names) MakeRoomForWords(col, names);
  const bool whole = std::all_of(names.begin(), names.end(), [this](int col) {
    return WidthOfColumn(col) <= table_.columnWidth(col);
  });
  FitRows(whole && !HasLineBreaks() ? RowHeights::Alike : RowHeights::AsNeeded);
}

/// Takes what a column lacks for its longest word from others that have more than theirs need.
void GridView::MakeRoomForWords(int col, const std::vector<int>& others) {
  if (WidthOfColumn(col) <= table_.columnWidth(col)) return;
  int lacking = WidthOfLongestWord(col) - table_.columnWidth(col);
  for (const int other : others) {
    if (lacking <= 0) return;
    const int needed = std::max(WidthOfHeading(other), WidthOfLongestWord(other));
    const int spare = table_.columnWidth(other) - needed;
    const int given = std::clamp(spare, 0, lacking);
    table_.setColumnWidth(other, table_.columnWidth(other) - given);
    table_.setColumnWidth(col, table_.columnWidth(col) + given);
    lacking -= given;
  }
}

int GridView::WidthOfHeading(int col) const {
  return heading_rows_ == 0 ? 0 : table_.horizontalHeader()->sectionSizeHint(col);
}

int GridView::WidthOfColumn(int col) const {
  return std::max(WidthOfHeading(col), AsView().sizeHintForColumn(col)) + kAir;
}

/// No word is broken.
int GridView::LeastWidthOfNames(int col) const {
  return std::max(kLeastNames, WidthOfLongestWord(col));
}

int GridView::WidthOfLongestWord(int col) const {
  static const QRegularExpression kBreak("(?<=-)|\\s");
  int longest = 0;
  for (int row = 0; row < table_.rowCount(); ++row) {
    for (const QString& word : table_.item(row, col)->text().split(kBreak)) {
      longest = std::max(longest, table_.fontMetrics().horizontalAdvance(word) + 2 * kAir);
    }
  }
  return longest;
}

/// A row is as high as its name takes. Where no text is broken they are all alike, and a thousand
/// need not be measured.
void GridView::FitRows(RowHeights heights) {
  int height = 2 * table_.frameWidth();
  if (heading_rows_ > 0) height += table_.horizontalHeader()->sizeHint().height();
  const int least_rows = table_.property(kLeastRows).toInt();
  int least = height;
  int row_height = 0;
  for (int row = 0; row < table_.rowCount(); ++row) {
    if (row == 0 || heights == RowHeights::AsNeeded) {
      row_height = std::max(kRowHeight, AsView().sizeHintForRow(row));
    }
    if (table_.rowHeight(row) != row_height) table_.setRowHeight(row, row_height);
    height += row_height;
    if (row < least_rows) least = height;
  }
  if (least_rows == 0) return;
  table_.setMinimumHeight(least);
  table_.setMaximumHeight(height);
}

/// The room for the columns has changed.
bool GridView::eventFilter(QObject* watched, QEvent* event) {
  if (watched == table_.viewport() && event->type() == QEvent::Resize) FitColumns();
  return CaptionedView::eventFilter(watched, event);
}

void GridView::ShowHeading() {
  table_.setColumnCount(model_.Cols());
  table_.horizontalHeader()->setHidden(model_.Rows() == 0 || heading_rows_ == 0);
  for (int col = 0; col < model_.Cols(); ++col) {
    auto* const item = new QTableWidgetItem(ToQt(model_.Cell(0, col)));
    item->setTextAlignment(table_.property(kEvenColumns).toBool() ? Qt::AlignCenter
                                                                  : AlignmentOf(col));
    table_.setHorizontalHeaderItem(col, item);
  }
}

void GridView::ShowCells() {
  table_.setRowCount(std::max(model_.Rows() - heading_rows_, 0));
  for (int row = heading_rows_; row < model_.Rows(); ++row) {
    for (int col = 0; col < model_.Cols(); ++col) {
      auto* const item = new QTableWidgetItem(ToQt(model_.Cell(row, col)));
      item->setTextAlignment(AlignmentOf(col));
      table_.setItem(row - heading_rows_, col, item);
    }
  }
}

void GridView::ShowCurrent() {
  table_.setProperty(kHeadingColumn, model_.Col());
  if (model_.Row() < heading_rows_) {
    table_.setCurrentCell(-1, -1);
    table_.clearSelection();
  } else {
    table_.setCurrentCell(model_.Row() - heading_rows_, model_.Col());
  }
}

void GridView::ReadKind(ControlState& state) const {
  auto& cells = state.cells.emplace();
  const int cols = table_.columnCount();
  if (!table_.horizontalHeader()->isHidden()) {
    auto& heading = cells.emplace_back();
    for (int col = 0; col < cols; ++col) {
      heading.push_back(TextOf(table_.horizontalHeaderItem(col)));
    }
  }
  for (int row = 0; row < table_.rowCount(); ++row) {
    auto& line = cells.emplace_back();
    for (int col = 0; col < cols; ++col) line.push_back(TextOf(table_.item(row, col)));
  }
  state.cols = cols;
  state.row = std::max(table_.currentRow() + heading_rows_, 0);
  state.col =
      table_.currentRow() < 0 ? table_.property(kHeadingColumn).toInt() : table_.currentColumn();
}

bool GridView::Pressed(const QWidget& on, const QMouseEvent& event) {
  if (&on == &table_) return true;  // the edge
  const QPoint place = event.position().toPoint();
  if (&on == table_.viewport()) {
    const QModelIndex index = table_.indexAt(place);
    if (index.isValid()) PressCell(index.row() + heading_rows_, index.column());
    return true;
  }
  const auto& header = *table_.horizontalHeader();
  if (&on != header.viewport() || header.cursor().shape() == Qt::SplitHCursor) return false;
  const int col = header.logicalIndexAt(place);
  if (col >= 0) PressCell(0, col);
  return true;
}

/// A click beside the cells is one on the grid; the current cell stays.
bool GridView::ClicksAt(const QWidget& on, QPoint at) const {
  return &on == &table_ || (&on == table_.viewport() && !table_.indexAt(at).isValid());
}

void GridView::PressCell(int row, int col) {
  Do([=, this](Hand& hand) { return hand.ClickCell(model_, row, col); });
}

/// The keys scroll; the current cell is the pointer's.
bool GridView::Typed(const QKeyEvent& event) {
  QScrollBar& down = *table_.verticalScrollBar();
  QScrollBar& across = *table_.horizontalScrollBar();
  switch (event.key()) {
    case Qt::Key_Up:
      down.triggerAction(QAbstractSlider::SliderSingleStepSub);
      break;
    case Qt::Key_Down:
      down.triggerAction(QAbstractSlider::SliderSingleStepAdd);
      break;
    case Qt::Key_PageUp:
      down.triggerAction(QAbstractSlider::SliderPageStepSub);
      break;
    case Qt::Key_PageDown:
      down.triggerAction(QAbstractSlider::SliderPageStepAdd);
      break;
    case Qt::Key_Home:
      down.triggerAction(QAbstractSlider::SliderToMinimum);
      break;
    case Qt::Key_End:
      down.triggerAction(QAbstractSlider::SliderToMaximum);
      break;
    case Qt::Key_Left:
      across.triggerAction(QAbstractSlider::SliderSingleStepSub);
      break;
    case Qt::Key_Right:
      across.triggerAction(QAbstractSlider::SliderSingleStepAdd);
      break;
    default:
      break;
  }
  return true;
}

}  // namespace marlowbeck
