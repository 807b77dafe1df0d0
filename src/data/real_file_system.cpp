#include "data/real_file_system.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#ifdef _WIN32
#include <io.h>
#endif

#include <algorithm>
#include <cerrno>
#include <system_error>
#include <utility>

#include "data/drives.h"
#include "data/runtime_error.h"
#include "data/text.h"

namespace marlowbeck {
namespace {

namespace fs = std::filesystem;

fs::path PathOfText(const std::string& text) {
  const std::string utf8 = Utf8FromCp1252(text);
  return {std::u8string(utf8.begin(), utf8.end())};
}

ErrorNumber NumberOfSystemError(int error) {
  switch (error) {
    case ENOENT:
      return ErrorNumber::FileNotFound;
    case ENOTDIR:
      return ErrorNumber::PathNotFound;
    case EACCES:
    case EPERM:
    case EROFS:
    case EBUSY:
    case ETXTBSY:
    case EBADF:  // written to, but opened for reading only
      return ErrorNumber::PermissionDenied;
    case EEXIST:
      return ErrorNumber::FileAlreadyExists;
    case EISDIR:
    case ENOTEMPTY:
      return ErrorNumber::PathFileAccess;
    case ENAMETOOLONG:
    case EINVAL:
    case EILSEQ:
      return ErrorNumber::BadFileName;
    case EMFILE:
    case ENFILE:
      return ErrorNumber::TooManyFiles;
    case ENOSPC:
    case EFBIG:
#ifdef EDQUOT
    case EDQUOT:
#endif
      return ErrorNumber::DiskFull;
    case EXDEV:
      return ErrorNumber::RenameAcrossDrives;
    case ENOMEM:
      return ErrorNumber::OutOfMemory;
    case ENXIO:
    case ENODEV:
      return ErrorNumber::DeviceUnavailable;
    default:
      return ErrorNumber::DeviceIoError;
  }
}

/// Throws what the system error says of `path`; a file that is missing because its folder is
/// counts as a path that was not found.
[[noreturn]] void Fail(int error, const fs::path& path) {
  std::error_code ignored;
  if (error == ENOENT && path.has_parent_path() && !fs::is_directory(path.parent_path(), ignored)) {
    throw RunTimeError(ErrorNumber::PathNotFound);
  }
  throw RunTimeError(NumberOfSystemError(error));
}

void Check(const std::error_code& error, const fs::path& path) {
  if (error) Fail(error.default_error_condition().value(), path);
}

#ifdef _WIN32
constexpr const char* kSeparators = "\\/";
constexpr int kBinary = O_BINARY;
constexpr int kSyncAccess = O_RDWR;
int OpenDescriptor(const fs::path& path, int flags) { return _wopen(path.c_str(), flags, 0666); }
int SyncDescriptor(int descriptor) { return _commit(descriptor); }
int CutDescriptor(int descriptor, std::uint64_t length) {
  return _chsize_s(descriptor, static_cast<long long>(length)) == 0 ? 0 : -1;
}
void SyncFolderOf(const fs::path&) {}  // a rename reaches the disk with the volume's own journal
long ReadSome(int descriptor, void* into, std::size_t size, std::uint64_t position) {
  if (_lseeki64(descriptor, static_cast<long long>(position), SEEK_SET) < 0) return -1;
  return _read(descriptor, into, static_cast<unsigned>(std::min<std::size_t>(size, 1U << 20)));
}
long WriteSome(int descriptor, const void* from, std::size_t size, std::uint64_t position) {
  if (_lseeki64(descriptor, static_cast<long long>(position), SEEK_SET) < 0) return -1;
  return _write(descriptor, from, static_cast<unsigned>(std::min<std::size_t>(size, 1U << 20)));
}
#else
constexpr const char* kSeparators = "/";
constexpr int kBinary = O_CLOEXEC;
constexpr int kSyncAccess = O_RDONLY;  // a copy may be as read-only as its source
int OpenDescriptor(const fs::path& path, int flags) { return ::open(path.c_str(), flags, 0666); }
int SyncDescriptor(int descriptor) { return ::fsync(descriptor); }
int CutDescriptor(int descriptor, std::uint64_t length) {
  return ::ftruncate(descriptor, static_cast<off_t>(length));
}
void SyncFolderOf(const fs::path& path) {
  const fs::path folder = path.parent_path();
  const int descriptor = ::open(folder.c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC);
  if (descriptor < 0) return;  // a folder that may not be opened for reading is left to the system
  ::fsync(descriptor);
  ::close(descriptor);
}
long ReadSome(int descriptor, void* into, std::size_t size, std::uint64_t position) {
  return static_cast<long>(::pread(descriptor, into, size, static_cast<off_t>(position)));
}
long WriteSome(int descriptor, const void* from, std::size_t size, std::uint64_t position) {
  return static_cast<long>(::pwrite(descriptor, from, size, static_cast<off_t>(position)));
}
#endif

class RealFile : public File {
 public:
  /// A `rewritten` file ends, once it is synced or closed, where the last write ended. It is not
  /// emptied before: some disks wait for the bytes of every file that was.
  RealFile(int descriptor, fs::path path, bool is_new, bool rewritten)
      : descriptor_(descriptor), path_(std::move(path)), is_new_(is_new), rewritten_(rewritten) {}
  RealFile(const RealFile&) = delete;
  RealFile& operator=(const RealFile&) = delete;
  ~RealFile() override {
    if (descriptor_ < 0) return;
    if (rewritten_) static_cast<void>(CutDescriptor(descriptor_, end_) == 0);
    ::close(descriptor_);
  }

