#include "desktop/screen_window.h"

#include <stdexcept>
#include <utility>

#include <QPushButton>
#include <QScreen>

#include "desktop/encoding.h"
#include "desktop/form_catalogue.h"
#include "desktop/panel_places.h"
#include "desktop/theme.h"

namespace marlowbeck {
namespace {

std::unique_ptr<QWidget> MakeForm(const std::string& screen) {
  const auto form = Forms().find(screen);
  if (form == Forms().end()) throw std::logic_error("there is no form for " + screen);
  return form->second();
}

}  // namespace

ScreenWindow::ScreenWindow(std::shared_ptr<Screen> screen, Windows& windows)
    : screen_(std::move(screen)), window_(MakeForm(screen_->Name())) {
  window_->setObjectName(QString::fromStdString(screen_->Name()));
  ApplyRoles(*window_);
  MakeViews(windows);
  BringUpToDate();
}

void ScreenWindow::MakeViews(Windows& windows) {
  // Widgets that are no control's take no focus either, and all tell of the pointer.
  for (QWidget* widget : window_->findChildren<QWidget*>()) {
    widget->setFocusPolicy(Qt::NoFocus);
    widget->setMouseTracking(true);
  }
  window_->setMouseTracking(true);
  for (Control* control : screen_->Controls()) {
    views_.push_back(MakeView(*control, *window_, windows));
    if (QWidget* const widget = views_.back()->Widget()) by_widget_[widget] = views_.back().get();
  }
  SetTabOrder();
}

/// The order of declaration, for whoever reads the window by other means than its keys.
void ScreenWindow::SetTabOrder() {
  QWidget* before = nullptr;
  for (const auto& view : views_) {
    if (!view->GetControl().TakesFocus() || view->Widget() == nullptr) continue;
    if (before != nullptr) QWidget::setTabOrder(before, view->Widget());
    before = view->Widget();
  }
}

View* ScreenWindow::ViewAt(const QObject* widget) const {
  for (; widget != nullptr && widget != window_.get(); widget = widget->parent()) {
    const auto place = by_widget_.find(widget);
    if (place != by_widget_.end()) return place->second;
  }
  return nullptr;
}

View* ScreenWindow::ViewOf(const Control& control) const {
  for (const auto& view : views_) {
    if (&view->GetControl() == &control) return view.get();
  }
  return nullptr;
}

void ScreenWindow::BringUpToDate() {
  const QString title = ToQt(screen_->Title());
  if (window_->windowTitle() != title) window_->setWindowTitle(title);
  window_->setEnabled(screen_->Enabled());
  {
    const OneStep step(*window_);
    for (const auto& view : views_) view->BringUpToDate();
  }
  MarkDefault();
}

/// The command that Enter goes to looks like it: one that has the focus takes it for itself.
void ScreenWindow::MarkDefault() {
  const Control* const focus = screen_->Focus();
  const bool is_command = focus != nullptr && focus->GetKind() == Kind::Command;
  bool found = false;
  for (const Control* control : screen_->Defaults) {
    const View* const view = ViewOf(*control);
    auto* const button = view == nullptr ? nullptr : qobject_cast<QPushButton*>(view->Widget());
    if (button == nullptr) continue;
    const bool is_it = is_command ? control == focus : !found && control->Live();
    if (button->isDefault() != is_it) button->setDefault(is_it);
    found = found || is_it;
  }
}

void ScreenWindow::Show() {
  if (!std::exchange(placed_, true)) Centre();
  window_->show();
}

void ScreenWindow::Centre() {
  const QRect room = window_->screen()->availableGeometry();
  QRect frame(QPoint(0, 0), window_->size().expandedTo(window_->minimumSizeHint()));
  frame.setSize(frame.size().boundedTo(room.size()));
  frame.moveCenter(room.center());
  window_->setGeometry(frame);
}

void ScreenWindow::PlaceFocus(bool anew) {
  const Control* const focus = screen_->Focus();
  View* const view = focus == nullptr ? nullptr : ViewOf(*focus);
  if (view == nullptr) {
    if (QWidget* const left = window_->focusWidget()) left->clearFocus();
    return;
  }
  QWidget* const target = view->Widget();
  const bool had_it = window_->focusWidget() == target;
  // As by the keyboard, so that its mark is seen, also in a window that is not active yet.
  if (!had_it) target->setFocus(Qt::TabFocusReason);
  window_->setAttribute(Qt::WA_KeyboardFocusChange);
  if (!had_it || anew) view->FocusCame();
}

}  // namespace marlowbeck
