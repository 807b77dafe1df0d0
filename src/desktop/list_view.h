#pragma once

#include <QListWidget>

#include "desktop/entry_views.h"
#include "ui/controls.h"

namespace marlowbeck {

/// A list of any kind. The model's current line is the selected row; in a list that picks on Enter
/// the keyboard's cursor is the current row, with a mark of its own.
class ListView : public CaptionedView {
 public:
  ListView(ListBox& control, QListWidget* list, Windows& windows);
  bool Pressed(const QWidget& on, const QMouseEvent& event) override;
  void PressedAgain(const QWidget& on, const QMouseEvent& event) override;
  [[nodiscard]] bool ClicksAt(const QWidget& on, QPoint at) const override;
  bool Typed(const QKeyEvent& event) override;

 protected:
  void ShowKind() override;
  void ReadKind(ControlState& state) const override;

 private:
  void BringIntoSight(int line);
  void ShowLines();
  void ShowMarks();
  void PressLine(int line, Qt::KeyboardModifiers modifiers);
  [[nodiscard]] int CurrentLine() const;
  [[nodiscard]] int LineFor(const QKeyEvent& event) const;
  [[nodiscard]] int LineStartingWith(const QString& text) const;

  ListBox& model_;
  QListWidget& list_;
  std::vector<std::string> shown_lines_;
  int shown_line_ = -1;
  int anchor_ = -1;  ///< where a shift-click begins
};

}  // namespace marlowbeck
