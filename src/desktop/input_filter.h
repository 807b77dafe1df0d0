#pragma once

#include <QKeyEvent>
#include <QMouseEvent>
#include <QObject>

#include "desktop/windows.h"

namespace marlowbeck {

/// Sees the whole application's keys and presses before the widgets do, so that the focus stays the
/// model's: a press first takes the focus there, and is swallowed where that is refused; keys that
/// mean something to every screen go to the hand.
class InputFilter : public QObject {
 public:
  explicit InputFilter(Windows& windows) : windows_(windows) {}

  bool eventFilter(QObject* watched, QEvent* event) override;

 private:
  bool Key(const QObject& watched, ScreenWindow& window, QKeyEvent& event);
  bool CommonKey(const QKeyEvent& event, const View* view);
  bool KeyRelease(const QKeyEvent& event);
  bool MousePress(QObject& watched, ScreenWindow& window, const QMouseEvent& event);
  bool MouseRelease(const QObject& watched, ScreenWindow& window, const QMouseEvent& event);
  bool SecondPress(QObject& watched, ScreenWindow& window, const QMouseEvent& event);
  bool MouseMove(const QObject& watched, ScreenWindow& window, const QMouseEvent& event);
  bool TakeFocus(Control& control);
  void FinishTyping();

  Windows& windows_;
  bool swallowing_ = false;           ///< until the button that lost its click is up again
  const Control* pressed_ = nullptr;  ///< where a click as a whole may end
  const Control* clicked_ = nullptr;  ///< by the last press, which may begin a double click
};

/// The key of the hand that a key of the keyboard is; nothing for any other.
std::optional<Key> HandKeyOf(const QKeyEvent& event);

}  // namespace marlowbeck
