#pragma once

#include <string>
#include <vector>

#include "data/file_system.h"

namespace marlowbeck {

/// Copies a file into a folder, under the name it has. The copy is made under a work name in that
/// folder and takes its place once it has reached the disk, so that a failure, which is thrown,
/// leaves there what was there: the file before, or none. The folder is to be synced at the end of
/// a run.
void CopyWhole(FileSystem& files, const std::string& source, const std::string& folder);

/// Deletes the files of a folder, out of these, that hold nothing. One that has gone, or whose
/// length cannot be told, is passed over.
void DeleteEmptyFiles(FileSystem& files, const std::string& folder,
                      const std::vector<std::string>& names);

/// The folder itself, or the nearest one above it that is there.
[[nodiscard]] std::string NearestFolder(FileSystem& files, const std::string& folder);

}  // namespace marlowbeck
