#include "setup/frmSeason.h"

#include "data/competition.h"
#include "data/text.h"
#include "session/season.h"
#include "session/shared_procedures.h"
#include "ui/screens.h"

namespace marlowbeck {

frmSeason::frmSeason(Screens& screens, const Context& context)
    : Screen(screens, "frmSeason", "[Marlowbeck]  Change Season Description"),
      context_(context),
      session_(context.session) {
  cboGrades.Click = [this] {
    if (!filling_) cboGrades_Click();
  };
  txtNewSeason.Change = [this] { cmdLicSave.SetEnabled(!txtNewSeason.Text().empty()); };
  SSCommand1.Click = [this] { txtNewSeason.SetText(lblOldSeason.Caption()); };
  cmdLicSave.Click = [this] { cmdLicSave_Click(); };
  cmdGrade.Click = [this] { cmdGrade_Click(); };
  for (Command* exit : {&cmdCancel, &cmdLicCancel}) exit->Click = [this] { Leave(); };
  for (Command* help : {&cmdHlp, &SSCommand2}) {
    help->Click = [this] { context_.platform.help.Open("qz1.HLP", 0); };
  }
  Defaults = {&cmdLicSave};
  Cancels = {&cmdCancel, &cmdLicCancel};
  Helps = {&cmdHlp, &SSCommand2};
}

void frmSeason::Load() {
  cmdGrade_Click();
  ListGrades();
}

void frmSeason::Unload() { InScreens().Show("frmDB"); }

void frmSeason::Leave() { InScreens().Unload(*this); }

void frmSeason::ListGrades() {
  GetGrades(context_, cboGrades);
  if (cboGrades.Count() == 0) return;
  filling_ = true;
  cboGrades.SetIndex(0);
  filling_ = false;
}

void frmSeason::cmdGrade_Click() {
  fraEdit.Hide();
  fraGrade.Show();
  cboGrades.SetFocus();
}

void frmSeason::cboGrades_Click() {
  fraGrade.Hide();
  fraEdit.Show();
  FileNames();
  // What stands here when the reading fails is of this grade, not of the one before.
  lblGradeName.SetCaption(session_.Grade);
  lblOldSeason.SetCaption({});
  txtNewSeason.SetText({});
  cmdLicSave.Disable();
  Label1.Show();
  lblOldSeason.Show();
  GetSeason();
  SSCommand1.SetVisible(lblOldSeason.Visible());
  lblOldSeason.SetCaption(session_.SeasonDescription);
  txtNewSeason.SetFocus();
}

void frmSeason::FileNames() {
  session_.Grade = Trim(cboGrades.Text());
  NameGradeFiles(session_);
}

void frmSeason::GetSeason() {
  if (ReadSeason(context_)) return;
  Label1.Hide();
  lblOldSeason.Hide();
  Warning(context_, Lines({"The Season Description file was not found.    ", "",
                           "Enter a title that describes the Year and    ",
                           "Season Name of the competition for " + session_.Grade + ".    ", "",
                           "eg: MEN'S WINTER COMP 2004    ", "",
                           "(This will appear on most printed output).    "}));
}

void frmSeason::cmdLicSave_Click() {
  session_.SeasonDescription = txtNewSeason.Text();
  if (!Trimmed(session_.SeasonDescription).empty()) {
    WriteOneString(context_.channels, session_.SeasonFile, session_.SeasonDescription);
    OKSound(context_);
  }
  Leave();
}

}  // namespace marlowbeck
