#include "knockout/frmKnockOut.h"

#include <utility>

#include "data/competition.h"
#include "data/runtime_error.h"
#include "data/text.h"
#include "session/messages.h"
#include "session/shared_procedures.h"
#include "ui/screens.h"

namespace marlowbeck {
namespace {

constexpr int kHelpTopic = 170;

/// "Wednesday 31 March 2004".
std::string DayAndDate(Date date) {
  std::string text = LongDate(date);
  text.erase(text.find(','), 1);
  return text;
}

}  // namespace

frmKnockOut::frmKnockOut(Screens& screens, const Context& context)
    : Screen(screens, "frmKnockOut", "Marlowbeck KNOCK-OUT"),
      context_(context),
      session_(context.session) {
  WireDates();
  WireSelection();
  WireDraw();
  for (Command* help : {&cmdNewDateHelp, &cmdKOHelp}) {
    help->Click = [this] { OpenHelp(kHelpTopic); };
  }
  Defaults = {&cmdOK, &cmdGradeOK, &cmdKOChangeDate, &cmdKOprint};
  Cancels = {&cmdBothCancel, &Command2, &cmdKOCancelDC, &cmdCancelKO, &cmdCancel};
  Helps = {&cmdNewDateHelp, &cmdKOHelp, &cmdWeekHelp};
}

void frmKnockOut::WireDates() {
  for (TextBox* day : {&txtKODate, &txtKOdateChange}) {
    day->SetLocked(true);
    day->SetTabStop(false);
  }
  NewCal.Change = [this] { txtKODate.SetText(DayName(NewCal.Value())); };
  ChDate.Change = [this] { txtKOdateChange.SetText(DayName(ChDate.Value())); };
  cmdOK.Click = [this] { cmdOK_Click(); };
  cmdCD.Click = [this] { cmdCD_Click(); };
  cmdKOChangeDate.Click = [this] { cmdKOChangeDate_Click(); };
  cmdKOCancelDC.Click = [this] { cmdKOCancelDC_Click(); };
  cmdKOGrade.Click = [this] { cmdKOGrade_Click(); };
  cmdGradeOK.Click = [this] { cmdGradeOK_Click(); };
  cmdSelAll.Click = [this] { cmdSelAll_Click(); };
  Command2.Click = [this] { Command2_Click(); };
  cmdReRun.Click = [this] { cmdReRun_Click(); };
  for (Command* cancel : {&cmdCancel, &cmdCancelKO}) {
    cancel->Click = [this] { InScreens().Unload(*this); };
  }
}

void frmKnockOut::OpenHelp(int topic) { context_.platform.help.Open("qz1.HLP", topic); }

void frmKnockOut::Load() {
  for (Panel* panel : {&picPrint, &fraFontPick, &fraKO, &fraKODC, &fraKOGrade}) panel->Hide();
  ButtonsOff();
  grade_ = kAllGrades;
  lblGrade.SetCaption(grade_);
  NewCal.SetValue(context_.platform.clock.Today());
  txtKODate.SetText(DayName(NewCal.Value()));
  ReadFileName(context_);
  const std::string name = UpperCase(FileNameOf(session_.PlayerFile));
  SetTitle("[Marlowbeck] KNOCK-OUT: Filename: " + WithoutLast(name, 4));
  font_box_.GetFont();
}

void frmKnockOut::Unload() {
  if (!restarting_) InScreens().Show("frmDB");
}

void frmKnockOut::cmdReRun_Click() {
  restarting_ = true;
  InScreens().Unload(*this);
  InScreens().Show("frmKnockOut");
}

void frmKnockOut::ShowDate() { lblKODate.SetCaption(DayAndDate(date_)); }

void frmKnockOut::cmdOK_Click() {
  date_ = NewCal.Value();
  ShowDate();
  fraKO.Show();
  fraKODate.Hide();
  GetAssocPlayers();
  KOGridMT();
  lstAllPlayers.SetFocus();
}

void frmKnockOut::cmdCD_Click() {
  fraKO.Disable();
  fraKODC.Show();
  ChDate.SetValue(date_);
  txtKOdateChange.SetText(DayName(date_));
}

void frmKnockOut::cmdKOChangeDate_Click() {
  fraKO.Enable();
  date_ = ChDate.Value();
  ShowDate();
  fraKODC.Hide();
}

void frmKnockOut::cmdKOCancelDC_Click() {
  fraKO.Enable();
  fraKODC.Hide();
}

void frmKnockOut::cmdKOGrade_Click() {
  if (Selected() >= 1) {
    const int answer =
        WarningYesNo(context_,
                     Lines({"There are players in the Knock-Out list.",
                            "If you select another grade, the current", "list will be deleted!", "",
                            "Do you wish to continue?"}),
                     Beep::First);
    if (answer == kAnswerNo) return;
  }
  fraKO.Disable();
  fraKOGrade.Show();
  GetGrades(context_, cboResGrade);
  if (cboResGrade.Count() > 0) cboResGrade.SetIndex(0);
}

/// Without any grade to select there is none to take.
void frmKnockOut::cmdGradeOK_Click() {
  if (cboResGrade.Index() >= 0) TakeGrade(Trimmed(cboResGrade.Text()));
}

void frmKnockOut::cmdSelAll_Click() { TakeGrade(kAllGrades); }

void frmKnockOut::TakeGrade(std::string_view grade) {
  KOGridMT();
  const std::string grade_before = std::exchange(grade_, grade);
  fraKO.Enable();
  fraKOGrade.Hide();
  try {
    GetAssocPlayers();
  } catch (const RunTimeError&) {
    grade_ = grade_before;
    ListNobody();
    throw;
  }
  lblGrade.SetCaption(grade_);
}

void frmKnockOut::Command2_Click() {
  fraKOGrade.Hide();
  fraKO.Enable();
}

}  // namespace marlowbeck
