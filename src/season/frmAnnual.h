#pragma once

#include <optional>
#include <string>
#include <vector>

#include "print/font_box.h"
#include "print/print_panel.h"
#include "season/season_results.h"
#include "ui/context.h"
#include "ui/controls.h"
#include "ui/screen.h"

namespace marlowbeck {

/// One player's season, night by night, with its totals; or those of a whole team, printed.
struct frmAnnual : Screen {
  frmAnnual(Screens& screens, const Context& context);

  // Whose season.
  ComboBox cboGrades{*this, "cboGrades", "Grade"};
  ComboBox cboTeams{*this, "cboTeams", "Team"};
  Label lblHmP{*this, "lblHmP"};
  ListBox lstPlayers{*this, "lstPlayers", "Player List"};
  Label lblNoneFound{*this, "lblNoneFound"};

  // The season.
  Label lblGrade{*this, "lblGrade", "Grade/Year"};
  Label lblPlayer{*this, "lblPlayer", "Player"};
  Grid grdAnnual{*this, "grdAnnual"};
  Label lblToT{*this, "lblToT", "Totals"};
  Grid grdTotals{*this, "grdTotals"};
  Panel picFF{*this, "picFF"};
  Panel fraFFYesNo{picFF, "fraFFYesNo", "Include Forfeits in TOTAL GAMES PLAYED ?"};
  OptionButton optFFyes{fraFFYesNo, "optFFyes", "Yes"};
  OptionButton optFFno{fraFFYesNo, "optFFno", "No"};

  Command cmdPrinter{*this, "cmdPrinter", "Printer"};
  Command cmdClipAnnual{*this, "cmdClipAnnual", "Copy to Clipboard"};
  Command cmdPlrResExit{*this, "cmdPlrResExit", "Help"};
  Command cmdCancelAnn{*this, "cmdCancelAnn", "Exit"};

  Panel picPrinter{*this, "picPrinter", "Print Options"};
  Label lblPrinterName{picPrinter, "lblPrinterName"};
  Label lblOrient{picPrinter, "lblOrient"};
  TextBox txtNoC{picPrinter, "txtNoC", "Number of Copies:"};
  Panel fraAllAnnual{picPrinter, "fraAllAnnual", "Select before Printing"};
  Label lblAllAnnual{fraAllAnnual, "lblAllAnnual"};
  OptionButton optYesAnnual{fraAllAnnual, "optYesAnnual", "Yes"};
  OptionButton optNoAnnual{fraAllAnnual, "optNoAnnual", "No"};
  Panel fraFontPick{picPrinter, "fraFontPick", "Printer Font"};
  FontLabel lblFont{fraFontPick, "lblFont"};
  Label lblPrFont{fraFontPick, "lblPrFont"};
  Label lblFontInfo{picPrinter, "lblFontInfo", " Click to change font. "};
  Command cmdBothOKHI{picPrinter, "cmdBothOKHI", "Printer"};
  Command cmdPrinterSetup{picPrinter, "cmdPrinterSetup", "Printer Setup"};
  Command cmdBothCancelHI{picPrinter, "cmdBothCancelHI", "Cancel"};

  void Load() override;
  void Unload() override;

  // The picks.
  void cboGrades_Click();
  void cboTeams_Click();
  void lstPlayers_Click();
  void FileNames();
  void GetGrades();
  void GetTeams();
  void GetPlayers();

  // The season on show.
  void CalcAnnual();
  void FillGrid();
  void ClearGrid();
  void GridsON();
  void GridsOFF();
  void KeepForfeitsChoice(bool included);
  void cmdClipAnnual_Click();

  // Its printing.
  void cmdPrinter_Click();
  void cmdBothOKHI_Click();
  void ClosePrintPanel();
  void DoALL();
  void PrintHI();

 private:
  void WirePicks();
  void WirePrinting();
  void ListNobody();
  void TellCount();
  void ShowPicks(bool shown);
  void ShowGrids(bool shown);
  void OfferAll();
  void AskAboutForfeits(bool asked);
  void FillTotals();

  const Context& context_;
  Session& session_;
  FontBox font_box_{context_, {fraFontPick, lblFont, lblPrFont, lblFontInfo}};
  PrintPanel print_panel_{context_, {lblPrinterName, lblOrient, txtNoC}};
  std::vector<std::int32_t> ids_;  ///< of the lines of lstPlayers
  /// While a whole team is printed, its files are read once.
  std::optional<SeasonResults> season_;
  std::string name_;
  AnnualReport report_;  ///< of the last CalcAnnual
};

}  // namespace marlowbeck
