// Copying the selected files of one pane into the folder of the other.

#include "data/runtime_error.h"
#include "data/table.h"
#include "data/text.h"
#include "filecopy/copy_words.h"
#include "filecopy/frmBackup.h"
#include "filecopy/whole_copy.h"
#include "session/messages.h"

namespace marlowbeck {
namespace {

constexpr int kMostTargets = 1000;

/// The names that the target's list shows when a run begins. More than a run can look through
/// throw SubscriptOutOfRange before anything is copied.
class TargetNames {
 public:
  explicit TargetNames(const FileList& list) {
    for (const std::string& name : list.Lines()) names_[++count_] = name;
  }

  [[nodiscard]] bool Has(const std::string& name) const {
    for (int i = 1; i <= count_; ++i) {
      if (EqualsIgnoringCase(names_[i], name)) return true;
    }
    return false;
  }

 private:
  Table<std::string> names_{1, kMostTargets};
  int count_ = 0;
};

/// A folder that has gone is left for the copy to tell of.
bool AreSame(FileSystem& files, const std::string& a, const std::string& b) {
  try {
    return files.AreSameFolder(a, b);
  } catch (const RunTimeError&) {
    return a == b;
  }
}

}  // namespace

void frmBackup::CopyClicked(CopyPane& from, CopyPane& to) {
  DoCopy(from, to);
  from.cmdUS.Disable();
  from.cmdBu.Disable();
  to.cmdDelFolder.Disable();
  if (to.HasFiles()) to.cmdAll.Enable();
}

void frmBackup::DoCopy(CopyPane& from, CopyPane& to) {
  if (from.BuFile.Marked().empty()) {
    GoodMessage(context_, "No files selected to copy.");
  } else if (AreSame(context_.channels.Files(), from.Path(), to.Path())) {
    Warning(context_, "You cannot copy a file to itself !");
    UnSelect(from);
  } else if (AskToCopy(from, to)) {
    WithBar(from, static_cast<int>(from.BuFile.Marked().size()),
            [this, &from, &to] { CopySelected(from, to); });
  } else {
    UnSelect(from);
  }
}

bool frmBackup::AskToCopy(CopyPane& from, CopyPane& to) {
  const int files = static_cast<int>(from.BuFile.Marked().size());
  return WarningYesNo(context_, CopyQuestion(files, to.Path(), chkReplace.Value())) == kAnswerYes;
}

void frmBackup::CopySelected(CopyPane& from, CopyPane& to) {
  const std::string target = to.Path();
  int copied = 0;
  const bool to_the_end = CopyEach(from, to, copied);
  EndCopying(from);
  context_.channels.Files().SyncFolder(target);
  if (to_the_end) GoodMessage(context_, CopiedReport(copied));
}

/// False when the run was ended by the user.
bool frmBackup::CopyEach(CopyPane& from, CopyPane& to, int& copied) {
  const std::string& source = from.Path();
  const std::string target = to.Path();
  const TargetNames targets(to.BuFile);
  context_.channels.Files().ChangeFolder(source);
  for (const std::string& name : from.Selected()) {
    // KEPT: a name counts as there when the target's list showed it as the run began, so that what
    // has come since is overwritten unasked; a repair would look at the disk.
    if (!chkReplace.Value() && targets.Has(name)) {
      const int answer = WarningYesNoCancel(context_, ReplaceQuestion(name, target));
      if (answer == kAnswerCancel) return false;
      if (answer != kAnswerYes) continue;
    }
    if (!CopyOrGiveUp(PathIn(source, name), to, target)) return false;
    to.BuFile.Include(name);
    ++copied;
    Advance();
  }
  return true;
}

/// A full disk can be changed for another one, as often as it takes. False when it was not.
bool frmBackup::CopyOrGiveUp(const std::string& source, CopyPane& to, const std::string& folder) {
  for (;;) {
    try {
      CopyWhole(context_.channels.Files(), source, folder);
      return true;
    } catch (const RunTimeError& error) {
      if (error.Number() != static_cast<int>(ErrorNumber::DiskFull)) throw;
    }
    context_.channels.AbandonAll();
    to.BuFile.Refresh();
    const int answer =
        WarningYesNo(context_, Lines({"Your disk is full !", "Please insert another disk.", "",
                                      "Do you wish to continue ?"}));
    if (answer != kAnswerYes) return false;
    to.BuFile.Refresh();
  }
}

void frmBackup::EndCopying(CopyPane& from) {
  picPb.Hide();
  UnSelect(from);
}

void frmBackup::WithBar(CopyPane& pane, int files, const std::function<void()>& work) {
  Pb.SetRange(0, files);
  Pb.SetValue(0);
  try {
    work();
  } catch (const RunTimeError&) {
    GiveUp(pane);
    throw;
  }
  picPb.Hide();
}

/// What led here is told by the error box, so that nothing else is.
void frmBackup::GiveUp(CopyPane& pane) {
  picPb.Hide();
  try {
    UnSelect(pane);
    ChkDeleteButton();
  } catch (const RunTimeError&) {
    pane.ClearSelection();
  }
}

void frmBackup::Advance() {
  picPb.Show();
  Pb.SetValue(Pb.Value() + 1);
  context_.platform.display.Refresh();
}

}  // namespace marlowbeck
