#pragma once

#include <cstdint>
#include <functional>
#include <string>
#include <string_view>
#include <vector>

namespace marlowbeck {

class Control;
class Screen;

using Handler = std::function<void()>;

enum class Kind {
  Panel,
  Label,
  Command,
  Picture,
  Menu,
  Text,
  Check,
  Option,
  List,
  Combo,
  Grid,
  Date,
  Progress,
  Drives,
  Folders,
  Files,
};

/// "panel", "label" and so on.
[[nodiscard]] std::string_view WordOf(Kind kind);

/// Colours that are part of what a control says.
enum class Meaning { None, Red, Green, Black };

/// What a control lies in: a screen, or a control of one.
class Owner {
 public:
  Owner(Screen& screen) : screen_(&screen) {}  // NOLINT(google-explicit-constructor)
  Owner(Control& control);                     // NOLINT(google-explicit-constructor)

  [[nodiscard]] Screen& InScreen() const { return *screen_; }
  [[nodiscard]] Control* InControl() const { return control_; }

 private:
  Screen* screen_;
  Control* control_ = nullptr;
};

/// One named control of a screen, with no more of a toolkit than its state and its events. It is
/// *shown* when it and all that holds it are visible, *live* when all are enabled too.
///
/// The order in which a screen's controls are declared is the tab order.
class Control {
 public:
  Control(const Control&) = delete;
  Control& operator=(const Control&) = delete;
  virtual ~Control() = default;

  [[nodiscard]] const std::string& Name() const { return name_; }
  [[nodiscard]] Kind GetKind() const { return kind_; }
  [[nodiscard]] Screen& InScreen() const { return screen_; }
  [[nodiscard]] Control* InControl() const { return owner_; }

  [[nodiscard]] bool Visible() const { return visible_; }
  void SetVisible(bool visible);
  void Show() { SetVisible(true); }
  void Hide() { SetVisible(false); }

  [[nodiscard]] bool Enabled() const { return enabled_; }
  void SetEnabled(bool enabled);
  void Enable() { SetEnabled(true); }
  void Disable() { SetEnabled(false); }

  /// It and all that holds it are visible, the screen included.
  [[nodiscard]] bool Shown() const;
  /// It and all that holds it are enabled, the screen included.
  [[nodiscard]] bool EnabledThroughout() const;
  /// A person can act on it: shown and enabled throughout.
  [[nodiscard]] bool Live() const { return Shown() && EnabledThroughout(); }

  [[nodiscard]] const std::string& Caption() const { return caption_; }
  void SetCaption(std::string_view caption);

  [[nodiscard]] Meaning GetMeaning() const { return meaning_; }
  void SetMeaning(Meaning meaning);

  /// Marked as the one that the pointer is over.
  [[nodiscard]] bool Bordered() const { return bordered_; }
  void SetBordered(bool bordered);

  [[nodiscard]] virtual bool TakesFocus() const { return false; }
  /// Reached by Tab. Left off for what only the pointer should reach.
  [[nodiscard]] bool TabStop() const { return tab_stop_; }
  void SetTabStop(bool tab_stop) { tab_stop_ = tab_stop; }
  /// Where Tab stops as things stand: of options, only at the selected one.
  [[nodiscard]] virtual bool ReachedByTab() const { return tab_stop_; }

  /// Puts the focus here: LostFocus of the control left, then GotFocus. Nothing happens where the
  /// focus cannot go.
  void SetFocus();

  /// Moves with every change of the state.
  [[nodiscard]] std::uint64_t Revision() const { return revision_; }

  Handler Click;
  Handler DoubleClick;
  Handler Change;
  Handler GotFocus;
  Handler LostFocus;
  Handler MouseMove;
  Handler MouseUp;  ///< the button has come up over a list, after what the click did
  Handler KeyUp;    ///< a key has come up in a list
  Handler Entered;  ///< Enter, in the place of a Tab or of a pick

  /// Runs a handler of this control, if there is one, through the dispatcher.
  void Fire(const Handler& handler) const;

 protected:
  Control(const Owner& owner, Kind kind, std::string_view name, std::string_view caption);

  void Touch() { ++revision_; }
  /// Assigns and, when that changes something, touches. Answers whether it did.
  template <typename T, typename Value>
  bool Assign(T& field, const Value& value) {
    if (field == value) return false;
    field = value;
    Touch();
    return true;
  }

 private:
  Screen& screen_;
  Control* owner_;
  Kind kind_;
  std::string name_;
  std::string caption_;
  bool visible_ = true;
  bool enabled_ = true;
  bool bordered_ = false;
  bool tab_stop_ = true;
  Meaning meaning_ = Meaning::None;
  std::uint64_t revision_ = 1;
};

}  // namespace marlowbeck
