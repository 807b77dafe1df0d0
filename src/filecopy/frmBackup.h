#pragma once

#include <functional>
#include <string>

#include "filecopy/copy_pane.h"
#include "ui/context.h"
#include "ui/controls.h"
#include "ui/screen.h"

namespace marlowbeck {

/// Copies files from one folder to another, to take a season to another disk and to bring it back.
/// The pane in which a file is selected is the source, the other one the target.
struct frmBackup : Screen {
  frmBackup(Screens& screens, const Context& context);

  CopyPane S;
  CopyPane D;
  OptionButton opt0{*this, "opt(0)", " Show All Files"};
  OptionButton opt1{*this, "opt(1)", " Marlowbeck files Only"};
  CheckBox chkReplace{*this, "chkReplace", "Overwrite Existing Files"};
  Panel picPb{*this, "picPb"};
  ProgressBar Pb{picPb, "Pb"};
  Command cmdHelp{*this, "cmdHelp", "Help"};
  Command cmdMain{*this, "cmdMain", "Main Menu"};
  Command cmdCancel{*this, "cmdCancel"};  ///< its caption is given by whoever opens the screen

  void Load() override;
  void Activate() override;
  void Unload() override;

  void DoCopyS() { DoCopy(S, D); }
  void DoCopyD() { DoCopy(D, S); }
  void UnSelectS() { UnSelect(S); }
  void UnSelectD() { UnSelect(D); }
  /// Neither pane is the source; what the disk holds is read anew.
  void Blank();
  /// All of a pane's files can be selected where it has some; its folder can be deleted where not.
  void ChkDeleteButton();

 private:
  // The panes. The first one named is the one that is worked in.
  void Connect(CopyPane& pane, CopyPane& other);
  void Start(CopyPane& pane);
  void DriveChanged(CopyPane& pane);
  void FolderChanged(CopyPane& pane);
  void FileClicked(CopyPane& pane, CopyPane& other);
  void FocusTaken(CopyPane& other);
  void AllClicked(CopyPane& pane, CopyPane& other);
  void UnSelect(CopyPane& pane);
  /// Both panes list the files that the options let through.
  void Filter();

  // Copying.
  void CopyClicked(CopyPane& from, CopyPane& to);
  void DoCopy(CopyPane& from, CopyPane& to);
  [[nodiscard]] bool AskToCopy(CopyPane& from, CopyPane& to);
  void CopySelected(CopyPane& from, CopyPane& to);
  [[nodiscard]] bool CopyEach(CopyPane& from, CopyPane& to, int& copied);
  [[nodiscard]] bool CopyOrGiveUp(const std::string& source, CopyPane& to,
                                  const std::string& folder);
  void EndCopying(CopyPane& from);

  // Deleting, and folders.
  void DeleteFiles(CopyPane& pane);
  void EndDeleting(CopyPane& pane);
  void DeleteFolder(CopyPane& pane);
  void NewFolder(CopyPane& pane, CopyPane& other);

  /// Does work on files that advances the bar. A failure leaves no bar and no selection behind.
  void WithBar(CopyPane& pane, int files, const std::function<void()>& work);
  void Advance();
  void GiveUp(CopyPane& pane);

  void ReadReplaceChoice();
  void WriteReplaceChoice();
  void BackToMainMenu();

  const Context& context_;
};

}  // namespace marlowbeck
