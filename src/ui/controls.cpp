#include "ui/controls.h"

#include <algorithm>

#include "data/runtime_error.h"
#include "ui/screen.h"

namespace marlowbeck {

void TextBox::SetText(std::string_view text) {
  if (Assign(text_, text)) Fire(Change);
}

template <typename Visit>
void OptionButton::ForEachPeer(Visit visit) const {
  for (Control* other : InScreen().Controls()) {
    if (other != this && other->GetKind() == Kind::Option && other->InControl() == InControl()) {
      visit(static_cast<OptionButton&>(*other));
    }
  }
}

void OptionButton::SetValue(bool value) {
  Assign(value_, value);
  if (value) ForEachPeer([](OptionButton& other) { other.SetValue(false); });
}

bool OptionButton::ReachedByTab() const {
  bool other_selected = false;
  ForEachPeer([&](const OptionButton& other) { other_selected |= other.Value() && other.Live(); });
  return Control::ReachedByTab() && !other_selected;
}

const std::string& LineHolder::Line(int index) const {
  if (index < 0 || index >= Count()) throw RunTimeError(ErrorNumber::SubscriptOutOfRange);
  return lines_[static_cast<std::size_t>(index)];
}

int LineHolder::Find(std::string_view text) const {
  const auto place = std::find(lines_.begin(), lines_.end(), text);
  return place == lines_.end() ? -1 : static_cast<int>(place - lines_.begin());
}

void LineHolder::AddLine(std::string_view line) {
  lines_.emplace_back(line);
  Touch();
}

void LineHolder::RemoveLine(int index) {
  if (index < 0 || index >= Count()) throw RunTimeError(ErrorNumber::SubscriptOutOfRange);
  lines_.erase(lines_.begin() + index);
  if (index_ == index) index_ = -1;
  if (index_ > index) --index_;
  Touch();
}

void LineHolder::Clear() {
  lines_.clear();
  index_ = -1;
  Touch();
}

void LineHolder::SetIndex(int index) {
  if (index < -1 || index >= Count()) throw RunTimeError(ErrorNumber::SubscriptOutOfRange);
  Assign(index_, index);
  IndexAssigned();
  if (index >= 0) Fire(Click);
}

void ListBox::SetMarked(int index, bool marked) {
  if (index < 0 || index >= Count()) throw RunTimeError(ErrorNumber::SubscriptOutOfRange);
  const bool changed = marked ? marked_.insert(index).second : marked_.erase(index) > 0;
  if (changed) Touch();
}

void ListBox::ClearMarks() {
  if (marked_.empty()) return;
  marked_.clear();
  Touch();
}

int ListBox::Cursor() const { return std::min(cursor_, Count() - 1); }

void ListBox::RemoveLine(int index) {
  LineHolder::RemoveLine(index);
  std::set<int> moved;
  for (const int mark : marked_) {
    if (mark != index) moved.insert(mark > index ? mark - 1 : mark);
  }
  marked_ = moved;
}

void ListBox::Clear() {
  LineHolder::Clear();
  marked_.clear();
}

void ListBox::IndexAssigned() {
  if (Index() >= 0) cursor_ = Index();
}

void ComboBox::SetText(std::string_view text) {
  if (!Assign(text_, text)) return;
  SetIndexSilently(Find(text));
  Fire(Change);
}

void ComboBox::RemoveLine(int index) {
  const bool was_current = index == Index();
  LineHolder::RemoveLine(index);
  if (was_current) text_.clear();
}

void ComboBox::Clear() {
  LineHolder::Clear();
  text_.clear();
}

void ComboBox::IndexAssigned() { text_ = Index() < 0 ? std::string() : Line(Index()); }

void Grid::SetSize(int rows, int cols) {
  cells_.resize(static_cast<std::size_t>(rows));
  for (auto& row : cells_) row.resize(static_cast<std::size_t>(cols));
  cols_ = cols;
  row_ = std::clamp(row_, 0, std::max(rows - 1, 0));
  col_ = std::clamp(col_, 0, std::max(cols - 1, 0));
  Touch();
}

const std::string& Grid::Cell(int row, int col) const {
  static const std::string kNothing;
  if (row < 0 || row >= Rows() || col < 0 || col >= cols_) return kNothing;
  return cells_[static_cast<std::size_t>(row)][static_cast<std::size_t>(col)];
}

void Grid::SetCell(int row, int col, std::string_view text) {
  if (row < 0 || row >= Rows() || col < 0 || col >= cols_) {
    throw RunTimeError(ErrorNumber::SubscriptOutOfRange);
  }
  Assign(cells_[static_cast<std::size_t>(row)][static_cast<std::size_t>(col)], text);
}

void Grid::SetCurrent(int row, int col) {
  Assign(row_, row);
  Assign(col_, col);
}

void ProgressBar::SetRange(int min, int max) {
  Assign(min_, min);
  Assign(max_, std::max(min, max));
  SetValue(value_);
}

void ProgressBar::SetValue(int value) { Assign(value_, std::clamp(value, min_, max_)); }

}  // namespace marlowbeck
