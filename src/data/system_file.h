#pragma once

#include <filesystem>
#include <memory>
#include <system_error>

#include "data/file_system.h"

namespace marlowbeck {

// Files as the operating system has them, by paths of the machine.

/// Throws what a system error says of a path; a file that is missing because its folder is counts
/// as a path that was not found.
[[noreturn]] void FailWith(int system_error, const std::filesystem::path& path);
/// The same for an error that may be none.
void Check(const std::error_code& error, const std::filesystem::path& path);

/// Opens a file. One that may only be read is opened for that by ReadWrite too, and fails when it
/// is written to.
[[nodiscard]] std::unique_ptr<File> OpenSystemFile(const std::filesystem::path& path,
                                                   OpenMode mode);

/// Makes a copy with the bytes, the protection and the time of the last change. Returns once it has
/// reached the disk.
void CopySystemFile(const std::filesystem::path& source, const std::filesystem::path& target);

/// Returns once the names in a path's folder have reached the disk.
void SyncFolderOf(const std::filesystem::path& path);

}  // namespace marlowbeck
