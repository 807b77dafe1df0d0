// The editing and the deleting of a player on the setup screen.

#include "data/text.h"
#include "session/messages.h"
#include "setup/frmNames.h"
#include "setup/player_deletion.h"

namespace marlowbeck {

/// The line of the list that a choice is asked for, and where it stands.
ListedLine frmNames::PickedLine() const {
  return {Trimmed(cboAddTm.Text()), Trimmed(cboAddGrd.Text()), lblEdName.Caption()};
}

void frmNames::cmdEdName_Click() {
  OpenPlayers();
  session_.EditRecord = 0;
  session_.Flag = 0;
  const std::optional<ListedPlayer> player = LastListed(context_.channels, PickedLine());
  context_.channels.CloseAll();
  if (player) TakeUp(*player);
  fraNamesMenu.Hide();
  EnablePanel("EDIT: Teams, Grades And Players");
  LockPlayerWithResults();
  txtAddSn.SetFocus();
}

void frmNames::TakeUp(const ListedPlayer& player) {
  txtAddSn.SetText(player.surname);
  txtAddFn.SetText(player.first_name);
  session_.EditRecord = player.record;
  session_.Flag = player.id;
}

/// The results of a player lie in the file of the grade and under the team: who has any cannot
/// move. Nobody can while it is not known.
void frmNames::LockPlayerWithResults() {
  HoldCombos(true);
  OpenResultSFile();
  const bool held = HasResults(context_.channels, session_.Flag);
  context_.channels.CloseAll();
  HoldCombos(held);
}

void frmNames::cmdDelName_Click() {
  const std::string grade = Trim(cboAddGrd.Text());
  const std::string team = Trim(cboAddTm.Text());
  FindDoomed();
  const int results = CountResults();
  if (Confirm(context_, DeletionQuestion(lblEdName.Caption(), results)) == kAnswerOk) {
    DeletePlayer(results);
    return BackFromDeletion();
  }
  session_.Flag = 0;
  Reset();
  PutGradeAndTeamBack(grade, team);
}

void frmNames::FindDoomed() {
  OpenPlayers();
  NameFilesOfGrade();
  session_.EditRecord = 0;
  session_.Flag = 0;
  const std::optional<ListedPlayer> player = FirstListed(context_.channels, PickedLine());
  if (player) session_.Flag = player->id;
  context_.channels.CloseAll();
}

int frmNames::CountResults() {
  OpenResultSFile();
  const int results = CountResultsOf(context_.channels, session_.Flag);
  context_.channels.CloseAll();
  return results;
}

/// The results go first: a failure between the two leaves a player without results, who can be
/// deleted again, and never results without a player.
void frmNames::DeletePlayer(int results) {
  if (results > 0) {
    OpenResultSFile();
    RemoveResultsOf(context_.channels, session_.Flag);
  }
  OpenPlayers();
  RemovePlayer(context_.channels, session_.Flag);
}

void frmNames::BackFromDeletion() {
  panAddPlayer.Show();
  EnablePanel(kSetupCaption);
  FreeCombos();
  session_.Flag = 0;
  Reset();
  if (session_.PlayerCount > 0) txtAddSn.SetFocus();
}

}  // namespace marlowbeck
