#pragma once

#include <QAbstractButton>
#include <QAction>
#include <QGroupBox>
#include <QProgressBar>

#include "desktop/captioned_view.h"
#include "desktop/picture_button.h"
#include "ui/controls.h"

namespace marlowbeck {

// The kinds that say little more than their caption.

/// The caption is a group's title, a label's text or that of a label of the form.
class PanelView : public CaptionedView {
 public:
  using CaptionedView::CaptionedView;
  bool Pressed(const QWidget& on, const QMouseEvent& event) override;
  [[nodiscard]] bool ClicksAt(const QWidget& on, QPoint at) const override;

 protected:
  void ShowKind() override;
  void ShowCommon() override;
  void ReadKind(ControlState& state) const override;
};

class LabelView : public View {
 public:
  LabelView(Control& control, QLabel* label, Windows& windows);
  bool Pressed(const QWidget& on, const QMouseEvent& event) override;
  [[nodiscard]] bool ClicksAt(const QWidget& on, QPoint at) const override;

 protected:
  void ShowKind() override;
  void ReadKind(ControlState& state) const override;

 private:
  QLabel& label_;
};

/// Commands, picture commands, check boxes and options: all that is clicked on.
class ButtonView : public View {
 public:
  ButtonView(Control& control, QAbstractButton* button, Windows& windows);

 protected:
  void ShowKind() override;
  void ReadKind(ControlState& state) const override;

 private:
  QAbstractButton& button_;
};

class MenuView : public View {
 public:
  MenuView(Control& control, QAction* action, Windows& windows);
  [[nodiscard]] QAction& GetAction() const { return action_; }

 protected:
  void ShowKind() override;
  void ShowCommon() override;
  void ReadKind(ControlState& state) const override;
  void ReadCommon(ControlState& state) const override;

 private:
  QAction& action_;
};

class ProgressView : public View {
 public:
  ProgressView(ProgressBar& control, QProgressBar* bar, Windows& windows)
      : View(control, bar, windows), model_(control), bar_(*bar) {}

 protected:
  void ShowKind() override;
  void ReadKind(ControlState& state) const override;

 private:
  ProgressBar& model_;
  QProgressBar& bar_;
};

}  // namespace marlowbeck
