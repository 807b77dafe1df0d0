#pragma once

#include <QComboBox>
#include <QDateEdit>
#include <QLabel>
#include <QLineEdit>

#include "desktop/view.h"
#include "ui/controls.h"

namespace marlowbeck {

/// What has its caption in a label beside it, which is shown and live as it is itself.
class CaptionedView : public View {
 public:
  CaptionedView(Control& control, QWidget* widget, Windows& windows);

 protected:
  void ShowCommon() override;

 private:
  QLabel* buddy_;
};

class TextView : public CaptionedView {
 public:
  TextView(TextBox& control, QLineEdit* box, Windows& windows);
  void FocusCame() override { box_.selectAll(); }

 protected:
  void ShowKind() override;
  void ReadKind(ControlState& state) const override;

 private:
  TextBox& model_;
  QLineEdit& box_;
};

class ComboView : public CaptionedView {
 public:
  ComboView(ComboBox& control, QComboBox* box, Windows& windows);
  void FocusCame() override;

 protected:
  void ShowKind() override;
  void ReadKind(ControlState& state) const override;

 private:
  void ShowEditable();
  void ShowLines();

  ComboBox& model_;
  QComboBox& box_;
};

class DateView : public CaptionedView {
 public:
  DateView(DatePicker& control, QDateEdit* box, Windows& windows);
  void FinishTyping() override { box_.interpretText(); }

 protected:
  void ShowKind() override;
  void ReadKind(ControlState& state) const override;

 private:
  DatePicker& model_;
  QDateEdit& box_;
};

}  // namespace marlowbeck
