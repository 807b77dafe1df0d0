#include "data/system_file.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#ifdef _WIN32
#include <io.h>
#endif

#include <algorithm>
#include <cerrno>
#include <span>
#include <utility>
#include <vector>

#include "data/runtime_error.h"

namespace marlowbeck {
namespace {

namespace fs = std::filesystem;

constexpr std::size_t kCopyBlock = std::size_t{256} * 1024;

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

#ifdef _WIN32
constexpr int kBinary = O_BINARY;
constexpr int kSyncAccess = O_RDWR;
int OpenDescriptor(const fs::path& path, int flags) { return _wopen(path.c_str(), flags, 0666); }
int SyncDescriptor(int descriptor) { return _commit(descriptor); }
int CutDescriptor(int descriptor, std::uint64_t length) {
  return _chsize_s(descriptor, static_cast<long long>(length)) == 0 ? 0 : -1;
}
long ReadSome(int descriptor, void* into, std::size_t size, std::uint64_t position) {
  if (_lseeki64(descriptor, static_cast<long long>(position), SEEK_SET) < 0) return -1;
  return _read(descriptor, into, static_cast<unsigned>(std::min<std::size_t>(size, 1U << 20)));
}
long WriteSome(int descriptor, const void* from, std::size_t size, std::uint64_t position) {
  if (_lseeki64(descriptor, static_cast<long long>(position), SEEK_SET) < 0) return -1;
  return _write(descriptor, from, static_cast<unsigned>(std::min<std::size_t>(size, 1U << 20)));
}
#else
constexpr int kBinary = O_CLOEXEC;
constexpr int kSyncAccess = O_RDONLY;  // a copy may be as read-only as its source
int OpenDescriptor(const fs::path& path, int flags) { return ::open(path.c_str(), flags, 0666); }
int SyncDescriptor(int descriptor) { return ::fsync(descriptor); }
int CutDescriptor(int descriptor, std::uint64_t length) {
  return ::ftruncate(descriptor, static_cast<off_t>(length));
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
    if (::fstat(descriptor_, &status) != 0) FailWith(errno, path_);
    return static_cast<std::uint64_t>(status.st_size);
  }

  std::size_t ReadAt(std::uint64_t position, std::span<std::byte> into) override {
    std::size_t done = 0;
    while (done < into.size()) {
      const long count =
          ReadSome(descriptor_, into.data() + done, into.size() - done, position + done);
      if (count < 0 && errno == EINTR) continue;
      if (count < 0) FailWith(errno, path_);
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
      if (count <= 0) FailWith(count < 0 ? errno : ENOSPC, path_);
      done += static_cast<std::size_t>(count);
    }
    end_ = std::max(end_, position + from.size());
  }

  void Sync() override {
    CutRest();
    if (SyncDescriptor(descriptor_) != 0) FailWith(errno, path_);
    if (std::exchange(is_new_, false)) SyncFolderOf(path_);
  }

  void Close() override {
    if (descriptor_ >= 0) CutRest();
    const int descriptor = std::exchange(descriptor_, -1);
    if (descriptor >= 0 && ::close(descriptor) != 0 && errno != EINTR) FailWith(errno, path_);
  }

 private:
  void CutRest() {
    if (!rewritten_ || Length() <= end_) return;
    if (CutDescriptor(descriptor_, end_) != 0) FailWith(errno, path_);
  }

  int descriptor_;
  fs::path path_;
  bool is_new_;
  bool rewritten_;
  std::uint64_t end_ = 0;  ///< of all that was written
};

/// Returns once the bytes of a file have reached the disk.
void SyncFile(const fs::path& path) {
  const int descriptor = OpenDescriptor(path, kSyncAccess | kBinary);
  if (descriptor < 0) return;  // one that may not be opened is left to the system
  RealFile file(descriptor, path, false, false);
  file.Sync();
  file.Close();
}

bool IsReadOnlyError(int error) { return error == EACCES || error == EPERM || error == EROFS; }

}  // namespace

void FailWith(int system_error, const fs::path& path) {
  std::error_code ignored;
  if (system_error == ENOENT && path.has_parent_path() &&
      !fs::is_directory(path.parent_path(), ignored)) {
    throw RunTimeError(ErrorNumber::PathNotFound);
  }
  throw RunTimeError(NumberOfSystemError(system_error));
}

void Check(const std::error_code& error, const fs::path& path) {
  if (error) FailWith(error.default_error_condition().value(), path);
}

#ifdef _WIN32
void SyncFolderOf(const fs::path&) {}  // a rename reaches the disk with the volume's own journal
#else
void SyncFolderOf(const fs::path& path) {
  const fs::path folder = path.parent_path();
  const int descriptor = ::open(folder.c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC);
  if (descriptor < 0) return;  // a folder that may not be opened for reading is left to the system
  ::fsync(descriptor);
  ::close(descriptor);
}
#endif

std::unique_ptr<File> OpenSystemFile(const fs::path& path, OpenMode mode) {
  std::error_code error;
  const bool is_new = mode != OpenMode::Read && !fs::exists(path, error);
  int descriptor = OpenDescriptor(
      path, mode == OpenMode::Read ? O_RDONLY | kBinary : O_RDWR | O_CREAT | kBinary);
  if (descriptor < 0 && mode == OpenMode::ReadWrite && !is_new && IsReadOnlyError(errno)) {
    // A season on a read-only disk can still be looked at; only a write to it fails.
    descriptor = OpenDescriptor(path, O_RDONLY | kBinary);
  }
  if (descriptor < 0) FailWith(errno, path);
  return std::make_unique<RealFile>(descriptor, path, is_new, mode == OpenMode::Truncate);
}

namespace {

/// Block by block: the library's own copy cannot tell a full disk from a broken one.
void CopyBytes(const fs::path& source, const fs::path& target) {
  const auto from = OpenSystemFile(source, OpenMode::Read);
  const auto to = OpenSystemFile(target, OpenMode::Truncate);
  std::vector<std::byte> block(kCopyBlock);
  std::uint64_t position = 0;
  while (const std::size_t count = from->ReadAt(position, block)) {
    to->WriteAt(position, std::span(block).first(count));
    position += count;
  }
  to->Close();
}

}  // namespace

void CopySystemFile(const fs::path& source, const fs::path& target) {
  std::error_code error;
  if (fs::equivalent(source, target, error)) throw RunTimeError(ErrorNumber::FileAlreadyExists);
  CopyBytes(source, target);
  // A disk that keeps no times or protections, or not of this user's files, is none the worse.
  const auto changed = fs::last_write_time(source, error);
  if (!error) fs::last_write_time(target, changed, error);
  const fs::file_status status = fs::status(source, error);
  if (!error) fs::permissions(target, status.permissions(), error);
  SyncFile(target);
}

}  // namespace marlowbeck
