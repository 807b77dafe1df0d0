#pragma once

#include <filesystem>

#include "data/file_system.h"

namespace marlowbeck {

/// The machine's own files. The one place that knows the operating system: system errors become
/// error numbers here, and names are matched without regard to case on any disk.
class RealFileSystem : public FileSystem {
 public:
  RealFileSystem();

  std::unique_ptr<File> Open(const std::string& path, OpenMode mode) override;
  bool Exists(const std::string& path) override;
  std::uint64_t LengthOf(const std::string& path) override;
  void Delete(const std::string& path) override;
  void Discard(const std::string& path) override;
  void Rename(const std::string& from, const std::string& to) override;
  void Replace(const std::string& from, const std::string& to) override;
  void ReplaceUnsynced(const std::string& from, const std::string& to) override;
  void SyncFolder(const std::string& folder) override;
  void Copy(const std::string& from, const std::string& to) override;
  void MakeFolder(const std::string& path) override;
  void RemoveFolder(const std::string& path) override;
  std::vector<FolderEntry> List(const std::string& folder) override;
  void ChangeFolder(const std::string& folder) override;
  std::string CurrentFolder() override;
  std::string WholePath(const std::string& folder) override;
  bool AreSameFolder(const std::string& a, const std::string& b) override;
  std::vector<std::string> Drives() override;

 private:
  /// The file or folder that a text names: in the current folder when bare, with each part in the
  /// case in which it lies on the disk when it does.
  [[nodiscard]] std::filesystem::path Located(const std::string& path) const;
  /// The same for a folder, which has to be there.
  [[nodiscard]] std::filesystem::path LocatedFolder(const std::string& folder) const;

  /// Answers what it has replaced.
  std::filesystem::path PutInPlace(const std::string& from, const std::string& to);

  std::filesystem::path current_;
};

/// A path of the machine as a text, as TextOfName has it.
[[nodiscard]] std::string TextOfPath(const std::filesystem::path& path);

}  // namespace marlowbeck
