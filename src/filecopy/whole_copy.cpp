#include "filecopy/whole_copy.h"

#include "data/runtime_error.h"

namespace marlowbeck {
namespace {

/// A name of no file in the folder, and short, so that there is room for it wherever there is room
/// for a name.
std::string FreeWorkName(FileSystem& files, const std::string& folder) {
  std::string path = PathIn(folder, "QzCopy.tmp");
  for (int n = 1; files.Exists(path); ++n) {
    path = PathIn(folder, "QzCopy" + std::to_string(n) + ".tmp");
  }
  return path;
}

bool IsEmpty(FileSystem& files, const std::string& path) {
  try {
    return files.LengthOf(path) == 0;
  } catch (const RunTimeError&) {
    return false;
  }
}

bool IsFolder(FileSystem& files, const std::string& path) {
  try {
    return !files.WholePath(path).empty();
  } catch (const RunTimeError&) {
    return false;
  }
}

}  // namespace

void CopyWhole(FileSystem& files, const std::string& source, const std::string& folder) {
  const std::string work = FreeWorkName(files, folder);
  try {
    files.Copy(source, work);
    files.ReplaceUnsynced(work, PathIn(folder, FileNameOf(source)));
  } catch (const RunTimeError&) {
    files.Discard(work);
    throw;
  }
}

void DeleteEmptyFiles(FileSystem& files, const std::string& folder,
                      const std::vector<std::string>& names) {
  for (const std::string& name : names) {
    const std::string path = PathIn(folder, name);
    if (IsEmpty(files, path)) files.Delete(path);
  }
}

std::string NearestFolder(FileSystem& files, const std::string& folder) {
  std::string path = folder;
  while (!IsFolder(files, path)) path = PathIn(path, "..");
  return files.WholePath(path);
}

}  // namespace marlowbeck
