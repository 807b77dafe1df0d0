// The entry panel: the matches of the work date, and the teams that have none yet.

#include "data/competition.h"
#include "data/text.h"
#include "ladder/frmLadder.h"
#include "ladder/match_lines.h"

namespace marlowbeck {
namespace {

constexpr const char* kSelectHome = "Select HOME TEAM";
constexpr const char* kSelectAway = "Select AWAY TEAM";
constexpr const char* kNoTeams = "No Teams to Enter";

}  // namespace

void frmLadder::EnterScores() {
  EmptyPanel();
  try {
    FillPanel();
  } catch (const RunTimeError&) {
    EmptyPanel();
    throw;
  }
}

void frmLadder::FillPanel() {
  fraScores.Show();
  fraScores.Enable();
  fraScoresIn.Show();
  session_.Grade = Trim(cboResGrade.Text());
  GetNewFileName();
  GetTeams();
  for (const std::string& team : TeamList) lstTeams.AddLine(team);
  fraChangeGrade.Hide();
  OpenConfig();
  ShowWorkDate();
  session_.LadderDate = session_.WorkDate;
  SaveWorkdate();
  lblHeader[0].SetCaption(session_.Grade);
  lblHeader[1].SetCaption(LongDate(session_.WorkDate));
  ListDone();
  if (lstTeams.Count() == 0) lblHomeAway.SetCaption(kNoTeams);
  GetDates();
}

/// Whatever of a grade and date stands there goes: should the panel not come to be filled, nothing
/// must be saved or put right under another grade or date.
void frmLadder::EmptyPanel() {
  BlankEntry();
  lstTeams.Clear();
  lstDone.Clear();
  for (Label& header : lblHeader) header.SetCaption({});
}

void frmLadder::BlankEntry() {
  cmdRecord.Disable();
  for (TextBox* box : {&txtHome, &txtAway, &txtHomeScore, &txtAwayScore}) box->SetText({});
  cmdHomeBack.Disable();
  cmdBackAway.Disable();
  unconfirmed_.reset();
  lstTeams.Enable();
  lblHomeAway.SetCaption(kSelectHome);
}

/// Lists the matches of the date; their teams have played and are taken out of the list of teams.
void frmLadder::ListDone() {
  OpenLadderFile(session_, context_.channels);
  context_.channels.ForEachRecord(Channel::Ladder, [&](Bytes bytes, int) {
    const LadderView match(bytes);
    if (match.GameDate() != session_.WorkDate) return;
    lstDone.AddLine(LineOfRecord(match));
    TakeOutTeams(match);
  });
  context_.channels.CloseAll();
}

/// The blank team of a bye is nobody.
void frmLadder::TakeOutTeams(const LadderView& match) {
  for (const std::string_view team : {match.HomeTeam(), match.AwayTeam()}) {
    const int line = team.empty() ? -1 : lstTeams.Find(team);
    if (line >= 0) lstTeams.RemoveLine(line);
  }
}

void frmLadder::lstTeams_Click() {
  const int line = lstTeams.Index();
  if (line < 0) return;
  const std::string team = lstTeams.Line(line);
  if (txtHome.Text().empty() && lblHomeAway.Caption() == kSelectHome) {
    session_.SelectedHome = team;
    lstTeams.RemoveLine(line);
    txtHome.SetText(team);
    lblHomeAway.SetCaption(kSelectAway);
  } else if (txtAway.Text().empty() && lblHomeAway.Caption() == kSelectAway) {
    session_.SelectedAway = team;
    lstTeams.RemoveLine(line);
    txtAway.SetText(team);
    lblHomeAway.SetCaption(kSelectHome);
  }
}

void frmLadder::lstTeams_MouseUp() {
  const bool both = !txtHome.Text().empty() && !txtAway.Text().empty();
  if (!both && lstTeams.Count() > 0) return;
  lblHomeAway.SetCaption({});
  txtHomeScore.SetFocus();
  lstTeams.Disable();
}

void frmLadder::cmdHomeBack_Click() {
  if (txtHome.Text().empty()) return;
  lstTeams.AddLine(txtHome.Text());
  txtHome.SetText({});
  txtHomeScore.SetText({});
  if (txtAway.Text().empty()) txtAwayScore.SetText({});
  lblHomeAway.SetCaption(kSelectHome);
  lstTeams.Enable();
  lstTeams.SetFocus();
  cmdHomeBack.Disable();
}

void frmLadder::cmdBackAway_Click() {
  if (txtAway.Text().empty()) return;
  lstTeams.AddLine(txtAway.Text());
  txtAway.SetText({});
  txtAwayScore.SetText({});
  if (txtHome.Text().empty()) txtHomeScore.SetText({});
  lblHomeAway.SetCaption(txtHome.Text().empty() ? kSelectHome : kSelectAway);
  lstTeams.Enable();
  lstTeams.SetFocus();
  cmdBackAway.Disable();
}

void frmLadder::CanRecord() {
  const bool match = !txtHome.Text().empty() && !txtHomeScore.Text().empty() &&
                     !txtAway.Text().empty() && !txtAwayScore.Text().empty();
  const bool bye = !txtHome.Text().empty() && UpperCase(txtHomeScore.Text()) == "B" &&
                   txtAway.Text().empty() && txtAwayScore.Text().empty();
  cmdRecord.SetEnabled(match || bye);
}

void frmLadder::AfterRecording() {
  BlankEntry();
  if (lstTeams.Count() == 0) lblHomeAway.SetCaption(kNoTeams);
  lstTeams.SetFocus();
  // KEPT: the one team that is left cannot be picked for its bye until the panel is filled anew; a
  // repair would leave the list enabled.
  if (lstTeams.Count() == 1) lstTeams.Disable();
}

}  // namespace marlowbeck
