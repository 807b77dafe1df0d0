#include "data/runtime_error.h"
#include "season/frmAnnual.h"
#include "season/print_annual.h"
#include "session/messages.h"

namespace marlowbeck {
namespace {

std::vector<std::vector<std::string>> RowsOf(const Grid& grid) {
  std::vector<std::vector<std::string>> rows;
  for (int row = 0; row < grid.Rows(); ++row) {
    rows.emplace_back();
    for (int col = 0; col < grid.Cols(); ++col) rows.back().push_back(grid.Cell(row, col));
  }
  return rows;
}

}  // namespace

void frmAnnual::WirePrinting() {
  cmdPrinter.Click = [this] { cmdPrinter_Click(); };
  cmdBothOKHI.Click = [this] { cmdBothOKHI_Click(); };
  cmdPrinterSetup.Click = [this] { print_panel_.SetUpPrinter(); };
  cmdBothCancelHI.Click = [this] { ClosePrintPanel(); };
}

void frmAnnual::cmdPrinter_Click() {
  ShowPicks(false);
  picPrinter.Show();
  optNoAnnual.SetValue(true);
  OfferAll();
  print_panel_.Open();
}

void frmAnnual::ClosePrintPanel() {
  picPrinter.Hide();
  ShowPicks(true);
}

void frmAnnual::ShowPicks(bool shown) {
  for (Control* control :
       std::initializer_list<Control*>{&cboGrades, &cboTeams, &lblHmP, &lstPlayers}) {
    control->SetVisible(shown);
  }
}

/// Whether all of the list are to be printed is asked only where there is more than one.
void frmAnnual::OfferAll() {
  const int count = lstPlayers.Count();
  fraAllAnnual.SetVisible(count > 1);
  lblAllAnnual.SetCaption(count == 2 ? "Print BOTH Players."
                                     : "Print ALL " + std::to_string(count) + " Players.");
}

void frmAnnual::cmdBothOKHI_Click() {
  if (!print_panel_.CheckCopies()) return;
  if (optYesAnnual.Value() && lstPlayers.Count() > 1) return DoALL();
  PrintHI();
  ClosePrintPanel();
}

void frmAnnual::DoALL() {
  season_.emplace(session_, context_.channels);
  try {
    for (int line = 0; line < lstPlayers.Count(); ++line) {
      lstPlayers.SetIndex(line);
      context_.platform.display.Refresh();
      // Who cannot be printed holds nobody else up: how wide a season is depends on its names.
      PrintHI();
    }
  } catch (const RunTimeError&) {
    season_.reset();
    ClosePrintPanel();
    throw;
  }
  season_.reset();
  ClosePrintPanel();
  lstPlayers.SetIndex(-1);
  // KEPT: a run of all players ends in these words also when some, or none, could be printed; a
  // repair would tell who is missing.
  GoodMessage(context_, "A L L    D O N E ! ");
}

void frmAnnual::PrintHI() {
  AnnualPrint season{lblGrade.Caption(), lblPlayer.Caption(), RowsOf(grdAnnual), RowsOf(grdTotals)};
  constexpr std::size_t kTotalPegs = 9;
  season.totals.at(0).at(kTotalPegs) = "Pegs";
  PrintAnnual(context_, print_panel_.Chosen().copies, season);
}

}  // namespace marlowbeck
