#include "ui/control.h"

#include <array>

#include "ui/screen.h"
#include "ui/screens.h"

namespace marlowbeck {
namespace {

constexpr std::array<std::string_view, 16> kKindWords = {
    "panel", "label", "command", "picture", "menu",     "text",   "check",   "option",
    "list",  "combo", "grid",    "date",    "progress", "drives", "folders", "files"};

}  // namespace

std::string_view WordOf(Kind kind) { return kKindWords[static_cast<std::size_t>(kind)]; }

Owner::Owner(Control& control) : screen_(&control.InScreen()), control_(&control) {}

Control::Control(const Owner& owner, Kind kind, std::string_view name, std::string_view caption)
    : screen_(owner.InScreen()),
      owner_(owner.InControl()),
      kind_(kind),
      name_(name),
      caption_(caption) {
  screen_.Add(*this);
}

void Control::SetVisible(bool visible) { Assign(visible_, visible); }
void Control::SetEnabled(bool enabled) { Assign(enabled_, enabled); }
void Control::SetCaption(std::string_view caption) { Assign(caption_, caption); }
void Control::SetMeaning(Meaning meaning) { Assign(meaning_, meaning); }
void Control::SetBordered(bool bordered) { Assign(bordered_, bordered); }

bool Control::Shown() const {
  return visible_ && (owner_ != nullptr ? owner_->Shown() : screen_.Visible());
}

bool Control::EnabledThroughout() const {
  return enabled_ && (owner_ != nullptr ? owner_->EnabledThroughout() : screen_.Enabled());
}

void Control::SetFocus() { screen_.MoveFocusTo(*this); }

void Control::Fire(const Handler& handler) const {
  if (handler) screen_.InScreens().GetDispatcher().Nested(handler);
}

}  // namespace marlowbeck
