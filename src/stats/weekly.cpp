#include <array>

#include "data/competition.h"
#include "data/text.h"
#include "session/season.h"
#include "session/shared_procedures.h"
#include "stats/frmPMenu.h"
#include "stats/team_reports.h"
#include "ui/grid_rows.h"

namespace marlowbeck {
namespace {

constexpr const char* kTeamResults = "Team Results";

}  // namespace

void frmPMenu::DoWeekly() {
  fraWeek.SetCaption(kTeamResults);
  lblSeason1.SetCaption({});
  // What an earlier visit listed is nothing to pick from where there is no grade any more.
  cboResTeam.Clear();
  lstAllDates.Clear();
  ForgetNight();
  ClearWeekGrids();
  OfferNight(false);
  GetGrades(context_, cboResGrade);
  // Without a grade there is no season to have a title.
  if (cboResGrade.Count() == 0) return;
  try {
    cboResGrade.SetIndex(0);
  } catch (const RunTimeError&) {
    // The season has its title whatever became of its latest night.
    context_.channels.AbandonAll();
    ShowSeason();
    throw;
  }
  ShowSeason();
}

void frmPMenu::ShowSeason() {
  GetSeason();
  lblSeason1.SetCaption(session_.SeasonDescription);
}

void frmPMenu::GetSeason() {
  marlowbeck::GetSeason(context_);
  lblSeason.SetCaption(session_.SeasonDescription);
}

/// What is picked becomes the team and grade in hand, whose files the reports read.
void frmPMenu::TakeSelection() {
  session_.Team = Trimmed(cboResTeam.Text());
  session_.Grade = Trimmed(cboResGrade.Text());
  NameGradeFiles(session_);
}

void frmPMenu::cboResGrade_Click() {
  TakeSelection();
  // KEPT: the season's title stays that of the first grade when another one is picked; a repair
  // would read the title of each grade here.
  GetTeams(context_, session_.Grade, cboResTeam);
  if (cboResTeam.Count() > 0) cboResTeam.SetIndex(0);
}

void frmPMenu::cboResTeam_Click() {
  TakeSelection();
  GetDates();
  ListDates();
}

void frmPMenu::GetDates() { marlowbeck::GetDates(session_, context_.channels); }

void frmPMenu::ListDates() {
  lstAllDates.Clear();
  lblNoneFound.Hide();
  OfferNight(false);
  std::vector<std::string> lines;
  for (const Date date : session_.TeamDates) lines.push_back(ShortDate(date));
  for (const std::string& line : lines) lstAllDates.AddLine(line);
  if (lines.empty()) {
    lblNoneFound.SetCaption("  No results found for: \r " + session_.Team + ",  " + session_.Grade +
                            ".  ");
    lblNoneFound.Show();
    return;
  }
  OfferNight(true);
  lstAllDates.SetIndex(lstAllDates.Count() - 1);
}

/// What there is to see and to do with a night, or with none.
void frmPMenu::OfferNight(bool any) {
  fraWkProg.SetVisible(any);
  cmdPrintLad.SetEnabled(any);
  cmdClipWeek.SetEnabled(any);
  cmdChangeDate.SetVisible(any);
}

void frmPMenu::FillGrids() {
  if (fraWeek.Caption() != kTeamResults) return;
  ForgetNight();
  ClearWeekGrids();
  if (lstAllDates.Count() == 0) {
    ListDates();
    return;
  }
  CalcWeekly();
  GridWeekly();
  CalcProg();
  GridProg();
}

/// Until another night has been worked out nothing tells of the one before.
void frmPMenu::ForgetNight() {
  progressive_.clear();
  lblOpp.SetCaption({});
  lblDT.SetCaption({});
  cmdChangeDate.SetCaption(kChangeDate);
  lblProgInfo.SetCaption({});
}

void frmPMenu::ClearWeekGrids() {
  for (const auto& [grid, nothing] : {std::pair{&grdWeek, ""}, std::pair{&grdProg, " "}}) {
    grid->Hide();
    for (int row = 1; row < grid->Rows(); ++row) {
      for (int col = 0; col < grid->Cols(); ++col) grid->SetCell(row, col, nothing);
    }
    grid->Show();
  }
}

void frmPMenu::CalcWeekly() {
  TakeSelection();
  session_.WorkDate = DateFromText(lstAllDates.Line(lstAllDates.Index()));
  context_.GoToWorkingFolder();
  reports_.CalcWeekly(session_, context_.channels);
}

void frmPMenu::GridWeekly() {
  const std::string date = ShortDate(session_.WorkDate);
  lblOpp.SetCaption(session_.Team + "  (" + session_.Grade + ")");
  lblDT.SetCaption(date + " (v's " + session_.Opposition + ")");
  cmdChangeDate.SetCaption("Change Game Date: " + date);
  context_.GoToWorkingFolder();
  const auto rows = ReadWeeklyFile(session_, context_.channels);
  const auto& games = session_.GameNames;
  grdWeek.SetSize(session_.RowCount + 1, 10);
  SetRow<10>(grdWeek, 0,
             {"\rPlayer", "\rAgg", "\rShots", "\r180's", "\r100's", "High\rScore",
              games[0] + "\rPegs", games[1] + "\rPegs", games[2] + "\rPegs", "\rAvg"});
  int row = 0;
  for (const WeeklyRow& weekly : rows) SetRow(grdWeek, ++row, WeeklyCells(weekly));
}

void frmPMenu::cmdChangeDate_Click() {
  if (!session_.WorkDate.IsSet()) return;
  context_.GoToWorkingFolder();
  WriteWorkDate(context_.channels, session_.WorkDate);
  WriteOneString(context_.channels, "dc.qz3", session_.Team);
  OpenDialog("frmChangeDate", [this] {
    GetDates();
    ListDates();
  });
}

void frmPMenu::grdWeek_DoubleClick() {
  const std::string player = grdWeek.Cell(grdWeek.Row(), 0);
  // The heading row has no player, and neither has a row that an error left blank.
  if (grdWeek.Col() != 0 || grdWeek.Row() == 0 || player.empty()) return;
  context_.GoToWorkingFolder();
  context_.channels.OpenOutput(Channel::Side, "qzEdScor.qz3", Keeping::Lasting);
  for (const std::string& item : {cboResGrade.Text(), cboResTeam.Text(), session_.Opposition,
                                  ShortDate(session_.WorkDate), player}) {
    context_.channels.Writer(Channel::Side).Text(item).EndLine();
  }
  context_.channels.CloseAll();
  OpenDialog("frmEdScore", [this] { FillGrids(); });
}

}  // namespace marlowbeck
