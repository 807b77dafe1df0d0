#include "stats/frmPMenu.h"
#include "stats/print_tables.h"

namespace marlowbeck {
namespace {

constexpr int kPrintingHelpTopic = 246;

}  // namespace

void frmPMenu::WirePrinting() {
  cmdPrintLad.Click = [this] { cmdPrintLad_Click(); };
  cmdPrinterSetup.Click = [this] { cmdPrinterSetup_Click(); };
  cmdBothOK.Click = [this] { cmdBothOK_Click(); };
  cmdBothCancel.Click = [this] { ClosePrintPanel(); };
  cmdWeekHelp.Click = [this] { context_.platform.help.Open("qz1.HLP", kPrintingHelpTopic); };
}

void frmPMenu::cmdPrintLad_Click() {
  grdWeek.Disable();
  grdProg.Disable();
  fraWeek.Disable();
  picPrint.Show();
  print_panel_.Open();
}

void frmPMenu::cmdPrinterSetup_Click() { print_panel_.SetUpPrinter(); }

void frmPMenu::ClosePrintPanel() {
  picPrint.Hide();
  fraWeek.Enable();
  grdWeek.Enable();
  grdProg.Enable();
}

void frmPMenu::cmdBothOK_Click() {
  if (!print_panel_.Check({&optBoth[0], &optBoth[1], &optBoth[2]},
                          "There are no print items selected - Nothing to print !    ")) {
    return;
  }
  ClosePrintPanel();
  if (optBoth[0].Value()) PrintWeekly();
  if (optBoth[1].Value()) PrintProg();
  if (optBoth[2].Value()) PrintBoth();
}

void frmPMenu::PrintWeekly() {
  PrintReport(context_, print_panel_.Chosen(), {WeeklyPrintTable(session_, grdWeek)});
}

void frmPMenu::PrintProg() {
  PrintReport(context_, print_panel_.Chosen(),
              {ProgressivePrintTable(session_, grdProg, TitleOfSeason::WithGrade)});
}

void frmPMenu::PrintBoth() {
  PrintReport(context_, print_panel_.Chosen(),
              {WeeklyPrintTable(session_, grdWeek),
               ProgressivePrintTable(session_, grdProg, TitleOfSeason::WithoutGrade)});
}

}  // namespace marlowbeck
