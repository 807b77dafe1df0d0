#include <algorithm>

#include "data/integer.h"
#include "data/numbers.h"
#include "data/text.h"
#include "season/frmPegRatio.h"
#include "season/print_ratios.h"
#include "session/messages.h"

namespace marlowbeck {

void frmPegRatio::WirePrinting() {
  cmdHiPrint.Click = [this] { cmdHiPrint_Click(); };
  optHI0.Click = [this] { optHI0_Click(); };
  optHI1.Click = [this] { optHI1_Click(); };
  txtHI.Change = [this] { txtHI_Change(); };
  cmdPrintRatios.Click = [this] { cmdPrintRatios_Click(); };
  cmdPrinterSetup.Click = [this] { print_panel_.SetUpPrinter(); };
  cmdBothCancelHI.Click = [this] { ClosePrintPanel(); };
}

void frmPegRatio::cmdHiPrint_Click() {
  picPrinter.Show();
  fraPik.Hide();
  print_panel_.Open();
  lblCopies.SetCaption("Number of copies:  1");
  optHI0.SetValue(true);
  OfferAmount();
}

/// Tells of the whole list as it is now, and takes it where it is chosen.
void frmPegRatio::OfferAmount() {
  optHI0.SetCaption("Print Entire List of " + std::to_string(rows_.size()) + " Peg Ratios");
  if (optHI0.Value()) optHI0_Click();
}

void frmPegRatio::optHI0_Click() {
  txtHI.SetText(std::to_string(rows_.size()));
  txtHI.Disable();
}

void frmPegRatio::optHI1_Click() {
  txtHI.SetText("");
  txtHI.Enable();
  txtHI.SetFocus();
}

/// No more can be printed than there is.
void frmPegRatio::txtHI_Change() {
  const auto count = static_cast<double>(rows_.size());
  if (optHI0.Value() || Val(txtHI.Text()) > count) txtHI.SetText(NumberText(count));
}

void frmPegRatio::cmdPrintRatios_Click() {
  const double amount = std::min(Val(txtHI.Text()), static_cast<double>(rows_.size()));
  if (amount < 1) {
    Warning(context_, "You must show AMOUNT to print!    ");
    return;
  }
  if (!print_panel_.CheckCopies()) return;
  const auto last = rows_.begin() + int{Integer::Narrow(amount)};
  const char* order = optAlfa.Value() ? " (Alphabetical)" : "  (High to Low)";
  PrintRatios(context_, print_panel_.Chosen().copies,
              {session_.AssociationName, Trim(lblHi0.Caption()) + order, lblHi1.Caption()},
              {rows_.begin(), last});
  ClosePrintPanel();
}

void frmPegRatio::ClosePrintPanel() {
  picPrinter.Hide();
  fraPik.Show();
}

}  // namespace marlowbeck
