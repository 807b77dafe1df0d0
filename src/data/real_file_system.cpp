#include "data/real_file_system.h"

#ifndef _WIN32
#include <dirent.h>
#endif

#include <algorithm>
#include <cerrno>
#include <system_error>
#include <utility>

#include "data/drives.h"
#include "data/runtime_error.h"
#include "data/system_file.h"
#include "data/text.h"

namespace marlowbeck {
namespace {

namespace fs = std::filesystem;

fs::path PathOfText(const std::string& text) {
  const std::string name = NameOfText(text);
  return {std::u8string(name.begin(), name.end())};
}

#ifdef _WIN32
constexpr const char* kSeparators = "\\/";
#else
constexpr const char* kSeparators = "/";
#endif

/// All that lies in a folder, in no order. An error ends the walk and is told.
std::vector<fs::directory_entry> EntriesOf(const fs::path& folder, std::error_code& error) {
  std::vector<fs::directory_entry> entries;
  fs::directory_iterator entry(folder, error);
  while (!error && entry != fs::directory_iterator()) {
    entries.push_back(*entry);
    entry.increment(error);
  }
  return entries;
}

/// Whether a name on the disk is the wanted one in any case.
bool IsInAnyCase(const std::string& found, const std::string& wanted) {
  // A letter takes as much room in either case, so that most names are told apart unread.
  if (found.size() != wanted.size()) return false;
  return EqualsIgnoringCase(TextOfName(found), TextOfName(wanted));
}

#ifdef _WIN32
/// Calls `visit` with the UTF-8 of every name in a folder until it answers true.
template <typename Visit>
void FindName(const fs::path& folder, Visit visit) {
  std::error_code error;
  for (const fs::directory_entry& entry : EntriesOf(folder, error)) {
    const std::u8string name = entry.path().filename().u8string();
    if (visit(std::string(name.begin(), name.end()))) return;
  }
}
#else
/// Calls `visit` with the UTF-8 of every name in a folder until it answers true. Nothing but names
/// is read: a folder may hold thousands, and is looked through for each file that is not there.
template <typename Visit>
void FindName(const fs::path& folder, Visit visit) {
  const std::unique_ptr<DIR, int (*)(DIR*)> entries(::opendir(folder.c_str()), ::closedir);
  while (entries != nullptr) {
    const dirent* const entry = ::readdir(entries.get());
    if (entry == nullptr || visit(std::string(entry->d_name))) return;
  }
}
#endif

/// The entry of `folder` that is `name` in any case; `name` itself when there is none.
fs::path EntryInAnyCase(const fs::path& folder, const fs::path& name) {
  std::error_code error;
  fs::path entry = folder / name;
  if (fs::exists(entry, error)) return entry;
  const std::u8string utf8 = name.u8string();
  const std::string wanted(utf8.begin(), utf8.end());
  FindName(folder, [&](const std::string& found) {
    if (!IsInAnyCase(found, wanted)) return false;
    entry = folder / fs::path(std::u8string(found.begin(), found.end()));
    return true;
  });
  return entry;
}

/// Nobody may write to it. A rename or a removal would not ask.
void RefuseProtected(const fs::path& path) {
  constexpr fs::perms kWriters =
      fs::perms::owner_write | fs::perms::group_write | fs::perms::others_write;
  std::error_code error;
  const fs::file_status status = fs::status(path, error);
  if (fs::exists(status) && (status.permissions() & kWriters) == fs::perms::none) {
    throw RunTimeError(ErrorNumber::PermissionDenied);
  }
}

/// A pipe or a device would block for ever.
void RefusePipes(const fs::path& path) {
  std::error_code error;
  if (fs::exists(path, error) && !fs::is_regular_file(path, error)) {
    throw RunTimeError(ErrorNumber::BadFileName);
  }
}

/// Puts a file in the place of one on another volume: by a copy beside it.
void ReplaceAcrossVolumes(const fs::path& source, const fs::path& target) {
  fs::path copy = target;
  copy += ".new";
  CopySystemFile(source, copy);
  std::error_code error;
  fs::rename(copy, target, error);
  Check(error, target);
  fs::remove(source, error);
}

}  // namespace

std::string TextOfPath(const std::filesystem::path& path) {
  const std::u8string utf8 = path.u8string();
  return TextOfName(std::string(utf8.begin(), utf8.end()));
}

std::string FileNameOf(const std::string& path) {
  const auto separator = path.find_last_of(kSeparators);
  return separator == std::string::npos ? path : path.substr(separator + 1);
}

std::string PathIn(const std::string& folder, const std::string& name) {
  if (folder.empty() || folder.find_last_of(kSeparators) == folder.size() - 1) return folder + name;
  return folder + static_cast<char>(fs::path::preferred_separator) + name;
}

RealFileSystem::RealFileSystem() {
  std::error_code error;
  current_ = fs::current_path(error);
}

std::filesystem::path RealFileSystem::Located(const std::string& path) const {
  if (path.empty() || path.find('\0') != std::string::npos) {
    throw RunTimeError(ErrorNumber::BadFileName);
  }
  fs::path named = PathOfText(path);
  // A drive alone is its root, wherever the program may stand on it.
  if (named.has_root_name() && named == named.root_name()) named /= "/";
  fs::path full = (current_ / named).lexically_normal();
  std::error_code error;
  if (fs::exists(full, error)) return full;
  fs::path located = full.root_path();
  for (const fs::path& part : full.relative_path()) located = EntryInAnyCase(located, part);
  return located;
}

std::unique_ptr<File> RealFileSystem::Open(const std::string& path, OpenMode mode) {
  const fs::path located = Located(path);
  std::error_code error;
  if (fs::is_directory(located, error)) throw RunTimeError(ErrorNumber::PathFileAccess);
  RefusePipes(located);
  return OpenSystemFile(located, mode);
}

bool RealFileSystem::Exists(const std::string& path) {
  std::error_code error;
  return fs::exists(Located(path), error);
}

std::uint64_t RealFileSystem::LengthOf(const std::string& path) {
  const fs::path located = Located(path);
  std::error_code error;
  const std::uintmax_t length = fs::file_size(located, error);
  Check(error, located);
  return length;
}

void RealFileSystem::Delete(const std::string& path) {
  const fs::path located = Located(path);
  std::error_code error;
  if (fs::is_directory(located, error)) throw RunTimeError(ErrorNumber::PathFileAccess);
  RefuseProtected(located);
  const bool was_there = fs::remove(located, error);
  Check(error, located);
  if (!was_there) FailWith(ENOENT, located);
}

void RealFileSystem::Discard(const std::string& path) {
  const fs::path located = Located(path);
  std::error_code error;
  if (!fs::is_regular_file(fs::symlink_status(located, error))) return;
  fs::permissions(located, fs::perms::owner_write, fs::perm_options::add, error);
  fs::remove(located, error);
}

void RealFileSystem::Rename(const std::string& from, const std::string& to) {
  const fs::path source = Located(from);
  const fs::path target = Located(to);
  std::error_code error;
  if (!fs::exists(source, error)) FailWith(ENOENT, source);
  if (fs::exists(target, error)) throw RunTimeError(ErrorNumber::FileAlreadyExists);
  fs::rename(source, target, error);
  Check(error, target);
  SyncFolderOf(target);
}

void RealFileSystem::Replace(const std::string& from, const std::string& to) {
  SyncFolderOf(PutInPlace(from, to));
}

void RealFileSystem::ReplaceUnsynced(const std::string& from, const std::string& to) {
  static_cast<void>(PutInPlace(from, to));
}

std::filesystem::path RealFileSystem::PutInPlace(const std::string& from, const std::string& to) {
  const fs::path source = Located(from);
  std::error_code error;
  // A link stays a link; what it stands for is replaced.
  fs::path target = fs::weakly_canonical(Located(to), error);
  if (error) target = Located(to);
  if (!fs::exists(source, error)) FailWith(ENOENT, source);
  if (fs::is_directory(target, error)) throw RunTimeError(ErrorNumber::PathFileAccess);
  RefuseProtected(target);
  const fs::file_status old = fs::status(target, error);
  if (fs::exists(old)) fs::permissions(source, old.permissions(), error);
  fs::rename(source, target, error);
  if (error == std::errc::cross_device_link) {
    ReplaceAcrossVolumes(source, target);
  } else {
    Check(error, target);
  }
  return target;
}

void RealFileSystem::SyncFolder(const std::string& folder) {
  SyncFolderOf(LocatedFolder(folder) / "name");
}

void RealFileSystem::Copy(const std::string& from, const std::string& to) {
  const fs::path source = Located(from);
  const fs::path target = Located(to);
  std::error_code error;
  if (!fs::exists(source, error)) FailWith(ENOENT, source);
  if (fs::is_directory(source, error) || fs::is_directory(target, error)) {
    throw RunTimeError(ErrorNumber::PathFileAccess);
  }
  RefusePipes(source);
  CopySystemFile(source, target);
}

void RealFileSystem::MakeFolder(const std::string& path) {
  const fs::path located = Located(path);
  std::error_code error;
  if (fs::exists(located, error)) throw RunTimeError(ErrorNumber::PathFileAccess);
  fs::create_directory(located, error);
  Check(error, located);
}

void RealFileSystem::RemoveFolder(const std::string& path) {
  const fs::path located = Located(path);
  std::error_code error;
  if (!fs::is_directory(located, error)) throw RunTimeError(ErrorNumber::PathNotFound);
  fs::remove(located, error);
  Check(error, located);
}

std::vector<FolderEntry> RealFileSystem::List(const std::string& folder) {
  const fs::path located = Located(folder);
  std::error_code error;
  const auto entries = EntriesOf(located, error);
  Check(error, located);
  std::vector<FolderEntry> list;
  list.reserve(entries.size());
  for (const fs::directory_entry& entry : entries) {
    list.push_back({TextOfPath(entry.path().filename()), entry.is_directory(error)});
  }
  std::sort(list.begin(), list.end(),
            [](const FolderEntry& a, const FolderEntry& b) { return ComesBefore(a.name, b.name); });
  return list;
}

std::filesystem::path RealFileSystem::LocatedFolder(const std::string& folder) const {
  const fs::path located = Located(folder);
  std::error_code error;
  if (!fs::is_directory(located, error)) throw RunTimeError(ErrorNumber::PathNotFound);
  // A separator at its end is none of its name.
  return located.has_filename() ? located : located.parent_path();
}

void RealFileSystem::ChangeFolder(const std::string& folder) { current_ = LocatedFolder(folder); }

std::string RealFileSystem::CurrentFolder() { return TextOfPath(current_); }

std::string RealFileSystem::WholePath(const std::string& folder) {
  return TextOfPath(LocatedFolder(folder));
}

bool RealFileSystem::AreSameFolder(const std::string& a, const std::string& b) {
  const fs::path one = LocatedFolder(a);
  const fs::path other = LocatedFolder(b);
  std::error_code error;
  return fs::equivalent(one, other, error);
}

std::vector<std::string> RealFileSystem::Drives() { return DrivesOfMachine(); }

}  // namespace marlowbeck
