#pragma once

#include <vector>

#include "print/font_box.h"
#include "print/print_panel.h"
#include "season/peg_ratios.h"
#include "ui/context.h"
#include "ui/controls.h"
#include "ui/screen.h"

namespace marlowbeck {

/// How often the players of a grade finish a game, by name or by ratio.
struct frmPegRatio : Screen {
  frmPegRatio(Screens& screens, const Context& context);

  Panel fraPegRatio{*this, "fraPegRatio", "Select Grade"};
  ComboBox cboResGrade{fraPegRatio, "cboResGrade"};
  Panel SSframe1{*this, "SSframe1", "Sort by ..."};
  OptionButton optRatio{SSframe1, "optRatio", "Percentage Ratio"};
  OptionButton optAlfa{SSframe1, "optAlfa", "Alphabetical"};
  ProgressBar pbRatio{*this, "pbRatio"};

  Panel fraGrid{*this, "fraGrid"};
  Label lblHi0{fraGrid, "lblHi(0)"};
  Label lblHi1{fraGrid, "lblHi(1)"};
  Grid grdRatio{fraGrid, "grdRatio"};

  Panel fraPik{*this, "fraPik"};
  Command cmdClipRatio{fraPik, "cmdClipRatio", "Copy to Clipboard"};
  Command cmdHelp{fraPik, "cmdHelp", "Help"};
  Panel fraPrinter{fraPik, "fraPrinter", "Options"};
  Command cmdHiPrint{fraPrinter, "cmdHiPrint", "Print"};
  Command cmdCancel{fraPrinter, "cmdCancel", "Exit"};

  Panel picPrinter{*this, "picPrinter", "Print Options"};
  Label Label3{picPrinter, "Label3", "Printer:"};
  Label lblPrinterName{picPrinter, "lblPrinterName"};
  Label Label2{picPrinter, "Label2", "Orientation:"};
  Label lblOrient{picPrinter, "lblOrient"};
  OptionButton optHI0{picPrinter, "optHI(0)"};
  OptionButton optHI1{picPrinter, "optHI(1)", "Enter another amount to Print"};
  Label Label6{picPrinter, "Label6", "Print"};
  TextBox txtHI{picPrinter, "txtHI"};
  Label lblHMPrint{picPrinter, "lblHMPrint", "Peg Ratios"};
  Label lblCopies{picPrinter, "lblCopies"};
  TextBox txtNoC{picPrinter, "txtNoC"};
  Panel fraFontPick{picPrinter, "fraFontPick", "Printer Font"};
  FontLabel lblFont{fraFontPick, "lblFont"};
  Label lblPrFont{fraFontPick, "lblPrFont"};
  Label lblFontInfo{picPrinter, "lblFontInfo", " Click to change font. "};
  Command cmdPrintRatios{picPrinter, "cmdPrintRatios", "Print"};
  Command cmdPrinterSetup{picPrinter, "cmdPrinterSetup", "Printer Setup"};
  Command cmdBothCancelHI{picPrinter, "cmdBothCancelHI", "Cancel"};

  void Load() override;
  void Unload() override;

  // The list.
  void ReCalc();
  void CalcRatio();
  void GridRatio();
  void ClearGridRatio();
  void GetSeason();
  void cmdClipRatio_Click();

  // Its printing.
  void cmdHiPrint_Click();
  void optHI0_Click();
  void optHI1_Click();
  void txtHI_Change();
  void cmdPrintRatios_Click();
  void ClosePrintPanel();

 private:
  void WireList();
  void WirePrinting();
  void SortBy(OptionButton& option);
  [[nodiscard]] bool AnyPegs();
  void ReadPlayers(PegRatios& ratios);
  void ReadResults(PegRatios& ratios);
  void ShowProgress(int result);
  void WriteRows();
  void OfferCopies(bool offered);
  void OfferAmount();
  void ForgetRows();
  void TellOpenPanel();

  const Context& context_;
  Session& session_;
  FontBox font_box_{context_, {fraFontPick, lblFont, lblPrFont, lblFontInfo}};
  PrintPanel print_panel_{context_, {lblPrinterName, lblOrient, txtNoC}};
  std::vector<RatioRow> rows_;  ///< of the last CalcRatio
  const OptionButton* sorted_by_ = nullptr;
};

}  // namespace marlowbeck
