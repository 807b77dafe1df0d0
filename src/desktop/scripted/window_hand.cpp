#include "desktop/scripted/window_hand.h"

#include <algorithm>
#include <array>
#include <stdexcept>

#include <QAbstractButton>
#include <QAbstractItemView>
#include <QApplication>
#include <QCalendarWidget>
#include <QCheckBox>
#include <QComboBox>
#include <QDateEdit>
#include <QHeaderView>
#include <QLineEdit>
#include <QListWidget>
#include <QMenu>
#include <QMenuBar>
#include <QScrollArea>
#include <QStyleOption>
#include <QTableView>
#include <QTableWidget>

#include "desktop/caption_views.h"
#include "desktop/encoding.h"
#include "desktop/scripted/gestures.h"

namespace marlowbeck {
namespace {

Outcome Refused(const Control& control, std::string_view why) {
  return {control.Name() + " " + std::string(why), false};
}

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

/// The entry that a keyboard would type into; null where nothing can be typed.
QLineEdit* EntryOf(const View& view) {
  if (auto* const combo = qobject_cast<QComboBox*>(view.Widget())) return combo->lineEdit();
  auto* const box = qobject_cast<QLineEdit*>(view.Widget());
  return box == nullptr || box->isReadOnly() ? nullptr : box;
}

QPoint ArrowOf(const QComboBox& combo) {
  QStyleOptionComboBox option;
  option.initFrom(&combo);
  option.editable = combo.isEditable();
  return combo.style()
      ->subControlRect(QStyle::CC_ComboBox, &option, QStyle::SC_ComboBoxArrow, &combo)
      .center();
}

/// Where a widget answers to a click: a box with a caption only on those two.
QRect AnsweringArea(const QWidget& widget) {
  const auto* const button = qobject_cast<const QAbstractButton*>(&widget);
  if (button == nullptr || !button->isCheckable()) return widget.rect();
  QStyleOptionButton option;
  option.initFrom(button);
  option.text = button->text();
  const auto area = qobject_cast<const QCheckBox*>(button) != nullptr
                        ? QStyle::SE_CheckBoxClickRect
                        : QStyle::SE_RadioButtonClickRect;
  return widget.style()->subElementRect(area, &option, &widget);
}

/// What keys go to.
QWidget& KeyboardOf(const ScreenWindow& window) {
  QWidget* const focus = window.Window().focusWidget();
  return focus != nullptr ? *focus : window.Window();
}

void ScrollIntoView(QWidget& widget) {
  for (QWidget* holder = widget.parentWidget(); holder != nullptr;
       holder = holder->parentWidget()) {
    if (auto* const area = qobject_cast<QScrollArea*>(holder)) area->ensureWidgetVisible(&widget);
  }
}

}  // namespace

Outcome WindowHand::Perform(const Action& action) {
  if (action.verb != Action::Verb::Mnemonic) CloseDropped();
  windows_.TakeOutcome();
  Outcome outcome = Dispatch(action);
  SettleEvents();
  return outcome;
}

Outcome WindowHand::Dispatch(const Action& action) {
  using Verb = Action::Verb;
  if (action.control != nullptr && action.verb != Verb::Hover) {
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

/// A point of the control's widget where it lies on top, and what lies there; nothing where it
/// cannot be reached.
std::optional<WindowHand::Place> WindowHand::FreePlace(View& view) const {
  constexpr int kStep = 6;
  QWidget& widget = *view.Widget();
  ScrollIntoView(widget);
  SettleEvents();
  QWidget& outer = *widget.window();
  const ScreenWindow& window = *windows_.WindowOf(&widget);
  const auto place_at = [&](QPoint at) -> std::optional<Place> {
    QWidget* const hit = outer.childAt(widget.mapTo(&outer, at));
    if (hit == nullptr || window.ViewAt(hit) != &view) return std::nullopt;
    return Place{hit, hit->mapFrom(&outer, widget.mapTo(&outer, at))};
  };
  const QRect area = AnsweringArea(widget);
  if (const auto centre = place_at(area.center())) return centre;
  for (int y = area.top() + kStep / 2; y <= area.bottom(); y += kStep) {
    for (int x = area.left() + kStep / 2; x <= area.right(); x += kStep) {
      if (const auto place = place_at({x, y})) return place;
    }
  }
  return std::nullopt;
}

Outcome WindowHand::ClickAt(const std::optional<Place>& place, const Control& control,
                            Qt::KeyboardModifiers modifiers) {
  if (!place) return Refused(control, "is out of reach behind something else");
  ClickMouse(*place->widget, place->at, modifiers);
  return Taken();
}

Outcome WindowHand::Click(Control& control) {
  if (!HasClick(control)) return Refused(control, "has no click");
  if (control.GetKind() == Kind::Menu) return ClickMenu(control);
  View& view = ViewOf(control);
  switch (control.GetKind()) {
    case Kind::List:
    case Kind::Drives:
    case Kind::Folders:
    case Kind::Files:
    case Kind::Combo:
    case Kind::Grid:
    case Kind::Date:
    case Kind::Text:
      // Beside lines, cells and letters there is no sure place to click on.
      windows_.Do(&view, [&](Hand& hand) { return hand.Click(control); });
      return Taken();
    default:
      return ClickAt(FreePlace(view), control);
  }
}

/// Drops the menu down and clicks on the entry; a menu itself only drops down.
Outcome WindowHand::ClickMenu(const Control& control) {
  QAction& action = static_cast<MenuView&>(ViewOf(control)).GetAction();
  const Control& top = control.InControl() == nullptr ? control : *control.InControl();
  QAction& top_action = static_cast<MenuView&>(ViewOf(top)).GetAction();
  auto* const bar = windows_.WindowOf(control.InScreen())->Window().findChild<QMenuBar*>();
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
  if (!outcome.Done() || outcome.lost || !control.DoubleClick) return outcome;
  if (windows_.WindowOf(control.InScreen()) == nullptr || !CheckLive(control).Done()) {
    return outcome;
  }
  if (const auto place = FreePlace(ViewOf(control))) ClickMouseAgain(*place->widget, place->at);
  Taken();
  return outcome;
}

Outcome WindowHand::Type(Control& control, const std::string& text) {
  View& view = ViewOf(control);
  QLineEdit* const entry = EntryOf(view);
  if (entry == nullptr) return Refused(control, "cannot be typed into");
  const auto held = windows_.GetScreens().Hold(control.InScreen());
  const QWidget& window = *entry->window();
  const auto place = FreePlace(view);
  if (!place) return Refused(control, "is out of reach behind something else");
  ClickMouse(*entry, entry->rect().center());
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

Outcome WindowHand::Pick(Control& control, int line) {
  View& view = ViewOf(control);
  const auto lines = view.Read().lines;
  if (!lines) return Refused(control, "has no lines");
  if (line < 0 || line >= static_cast<int>(lines->size())) {
    return Refused(control, "has no such line");
  }
  return control.GetKind() == Kind::Combo ? PickInCombo(view, line)
                                          : PickInList(view, line, Qt::NoModifier);
}

/// Drops the list down, goes to the line and takes it.
Outcome WindowHand::PickInCombo(View& view, int line) {
  auto& combo = static_cast<QComboBox&>(*view.Widget());
  if (!FreePlace(view)) {
    return Refused(view.GetControl(), "is out of reach behind something else");
  }
  ClickMouse(combo, ArrowOf(combo));
  Outcome outcome = Taken();
  if (outcome.lost) return outcome;
  QAbstractItemView& list = *combo.view();
  if (!list.isVisible()) return Refused(view.GetControl(), "does not drop down");
  list.setCurrentIndex(combo.model()->index(line, combo.modelColumn()));
  PressKey(list, Qt::Key_Return);
  return Taken();
}

Outcome WindowHand::PickInList(View& view, int line, Qt::KeyboardModifiers modifiers) {
  auto& list = static_cast<QListWidget&>(*view.Widget());
  if (!FreePlace(view)) {
    return Refused(view.GetControl(), "is out of reach behind something else");
  }
  list.scrollToItem(list.item(line));
  const QRect row = list.visualItemRect(list.item(line)) & list.viewport()->rect();
  ClickMouse(*list.viewport(), row.center(), modifiers);
  return Taken();
}

Outcome WindowHand::PickTwice(Control& control, int line) {
  const auto held = windows_.GetScreens().Hold(control.InScreen());
  Outcome outcome = Pick(control, line);
  if (!outcome.Done() || outcome.lost || !control.DoubleClick) return outcome;
  if (windows_.WindowOf(control.InScreen()) == nullptr || !CheckLive(control).Done()) {
    return outcome;
  }
  auto* const list = qobject_cast<QListWidget*>(ViewOf(control).Widget());
  if (list != nullptr) ClickMouseAgain(*list->viewport(), list->viewport()->rect().center());
  Taken();
  return outcome;
}

Outcome WindowHand::Select(Control& control, const std::vector<int>& lines) {
  View& view = ViewOf(control);
  const ControlState state = view.Read();
  if (!state.selected) return Refused(control, "marks one line only");
  for (const int line : lines) {
    if (line < 0 || line >= static_cast<int>(state.lines->size())) {
      return Refused(control, "has no such line");
    }
  }
  const auto held = windows_.GetScreens().Hold(control.InScreen());
  const std::vector<int>& clicks = lines.empty() ? *state.selected : lines;
  Outcome outcome;
  for (std::size_t i = 0; i < clicks.size() && !outcome.lost; ++i) {
    if (!HasLine(control, clicks[i])) break;  // a click has taken it away
    const bool first = i == 0 && !lines.empty();
    outcome = PickInList(view, clicks[i], first ? Qt::NoModifier : Qt::ControlModifier);
  }
  return outcome;
}

/// The list can still be acted on and has the line.
bool WindowHand::HasLine(const Control& control, int line) const {
  if (windows_.WindowOf(control.InScreen()) == nullptr || !CheckLive(control).Done()) return false;
  const auto lines = ViewOf(control).Read().lines;
  return lines && line < static_cast<int>(lines->size());
}

Outcome WindowHand::Cell(Control& control, int row, int col) {
  View& view = ViewOf(control);
  const ControlState state = view.Read();
  if (!state.cells) return Refused(control, "has no cells");
  if (row < 0 || row >= static_cast<int>(state.cells->size()) || col < 0 || col >= *state.cols) {
    return Refused(control, "has no such cell");
  }
  auto& table = static_cast<QTableWidget&>(*view.Widget());
  if (!FreePlace(view)) return Refused(control, "is out of reach behind something else");
  table.scrollTo(table.model()->index(std::max(row - 1, 0), col));
  SettleEvents();
  if (row == 0) {
    QHeaderView& header = *table.horizontalHeader();
    // Well inside, since the edge is for widening the column.
    const int x = header.sectionViewportPosition(col) + header.sectionSize(col) / 2;
    ClickMouse(*header.viewport(), {x, header.height() / 2});
  } else {
    const QRect cell = table.visualRect(table.model()->index(row - 1, col));
    ClickMouse(*table.viewport(), (cell & table.viewport()->rect()).center());
  }
  return Taken();
}

Outcome WindowHand::CellTwice(Control& control, int row, int col) {
  const auto held = windows_.GetScreens().Hold(control.InScreen());
  Outcome outcome = Cell(control, row, col);
  if (!outcome.Done() || outcome.lost || !control.DoubleClick) return outcome;
  if (windows_.WindowOf(control.InScreen()) == nullptr || !CheckLive(control).Done()) {
    return outcome;
  }
  auto& table = static_cast<QTableWidget&>(*ViewOf(control).Widget());
  ClickMouseAgain(*table.viewport(), table.viewport()->rect().center());
  Taken();
  return outcome;
}

/// Lets the calendar drop down and takes the day in it.
Outcome WindowHand::PickDate(Control& control, Date date) {
  View& view = ViewOf(control);
  auto* const box = qobject_cast<QDateEdit*>(view.Widget());
  if (box == nullptr) return Refused(control, "has no date");
  if (!FreePlace(view)) return Refused(control, "is out of reach behind something else");
  constexpr int kArrow = 8;
  ClickMouse(*box, {box->width() - kArrow, box->height() / 2});
  Outcome outcome = Taken();
  if (outcome.lost) return outcome;
  QCalendarWidget& calendar = *box->calendarWidget();
  if (!calendar.isVisible()) return Refused(control, "does not drop down");
  calendar.setSelectedDate(ToQt(date));
  if (auto* const days = calendar.findChild<QTableView*>()) PressKey(*days, Qt::Key_Return);
  CloseDropped();
  return Taken();
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
  for (const auto& [known, code] : kKeys) {
    if (known == key) Strike(*front, code);
  }
  return Taken();
}

/// A key comes up where the focus is by then. One that called up a box comes up in that.
void WindowHand::Strike(const ScreenWindow& front, int code) {
  const long boxes_before = boxes_.Shown();
  KeyDown(KeyboardOf(front), code);
  const ScreenWindow* const now = windows_.Front();
  if (now != nullptr && boxes_.Shown() == boxes_before) KeyUp(KeyboardOf(*now), code);
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
      PressKey(*menu, key, Qt::NoModifier, QChar(key).toLower());
      return Taken();
    }
  }
  CloseDropped();
  PressKey(KeyboardOf(*front), key, Qt::AltModifier);
  return Taken();
}

/// A click into an entry; to the others the focus goes without a click, which would do more.
Outcome WindowHand::Focus(Control& control) {
  if (!control.TakesFocus()) return Refused(control, "takes no focus");
  View& view = ViewOf(control);
  if (QLineEdit* const entry = EntryOf(view); entry != nullptr && FreePlace(view)) {
    ClickMouse(*entry, entry->rect().center());
  } else {
    windows_.Do(nullptr, [&](Hand& hand) { return hand.Focus(control); });
  }
  return Taken();
}

Outcome WindowHand::Hover(Control& control) {
  View& view = ViewOf(control);
  if (!view.Read().shown) return Refused(control, "is hidden");
  if (view.Widget() == nullptr) return {};
  if (const auto place = FreePlace(view)) MoveMouse(*place->widget, place->at);
  return Taken();
}

Outcome WindowHand::HoverScreen(const Screen& screen) {
  const ScreenWindow* const window = windows_.WindowOf(screen);
  if (window == nullptr || !window->Window().isVisible()) {
    return {screen.Name() + " is hidden", false};
  }
  MoveMouse(window->Window(), {1, 1});
  return Taken();
}

Outcome WindowHand::CloseScreen(const Screen& screen) {
  const ScreenWindow* const window = windows_.WindowOf(screen);
  if (window == nullptr || !window->Window().isVisible()) {
    return {screen.Name() + " is hidden", false};
  }
  if (!window->Window().isEnabled()) return {screen.Name() + " is disabled", false};
  window->Window().close();
  return Taken();
}

}  // namespace marlowbeck
