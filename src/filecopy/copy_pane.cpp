#include "filecopy/copy_pane.h"

#include "data/runtime_error.h"
#include "filecopy/copy_words.h"
#include "filecopy/whole_copy.h"

namespace marlowbeck {

CopyPane::CopyPane(Screen& screen, FileSystem& files, std::string_view frame, char letter)
    : Frame(screen, frame),
      lbl(Frame, std::string("lbl") + letter),
      lblPath(Frame, std::string("lblPath") + letter),
      BuDrive(Frame, std::string("BuDrive") + letter, files),
      BuDir(Frame, std::string("BuDir") + letter, files),
      BuFile(Frame, std::string("BuFile") + letter, files),
      txtNumFile(Frame, std::string("txtNumFile") + letter),
      cmdAll(Frame, std::string("cmdAll") + letter, "Select All"),
      cmdBu(Frame, std::string("cmdBu") + letter, "Copy"),
      cmdUS(Frame, std::string("cmdUS") + letter, "Unselect"),
      cmdNew(Frame, std::string("cmdNew") + letter, "New Folder"),
      cmdDelete(Frame, std::string("cmdDelete") + letter, "Delete File/s"),
      cmdDelFolder(Frame, std::string("cmdDelFolder") + letter, "Delete Folder"),
      files_(files) {
  BuFile.SetMulti(true);
  txtNumFile.SetLocked(true);
  txtNumFile.SetTabStop(false);
}

std::vector<std::string> CopyPane::Selected() const {
  std::vector<std::string> names;
  for (const int line : BuFile.Marked()) names.push_back(BuFile.Line(line));
  return names;
}

void CopyPane::SelectAll() {
  for (int line = 0; line < BuFile.Count(); ++line) BuFile.SetMarked(line, true);
}

void CopyPane::ClearSelection() {
  BuFile.ClearMarks();
  ShowCount();
}

void CopyPane::ShowCount() { txtNumFile.SetText(CountWords(BuFile.Count())); }

void CopyPane::RefreshFolders() {
  try {
    BuDir.Refresh();
  } catch (const RunTimeError&) {
    const std::string nearest = NearestFolder(files_, Path());
    if (nearest == Path()) throw;
    BuDir.SetPath(nearest);
  }
}

void CopyPane::Refresh() {
  RefreshFolders();
  BuFile.Refresh();
}

}  // namespace marlowbeck
