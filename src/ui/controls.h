#pragma once

#include <set>
#include <string>
#include <string_view>
#include <vector>

#include "data/date.h"
#include "ui/control.h"

namespace marlowbeck {

class Panel : public Control {
 public:
  Panel(const Owner& owner, std::string_view name, std::string_view caption = {})
      : Control(owner, Kind::Panel, name, caption) {}
};

class Label : public Control {
 public:
  Label(const Owner& owner, std::string_view name, std::string_view caption = {})
      : Control(owner, Kind::Label, name, caption) {}
};

class Command : public Control {
 public:
  Command(const Owner& owner, std::string_view name, std::string_view caption = {})
      : Control(owner, Kind::Command, name, caption) {}
  [[nodiscard]] bool TakesFocus() const override { return true; }
};

/// A command that shows a picture.
class Picture : public Control {
 public:
  Picture(const Owner& owner, std::string_view name, std::string_view caption = {})
      : Control(owner, Kind::Picture, name, caption) {}
  [[nodiscard]] bool TakesFocus() const override { return true; }

  /// The control at whose height it stands; null for a picture with a place of its own.
  [[nodiscard]] const Control* Beside() const { return beside_; }
  void SetBeside(const Control& control) { Assign(beside_, &control); }

 private:
  const Control* beside_ = nullptr;
};

/// A menu of the menu bar, or an entry of one.
class MenuEntry : public Control {
 public:
  MenuEntry(const Owner& owner, std::string_view name, std::string_view caption = {})
      : Control(owner, Kind::Menu, name, caption) {}
};

/// An entry box. The caption is that of the label beside it.
class TextBox : public Control {
 public:
  TextBox(const Owner& owner, std::string_view name, std::string_view caption = {})
      : Control(owner, Kind::Text, name, caption) {}
  [[nodiscard]] bool TakesFocus() const override { return true; }

  [[nodiscard]] const std::string& Text() const { return text_; }
  /// Fires Change when the text differs.
  void SetText(std::string_view text);
  [[nodiscard]] bool Locked() const { return locked_; }
  void SetLocked(bool locked) { Assign(locked_, locked); }

 private:
  std::string text_;
  bool locked_ = false;
};

class CheckBox : public Control {
 public:
  CheckBox(const Owner& owner, std::string_view name, std::string_view caption = {})
      : Control(owner, Kind::Check, name, caption) {}
  [[nodiscard]] bool TakesFocus() const override { return true; }

  [[nodiscard]] bool Value() const { return value_; }
  void SetValue(bool value) { Assign(value_, value); }

 private:
  bool value_ = false;
};

/// One of the options that lie in the same panel: selecting one clears the others.
class OptionButton : public Control {
 public:
  OptionButton(const Owner& owner, std::string_view name, std::string_view caption = {})
      : Control(owner, Kind::Option, name, caption) {}
  [[nodiscard]] bool TakesFocus() const override { return true; }

  [[nodiscard]] bool ReachedByTab() const override;

  [[nodiscard]] bool Value() const { return value_; }
  void SetValue(bool value);

 private:
  /// Calls `visit` for each of the other options in the same panel.
  template <typename Visit>
  void ForEachPeer(Visit visit) const;

  bool value_ = false;
};

/// What lists and combos share: lines and a current one, -1 for none.
class LineHolder : public Control {
 public:
  [[nodiscard]] bool TakesFocus() const override { return true; }

  [[nodiscard]] const std::vector<std::string>& Lines() const { return lines_; }
  [[nodiscard]] int Count() const { return static_cast<int>(lines_.size()); }
  [[nodiscard]] const std::string& Line(int index) const;
  [[nodiscard]] int Index() const { return index_; }
  /// The first line equal to a text, -1 when there is none.
  [[nodiscard]] int Find(std::string_view text) const;

  void AddLine(std::string_view line);
  virtual void RemoveLine(int index);
  virtual void Clear();

  /// Makes a line the current one and fires Click, also when it is that already. -1 makes none
  /// current and fires nothing.
  void SetIndex(int index);

 protected:
  LineHolder(const Owner& owner, Kind kind, std::string_view name, std::string_view caption)
      : Control(owner, kind, name, caption) {}
  virtual void IndexAssigned() {}
  void SetIndexSilently(int index) { Assign(index_, index); }

 private:
  std::vector<std::string> lines_;
  int index_ = -1;
};

/// A list, of which one line or many can be marked.
class ListBox : public LineHolder {
 public:
  ListBox(const Owner& owner, std::string_view name, std::string_view caption = {})
      : ListBox(owner, Kind::List, name, caption) {}

