#pragma once

#include <functional>
#include <map>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

#include "ui/dispatcher.h"
#include "ui/screen.h"

namespace marlowbeck {

/// The registry of screens and those that are loaded, front last. Screens open one another by
/// name; a name that nothing is registered under cannot be opened, and asking to is harmless.
class Screens {
 public:
  using Factory = std::function<std::unique_ptr<Screen>(Screens&)>;

  explicit Screens(std::function<void(int number)> report) : dispatcher_(std::move(report)) {}

  void Register(std::string_view name, Factory factory);
  [[nodiscard]] bool Knows(std::string_view name) const;
  /// Every name that there is a screen for, upper-cased.
  [[nodiscard]] std::vector<std::string> Names() const;
  /// A screen as it is before it is loaded, and apart from those that are; null for an unknown one.
  [[nodiscard]] std::unique_ptr<Screen> Make(std::string_view name);

  [[nodiscard]] Dispatcher& GetDispatcher() { return dispatcher_; }

  /// The screen of that name, loaded now if it was not; null for an unknown one.
  Screen* Load(std::string_view name);
  /// Loads a screen if need be, brings it to the front and activates it.
  Screen* Show(std::string_view name);
  void Hide(Screen& screen);
  /// Hides the screen, runs its Unload and its Closed, and lets go of it once the event is over.
  void Unload(Screen& screen);
  /// Only lets a loaded screen be seen, as a box of its own kind: nothing is activated, also not
  /// when it goes again.
  Screen* ShowQuietly(std::string_view name);
  void HideQuietly(Screen& screen);

  [[nodiscard]] Screen* Find(std::string_view name) const;
  /// Keeps a loaded screen in being, also when it is unloaded in the meantime.
  [[nodiscard]] std::shared_ptr<Screen> Hold(const Screen& screen) const;
  /// The topmost visible screen; null for none.
  [[nodiscard]] Screen* Front() const;
  void BringToFront(Screen& screen);
  /// The control that has the focus; null for none.
  [[nodiscard]] Control* Focus() const;
  [[nodiscard]] const std::vector<std::shared_ptr<Screen>>& Loaded() const { return loaded_; }

  /// The program ends: nothing more is done.
  void End() { ended_ = true; }
  [[nodiscard]] bool Ended() const { return ended_; }

  /// After each event: screens that have left are let go, and the front one has a focus.
  void Settle();

 private:
  void ActivateFrontUnless(const Screen* before);
  void Activate(Screen& screen);

  Dispatcher dispatcher_;
  std::map<std::string, Factory, std::less<>> factories_;
  std::vector<std::shared_ptr<Screen>> loaded_;
  std::vector<std::shared_ptr<Screen>> leaving_;
  bool ended_ = false;
};

}  // namespace marlowbeck
