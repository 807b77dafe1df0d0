#pragma once

#include <string>
#include <string_view>
#include <vector>

#include "data/file_system.h"
#include "ui/controls.h"

namespace marlowbeck {

// The drives, the folders and the files of a disk. They fill themselves: a screen says where to
// look, and a person goes on from there. What cannot be read throws a run-time error, and the list
// stays as it was.

/// What the three share. The file system must outlive them.
class DiskList : public ListBox {
 public:
  /// Reads the disk anew. No line of folders or files is current or marked after it.
  virtual void Refresh() = 0;

 protected:
  DiskList(const Owner& owner, Kind kind, std::string_view name, FileSystem& files,
           std::string_view caption)
      : ListBox(owner, kind, name, caption), files_(files) {}

  [[nodiscard]] FileSystem& Files() const { return files_; }
  void SetLines(const std::vector<std::string>& lines);

 private:
  FileSystem& files_;
};

/// The drives of the machine. Empty until Refresh.
class DriveList : public DiskList {
 public:
  DriveList(const Owner& owner, std::string_view name, FileSystem& files,
            std::string_view caption = {})
      : DiskList(owner, Kind::Drives, name, files, caption) {}

  /// The current drive, empty for none. That it can be read is not said.
  [[nodiscard]] const std::string& Drive() const { return drive_; }
  /// Makes the drive current on which a path lies: of several the innermost. Fires Click, and
  /// Change when it is another one, as a person's pick does. Throws DeviceUnavailable when it lies
  /// on none.
  void SetDrive(std::string_view path);
  /// The same for what is on show already: fires nothing. A path on no drive makes none current.
  void ShowDriveOf(std::string_view path);
  /// Those that have come since stand below the others, and those that have gone keep their lines,
  /// so that none moves away under the pointer that is about to pick it.
  void TakeNew();
  /// The current drive stays current as long as it is there.
  void Refresh() override;

 protected:
  void IndexAssigned() override;

 private:
  /// The line of the innermost drive on which a path lies; -1 when it lies on none.
  [[nodiscard]] int LineOf(std::string_view path) const;

  std::string drive_;
};

/// What shows a folder of the disk, named by its path; empty until that is set.
class PathList : public DiskList {
 public:
  [[nodiscard]] const std::string& Path() const { return path_; }
  /// Goes to a folder and reads it; a bare name lies in the current folder of the file system.
  /// Throws PathNotFound when there is no such folder.
  void SetPath(const std::string& folder);
  void Refresh() override;

 protected:
  using DiskList::DiskList;
  /// The lines for what lies in a folder, by name without regard to case.
  [[nodiscard]] virtual std::vector<std::string> LinesFor(
      const std::string& folder, const std::vector<FolderEntry>& entries) const = 0;
  virtual void PathChanged() {}

 private:
  std::string path_;
};

/// The folders in a folder, ".." first where there is one above it. A double click on a line, or
/// Enter, opens it. Fires Change when the path becomes another one, by program or by a person.
class FolderList : public PathList {
 public:
  FolderList(const Owner& owner, std::string_view name, FileSystem& files,
             std::string_view caption = {})
      : PathList(owner, Kind::Folders, name, files, caption) {}

  /// Goes to the folder of a line.
  void Open(int line);

 protected:
  [[nodiscard]] std::vector<std::string> LinesFor(
      const std::string& folder, const std::vector<FolderEntry>& entries) const override;
  void PathChanged() override { Fire(Change); }
};

/// The files in a folder whose names a pattern lets through.
class FileList : public PathList {
 public:
  FileList(const Owner& owner, std::string_view name, FileSystem& files,
           std::string_view caption = {})
      : PathList(owner, Kind::Files, name, files, caption) {}

  [[nodiscard]] const std::string& Pattern() const { return pattern_; }
  /// One pattern, or several parted by semicolons, as MatchesPattern takes them.
  void SetPattern(std::string_view pattern);
  /// A file of this name lies in the folder now: lists it where Refresh would, without a look at
  /// the disk. For long runs, at whose end Refresh has the last word.
  void Include(const std::string& name);

 protected:
  [[nodiscard]] std::vector<std::string> LinesFor(
      const std::string& folder, const std::vector<FolderEntry>& entries) const override;

 private:
  std::string pattern_ = "*.*";
};

/// Whether one of the patterns, parted by semicolons, fits a file's name without regard to case:
/// "?" stands for any character, "*" for any number of them, and "*.*" for every name.
[[nodiscard]] bool MatchesPattern(std::string_view name, std::string_view patterns);

}  // namespace marlowbeck
