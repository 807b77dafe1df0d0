#pragma once

#include <array>
#include <vector>

#include "print/font_box.h"
#include "print/print_panel.h"
#include "stats/team_reports.h"
#include "ui/context.h"
#include "ui/controls.h"
#include "ui/screen.h"

namespace marlowbeck {

/// The Reports screen: a menu of reports over panels that take turns. Every report is worked out
/// afresh from the player and result records each time it is asked for.
struct frmPMenu : Screen {
  frmPMenu(Screens& screens, const Context& context);

  // The menu of reports, with the ball that points at the entry under the pointer.
  Panel fraMenu{*this, "fraMenu"};
  Picture Image1{fraMenu, "Image1", "Highest Averages"};
  Picture Image3{fraMenu, "Image3", "Highest Pegs"};
  Picture Image2{fraMenu, "Image2", "Highest Scores"};
  Picture Image4{fraMenu, "Image4", "Most Pegs"};
  Picture Image5{fraMenu, "Image5", "Most Centuries"};
  Picture Image9{fraMenu, "Image9", "Most 180's"};
  Picture Image6{fraMenu, "Image6", "Weekly Results"};
  Picture Image7{fraMenu, "Image7", "Season Report"};
  Picture Image8{fraMenu, "Image8", "Peg Ratios"};
  Picture Image12{fraMenu, "Image12", "Name Search"};
  Picture Image10{fraMenu, "Image10", "Exit"};
  Picture imgBall{fraMenu, "imgBall"};

  // Weekly results: what to show, and what to do with it.
  Panel fraWeek{*this, "fraWeek", "Team Results"};
  Label lblSeason1{fraWeek, "lblSeason1"};
  ComboBox cboResGrade{fraWeek, "cboResGrade", "Select Grade:"};
  ComboBox cboResTeam{fraWeek, "cboResTeam", "Select Team:"};
  ListBox lstAllDates{fraWeek, "lstAllDates", "Dates Played:"};
  static constexpr const char* kChangeDate = "Change Game Date : ";
  Command cmdChangeDate{fraWeek, "cmdChangeDate", kChangeDate};
  Command cmdPrintLad{fraWeek, "cmdPrintLad", "Print"};
  Command cmdClipWeek{fraWeek, "cmdClipWeek", "Copy to Clipboard"};
  Command cmdPlrResExit{fraWeek, "cmdPlrResExit", "Help"};
  Command cmdCancelWK{fraWeek, "cmdCancelWK", "Exit"};

  // The team's night and, below it, its season up to that night.
  Panel fraWkProg{*this, "fraWkProg"};
  Label lblOpp{fraWkProg, "lblOpp"};
  Label lblDT{fraWkProg, "lblDT"};
  Grid grdWeek{fraWkProg, "grdWeek"};
  Label lblProgInfo{fraWkProg, "lblProgInfo"};
  Grid grdProg{fraWkProg, "grdProg"};
  Panel fraFFYesNo{fraWkProg, "fraFFYesNo"};
  Label Label13{fraFFYesNo, "Label13",
                "Include Forfeits in All Games Played in Progressive Details ?"};
  OptionButton optFFyes{fraFFYesNo, "optFFyes", "Yes"};
  OptionButton optFFno{fraFFYesNo, "optFFno", "No"};

  Label lblNoneFound{*this, "lblNoneFound"};

  // The lists of the highest, one grade at a time or all together.
  Label lblSeason{*this, "lblSeason"};
  Panel fraPikHi{*this, "fraPikHi"};
  ComboBox cboHiGrade{fraPikHi, "cboHiGrade", "Select Grade:"};
  ListBox lstHiDates{fraPikHi, "lstHiDates", "Select Date:"};
  static constexpr const char* kProgressive = "Progressive";
  Command cmdProgress{fraPikHi, "cmdProgress", kProgressive};
  Command cmdCombine{fraPikHi, "cmdCombine", "Combine All Grades"};
  Command cmdHiPrint{fraPikHi, "cmdHiPrint", "Print"};
  Command cmdClipHi{fraPikHi, "cmdClipHi", "Copy to Clipboard"};
  Command cmdExitHi{fraPikHi, "cmdExitHi", "Help"};
  Command cmdHiMenu{fraPikHi, "cmdHiMenu", "Exit"};
  Panel FraCombineOptions{*this, "FraCombineOptions"};
  OptionButton optCombineAvg{FraCombineOptions, "optCombineAvg", "List by Average"};
  OptionButton optCombineAlpha{FraCombineOptions, "optCombineAlpha", "Alphabetical List"};
  Command cmdReDoAvgs{*this, "cmdReDoAvgs", "List "};
  Panel fraHi{*this, "fraHi"};
  std::array<Label, 2> lblHi = {Label{fraHi, "lblHi(0)"}, Label{fraHi, "lblHi(1)"}};
  Command cmdHcap{fraHi, "cmdHcap", "Handicaps"};
  Grid grdHI{fraHi, "grdHI"};

