#pragma once

#include <array>
#include <functional>
#include <optional>
#include <string>
#include <vector>

#include "data/date_steps.h"
#include "data/records.h"
#include "results/score_boxes.h"
#include "ui/context.h"
#include "ui/controls.h"
#include "ui/screen.h"

namespace marlowbeck {

class NextPlayer;
struct OppositionSwap;

/// Score sheets: from grade and date by way of team, opposition and player to the boxes of one
/// night, whose record goes to the results file of the grade. Layers of panels replace one another:
/// fraChangeGrade; fraTeams with fraResControls; fraResults with fraTeams beside it for a new
/// sheet, with fraEdButtons for one that is corrected.
struct frmResults : Screen {
  frmResults(Screens& screens, const Context& context);

  std::array<Label, 3> lblHeader = {Label{*this, "lblHeader(0)"}, Label{*this, "lblHeader(1)"},
                                    Label{*this, "lblHeader(2)"}};

  Panel fraChangeGrade{*this, "fraChangeGrade", "Select Grade and Game Date"};
  ComboBox cboResGrade{fraChangeGrade, "cboResGrade", "Grade"};
  DatePicker Cal{fraChangeGrade, "Cal", "Game Date"};
  TextBox txtDayName{fraChangeGrade, "txtDayName"};
  Command cmdGotoResults{fraChangeGrade, "cmdGotoResults", "OK"};
  Command cmdExit{fraChangeGrade, "cmdExit", "Cancel"};
  Command cmdHelp1{fraChangeGrade, "cmdHelp1", "Help"};

  Panel fraTeams{*this, "fraTeams", "Teams Selection"};
  ComboBox cboResTeam{fraTeams, "cboResTeam", "Team - (for Score entry)"};
  ComboBox cboOpp{fraTeams, "cboOpp", "Opposition - (Teams Available)"};
  Label lblPlayerList{fraTeams, "lblPlayerList"};
  ListBox lstResPlayers{fraTeams, "lstResPlayers"};
  Label lblEntered{fraTeams, "lblEntered"};
  ListBox lstFinished{fraTeams, "lstFinished"};
  Label lblPressF1{fraTeams, "lblPressF1", "  Press F1 for Help  "};

  Panel fraResControls{*this, "fraResControls", " Selections: "};
  Command cmdChangeGrade{fraResControls, "cmdChangeGrade", "Change Grade / Date"};
  Command cmdLeaveResults{fraResControls, "cmdLeaveResults", "Exit"};
  Panel panChangeOpp{fraResControls, "panChangeOpp"};
  Panel panAddNames{fraResControls, "panAddNames"};
  Panel fraDateSelector{fraResControls, "fraDateSelector", "Date Selector"};
  Command cmdFirst{fraDateSelector, "cmdFirst", "<<"};
  Command cmdPrevDate{fraDateSelector, "cmdPrevDate", "<"};
  Command cmdNextDate{fraDateSelector, "cmdNextDate", ">"};
  Command cmdLast{fraDateSelector, "cmdLast", ">>"};
  Command cmdMakeWorkDate{fraDateSelector, "cmdMakeWorkDate"};

  Panel fraResultsBDR{*this, "fraResultsBDR"};
  Panel fraResults{fraResultsBDR, "fraResults", "Enter Scores"};
  Panel panFirstName{fraResults, "panFirstName"};
  Panel panSurname{fraResults, "panSurname"};
  Label lblPlrID{fraResults, "lblPlrID", "Player ID"};
  Panel panPlrID{fraResults, "panPlrID"};
  ScoreBoxes scores;  // lies in fraResults
  Command cmdSave{fraResults, "cmdSave", "Save"};
  Command cmdClearRes{fraResults, "cmdClearRes", "Clear Scores"};
  Command cmdResultsCancel{fraResults, "cmdResultsCancel", "Cancel"};
  CheckBox chkFF{fraResults, "chkFF", "Register a Forfeit Only"};

  Panel fraEdButtons{*this, "fraEdButtons", "Edit Options"};
  DatePicker EdCal{fraEdButtons, "EdCal", "Change the game date here before saving if required."};
  Command cmdEdDelete{fraEdButtons, "cmdEdDelete", "Delete Scores"};

  Panel fraReDoOpp{*this, "fraReDoOpp"};
  Label lblReDoOpp{fraReDoOpp, "lblReDoOpp"};
  ComboBox cboReDoOpp{fraReDoOpp, "cboReDoOpp"};
  Command cmdSaveOp{fraReDoOpp, "cmdSaveOp", "Save"};
  Command SSCommand3{fraReDoOpp, "SSCommand3", "Cancel"};

