#include <algorithm>

#include "data/integer.h"
#include "data/numbers.h"
#include "session/messages.h"
#include "stats/frmPMenu.h"
#include "stats/print_list.h"

namespace marlowbeck {

void frmPMenu::WireListPrinting() {
  cmdHiPrint.Click = [this] { cmdHiPrint_Click(); };
  optHI[0].Click = [this] { optHI0_Click(); };
  optHI[1].Click = [this] { optHI1_Click(); };
  txtHI.Change = [this] { txtHI_Change(); };
  cmdPrinterSetupHI.Click = [this] { list_print_panel_.SetUpPrinter(); };
  cmdBothOKHI.Click = [this] { cmdBothOKHI_Click(); };
  cmdBothCancelHI.Click = [this] { CloseListPrintPanel(); };
}

/// The rows of the list on show; none where there is no list.
int frmPMenu::ListedRows() const { return fraHi.Visible() ? std::max(grdHI.Rows() - 1, 0) : 0; }

void frmPMenu::cmdHiPrint_Click() {
  if (ListedRows() == 0) return;
  picPrintHI.Show();
  grdHI.Disable();
  fraPikHi.Disable();
  cmdProgress.Disable();
  fraWkProg.Hide();
  const std::string name = fraPikHi.Caption();
  optHI[0].SetCaption("Print Entire List of " + name);
  optHI[0].SetValue(true);
  lblHMPrint.SetCaption(name);
  txtHI.SetText(std::to_string(ListedRows()));
  list_print_panel_.Open();
}

void frmPMenu::optHI0_Click() { txtHI.SetText(std::to_string(session_.RowCount)); }

void frmPMenu::optHI1_Click() {
  txtHI.SetText("");
  txtHI.SetFocus();
}

/// No more can be printed than there is, and no less while all is selected.
void frmPMenu::txtHI_Change() {
  const int most = grdHI.Rows() - 1;
  if (optHI[0].Value() || Val(txtHI.Text()) > most) txtHI.SetText(std::to_string(most));
}

void frmPMenu::cmdBothOKHI_Click() {
  if (Val(txtHI.Text()) < 1) {
    Warning(context_, "You must show AMOUNT to print!    ");
    return;
  }
  if (!list_print_panel_.CheckCopies()) return;
  PrintHI();
  CloseListPrintPanel();
}

void frmPMenu::CloseListPrintPanel() {
  picPrintHI.Hide();
  fraPikHi.Enable();
  cmdProgress.Enable();
  grdHI.Enable();
}

void frmPMenu::PrintHI() {
  // The way back from all grades stays open behind the panel, and can lead to an empty list.
  if (ListedRows() == 0) return;
  const int amount = std::min<int>(Integer::Narrow(Val(txtHI.Text())), grdHI.Rows() - 1);
  PrintList(context_, list_print_panel_.Chosen(),
            PrintedList(grdHI, amount, lblHi[0].Caption(), lblHi[1].Caption()));
}

}  // namespace marlowbeck
