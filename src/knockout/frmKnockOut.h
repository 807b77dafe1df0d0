#pragma once

#include <array>
#include <string>
#include <string_view>
#include <vector>

#include "knockout/entrants.h"
#include "knockout/list_file.h"
#include "print/font_box.h"
#include "print/print_panel.h"
#include "ui/context.h"
#include "ui/controls.h"
#include "ui/screen.h"

namespace marlowbeck {

/// A knock-out: who is in it, the draw, its table on paper. The table on the screen is all there is
/// of the selection; every procedure reads it there.
struct frmKnockOut : Screen {
  frmKnockOut(Screens& screens, const Context& context);

  // When it is played.
  Panel fraKODate{*this, "fraKODate", "Date and Grade Selection for Knock-Out"};
  DatePicker NewCal{fraKODate, "NewCal"};
  TextBox txtKODate{fraKODate, "txtKODate"};
  Command cmdNewDateHelp{fraKODate, "cmdNewDateHelp", "&Help"};
  Command cmdOK{fraKODate, "cmdOK", "&OK"};
  Command cmdCancel{fraKODate, "cmdCancel", "&Cancel"};

  // Who is in it.
  Panel fraKO{*this, "fraKO", "Players Selections"};
  Label lblKOC{fraKO, "lblKOC", "KNOCK-OUT Competition"};
  Label lblKODate{fraKO, "lblKODate"};
  Label lblGrade{fraKO, "lblGrade"};
  std::array<Label, 5> lblKONOP = {Label{fraKO, "lblKONOP(0)"}, Label{fraKO, "lblKONOP(1)"},
                                   Label{fraKO, "lblKONOP(2)"}, Label{fraKO, "lblKONOP(3)"},
                                   Label{fraKO, "lblKONOP(4)"}};
  ListBox lstAllPlayers{fraKO, "lstAllPlayers", "Double Click NAME to Select"};
  Command cmdADD{fraKO, "cmdADD", "Add > Selection"};
  Command cmdREMOVE{fraKO, "cmdREMOVE", "< Remove Selection"};
  Command cmdALL{fraKO, "cmdALL", "Select All Players"};
  Command cmdScramble{fraKO, "cmdScramble", "Scramble"};
  Grid grdKO{fraKO, "grdKO", "Double Click NAME to Remove"};
  Command cmdKOGrade{fraKO, "cmdKOGrade", "Select Grade"};
  Command cmdCD{fraKO, "cmdCD", "Change Date"};
  Command cmdOpen{fraKO, "cmdOpen", "Open a List"};
  Command cmdSaveKO{fraKO, "cmdSaveKO", "Save Current List"};
  Command cmdReRun{fraKO, "cmdReRun", "Re-Start"};
  Command cmdKOHelp{fraKO, "cmdKOHelp", "&Help"};
  Command cmdClipBoard{fraKO, "cmdClipBoard", "Copy to Clipboard"};
  Command cmdPrnt{fraKO, "cmdPrnt", "Print Setup"};
  Command cmdCancelKO{fraKO, "cmdCancelKO", "&Cancel"};

  // Another grade.
  Panel fraKOGrade{*this, "fraKOGrade", "Select Grade"};
  ComboBox cboResGrade{fraKOGrade, "cboResGrade"};
  Command cmdSelAll{fraKOGrade, "cmdSelAll", "Select ALL Grades"};
  Command cmdGradeOK{fraKOGrade, "cmdGradeOK", "OK"};
  Command Command2{fraKOGrade, "Command2", "&Cancel"};

  // Another date.
  Panel fraKODC{*this, "fraKODC", "Date Selection for Knock-Out"};
  DatePicker ChDate{fraKODC, "ChDate"};
  TextBox txtKOdateChange{fraKODC, "txtKOdateChange"};
  Command cmdKOChangeDate{fraKODC, "cmdKOChangeDate", "&OK"};
  Command cmdKOCancelDC{fraKODC, "cmdKOCancelDC", "&Cancel"};

  // The print panel.
  Panel picPrint{*this, "picPrint", "Print Options"};
  Label lblPrinterName{picPrint, "lblPrinterName"};
  Label lblOrient{picPrint, "lblOrient"};
  TextBox txtNoC{picPrint, "txtNoC", "Number of Copies:"};
  Panel fraFontPick{picPrint, "fraFontPick", "Printer Font"};
  FontLabel lblFont{fraFontPick, "lblFont"};
  Label lblPrFont{fraFontPick, "lblPrFont"};
  Label lblFontInfo{picPrint, "lblFontInfo", " Click to change font. "};
  Command cmdWeekHelp{picPrint, "cmdWeekHelp", "Help"};
  Command cmdPrinterSetup{picPrint, "cmdPrinterSetup", "Printer Setup"};
  Command cmdKOprint{picPrint, "cmdKOprint", "Print"};
  Command cmdBothCancel{picPrint, "cmdBothCancel", "Cancel"};

  void Load() override;
  void Unload() override;

  // Date and grade.
  void cmdOK_Click();
  void cmdCD_Click();
  void cmdKOChangeDate_Click();
  void cmdKOCancelDC_Click();
  void cmdKOGrade_Click();
  void cmdGradeOK_Click();
  void cmdSelAll_Click();
  void Command2_Click();
  void cmdReRun_Click();

  // The selection.
  void GetAssocPlayers();
  void KOGridMT();
  void UpdateNOP();
  void PutInGrid();
  void RemFromGrd();
  void RefreshGrdKO(const Places& places);
  void cmdALL_Click();

  // List files.
  void cmdSaveKO_Click();
  void SaveList(const std::string& file_name);
  void cmdOpen_Click();
  void OpenList();
  void RemoveDupes();

  // The draw.
  void cmdScramble_Click();
  void Byes();
  void cmdPrnt_Click();
  void cmdKOprint_Click();
  bool PrintHI();
  void ClosePrintPanel();
  void cmdClipBoard_Click();

 private:
  void WireDates();
  void WireSelection();
  void WireDraw();
  void OpenHelp(int topic);
  void ShowDate();
  void TakeGrade(std::string_view grade);
  void ListNobody();
  void ButtonsOff();
  [[nodiscard]] int Selected() const;
  [[nodiscard]] int FirstFreePlace() const;
  [[nodiscard]] Entrant EntrantAt(int row) const;
  [[nodiscard]] std::vector<Entrant> Entrants() const;
  [[nodiscard]] Places PlacesInGrid() const;
  void PutAt(int row, const Entrant& entrant);
  void PutPlaces(const Places& places);
  void WarnOfTooMany();
  void WithFileWords(const Handler& work);
  void ShowList(const ListReading& reading);

  const Context& context_;
  Session& session_;
  FontBox font_box_{context_, {fraFontPick, lblFont, lblPrFont, lblFontInfo}, Beep::First};
  PrintPanel print_panel_{context_, {lblPrinterName, lblOrient, txtNoC}, Beep::First};
  std::string grade_;
  Date date_;
  Available available_;
  int total_available_ = 0;
  bool bye_ = false;  ///< one more place, that nobody has, is printed or copied
  bool restarting_ = false;
};

}  // namespace marlowbeck