  Panel panResAddPlayer{*this, "panResAddPlayer", "Add Player"};
  TextBox txtAddSn0{panResAddPlayer, "txtAddSn0", "Surname"};
  TextBox txtAddFn0{panResAddPlayer, "txtAddFn0", "First Name"};
  TextBox txtAddTm0{panResAddPlayer, "txtAddTm0", "Team"};
  TextBox txtAddGrd0{panResAddPlayer, "txtAddGrd0", "Grade"};
  Command cmdAddSave0{panResAddPlayer, "cmdAddSave0", "Save"};
  Command cmdAddCancel0{panResAddPlayer, "cmdAddCancel0", "Cancel"};
  Command SSCommand1{panResAddPlayer, "SSCommand1", "Help"};

  void Load() override;
  void Activate() override;
  void Unload() override;
  void HelpKey() override;

  // Grade and date.
  void Start();
  void StartAgain(const std::string& competition);
  void BackToGradeAndDate(bool over_teams);
  void StartScores();
  void UpdateTeamsInfo();
  void cmdExit_Click();
  void cmdChangeGrade_Click();
  void Cal_Change();

  // Team, players, opposition.
  void cboResTeam_Click();
  void cboOpp_Click();
  void Heading();
  void GetPlayers();
  void GetOpp();
  void AddOpp();
  /// The last guard before a score sheet opens: a team meets one opposition on a date.
  void ChangeOpp();
  void RePick();

  // Dates.
  /// TeamDates: the dates on which the team in hand has results of its own.
  void GetDates();
  void cmdFirst_Click();
  void cmdPrevDate_Click();
  void cmdNextDate_Click();
  void cmdLast_Click();
  void cmdMakeWorkDate_Click();

  // The score sheet.
  void lstResPlayers_Click();
  void GotPlayer();
  void lstFinished_Click();
  void GetOldScores();
  void GetNoP();
  void WhichBoxes();
  void ClearResults();
  void EnableBoxes();
  void DisableBoxes();
  void chkFF_Click();
  void cmdClearRes_Click();
  void EdCal_Change();

  // Its rules.
  void txtAgg_LostFocus();
  void CheckPeg(TextBox& peg);
  void PegHi(TextBox& peg);
  /// Leaves Flag at 1 when a rule is broken, at 0 when all is well, and as it stood when neither
  /// high score nor centuries nor 180s are entered.
  void CheckCenturies();
  void cmdSave_Click();

  // Putting right what was saved.
  void cmdEdDelete_Click();
  void panChangeOpp_Click();
  void cmdSaveOp_Click();

  // Somebody who is not listed yet.
  void panAddNames_Click();
  void cmdAddSave0_Click();
  void cmdAddCancel0_Click();

 private:
  void ListTeams();
  [[nodiscard]] bool FindTwoTeams();
  void OfferMoreTeams();
  void ShowDay(Date date);
  /// Reads the results file in order, until a visit answers false.
  void ForEachResult(const std::function<bool(const ResultView&, int)>& visit);
  void ReadRecord(int number);
  void RefreshLists();
  [[nodiscard]] std::string ConflictWords() const;
  void GoToDate(Date date, const char* asked_as);
  [[nodiscard]] bool FindPlayer(const ListBox& list);
  void ShowPlayer(const PlayerRecord& player);
  void OpenSavedResult();
  [[nodiscard]] int FindSavedResult();
  void ShowForCorrection();
  /// Back to the lists as they stand, without a look at the files: what the sheet was opened for
  /// cannot be done any more.
  void CloseSheet();
  [[nodiscard]] bool ScoresPass();
  void RestoreWhenEditing();
  [[nodiscard]] bool DateIsTaken();
  void KeepOldDate();
  void FillRecord();
  void WriteRecord();
  [[nodiscard]] int AskToDelete();
  /// Lets a work file without the record in hand take the place of the results.
  void PutInPlace(const std::string& work_file);
  void BackToTeams();
  [[nodiscard]] std::optional<std::string> SideThatMeets(const OppositionSwap& swap);
  void RefuseSwap(const OppositionSwap& swap, const std::string& side);
  [[nodiscard]] int AskToSwap(const OppositionSwap& swap, const std::string& opposition);
  void ChangeResults(const OppositionSwap& swap);
  void PutNewPlayer();
  [[nodiscard]] PlayerRecord PlayerToAdd(const NextPlayer& next) const;
  [[nodiscard]] bool EndsUnconfirmed();
  [[nodiscard]] bool IsOutOfOrder();
  void NameFileToSort();
  void OpenHelp(int topic);

  const Context& context_;
  /// Gone to add a team that a grade of this competition lacks.
  std::optional<std::string> away_from_;
  /// The one record buffer of the screen, in which readings of the results file leave their last
  /// record, and those of an empty file blanks; always read anew before a sheet opens.
  ResultRecord record_;
  int other_teams_ = 0;  ///< of the grade, as GetOpp last counted them
  /// A player written from the open panel whose save has not come to its end.
  std::optional<PlayerBytes> unconfirmed_;
};

}  // namespace marlowbeck
