#pragma once

#include <QLabel>

#include "desktop/view.h"

namespace marlowbeck {

/// What may have its caption in a label of the form, `buddy_` and the control's name, which is
/// shown and live as it is itself.
class CaptionedView : public View {
 public:
  CaptionedView(Control& control, QWidget* widget, Windows& windows);

 protected:
  void ShowCommon() override;
  /// Null where the form has none.
  [[nodiscard]] QLabel* Buddy() const { return buddy_; }

 private:
  QLabel* buddy_;
};

}  // namespace marlowbeck
