#pragma once

#include <memory>
#include <string>

#include <QKeyEvent>
#include <QMouseEvent>
#include <QObject>
#include <QWidget>

#include "ui/control_state.h"
#include "ui/hand.h"

namespace marlowbeck {

class Windows;

/// A control model with the widget that shows it: brings the widget up to date, turns what a person
/// does to it into acts of the hand, and reads back what the widget shows.
class View : public QObject {
 public:
  View(Control& control, QWidget* widget, Windows& windows);

  [[nodiscard]] Control& GetControl() const { return control_; }
  /// Null for a menu entry, which is no widget.
  [[nodiscard]] QWidget* Widget() const { return widget_; }

  /// Shows the model's state if it has changed since it was last shown, or is stale.
  void BringUpToDate();
  /// A person has worked the widget: it may show something else than its model.
  void MakeStale() { stale_ = true; }

  /// What the widget shows, without a look at the model.
  [[nodiscard]] ControlState Read() const;

  /// A press of the left button, once the focus is here. Answers whether it is dealt with.
  virtual bool Pressed(const QWidget& on, const QMouseEvent& event);
  /// The second press of a double click.
  virtual void PressedAgain(const QWidget& on, const QMouseEvent& event);
  /// A click with the left button there, told when it is let go: that of the control as a whole.
  [[nodiscard]] virtual bool ClicksAt(const QWidget& on, QPoint at) const;
  /// A key that is none of the common ones. Answers whether it is dealt with.
  virtual bool Typed(const QKeyEvent& event);
  /// Up and Down are the widget's own, and mean nothing to the model.
  [[nodiscard]] virtual bool KeepsArrows() const { return false; }
  /// What has been typed but not been told yet is told now.
  virtual void FinishTyping() {}
  /// The focus has come here, or stays after a key that would have taken it elsewhere.
  virtual void FocusCame() {}

 protected:
  using Act = std::function<Outcome(Hand&)>;
  /// Puts the model's state, but visible and enabled, into the widget.
  virtual void ShowKind() = 0;
  /// Adds the fields that only this kind has.
  virtual void ReadKind(ControlState& state) const = 0;
  virtual void ShowCommon();
  virtual void ReadCommon(ControlState& state) const;
  Outcome Do(const Act& act);

 private:
  void ShowMeaning();

  Control& control_;
  QWidget* widget_;
  Windows& windows_;
  std::uint64_t shown_revision_ = 0;
  bool stale_ = true;
};

/// Pairs a control with the widget of its name in a window. Throws std::logic_error, naming the
/// control, when there is none of the right class.
std::unique_ptr<View> MakeView(Control& control, QWidget& window, Windows& windows);

/// A control's name as an object name: optBU(0) is optBU_0.
[[nodiscard]] QString ObjectNameOf(const Control& control);

}  // namespace marlowbeck
