#include "desktop/view.h"

#include <QGroupBox>

#include "desktop/encoding.h"
#include "desktop/theme.h"
#include "desktop/windows.h"

namespace marlowbeck {

View::View(Control& control, QWidget* widget, Windows& windows)
    : control_(control), widget_(widget), windows_(windows) {
  if (widget_ == nullptr) return;
  // The focus belongs to the model: the pointer does not move it.
  widget_->setFocusPolicy(control.TakesFocus() ? Qt::TabFocus : Qt::NoFocus);
  if (widget_->accessibleName().isEmpty()) widget_->setAccessibleName(Spoken(control.Caption()));
}

void View::BringUpToDate() {
  if (!stale_ && shown_revision_ == control_.Revision()) return;
  shown_revision_ = control_.Revision();
  stale_ = false;
  const QSignalBlocker silence(widget_);
  ShowKind();
  ShowCommon();
}

void View::ShowCommon() {
  ShowMeaning();
  widget_->setEnabled(control_.Enabled());
  widget_->setVisible(control_.Visible());
}

void View::ShowMeaning() {
  const Meaning meaning = control_.GetMeaning();
  if (widget_->property(kMeaning).toInt() == static_cast<int>(meaning)) return;
  widget_->setProperty(kMeaning, static_cast<int>(meaning));
  // A panel's colour is that of its title alone, which the style paints: what lies in it keeps its
  // own.
  if (qobject_cast<QGroupBox*>(widget_) != nullptr) return widget_->update();
  QPalette palette = widget_->palette();
  for (const auto role : {QPalette::WindowText, QPalette::Text, QPalette::ButtonText}) {
    for (const auto group : {QPalette::Active, QPalette::Inactive}) {
      palette.setColor(group, role, ColorOf(meaning));
    }
  }
  widget_->setPalette(palette);
}

ControlState View::Read() const {
  ControlState state;
  state.name = control_.Name();
  state.kind = control_.GetKind();
  ReadCommon(state);
  ReadKind(state);
  return state;
}

void View::ReadCommon(ControlState& state) const {
  state.visible = !widget_->isHidden();
  state.shown = widget_->isVisible();
  state.enabled = widget_->isEnabled();
  state.color = static_cast<Meaning>(widget_->property(kMeaning).toInt());
}

bool View::Pressed(const QWidget& /*on*/, const QMouseEvent& /*event*/) { return false; }
void View::PressedAgain(const QWidget& /*on*/, const QMouseEvent& /*event*/) {
  Do([this](Hand& hand) { return hand.SecondClick(control_); });
}
bool View::ClicksAt(const QWidget& /*on*/, QPoint /*at*/) const { return false; }
bool View::Typed(const QKeyEvent& /*event*/) { return false; }

Outcome View::Do(const Act& act) { return windows_.Do(this, act); }

QString ObjectNameOf(const Control& control) {
  QString name = QString::fromStdString(control.Name());
  return name.replace('(', '_').remove(')');
}

}  // namespace marlowbeck
