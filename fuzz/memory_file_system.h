#pragma once

#include <algorithm>
#include <map>
#include <memory>
#include <string>
#include <vector>

#include "data/file_system.h"
#include "data/runtime_error.h"
#include "data/text.h"

namespace marlowbeck::fuzz {

/// Files in memory, without folders: quick enough to be made anew for every input.
class MemoryFileSystem : public FileSystem {
 public:
  using Content = std::shared_ptr<std::vector<std::byte>>;

  [[nodiscard]] std::vector<std::byte>& Bytes(const std::string& name) {
    Content& content = files_[UpperCase(name)];
    if (!content) content = std::make_shared<std::vector<std::byte>>();
    return *content;
  }

  std::unique_ptr<File> Open(const std::string& path, OpenMode mode) override {
    if (mode == OpenMode::Read) Require(path);
    auto& bytes = Bytes(path);
    if (mode == OpenMode::Truncate) bytes.clear();
    return std::make_unique<MemoryFile>(files_[UpperCase(path)]);
  }
  bool Exists(const std::string& path) override { return files_.contains(UpperCase(path)); }
  void Delete(const std::string& path) override {
    Require(path);
    files_.erase(UpperCase(path));
  }
  std::uint64_t LengthOf(const std::string& path) override {
    Require(path);
    return Bytes(path).size();
  }
  void Discard(const std::string& path) override { files_.erase(UpperCase(path)); }
  void Rename(const std::string& from, const std::string& to) override {
    if (Exists(to)) throw RunTimeError(ErrorNumber::FileAlreadyExists);
    Replace(from, to);
  }
  void Replace(const std::string& from, const std::string& to) override {
    Require(from);
    files_[UpperCase(to)] = files_[UpperCase(from)];
    if (UpperCase(from) != UpperCase(to)) files_.erase(UpperCase(from));
  }
  void ReplaceUnsynced(const std::string& from, const std::string& to) override {
    Replace(from, to);
  }
  void SyncFolder(const std::string&) override {}
  void Copy(const std::string& from, const std::string& to) override {
    Require(from);
    Bytes(to) = Bytes(from);
  }
  void MakeFolder(const std::string&) override {}
  void RemoveFolder(const std::string&) override {}
  std::vector<FolderEntry> List(const std::string&) override { return {}; }
  void ChangeFolder(const std::string&) override {}
  std::string CurrentFolder() override { return "/"; }
  std::string WholePath(const std::string&) override { return "/"; }
  bool AreSameFolder(const std::string&, const std::string&) override { return true; }
  std::vector<std::string> Drives() override { return {"/"}; }

 private:
  class MemoryFile : public File {
   public:
    explicit MemoryFile(Content content) : content_(std::move(content)) {}
    std::uint64_t Length() override { return content_->size(); }
    std::size_t ReadAt(std::uint64_t position, std::span<std::byte> into) override {
      if (position >= content_->size()) return 0;
      const auto count = std::min<std::size_t>(into.size(), content_->size() - position);
      std::copy_n(content_->begin() + static_cast<std::ptrdiff_t>(position), count, into.begin());
      return count;
    }
    void WriteAt(std::uint64_t position, std::span<const std::byte> from) override {
      content_->resize(std::max<std::size_t>(content_->size(), position + from.size()));
      std::copy(from.begin(), from.end(),
                content_->begin() + static_cast<std::ptrdiff_t>(position));
    }
    void Sync() override {}
    void Close() override {}

   private:
    Content content_;
  };

  void Require(const std::string& path) {
    if (!Exists(path)) throw RunTimeError(ErrorNumber::FileNotFound);
  }

  std::map<std::string, Content> files_;
};

}  // namespace marlowbeck::fuzz
