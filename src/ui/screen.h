#pragma once

#include <string>
#include <string_view>
#include <vector>

#include "ui/control.h"

namespace marlowbeck {

class Screens;

/// A screen: named controls and the handlers of their events. Each kind of screen is one struct
/// whose members are its controls; it is loaded, shown, hidden and unloaded by Screens.
class Screen {
 public:
  Screen(Screens& screens, std::string_view name, std::string_view title);
  Screen(const Screen&) = delete;
  Screen& operator=(const Screen&) = delete;
  virtual ~Screen() = default;

  [[nodiscard]] const std::string& Name() const { return name_; }
  [[nodiscard]] Screens& InScreens() const { return screens_; }

  [[nodiscard]] const std::string& Title() const { return title_; }
  void SetTitle(std::string_view title);
  [[nodiscard]] bool Visible() const { return visible_; }
  [[nodiscard]] bool Enabled() const { return enabled_; }
  void SetEnabled(bool enabled);

  /// All controls in the order of declaration, which is the tab order.
  [[nodiscard]] const std::vector<Control*>& Controls() const { return controls_; }
  /// By name without regard to case; null when there is none.
  [[nodiscard]] Control* Find(std::string_view name) const;

  /// The control that has the focus while this screen is in front; null for none.
  [[nodiscard]] Control* Focus() const;
  void MoveFocusTo(Control& control);
  /// Puts the focus of a screen that has none on a live tab stop, without an event: on the one that
  /// follows the control that had it, or else on the first.
  void EnsureFocus();
  /// The live tab stop that follows, or comes before, the focus; null when there is none.
  [[nodiscard]] Control* NextStop(bool backward) const;

  [[nodiscard]] std::uint64_t Revision() const { return revision_; }

  // What happens to the screen. Each runs as an event of its own.
  virtual void Load() {}      ///< once, before it is first shown
  virtual void Activate() {}  ///< shown, or in front again since another was hidden or unloaded
  virtual void Unload() {}    ///< it has left; by now it is out of sight

  /// Tells the opener that something of its concern has been saved.
  void TellSaved();

  // What a person does to the screen as a whole.
  virtual void CloseButton();  ///< by default unloads the screen
  virtual void Escape();       ///< by default clicks the first live of Cancels
  virtual void HelpKey();      ///< by default clicks the first live of Helps
  virtual void MouseMove() {}  ///< the pointer moves over the bare screen

  /// Commands for Enter where no entry box has it, for Esc and for F1: the first live one counts.
  std::vector<Control*> Defaults;
  std::vector<Control*> Cancels;
  std::vector<Control*> Helps;

  // What a screen has to tell the one that opened it. Each runs as an event of its own, so that
  // what the opener makes of it undoes nothing here.
  Handler Saved;   ///< by TellSaved
  Handler Closed;  ///< it has left

 private:
  friend class Control;
  friend class Screens;

  void Add(Control& control) { controls_.push_back(&control); }
  void SetVisible(bool visible);

  Screens& screens_;
  std::string name_;
  std::string title_;
  bool visible_ = false;
  bool enabled_ = true;
  std::vector<Control*> controls_;
  Control* focus_ = nullptr;
  Control* entered_ = nullptr;  ///< the control that has had its GotFocus
  std::uint64_t revision_ = 1;
};

/// Clicks the first live command of a list; false when there is none.
bool ClickFirstLive(const std::vector<Control*>& commands);

}  // namespace marlowbeck
