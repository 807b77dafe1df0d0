#pragma once

#include <QComboBox>
#include <QDialog>
#include <QRadioButton>

#include "desktop/page_printer.h"

namespace marlowbeck {

/// Asks where documents go, to a printer, a PDF file or a preview, and which way round the paper
/// is.
class PrinterSetupDialog : public QDialog {
 public:
  PrinterSetupDialog(const PrintTarget& target, Orientation orientation, QWidget* parent);

  [[nodiscard]] PrintTarget ChosenTarget() const;
  [[nodiscard]] Orientation ChosenOrientation() const;

 private:
  void OfferTargets(const PrintTarget& present);
  void Arrange();

  QComboBox* targets_;
  QRadioButton* portrait_;
  QRadioButton* landscape_;
};

}  // namespace marlowbeck
