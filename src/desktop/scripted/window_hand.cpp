#include "desktop/scripted/window_hand.h"

#include <algorithm>
#include <array>
#include <stdexcept>

#include <QApplication>
#include <QLineEdit>
#include <QMenu>
#include <QMenuBar>

#include "desktop/caption_views.h"
#include "desktop/encoding.h"
#include "desktop/scripted/gestures.h"

namespace marlowbeck {
namespace {

/// Labels, panels and bars are only clicked on where they answer.
bool HasClick(const Control& control) {
  switch (control.GetKind()) {
    case Kind::Panel:
    case Kind::Label:
    case Kind::Progress:
      return static_cast<bool>(control.Click);
    default:
      return true;
  }
}

/// A person who goes on elsewhere closes what has dropped down.
void CloseDropped() {
  while (QWidget* const dropped = QApplication::activePopupWidget()) dropped->close();
}

/// What keys go to.
QWidget& KeyboardOf(const ScreenWindow& window) {
  QWidget* const focus = window.Window().focusWidget();
  return focus != nullptr ? *focus : window.Window();
}

}  // namespace

Outcome Refused(const Control& control, std::string_view why) {
  return {control.Name() + " " + std::string(why), false};
}

Outcome OutOfReach(const Control& control) {
  return Refused(control, "is out of reach behind something else");
}

Outcome WindowHand::Perform(const Action& action) {
  windows_.TakeOutcome();
  Outcome outcome = Dispatch(action);
  SettleEvents();
  return outcome;
}

Outcome WindowHand::Dispatch(const Action& action) {
  using Verb = Action::Verb;
  if (action.control != nullptr) {
    if (Outcome check = CheckLive(*action.control); !check.Done()) return check;
  }
  switch (action.verb) {
    case Verb::Click:
      return Click(*action.control);
    case Verb::DoubleClick:
      return DoubleClick(action);
    case Verb::Type:
      return Type(*action.control, action.text);
    case Verb::Pick:
      return Pick(*action.control, action.numbers.at(0));
    case Verb::PickTwice:
      return PickTwice(*action.control, action.numbers.at(0));
    case Verb::Select:
      return Select(*action.control, action.numbers);
    case Verb::Cell:
      return Cell(*action.control, action.numbers.at(0), action.numbers.at(1));
    case Verb::DoubleCell:
      return CellTwice(*action.control, action.numbers.at(0), action.numbers.at(1));
    case Verb::PickDate:
      return PickDate(*action.control, action.date);
    case Verb::Press:
      return Press(action.key);
    case Verb::Mnemonic:
      return PressMnemonic(action.letter);
    case Verb::Focus:
      return Focus(*action.control);
    case Verb::Hover:
      return Hover(*action.control);
    case Verb::HoverScreen:
      return HoverScreen(*action.screen);
    case Verb::CloseScreen:
      return CloseScreen(*action.screen);
  }
  return {};
}

View& WindowHand::ViewOf(const Control& control) const {
  const ScreenWindow* const window = windows_.WindowOf(control.InScreen());
  View* const view = window == nullptr ? nullptr : window->ViewOf(control);
  if (view == nullptr) throw std::logic_error(control.Name() + " is in no window");
  return *view;
}

Outcome WindowHand::CheckLive(const Control& control) const {
  const ControlState state = ViewOf(control).Read();
  if (!state.shown) return Refused(control, "is hidden");
  if (!state.enabled) return Refused(control, "is disabled");
  return {};
}

Outcome WindowHand::Taken() { return windows_.TakeOutcome().value_or(Outcome{}); }

Outcome WindowHand::CheckLive(const Screen& screen) const {
  const ScreenWindow* const window = windows_.WindowOf(screen);
  if (window == nullptr || !window->Window().isVisible()) {
    return {screen.Name() + " is hidden", false};
  }
  if (!window->Window().isEnabled()) return {screen.Name() + " is disabled", false};
  return {};
}

bool WindowHand::TakesSecondClick(const Control& control) const {
  return AnswersDoubleClick(control) && windows_.WindowOf(control.InScreen()) != nullptr &&
         CheckLive(control).Done();
}

std::optional<Place> WindowHand::Reach(View& view) const {
  const auto place = PlaceOn(view, *windows_.WindowOf(view.Widget()));
  if (place) CloseDropped();
  return place;
}

std::optional<Place> WindowHand::ReachBesideLines(View& view) const {
  const auto place = PlaceBesideLines(view, *windows_.WindowOf(view.Widget()));
  if (place) CloseDropped();
  return place;
}

Outcome WindowHand::Click(Control& control) {
  if (!HasClick(control)) return Refused(control, "has no click");
  if (control.GetKind() == Kind::Menu) return ClickMenu(control);
  const auto place = ReachBesideLines(ViewOf(control));
  if (!place) return OutOfReach(control);
  ClickMouse(*place->widget, place->at);
  return Taken();
}

/// Drops the menu down and clicks on the entry; a menu itself only drops down.
Outcome WindowHand::ClickMenu(const Control& control) {
  QAction& action = static_cast<MenuView&>(ViewOf(control)).GetAction();
  const Control& top = control.InControl() == nullptr ? control : *control.InControl();
  QAction& top_action = static_cast<MenuView&>(ViewOf(top)).GetAction();
  auto* const bar = windows_.WindowOf(control.InScreen())->Window().findChild<QMenuBar*>();
  CloseDropped();
  ClickMouse(*bar, bar->actionGeometry(&top_action).center());
  if (&action != &top_action) {
    QMenu& menu = *top_action.menu();
    if (!menu.isVisible()) menu.popup(bar->mapToGlobal(bar->rect().bottomLeft()));
    ClickMouse(menu, menu.actionGeometry(&action).center());
  }
  return Taken();
}

/// Where a second click means nothing it would only be one click more.
Outcome WindowHand::DoubleClick(const Action& action) {
  Control& control = *action.control;
  const auto held = windows_.GetScreens().Hold(control.InScreen());
  Outcome outcome = Click(control);
  if (!outcome.Done() || outcome.lost || !TakesSecondClick(control)) return outcome;
  if (const auto place = ReachBesideLines(ViewOf(control))) {
    ClickMouseAgain(*place->widget, place->at);
  }
  Taken();
  return outcome;
}

Outcome WindowHand::Type(Control& control, const std::string& text) {
  View& view = ViewOf(control);
  QLineEdit* const entry = EntryOf(view);
  if (entry == nullptr) return Refused(control, "cannot be typed into");
  const auto held = windows_.GetScreens().Hold(control.InScreen());
  const QWidget& window = *entry->window();
  if (!Reach(view)) return OutOfReach(control);
  PressAndLeave(*entry, entry->rect().center());
  Outcome outcome = Taken();
  if (outcome.lost) return outcome;
  PressKey(*entry, Qt::Key_A, Qt::ControlModifier);
  if (text.empty()) PressKey(*entry, Qt::Key_Delete);
  // The line of a combo has its focus through the combo.
  const QWidget* const holder = entry->focusProxy() != nullptr ? entry->focusProxy() : entry;
  for (const QChar letter : ToQt(text)) {
    // What is typed on after the focus has left does not come here.
    if (!window.isVisible() || window.focusWidget() != holder) break;
    PressKey(*entry, 0, Qt::NoModifier, letter);
    Taken();
  }
  Taken();
  return outcome;
}

Outcome WindowHand::Press(Key key) {
  ScreenWindow* const front = windows_.Front();
  if (front == nullptr) return {"no screen is in front", false};
  if (!front->Window().isEnabled()) return {front->GetScreen().Name() + " is disabled", false};
  static constexpr std::array<std::pair<Key, int>, 7> kKeys = {{{Key::Enter, Qt::Key_Return},
                                                                {Key::Tab, Qt::Key_Tab},
                                                                {Key::BackTab, Qt::Key_Backtab},
                                                                {Key::Escape, Qt::Key_Escape},
                                                                {Key::Up, Qt::Key_Up},
                                                                {Key::Down, Qt::Key_Down},
                                                                {Key::F1, Qt::Key_F1}}};
  const auto* const place = std::find_if(kKeys.begin(), kKeys.end(),
                                         [key](const auto& known) { return known.first == key; });
  CloseDropped();
  return Strike(KeyboardOf(*front), place->second, Qt::NoModifier);
}

/// A key comes up where the focus is by then. One that called up a box or a menu comes up in that.
Outcome WindowHand::Strike(QWidget& keyboard, int code, Qt::KeyboardModifiers modifiers,
                           const QString& text) {
  const long boxes_before = boxes_.Shown();
  KeyDown(keyboard, code, modifiers, text);
  Outcome outcome = Taken();
  const ScreenWindow* const front = windows_.Front();
  const bool comes_up_here =
      boxes_.Shown() == boxes_before && QApplication::activePopupWidget() == nullptr;
  if (!outcome.Done() || !comes_up_here || front == nullptr) return outcome;
  KeyUp(KeyboardOf(*front), code, modifiers, text);
  Taken();
  return outcome;
}

/// While a menu is down, a letter of one of its entries is the menu's.
Outcome WindowHand::PressMnemonic(char letter) {
  ScreenWindow* const front = windows_.Front();
  if (front == nullptr) return {"no screen is in front", false};
  const int key = QChar::fromLatin1(letter).toUpper().unicode();
  if (auto* const menu = qobject_cast<QMenu*>(QApplication::activePopupWidget())) {
    for (const QAction* entry : menu->actions()) {
      if (MnemonicOf(FromMnemonicText(entry->text())) != static_cast<char>(key)) continue;
      if (!entry->isEnabled() || !entry->isVisible()) continue;
      return Strike(*menu, key, Qt::NoModifier, QChar(key).toLower());
    }
  }
  CloseDropped();
  return Strike(KeyboardOf(*front), key, Qt::AltModifier);
}

/// By a press of the button that is let go elsewhere.
Outcome WindowHand::Focus(Control& control) {
  if (!control.TakesFocus()) return Refused(control, "takes no focus");
  const auto place = ReachBesideLines(ViewOf(control));
  if (!place) return OutOfReach(control);
  PressAndLeave(*place->widget, place->at);
  CloseDropped();  // a combo drops down at the press
  return Taken();
}

Outcome WindowHand::Hover(Control& control) {
  View& view = ViewOf(control);
  if (view.Widget() == nullptr) return {};
  const auto place = Reach(view);
  if (!place) return OutOfReach(control);
  MoveMouse(*place->widget, place->at);
  return Taken();
}

Outcome WindowHand::HoverScreen(const Screen& screen) {
  if (Outcome check = CheckLive(screen); !check.Done()) return check;
  CloseDropped();
  MoveMouse(windows_.WindowOf(screen)->Window(), {1, 1});
  return Taken();
}

Outcome WindowHand::CloseScreen(const Screen& screen) {
  if (Outcome check = CheckLive(screen); !check.Done()) return check;
  CloseDropped();
  windows_.WindowOf(screen)->Window().close();
  return Taken();
}

}  // namespace marlowbeck
