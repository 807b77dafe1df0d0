#pragma once

#include <array>
#include <functional>
#include <memory>
#include <optional>
#include <string_view>

#include "data/file_system.h"

namespace marlowbeck {

enum class FileOperation {
  Open,
  Read,
  Write,
  Sync,
  Close,
  Delete,
  Rename,
  Copy,
  MakeFolder,
  RemoveFolder
};
inline constexpr std::size_t kFileOperations = 10;

/// "open", "read", "write", "sync", "close", "delete", "rename", "copy", "mkdir", "rmdir".
[[nodiscard]] std::string_view WordOf(FileOperation operation);
[[nodiscard]] std::optional<FileOperation> FileOperationFromWord(std::string_view word);

/// What is to go wrong, and a count of all that went on. `nth` counts operations of the kind from
/// the moment the fault is set, the first being 1; no operation stands for any of them.
class FaultPlan {
 public:
  void FailAt(std::optional<FileOperation> operation, long nth, int number, bool and_after);
  /// The nth write (a copy counts as one) puts its first `bytes` bytes on disk and then fails.
  void CutAt(long nth, std::size_t bytes, int number);
  void CrashAt(std::optional<FileOperation> operation, long nth);
  void Off();

  [[nodiscard]] long Done(FileOperation operation) const;
  [[nodiscard]] long DoneInAll() const;

  /// What a crash does: kills the process, unless a test puts something in its place.
  std::function<void()> kill;

 private:
  friend class FaultFileSystem;
  friend class FaultFile;

  enum class Kind { Fail, Cut, Crash };
  struct Fault {
    Kind kind = Kind::Fail;
    std::optional<FileOperation> operation;
    long countdown = 0;
    int number = 0;
    bool and_after = false;
    std::size_t bytes = 0;
  };

  /// Counts an operation; throws, or kills, when its time has come. Answers the number of bytes to
  /// write before failing with `cut_number_` when the operation is to be cut.
  std::optional<std::size_t> Begin(FileOperation operation);
  static bool Concerns(const Fault& fault, FileOperation operation);

  std::array<long, kFileOperations> done_{};
  std::vector<Fault> faults_;
  int cut_number_ = 0;
};

/// Wraps another file system and lets its operations fail, be cut short or be the last thing the
/// process does, as the plan has it. For tests and the driver.
class FaultFileSystem : public FileSystem {
 public:
  explicit FaultFileSystem(FileSystem& real) : real_(real) {}

  [[nodiscard]] FaultPlan& Plan() { return plan_; }

  std::unique_ptr<File> Open(const std::string& path, OpenMode mode) override;
  bool Exists(const std::string& path) override { return real_.Exists(path); }
  std::uint64_t LengthOf(const std::string& path) override { return real_.LengthOf(path); }
  void Delete(const std::string& path) override;
  /// Counts as a deletion. One that is to fail leaves the file.
  void Discard(const std::string& path) override;
  void Rename(const std::string& from, const std::string& to) override;
  void Replace(const std::string& from, const std::string& to) override;
  void ReplaceUnsynced(const std::string& from, const std::string& to) override;
  void SyncFolder(const std::string& folder) override;
  void Copy(const std::string& from, const std::string& to) override;
  void MakeFolder(const std::string& path) override;
  void RemoveFolder(const std::string& path) override;
  std::vector<FolderEntry> List(const std::string& folder) override { return real_.List(folder); }
  void ChangeFolder(const std::string& folder) override { real_.ChangeFolder(folder); }
  std::string CurrentFolder() override { return real_.CurrentFolder(); }
  std::string WholePath(const std::string& folder) override { return real_.WholePath(folder); }
  bool AreSameFolder(const std::string& a, const std::string& b) override {
    return real_.AreSameFolder(a, b);
  }
  std::vector<std::string> Drives() override { return real_.Drives(); }

 private:
  FileSystem& real_;
  FaultPlan plan_;
};

}  // namespace marlowbeck
