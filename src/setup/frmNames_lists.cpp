// The lists of the setup screen: grades, teams, players, and what is picked or added in them.

#include <algorithm>

#include "data/text.h"
#include "session/messages.h"
#include "setup/frmNames.h"
#include "setup/player_names.h"

namespace marlowbeck {
namespace {

/// Fills a combo and makes its first line the current one.
void Fill(ComboBox& combo, const std::vector<std::string>& names) {
  combo.Clear();
  for (const std::string& name : names) combo.AddLine(name);
  if (combo.Count() > 0) combo.SetIndex(0);
}

/// Adds a line in its place among the sorted ones, once, and makes it the text.
void AddAndSelect(ComboBox& combo, const std::string& name) {
  std::vector<std::string> lines = combo.Lines();
  const auto place = std::ranges::lower_bound(lines, name);
  if (place == lines.end() || *place != name) lines.insert(place, name);
  combo.Clear();
  for (const std::string& line : lines) combo.AddLine(line);
  combo.SetText(name);
}

}  // namespace

void frmNames::GetGrades() {
  OpenPlayers();
  const std::vector<std::string> grades = AllGrades(context_.channels);
  context_.channels.CloseAll();
  Fill(cboAddGrd, grades);
}

void frmNames::GetTeams() {
  OpenPlayers();
  const std::vector<std::string> teams = AllTeams(context_.channels);
  context_.channels.CloseAll();
  Fill(cboAddTm, teams);
}

void frmNames::PlayerList() {
  lstPlayers.Clear();
  const std::string team = Trim(cboAddTm.Text());
  const std::string grade = Trim(cboAddGrd.Text());
  OpenPlayers();
  const std::vector<std::string> players = PlayersOf(context_.channels, team, grade);
  context_.channels.CloseAll();
  for (const std::string& player : players) {
    lstPlayers.AddLine(player);
    // KEPT: a team without players leaves the number of the one before; a repair would clear it.
    lblHMP.SetCaption("Players: (" + std::to_string(lstPlayers.Count()) +
                      ")  Select to Edit or Delete");
  }
  panTM.SetCaption(team);
  panGR.SetCaption(grade);
}

void frmNames::cboAddGrd_Change() {
  PlayerList();
  CheckNoP();
  PegsDescription();
}

void frmNames::lstPlayers_Click() {
  ButtonsOFF();
  cmdClear.Show();
  fraNamesMenu.Show();
  panAddPlayer.Disable();
  ClearNames();
  lblEdName.SetCaption(lstPlayers.Line(lstPlayers.Index()));
  lblEdTeam.SetCaption(Trimmed(cboAddTm.Text()));
  lblEdgrade.SetCaption(Trimmed(cboAddGrd.Text()));
  fraAddNames.SetCaption(" Edit Player ");
}

void frmNames::cmdCancelDel_Click() {
  session_.Flag = 0;
  fraNamesMenu.Hide();
  EnablePanel(kSetupCaption);
  FreeCombos();
  ButtonsON();
  PlayerList();
  ClearNames();
  cmdClear.Hide();
  Reset();
}

void frmNames::cmdClear_Click() {
  const std::string grade = cboAddGrd.Text();
  const std::string team = cboAddTm.Text();
  session_.Flag = 0;
  session_.EditRecord = 0;
  Reset();
  FreeCombos();
  PutGradeAndTeamBack(grade, team);
}

void frmNames::cmdNewGrd_Click() {
  AskForNewName("Enter NEW grade name", "Add NEW grade Name", GradeInUse, cboAddGrd);
}

void frmNames::cmdNewTm_Click() {
  AskForNewName("Enter NEW team name", "Add NEW team Name", TeamInUse, cboAddTm);
}

/// A new name stands in its list only: it is written with the first player who carries it.
void frmNames::AskForNewName(const std::string& prompt, const std::string& title, InUse in_use,
                             ComboBox& combo) {
  WithButtonsOff([&] {
    const std::string reply = context_.platform.boxes.Input({prompt, title, {}, {}});
    if (!Trimmed(reply).empty()) AddNewName(reply, in_use, combo);
    BackToNames();
  });
}

void frmNames::AddNewName(const std::string& name, InUse in_use, ComboBox& combo) {
  OpenPlayers();
  const bool taken = in_use(context_.channels, name);
  context_.channels.CloseAll();
  if (taken) {
    Warning(context_, name + " is already in use.    ");
  } else {
    AddAndSelect(combo, name);
  }
}

}  // namespace marlowbeck
