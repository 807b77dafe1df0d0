#include "desktop/printer_setup.h"

#include <QDialogButtonBox>
#include <QFormLayout>
#include <QHBoxLayout>
#include <QPrinterInfo>
#include <QVBoxLayout>

namespace marlowbeck {

PrinterSetupDialog::PrinterSetupDialog(const PrintTarget& target, Orientation orientation,
                                       QWidget* parent)
    : QDialog(parent),
      targets_(new QComboBox(this)),
      portrait_(new QRadioButton("&Portrait", this)),
      landscape_(new QRadioButton("&Landscape", this)) {
  setWindowTitle("Printer Set-up");
  OfferTargets(target);
  (orientation == Orientation::Portrait ? portrait_ : landscape_)->setChecked(true);
  Arrange();
}

void PrinterSetupDialog::OfferTargets(const PrintTarget& present) {
  const auto offer = [this](const QString& text, PrintTarget::Kind kind) {
    targets_->addItem(text, static_cast<int>(kind));
  };
  for (const QString& name : QPrinterInfo::availablePrinterNames()) {
    offer(name, PrintTarget::Kind::Printer);
  }
  offer("PDF file", PrintTarget::Kind::Pdf);
  offer("Preview on the screen", PrintTarget::Kind::Preview);
  const int place = present.kind == PrintTarget::Kind::Printer
                        ? targets_->findText(present.printer)
                        : targets_->findData(static_cast<int>(present.kind));
  targets_->setCurrentIndex(std::max(place, 0));
}

void PrinterSetupDialog::Arrange() {
  auto* const ways = new QHBoxLayout;
  ways->addWidget(portrait_);
  ways->addWidget(landscape_);
  ways->addStretch();
  auto* const form = new QFormLayout;
  form->setSpacing(8);
  form->addRow("Print &to:", targets_);
  form->addRow("Paper:", ways);
  auto* const buttons = new QDialogButtonBox(QDialogButtonBox::Ok | QDialogButtonBox::Cancel, this);
  connect(buttons, &QDialogButtonBox::accepted, this, &QDialog::accept);
  connect(buttons, &QDialogButtonBox::rejected, this, &QDialog::reject);
  auto* const column = new QVBoxLayout(this);
  column->setContentsMargins(24, 24, 24, 24);
  column->setSpacing(16);
  column->addLayout(form);
  column->addWidget(buttons);
}

PrintTarget PrinterSetupDialog::ChosenTarget() const {
  const auto kind = static_cast<PrintTarget::Kind>(targets_->currentData().toInt());
  return {kind, kind == PrintTarget::Kind::Printer ? targets_->currentText() : QString()};
}

Orientation PrinterSetupDialog::ChosenOrientation() const {
  return portrait_->isChecked() ? Orientation::Portrait : Orientation::Landscape;
}

}  // namespace marlowbeck
