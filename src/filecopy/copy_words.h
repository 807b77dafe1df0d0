#pragma once

#include <string>
#include <string_view>
#include <vector>

namespace marlowbeck {

// What the file copier says. Paths and names are those of the disk; a line break is one "\r".

/// "File List = 12".
[[nodiscard]] std::string CountWords(int files);
/// "1  File selected.", "2  Files selected.".
[[nodiscard]] std::string SelectedWords(int files);
/// A path of at most 50 characters whole; of a longer one its first 3 and its last 40.
[[nodiscard]] std::string ShortenedPath(std::string_view path);

/// The question before `files` files are copied into a folder.
[[nodiscard]] std::string CopyQuestion(int files, std::string_view folder, bool overwriting);
/// The question about one file that is in the folder already.
[[nodiscard]] std::string ReplaceQuestion(std::string_view name, std::string_view folder);
/// The report at the end of a run.
[[nodiscard]] std::string CopiedReport(int files);

/// The question before these files of a folder are deleted: one is named, more are counted.
[[nodiscard]] std::string DeleteQuestion(const std::vector<std::string>& names,
                                         std::string_view folder);
[[nodiscard]] std::string DeleteFolderQuestion(std::string_view folder);
/// What is asked for a new folder's name.
[[nodiscard]] std::string NewFolderPrompt(std::string_view folder);

}  // namespace marlowbeck
