// From grade and date to the lists of a team's players.

#include "data/competition.h"
#include "data/text.h"
#include "results/frmResults.h"
#include "results/player_listing.h"
#include "session/messages.h"
#include "session/shared_procedures.h"
#include "ui/screens.h"

namespace marlowbeck {

void frmResults::Start() {
  for (Panel* panel : {&fraResControls, &fraResults, &fraEdButtons}) panel->Hide();
  fraChangeGrade.Show();
  ReadFileName(context_);
  Session& session = context_.session;
  if (session.PlayerFile.empty()) return nofile(context_, InScreens(), Beep::No);
  try {
    session.WorkDate = ReadWorkDate(context_.channels);
  } catch (const RunTimeError&) {
    context_.channels.AbandonAll();
    nofile(context_, InScreens(), Beep::No);
    if (!session.WorkDate.IsSet()) return;
  }
  ShowDay(session.WorkDate);
  GetGrades(context_, cboResGrade);
  if (cboResGrade.Count() > 0) cboResGrade.SetIndex(0);
}

/// Back from the setup, which may have added and removed grades: what was picked stands as it was,
/// unless another competition has been opened since `competition` was left.
void frmResults::StartAgain(const std::string& competition) {
  const std::string grade = cboResGrade.Text();
  const Date day = Cal.Value();
  Start();
  if (context_.session.PlayerFile != competition) return;
  Cal.SetValue(day);
  txtDayName.SetText(DayName(day));
  if (const int line = cboResGrade.Find(grade); line >= 0) cboResGrade.SetIndex(line);
}

/// The work date, both date pickers and the name of the day become those of a date.
void frmResults::ShowDay(Date date) {
  // A date that no calendar holds fails here, before anything has moved.
  const std::string day = DayName(date);
  context_.session.WorkDate = date;
  Cal.SetValue(date);
  EdCal.SetValue(date);
  txtDayName.SetText(day);
}

void frmResults::Cal_Change() {
  txtDayName.SetText(DayName(Cal.Value()));
  cmdGotoResults.SetFocus();
}

void frmResults::cmdChangeGrade_Click() {
  fraResControls.Hide();
  fraTeams.Disable();
  Start();
}

void frmResults::StartScores() {
  Session& session = context_.session;
  session.Team.clear();
  session.Grade = Trim(cboResGrade.Text());
  OpenFile(session, context_.channels);
  const bool two_teams = !session.PlayerFile.empty() && FindTwoTeams();
  context_.channels.CloseAll();
  if (!two_teams) return OfferMoreTeams();
  fraResControls.Show();
  // The teams are listed for the date picked here, not for the one that was worked on before.
  session.WorkDate = Cal.Value();
  EdCal.SetValue(session.WorkDate);
  const bool over_teams = fraTeams.Visible();
  try {
    UpdateTeamsInfo();
  } catch (const RunTimeError&) {
    if (fraChangeGrade.Visible()) BackToGradeAndDate(over_teams);
    throw;
  }
  cmdMakeWorkDate.SetCaption("Work Date: " + ShortDate(session.WorkDate));
}

/// The teams could not be listed: what was up for them would lie over what is to be picked again.
void frmResults::BackToGradeAndDate(bool over_teams) {
  fraResControls.Hide();
  fraTeams.SetVisible(over_teams);
  fraTeams.Disable();
}

/// The first player of the grade gives the team in hand; a later one of another team is the second.
bool frmResults::FindTwoTeams() {
  Session& session = context_.session;
  bool first_found = false;
  bool second_found = false;
  context_.channels.ForEachRecord(Channel::Players, [&](Bytes bytes, int) {
    const PlayerView player(bytes);
    if (player.Grade() != session.Grade) return true;
    if (!first_found) session.Team = player.Team();
    first_found = true;
    second_found = player.Team() != session.Team;
    return !second_found;
  });
  return second_found;
}

void frmResults::OfferMoreTeams() {
  const std::string grade = context_.session.Grade;
  const int answer = WarningYesNo(
      context_, Lines({"There is only one team listed for " + grade + ".", "",
                       "Before you can enter results, there must be at least TWO teams",
                       "in the one grade. This allows the opposition team to be recorded.", "",
                       "You can return to Results Entry from the Main Menu after adding",
                       "more teams, or you can click NO to select another grade.", "",
                       "Do you wish to add more teams now ?"}));
  if (answer == kAnswerNo || !InScreens().Knows("frmNames")) return;
  context_.session.Flag = 1;
  away_from_ = context_.session.PlayerFile;
  InScreens().Hide(*this);
  InScreens().Show("frmNames");
}

void frmResults::UpdateTeamsInfo() {
  Session& session = context_.session;
  ClearResults();
  fraResults.Hide();
  fraTeams.Show();
  fraTeams.Enable();
  session.Grade = Trim(cboResGrade.Text());
  NameGradeFiles(session);
  ListTeams();
  GetPlayers();
  Heading();
  AddOpp();
  context_.GoToWorkingFolder();
  WriteWorkDate(context_.channels, session.WorkDate);
  if (cboResTeam.Text().empty()) fraResControls.Hide();
  Heading();
  if (cboResTeam.Count() > 0) cboResTeam.SetIndex(0);
}

/// The first team stands in the combo at once; it is picked, with all that follows from that, when
/// the rest is ready.
void frmResults::ListTeams() {
  GetTeams(context_, context_.session.Grade, cboResTeam);
  if (cboResTeam.Count() > 0) cboResTeam.SetText(cboResTeam.Line(0));
}

void frmResults::cboResTeam_Click() {
  Session& session = context_.session;
  for (Panel* panel : {&panSurname, &panFirstName, &panPlrID}) panel->SetCaption("");
  session.Team = Trim(cboResTeam.Text());
  fraResults.Hide();
  GetOpp();
  GetPlayers();
  if (other_teams_ % 2 == 0) {
    if (cboOpp.Text().empty()) {
      lstResPlayers.Disable();
      Warning(context_,
              Lines({session.Team + " Team cannot play.", "", "No available opposition teams."}));
    }
    if (cboOpp.Count() > 0) lstResPlayers.Enable();
  }
  // KEPT: in a grade with an even number of teams the list of players stays as it was when no
  // opposition is left, and a result can then be saved against nobody; a repair would disable it.
  GetDates();
  Heading();
  AddOpp();
  if (cboOpp.Text().empty()) lblHeader[2].SetCaption("");
}

void frmResults::Heading() {
  Session& session = context_.session;
  fraChangeGrade.Hide();
  for (Label& header : lblHeader) header.Show();
  lblHeader[0].SetCaption(session.Grade);
  lblHeader[1].SetCaption(LongDate(Cal.Value()));
  session.WorkDate = Cal.Value();
  lblHeader[2].SetCaption(Trimmed(UpperCase(session.Team) + "  v's  " + UpperCase(cboOpp.Text())));
  lblPlayerList.SetCaption(Lines({session.Team, "Players"}));
}

void frmResults::GetPlayers() {
  lstResPlayers.Clear();
  lstFinished.Clear();
  cboResTeam.Enable();
  const PlayerListing listing =
      ReadPlayerListing(context_.session, context_.channels, Trimmed(cboOpp.Text()));
  for (const std::string& line : listing.ToEnter()) lstResPlayers.AddLine(line);
  for (const std::string& line : listing.Entered()) lstFinished.AddLine(line);
  const int entered = lstFinished.Count();
  lblEntered.SetCaption(
      entered > 0 ? "Entered Players = " + std::to_string(entered) + "  [Click to Edit]" : "");
  if (entered > 0) cboOpp.Disable();
}

}  // namespace marlowbeck
