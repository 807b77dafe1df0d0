#include "desktop/scripted/gestures.h"

#include <QApplication>
#include <QKeyEvent>
#include <QMouseEvent>
#include <QPointer>

namespace marlowbeck {
namespace {

void SendMouse(QWidget& widget, QEvent::Type type, QPoint at, Qt::MouseButton button,
               Qt::MouseButtons held, Qt::KeyboardModifiers modifiers) {
  QMouseEvent event(type, at, widget.mapToGlobal(QPointF(at)), button, held, modifiers);
  QApplication::sendEvent(&widget, &event);
}

/// How deep panels may lie in each other: a layout asks the one around it in the next round of
/// events only.
constexpr int kMostRounds = 50;

/// Sees whether any layout was asked to lie anew.
class LayoutWatch : public QObject {
 public:
  LayoutWatch() { qApp->installEventFilter(this); }

  bool eventFilter(QObject* /*on*/, QEvent* event) override {
    seen_ = seen_ || event->type() == QEvent::LayoutRequest;
    return false;
  }

  void Forget() { seen_ = false; }
  [[nodiscard]] bool HasSeenAny() const { return seen_; }

 private:
  bool seen_ = false;
};

}  // namespace

void PressMouse(QWidget& widget, QPoint at, Qt::KeyboardModifiers modifiers) {
  SendMouse(widget, QEvent::MouseButtonPress, at, Qt::LeftButton, Qt::LeftButton, modifiers);
}

void ReleaseMouse(QWidget& widget, QPoint at, Qt::KeyboardModifiers modifiers) {
  SendMouse(widget, QEvent::MouseButtonRelease, at, Qt::LeftButton, Qt::NoButton, modifiers);
}

/// What is pressed may have gone by the time that the button is up.
void ClickMouse(QWidget& widget, QPoint at, Qt::KeyboardModifiers modifiers) {
  const QPointer<QWidget> still_there(&widget);
  PressMouse(widget, at, modifiers);
  if (still_there) ReleaseMouse(widget, at, modifiers);
}

void ClickMouseAgain(QWidget& widget, QPoint at) {
  const QPointer<QWidget> still_there(&widget);
  SendMouse(widget, QEvent::MouseButtonDblClick, at, Qt::LeftButton, Qt::LeftButton,
            Qt::NoModifier);
  if (still_there) ReleaseMouse(widget, at);
}

void MoveMouse(QWidget& widget, QPoint at) {
  SendMouse(widget, QEvent::MouseMove, at, Qt::NoButton, Qt::NoButton, Qt::NoModifier);
}

void PressAndLeave(QWidget& widget, QPoint at) {
  constexpr QPoint kBeside(-20, -20);
  const QPointer<QWidget> still_there(&widget);
  PressMouse(widget, at);
  if (still_there) {
    SendMouse(widget, QEvent::MouseMove, kBeside, Qt::NoButton, Qt::LeftButton, Qt::NoModifier);
  }
  if (still_there) ReleaseMouse(widget, kBeside);
}

void KeyDown(QWidget& widget, int key, Qt::KeyboardModifiers modifiers, const QString& text) {
  QKeyEvent press(QEvent::KeyPress, key, modifiers, text);
  QApplication::sendEvent(&widget, &press);
}

void KeyUp(QWidget& widget, int key, Qt::KeyboardModifiers modifiers, const QString& text) {
  QKeyEvent release(QEvent::KeyRelease, key, modifiers, text);
  QApplication::sendEvent(&widget, &release);
}

void PressKey(QWidget& widget, int key, Qt::KeyboardModifiers modifiers, const QString& text) {
  const QPointer<QWidget> still_there(&widget);
  KeyDown(widget, key, modifiers, text);
  if (still_there) KeyUp(widget, key, modifiers, text);
}

void TypeOver(QWidget& entry, const QString& text) {
  PressKey(entry, Qt::Key_A, Qt::ControlModifier);
  if (text.isEmpty()) PressKey(entry, Qt::Key_Delete);
  for (qsizetype at = 0; at < text.size();) {  // a letter may take two characters
    const qsizetype length = text[at].isHighSurrogate() && at + 1 < text.size() ? 2 : 1;
    PressKey(entry, 0, Qt::NoModifier, text.sliced(at, length));
    at += length;
  }
}

void SettleEvents() {
  LayoutWatch watch;
  int round = 0;
  do {
    watch.Forget();
    QApplication::processEvents();
  } while (watch.HasSeenAny() && ++round < kMostRounds);
  QApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
}

}  // namespace marlowbeck
