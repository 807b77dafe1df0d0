// One rule for a whole grade: on one date a team meets one opposition.

#include "data/competition.h"
#include "data/text.h"
#include "results/frmResults.h"
#include "results/opposition_finder.h"
#include "session/messages.h"

namespace marlowbeck {

void frmResults::GetOpp() {
  Session& session = context_.session;
  cboOpp.Clear();
  OppositionFinder finder(cboResTeam.Lines(), session.Team, session.WorkDate);
  other_teams_ = finder.OtherTeams();
  OpenResultSFile(session, context_.channels);
  ForEachResult([&](const ResultView& result, int) {
    finder.AddResult(result);
    return true;
  });
  context_.channels.CloseAll();
  for (const std::string& team : finder.Free()) cboOpp.AddLine(team);
  if (cboOpp.Count() > 0) cboOpp.SetIndex(0);
  // The one met already is shown though it is no longer among the lines.
  cboOpp.SetEnabled(!finder.Met());
  if (finder.Met()) cboOpp.SetText(*finder.Met());
}

void frmResults::cboOpp_Click() {
  context_.session.Team = Trim(cboResTeam.Text());
  GetPlayers();
  Heading();
  AddOpp();
}

void frmResults::AddOpp() {
  Session& session = context_.session;
  panAddNames.SetCaption(" Add Players to " + session.Team + " ");
  const std::string opposition = Trim(cboOpp.Text());
  bool has_entered = false;  // the opposition, players of its own
  OpenResultSFile(session, context_.channels);
  ForEachResult([&](const ResultView& result, int) {
    has_entered = result.GameDate() == session.WorkDate && result.Team() == opposition;
    return !has_entered;
  });
  context_.channels.CloseAll();
  const bool can_change = cboOpp.Count() > 0 && !has_entered;
  if (can_change) panChangeOpp.SetCaption(" Change Opposition from " + opposition + " ");
  panChangeOpp.SetVisible(can_change);
}

void frmResults::ChangeOpp() {
  Session& session = context_.session;
  const std::string team = Trim(cboResTeam.Text());
  const std::string opposition = Trim(cboOpp.Text());
  int conflict = 0;  // record number
  OpenResultSFile(session, context_.channels);
  ForEachResult([&](const ResultView& result, int number) {
    if (IsConflict(result, Cal.Value(), team, opposition)) conflict = number;
    return conflict == 0;
  });
  context_.channels.CloseAll();
  if (conflict == 0) return;
  const bool is_last = conflict == session.ResultCount;
  const std::string words = ConflictWords();
  if (!session.Quiet) Warning(context_, words);
  RefreshLists();
  if (!session.Quiet) {
    Warning(context_, Lines({words, "Please reselect teams."}));
    return RefreshLists();
  }
  // KEPT: a conflict that the results of the date hold already ends in the error box, since the
  // lists are refreshed in the middle of the look through the file; a repair would end the look.
  if (!is_last) throw RunTimeError(ErrorNumber::BadFileName);
}

std::string frmResults::ConflictWords() const {
  return Lines({Trim(record_.Team) + " versus " + Trim(record_.Opposition),
                "was played on " + LongDate(record_.GameDate) + ". Therefore",
                Trim(cboOpp.Text()) + " cannot play against either team."});
}

void frmResults::RefreshLists() {
  GetOpp();
  GetPlayers();
  Heading();
  AddOpp();
}

void frmResults::RePick() {
  ClearResults();
  fraResults.Hide();
  fraEdButtons.Hide();
  fraResControls.Show();
  fraTeams.Show();
  cboOpp.Enable();
  RefreshLists();
  EdCal.SetValue(Cal.Value());
  lstResPlayers.SetFocus();
}

}  // namespace marlowbeck
