// The manual's pages lead to what is there: every picture, every other page, every heading.

#include <algorithm>
#include <cctype>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <regex>
#include <sstream>
#include <string>
#include <vector>

#include <gtest/gtest.h>

namespace marlowbeck {
namespace {

namespace fs = std::filesystem;

const fs::path kDocs = fs::path(MARLOWBECK_SOURCE_DIR) / "docs";

std::string Content(const fs::path& file) {
  std::ifstream in(file);
  return {std::istreambuf_iterator<char>(in), {}};
}

/// What stands in the round brackets of every link and picture of a text.
std::vector<std::string> Targets(const std::string& text) {
  static const std::regex target(R"(\]\(([^)]*)\))");
  std::vector<std::string> targets;
  for (std::sregex_iterator at(text.begin(), text.end(), target), end; at != end; ++at) {
    targets.push_back((*at)[1]);
  }
  return targets;
}

/// A heading as links name it: in small letters, with hyphens for blanks and no other signs.
std::string AnchorOf(const std::string& heading) {
  std::string anchor;
  for (const char letter : heading.substr(heading.find_first_not_of("# "))) {
    const auto byte = static_cast<unsigned char>(letter);
    if (letter == ' ' || letter == '-') anchor += '-';
    if (std::isalnum(byte) != 0) anchor += static_cast<char>(std::tolower(byte));
  }
  return anchor;
}

bool HasHeading(const fs::path& page, const std::string& anchor) {
  std::istringstream lines(Content(page));
  for (std::string line; std::getline(lines, line);) {
    if (line.starts_with('#') && AnchorOf(line) == anchor) return true;
  }
  return false;
}

/// "page.md#heading", "page.md", "#heading" or "folder/picture.png", seen from a page.
void ExpectIsThere(const fs::path& page, const std::string& target) {
  const auto mark = target.find('#');
  const fs::path file = mark == 0 ? page : page.parent_path() / target.substr(0, mark);
  EXPECT_TRUE(fs::exists(file)) << page.filename() << " leads to " << target;
  if (mark == std::string::npos || !fs::exists(file)) return;
  EXPECT_TRUE(HasHeading(file, target.substr(mark + 1)))
      << page.filename() << " leads to " << target;
}

TEST(ManualPages, LeadToPicturesPagesAndHeadingsThatAreThere) {
  int seen = 0;
  for (const auto& entry : fs::directory_iterator(kDocs)) {
    if (entry.path().extension() != ".md") continue;
    for (const std::string& target : Targets(Content(entry.path()))) {
      if (target.starts_with("http")) continue;
      ExpectIsThere(entry.path(), target);
      ++seen;
    }
  }
  EXPECT_GT(seen, 20);
}

TEST(ManualPages, TopicsOfTheHelpAreThere) {
  std::istringstream lines(Content(kDocs / "topics.txt"));
  int seen = 0;
  for (std::string line; std::getline(lines, line);) {
    const auto blank = line.find_first_of("\t ");
    ASSERT_NE(blank, std::string::npos) << line;
    ExpectIsThere(kDocs / "topics.txt", line.substr(blank + 1));
    ++seen;
  }
  EXPECT_GT(seen, 5);
}

}  // namespace
}  // namespace marlowbeck
