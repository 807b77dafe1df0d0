#pragma once

#include <array>
#include <optional>
#include <string>
#include <vector>

#include "data/records.h"
#include "ladder/ladder_rows.h"
#include "ladder/print_tables.h"
#include "print/font_box.h"
#include "print/print_panel.h"
#include "ui/context.h"
#include "ui/controls.h"
#include "ui/screen.h"

namespace marlowbeck {

/// The premiership ladder of a grade: matches of a date are entered and corrected on the Scores
/// tab, the table up to any date stands on the ladder tab, and the rules of the table are set on
/// the Configuration tab. Everything is worked out from the ladder file of the grade in hand.
struct frmLadder : Screen {
  frmLadder(Screens& screens, const Context& context);

  // The tabs.
  Panel fraButtons{*this, "fraButtons"};
  Command cmdSC{fraButtons, "cmdSC", "Scores"};
  Command cmdPL{fraButtons, "cmdPL", "Premiership Ladder"};
  Command cmdCF{fraButtons, "cmdCF", "Configuration"};
  Command cmdExitLadder{fraButtons, "cmdExitLadder", "Exit"};

  // Scores: grade and date on the panel that stands over the rest until it is answered.
  Panel fraSC{*this, "fraSC"};
  /// Of the entry panel and of the edit panel, which take turns under it.
  std::array<Label, 2> lblHeader = {Label{fraSC, "lblHeader(0)"}, Label{fraSC, "lblHeader(1)"}};
  Panel fraChangeGrade{fraSC, "fraChangeGrade", "Select grade and Game date"};
  ComboBox cboResGrade{fraChangeGrade, "cboResGrade", "Grade"};
  DatePicker Cal{fraChangeGrade, "Cal", "Game Date"};
  TextBox txtDayName{fraChangeGrade, "txtDayName"};
  Command cmdGotoResults{fraChangeGrade, "cmdGotoResults", "OK"};
  Command cmdCancelCal{fraChangeGrade, "cmdCancelCal", "Exit"};
  Command cmdHelp1{fraChangeGrade, "cmdHelp1", "Help"};

  // A match of the date: two teams off the list, and their scores.
  Panel fraScores{fraSC, "fraScores", "Enter Scores"};
  Panel fraScoresIn{fraScores, "fraScoresIn", "Score Entry"};
  Label lblHomeAway{fraScoresIn, "lblHomeAway", "Select HOME TEAM"};
  ListBox lstTeams{fraScoresIn, "lstTeams"};
  TextBox txtHome{fraScoresIn, "txtHome", "Home Team:"};
  TextBox txtHomeScore{fraScoresIn, "txtHomeScore"};
  TextBox txtAway{fraScoresIn, "txtAway", "Away Team:"};
  TextBox txtAwayScore{fraScoresIn, "txtAwayScore"};
  Command cmdRecord{fraScoresIn, "cmdRecord", "Save"};
  Command cmdHomeBack{fraScoresIn, "cmdHomeBack", "<< Back"};
  Command cmdBackAway{fraScoresIn, "cmdBackAway", "<< Back"};

  Panel Frame3{fraScores, "Frame3", " Recorded Scores - Click on Teams to Edit or Delete scores. "};
  ListBox lstDone{Frame3, "lstDone"};
  Panel Frame2{fraScores, "Frame2", "Dates Played"};
  Command cmdFirst{Frame2, "cmdFirst", "<<"};
  Command cmdPrevDate{Frame2, "cmdPrevDate", "<"};
  Command cmdNextDate{Frame2, "cmdNextDate", ">"};
  Command cmdLast{Frame2, "cmdLast", ">>"};
  Command cmdChangeGrade{fraScores, "cmdChangeGrade", "Change Grade and Date"};
  Command SSCommand2{fraScores, "SSCommand2", "Help"};
  Command cmdExit{fraScores, "cmdExit", "Exit"};

  // A recorded match to be put right, in the place of the entry boxes.
  Panel fraEdScore{fraSC, "fraEdScore", "Edit Scores"};
  TextBox txtEdHome{fraEdScore, "txtEdHome", "Home Team:"};
  TextBox txtEdHomeScore{fraEdScore, "txtEdHomeScore"};
  TextBox txtEdAway{fraEdScore, "txtEdAway", "Away Team:"};
  TextBox txtEdAwayScore{fraEdScore, "txtEdAwayScore"};
  Panel fraEdCal{fraEdScore, "fraEdCal", "Change Game Date"};
  DatePicker EdCal{fraEdCal, "EdCal", "Change the game date here before saving if required."};
  Command cmdSaveEdit{fraEdScore, "cmdSaveEdit", "Save"};
  Command cmdDeleteEdit{fraEdScore, "cmdDeleteEdit", "Delete"};
  Command cmdCancelEdit{fraEdScore, "cmdCancelEdit", "Cancel"};

