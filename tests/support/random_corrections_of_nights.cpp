// Corrections of a team's night, on the score sheets and from the weekly table. Where a draw finds
// nothing to correct, nothing is done.

#include <algorithm>

#include "data/text.h"
#include "support/league.h"
#include "support/random_corrections.h"
#include "support/random_names.h"

namespace marlowbeck {

/// False where the grade drawn has no sheets to be opened.
bool RandomCorrections::OpenSheets() {
  const std::string grade = OneOf(model.Grades());
  const std::vector<std::string> teams = model.Teams(grade);
  if (!SeasonModel::NamesAFile(grade) || teams.size() < 2) return false;
  at_ = {grade, OneOf(teams), March(3 + 7 * Below(5))};
  LeaveTheScreens();
  Do("click imgSheets");
  Do8("pick cboResGrade =" + at_.grade);
  Do("date Cal " + IsoDate(at_.date));
  Do("click cmdGotoResults");
  Do8("pick cboResTeam =" + at_.team);
  model.results[UpperCase(grade)];  // the look makes the file
  EXPECT_EQ(Text("cboOpp"), Utf8FromCp1252(model.OppositionOn(at_))) << told_;
  ExpectLines(Lines("lstFinished"), model.Entered(at_));
  EXPECT_EQ(Shown("panChangeOpp"), model.CanSwap(at_)) << told_;
  return true;
}

void RandomCorrections::LeaveSheets() {
  Do("click cmdLeaveResults");
  model.CloseSheets(at_.grade);
}

void RandomCorrections::SwapAnOpposition() {
  if (!OpenSheets()) return;
  if (!model.CanSwap(at_)) return LeaveSheets();
  const std::string to = OneOf(model.FreeTeams(at_));
  const bool sure = !OneIn(4);
  Say("swap for " + at_.team + " of " + at_.grade + " on " + ShortDate(at_.date) + " to " + to);
  Do("click panChangeOpp");
  ExpectLines(Lines("cboReDoOpp"), model.FreeTeams(at_));
  Do8("pick cboReDoOpp =" + to);
  Do(sure ? "answer yes" : "answer no");
  Do("click cmdSaveOp");
  std::vector<std::string> boxes = BoxTexts();
  // The team that is picked afterwards may have nobody to play.
  std::erase_if(boxes, [](const std::string& box) {
    return box.ends_with(" Team cannot play.\r\rNo available opposition teams.");
  });
  ExpectBoxes(boxes, model.SwapOpposition(at_, to, sure));
  Do("forget");
  LeaveSheets();
}

void RandomCorrections::DeleteAResult() {
  if (!OpenSheets()) return;
  const std::vector<std::string> entered = model.Entered(at_);
  if (entered.empty()) return LeaveSheets();
  const std::string line = OneOf(entered);
  const bool sure = !OneIn(4);
  Say("delete the result of " + line + " for " + at_.team + " of " + at_.grade + " on " +
      ShortDate(at_.date));
  Do8("pick lstFinished =" + line);
  const auto boxes = model.DeleteResult(at_, line, sure);
  ASSERT_EQ(Shown("cmdEdDelete"), boxes.has_value()) << told_;
  if (boxes) {
    Do(sure ? "answer yes" : "answer no");
    Do("click cmdEdDelete");
    ExpectBoxes(*boxes);
  } else {
    Do("click cmdResultsCancel");
  }
  LeaveSheets();
}

void RandomCorrections::AddAPlayerFromSheets() {
  if (!OpenSheets()) return;
  SeasonModel::Edit typed{OneOf(kSurnames), OneOf(kFirstNames), at_.team, at_.grade};
  if (OneIn(5)) typed.surname.clear();
  Do("click panAddNames");
  if (OneIn(3)) {
    typed.grade = OneOf(model.Grades());
    typed.team = OneOf(model.Teams(typed.grade));
    Do8("type txtAddTm0 " + typed.team);
    Do8("type txtAddGrd0 " + typed.grade);
  }
  Say("add " + typed.surname + ", " + typed.first_name + " to " + typed.team + " in " +
      typed.grade + " from the sheets of " + at_.grade);
  Do8("type txtAddSn0 " + typed.surname);
  Do8("type txtAddFn0 " + typed.first_name);
  Do("click cmdAddSave0");
  ExpectBoxes(model.AddFromSheets(at_.grade, typed));
  if (Shown("panResAddPlayer")) Do("click cmdAddCancel0");
  LeaveSheets();
}

/// False where the grade drawn, or the first one, which is shown at once, has no files to be read.
bool RandomCorrections::OpenWeekly() {
  const std::string first = model.Grades().front();
  const std::string grade = OneOf(model.Grades());
  if (!SeasonModel::NamesAFile(first) || !SeasonModel::NamesAFile(grade)) return false;
  at_ = {grade, OneOf(model.Teams(grade)), {}};
  LeaveTheScreens();
  for (const std::string& looked_at : {first, grade}) model.results[UpperCase(looked_at)];
  if (model.seasons.try_emplace(UpperCase(first), "\"Another title\"\r\n").second) {
    Do("input Another title");
  }
  DoAll({"click imgPrinter", "click Image6"});
  Do8("pick cboResGrade =" + at_.grade);
  Do8("pick cboResTeam =" + at_.team);
  return true;
}

void RandomCorrections::LeaveWeekly() { DoAll({"click cmdCancelWK", "click Image10"}); }

bool RandomCorrections::PickADate() {
  const std::vector<Date> dates = model.Dates(at_.grade, at_.team);
  std::vector<std::string> lines;
  for (const Date date : dates) lines.push_back(ShortDate(date));
  ExpectLines(Lines("lstAllDates"), lines);
  if (dates.empty()) return false;
  at_.date = OneOf(dates);
  Do("pick lstAllDates =" + ShortDate(at_.date));
  return true;
}

/// Mostly such as pass every check.
Figures RandomCorrections::DrawFigures() {
  Figures figures;
  figures.aggregate = OneIn(8) ? 0 : 1 + Below(7000);
  figures.shots = 35 + Below(60);
  figures.high_score = Below(100);
  if (OneIn(2)) figures = {figures.aggregate, figures.shots, 100 + Below(80), 1 + Below(9)};
  if (OneIn(4)) figures = {figures.aggregate, figures.shots, 180, 5 + Below(9), 1 + Below(5)};
  for (int& peg : figures.pegs) peg = OneIn(3) ? 0 : Below(400);
  figures.legs = OneIn(8) ? 0 : 1 + Below(20);
  return figures;
}

void RandomCorrections::TypeFigures(const std::string& row, const Figures& figures) {
  const auto type = [&](const std::string& box, int figure) {
    Do("type " + box + " " + (figure > 0 ? std::to_string(figure) : ""));
  };
  Do("type txtAgg " + std::to_string(figures.aggregate));
  type("txtShots", figures.shots);
  type("txtHS", figures.high_score);
  type("txtCent", figures.centuries);
  type("txtHowMany180s", figures.scores_180);
  for (std::size_t peg = 0; peg < figures.pegs.size(); ++peg) {
    const std::string box = "txtP" + std::to_string(peg + 1);
    const bool has_box = model.HasPegBox(at_, row, peg);
    EXPECT_EQ(Shown(box), has_box) << told_;
    if (has_box) type(box, figures.pegs[peg]);
  }
  type("txtLegs", figures.legs);
}

void RandomCorrections::CorrectAScore() {
  if (!OpenWeekly()) return;
  if (!PickADate()) return LeaveWeekly();
  std::vector<std::string> cells;
  for (const TextList& row : Cells("grdWeek")) cells.push_back(row.front());
  std::vector<std::string> rows = model.Rows(at_);
  const std::string row = rows.empty() ? "" : OneOf(rows);
  const auto place = std::ranges::find(cells, Utf8FromCp1252(row)) - cells.begin();
  // In the table they stand by their averages.
  std::ranges::sort(rows);
  std::vector<std::string> names;
  for (std::size_t i = 1; i < cells.size(); ++i) names.push_back(Cp1252FromUtf8(cells[i]));
  std::ranges::sort(names);
  EXPECT_EQ(names, rows) << told_;
  if (rows.empty() || HasFailure()) return LeaveWeekly();
  Say("correct " + row + " of " + at_.team + " in " + at_.grade + " on " + ShortDate(at_.date));
  Do("dblcell grdWeek " + std::to_string(place) + " 0");
  const Figures figures = DrawFigures();
  TypeFigures(row, figures);
  Do("click cmdSave");
  ExpectBoxes(model.CorrectScore(at_, row, figures));
  if (Front() == "frmEdScore") Do("click Command2");
  LeaveWeekly();
}

void RandomCorrections::ChangeADate() {
  if (!OpenWeekly()) return;
  if (!PickADate()) return LeaveWeekly();
  const Date to = OneIn(2) ? March(3 + 7 * Below(5)) : March(1 + Below(31));
  Say("move " + at_.team + " of " + at_.grade + " from " + ShortDate(at_.date) + " to " +
      ShortDate(to));
  Do("click cmdChangeDate");
  Do("date NewCal " + IsoDate(to));
  Do("click cmdOK");
  ExpectBoxes(model.ChangeDate(at_, to));
  if (Front() == "frmChangeDate") Do("click cmdCancel");
  LeaveWeekly();
}

}  // namespace marlowbeck
