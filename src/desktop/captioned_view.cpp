#include "desktop/captioned_view.h"

#include "desktop/encoding.h"

namespace marlowbeck {

CaptionedView::CaptionedView(Control& control, QWidget* widget, Windows& windows)
    : View(control, widget, windows),
      buddy_(widget->window()->findChild<QLabel*>("buddy_" + ObjectNameOf(control))) {
  if (buddy_ != nullptr) buddy_->setBuddy(widget);
}

void CaptionedView::ShowCommon() {
  View::ShowCommon();
  const std::string& caption = GetControl().Caption();
  if (!caption.empty()) Widget()->setAccessibleName(Spoken(caption));
  if (buddy_ == nullptr) return;
  buddy_->setText(ToMnemonicText(GetControl().Caption()));
  buddy_->setEnabled(GetControl().Enabled());
  buddy_->setVisible(GetControl().Visible());
}

}  // namespace marlowbeck
