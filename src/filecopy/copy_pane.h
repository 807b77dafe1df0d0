#pragma once

#include <string>
#include <string_view>
#include <vector>

#include "ui/disk_lists.h"

namespace marlowbeck {

/// One pane of the file copier: a drive, a folder of it and its files, with what can be done to
/// them. Its controls end in the pane's letter. What pressing them does is the screen's affair.
struct CopyPane {
  CopyPane(Screen& screen, FileSystem& files, std::string_view frame, char letter);

  Panel Frame;
  Label lbl;      ///< whether it is the source or the target
  Label lblPath;  ///< the folder, shortened where it is long
  DriveList BuDrive;
  FolderList BuDir;
  FileList BuFile;
  TextBox txtNumFile;
  Command cmdAll;
  Command cmdBu;
  Command cmdUS;
  Command cmdNew;
  Command cmdDelete;
  Command cmdDelFolder;

  [[nodiscard]] const std::string& Path() const { return BuDir.Path(); }
  [[nodiscard]] bool HasFiles() const { return BuFile.Count() > 0; }
  /// The names of the files that are selected, in the order of the list.
  [[nodiscard]] std::vector<std::string> Selected() const;
  void SelectAll();
  /// No file is selected any more; the count is back.
  void ClearSelection();
  void ShowCount();
  /// Reads the disk anew: the folders alone, or the files too. A folder that has gone gives way to
  /// the nearest one above it.
  void RefreshFolders();
  void Refresh();

 private:
  FileSystem& files_;
};

}  // namespace marlowbeck