  std::uint64_t Length() override {
    struct stat status {};
    if (::fstat(descriptor_, &status) != 0) Fail(errno, path_);
    return static_cast<std::uint64_t>(status.st_size);
  }

  std::size_t ReadAt(std::uint64_t position, std::span<std::byte> into) override {
    std::size_t done = 0;
    while (done < into.size()) {
      const long count =
          ReadSome(descriptor_, into.data() + done, into.size() - done, position + done);
      if (count < 0 && errno == EINTR) continue;
      if (count < 0) Fail(errno, path_);
      if (count == 0) break;
      done += static_cast<std::size_t>(count);
    }
    return done;
  }

  void WriteAt(std::uint64_t position, std::span<const std::byte> from) override {
    std::size_t done = 0;
    while (done < from.size()) {
      const long count =
          WriteSome(descriptor_, from.data() + done, from.size() - done, position + done);
      if (count < 0 && errno == EINTR) continue;
      if (count <= 0) Fail(count < 0 ? errno : ENOSPC, path_);
      done += static_cast<std::size_t>(count);
    }
    end_ = std::max(end_, position + from.size());
  }

  void Sync() override {
    CutRest();
    if (SyncDescriptor(descriptor_) != 0) Fail(errno, path_);
    if (std::exchange(is_new_, false)) SyncFolderOf(path_);
  }

  void Close() override {
    if (descriptor_ >= 0) CutRest();
    const int descriptor = std::exchange(descriptor_, -1);
    if (descriptor >= 0 && ::close(descriptor) != 0 && errno != EINTR) Fail(errno, path_);
  }

 private:
  void CutRest() {
    if (!rewritten_ || Length() <= end_) return;
    if (CutDescriptor(descriptor_, end_) != 0) Fail(errno, path_);
  }