  // The ladder up to a date, and the matches of that date.
  Panel fraPL{*this, "fraPL"};
  Label lblSeason{fraPL, "lblSeason"};
  Label Label10{fraPL, "Label10", "Select Grade"};
  ComboBox cboTGrades{fraPL, "cboTGrades"};
  Label Label11{fraPL, "Label11", "Select Date"};
  ListBox lstTableDates{fraPL, "lstTableDates"};
  Panel fraViewLadder{fraPL, "fraViewLadder"};
  Label lblLadHeader{fraViewLadder, "lblLadHeader"};
  Grid grdLad{fraViewLadder, "grdLad"};
  Label lblGameDetails{fraViewLadder, "lblGameDetails"};
  Grid grdWk{fraViewLadder, "grdWk"};
  Panel fraFontPick{fraPL, "fraFontPick", "Printer Font"};
  FontLabel lblFont{fraFontPick, "lblFont"};
  Label lblPrFont{fraFontPick, "lblPrFont"};
  Label lblFontInfo{fraPL, "lblFontInfo", " Click to change font. "};
  Panel fraCmds{fraPL, "fraCmds"};
  Command cmdPrintLad{fraCmds, "cmdPrintLad", "Printer"};
  Command cmdClipLadder{fraCmds, "cmdClipLadder", "Copy to Clipboard"};
  Command cmdPenalty{fraCmds, "cmdPenalty", "Adjust Points"};
  Panel fraHelpExit{fraPL, "fraHelpExit"};
  Command Command2{fraHelpExit, "Command2", "Help"};
  Command Command1{fraHelpExit, "Command1", "Exit"};

  // Points given to a team, or taken from it, for its match of the date.
  Panel fraPenalty{*this, "fraPenalty", "Adjust Points"};
  Panel Frame4{fraPenalty, "Frame4"};
  Label Label12{Frame4, "Label12", "Select Team"};
  ListBox lstPenalty{Frame4, "lstPenalty"};
  Command cmdCancel2{Frame4, "cmdCancel2", "Cancel"};
  Panel fraPenPts{*this, "fraPenPts", "Adjust Points"};
  Label Label13{fraPenPts, "Label13", "Team:"};
  Label lblPen2{fraPenPts, "lblPen2"};
  Label Label14{fraPenPts, "Label14", "Date:"};
  Label lblPen3{fraPenPts, "lblPen3"};
  Label lblPen1{fraPenPts, "lblPen1"};
  TextBox txtPenPts{fraPenPts, "txtPenPts"};
  Command cmdPenOK{fraPenPts, "cmdPenOK", "OK"};
  Command cmdPenCancel{fraPenPts, "cmdPenCancel", "Cancel"};

  // What to print.
  Panel fraPO{*this, "fraPO", "Printer Options"};
  std::array<OptionButton, 3> optBoth = {
      OptionButton{fraPO, "optBoth(0)", "        Game Results ONLY"},
      OptionButton{fraPO, "optBoth(1)", "Premiership Ladder ONLY"},
      OptionButton{fraPO, "optBoth(2)", "  BOTH Results and Ladder"}};
  Label Label8{fraPO, "Label8", "How many Centimeters from Top of Page ?"};
  ComboBox cboFromTop{fraPO, "cboFromTop", {}, ComboBox::Typing::Free};
  Label lblCopies{fraPO, "lblCopies", "Number of Copies:"};
  TextBox txtNoC{fraPO, "txtNoC"};
  Label lblPrinter{fraPO, "lblPrinter", "Printer:"};
  Label lblPrinterName{fraPO, "lblPrinterName"};
  Label Label15{fraPO, "Label15", "Orientation:"};
  Label lblOrient{fraPO, "lblOrient"};
  Command cmdPrinterSetup{fraPO, "cmdPrinterSetup", "Printer Setup"};
  Command SSCommand5{fraPO, "SSCommand5", "Help"};
  Command cmdBothOK{fraPO, "cmdBothOK", "Print"};
  Command cmdBothCancel{fraPO, "cmdBothCancel", "Cancel"};

