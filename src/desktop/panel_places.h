#pragma once

#include <QWidget>

namespace marlowbeck {

/// What goes and what comes on a window change places in one step: a window that had to hold both
/// for a moment would stay as large as that. Lasts as long as the window is brought up to date.
class OneStep {
 public:
  explicit OneStep(QWidget& window);
  /// Panels with the property "aside" stand in the middle of their grid, over what is out of reach
  /// there. Where anything there can be worked, they step aside into the column that is named.
  ~OneStep();
  OneStep(const OneStep&) = delete;
  OneStep& operator=(const OneStep&) = delete;

 private:
  QWidget& window_;
  QLayout* layout_;
};

}  // namespace marlowbeck
