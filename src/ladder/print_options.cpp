// Printing and copying what the ladder tab shows.

#include "data/text.h"
#include "ladder/clipboard_text.h"
#include "ladder/frmLadder.h"
#include "session/messages.h"
#include "session/season.h"

namespace marlowbeck {
namespace {

/// The cells from a row on; none of a grid that is not seen.
TextRows RowsFrom(const Grid& grid, int first) {
  TextRows rows;
  if (!grid.Visible()) return rows;
  for (int row = first; row < grid.Rows(); ++row) {
    auto& cells = rows.emplace_back();
    for (int col = 0; col < grid.Cols(); ++col) cells.push_back(grid.Cell(row, col));
  }
  return rows;
}

}  // namespace

void frmLadder::WirePrinting() {
  cmdPrintLad.Click = [this] { cmdPrintLad_Click(); };
  cmdPrinterSetup.Click = [this] { print_panel_.SetUpPrinter(); };
  cmdBothOK.Click = [this] { cmdBothOK_Click(); };
  cmdBothCancel.Click = [this] { ClosePrintOptions(); };
  cmdClipLadder.Click = [this] { cmdClipLadder_Click(); };
}

void frmLadder::cmdPrintLad_Click() {
  for (Panel* panel : {&fraButtons, &fraCmds, &fraHelpExit}) panel->Hide();
  OfferTables(false);
  print_panel_.Open();
  fraPO.Show();
}

void frmLadder::ClosePrintOptions() {
  fraPO.Hide();
  for (Panel* panel : {&fraButtons, &fraCmds, &fraHelpExit}) panel->Show();
  OfferTables(true);
}

/// Another table would come up under the panel; the font may be chosen all the same.
void frmLadder::OfferTables(bool offered) {
  for (Control* control :
       std::initializer_list<Control*>{&cboTGrades, &lstTableDates, &grdLad, &grdWk}) {
    control->SetEnabled(offered);
  }
}

void frmLadder::cmdBothOK_Click() {
  if (!print_panel_.Check({&optBoth[0], &optBoth[1], &optBoth[2]},
                          "Please select Results, Ladder or Both before printing.    ")) {
    return;
  }
  ClosePrintOptions();
  if (optBoth[0].Value()) Weekly();
  if (optBoth[1].Value()) Ladder();
  if (optBoth[2].Value()) PrintBoth();
}

void frmLadder::Weekly() { Print(LadderPrintout::Results); }
void frmLadder::Ladder() { Print(LadderPrintout::Ladder); }
void frmLadder::PrintBoth() { Print(LadderPrintout::Both); }

void frmLadder::Print(LadderPrintout what) {
  PrintLadderTab(context_, print_panel_.Chosen(), what, ShownTab());
}

LadderTab frmLadder::ShownTab() const {
  return {cboTGrades.Text(), lblGameDetails.Caption(), LadderTitle(),
          TeamList,          RowsFrom(grdWk, 0),       RowsFrom(grdLad, 1)};
}

void frmLadder::cmdClipLadder_Click() {
  context_.platform.clipboard.Clear();
  GetSeason(context_);
  context_.platform.clipboard.SetText(
      LadderClipboardText(session_, session_.LadderDate, ShownTab()));
  // KEPT: the box says that leaving clears the clipboard, which it does not; a repair would leave
  // those words out.
  GoodMessage(
      context_,
      Lines({"The Game results and Premiership Ladder    ",
             "have been copied to the clipboard and   ", "can now be pasted as text into your    ",
             "favourite spreadsheet or wordprocessor.    ", "",
             "Note: When you leave this section,    ", "the Clipboard will be cleared !"}));
}

}  // namespace marlowbeck
