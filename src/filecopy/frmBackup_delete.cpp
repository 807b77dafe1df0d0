// Deleting files, and the making and deleting of folders.

#include "data/runtime_error.h"
#include "data/text.h"
#include "filecopy/copy_words.h"
#include "filecopy/frmBackup.h"
#include "filecopy/whole_copy.h"
#include "session/messages.h"

namespace marlowbeck {
namespace {

/// The one file that is never deleted.
constexpr const char* kProtectedName = "COMMAND.COM";

}  // namespace

void frmBackup::DeleteFiles(CopyPane& pane) {
  const std::vector<std::string> names = pane.Selected();
  if (names.empty()) return;
  if (DangerYN(context_, DeleteQuestion(names, pane.Path())) != kAnswerYes) return UnSelect(pane);
  FileSystem& files = context_.channels.Files();
  WithBar(pane, static_cast<int>(names.size()), [&] {
    files.ChangeFolder(pane.Path());
    picPb.Show();
    for (const std::string& name : names) {
      // KEPT: COMMAND.COM is passed over without a word, though the question counted it; a repair
      // would say so, or delete it.
      if (UpperCase(name) != kProtectedName) files.Delete(PathIn(pane.Path(), name));
      Advance();
    }
  });
  EndDeleting(pane);
}

void frmBackup::EndDeleting(CopyPane& pane) {
  Blank();
  pane.cmdDelete.Disable();
  pane.cmdUS.Disable();
  pane.cmdBu.Disable();
  pane.cmdNew.Enable();
  ChkDeleteButton();
}

void frmBackup::DeleteFolder(CopyPane& pane) {
  const std::string folder = pane.Path();
  if (DangerYN(context_, DeleteFolderQuestion(folder)) != kAnswerYes) return;
  FileSystem& files = context_.channels.Files();
  files.ChangeFolder(folder);
  files.ChangeFolder("..");
  pane.BuDir.SetPath(files.CurrentFolder());
  files.RemoveFolder(folder);
  EndDeleting(pane);
  // KEPT: what lies empty in the folder above goes too, unasked; a repair would leave it alone.
  DeleteEmptyFiles(files, pane.Path(), pane.BuFile.Lines());
  EndDeleting(pane);
}

/// What is selected in the other pane stays so.
void frmBackup::NewFolder(CopyPane& pane, CopyPane& other) {
  const std::string name = Trim(context_.platform.boxes.Input(
      {NewFolderPrompt(pane.Path()), "Marlowbeck", "New Folder", {}, true}));
  if (name.empty()) return;
  context_.channels.Files().MakeFolder(PathIn(pane.Path(), name));
  pane.Refresh();
  other.RefreshFolders();
}

}  // namespace marlowbeck
