#pragma once

#include <exception>
#include <functional>
#include <memory>
#include <optional>
#include <utility>
#include <vector>

#include "desktop/screen_window.h"
#include "ui/hand.h"

namespace marlowbeck {

/// All windows of a program: one for each loaded screen, shown, raised and let go as the models
/// say. Everything that a person does goes through Do, and is one event.
class Windows {
 public:
  /// `ended` is called, once, when the program has ended.
  Windows(Screens& screens, Hand& hand, std::function<void()> ended);
  Windows(const Windows&) = delete;
  Windows& operator=(const Windows&) = delete;
  ~Windows();

  using Act = std::function<Outcome(Hand&)>;
  /// Lets the hand act, then brings all that is seen up to date. `acted` is the view that the
  /// person worked, null for none. Nothing happens while another act is still going on.
  Outcome Do(View* acted, const Act& act);
  /// The same for a key: a box that keeps the focus is entered anew.
  Outcome DoByKey(const Act& act);

  /// Something to be done once, just before the first window is shown.
  void CallBeforeShowing(std::function<void()> call) { before_showing_ = std::move(call); }

  /// Brings all windows up to date.
  void Refresh();
  /// The waiting pointer, until the act that is going on is over.
  void ShowBusy();

  [[nodiscard]] ScreenWindow* WindowOf(const QObject* widget) const;
  [[nodiscard]] ScreenWindow* WindowOf(const Screen& screen) const;
  /// The window in front; null for none.
  [[nodiscard]] ScreenWindow* Front() const;
  [[nodiscard]] Screens& GetScreens() { return screens_; }

  /// What breaks an act off is kept for TakeOutcome. Without this it ends the program, since it can
  /// only be a fault in it.
  void KeepFailures() { keeps_failures_ = true; }
  /// How the acts since the last asking went; nothing when there was none. Rethrows what broke one
  /// off.
  std::optional<Outcome> TakeOutcome();

 private:
  Outcome Guarded(const Act& act);
  void AddWindows();
  void DropWindows();
  void ShowAndHide();
  void BringFrontUp();

  Screens& screens_;
  Hand& hand_;
  std::function<void()> ended_;
  std::function<void()> before_showing_;
  std::vector<ScreenWindow*> windows_;
  const Screen* front_ = nullptr;
  bool acting_ = false;
  bool busy_ = false;
  std::optional<Outcome> outcome_;
  bool keeps_failures_ = false;
  std::exception_ptr failure_;
};

}  // namespace marlowbeck
