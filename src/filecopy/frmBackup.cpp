#include "filecopy/frmBackup.h"

#include "data/runtime_error.h"
#include "session/shared_procedures.h"
#include "ui/screens.h"

namespace marlowbeck {
namespace {

constexpr const char* kReplaceFile = "QzCopy.qz3";
constexpr const char* kMainMenu = "Main Menu";
constexpr int kHelpTopic = 215;

}  // namespace

frmBackup::frmBackup(Screens& screens, const Context& context)
    : Screen(screens, "frmBackup", "[Marlowbeck]  File Copy Utility"),
      S(*this, context.channels.Files(), "Frame1", 'S'),
      D(*this, context.channels.Files(), "Frame2", 'D'),
      context_(context) {
  opt1.SetValue(true);
  picPb.Hide();
  opt0.Click = [this] { Filter(); };
  opt1.Click = [this] { Filter(); };
  chkReplace.Click = [this] { WriteReplaceChoice(); };
  cmdHelp.Click = [this] { context_.platform.help.Open("qz1.HLP", kHelpTopic); };
  cmdMain.Click = [this] { BackToMainMenu(); };
  cmdCancel.Click = [this] { InScreens().Unload(*this); };
  Cancels = {&cmdCancel};
  Helps = {&cmdHelp};
}

void frmBackup::Load() {
  context_.GoToWorkingFolder();
  Start(S);
  Start(D);
  Connect(S, D);
  Connect(D, S);
  Blank();
  for (CopyPane* pane : {&S, &D}) {
    pane->cmdDelete.Disable();
    pane->cmdBu.Disable();
    pane->cmdUS.Disable();
  }
  ChkDeleteButton();
}

void frmBackup::Activate() {
  cmdMain.SetVisible(cmdCancel.Caption() != kMainMenu);
  if (!opt1.Value()) {
    opt1.SetValue(true);
    Filter();
  }
  ChkDeleteButton();
  ReadReplaceChoice();
}

/// Opened from the main menu it leads back to it; opened on the way out, to the end.
void frmBackup::Unload() {
  GoToWorkingFolderIfThere(context_);
  Screen* const menu = InScreens().Find("frmDB");
  if (menu != nullptr && menu->Visible()) {
    menu->SetEnabled(true);
  } else {
    EndProgram(context_, InScreens());
  }
}

/// The menu is loaded anew, since its way out has gone from it.
void frmBackup::BackToMainMenu() {
  if (Screen* const menu = InScreens().Find("frmDB")) InScreens().Unload(*menu);
  InScreens().Show("frmDB");
  InScreens().Unload(*this);
}

void frmBackup::ReadReplaceChoice() {
  context_.GoToWorkingFolder();
  try {
    context_.channels.OpenInput(Channel::Side, kReplaceFile);
    chkReplace.SetValue(context_.channels.Reader(Channel::Side).Text() == "YES");
    context_.channels.Close(Channel::Side);
  } catch (const RunTimeError&) {
    context_.channels.AbandonAll();
    chkReplace.SetValue(false);
    WriteReplaceChoice();
  }
}

void frmBackup::WriteReplaceChoice() {
  context_.GoToWorkingFolder();
  context_.channels.OpenOutput(Channel::Side, kReplaceFile, Keeping::Lasting);
  context_.channels.Writer(Channel::Side).PlainLine(chkReplace.Value() ? "YES" : "NO");
  context_.channels.Close(Channel::Side);
}

}  // namespace marlowbeck
