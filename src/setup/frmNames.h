#pragma once

#include <string>
#include <vector>

#include "setup/best_of_three_boxes.h"
#include "setup/player_names.h"
#include "ui/context.h"
#include "ui/controls.h"
#include "ui/screen.h"

namespace marlowbeck {

/// Where a competition gets its people. It has two faces: the entry of the first player of an empty
/// file, and the lists with the entry of further ones. A grade or a team is nothing but the text
/// that its players carry.
struct frmNames : Screen {
  frmNames(Screens& screens, const Context& context);

  // The first player.
  Panel panAddPlayer0{*this, "panAddPlayer0", "ADD: Player, Team and Grade"};
  Label Label9{panAddPlayer0, "Label9",
               "This is the entry section for the first player in your NEW FILE."};
  TextBox txtAddSn0{panAddPlayer0, "txtAddSn0", "Surname"};
  TextBox txtAddFn0{panAddPlayer0, "txtAddFn0", "First Name"};
  TextBox txtAddTm0{panAddPlayer0, "txtAddTm0", "Team"};
  TextBox txtAddGrd0{panAddPlayer0, "txtAddGrd0", "Grade"};
  Panel fraNoP{panAddPlayer0, "fraNoP", "Select BEST of THREE games"};
  BestOfThreeBoxes first_boxes{fraNoP,
                               {"chkTriples", "chkDoubles", "chkSingles", "chkAll", "chkNone"}};
  Command cmdAddSave0{panAddPlayer0, "cmdAddSave0", "Save"};
  Command cmdAddCancel0{panAddPlayer0, "cmdAddCancel0", "Exit"};
  Command cmdHelp3{panAddPlayer0, "cmdHelp3", "Help"};

  // Further players.
  Panel panAddPlayer{*this, "panAddPlayer", " Setup :    Teams, Grades and Players "};
  Panel fraAddNames{panAddPlayer, "fraAddNames", "Add New Players"};
  TextBox txtAddSn{fraAddNames, "txtAddSn", "Surname"};
  TextBox txtAddFn{fraAddNames, "txtAddFn", "First Name"};
  Command cmdAddSave{fraAddNames, "cmdAddSave", "Save"};
  Command cmdClear{fraAddNames, "cmdClear", "Cancel Edit"};
  Panel fraGT3{panAddPlayer, "fraGT3"};
  ComboBox cboAddGrd{fraGT3, "cboAddGrd", "All Grades:", ComboBox::Typing::Free};
  ComboBox cboAddTm{fraGT3, "cboAddTm", "All Teams:", ComboBox::Typing::Free};
  Label lblNoP{fraGT3, "lblNoP"};
  Panel fraPList{panAddPlayer, "fraPList", "Players List"};
  Panel panGR{fraPList, "panGR"};
  Panel panTM{fraPList, "panTM"};
  Label lblHMP{fraPList, "lblHMP"};
  ListBox lstPlayers{fraPList, "lstPlayers"};
  Panel fraBoT{panAddPlayer, "fraBoT", "BEST of THREE games"};
  BestOfThreeBoxes grade_boxes{fraBoT, {"chkTrip", "chkDoub", "chkSing", "chkEvery", "chkNun"}};
  Command cmdNoPOK{fraBoT, "cmdNoPOK", "OK"};
  Command cmdCancelBo3{fraBoT, "cmdCancelBo3", "Cancel"};
  Panel fraButtons{panAddPlayer, "fraButtons"};
  Command cmdNewGrd{fraButtons, "cmdNewGrd", "Add New Grade"};
  Command cmdEdGradeName{fraButtons, "cmdEdGradeName", "Edit Grade Name"};
  Command cmdNewTm{fraButtons, "cmdNewTm", "Add New Team"};
  Command cmdEdTeamName{fraButtons, "cmdEdTeamName", "Edit Team Name"};
  Command cmdEdBOT{fraButtons, "cmdEdBOT", "Edit Best of 3"};
  Command cmdAddCancel{fraButtons, "cmdAddCancel", "Exit"};
  Command cmdSearch{panAddPlayer, "cmdSearch", "Search Players"};
  Command cmdHelpNames{panAddPlayer, "cmdHelpNames", "Help"};

