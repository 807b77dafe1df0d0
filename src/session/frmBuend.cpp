#include "session/frmBuend.h"

#include "data/text.h"
#include "session/shared_procedures.h"
#include "ui/screens.h"

namespace marlowbeck {
namespace {

constexpr int kHelpTopic = 215;

}  // namespace

frmBuend::frmBuend(Screens& screens, const Context& context)
    : Screen(screens, "frmBuend", "[Marlowbeck]  BEFORE YOU QUIT"), context_(context) {
  optBU0.Click = [this] { cmdAddSave0.SetCaption("Backup Now"); };
  optBU1.Click = [this] { cmdAddSave0.SetCaption("Quit Now"); };
  cmdAddSave0.Click = [this] { cmdAddSave0_Click(); };
  cmdMainMenu.Click = [this] { cmdMainMenu_Click(); };
  cmdHelp.Click = [this] { context_.platform.help.Open("qz1.HLP", kHelpTopic); };
  Defaults = {&cmdAddSave0};
  Helps = {&cmdHelp};
}

void frmBuend::Load() {
  Label2.SetCaption(Lines({"Marlowbeck highly recommends that you copy your",
                           "data to another disk to avoid data loss, usually caused",
                           "by accidental erasure or equipment failure.", "",
                           "To ensure that your data is copied correctly, please",
                           "follow the step-by-step instructions in the Help file."}));
  optBU0.SetValue(true);
}

void frmBuend::CloseButton() { Quit(); }

void frmBuend::Escape() { Quit(); }

void frmBuend::Quit() {
  context_.channels.CloseAll();
  GoToWorkingFolderIfThere(context_);
  EndProgram(context_, InScreens());
}

void frmBuend::cmdAddSave0_Click() {
  if (optBU0.Value()) {
    Backup();
  } else {
    Quit();
  }
}

void frmBuend::Backup() {
  context_.channels.CloseAll();
  Screen* const backup = InScreens().Load("frmBackup");
  if (backup == nullptr) return;
  if (Screen* const menu = InScreens().Find("frmDB")) InScreens().Hide(*menu);
  backup->Find("cmdCancel")->SetCaption("End Marlowbeck");
  InScreens().Unload(*this);
  InScreens().Show("frmBackup");
}

void frmBuend::cmdMainMenu_Click() {
  if (Screen* const menu = InScreens().Find("frmDB")) InScreens().Unload(*menu);
  InScreens().Show("frmDB");
  InScreens().Unload(*this);
}

}  // namespace marlowbeck
