#include "desktop/windows.h"

#include <algorithm>
#include <utility>

#include <QApplication>

namespace marlowbeck {

Windows::Windows(Screens& screens, Hand& hand, std::function<void()> ended)
    : screens_(screens), hand_(hand), ended_(std::move(ended)) {}

Windows::~Windows() {
  for (ScreenWindow* window : windows_) delete window;
}

Outcome Windows::Do(View* acted, const Act& act) {
  if (acting_) return {};
  acting_ = true;
  Outcome outcome = Guarded(act);
  acting_ = false;
  if (std::exchange(busy_, false)) QApplication::restoreOverrideCursor();
  if (acted != nullptr) acted->MakeStale();
  // A click that was lost stays lost, whatever the person does on.
  if (!outcome_ || !outcome_->lost) outcome_ = outcome;
  Refresh();
  // A box that would not be left is entered anew.
  if (ScreenWindow* const front = Front()) front->PlaceFocus(outcome.lost);
  if (screens_.Ended() && ended_) std::exchange(ended_, nullptr)();
  return outcome;
}

Outcome Windows::DoByKey(const Act& act) {
  const Control* const before = screens_.Focus();
  Outcome outcome = Do(nullptr, act);
  ScreenWindow* const front = Front();
  if (front != nullptr && screens_.Focus() == before) front->PlaceFocus(true);
  return outcome;
}

void Windows::ShowBusy() {
  if (acting_ && !std::exchange(busy_, true)) QApplication::setOverrideCursor(Qt::WaitCursor);
}

/// The toolkit between here and who set the event off is no place for exceptions to pass through.
Outcome Windows::Guarded(const Act& act) {
  try {
    return act(hand_);
  } catch (...) {
    if (!keeps_failures_) throw;
    failure_ = std::current_exception();
    screens_.Settle();
    return {"the event was broken off", true};
  }
}

std::optional<Outcome> Windows::TakeOutcome() {
  if (failure_) std::rethrow_exception(std::exchange(failure_, nullptr));
  return std::exchange(outcome_, std::nullopt);
}

void Windows::Refresh() {
  AddWindows();
  for (ScreenWindow* window : windows_) window->BringUpToDate();
  ShowAndHide();
  DropWindows();
}

/// A screen without controls is never seen as a window.
void Windows::AddWindows() {
  for (const auto& screen : screens_.Loaded()) {
    if (screen->Controls().empty() || WindowOf(*screen) != nullptr) continue;
    windows_.push_back(new ScreenWindow(screen, *this));
  }
}

/// Windows of screens that have left go once nothing of theirs is at work any more.
void Windows::DropWindows() {
  const auto& loaded = screens_.Loaded();
  const auto has_left = [&](const ScreenWindow* window) {
    return std::none_of(loaded.begin(), loaded.end(),
                        [&](const auto& screen) { return screen.get() == &window->GetScreen(); });
  };
  for (ScreenWindow* window : windows_) {
    if (has_left(window)) window->deleteLater();
  }
  std::erase_if(windows_, has_left);
}

/// First what comes, then what goes, so that the desktop behind is not seen in between.
void Windows::ShowAndHide() {
  for (ScreenWindow* window : windows_) {
    if (!window->GetScreen().Visible() || window->Window().isVisible()) continue;
    if (const auto call = std::exchange(before_showing_, nullptr)) call();
    window->Show();
  }
  BringFrontUp();
  for (ScreenWindow* window : windows_) {
    if (!window->GetScreen().Visible() && window->Window().isVisible()) window->Hide();
  }
}

void Windows::BringFrontUp() {
  ScreenWindow* const front = Front();
  if (front == nullptr || &front->GetScreen() == front_) return;
  front_ = &front->GetScreen();
  front->Window().raise();
  front->Window().activateWindow();
  front->PlaceFocus(false);
}

ScreenWindow* Windows::WindowOf(const QObject* widget) const {
  const auto* const inner = qobject_cast<const QWidget*>(widget);
  if (inner == nullptr) return nullptr;
  const QWidget* const outer = inner->window();
  const auto place = std::find_if(windows_.begin(), windows_.end(),
                                  [&](const auto* window) { return &window->Window() == outer; });
  return place == windows_.end() ? nullptr : *place;
}

ScreenWindow* Windows::WindowOf(const Screen& screen) const {
  const auto place = std::find_if(windows_.begin(), windows_.end(), [&](const auto* window) {
    return &window->GetScreen() == &screen;
  });
  return place == windows_.end() ? nullptr : *place;
}

ScreenWindow* Windows::Front() const {
  const Screen* const front = screens_.Front();
  return front == nullptr ? nullptr : WindowOf(*front);
}

}  // namespace marlowbeck
