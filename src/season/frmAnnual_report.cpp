#include <algorithm>

#include "data/runtime_error.h"
#include "data/text.h"
#include "print/tabbed_text.h"
#include "season/frmAnnual.h"
#include "session/forfeits_choice.h"
#include "session/messages.h"
#include "session/season.h"
#include "ui/grid_rows.h"

namespace marlowbeck {
namespace {

constexpr int kColumns = 11;
constexpr int kTotalsColumns = 12;

std::vector<std::string> RowOf(const Grid& grid, int row) {
  std::vector<std::string> cells;
  cells.reserve(static_cast<std::size_t>(grid.Cols()));
  for (int col = 0; col < grid.Cols(); ++col) cells.push_back(grid.Cell(row, col));
  return cells;
}

}  // namespace

void frmAnnual::CalcAnnual() {
  const std::int32_t id = ids_.at(static_cast<std::size_t>(lstPlayers.Index()));
  if (season_) {
    report_ = season_->ReportOf(id);
    name_ = season_->NameOf(id);
  } else {
    const SeasonResults season(session_, context_.channels);
    report_ = season.ReportOf(id);
    name_ = season.NameOf(id);
  }
  context_.channels.OpenOutput(Channel::Side, session_.SeasonReportFile, Keeping::Working);
  WriteAnnual(context_.channels.Writer(Channel::Side), name_, report_);
  context_.channels.CloseAll();
}

void frmAnnual::FillGrid() {
  if (report_.Games().empty()) return;
  context_.GoToWorkingFolder();
  const bool included = ReadForfeitsIncluded(context_);
  (included ? optFFyes : optFFno).SetValue(true);
  GetSeason(context_);
  ClearGrid();
  lblGrade.SetCaption(session_.Team + "  (" + session_.Grade + ")  -  " +
                      session_.SeasonDescription);
  lblPlayer.SetCaption("Season Report:   " + name_);
  const auto& names = session_.GameNames;
  grdAnnual.SetSize(static_cast<int>(report_.Games().size()) + 1, kColumns);
  SetRow<kColumns>(
      grdAnnual, 0,
      {"Date", "Against", "Agg", "Sh", "180", "100", "H/Sc", names[0], names[1], names[2], "Avg"});
  int row = 0;
  for (const AnnualGame& game : report_.Games()) SetRow(grdAnnual, ++row, AnnualCells(game));
  FillTotals();
  GridsON();
}

void frmAnnual::FillTotals() {
  const auto& games = report_.Games();
  const auto forfeits = static_cast<int>(std::ranges::count_if(
      games, [](const AnnualGame& game) { return IsForfeitRow(AnnualCells(game)); }));
  AskAboutForfeits(forfeits > 0);
  const int count = static_cast<int>(games.size()) - (optFFno.Value() ? forfeits : 0);
  const auto& names = session_.GameNames;
  grdTotals.SetSize(2, kTotalsColumns);
  SetRow<kTotalsColumns>(grdTotals, 0,
                         {"Games", "Agg", "Shots", "180's", "100's", "Hi Scr", names[0], names[1],
                          names[2], "Tot.Pegs", "Hi Peg", "Avg"});
  SetRow(grdTotals, 1, TotalsCells(report_.Totals(), count));
}

void frmAnnual::ClearGrid() {
  for (int row = 0; row < grdAnnual.Rows(); ++row) {
    for (int col = 0; col < grdAnnual.Cols(); ++col) grdAnnual.SetCell(row, col, "");
  }
}

void frmAnnual::GridsON() { ShowGrids(true); }

void frmAnnual::GridsOFF() {
  ShowGrids(false);
  AskAboutForfeits(false);
}

void frmAnnual::AskAboutForfeits(bool asked) {
  fraFFYesNo.SetVisible(asked);
  picFF.SetVisible(asked);
}

void frmAnnual::ShowGrids(bool shown) {
  for (Control* control :
       std::initializer_list<Control*>{&grdAnnual, &grdTotals, &lblGrade, &lblPlayer, &lblToT}) {
    control->SetVisible(shown);
  }
  cmdPrinter.SetEnabled(shown);
  cmdClipAnnual.SetEnabled(shown);
}

void frmAnnual::KeepForfeitsChoice(bool included) {
  try {
    WriteForfeitsIncluded(context_, included);
  } catch (const RunTimeError&) {
    // The answer that the totals are told by stands, so that the other one can be given again.
    (included ? optFFno : optFFyes).SetValue(true);
    throw;
  }
  FillGrid();
}

void frmAnnual::cmdClipAnnual_Click() {
  using LastTab = TabbedText::LastTab;
  context_.platform.clipboard.Clear();
  const auto& names = session_.GameNames;
  TabbedText text;
  text.Line(session_.AssociationName).Line(lblGrade.Caption()).Line(lblPlayer.Caption());
  text.Row({"Date", "Against", "Agg", "Shots", "180's", "100's", "H/Scr", names[0], names[1],
            names[2], "Avg"},
           LastTab::No);
  for (int row = 1; row < grdAnnual.Rows(); ++row) text.Row(RowOf(grdAnnual, row), LastTab::No);
  text.Line("SEASON TOTALS");
  text.Row({"Games", "Agg", "Shots", "180's", "100's", "H/Scr", names[0], names[1], names[2],
            "Pegs", "Hi/Peg", "Avg"},
           LastTab::No);
  text.Row(RowOf(grdTotals, 1), LastTab::No);
  context_.platform.clipboard.SetText(text.Text());
  // KEPT: the box says that leaving clears the clipboard, which it does not; a repair would leave
  // those words out.
  GoodMessage(context_,
              Lines({"Annual report has been copied to the clipboard    ",
                     "and can now be pasted as text into your    ",
                     "favourite spreadsheet or wordprocessor.    ", "",
                     "Note: When you leave this section,    ", "the Clipboard will be cleared !"}));
}

}  // namespace marlowbeck
