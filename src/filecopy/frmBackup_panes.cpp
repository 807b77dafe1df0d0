// The two panes of the file copier: where they stand, and which of their files are selected.

#include <algorithm>

#include "data/runtime_error.h"
#include "filecopy/copy_words.h"
#include "filecopy/frmBackup.h"
#include "session/messages.h"

namespace marlowbeck {
namespace {

constexpr const char* kNoneSelected = " No files selected ";
constexpr const char* kOwnFiles = "*.qza;*.qzi;*.qzl;*.qzr;*.qzs";
constexpr const char* kAllFiles = "*.*";

void Say(Label& label, std::string_view words, Meaning meaning) {
  label.SetCaption(words);
  label.SetMeaning(meaning);
}

/// Throws DeviceUnavailable for a drive that has gone, though the folder where it stood may be
/// left.
void ExpectReady(FileSystem& files, const std::string& drive) {
  const std::vector<std::string> drives = files.Drives();
  if (std::find(drives.begin(), drives.end(), drive) == drives.end()) {
    throw RunTimeError(ErrorNumber::DeviceUnavailable);
  }
}

}  // namespace

void frmBackup::Connect(CopyPane& pane, CopyPane& other) {
  pane.BuDrive.GotFocus = [&pane] { pane.BuDrive.TakeNew(); };
  pane.BuDrive.Change = [this, &pane] { DriveChanged(pane); };
  pane.BuDir.Change = [this, &pane] { FolderChanged(pane); };
  pane.BuDir.GotFocus = [this, &other] { FocusTaken(other); };
  pane.BuFile.GotFocus = [this, &other] { FocusTaken(other); };
  pane.BuFile.Click = [this, &pane, &other] { FileClicked(pane, other); };
  pane.BuFile.MouseUp = [&pane] { pane.cmdDelete.SetEnabled(!pane.BuFile.Marked().empty()); };
  pane.cmdAll.Click = [this, &pane, &other] { AllClicked(pane, other); };
  pane.cmdUS.Click = [this, &pane] { UnSelect(pane); };
  pane.cmdBu.Click = [this, &pane, &other] { CopyClicked(pane, other); };
  pane.cmdDelete.Click = [this, &pane] { DeleteFiles(pane); };
  pane.cmdDelFolder.Click = [this, &pane] { DeleteFolder(pane); };
  pane.cmdNew.Click = [this, &pane, &other] { NewFolder(pane, other); };
}

/// On the program's folder. Nothing is told of it: the pane is not yet connected.
void frmBackup::Start(CopyPane& pane) {
  const std::string folder = context_.channels.Files().CurrentFolder();
  pane.BuDrive.Refresh();
  pane.BuFile.SetPattern(kOwnFiles);
  pane.BuDir.SetPath(folder);
  pane.BuFile.SetPath(folder);
  pane.BuDrive.ShowDriveOf(pane.Path());
  pane.lblPath.SetCaption(ShortenedPath(pane.Path()));
}

/// A drive that cannot be read leaves the pane where it was.
void frmBackup::DriveChanged(CopyPane& pane) {
  const std::string drive = pane.BuDrive.Drive();
  const std::string before = pane.Path();
  try {
    ExpectReady(context_.channels.Files(), drive);
    pane.BuDir.SetPath(drive);
  } catch (const RunTimeError&) {
    Warning(context_, "Drive " + drive + " is not available!    ");
    pane.BuDrive.ShowDriveOf(before);
    return;
  }
  context_.channels.Files().ChangeFolder(pane.Path());
}

void frmBackup::FolderChanged(CopyPane& pane) {
  context_.channels.Files().ChangeFolder(pane.Path());
  pane.BuDrive.ShowDriveOf(pane.Path());
  pane.lblPath.SetCaption(ShortenedPath(pane.Path()));
  pane.BuFile.SetPath(pane.Path());
  UnSelectS();
  UnSelectD();
  ChkDeleteButton();
}

/// Selecting a file makes its pane the source.
void frmBackup::FileClicked(CopyPane& pane, CopyPane& other) {
  const int selected = static_cast<int>(pane.BuFile.Marked().size());
  pane.cmdDelete.Enable();
  pane.cmdUS.Enable();
  pane.cmdBu.Enable();
  pane.cmdNew.Disable();
  other.cmdUS.Disable();
  other.cmdBu.Disable();
  pane.cmdAll.SetEnabled(selected < pane.BuFile.Count());
  Say(pane.lbl, " SOURCE DRIVE ", Meaning::Green);
  Say(other.lbl, " TARGET DRIVE ", Meaning::Red);
  pane.txtNumFile.SetText(SelectedWords(selected));
}

/// Only one pane has files selected: the one that is worked in.
void frmBackup::FocusTaken(CopyPane& other) {
  other.ClearSelection();
  other.cmdDelete.Disable();
  other.cmdUS.Disable();
  other.cmdAll.SetEnabled(other.HasFiles());
}

void frmBackup::AllClicked(CopyPane& pane, CopyPane& other) {
  pane.SelectAll();
  FocusTaken(other);
  FileClicked(pane, other);
}

void frmBackup::UnSelect(CopyPane& pane) {
  pane.ClearSelection();
  pane.cmdDelete.Disable();
  pane.cmdUS.Disable();
  pane.cmdBu.Disable();
  pane.cmdNew.Enable();
  Blank();
  pane.cmdAll.SetEnabled(pane.HasFiles());
}

void frmBackup::Filter() {
  UnSelectS();
  UnSelectD();
  for (CopyPane* pane : {&S, &D}) {
    pane->BuFile.SetPattern(opt1.Value() ? kOwnFiles : kAllFiles);
    pane->ShowCount();
  }
  ChkDeleteButton();
}

void frmBackup::Blank() {
  for (CopyPane* pane : {&S, &D}) {
    Say(pane->lbl, kNoneSelected, Meaning::Black);
    pane->Refresh();
    pane->ShowCount();
  }
}

void frmBackup::ChkDeleteButton() {
  for (CopyPane* pane : {&S, &D}) {
    pane->cmdAll.SetEnabled(pane->HasFiles());
    pane->cmdDelFolder.SetEnabled(!pane->HasFiles());
  }
}

}  // namespace marlowbeck
