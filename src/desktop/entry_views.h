#pragma once

#include <QComboBox>
#include <QDateEdit>
#include <QLineEdit>

#include "desktop/captioned_view.h"
#include "ui/controls.h"

namespace marlowbeck {

class TextView : public CaptionedView {
 public:
  TextView(TextBox& control, QLineEdit* box, Windows& windows);
  [[nodiscard]] bool ClicksAt(const QWidget& on, QPoint at) const override;
  void FocusCame() override { box_.selectAll(); }

 protected:
  void ShowKind() override;
  void ReadKind(ControlState& state) const override;

 private:
  void ShowLocked();

  TextBox& model_;
  QLineEdit& box_;
};

class ComboView : public CaptionedView {
 public:
  ComboView(ComboBox& control, QComboBox* box, Windows& windows);
  void FocusCame() override;
  bool Pressed(const QWidget& on, const QMouseEvent& event) override;
  bool Typed(const QKeyEvent& event) override;

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
  [[nodiscard]] bool ClicksAt(const QWidget& on, QPoint at) const override;
  void FinishTyping() override { box_.interpretText(); }

 protected:
  void ShowKind() override;
  void ReadKind(ControlState& state) const override;

 private:
  DatePicker& model_;
  QDateEdit& box_;
};

}  // namespace marlowbeck
