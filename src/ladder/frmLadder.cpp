#include "ladder/frmLadder.h"

#include "data/competition.h"
#include "data/text.h"
#include "session/messages.h"
#include "session/shared_procedures.h"
#include "ui/screens.h"

namespace marlowbeck {
namespace {

constexpr const char* kCancel = "&Cancel";
constexpr const char* kMainMenu = "&Main Menu";
constexpr int kScoresHelpTopic = 160;
constexpr int kPrintingHelpTopic = 246;
constexpr int kTableHelpTopic = 161;
/// In the Flag: a grade has been chosen.
constexpr int kGradeChosen = 1;

}  // namespace

frmLadder::frmLadder(Screens& screens, const Context& context)
    : Screen(screens, "frmLadder", "[Marlowbeck]  Premiership Ladder"),
      context_(context),
      session_(context.session) {
  Wire();
  WireScores();
  WireEditing();
  WireTable();
  WirePrinting();
  for (TextBox* box : {&txtDayName, &txtHome, &txtAway, &txtEdHome, &txtEdAway, &cfgGrade}) {
    box->SetLocked(true);
    box->SetTabStop(false);
  }
  grdWk.SetFiguresFrom(5);  // none: the winner's games stand behind its name
  Defaults = {&cmdSaveEdit, &cmdPenOK, &cmdBothOK, &cmdSaveConfig, &cmdGotoResults, &cmdRecord};
  Cancels = {&cmdCancelEdit, &cmdPenCancel, &cmdCancel2, &cmdBothCancel, &cmdCancel, &cmdCancelCal};
}

void frmLadder::Wire() {
  cmdSC.Click = [this] { setTAB0(); };
  cmdPL.Click = [this] { setTAB1(); };
  cmdCF.Click = [this] { setTAB2(); };
  Cal.Change = [this] { Cal_Change(); };
  cmdGotoResults.Click = [this] { cmdGotoResults_Click(); };
  cmdCancelCal.Click = [this] { cmdCancelCal_Click(); };
  cmdChangeGrade.Click = [this] { cmdChangeGrade_Click(); };
  cmdSaveConfig.Click = [this] { cmdSaveConfig_Click(); };
  cmdCancel.Click = [this] { cmdCancel_Click(); };
  for (Command* exit : {&cmdExit, &cmdExitLadder, &Command1}) {
    exit->Click = [this] { InScreens().Unload(*this); };
  }
  for (Command* help : {&cmdHelp1, &SSCommand2}) {
    help->Click = [this] { OpenHelp(kScoresHelpTopic); };
  }
  Command2.Click = [this] { OpenHelp(kTableHelpTopic); };
  SSCommand5.Click = [this] { OpenHelp(kPrintingHelpTopic); };
}

void frmLadder::WireScores() {
  lstTeams.SetPicksOnEnter(true);
  lstTeams.Click = [this] { lstTeams_Click(); };
  lstTeams.MouseUp = [this] { lstTeams_MouseUp(); };
  // A key comes up here also when it has only brought the focus to the list.
  lstTeams.KeyUp = [this] {
    if (!txtHome.Text().empty() || !txtAway.Text().empty()) lstTeams_MouseUp();
  };
  txtHome.Change = [this] {
    cmdHomeBack.SetEnabled(!txtHome.Text().empty());
    CanRecord();
  };
  txtAway.Change = [this] {
    cmdBackAway.SetEnabled(!txtAway.Text().empty());
    CanRecord();
  };
  txtHomeScore.Change = [this] { CanRecord(); };
  txtAwayScore.Change = [this] { CanRecord(); };
  cmdHomeBack.Click = [this] { cmdHomeBack_Click(); };
  cmdBackAway.Click = [this] { cmdBackAway_Click(); };
  cmdRecord.Click = [this] { cmdRecord_Click(); };
  cmdFirst.Click = [this] { cmdFirst_Click(); };
  cmdPrevDate.Click = [this] { cmdPrevDate_Click(); };
  cmdNextDate.Click = [this] { cmdNextDate_Click(); };
  cmdLast.Click = [this] { cmdLast_Click(); };
}

void frmLadder::WireEditing() {
  lstDone.SetPicksOnEnter(true);
  lstDone.Click = [this] { lstDone_Click(); };
  EdCal.Change = [this] { EdCal_Change(); };
  cmdSaveEdit.Click = [this] { cmdSaveEdit_Click(); };
  cmdDeleteEdit.Click = [this] { cmdDeleteEdit_Click(); };
  cmdCancelEdit.Click = [this] { cmdCancelEdit_Click(); };
}

void frmLadder::WireTable() {
  cboTGrades.Click = [this] { cboTGrades_Click(); };
  lstTableDates.Click = [this] { lstTableDates_Click(); };
  cmdPenalty.Click = [this] { cmdPenalty_Click(); };
  lstPenalty.SetPicksOnEnter(true);
  lstPenalty.Click = [this] { lstPenalty_Click(); };
  txtPenPts.Entered = [this] { SavePen(); };
  cmdPenOK.Click = [this] { SavePen(); };
  cmdPenCancel.Click = [this] { cmdPenCancel_Click(); };
  cmdCancel2.Click = [this] { cmdPenCancel_Click(); };
}

void frmLadder::Load() {
  EraseArrays();
  Start();
}

void frmLadder::Activate() {
  if (cboResGrade.Live()) cboResGrade.SetFocus();
}

void frmLadder::Unload() { InScreens().Show("frmDB"); }

void frmLadder::Start() {
  session_.DateCount = 0;
  ShowAtStart();
  ReadFileName(context_);
  if (session_.PlayerFile.empty()) {
    nofile(context_, InScreens(), Beep::No);
    InScreens().Unload(*this);
    return;
  }
  GetWorkDate();
  if (!session_.WorkDate.IsSet()) session_.WorkDate = context_.platform.clock.Today();
  ShowWorkDate();
  GetGrades(context_, cboResGrade);
  if (cboResGrade.Count() > 0) cboResGrade.SetIndex(0);
}

void frmLadder::ShowAtStart() {
  for (Panel* panel : {&fraEdScore, &fraPenalty, &fraPenPts}) panel->Hide();
  fraButtons.Show();
  fraSC.Show();
  CheckButtons();
  fraChangeGrade.Show();
  fraScores.Hide();  // until a grade has been chosen
  CanRecord();
  cmdHomeBack.Disable();
  cmdBackAway.Disable();
}

void frmLadder::CheckButtons() {
  fraSC.Show();
  for (Panel* panel : {&fraPL, &fraCF, &fraPO}) panel->Hide();
  for (Command* tab : {&cmdSC, &cmdPL, &cmdCF}) tab->Disable();
}

void frmLadder::GetNewFileName() { NameGradeFiles(session_); }

void frmLadder::GetTeams() {
  TeamList.clear();
  session_.TeamCount = 0;
  OpenFile(session_, context_.channels);
  if (session_.PlayerFile.empty()) return;
  TeamList = SortedDistinct(TeamsInFile(context_.channels, session_.Grade));
  session_.TeamCount = static_cast<int>(TeamList.size());
  context_.channels.CloseAll();
}

void frmLadder::GetWorkDate() {
  context_.GoToWorkingFolder();
  try {
    session_.WorkDate = ReadWorkDate(context_.channels);
  } catch (const RunTimeError&) {
    context_.channels.AbandonAll();
  }
}

void frmLadder::SaveWorkdate() {
  context_.GoToWorkingFolder();
  WriteWorkDate(context_.channels, session_.WorkDate);
}

void frmLadder::ShowWorkDate() {
  const std::string day = DayName(session_.WorkDate);
  Cal.SetValue(session_.WorkDate);
  txtDayName.SetText(day);
}

void frmLadder::Cal_Change() {
  session_.WorkDate = Cal.Value();
  ShowWorkDate();
  SaveWorkdate();
  cmdGotoResults.SetFocus();
}

void frmLadder::cmdGotoResults_Click() {
  session_.Flag = kGradeChosen;
  session_.Grade = Trim(cboResGrade.Text());
  session_.WorkDate = Cal.Value();
  SaveWorkdate();
  cmdSC.Disable();
  cmdPL.Enable();
  cmdCF.Enable();
  fraSC.Show();
  fraScoresIn.Show();
  fraPL.Hide();
  EnterScores();
}

void frmLadder::cmdCancelCal_Click() {
  if (cmdCancelCal.Caption() != kCancel) return InScreens().Unload(*this);
  cmdCancelCal.SetCaption(kMainMenu);
  fraScores.Show();
  fraScoresIn.Show();
  // KEPT: the grade and the date that stand on the panel hold also after Cancel; a repair would put
  // back those that were worked on.
  EnterScores();
}

void frmLadder::cmdChangeGrade_Click() {
  fraScoresIn.Hide();
  fraScores.Disable();  // the panel stands over it
  fraChangeGrade.Show();
  cmdCancelCal.SetCaption(kCancel);
  cboResGrade.SetFocus();
}

void frmLadder::setTAB0() {
  EmptyPanel();  // grade and date in hand are those of the ladder
  fraSC.Show();
  fraPL.Hide();
  fraCF.Hide();
  cmdSC.Disable();
  cmdPL.Enable();
  cmdCF.Enable();
  if (session_.Flag == kGradeChosen) {
    fraChangeGrade.Hide();
  } else if (session_.LadderDate.IsSet()) {
    session_.WorkDate = session_.LadderDate;
    SaveWorkdate();
    ShowWorkDate();
  }
  if (fraChangeGrade.Visible()) return;
  fraScores.Show();
  fraScores.Enable();
  SortLadderFile();
  EnterScores();
}

void frmLadder::setTAB1() {
  fraSC.Hide();
  fraCF.Hide();
  fraPL.Show();
  cmdPL.Disable();
  cmdSC.Enable();
  cmdCF.Enable();
  for (Control* control : std::initializer_list<Control*>{
           &lblGameDetails, &lblLadHeader, &grdLad, &grdWk, &fraPenalty, &fraPenPts, &fraCmds}) {
    control->Hide();  // the commands until there is a date
  }
  lstTableDates.Clear();
  font_box_.GetFont();
  if (session_.DateCount > 0) {
    GetDates();
    ListDates();
  }
  GetGrades(context_, cboTGrades);
  if (cboTGrades.Count() > 0) return cboTGrades.SetIndex(0);
  GetDates();
  ListDates();
  if (lstTableDates.Count() > 0) lstTableDates.SetIndex(lstTableDates.Count() - 1);
}

void frmLadder::setTAB2() {
  GetNewFileName();
  OpenConfig();
  fraCF.Show();
  fraButtons.Hide();
  cmdCF.Disable();
  cmdSC.Enable();
  cmdPL.Enable();
  // The panel stands over the tab that is left.
  fraSC.Disable();
  fraPL.Disable();
  cfgGames.SetFocus();
}

void frmLadder::HelpKey() {
  if (fraPO.Visible()) return OpenHelp(kPrintingHelpTopic);
  OpenHelp(fraPL.Visible() ? kTableHelpTopic : kScoresHelpTopic);
}

void frmLadder::OpenHelp(int topic) { context_.platform.help.Open("qz1.HLP", topic); }

}  // namespace marlowbeck
