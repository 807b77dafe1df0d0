// Opening and closing a score sheet: the player, the boxes that his grade has, and the figures of a
// saved one.

#include <algorithm>

#include "data/competition.h"
#include "data/numbers.h"
#include "data/text.h"
#include "results/find_records.h"
#include "results/frmResults.h"
#include "results/player_listing.h"
#include "results/quiet_spell.h"
#include "session/messages.h"

namespace marlowbeck {
void frmResults::lstResPlayers_Click() {
  if (lstFinished.Count() >= kPlayersOfATeam) {
    const int answer =
        WarningYesNo(context_, Lines({"6 Players have been entered.", "Are you sure you need to",
                                      "enter more than 6 results?"}));
    if (answer == kAnswerNo) return;
  }
  EnableBoxes();
  const QuietSpell quiet(context_.session.Quiet);
  GotPlayer();
}

void frmResults::GotPlayer() {
  Session& session = context_.session;
  session.EditRecord = 0;
  cboResTeam.Enable();
  fraResults.SetMeaning(Meaning::Black);
  fraResults.SetCaption("Enter Player's Scores");
  ClearResults();
  ChangeOpp();
  if (!session.Quiet && lstFinished.Count() >= kPlayersOfATeam) {
    Warning(context_, "Six Players for " + session.Team + " have been entered.");
    return GetPlayers();
  }
  if (FindPlayer(lstResPlayers)) {
    fraEdButtons.Hide();
    fraResControls.Hide();
  }
  WhichBoxes();
  // The three games of a grade without any best of three are one leg each.
  if (session.BestOfThree == 111) scores.txtLegs.SetText("3");
  if (!panPlrID.Caption().empty()) scores.txtAgg.SetFocus();
}

/// Shows the sheet of the first player whose name is the selected line; false when there is none.
bool frmResults::FindPlayer(const ListBox& list) {
  if (list.Index() < 0) return false;
  const auto player = FindPlayerByLine(context_.session, context_.channels, list.Line(list.Index()),
                                       kSheetNameSeparator);
  if (player) ShowPlayer(*player);
  return player.has_value();
}

void frmResults::ShowPlayer(const PlayerRecord& player) {
  fraResults.Show();
  panFirstName.SetCaption(player.FirstName + " ");
  panSurname.SetCaption(player.Surname + " ");
  panPlrID.SetCaption(std::to_string(player.ID));
}

void frmResults::lstFinished_Click() {
  EnableBoxes();
  ClearResults();
  try {
    OpenSavedResult();
  } catch (const RunTimeError&) {
    // A sheet that is half open would be saved as a new one.
    CloseSheet();
    throw;
  }
}

void frmResults::OpenSavedResult() {
  Session& session = context_.session;
  if (FindPlayer(lstFinished)) scores.txtAgg.SetFocus();
  session.EditRecord = 0;
  const int number = FindSavedResult();
  if (number == 0) return;
  session.EditRecord = number;
  WhichBoxes();
  scores.Fill(record_);
  ShowForCorrection();
}

void frmResults::CloseSheet() {
  context_.session.EditRecord = 0;
  fraResults.Hide();
  fraEdButtons.Hide();
  fraResControls.Show();
  fraTeams.Show();
}

/// The last result of the player in hand for this team, opposition and date, which is then in the
/// record buffer; 0 for none, with the first record of the file there, where a search from the back
/// ends.
int frmResults::FindSavedResult() {
  const Session& session = context_.session;
  const ResultKey wanted{static_cast<std::int32_t>(Val(panPlrID.Caption())), session.Team,
                         Trim(cboOpp.Text()), session.WorkDate};
  int found = 0;
  OpenResultSFile(context_.session, context_.channels);
  ForEachResult([&](const ResultView& result, int number) {
    if (wanted.Fits(result)) found = number;
    return true;
  });
  if (session.ResultCount > 0) ReadRecord(std::max(found, 1));
  context_.channels.CloseAll();
  return found;
}

void frmResults::ShowForCorrection() {
  fraResults.SetCaption("EDIT Player's Score");
  fraResults.SetMeaning(Meaning::Red);
  cboResTeam.Disable();
  fraEdButtons.Show();
  EdCal.SetValue(context_.session.WorkDate);
  fraResControls.Hide();
  fraTeams.Hide();
  if (Trimmed(record_.Forfeit) != "F") return;
  chkFF.SetValue(true);
  DisableBoxes();
}

void frmResults::GetOldScores() {
  WhichBoxes();
  OpenResultSFile(context_.session, context_.channels);
  ReadRecord(context_.session.EditRecord);
  context_.channels.CloseAll();
  scores.Restore(record_);
}

void frmResults::GetNoP() {
  Session& session = context_.session;
  session.BestOfThree = 0;
  OpenFile(session, context_.channels);
  context_.channels.ForEachRecord(Channel::Players, [&](Bytes bytes, int) {
    const PlayerView player(bytes);
    if (player.Grade() != lblHeader[0].Caption()) return true;
    session.BestOfThree = player.BestOfThree();
    return false;
  });
  context_.channels.CloseAll();
}

void frmResults::WhichBoxes() {
  GetNoP();
  scores.ShowPegBoxes(context_.session.BestOfThree, context_.session.GameNames);
}

void frmResults::ClearResults() {
  for (Control* control : Controls()) {
    if (control->GetKind() == Kind::Text) static_cast<TextBox*>(control)->SetText("");
  }
  for (Panel* panel : {&panSurname, &panFirstName, &panPlrID}) panel->SetCaption("");
}

void frmResults::EnableBoxes() {
  scores.Enable();
  chkFF.SetValue(false);
}

void frmResults::DisableBoxes() { scores.Disable(); }

void frmResults::chkFF_Click() {
  // Either way: a night that was played after all has none of the figures of a saved forfeit.
  scores.Blank();
  if (chkFF.Value()) {
    DisableBoxes();
  } else {
    scores.Enable();
  }
}

void frmResults::cmdClearRes_Click() {
  EnableBoxes();
  scores.Blank();
  scores.txtAgg.SetFocus();
}

void frmResults::EdCal_Change() {
  scores.txtAgg.SetFocus();
  Heading();
}

}  // namespace marlowbeck
