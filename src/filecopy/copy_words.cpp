#include "filecopy/copy_words.h"

#include "data/text.h"

namespace marlowbeck {
namespace {

constexpr std::size_t kPathHead = 3;
constexpr std::size_t kPathTail = 40;
constexpr const char* kPathGap = "  ...  ";
/// What a shortened path takes; a path that takes no more has room whole.
constexpr std::size_t kPathRoom = kPathHead + 7 + kPathTail;

std::string Counted(int count, std::string_view one, std::string_view more) {
  return std::to_string(count) + std::string(count == 1 ? one : more);
}

}  // namespace

std::string CountWords(int files) { return "File List = " + std::to_string(files); }

std::string SelectedWords(int files) {
  return Counted(files, "  File selected.", "  Files selected.");
}

std::string ShortenedPath(std::string_view path) {
  const std::vector<std::string_view> characters = CharactersOf(path);
  if (characters.size() <= kPathRoom) return std::string(path);
  const auto at = [&](std::size_t character) {
    return static_cast<std::size_t>(characters[character].data() - path.data());
  };
  return std::string(path.substr(0, at(kPathHead))) + kPathGap +
         std::string(path.substr(at(characters.size() - kPathTail)));
}

std::string CopyQuestion(int files, std::string_view folder, bool overwriting) {
  const std::string question =
      Lines({"You are about to Copy " + Counted(files, " file to", " files to"), UpperCase(folder),
             "", ""});
  const std::string warning =
      overwriting ? Lines({"W A R N I N G!", "Existing files will be Overwritten.", "", ""}) : "";
  return question + warning + "Are you Sure?";
}

std::string ReplaceQuestion(std::string_view name, std::string_view folder) {
  return Lines(
      {std::string(name) + " already exists in", folder, "", "Do you wish to replace it?"});
}

std::string CopiedReport(int files) {
  if (files == 0) return "No files copied.";
  return Counted(files, " file has been copied.", " files have been copied.");
}

std::string DeleteQuestion(const std::vector<std::string>& names, std::string_view folder) {
  const std::string what =
      names.size() == 1 ? UpperCase(names.front()) : std::to_string(names.size()) + " files";
  return Lines(
      {"You are about to delete " + what + " from", UpperCase(folder), "", "Are you Sure?"});
}

std::string DeleteFolderQuestion(std::string_view folder) {
  return Lines({"You are about to delete the following folder,", folder, "", "Are you Sure ?"});
}

std::string NewFolderPrompt(std::string_view folder) {
  return Lines({"Create a new folder in...", UpperCase(folder), "", "Enter NEW Name for Folder"});
}

}  // namespace marlowbeck
