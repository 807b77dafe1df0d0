#include "desktop/list_view.h"

#include <algorithm>
#include <iterator>

#include <QScrollBar>
#include <QTimer>

#include "desktop/encoding.h"
#include "ui/disk_lists.h"

namespace marlowbeck {
namespace {

/// How many lines at each end of a list stay as they are shown.
struct Kept {
  int above = 0;
  int below = 0;
};

/// A long list that grows line by line is not made anew for each.
Kept KeptOf(const std::vector<std::string>& shown, const std::vector<std::string>& lines) {
  const auto above = std::mismatch(shown.begin(), shown.end(), lines.begin(), lines.end());
  const auto below = std::mismatch(shown.rbegin(), std::reverse_iterator(above.first),
                                   lines.rbegin(), std::reverse_iterator(above.second));
  return {static_cast<int>(above.first - shown.begin()),
          static_cast<int>(below.first - shown.rbegin())};
}

}  // namespace

ListView::ListView(ListBox& control, QListWidget* list, Windows& windows)
    : CaptionedView(control, list, windows), model_(control), list_(*list) {
  list_.setSelectionMode(model_.Multi() ? QAbstractItemView::MultiSelection
                                        : QAbstractItemView::SingleSelection);
  // A long name takes two lines; nothing is scrolled sideways.
  list_.setWordWrap(true);
  list_.setResizeMode(QListView::Adjust);
  list_.setEditTriggers(QAbstractItemView::NoEditTriggers);
}

/// A list that has just come up gets its size later, and has to be scrolled once more then.
void ListView::BringIntoSight(int line) {
  const auto scroll = [this, line] {
    if (line < list_.count()) list_.scrollToItem(list_.item(line));
  };
  scroll();
  QTimer::singleShot(0, this, scroll);
}

void ListView::ShowKind() {
  ShowLines();
  ShowMarks();
  const int line = CurrentLine();
  if (line >= 0 && line != shown_line_) BringIntoSight(line);
  shown_line_ = line;
  list_.setAccessibleDescription(model_.GetKind() == Kind::Folders ||
                                         model_.GetKind() == Kind::Files
                                     ? ToQt(static_cast<const PathList&>(model_).Path())
                                     : QString());
}

void ListView::ShowLines() {
  const std::vector<std::string>& lines = model_.Lines();
  if (shown_lines_ == lines) return;
  const int scrolled = list_.verticalScrollBar()->value();
  const Kept kept = KeptOf(shown_lines_, lines);
  if (kept.above + kept.below == 0) list_.clear();
  for (int i = list_.count() - kept.below; i > kept.above; --i) delete list_.takeItem(i - 1);
  // Told that there is no current line, the list makes none of its own when the focus comes.
  list_.setCurrentIndex({});
  QStringList texts;
  std::for_each(lines.begin() + kept.above, lines.end() - kept.below,
                [&](const std::string& line) { texts.append(ToQt(line)); });
  list_.insertItems(kept.above, texts);
  list_.verticalScrollBar()->setValue(scrolled);
  shown_lines_ = lines;
  shown_line_ = -1;
}

void ListView::ShowMarks() {
  auto& selection = *list_.selectionModel();
  const auto* const items = list_.model();
  selection.clearSelection();
  selection.setCurrentIndex(CurrentLine() < 0 ? QModelIndex() : items->index(CurrentLine(), 0),
                            QItemSelectionModel::NoUpdate);
  const auto mark = [&](int line) {
    selection.select(items->index(line, 0), QItemSelectionModel::Select);
  };
  if (model_.Multi()) {
    for (const int line : model_.Marked()) mark(line);
  } else if (model_.Index() >= 0) {
    mark(model_.Index());
  }
}

int ListView::CurrentLine() const {
  return model_.PicksOnEnter() ? model_.Cursor() : model_.Index();
}

void ListView::ReadKind(ControlState& state) const {
  auto& lines = state.lines.emplace();
  for (int i = 0; i < list_.count(); ++i) lines.push_back(NameFromQt(list_.item(i)->text()));
  std::vector<int> selected;
  for (const QModelIndex& index : list_.selectionModel()->selectedIndexes()) {
    selected.push_back(index.row());
  }
  std::sort(selected.begin(), selected.end());
  if (list_.selectionMode() == QAbstractItemView::SingleSelection) {
    state.index = selected.empty() ? -1 : selected.front();
  } else {
    state.index = list_.currentRow();
    state.selected = selected;
  }
  if (state.kind == Kind::Folders || state.kind == Kind::Files) {
    state.path = NameFromQt(list_.accessibleDescription());
  }
}

/// A press beside the lines only brings the focus.
bool ListView::Pressed(const QWidget& on, const QMouseEvent& event) {
  if (&on == &list_) return true;  // the edge
  if (&on != list_.viewport()) return false;
  const QModelIndex index = list_.indexAt(event.position().toPoint());
  if (index.isValid()) PressLine(index.row(), event.modifiers());
  return true;
}

/// A second click on a line, where the first has been told already.
void ListView::PressedAgain(const QWidget& on, const QMouseEvent& event) {
  const QModelIndex index =
      &on == list_.viewport() ? list_.indexAt(event.position().toPoint()) : QModelIndex();
  if (!index.isValid()) return CaptionedView::PressedAgain(on, event);
  Do([=, this](Hand& hand) { return hand.SecondPick(model_, index.row()); });
}

/// Beside the lines.
bool ListView::ClicksAt(const QWidget& on, QPoint at) const {
  return model_.MouseUp &&
         (&on == &list_ || (&on == list_.viewport() && !list_.indexAt(at).isValid()));
}

void ListView::PressLine(int line, Qt::KeyboardModifiers modifiers) {
  if (model_.Multi() && modifiers.testFlag(Qt::ControlModifier)) {
    Do([=, this](Hand& hand) { return hand.Toggle(model_, line); });
    anchor_ = line;
  } else if (model_.Multi() && modifiers.testFlag(Qt::ShiftModifier)) {
    const int from = anchor_ >= 0 && anchor_ < model_.Count() ? anchor_ : line;
    Do([=, this](Hand& hand) { return hand.MarkThrough(model_, from, line); });
  } else {
    Do([=, this](Hand& hand) { return hand.Pick(model_, line); });
    anchor_ = line;
  }
}

bool ListView::Typed(const QKeyEvent& event) {
  if (event.key() == Qt::Key_Space && CurrentLine() >= 0) {
    PressLine(CurrentLine(), model_.Multi() ? Qt::ControlModifier : Qt::NoModifier);
    return true;
  }
  const int line = LineFor(event);
  if (line >= 0) Do([=, this](Hand& hand) { return hand.MoveToLine(model_, line); });
  return true;
}

/// The line that a key goes to; -1 when it goes nowhere.
int ListView::LineFor(const QKeyEvent& event) const {
  const int page = std::max(1, list_.viewport()->height() / std::max(1, list_.sizeHintForRow(0)));
  switch (event.key()) {
    case Qt::Key_Home:
      return 0;
    case Qt::Key_End:
      return model_.Count() - 1;
    case Qt::Key_PageUp:
      return std::max(CurrentLine() - page, 0);
    case Qt::Key_PageDown:
      return CurrentLine() + page;
    default:
      return LineStartingWith(event.text());
  }
}

/// The next line, round the end, that begins with a letter.
int ListView::LineStartingWith(const QString& text) const {
  if (text.isEmpty() || !text[0].isLetterOrNumber()) return -1;
  const int count = list_.count();
  for (int step = 1; step <= count; ++step) {
    const int line = (std::max(CurrentLine(), -1) + step) % count;
    if (list_.item(line)->text().trimmed().startsWith(text, Qt::CaseInsensitive)) return line;
  }
  return -1;
}

}  // namespace marlowbeck
