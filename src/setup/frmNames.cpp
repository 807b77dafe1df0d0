#include "setup/frmNames.h"

#include "data/competition.h"
#include "data/text.h"
#include "session/shared_procedures.h"
#include "ui/screens.h"

namespace marlowbeck {
namespace {

/// Flag while the score sheet is what comes back when this screen is left.
constexpr int kFromScoreSheet = 1;
/// Flag for the search: this screen is what comes back after it.
constexpr int kSearchFromSetup = 2;

}  // namespace

frmNames::frmNames(Screens& screens, const Context& context)
    : Screen(screens, "frmNames", "[Marlowbeck]  Teams, Grades and Players"),
      context_(context),
      session_(context.session) {
  for (Panel* panel : {&panAddPlayer0, &fraNamesMenu, &fraBoT}) panel->Hide();
  cmdClear.Hide();
  cmdAddSave.Disable();
  lstPlayers.SetPicksOnEnter(true);
  WireFirstPlayer();
  WirePlayers();
  Defaults = {&cmdNoPOK, &cmdAddSave0, &cmdAddSave};
  Cancels = {&cmdCancelBo3, &cmdCancelDel, &cmdClear, &cmdAddCancel0, &cmdAddCancel};
  Helps = {&cmdHelp3, &cmdHelpNames};
  for (Control* help : Helps) {
    help->Click = [this] { context_.platform.help.Open("qz1.HLP", 0); };
  }
}

void frmNames::WireFirstPlayer() {
  cmdAddSave0.Click = [this] { cmdAddSave0_Click(); };
  cmdAddCancel0.Click = [this] { InScreens().Unload(*this); };
}

void frmNames::WirePlayers() {
  txtAddSn.Change = [this] { NamesChanged(); };
  txtAddFn.Change = [this] { NamesChanged(); };
  cmdAddSave.Click = [this] { cmdAddSave_Click(); };
  cmdClear.Click = [this] { cmdClear_Click(); };
  cboAddGrd.Change = [this] { cboAddGrd_Change(); };
  cboAddGrd.Click = [this] {
    cboAddGrd_Change();
    txtAddSn.SetFocus();
  };
  cboAddGrd.LostFocus = [this] {
    if (session_.BestOfThree == 0) GetPegs();
  };
  cboAddTm.Change = [this] { PlayerList(); };
  cboAddTm.Click = [this] {
    PlayerList();
    txtAddSn.SetFocus();
  };
  lstPlayers.Click = [this] { lstPlayers_Click(); };
  cmdEdName.Click = [this] { cmdEdName_Click(); };
  cmdDelName.Click = [this] { cmdDelName_Click(); };
  cmdCancelDel.Click = [this] { cmdCancelDel_Click(); };
  cmdNewGrd.Click = [this] { cmdNewGrd_Click(); };
  cmdNewTm.Click = [this] { cmdNewTm_Click(); };
  cmdEdGradeName.Click = [this] { cmdEdGradeName_Click(); };
  cmdEdTeamName.Click = [this] { cmdEdTeamName_Click(); };
  cmdEdBOT.Click = [this] { cmdEdBOT_Click(); };
  grade_boxes.Changed = [this] { NewGradePegs(); };
  cmdNoPOK.Click = [this] { cmdNoPOK_Click(); };
  cmdCancelBo3.Click = [this] { cmdCancelBo3_Click(); };
  cmdAddCancel.Click = [this] { cmdAddCancel_Click(); };
  cmdSearch.Click = [this] { cmdSearch_Click(); };
}

void frmNames::Activate() {
  ReadOpenCompetition();
  OpenFile(session_, context_.channels);
  context_.channels.Close(Channel::Players);
  if (session_.PlayerFile.empty()) {
    InScreens().Unload(*this);
    return;
  }
  Reset();
  (session_.PlayerCount < 1 ? txtAddSn0 : txtAddSn).SetFocus();
}

void frmNames::ReadOpenCompetition() {
  session_.PlayerCount = 0;
  session_.PlayerFile.clear();
  try {
    ReadFileName(context_);
  } catch (const RunTimeError&) {
    // No competition is named: the screen leaves without a word.
    context_.channels.AbandonAll();
  }
}

void frmNames::Unload() { InScreens().Show("frmDB"); }

void frmNames::OpenPlayers() { OpenFile(session_, context_.channels); }

/// Takes the grade from its combo, as it stands there.
void frmNames::NameFilesOfGrade() {
  session_.Grade = Trim(cboAddGrd.Text());
  NameGradeFiles(session_);
}

void frmNames::OpenResultSFile() {
  NameFilesOfGrade();
  marlowbeck::OpenResultSFile(session_, context_.channels);
}

void frmNames::Reset() {
  OpenPlayers();
  if (session_.PlayerCount < 1) {
    ResetToFirstPlayer();
  } else {
    ResetToLists();
  }
  session_.EditRecord = 0;
  context_.channels.CloseAll();
}

void frmNames::ResetToFirstPlayer() {
  panAddPlayer0.Show();
  txtAddSn0.SetFocus();
  panAddPlayer.Hide();
  fraNamesMenu.Hide();
  first_boxes.Caption(session_.GameNames);
  fraNoP.Show();
  ClearAdd();
}

void frmNames::ResetToLists() {
  cmdClear.Hide();
  panAddPlayer0.Hide();
  panAddPlayer.Show();
  EnablePanel(kSetupCaption);
  fraAddNames.SetCaption("Add New Players");
  fraNamesMenu.Hide();
  ShowBestOfThree(false);
  ClearAdd();
  GetGrades();
  GetTeams();
  PlayerList();
  FreeCombos();
  ButtonsON();
  ClearNames();
}

/// The Best of Three panel takes the place of the lists.
void frmNames::ShowBestOfThree(bool shown) {
  fraBoT.SetVisible(shown);
  fraGT3.SetVisible(!shown);
  fraPList.SetVisible(!shown);
}

void frmNames::ClearAdd() {
  if (session_.PlayerCount < 1) {
    for (TextBox* box : {&txtAddFn0, &txtAddTm0, &txtAddGrd0}) box->SetText({});
    panAddPlayer0.Enable();
    return;
  }
  txtAddFn.SetText({});
  cboAddGrd.SetText({});
  cboAddTm.SetText({});
  panAddPlayer.Enable();
}

void frmNames::EnableButtons(bool enabled) {
  for (Command* command : {&cmdEdBOT, &cmdEdGradeName, &cmdEdTeamName, &cmdAddCancel, &cmdNewGrd,
                           &cmdNewTm, &cmdSearch}) {
    command->SetEnabled(enabled);
  }
}

void frmNames::ButtonsOFF() { EnableButtons(false); }

void frmNames::ButtonsON() {
  EnableButtons(true);
  session_.EditRecord = 0;
}

/// The commands come back also when the work fails, since they alone lead on.
void frmNames::WithButtonsOff(const Handler& work) {
  ButtonsOFF();
  try {
    work();
  } catch (const RunTimeError&) {
    context_.channels.AbandonAll();
    ButtonsON();
    throw;
  }
}

void frmNames::BackToNames() {
  ButtonsON();
  txtAddSn.SetFocus();
}

void frmNames::HoldCombos(bool held) {
  cboAddGrd.SetHeld(held);
  cboAddTm.SetHeld(held);
}

void frmNames::FreeCombos() { HoldCombos(false); }

void frmNames::EnablePanel(const char* caption) {
  panAddPlayer.Enable();
  panAddPlayer.SetCaption(caption);
}

void frmNames::ClearNames() {
  txtAddSn.SetText({});
  txtAddFn.SetText({});
}

void frmNames::PutGradeAndTeamBack(const std::string& grade, const std::string& team) {
  cboAddTm.SetText(team);
  cboAddGrd.SetText(grade);
  txtAddSn.SetFocus();
}

void frmNames::cmdAddCancel_Click() {
  const bool to_score_sheet = session_.Flag == kFromScoreSheet && InScreens().Knows("frmResults");
  InScreens().Unload(*this);
  if (!to_score_sheet) return;
  InScreens().Show("frmResults");
  if (Screen* const menu = InScreens().Find("frmDB")) InScreens().Hide(*menu);
}

void frmNames::cmdSearch_Click() {
  const std::string surname = AskSurname(context_);
  if (surname.empty()) return;
  session_.SearchText = surname;
  session_.Flag = kSearchFromSetup;
  InScreens().Hide(*this);
  InScreens().Show("frmSearchPlayer");
}

}  // namespace marlowbeck
