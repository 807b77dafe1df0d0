// Corrections of names, typed on the setup screen.

#include <algorithm>
#include <iterator>

#include "data/text.h"
#include "support/random_corrections.h"
#include "support/random_names.h"

namespace marlowbeck {
namespace {

constexpr std::size_t kFewPlayers = 12;
constexpr int kErrorBox = 16;

}  // namespace

void RandomCorrections::OpenSetup() {
  if (!in_setup_) Do("click imgPlayers");
  in_setup_ = true;
}

void RandomCorrections::PickATeam() {
  OpenSetup();
  at_.grade = OneOf(model.Grades());
  at_.team = OneOf(model.Teams(at_.grade));
  Do8("pick cboAddGrd =" + at_.grade);
  Do8("pick cboAddTm =" + at_.team);
  ExpectLines(Lines("lstPlayers"), model.Lines(at_.grade, at_.team));
}

std::string RandomCorrections::PickAPlayer() {
  PickATeam();
  const std::string line = OneOf(model.Lines(at_.grade, at_.team));
  Do8("pick lstPlayers =" + line);
  return line;
}

void RandomCorrections::RenameATeam() {
  PickATeam();
  const std::string reply = OneIn(2) ? OneOf(kTeamReplies) : "Team " + std::to_string(Below(999));
  Say("rename team " + at_.team + " of " + at_.grade + " to " + reply);
  Do8("input " + reply);
  Do("click cmdEdTeamName");
  ExpectBoxes(model.RenameTeam(at_.grade, at_.team, reply));
  // After a failure the lists are those of before until the screen is opened anew.
  if (Boxes().size() == 1 && Boxes()[0].style == kErrorBox) LeaveTheScreens();
}

void RandomCorrections::RenameAGrade() {
  PickATeam();
  const std::string reply = OneIn(2) ? OneOf(kGradeReplies) : "Grade " + std::to_string(Below(99));
  Say("rename grade " + at_.grade + " to " + reply);
  Do8("input " + reply);
  Do("click cmdEdGradeName");
  ExpectBoxes(model.RenameGrade(at_.grade, reply));
}

void RandomCorrections::DeleteAPlayer() {
  if (model.players.size() <= kFewPlayers) return AddAPlayer();
  const std::string line = PickAPlayer();
  const bool sure = !OneIn(4);
  Say("delete " + line + " of " + at_.team + " in " + at_.grade + (sure ? "" : ", not sure"));
  Do(sure ? "answer ok" : "answer cancel");
  Do("click cmdDelName");
  ExpectBoxes(model.DeletePlayer(at_.grade, at_.team, line, sure));
  Do("forget");
  if (Shown("fraNamesMenu")) Do("click cmdCancelDel");
}

void RandomCorrections::EditAPlayer() {
  const std::string line = PickAPlayer();
  SeasonModel::Edit edit{OneOf(kSurnames), OneOf(kFirstNames), at_.team, at_.grade};
  Say("edit " + line + " of " + at_.team + " in " + at_.grade + " to " + edit.surname + ", " +
      edit.first_name);
  Do("click cmdEdName");
  std::vector<std::string> boxes = BoxTexts();
  const bool bound = model.IsBound(at_.grade, at_.team, line);
  EXPECT_EQ(Get("cboAddTm")["locked"], bound) << told_;
  if (!bound && OneIn(2)) {
    edit.grade = OneOf(model.Grades());
    edit.team = OneOf(model.Teams(edit.grade));
    Do8("pick cboAddGrd =" + edit.grade);
    Do8("pick cboAddTm =" + edit.team);
  }
  Do8("type txtAddSn " + edit.surname);
  Do8("type txtAddFn " + edit.first_name);
  Do("click cmdAddSave");
  std::ranges::copy(BoxTexts(), std::back_inserter(boxes));
  ExpectBoxes(boxes, model.EditPlayer(at_.grade, at_.team, line, edit));
}

void RandomCorrections::AddAPlayer() {
  PickATeam();
  const std::string surname = OneOf(kSurnames);
  const std::string first_name = OneOf(kFirstNames);
  Say("add " + surname + ", " + first_name + " to " + at_.team + " in " + at_.grade);
  Do8("type txtAddSn " + surname);
  Do8("type txtAddFn " + first_name);
  Do("click cmdAddSave");
  ExpectBoxes(model.Add(at_.grade, at_.team, surname, first_name));
}

}  // namespace marlowbeck
