// The draw, and what becomes of it: on paper and as text.

#include "data/text.h"
#include "knockout/draw.h"
#include "knockout/frmKnockOut.h"
#include "knockout/print_knockout.h"
#include "print/tabbed_text.h"
#include "session/messages.h"

namespace marlowbeck {
namespace {

constexpr int kPrintingHelpTopic = 246;

bool IsOdd(int count) { return count % 2 != 0; }

}  // namespace

void frmKnockOut::WireDraw() {
  cmdScramble.Click = [this] { cmdScramble_Click(); };
  cmdPrnt.Click = [this] { cmdPrnt_Click(); };
  cmdKOprint.Click = [this] { cmdKOprint_Click(); };
  cmdPrinterSetup.Click = [this] { print_panel_.SetUpPrinter(); };
  cmdBothCancel.Click = [this] { ClosePrintPanel(); };
  cmdWeekHelp.Click = [this] { OpenHelp(kPrintingHelpTopic); };
  cmdClipBoard.Click = [this] { cmdClipBoard_Click(); };
}

void frmKnockOut::cmdScramble_Click() {
  Chance chance(context_.platform.timer.Seed());
  int row = 0;
  for (const Entrant& entrant : Draw(Entrants(), [&chance] { return chance.Next(); })) {
    PutAt(++row, entrant);
  }
}

void frmKnockOut::Byes() {
  bye_ = false;
  if (!IsOdd(Selected())) return;
  const int answer = WarningYesNo(
      context_,
      Lines({"The selected list is uneven. A BYE will", "automatically be added to the last",
             "position when the list is printed.", "", "Do you wish to Continue?"}),
      Beep::First);
  bye_ = answer != kAnswerNo;
}

void frmKnockOut::cmdPrnt_Click() {
  if (Selected() == 0) {
    Warning(context_, "Nothing to PRINT!", Beep::First);
    return;
  }
  Byes();
  // KEPT: the answer looked at is that of the last box of all, so that an even list, which is asked
  // nothing, is not printed after a No to something else; a repair would look at this box's own.
  if (session_.MessageAnswer == kAnswerNo) return;
  picPrint.Show();
  fraFontPick.Show();
  fraKO.Hide();
  print_panel_.PrinterInfo();
  txtNoC.SetText("1");
}

void frmKnockOut::ClosePrintPanel() {
  picPrint.Hide();
  fraFontPick.Hide();
  fraKO.Show();
}

/// Where nothing came out the panel stays, so that another font can be chosen.
void frmKnockOut::cmdKOprint_Click() {
  if (!print_panel_.CheckCopies() || !PrintHI()) return;
  bye_ = false;
  ClosePrintPanel();
}

bool frmKnockOut::PrintHI() {
  return PrintKnockOut(context_, print_panel_.Chosen().copies,
                       {{lblKOC.Caption() + " : " + lblKODate.Caption(), lblGrade.Caption()},
                        {grdKO.Cell(0, 0), grdKO.Cell(0, 1), grdKO.Cell(0, 2)},
                        Entrants(),
                        grade_ == kAllGrades,
                        bye_});
}

void frmKnockOut::cmdClipBoard_Click() {
  bye_ = IsOdd(Selected());
  const int last = Selected() + (bye_ ? 1 : 0);
  TabbedText text;
  text.Line(lblKOC.Caption() + "    " + lblGrade.Caption());
  text.Line(lblKODate.Caption() + "    ");
  for (int row = 0; row <= last; ++row) {
    const bool is_bye = bye_ && row == last;
    const Entrant entrant = EntrantAt(row);
    text.Row({grdKO.Cell(row, 0), is_bye ? kByeWords : entrant.name, entrant.grade},
             TabbedText::LastTab::Yes);
  }
  bye_ = false;
  context_.platform.clipboard.Clear();
  context_.platform.clipboard.SetText(text.Text());
  // KEPT: the lines end without the blanks that pad those of the other boxes; a repair would use
  // the same words everywhere.
  GoodMessage(context_, Lines({lblKOC.Caption() + " : " + lblGrade.Caption(),
                               lblKODate.Caption() + "    ", "", "has been copied to the clipboard",
                               "and can now be pasted as text into your",
                               "favourite spreadsheet or wordprocessor."}));
}

}  // namespace marlowbeck
