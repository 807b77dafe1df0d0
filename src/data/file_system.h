#pragma once

#include <cstddef>
#include <cstdint>
#include <memory>
#include <span>
#include <string>
#include <vector>

namespace marlowbeck {

/// An open file, read and written at byte positions. Closing happens by Close, which can fail, or
/// by destruction, which keeps silent.
class File {
 public:
  virtual ~File() = default;

  [[nodiscard]] virtual std::uint64_t Length() = 0;
  /// Fills as much of `into` as the file holds from `position` on; answers the number of bytes.
  virtual std::size_t ReadAt(std::uint64_t position, std::span<std::byte> into) = 0;
  /// Writes all of `from` at `position`, growing the file where needed.
  virtual void WriteAt(std::uint64_t position, std::span<const std::byte> from) = 0;
  /// Returns once all written bytes, and the file's name when it is new, have reached the disk.
  virtual void Sync() = 0;
  virtual void Close() = 0;
};

enum class OpenMode {
  Read,       ///< must exist
  ReadWrite,  ///< made, empty, when missing
  Truncate,   ///< made, or emptied
};

struct FolderEntry {
  std::string name;
  bool is_folder = false;
};

/// The only door to the disk. Paths are texts of code page 1252, with escapes for the characters
/// that it has no place for; a bare name lies in the current folder; names are found without regard
/// to case. Failures throw RunTimeError.
class FileSystem {
 public:
  virtual ~FileSystem() = default;

  [[nodiscard]] virtual std::unique_ptr<File> Open(const std::string& path, OpenMode mode) = 0;
  [[nodiscard]] virtual bool Exists(const std::string& path) = 0;
  /// In bytes.
  [[nodiscard]] virtual std::uint64_t LengthOf(const std::string& path) = 0;
  virtual void Delete(const std::string& path) = 0;
  /// Takes away a work file that is of no more use, whatever its protection. That there is none, or
  /// that it cannot be, is of no matter.
  virtual void Discard(const std::string& path) = 0;
  /// Fails with FileAlreadyExists when there is a file named `to`.
  virtual void Rename(const std::string& from, const std::string& to) = 0;
  /// Puts `from` in the place of `to`, whether or not that exists, in one step, and returns once
  /// the folder has reached the disk. Both must lie on one volume.
  virtual void Replace(const std::string& from, const std::string& to) = 0;
  /// The same, but that the folder may reach the disk later, as SyncFolder has it. After a power
  /// cut before that either file is there. For runs over many files.
  virtual void ReplaceUnsynced(const std::string& from, const std::string& to) = 0;
  /// Returns once the names in a folder have reached the disk.
  virtual void SyncFolder(const std::string& folder) = 0;
  /// All of a file, with the time of its last change. Returns once the bytes have reached the disk.
  virtual void Copy(const std::string& from, const std::string& to) = 0;
  virtual void MakeFolder(const std::string& path) = 0;
  virtual void RemoveFolder(const std::string& path) = 0;
  [[nodiscard]] virtual std::vector<FolderEntry> List(const std::string& folder) = 0;
  /// Makes a folder the one in which bare names lie.
  virtual void ChangeFolder(const std::string& folder) = 0;
  [[nodiscard]] virtual std::string CurrentFolder() = 0;
  /// A folder's path from the root on, as it lies on the disk and without a separator at its end.
  /// Throws PathNotFound when there is no such folder.
  [[nodiscard]] virtual std::string WholePath(const std::string& folder) = 0;
  /// Whether two folders are one and the same, by whatever spelling, link or mount they are
  /// reached.
  [[nodiscard]] virtual bool AreSameFolder(const std::string& a, const std::string& b) = 0;
  /// The drives: letters as "C:", or the folders at which disks are mounted.
  [[nodiscard]] virtual std::vector<std::string> Drives() = 0;
};

/// The part of a path after its last folder separator.
[[nodiscard]] std::string FileNameOf(const std::string& path);
/// The path of a name in a folder: with one separator between them, also where the folder is a
/// root.
[[nodiscard]] std::string PathIn(const std::string& folder, const std::string& name);

}  // namespace marlowbeck
