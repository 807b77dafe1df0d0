#pragma once

#include <map>
#include <memory>
#include <vector>

#include <QObject>
#include <QWidget>

#include "desktop/view.h"
#include "ui/screen.h"

namespace marlowbeck {

/// The window of a screen: its form, with a view for every control. It holds the screen for as long
/// as it stands itself.
class ScreenWindow : public QObject {
 public:
  /// Throws std::logic_error when there is no form, or one that lacks a control's widget.
  ScreenWindow(std::shared_ptr<Screen> screen, Windows& windows);

  [[nodiscard]] Screen& GetScreen() const { return *screen_; }
  [[nodiscard]] QWidget& Window() const { return *window_; }
  [[nodiscard]] const std::vector<std::unique_ptr<View>>& Views() const { return views_; }

  /// The view that a widget of the window is, or lies in; null on the bare window.
  [[nodiscard]] View* ViewAt(const QObject* widget) const;
  [[nodiscard]] View* ViewOf(const Control& control) const;

  /// Brings title, contents and whether it is enabled up to date; shows or hides nothing.
  void BringUpToDate();
  /// Lets it be seen; in the middle of the display the first time.
  void Show();
  void Hide() { window_->hide(); }
  /// Moves the keyboard's focus where the model has it. `anew`: also what has it already is entered
  /// again.
  void PlaceFocus(bool anew);

 private:
  void MakeViews(Windows& windows);
  void SetTabOrder();
  void Centre();
  void MarkDefault();

  std::shared_ptr<Screen> screen_;
  std::unique_ptr<QWidget> window_;
  std::vector<std::unique_ptr<View>> views_;
  std::map<const QObject*, View*> by_widget_;
  bool placed_ = false;
};

}  // namespace marlowbeck
