#include "season/frmPegRatio.h"

#include "data/competition.h"
#include "data/date.h"
#include "data/runtime_error.h"
#include "data/text.h"
#include "print/tabbed_text.h"
#include "session/messages.h"
#include "session/season.h"
#include "session/shared_procedures.h"
#include "ui/grid_rows.h"
#include "ui/screens.h"

namespace marlowbeck {
namespace {

constexpr const char* kWorkFile = "LegPegs.qz3";
constexpr int kColumns = 6;
constexpr int kFirstFigures = 3;
constexpr int kRecordsPerGlance = 2048;  // between two looks at the bar

}  // namespace

frmPegRatio::frmPegRatio(Screens& screens, const Context& context)
    : Screen(screens, "frmPegRatio", "[Marlowbeck]  Peg Ratios"),
      context_(context),
      session_(context.session) {
  grdRatio.SetFiguresFrom(kFirstFigures);
  WireList();
  WirePrinting();
  Cancels = {&cmdBothCancelHI, &cmdCancel};
  Helps = {&cmdHelp};
}

void frmPegRatio::WireList() {
  cboResGrade.Click = [this] { ReCalc(); };
  for (OptionButton* option : {&optAlfa, &optRatio}) {
    option->Click = [this, option] { SortBy(*option); };
    option->DoubleClick = option->Click;
  }
  cmdClipRatio.Click = [this] { cmdClipRatio_Click(); };
  cmdHelp.Click = [this] { context_.platform.help.Open("qz1.HLP", 0); };
  cmdCancel.Click = [this] { InScreens().Unload(*this); };
}

void frmPegRatio::Load() {
  ReadFileName(context_);
  picPrinter.Hide();
  pbRatio.Hide();
  fraGrid.Hide();
  OfferCopies(false);
  font_box_.GetFont();
  // No grade is picked yet: nothing is worked out, or asked, before one is.
  GetGrades(context_, cboResGrade);
}

void frmPegRatio::Unload() { InScreens().Show("frmPMenu"); }

void frmPegRatio::SortBy(OptionButton& option) {
  option.SetValue(true);
  if (sorted_by_ == &option) return;
  sorted_by_ = &option;
  if (cboResGrade.Index() >= 0) ReCalc();
}

void frmPegRatio::OfferCopies(bool offered) {
  cmdHiPrint.SetEnabled(offered);
  cmdClipRatio.SetEnabled(offered);
}

void frmPegRatio::ReCalc() {
  fraGrid.Hide();
  // What is not worked out to its end is neither printed nor copied.
  OfferCopies(false);
  ForgetRows();
  session_.Grade = Trim(cboResGrade.Text());
  NameGradeFiles(session_);
  if (!AnyPegs()) {
    Warning(context_, "No pegs found for " + session_.Grade + ".   ");
    return;
  }
  GetSeason();
  try {
    CalcRatio();
  } catch (const RunTimeError&) {
    ForgetRows();
    pbRatio.Hide();
    throw;
  }
  GridRatio();
  lblHi0.SetCaption(session_.Grade + "   Player Peg Ratios");
  lblHi1.SetCaption(session_.SeasonDescription);
  OfferCopies(true);
  fraGrid.Show();
  TellOpenPanel();
}

void frmPegRatio::ForgetRows() {
  rows_.clear();
  TellOpenPanel();
}

/// An open panel still has the amount of the list before.
void frmPegRatio::TellOpenPanel() {
  if (picPrinter.Visible()) OfferAmount();
}

void frmPegRatio::GetSeason() { marlowbeck::GetSeason(context_); }

/// Whether any result of the grade has a peg, whosever it is.
bool frmPegRatio::AnyPegs() {
  bool any = false;
  OpenResultSFile(session_, context_.channels);
  context_.channels.ForEachRecord(Channel::Results, [&](Bytes record, int) {
    any = PegsMade(ResultView(record)) > 0;
    return !any;
  });
  context_.channels.CloseAll();
  return any;
}

void frmPegRatio::CalcRatio() {
  if (!optAlfa.Value() && !optRatio.Value()) {
    optAlfa.SetValue(true);
    sorted_by_ = &optAlfa;
  }
  PegRatios ratios(session_.Grade);
  ReadPlayers(ratios);
  pbRatio.SetRange(0, ratios.PlayerCount());
  pbRatio.SetValue(pbRatio.Min());
  pbRatio.Show();
  ReadResults(ratios);
  rows_ = ratios.Rows();
  session_.RowCount = static_cast<int>(rows_.size());
  WriteRows();
  pbRatio.SetValue(pbRatio.Max());
  SortRatios(rows_, optAlfa.Value() ? RatioOrder::Alphabetical : RatioOrder::HighToLow);
  WriteRows();
  pbRatio.Hide();
}

void frmPegRatio::ReadPlayers(PegRatios& ratios) {
  OpenFile(session_, context_.channels);
  context_.channels.ForEachRecord(Channel::Players,
                                  [&](Bytes record, int) { ratios.AddPlayer(PlayerView(record)); });
  context_.channels.CloseAll();
}

void frmPegRatio::ReadResults(PegRatios& ratios) {
  OpenResultSFile(session_, context_.channels);
  context_.channels.ForEachRecord(Channel::Results, [&](Bytes record, int number) {
    ratios.AddResult(ResultView(record));
    if (number % kRecordsPerGlance == 0) ShowProgress(number);
  });
  context_.channels.CloseAll();
}

/// All players come along together, as far as the results have been read.
void frmPegRatio::ShowProgress(int result) {
  pbRatio.SetValue(pbRatio.Max() * result / int{session_.ResultCount});
  context_.platform.display.Refresh();
}

void frmPegRatio::WriteRows() {
  context_.GoToWorkingFolder();
  context_.channels.OpenOutput(Channel::Side, kWorkFile, Keeping::Working);
  WriteRatios(context_.channels.Writer(Channel::Side), rows_);
  context_.channels.CloseAll();
}

void frmPegRatio::GridRatio() {
  ClearGridRatio();
  if (rows_.empty()) {
    grdRatio.SetSize(2, kColumns);
    Warning(context_, "No players found for " + session_.Grade + "    ");
    return;
  }
  grdRatio.SetSize(static_cast<int>(rows_.size()) + 1, kColumns);
  SetRow<kColumns>(grdRatio, 0, {"No.", "Player", "Team", "Legs", "Pegs", "Ratio"});
  int place = 0;
  for (const RatioRow& row : rows_) {
    ++place;
    SetRow(grdRatio, place, RatioCells(place, row));
  }
}

void frmPegRatio::ClearGridRatio() {
  for (int row = 0; row < grdRatio.Rows(); ++row) {
    for (int col = 0; col < grdRatio.Cols(); ++col) grdRatio.SetCell(row, col, "");
  }
}

void frmPegRatio::cmdClipRatio_Click() {
  context_.platform.clipboard.Clear();
  GetSeason();
  TabbedText text;
  text.Line(session_.AssociationName).Line(Trim(session_.SeasonDescription));
  text.Line(Trim(lblHi0.Caption()));
  text.Line("Print Date:  " + ShortDate(context_.platform.clock.Today()));
  for (int row = 0; row < grdRatio.Rows(); ++row) {
    std::vector<std::string> cells;
    cells.reserve(kColumns);
    for (int col = 0; col < kColumns; ++col) cells.push_back(grdRatio.Cell(row, col));
    text.Row(cells, TabbedText::LastTab::Yes);
  }
  context_.platform.clipboard.SetText(text.Text());
  GoodMessage(context_, Lines({Trim(lblHi0.Caption()) + "    ", Trim(lblHi1.Caption()) + "    ",
                               "has been copied to the clipboard    ",
                               "and can now be pasted as text into your    ",
                               "favourite spreadsheet or wordprocessor.    "}));
}

}  // namespace marlowbeck