  /// Several lines can be marked.
  [[nodiscard]] bool Multi() const { return multi_; }
  void SetMulti(bool multi) { multi_ = multi; }
  [[nodiscard]] const std::set<int>& Marked() const { return marked_; }
  void SetMarked(int index, bool marked);
  void ClearMarks();

  /// A pick of a line opens something: the arrow keys then only move the cursor, and Enter picks.
  [[nodiscard]] bool PicksOnEnter() const { return picks_on_enter_; }
  void SetPicksOnEnter(bool picks) { picks_on_enter_ = picks; }
  /// The line under the keyboard, where lines are picked by Enter; kept in its place when the list
  /// is filled anew, so that it stands on the next line when one is gone. -1 in an empty list.
  [[nodiscard]] int Cursor() const;
  void SetCursor(int cursor) { Assign(cursor_, cursor); }

  void RemoveLine(int index) override;
  void Clear() override;

 protected:
  ListBox(const Owner& owner, Kind kind, std::string_view name, std::string_view caption)
      : LineHolder(owner, kind, name, caption) {}
  void IndexAssigned() override;

 private:
  bool multi_ = false;
  bool picks_on_enter_ = false;
  int cursor_ = 0;
  std::set<int> marked_;
};

/// A list that drops down. A locked one cannot be typed into, only picked from; one that is held
/// cannot be picked from either. By program its text may be anything all the same.
class ComboBox : public LineHolder {
 public:
  enum class Typing { Locked, Free };

  ComboBox(const Owner& owner, std::string_view name, std::string_view caption = {},
           Typing typing = Typing::Locked)
      : LineHolder(owner, Kind::Combo, name, caption), typing_(typing) {}

  [[nodiscard]] const std::string& Text() const { return text_; }
  /// Fires Change when the text differs. The line equal to it, if any, becomes current without a
  /// Click.
  void SetText(std::string_view text);
  [[nodiscard]] bool Locked() const { return typing_ == Typing::Locked || held_; }
  /// Its text is not to be changed by a person, in no way.
  [[nodiscard]] bool Held() const { return held_; }
  void SetHeld(bool held) { Assign(held_, held); }

  void RemoveLine(int index) override;
  void Clear() override;

 protected:
  void IndexAssigned() override;

 private:
  Typing typing_;
  bool held_ = false;
  std::string text_;
};

/// A table of texts with a heading row.
class Grid : public Control {
 public:
  Grid(const Owner& owner, std::string_view name, std::string_view caption = {})
      : Control(owner, Kind::Grid, name, caption) {}
  [[nodiscard]] bool TakesFocus() const override { return true; }

  [[nodiscard]] int Rows() const { return static_cast<int>(cells_.size()); }
  [[nodiscard]] int Cols() const { return cols_; }
  void SetSize(int rows, int cols);
  /// Empty for a place outside the table.
  [[nodiscard]] const std::string& Cell(int row, int col) const;
  void SetCell(int row, int col, std::string_view text);

  [[nodiscard]] int Row() const { return row_; }
  [[nodiscard]] int Col() const { return col_; }
  void SetCurrent(int row, int col);

  /// Columns from this one on hold figures and stand to the right.
  [[nodiscard]] int FiguresFrom() const { return figures_from_; }
  void SetFiguresFrom(int col) { Assign(figures_from_, col); }

 private:
  std::vector<std::vector<std::string>> cells_;
  int cols_ = 0;
  int row_ = 0;
  int col_ = 0;
  int figures_from_ = 1;
};

/// A date to be picked. Assigning it fires nothing; a person's pick fires Change.
class DatePicker : public Control {
 public:
  DatePicker(const Owner& owner, std::string_view name, std::string_view caption = {})
      : Control(owner, Kind::Date, name, caption) {}
  [[nodiscard]] bool TakesFocus() const override { return true; }

  [[nodiscard]] marlowbeck::Date Value() const { return value_; }
  void SetValue(marlowbeck::Date value) { Assign(value_, value); }

 private:
  marlowbeck::Date value_{2};  // 1 January 1900, until the screen sets it
};

class ProgressBar : public Control {
 public:
  ProgressBar(const Owner& owner, std::string_view name)
      : Control(owner, Kind::Progress, name, {}) {}

  [[nodiscard]] int Min() const { return min_; }
  [[nodiscard]] int Max() const { return max_; }
  [[nodiscard]] int Value() const { return value_; }
  void SetRange(int min, int max);
  /// Stays within the range.
  void SetValue(int value);

 private:
  int min_ = 0;
  int max_ = 100;
  int value_ = 0;
};

}  // namespace marlowbeck
