#include "desktop/caption_views.h"

#include <algorithm>

#include <QMenu>

#include "data/text.h"
#include "desktop/encoding.h"
#include "desktop/printer_font.h"
#include "print/font_box.h"

namespace marlowbeck {
namespace {

std::optional<bool> ValueOf(const Control& control) {
  if (const auto* check = dynamic_cast<const CheckBox*>(&control)) return check->Value();
  if (const auto* option = dynamic_cast<const OptionButton*>(&control)) return option->Value();
  return std::nullopt;
}

/// Brings a picture to the height of the control that it stands beside.
void MoveBeside(QWidget& picture, const Control& control) {
  const auto* const other = picture.window()->findChild<QWidget*>(ObjectNameOf(control));
  if (other == nullptr) return;
  const QPoint centre = other->mapTo(picture.window(), other->rect().center());
  const int height = picture.parentWidget()->mapFrom(picture.window(), centre).y();
  picture.move(picture.x(), height - picture.height() / 2);
}

/// What holds a panel comes up with it.
void RaiseWithHolders(QWidget& panel) {
  for (QWidget* widget = &panel; widget != panel.window(); widget = widget->parentWidget()) {
    widget->raise();
  }
}

/// What holds nothing any more that could be seen is not to lie over anything.
void LowerEmptyHolders(const QWidget& panel) {
  for (QWidget* holder = panel.parentWidget(); holder != panel.window();
       holder = holder->parentWidget()) {
    const auto inner = holder->findChildren<QWidget*>(Qt::FindDirectChildrenOnly);
    const bool is_empty = std::all_of(inner.begin(), inner.end(),
                                      [](const QWidget* widget) { return widget->isHidden(); });
    if (!is_empty) return;
    holder->lower();
  }
}

/// A name may be filled up with blanks to the width of its field.
void TakeNoRoomForBlanks(QLabel& label) {
  QString text = label.text();
  while (text.endsWith(' ')) text.chop(1);
  label.setMaximumWidth(label.fontMetrics().horizontalAdvance(text + ' '));
}

}  // namespace

/// A press that begins a click is not passed on to what the panel lies in.
bool PanelView::Pressed(const QWidget& /*on*/, const QMouseEvent& /*event*/) {
  return static_cast<bool>(GetControl().Click);
}

bool PanelView::ClicksAt(const QWidget& /*on*/, QPoint /*at*/) const {
  return static_cast<bool>(GetControl().Click);
}

void PanelView::ShowKind() {
  const std::string& caption = GetControl().Caption();
  if (auto* const group = qobject_cast<QGroupBox*>(Widget())) {
    group->setTitle(ToMnemonicText(caption));
  } else if (auto* const label = qobject_cast<QLabel*>(Widget())) {
    label->setTextFormat(Qt::PlainText);
    label->setText(ToQt(caption));
    label->setAccessibleName(Spoken(Trimmed(caption)));
    if (label->frameShape() == QFrame::NoFrame) TakeNoRoomForBlanks(*label);
  } else if (Buddy() == nullptr) {
    Widget()->setWindowTitle(ToQt(caption));  // nowhere to be seen, but there to be read
  }
}

/// A panel that comes up stands over those that lie in the same place.
void PanelView::ShowCommon() {
  const bool was_hidden = Widget()->isHidden();
  CaptionedView::ShowCommon();
  if (was_hidden && !Widget()->isHidden()) RaiseWithHolders(*Widget());
  if (!was_hidden && Widget()->isHidden()) LowerEmptyHolders(*Widget());
}

void PanelView::ReadKind(ControlState& state) const {
  if (const auto* const group = qobject_cast<const QGroupBox*>(Widget())) {
    state.caption = FromMnemonicText(group->title());
  } else if (const auto* const label = qobject_cast<const QLabel*>(Widget())) {
    state.caption = NameFromQt(label->text());
  } else if (Buddy() != nullptr) {
    state.caption = FromMnemonicText(Buddy()->text());
  } else {
    state.caption = FromQt(Widget()->windowTitle());
  }
}

LabelView::LabelView(Control& control, QLabel* label, Windows& windows)
    : View(control, label, windows), label_(*label) {
  label_.setTextFormat(Qt::PlainText);
  if (control.Click) label_.setCursor(Qt::PointingHandCursor);
}

bool LabelView::Pressed(const QWidget& /*on*/, const QMouseEvent& /*event*/) {
  return static_cast<bool>(GetControl().Click);
}

bool LabelView::ClicksAt(const QWidget& /*on*/, QPoint /*at*/) const {
  return static_cast<bool>(GetControl().Click);
}

void LabelView::ShowKind() {
  if (const auto* const in_its_font = dynamic_cast<const FontLabel*>(&GetControl())) {
    label_.setFont(FontOnScreen(in_its_font->Font()));
  }
  label_.setText(ToQt(GetControl().Caption()));
  label_.setAccessibleName(Spoken(GetControl().Caption()));
}

void LabelView::ReadKind(ControlState& state) const { state.caption = NameFromQt(label_.text()); }

ButtonView::ButtonView(Control& control, QAbstractButton* button, Windows& windows)
    : View(control, button, windows), button_(*button) {
  // The model says which option of a panel is the one.
  button_.setAutoExclusive(false);
  connect(button, &QAbstractButton::clicked, this,
          [this] { Do([this](Hand& hand) { return hand.Click(GetControl()); }); });
}

void ButtonView::ShowKind() {
  const std::string& caption = GetControl().Caption();
  button_.setText(ToMnemonicText(caption));
  if (!caption.empty()) button_.setAccessibleName(Spoken(caption));
  if (const auto value = ValueOf(GetControl())) button_.setChecked(*value);
  if (auto* const picture = qobject_cast<PictureButton*>(&button_)) {
    picture->SetBordered(GetControl().Bordered());
    const Control* const beside = static_cast<const Picture&>(GetControl()).Beside();
    if (beside != nullptr) MoveBeside(*picture, *beside);
  }
}

void ButtonView::ReadKind(ControlState& state) const {
  state.caption = FromMnemonicText(button_.text());
  if (button_.isCheckable()) state.value = button_.isChecked();
}

MenuView::MenuView(Control& control, QAction* action, Windows& windows)
    : View(control, nullptr, windows), action_(*action) {
  connect(action, &QAction::triggered, this,
          [this] { Do([this](Hand& hand) { return hand.Click(GetControl()); }); });
  if (action->menu() == nullptr) return;
  // Its screen comes to the front, however it was dropped down.
  connect(action->menu(), &QMenu::aboutToShow, this,
          [this] { Do([this](Hand& hand) { return hand.Click(GetControl()); }); });
}

void MenuView::ShowKind() { action_.setText(ToMnemonicText(GetControl().Caption())); }

void MenuView::ShowCommon() {
  action_.setEnabled(GetControl().Enabled());
  action_.setVisible(GetControl().Visible());
}

void MenuView::ReadKind(ControlState& state) const {
  state.caption = FromMnemonicText(action_.text());
}

/// An entry is there when its menu is, and a menu when its window is.
void MenuView::ReadCommon(ControlState& state) const {
  state.visible = action_.isVisible();
  state.shown = state.visible;
  state.enabled = action_.isEnabled();
  for (QObject* holder : action_.associatedObjects()) {
    if (const auto* const menu = qobject_cast<QMenu*>(holder)) {
      state.shown = state.shown && menu->menuAction()->isVisible();
      state.enabled = state.enabled && menu->menuAction()->isEnabled();
    }
    if (const auto* const widget = qobject_cast<QWidget*>(holder)) {
      const QWidget* window = widget;
      while (window->parentWidget() != nullptr) window = window->parentWidget();
      state.shown = state.shown && window->isVisible();
      state.enabled = state.enabled && window->isEnabled();
    }
  }
}

void ProgressView::ShowKind() {
  bar_.setRange(model_.Min(), model_.Max());
  bar_.setValue(model_.Value());
}

void ProgressView::ReadKind(ControlState& state) const {
  state.progress = ProgressState{bar_.minimum(), bar_.maximum(), bar_.value()};
}

}  // namespace marlowbeck
