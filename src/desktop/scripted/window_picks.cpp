#include <algorithm>
#include <stdexcept>

#include <QCalendarWidget>
#include <QComboBox>
#include <QDateEdit>
#include <QHeaderView>
#include <QListWidget>
#include <QSpinBox>
#include <QTableWidget>
#include <QToolButton>

#include "desktop/encoding.h"
#include "desktop/scripted/gestures.h"
#include "desktop/scripted/window_hand.h"

namespace marlowbeck {
namespace {

QPoint CentreOf(const QAbstractItemView& view, const QModelIndex& index) {
  return (view.visualRect(index) & view.viewport()->rect()).center();
}

/// The pointer has come from elsewhere: where it stands when a list drops down it picks nothing.
void ClickInDropped(QAbstractItemView& list, const QModelIndex& index) {
  list.scrollTo(index);
  QWidget& viewport = *list.viewport();
  MoveMouse(viewport, viewport.rect().bottomRight() + QPoint(100, 100));
  MoveMouse(viewport, CentreOf(list, index));
  ClickMouse(viewport, CentreOf(list, index));
}

QPoint CellOf(const QTableWidget& table, int row, int col) {
  return CentreOf(table, table.model()->index(row, col));
}

/// Rows of a grid that stand in the table's heading.
int HeadingRows(const QTableWidget& table) { return table.horizontalHeader()->isHidden() ? 0 : 1; }

/// Well inside the heading, since its edge is for widening the column.
QPoint HeadingOf(const QHeaderView& header, int col) {
  const int middle = header.sectionViewportPosition(col) + header.sectionSize(col) / 2;
  return {middle, header.height() / 2};
}

template <typename Widget>
Widget& PartOf(const QCalendarWidget& calendar, const char* name) {
  auto* const part = calendar.findChild<Widget*>(name);
  if (part == nullptr) throw std::logic_error(std::string("the calendar has no ") + name);
  return *part;
}

/// Types the year, then goes from month to month.
void TurnTo(const QCalendarWidget& calendar, QDate date) {
  const auto click = [&](const char* name) {
    auto& button = PartOf<QToolButton>(calendar, name);
    ClickMouse(button, button.rect().center());
  };
  if (calendar.yearShown() != date.year()) {
    click("qt_calendar_yearbutton");
    auto& year = PartOf<QSpinBox>(calendar, "qt_calendar_yearedit");
    TypeOver(year, QString::number(date.year()));
    PressKey(year, Qt::Key_Return);
  }
  for (int turns = 0; calendar.monthShown() != date.month() && turns < 12; ++turns) {
    click(calendar.monthShown() < date.month() ? "qt_calendar_nextmonth" : "qt_calendar_prevmonth");
  }
}

/// The cell of a day of the month that is shown. Days of the month before may come first.
QModelIndex CellOfDay(const QAbstractItemModel& days, int day) {
  constexpr int kWeeks = 6;
  constexpr int kDays = 7;
  const int top = days.rowCount() - kWeeks;
  const int left = days.columnCount() - kDays;
  const auto cell = [&](int place) {
    return days.index(top + place / kDays, left + place % kDays);
  };
  int first = 0;
  while (first < kDays * 2 && cell(first).data().toInt() != 1) ++first;
  return cell(first + day - 1);
}

}  // namespace

/// The list can still be acted on and has the line.
bool WindowHand::HasLine(const Control& control, int line) const {
  if (windows_.WindowOf(control.InScreen()) == nullptr || !CheckLive(control).Done()) return false;
  const auto lines = ViewOf(control).Read().lines;
  return lines && line >= 0 && line < static_cast<int>(lines->size());
}

bool WindowHand::HasCell(const Control& control, int row, int col) const {
  if (windows_.WindowOf(control.InScreen()) == nullptr || !CheckLive(control).Done()) return false;
  const ControlState state = ViewOf(control).Read();
  return state.cells && row >= 0 && row < static_cast<int>(state.cells->size()) && col >= 0 &&
         col < *state.cols;
}

Outcome WindowHand::Pick(Control& control, int line) {
  View& view = ViewOf(control);
  if (!view.Read().lines) return Refused(control, "has no lines");
  if (!HasLine(control, line)) return Refused(control, "has no such line");
  return control.GetKind() == Kind::Combo ? PickInCombo(view, line)
                                          : PickInList(view, line, Qt::NoModifier);
}

/// Drops the list down and clicks on the line, if leaving what had the focus has left it there.
Outcome WindowHand::PickInCombo(View& view, int line) {
  if (static_cast<const ComboBox&>(view.GetControl()).Held()) {
    return Refused(view.GetControl(), "is locked");
  }
  auto& combo = static_cast<QComboBox&>(*view.Widget());
  if (!Reach(view)) return OutOfReach(view.GetControl());
  ClickMouse(combo, ArrowOf(combo));
  Outcome outcome = Taken();
  if (outcome.lost || !HasLine(view.GetControl(), line)) return outcome;
  if (!combo.view()->isVisible()) return Refused(view.GetControl(), "does not drop down");
  ClickInDropped(*combo.view(), combo.model()->index(line, combo.modelColumn()));
  return Taken();
}

Outcome WindowHand::PickInList(View& view, int line, Qt::KeyboardModifiers modifiers) {
  auto& list = static_cast<QListWidget&>(*view.Widget());
  if (!Reach(view)) return OutOfReach(view.GetControl());
  list.scrollToItem(list.item(line));
  ClickMouse(*list.viewport(), CentreOf(list, list.model()->index(line, 0)), modifiers);
  return Taken();
}

Outcome WindowHand::PickTwice(Control& control, int line) {
  const auto held = windows_.GetScreens().Hold(control.InScreen());
  Outcome outcome = Pick(control, line);
  if (!outcome.Done() || outcome.lost || !TakesSecondClick(control)) return outcome;
  auto* const list = qobject_cast<QListWidget*>(ViewOf(control).Widget());
  if (list == nullptr) return outcome;
  const QPoint at = HasLine(control, line) ? CentreOf(*list, list->model()->index(line, 0))
                                           : list->viewport()->rect().center();
  ClickMouseAgain(*list->viewport(), at);
  Taken();
  return outcome;
}

Outcome WindowHand::Select(Control& control, const std::vector<int>& lines) {
  View& view = ViewOf(control);
  const ControlState state = view.Read();
  if (!state.selected) return Refused(control, "marks one line only");
  if (!std::all_of(lines.begin(), lines.end(), [&](int line) { return HasLine(control, line); })) {
    return Refused(control, "has no such line");
  }
  const auto held = windows_.GetScreens().Hold(control.InScreen());
  const std::vector<int>& clicks = lines.empty() ? *state.selected : lines;
  Outcome outcome;
  for (std::size_t i = 0; i < clicks.size() && !outcome.lost; ++i) {
    if (!HasLine(control, clicks[i])) break;  // a click has taken it away
    const bool first = i == 0 && !lines.empty();
    outcome = PickInList(view, clicks[i], first ? Qt::NoModifier : Qt::ControlModifier);
  }
  return outcome;
}

Outcome WindowHand::Cell(Control& control, int row, int col) {
  View& view = ViewOf(control);
  if (!view.Read().cells) return Refused(control, "has no cells");
  if (!HasCell(control, row, col)) return Refused(control, "has no such cell");
  auto& table = static_cast<QTableWidget&>(*view.Widget());
  if (!Reach(view)) return OutOfReach(control);
  const int in_table = row - HeadingRows(table);
  table.scrollTo(table.model()->index(std::max(in_table, 0), col));
  SettleEvents();
  if (in_table < 0) {
    const QHeaderView& header = *table.horizontalHeader();
    ClickMouse(*header.viewport(), HeadingOf(header, col));
  } else {
    ClickMouse(*table.viewport(), CellOf(table, in_table, col));
  }
  return Taken();
}

Outcome WindowHand::CellTwice(Control& control, int row, int col) {
  const auto held = windows_.GetScreens().Hold(control.InScreen());
  Outcome outcome = Cell(control, row, col);
  if (!outcome.Done() || outcome.lost || !TakesSecondClick(control)) return outcome;
  auto& table = static_cast<QTableWidget&>(*ViewOf(control).Widget());
  const int in_table = row - HeadingRows(table);
  if (in_table < 0) {
    const QHeaderView& header = *table.horizontalHeader();
    ClickMouseAgain(*header.viewport(), HeadingOf(header, col));
  } else {
    ClickMouseAgain(*table.viewport(), HasCell(control, row, col)
                                           ? CellOf(table, in_table, col)
                                           : table.viewport()->rect().center());
  }
  Taken();
  return outcome;
}

/// Lets the calendar drop down, turns to the month and clicks on the day.
Outcome WindowHand::PickDate(Control& control, Date date) {
  View& view = ViewOf(control);
  auto* const box = qobject_cast<QDateEdit*>(view.Widget());
  if (box == nullptr) return Refused(control, "has no date");
  if (!Reach(view)) return OutOfReach(control);
  constexpr int kArrow = 8;
  ClickMouse(*box, {box->width() - kArrow, box->height() / 2});
  Outcome outcome = Taken();
  if (outcome.lost) return outcome;
  const QCalendarWidget& calendar = *box->calendarWidget();
  if (!calendar.isVisible()) return Refused(control, "does not drop down");
  const QDate day = ToQt(date);
  TurnTo(calendar, day);
  auto& days = PartOf<QTableView>(calendar, "qt_calendar_calendarview");
  ClickMouse(*days.viewport(), CentreOf(days, CellOfDay(*days.model(), day.day())));
  return Taken();
}

}  // namespace marlowbeck
