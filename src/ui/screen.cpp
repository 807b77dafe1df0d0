#include "ui/screen.h"

#include <algorithm>
#include <utility>

#include "data/text.h"
#include "ui/screens.h"

namespace marlowbeck {

Screen::Screen(Screens& screens, std::string_view name, std::string_view title)
    : screens_(screens), name_(name), title_(title) {}

void Screen::SetTitle(std::string_view title) {
  title_ = title;
  ++revision_;
}

void Screen::SetEnabled(bool enabled) {
  enabled_ = enabled;
  ++revision_;
}

void Screen::SetVisible(bool visible) {
  visible_ = visible;
  ++revision_;
}

Control* Screen::Find(std::string_view name) const {
  const auto place = std::find_if(controls_.begin(), controls_.end(), [&](const Control* control) {
    return EqualsIgnoringCase(control->Name(), name);
  });
  return place == controls_.end() ? nullptr : *place;
}

Control* Screen::Focus() const { return focus_ != nullptr && focus_->Live() ? focus_ : nullptr; }

void Screen::MoveFocusTo(Control& control) {
  if (!control.TakesFocus() || !control.Visible() || !control.Enabled()) return;
  if (visible_ && !control.Live()) return;
  if (focus_ == &control && (entered_ == &control || !visible_)) return;
  focus_ = &control;
  ++revision_;
  if (!visible_) return;
  Control* const left = std::exchange(entered_, nullptr);
  if (left != nullptr && left != &control) left->Fire(left->LostFocus);
  // The control left may have called the focus back.
  if (focus_ != &control || entered_ == &control) return;
  entered_ = &control;
  control.Fire(control.GotFocus);
}

void Screen::EnsureFocus() {
  Control* const wanted = Focus() != nullptr ? focus_ : NextStop(false);
  if (std::exchange(focus_, wanted) != wanted) ++revision_;
  entered_ = focus_;
}

Control* Screen::NextStop(bool backward) const {
  const auto count = controls_.size();
  const auto present = std::find(controls_.begin(), controls_.end(), focus_);
  const std::size_t start = present == controls_.end()
                                ? (backward ? 0 : count - 1)
                                : static_cast<std::size_t>(present - controls_.begin());
  for (std::size_t step = 1; step <= count; ++step) {
    Control* const control = controls_[(start + (backward ? count - step : step)) % count];
    if (control->TakesFocus() && control->ReachedByTab() && control->Live()) return control;
  }
  return nullptr;
}

void Screen::TellSaved() {
  if (Saved) screens_.GetDispatcher().Run(Saved);
}

void Screen::CloseButton() { screens_.Unload(*this); }
void Screen::Escape() { ClickFirstLive(Cancels); }
void Screen::HelpKey() { ClickFirstLive(Helps); }

bool ClickFirstLive(const std::vector<Control*>& commands) {
  const auto place = std::find_if(commands.begin(), commands.end(),
                                  [](const Control* command) { return command->Live(); });
  if (place == commands.end()) return false;
  (*place)->Fire((*place)->Click);
  return true;
}

}  // namespace marlowbeck