  int descriptor_;
  fs::path path_;
  bool is_new_;
  bool rewritten_;
  std::uint64_t end_ = 0;  ///< of all that was written
};

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

/// The entry of `folder` that is `name` in any case; `name` itself when there is none. A name with
/// characters that a text cannot hold is none: two such names may read alike.
fs::path EntryInAnyCase(const fs::path& folder, const fs::path& name) {
  std::error_code error;
  if (fs::exists(folder / name, error)) return folder / name;
  const std::string wanted = TextOfPath(name);
  for (const fs::directory_entry& entry : EntriesOf(folder, error)) {
    const fs::path found = entry.path().filename();
    const std::string text = TextOfPath(found);
    if (EqualsIgnoringCase(text, wanted) && PathOfText(text) == found) return entry.path();
  }
  return folder / name;
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

/// Returns once a file, and its name, have reached the disk.
void SyncFile(const fs::path& path) {
  const int descriptor = OpenDescriptor(path, kSyncAccess | kBinary);
  if (descriptor < 0) return;  // one that may not be opened is left to the system
  RealFile file(descriptor, path, true, false);
  file.Sync();
  file.Close();
}

/// Returns once the copy has reached the disk.
void CopyWithTime(const fs::path& source, const fs::path& target) {
  std::error_code error;
  fs::copy_file(source, target, fs::copy_options::overwrite_existing, error);
  Check(error, target);
  // A disk that keeps no times, or not of this user's files, is none the worse for it.
  const auto changed = fs::last_write_time(source, error);
  if (!error) fs::last_write_time(target, changed, error);
  SyncFile(target);
}

/// Puts a file in the place of one on another volume: by a copy beside it.
void ReplaceAcrossVolumes(const fs::path& source, const fs::path& target) {
  fs::path copy = target;
  copy += ".new";
  CopyWithTime(source, copy);
  std::error_code error;
  fs::rename(copy, target, error);
  Check(error, target);
  SyncFolderOf(target);
  fs::remove(source, error);
}

}  // namespace

std::string TextOfPath(const std::filesystem::path& path) {
  const std::u8string utf8 = path.u8string();
  return Cp1252FromUtf8(std::string(utf8.begin(), utf8.end()));
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
  if (fs::exists(located, error) && !fs::is_regular_file(located, error)) {
    throw RunTimeError(ErrorNumber::BadFileName);  // a pipe or device would block for ever
  }
  if (mode == OpenMode::Read) {
    const int descriptor = OpenDescriptor(located, O_RDONLY | kBinary);
    if (descriptor < 0) Fail(errno, located);
    return std::make_unique<RealFile>(descriptor, located, false, false);
  }
  const bool is_new = !fs::exists(located, error);
  int descriptor = OpenDescriptor(located, O_RDWR | O_CREAT | kBinary);
  if (descriptor < 0 && mode == OpenMode::ReadWrite && !is_new &&
      (errno == EACCES || errno == EPERM || errno == EROFS)) {
    // A season on a read-only disk can still be looked at; only a write to it fails.
    descriptor = OpenDescriptor(located, O_RDONLY | kBinary);
  }
  if (descriptor < 0) Fail(errno, located);
  return std::make_unique<RealFile>(descriptor, located, is_new, mode == OpenMode::Truncate);
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
  if (!was_there) Fail(ENOENT, located);
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
  if (!fs::exists(source, error)) Fail(ENOENT, source);
  if (fs::exists(target, error)) throw RunTimeError(ErrorNumber::FileAlreadyExists);
  fs::rename(source, target, error);
  Check(error, target);
  SyncFolderOf(target);
}

void RealFileSystem::Replace(const std::string& from, const std::string& to) {
  const fs::path source = Located(from);
  std::error_code error;
  // A link stays a link; what it stands for is replaced.
  fs::path target = fs::weakly_canonical(Located(to), error);
  if (error) target = Located(to);
  if (!fs::exists(source, error)) Fail(ENOENT, source);
  if (fs::is_directory(target, error)) throw RunTimeError(ErrorNumber::PathFileAccess);
  RefuseProtected(target);
  const fs::file_status old = fs::status(target, error);
  if (fs::exists(old)) fs::permissions(source, old.permissions(), error);
  fs::rename(source, target, error);
  if (error == std::errc::cross_device_link) return ReplaceAcrossVolumes(source, target);
  Check(error, target);
  SyncFolderOf(target);
}

void RealFileSystem::Copy(const std::string& from, const std::string& to) {
  const fs::path source = Located(from);
  const fs::path target = Located(to);
  std::error_code error;
  if (!fs::exists(source, error)) Fail(ENOENT, source);
  if (fs::is_directory(source, error) || fs::is_directory(target, error)) {
    throw RunTimeError(ErrorNumber::PathFileAccess);
  }
  CopyWithTime(source, target);
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
  std::sort(list.begin(), list.end(), [](const FolderEntry& a, const FolderEntry& b) {
    return std::pair(UpperCase(a.name), a.name) < std::pair(UpperCase(b.name), b.name);
  });
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