  // What to do with a player picked in the list.
  Panel fraNamesMenu{*this, "fraNamesMenu", "Edit or Delete a player from file"};
  Label lblEdName{fraNamesMenu, "lblEdName"};
  Label lblEdTeam{fraNamesMenu, "lblEdTeam"};
  Label lblEdgrade{fraNamesMenu, "lblEdgrade"};
  Command cmdEdName{fraNamesMenu, "cmdEdName", "Edit"};
  Command cmdDelName{fraNamesMenu, "cmdDelName", "Delete"};
  Command cmdCancelDel{fraNamesMenu, "cmdCancelDel", "Cancel"};

  void Activate() override;
  void Unload() override;

  // The state of the screen.
  void Reset();
  void ClearAdd();
  void ButtonsOFF();
  void ButtonsON();
  void cmdAddCancel_Click();
  void cmdSearch_Click();

  // The lists.
  void GetGrades();
  void GetTeams();
  void PlayerList();
  void cboAddGrd_Change();
  void lstPlayers_Click();
  void cmdCancelDel_Click();
  void cmdClear_Click();
  void cmdNewGrd_Click();
  void cmdNewTm_Click();

  // Players.
  void cmdAddSave0_Click();
  bool SaveNewPlayer0();
  void cmdAddSave_Click();
  bool SaveNewPlayer();
  void cmdEdName_Click();
  void cmdDelName_Click();

  // Other names for grades and teams.
  void cmdEdGradeName_Click();
  void cmdEdTeamName_Click();

  // Best of Three.
  void CheckNoP();
  void GetPegs();
  void NewGradePegs();
  void NewPegs0();
  void PegsDescription();
  void cmdEdBOT_Click();
  void cmdNoPOK_Click();
  void cmdCancelBo3_Click();

 private:
  static constexpr const char* kSetupCaption = " Setup :    Teams, Grades and Players ";

  /// Whether a name is in use already, looked for in the open player file.
  using InUse = bool (*)(Channels& channels, std::string_view name);

  void WireFirstPlayer();
  void WirePlayers();
  void ReadOpenCompetition();
  void ResetToFirstPlayer();
  void ResetToLists();
  void ShowBestOfThree(bool shown);
  void EnableButtons(bool enabled);
  void WithButtonsOff(const Handler& work);
  void BackToNames();
  void HoldCombos(bool held);
  void FreeCombos();
  void EnablePanel(const char* caption);
  void ClearNames();
  void NamesChanged();
  void PutGradeAndTeamBack(const std::string& grade, const std::string& team);

  void NameFilesOfGrade();
  void OpenPlayers();
  void OpenResultSFile();
  void AskForNewName(const std::string& prompt, const std::string& title, InUse in_use,
                     ComboBox& combo);
  void AddNewName(const std::string& name, InUse in_use, ComboBox& combo);
  [[nodiscard]] bool AnyBoxTicked() const;
  void PutFirstPlayer();
  void PutPlayer();
  void PutEdited(const PlayerRecord& player);
  void Append(const PlayerRecord& player);

  [[nodiscard]] ListedLine PickedLine() const;
  void TakeUp(const ListedPlayer& player);
  void LockPlayerWithResults();
  void FindDoomed();
  [[nodiscard]] int CountResults();
  void DeletePlayer(int results);
  void BackFromDeletion();

  void TakeGradeAndTeam();
  [[nodiscard]] std::string AskForOtherName(const std::string& title, const std::string& name);
  [[nodiscard]] bool IsFree(std::string_view name, InUse in_use);
  void RenameGrade(const std::string& name);
  void RenameFilesOfGrade(const std::string& name);
  void RenameTeam(const std::string& name);

  bool FindBestOfThree();
  void RefuseBestOfThree();
  void ChangeBestOfThree();
  void CloseBestOfThree();

  const Context& context_;
  Session& session_;
};

}  // namespace marlowbeck
