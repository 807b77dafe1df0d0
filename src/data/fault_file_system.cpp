#include "data/fault_file_system.h"

#include <algorithm>
#include <csignal>
#include <cstdlib>
#include <utility>
#include <vector>

#include "data/runtime_error.h"

namespace marlowbeck {
namespace {

constexpr std::array<std::string_view, kFileOperations> kWords = {
    "open", "read", "write", "sync", "close", "delete", "rename", "copy", "mkdir", "rmdir"};

[[noreturn]] void KillProcess() {
#ifdef SIGKILL
  std::raise(SIGKILL);
#endif
  std::_Exit(137);
}

}  // namespace

std::string_view WordOf(FileOperation operation) {
  return kWords[static_cast<std::size_t>(operation)];
}

std::optional<FileOperation> FileOperationFromWord(std::string_view word) {
  const auto* const place = std::find(kWords.begin(), kWords.end(), word);
  if (place == kWords.end()) return std::nullopt;
  return static_cast<FileOperation>(place - kWords.begin());
}

void FaultPlan::FailAt(std::optional<FileOperation> operation, long nth, int number,
                       bool and_after) {
  faults_.push_back({Kind::Fail, operation, nth, number, and_after, 0});
}

void FaultPlan::CutAt(long nth, std::size_t bytes, int number) {
  faults_.push_back({Kind::Cut, FileOperation::Write, nth, number, false, bytes});
}

void FaultPlan::CrashAt(std::optional<FileOperation> operation, long nth) {
  faults_.push_back({Kind::Crash, operation, nth, 0, false, 0});
}

void FaultPlan::Off() { faults_.clear(); }

long FaultPlan::Done(FileOperation operation) const {
  return done_[static_cast<std::size_t>(operation)];
}

long FaultPlan::DoneInAll() const {
  long sum = 0;
  for (const long count : done_) sum += count;
  return sum;
}

bool FaultPlan::Concerns(const Fault& fault, FileOperation operation) {
  if (!fault.operation || *fault.operation == operation) return true;
  return fault.kind == Kind::Cut && operation == FileOperation::Copy;
}

std::optional<std::size_t> FaultPlan::Begin(FileOperation operation) {
  ++done_[static_cast<std::size_t>(operation)];
  std::optional<Fault> due;
  for (auto fault = faults_.begin(); fault != faults_.end();) {
    if (!Concerns(*fault, operation) || --fault->countdown > 0) {
      ++fault;
      continue;
    }
    if (!due) due = *fault;
    fault = fault->and_after ? fault + 1 : faults_.erase(fault);
  }
  if (!due) return std::nullopt;
  if (due->kind == Kind::Crash) {
    if (kill) kill();
    KillProcess();
  }
  if (due->kind == Kind::Fail) throw RunTimeError(due->number);
  cut_number_ = due->number;
  return due->bytes;
}

class FaultFile : public File {
 public:
  FaultFile(std::unique_ptr<File> real, FaultPlan& plan) : real_(std::move(real)), plan_(plan) {}

  std::uint64_t Length() override { return real_->Length(); }

  std::size_t ReadAt(std::uint64_t position, std::span<std::byte> into) override {
    plan_.Begin(FileOperation::Read);
    return real_->ReadAt(position, into);
  }

  void WriteAt(std::uint64_t position, std::span<const std::byte> from) override {
    const auto cut = plan_.Begin(FileOperation::Write);
    if (!cut) return real_->WriteAt(position, from);
    real_->WriteAt(position, from.first(std::min(*cut, from.size())));
    throw RunTimeError(plan_.cut_number_);
  }

  void Sync() override {
    plan_.Begin(FileOperation::Sync);
    real_->Sync();
  }

  void Close() override {
    plan_.Begin(FileOperation::Close);
    real_->Close();
  }

 private:
  std::unique_ptr<File> real_;
  FaultPlan& plan_;
};

std::unique_ptr<File> FaultFileSystem::Open(const std::string& path, OpenMode mode) {
  plan_.Begin(FileOperation::Open);
  return std::make_unique<FaultFile>(real_.Open(path, mode), plan_);
}

void FaultFileSystem::Delete(const std::string& path) {
  plan_.Begin(FileOperation::Delete);
  real_.Delete(path);
}

void FaultFileSystem::Discard(const std::string& path) {
  try {
    plan_.Begin(FileOperation::Delete);
  } catch (const RunTimeError&) {
    return;
  }
  real_.Discard(path);
}

void FaultFileSystem::Rename(const std::string& from, const std::string& to) {
  plan_.Begin(FileOperation::Rename);
  real_.Rename(from, to);
}

void FaultFileSystem::Replace(const std::string& from, const std::string& to) {
  plan_.Begin(FileOperation::Rename);
  real_.Replace(from, to);
}

void FaultFileSystem::ReplaceUnsynced(const std::string& from, const std::string& to) {
  plan_.Begin(FileOperation::Rename);
  real_.ReplaceUnsynced(from, to);
}

void FaultFileSystem::SyncFolder(const std::string& folder) {
  plan_.Begin(FileOperation::Sync);
  real_.SyncFolder(folder);
}

void FaultFileSystem::Copy(const std::string& from, const std::string& to) {
  const auto cut = plan_.Begin(FileOperation::Copy);
  if (!cut) return real_.Copy(from, to);
  const auto source = real_.Open(from, OpenMode::Read);
  std::vector<std::byte> bytes(
      static_cast<std::size_t>(std::min<std::uint64_t>(*cut, source->Length())));
  bytes.resize(source->ReadAt(0, bytes));
  real_.Open(to, OpenMode::Truncate)->WriteAt(0, bytes);
  throw RunTimeError(plan_.cut_number_);
}

void FaultFileSystem::MakeFolder(const std::string& path) {
  plan_.Begin(FileOperation::MakeFolder);
  real_.MakeFolder(path);
}

void FaultFileSystem::RemoveFolder(const std::string& path) {
  plan_.Begin(FileOperation::RemoveFolder);
  real_.RemoveFolder(path);
}

}  // namespace marlowbeck
