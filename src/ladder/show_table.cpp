// The ladder tab: the table up to a date, and the matches of that date.

#include "data/competition.h"
#include "data/text.h"
#include "ladder/frmLadder.h"
#include "ladder/match_lines.h"
#include "session/season.h"

namespace marlowbeck {
namespace {

constexpr const char* kLadderFile = "ladder.qz3";
constexpr int kLadderCols = 10;
constexpr int kResultCols = 5;
constexpr std::array<const char*, kLadderCols> kHeadings = {
    "Team", "Played", "Won", "Loss", "Draw", "For", "Against", "Percent", "Points", "Adjust"};

std::array<std::string, kLadderCols> CellsOf(const LadderRow& row) {
  return {row.Team,
          std::to_string(row.Played),
          std::to_string(row.Won),
          std::to_string(row.Lost),
          std::to_string(row.Draw),
          std::to_string(row.For),
          std::to_string(row.Against),
          PercentText(row.For, row.Against),
          std::to_string(row.Points),
          AdjustText(row.Adjust)};
}

void BlankCells(Grid& grid) {
  for (int row = 0; row < grid.Rows(); ++row) {
    for (int col = 0; col < grid.Cols(); ++col) grid.SetCell(row, col, {});
  }
}

}  // namespace

void frmLadder::cboTGrades_Click() {
  for (Control* control :
       std::initializer_list<Control*>{&grdLad, &grdWk, &lblLadHeader, &lblGameDetails}) {
    control->Hide();
  }
  session_.Grade = Trim(cboTGrades.Text());
  GetNewFileName();
  lstTableDates.Clear();
  fraCmds.Hide();  // until there is a date
  GetSeason(context_);
  lblSeason.SetCaption(session_.SeasonDescription);
  GetTeams();
  GetDates();
  ListDates();
  if (lstTableDates.Count() == 0) return;
  fraCmds.Show();
  lstTableDates.SetIndex(lstTableDates.Count() - 1);
}

void frmLadder::ListDates() {
  lstTableDates.Clear();
  std::vector<std::string> lines;
  for (const Date date : session_.DateList) lines.push_back(ShortDate(date));
  for (const std::string& line : lines) lstTableDates.AddLine(line);
}

Date frmLadder::SelectedDate() const {
  return DateFromText(lstTableDates.Line(lstTableDates.Index()));
}

void frmLadder::lstTableDates_Click() {
  EraseArrays();
  session_.LadderDate = SelectedDate();
  session_.WorkDate = session_.LadderDate;
  GetGameResults();
  WorkOutTable();
}

void frmLadder::EraseArrays() {
  session_.DateList.clear();
  rows.clear();
  // Until it has been worked out anew no table that holds no more is to be seen, or printed.
  grdLad.Hide();
  lblLadHeader.Hide();
}

void frmLadder::GetGameResults() {
  grdWk.Hide();
  grdWk.SetSize(1, kResultCols);
  BlankCells(grdWk);
  lblGameDetails.SetCaption(session_.Grade + "    " + LongDate(SelectedDate()) + " ");
  lblGameDetails.Show();
  OpenLadderFile(session_, context_.channels);
  int row = -1;
  context_.channels.ForEachRecord(Channel::Ladder, [&](Bytes bytes, int) {
    const LadderView match(bytes);
    if (match.GameDate() == session_.LadderDate) ShowResultRow(++row, match);
  });
  context_.channels.CloseAll();
  grdWk.SetVisible(row >= 0);
}

void frmLadder::ShowResultRow(int row, const LadderView& match) {
  if (row > 0) grdWk.SetSize(row + 1, kResultCols);
  const auto cells = ResultCells(match);
  for (int col = 0; col < kResultCols; ++col) {
    grdWk.SetCell(row, col, cells[static_cast<std::size_t>(col)]);
  }
}

void frmLadder::WorkOutTable() {
  session_.LadderDate = SelectedDate();
  OpenConfig();
  LadderTally tally(TeamList, RulesInHand(session_), session_.LadderDate);
  OpenLadderFile(session_, context_.channels);
  context_.channels.ForEachRecord(Channel::Ladder,
                                  [&](Bytes bytes, int) { tally.Add(LadderView(bytes)); });
  context_.channels.CloseAll();
  rows = tally.Rows();
  SortLadder(rows);
  WriteLadderFile();
  GridLadder();
}

void frmLadder::WriteLadderFile() {
  context_.GoToWorkingFolder();
  context_.channels.OpenOutput(Channel::Side, kLadderFile, Keeping::Working);
  SideFileWriter& writer = context_.channels.Writer(Channel::Side);
  for (const LadderRow& row : rows) {
    writer.Text(row.Team).Number(row.Played).Number(row.Won).Number(row.Lost).Number(row.Draw);
    writer.Number(row.For).Number(row.Against).EndLine();
    writer.Number(row.Points).Number(row.Percent).Number(row.Adjust).EndLine();
  }
  context_.channels.Close(Channel::Side);
}

std::string frmLadder::LadderTitle() const {
  return session_.Grade + " PREMIERSHIP LADDER up to: " + LongDate(session_.LadderDate) + " ";
}

void frmLadder::GridLadder() {
  lblLadHeader.SetCaption(LadderTitle());
  grdLad.SetSize(static_cast<int>(rows.size()) + 1, kLadderCols);
  for (int col = 0; col < kLadderCols; ++col) {
    grdLad.SetCell(0, col, kHeadings[static_cast<std::size_t>(col)]);
  }
  int line = 0;
  for (const LadderRow& row : rows) {
    ++line;
    const auto cells = CellsOf(row);
    for (int col = 0; col < kLadderCols; ++col) {
      grdLad.SetCell(line, col, cells[static_cast<std::size_t>(col)]);
    }
  }
  grdLad.SetCurrent(0, 0);
  lblLadHeader.Show();
  grdLad.Show();
}

void frmLadder::ClearGrids() {
  BlankCells(grdLad);
  BlankCells(grdWk);
}

}  // namespace marlowbeck
