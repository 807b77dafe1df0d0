// What is kept on purpose is told once in the code, under its mark, and once in docs/kept.md.

#include <filesystem>
#include <fstream>
#include <set>
#include <string>

#include <gtest/gtest.h>

namespace marlowbeck {
namespace {

namespace fs = std::filesystem;

const fs::path kSource = MARLOWBECK_SOURCE_DIR;
constexpr const char* kMark = "KEPT: ";

/// What follows the slashes of a comment; nothing for a line of code.
std::string CommentOf(const std::string& line) {
  const auto slashes = line.find_first_not_of(' ');
  if (slashes == std::string::npos || line.compare(slashes, 2, "//") != 0) return {};
  const auto words = line.find_first_not_of("/ ", slashes);
  return words == std::string::npos ? std::string() : line.substr(words);
}

/// "- path: words" for every mark in a file, the words joined up to the end of their sentence.
void CollectMarks(const fs::path& file, std::set<std::string>& marks) {
  std::ifstream in(file);
  for (std::string line; std::getline(in, line);) {
    std::string words = CommentOf(line);
    if (words.rfind(kMark, 0) != 0) continue;
    words = words.substr(std::string(kMark).size());
    while (words.back() != '.' && std::getline(in, line) && !CommentOf(line).empty()) {
      words += " " + CommentOf(line);
    }
    marks.insert("- " + fs::relative(file, kSource).generic_string() + ": " + words);
  }
}

std::set<std::string> MarksInCode() {
  std::set<std::string> marks;
  for (const auto& entry : fs::recursive_directory_iterator(kSource / "src")) {
    const auto extension = entry.path().extension();
    if (extension == ".cpp" || extension == ".h") CollectMarks(entry.path(), marks);
  }
  return marks;
}

std::set<std::string> LinesOfTheList() {
  std::set<std::string> lines;
  std::ifstream in(kSource / "docs" / "kept.md");
  for (std::string line; std::getline(in, line);) {
    if (line.rfind("- ", 0) == 0) lines.insert(line);
  }
  return lines;
}

TEST(Kept, ListAndMarksSayTheSame) {
  const auto marks = MarksInCode();
  ASSERT_FALSE(marks.empty());
  EXPECT_EQ(LinesOfTheList(), marks);
}

}  // namespace
}  // namespace marlowbeck