  // The rules of the table.
  Panel fraCF{*this, "fraCF"};
  Panel fraConfig{fraCF, "fraConfig", "Configuration"};
  TextBox cfgGrade{fraConfig, "cfgGrade", "Current Grade:"};
  TextBox cfgGames{fraConfig, "cfgGames", "Games played in a Match:"};
  TextBox cfgWin{fraConfig, "cfgWin", "Points for a Win:"};
  TextBox cfgLoss{fraConfig, "cfgLoss", "Points for a Loss:"};
  TextBox cfgDraw{fraConfig, "cfgDraw", "Points for a Draw:"};
  TextBox cfgFinals{fraConfig, "cfgFinals", "Number of Teams to play in Finals:"};
  Command cmdSaveConfig{fraConfig, "cmdSaveConfig", "Save"};
  Command cmdCancel{fraConfig, "cmdCancel", "Cancel"};

  void Load() override;
  void Activate() override;
  void Unload() override;
  void HelpKey() override;

  // Opening, and the tabs.
  void Start();
  void CheckButtons();
  void setTAB0();
  void setTAB1();
  void setTAB2();
  void Cal_Change();
  void cmdGotoResults_Click();
  void cmdCancelCal_Click();
  void cmdChangeGrade_Click();
  void GetNewFileName();
  /// TeamList and TeamCount: the teams of the grade in hand.
  void GetTeams();
  void GetWorkDate();
  void SaveWorkdate();

  // The rules.
  /// Reads the rules of the grade in hand and shows them; makes a file with the usual ones, and
  /// says so, where they cannot be read.
  void OpenConfig();
  void cmdSaveConfig_Click();
  void cmdCancel_Click();

  // Scores.
  void EnterScores();
  void lstTeams_Click();
  /// The list of teams has been clicked, or picked from by a key.
  void lstTeams_MouseUp();
  void cmdHomeBack_Click();
  void cmdBackAway_Click();
  void CanRecord();
  void cmdRecord_Click();
  /// Puts the ladder file of the grade in hand in date order.
  void SortLadderFile();
  /// DateList and DateCount: the dates of the ladder file.
  void GetDates();

  // The walk along the dates.
  void cmdFirst_Click();
  void cmdPrevDate_Click();
  void cmdNextDate_Click();
  void cmdLast_Click();

  // Putting right what was recorded.
  void lstDone_Click();
  void EdCal_Change();
  void cmdSaveEdit_Click();
  void cmdDeleteEdit_Click();
  void cmdCancelEdit_Click();

  // The table.
  void cboTGrades_Click();
  void lstTableDates_Click();
  void EraseArrays();
  void GetGameResults();
  void WorkOutTable();
  void GridLadder();
  void ClearGrids();

  // Points given and taken.
  void cmdPenalty_Click();
  void lstPenalty_Click();
  void SavePen();
  void cmdPenCancel_Click();

  // Printing and copying.
  void cmdPrintLad_Click();
  void cmdBothOK_Click();
  void Weekly();
  void Ladder();
  void PrintBoth();
  void cmdClipLadder_Click();

  // Of the grade in hand.
  std::vector<std::string> TeamList;
  LadderRows rows;  ///< the table, as last worked out

 private:
  void Wire();
  void WireScores();
  void WireEditing();
  void WireTable();
  void WirePrinting();
  void ShowAtStart();
  void ShowWorkDate();
  void LeaveConfiguration();
  void FillPanel();
  void EmptyPanel();
  void BlankEntry();
  void ListDone();
  void TakeOutTeams(const LadderView& match);
  [[nodiscard]] bool ScoresPass(const TextBox& home, const TextBox& away);
  [[nodiscard]] bool ScoresAreInRange(double home, double away);
  void AskForScoresAgain();
  void WriteMatch();
  void AfterRecording();
  void GoToDate(Date date);
  void OpenEditPanel();
  void CloseEditPanel();
  [[nodiscard]] bool HasMatchOnNewDate();
  void PutStoredScoresBack();
  void ListDates();
  void ShowResultRow(int row, const LadderView& match);
  void WriteLadderFile();
  [[nodiscard]] Date SelectedDate() const;
  void ShowPenaltyWords();
  void StorePenalty(double points);
  void ClosePenalties();
  [[nodiscard]] std::string LadderTitle() const;
  void OfferTables(bool offered);
  void ClosePrintOptions();
  void Print(LadderPrintout what);
  [[nodiscard]] LadderTab ShownTab() const;
  void OpenHelp(int topic);

  const Context& context_;
  Session& session_;
  PrintPanel print_panel_{context_, {lblPrinterName, lblOrient, txtNoC, &cboFromTop}};
  FontBox font_box_{context_, {fraFontPick, lblFont, lblPrFont, lblFontInfo}};
  /// The one record buffer of the corrections: a save writes into it what the panel shows, and
  /// leaves in it what else the last record read had.
  LadderRecord record_;
  /// A match written from the entry boxes whose save has not come to its end.
  std::optional<LadderBytes> unconfirmed_;
};

}  // namespace marlowbeck
