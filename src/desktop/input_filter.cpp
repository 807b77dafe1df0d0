#include "desktop/input_filter.h"

#include <utility>

#include <QAbstractScrollArea>
#include <QApplication>
#include <QComboBox>
#include <QDateEdit>
#include <QLineEdit>
#include <QMainWindow>
#include <QMenuBar>

#include "desktop/caption_views.h"
#include "desktop/encoding.h"

namespace marlowbeck {
namespace {

/// The letter or figure pressed together with Alt; 0 for none.
char AltLetter(const QKeyEvent& event) {
  if (event.modifiers() != Qt::AltModifier) return 0;
  const int key = event.key();
  const bool letter =
      (key >= Qt::Key_A && key <= Qt::Key_Z) || (key >= Qt::Key_0 && key <= Qt::Key_9);
  return letter ? static_cast<char>(key) : '\0';
}

/// Lets the menu of a menu bar drop down, as its letter does.
void DropDown(ScreenWindow& window, const Control& menu) {
  auto* const frame = qobject_cast<QMainWindow*>(&window.Window());
  const auto* const view = static_cast<const MenuView*>(window.ViewOf(menu));
  if (frame != nullptr && view != nullptr) frame->menuBar()->setActiveAction(&view->GetAction());
}

bool CanBeTypedInto(const QWidget& widget) {
  const auto* const combo = qobject_cast<const QComboBox*>(&widget);
  return (combo != nullptr && combo->isEditable()) ||
         qobject_cast<const QLineEdit*>(&widget) != nullptr ||
         qobject_cast<const QDateEdit*>(&widget) != nullptr;
}

bool IsMenuMnemonic(const Control& control, char letter) {
  return control.GetKind() == Kind::Menu && control.InControl() == nullptr && control.Live() &&
         MnemonicOf(control.Caption()) == letter;
}

}  // namespace

std::optional<Key> HandKeyOf(const QKeyEvent& event) {
  const auto modifiers = event.modifiers() & ~Qt::KeypadModifier;
  if (event.key() == Qt::Key_Backtab) return Key::BackTab;
  if (event.key() == Qt::Key_Tab && modifiers == Qt::ShiftModifier) return Key::BackTab;
  if (modifiers != Qt::NoModifier) return std::nullopt;
  switch (event.key()) {
    case Qt::Key_Return:
    case Qt::Key_Enter:
      return Key::Enter;
    case Qt::Key_Tab:
      return Key::Tab;
    case Qt::Key_Escape:
      return Key::Escape;
    case Qt::Key_Up:
      return Key::Up;
    case Qt::Key_Down:
      return Key::Down;
    case Qt::Key_F1:
      return Key::F1;
    default:
      return std::nullopt;
  }
}

bool InputFilter::eventFilter(QObject* watched, QEvent* event) {
  switch (event->type()) {
    case QEvent::KeyPress:
    case QEvent::KeyRelease:
    case QEvent::ShortcutOverride:
    case QEvent::MouseButtonPress:
    case QEvent::MouseButtonDblClick:
    case QEvent::MouseButtonRelease:
    case QEvent::MouseMove:
    case QEvent::Wheel:
    case QEvent::Close:
      break;
    default:
      return false;
  }
  ScreenWindow* const window = windows_.WindowOf(watched);
  if (window == nullptr) return false;
  switch (event->type()) {
    case QEvent::KeyPress:
    case QEvent::ShortcutOverride:
      return Key(*watched, *window, *static_cast<QKeyEvent*>(event));
    case QEvent::KeyRelease:
      return KeyRelease(*static_cast<QKeyEvent*>(event));
    case QEvent::MouseButtonPress:
      return MousePress(*watched, *window, *static_cast<QMouseEvent*>(event));
    case QEvent::MouseButtonDblClick:
      return SecondPress(*watched, *window, *static_cast<QMouseEvent*>(event));
    case QEvent::MouseButtonRelease:
      return MouseRelease(*watched, *window, *static_cast<QMouseEvent*>(event));
    case QEvent::MouseMove:
      return MouseMove(*watched, *window, *static_cast<QMouseEvent*>(event));
    case QEvent::Wheel:
      // A wheel that passes over an entry changes nothing in it.
      return qobject_cast<QComboBox*>(watched) != nullptr ||
             qobject_cast<QDateEdit*>(watched) != nullptr;
    default:
      if (watched != &window->Window()) return false;
      event->ignore();
      windows_.Do(nullptr, [&](Hand& hand) { return hand.CloseScreen(window->GetScreen()); });
      return true;
  }
}

/// Of a key that is ours the shortcut is claimed first, so that it comes as a key.
bool InputFilter::Key(const QObject& watched, ScreenWindow& window, QKeyEvent& event) {
  if (qobject_cast<const QMenuBar*>(&watched) != nullptr) return false;
  View* const view = window.ViewAt(&watched);
  const bool arrows = event.key() == Qt::Key_Up || event.key() == Qt::Key_Down;
  const bool common =
      AltLetter(event) != 0 ||
      (HandKeyOf(event).has_value() && !(arrows && view != nullptr && view->KeepsArrows()));
  if (event.type() == QEvent::ShortcutOverride) {
    if (common) event.accept();
    return common;
  }
  if (common) return CommonKey(event, view);
  const auto held = event.modifiers() & ~(Qt::ShiftModifier | Qt::KeypadModifier);
  return view != nullptr && held == Qt::NoModifier && view->Typed(event);
}

bool InputFilter::CommonKey(const QKeyEvent& event, const View* view) {
  const auto key = HandKeyOf(event);
  // A key that is held down is not pressed again.
  const bool is_tab = key == Key::Tab || key == Key::BackTab;
  const bool is_arrow = key == Key::Up || key == Key::Down;
  if (event.isAutoRepeat() && !is_tab && !is_arrow) return true;
  if (view != nullptr) FinishTyping();
  if (key) {
    const auto press = [&](Hand& hand) { return hand.Press(*key); };
    if (is_tab || key == Key::Enter) {
      windows_.DoByKey(press);
    } else {
      windows_.Do(nullptr, press);
    }
    return true;
  }
  const char letter = AltLetter(event);
  windows_.DoByKey([&](Hand& hand) {
    hand.CloseMenu();  // while one is down, the keys are its own
    return hand.PressMnemonic(letter);
  });
  if (ScreenWindow* const front = windows_.Front()) {
    for (const Control* control : front->GetScreen().Controls()) {
      if (!IsMenuMnemonic(*control, letter)) continue;
      DropDown(*front, *control);
      break;
    }
  }
  return true;
}

/// Lists want to know; a key that is held down comes up once.
bool InputFilter::KeyRelease(const QKeyEvent& event) {
  const Control* const focus = windows_.GetScreens().Focus();
  if (event.isAutoRepeat() || focus == nullptr || !focus->KeyUp) return false;
  windows_.Do(nullptr, [](Hand& hand) { return hand.Release(); });
  return true;
}

bool InputFilter::TakeFocus(Control& control) {
  if (!control.TakesFocus() || windows_.GetScreens().Focus() == &control) return true;
  return !windows_.Do(nullptr, [&](Hand& hand) { return hand.Focus(control); }).lost;
}

/// A date that is half typed is told before the person goes on to something else.
void InputFilter::FinishTyping() {
  const Control* const focus = windows_.GetScreens().Focus();
  ScreenWindow* const front = windows_.Front();
  if (focus == nullptr || front == nullptr) return;
  if (View* const view = front->ViewOf(*focus)) view->FinishTyping();
}

bool InputFilter::MousePress(QObject& watched, ScreenWindow& window, const QMouseEvent& event) {
  swallowing_ = false;
  pressed_ = nullptr;
  clicked_ = nullptr;
  View* const view = window.ViewAt(&watched);
  if (view == nullptr) return false;
  if (!view->Widget()->isEnabled()) return true;
  Control& control = view->GetControl();
  if (windows_.GetScreens().Focus() != &control) FinishTyping();
  if (!TakeFocus(control)) {
    swallowing_ = true;
    return true;
  }
  if (event.button() != Qt::LeftButton) return false;
  clicked_ = &control;
  const auto& widget = static_cast<const QWidget&>(watched);
  // A line that goes as it is picked leaves the button to come up beside the lines.
  if (view->ClicksAt(widget, event.position().toPoint())) pressed_ = &control;
  return view->Pressed(widget, event);
}

/// The second press of a double click is no second click, and nothing to what has come up in the
/// place of what was clicked. In an entry it marks a word.
bool InputFilter::SecondPress(QObject& watched, ScreenWindow& window, const QMouseEvent& event) {
  View* const view = window.ViewAt(&watched);
  if (view == nullptr || event.button() != Qt::LeftButton) {
    return MousePress(watched, window, event);
  }
  const bool was_clicked = clicked_ == &view->GetControl();
  swallowing_ = !was_clicked || !CanBeTypedInto(*view->Widget());
  if (was_clicked) view->PressedAgain(static_cast<const QWidget&>(watched), event);
  return swallowing_;
}

bool InputFilter::MouseRelease(const QObject& watched, ScreenWindow& window,
                               const QMouseEvent& event) {
  if (swallowing_) {
    swallowing_ = event.buttons() != Qt::NoButton;
    return true;
  }
  View* const view = window.ViewAt(&watched);
  if (view == nullptr || event.button() != Qt::LeftButton) return false;
  Control& control = view->GetControl();
  if (std::exchange(pressed_, nullptr) != &control) return false;
  const auto& on = static_cast<const QWidget&>(watched);
  const QPoint at = event.position().toPoint();
  const bool inside = view->Widget()->rect().contains(on.mapTo(view->Widget(), at));
  if (inside && view->ClicksAt(on, at)) {
    windows_.Do(view, [&](Hand& hand) { return hand.Click(control); });
  }
  return false;
}

bool InputFilter::MouseMove(const QObject& watched, ScreenWindow& window,
                            const QMouseEvent& event) {
  if (event.buttons() != Qt::NoButton) return swallowing_;
  if (qobject_cast<const QMenuBar*>(&watched) != nullptr) return false;
  const View* const view = window.ViewAt(&watched);
  if (view == nullptr) {
    windows_.Do(nullptr, [&](Hand& hand) { return hand.HoverScreen(window.GetScreen()); });
    return true;
  }
  Control& control = view->GetControl();
  if (control.MouseMove) {
    windows_.Do(nullptr, [&](Hand& hand) { return hand.Hover(control); });
  }
  // Lists and grids need the pointer themselves, for the edges of their headers.
  return dynamic_cast<const QAbstractScrollArea*>(view->Widget()) == nullptr;
}

}  // namespace marlowbeck