  // The printer font and the print panels.
  Panel fraFontPick{*this, "fraFontPick", "Printer Font"};
  FontLabel lblFont{fraFontPick, "lblFont"};
  Label lblPrFont{fraFontPick, "lblPrFont"};
  Label lblFontInfo{*this, "lblFontInfo", " Click to change font. "};
  Panel picPrint{*this, "picPrint", "Print Options"};
  Label lblPrinterName{picPrint, "lblPrinterName"};
  Label lblOrient{picPrint, "lblOrient"};
  std::array<OptionButton, 3> optBoth = {
      OptionButton{picPrint, "optBoth(0)", "Weekly details ONLY"},
      OptionButton{picPrint, "optBoth(1)", "Progressive details ONLY"},
      OptionButton{picPrint, "optBoth(2)", "Weekly and Progressive details"}};
  ComboBox cboFromTop{picPrint, "cboFromTop", "How many Centimeters from Top of Page ?",
                      ComboBox::Typing::Free};
  TextBox txtNoC{picPrint, "txtNoC", "Number of Copies:"};
  Command cmdWeekHelp{picPrint, "cmdWeekHelp", "Help"};
  Command cmdPrinterSetup{picPrint, "cmdPrinterSetup", "Printer Setup"};
  Command cmdBothOK{picPrint, "cmdBothOK", "Print"};
  Command cmdBothCancel{picPrint, "cmdBothCancel", "Cancel"};
  Panel picPrintHI{*this, "picPrintHI", "Print Options"};
  Label lblPrinterNameHI{picPrintHI, "lblPrinterNameHI"};
  Label lblOrientHI{picPrintHI, "lblOrientHI"};
  std::array<OptionButton, 2> optHI = {
      OptionButton{picPrintHI, "optHI(0)"},
      OptionButton{picPrintHI, "optHI(1)", "Enter another amount to Print"}};
  TextBox txtHI{picPrintHI, "txtHI"};
  Label lblHMPrint{picPrintHI, "lblHMPrint"};
  TextBox txtNoCHI{picPrintHI, "txtNoCHI", "Number of Copies:"};
  Command cmdPrinterSetupHI{picPrintHI, "cmdPrinterSetupHI", "Printer Setup"};
  Command cmdBothOKHI{picPrintHI, "cmdBothOKHI", "Print"};
  Command cmdBothCancelHI{picPrintHI, "cmdBothCancelHI", "Cancel"};

  void Load() override;
  void Activate() override;
  void Unload() override;
  void CloseButton() override;
  void Escape() override;

  // The menu.
  void StartScreen();
  void WorkScreen();
  void HideAll();
  void GetPlayerFileName();
  void Image6_Click();
  void Image12_Click();
  /// Marks the entry that the pointer is over.
  void PointAt(Picture& entry);
  void PointAtNothing();

  // Weekly results.
  void DoWeekly();
  void GetDates();
  void ListDates();
  void FillGrids();
  void CalcWeekly();
  void GridWeekly();
  void ClearWeekGrids();
  void GetSeason();
  void cboResGrade_Click();
  void cboResTeam_Click();
  void cmdChangeDate_Click();
  void grdWeek_DoubleClick();

  // Progressive details.
  void CalcProg();
  void GridProg();
  void optFFyes_Click();
  void optFFno_Click();

  // The lists of the highest.
  void DoHighest();
  void ListGrades();
  void GetHiDates();
  void ListDateOnly();
  void CalcHi();
  void CalcHiProg();
  void GridHi();
  void ClearGridHi();
  void lstHiDates_Click();
  void cmdProgress_Click();
  void cmdExitHi_Click();
  void cmdHiMenu_Click();

  // All grades together, and handicaps.
  void cmdCombine_Click();
  void CombineStart();
  void CombineAV();
  void CombineSort();
  void CombineShow();
  void cmdReDoAvgs_Click();
  void cmdHcap_Click();

  // Printing of the two tables.
  void cmdPrintLad_Click();
  void cmdPrinterSetup_Click();
  void cmdBothOK_Click();
  void PrintWeekly();
  void PrintProg();
  void PrintBoth();

  // Printing of a list.
  void cmdHiPrint_Click();
  void optHI0_Click();
  void optHI1_Click();
  void txtHI_Change();
  void cmdBothOKHI_Click();
  void PrintHI();

  // Copies for a spreadsheet.
  void cmdClipWeek_Click();
  void cmdClipHi_Click();

 private:
  void WireMenu();
  void WireWeekly();
  void WireHighest();
  void WireCombined();
  void WirePrinting();
  void WireListPrinting();
  void WireCopying();
  void ClosePrintPanel();
  [[nodiscard]] std::array<Picture*, 11> Entries();
  void TakeSelection();
  void ShowSeason();
  void OfferNight(bool any);
  void ForgetNight();
  void KeepForfeitsChoice(bool included);
  void OpenList(int choice, const std::string& name);
  void OfferList(bool any);
  void ShowListPanel();
  void ListUpToDate();
  void ShowNoneFound();
  void NameCombine();
  void PickCombinedOrder(OptionButton& picked);
  [[nodiscard]] bool IsAverages() const;
  [[nodiscard]] bool AtDeadEnd() const;
  [[nodiscard]] int ListedRows() const;
  void RefillList(const Handler& refill);
  void CloseListPrintPanel();
  void OpenReport(int choice, std::string_view screen);
  /// Hides this screen and shows another, where there is such a screen.
  void GoTo(std::string_view screen);
  /// The same for one that comes back here: this screen is out of reach until then, and `saved`
  /// runs each time that the other one has saved something.
  void OpenDialog(std::string_view screen, const Handler& saved);

  const Context& context_;
  Session& session_;
  PrintPanel print_panel_{context_, {lblPrinterName, lblOrient, txtNoC, &cboFromTop}};
  PrintPanel list_print_panel_{context_, {lblPrinterNameHI, lblOrientHI, txtNoCHI}};
  FontBox font_box_{context_, {fraFontPick, lblFont, lblPrFont, lblFontInfo}};
  TeamReports reports_;
  std::vector<ProgressiveRow> progressive_;  ///< the rows of the last CalcProg
};

}  // namespace marlowbeck
