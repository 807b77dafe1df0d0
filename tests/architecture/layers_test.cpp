// The arrows between the layers, read from the includes.

#include <filesystem>
#include <fstream>
#include <map>
#include <regex>
#include <set>
#include <string>
#include <vector>

#include <gtest/gtest.h>

namespace marlowbeck {
namespace {

namespace fs = std::filesystem;

const fs::path kSources = fs::path(MARLOWBECK_SOURCE_DIR) / "src";

struct Include {
  std::string file;    ///< "session/frmDB.cpp"
  std::string folder;  ///< "session"
  std::string what;    ///< "ui/screens.h", "QWidget"
  bool of_ours = false;
};

void Read(const fs::path& path, std::vector<Include>& includes) {
  static const std::regex kInclude(R"re(^\s*#\s*include\s*(["<])([^">]+)[">])re");
  const fs::path file = fs::relative(path, kSources);
  std::ifstream in(path);
  for (std::string line; std::getline(in, line);) {
    std::smatch match;
    if (!std::regex_search(line, match, kInclude)) continue;
    includes.push_back(
        {file.generic_string(), file.begin()->string(), match[2], match[1].str() == "\""});
  }
}

std::vector<Include> AllIncludes() {
  std::vector<Include> includes;
  for (const auto& entry : fs::recursive_directory_iterator(kSources)) {
    const auto extension = entry.path().extension();
    if (extension == ".cpp" || extension == ".h") Read(entry.path(), includes);
  }
  return includes;
}

std::string FolderOf(const std::string& file) { return file.substr(0, file.find('/')); }

const std::set<std::string> kFaces = {"desktop", "drive"};

/// What every subsystem says and asks in the same words, beneath them all.
const std::set<std::string> kCommonWords = {"session/messages", "session/error_table",
                                            "session/season"};

/// How high a file stands; subsystems, which are all other folders, stand on one level.
int LevelOf(const std::string& file) {
  static const std::map<std::string, int> kLevels = {{"data", 0},   {"platform", 1}, {"ui", 1},
                                                     {"print", 3},  {"program", 5},  {"drive", 6},
                                                     {"desktop", 7}};
  if (kCommonWords.contains(file.substr(0, file.rfind('.')))) return 2;
  const auto place = kLevels.find(FolderOf(file));
  return place == kLevels.end() ? 4 : place->second;
}

TEST(Layers, ThereIsSomethingToRead) { EXPECT_GT(AllIncludes().size(), 100U); }

TEST(Layers, NoArrowRunsUpwards) {
  for (const Include& include : AllIncludes()) {
    if (!include.of_ours || include.what.find('/') == std::string::npos) continue;
    EXPECT_LE(LevelOf(include.what), LevelOf(include.file))
        << include.file << " includes " << include.what;
  }
}

TEST(Layers, NoSubsystemIncludesAScreenOfAnother) {
  for (const Include& include : AllIncludes()) {
    if (!include.of_ours || include.folder == "program") continue;
    const bool is_screen = include.what.find("/frm") != std::string::npos;
    EXPECT_FALSE(is_screen && FolderOf(include.what) != include.folder)
        << include.file << " includes " << include.what;
  }
}

TEST(Layers, TheToolkitIsSeenInTheDesktopOnly) {
  static const std::regex kToolkit("^(Q[A-Z][A-Za-z]*|Qt[A-Z].*)$");
  for (const Include& include : AllIncludes()) {
    if (include.folder == "desktop" || include.of_ours) continue;
    EXPECT_FALSE(std::regex_match(include.what, kToolkit))
        << include.file << " includes " << include.what;
  }
}

TEST(Layers, LibrariesOfTheDriverAreSeenInTheDriverOnly) {
  static const std::regex kLibrary("^(nlohmann|CLI)/.*$");
  for (const Include& include : AllIncludes()) {
    if (include.folder == "drive") continue;
    EXPECT_FALSE(std::regex_match(include.what, kLibrary))
        << include.file << " includes " << include.what;
  }
}

TEST(Layers, TheCoreKnowsNoFace) {
  for (const Include& include : AllIncludes()) {
    if (kFaces.contains(include.folder) || !include.of_ours) continue;
    EXPECT_FALSE(kFaces.contains(FolderOf(include.what)))
        << include.file << " includes " << include.what;
  }
}

/// The desktop's scripted part is what the driver's face is made of; the rest knows no script.
TEST(Layers, OnlyItsScriptedPartLetsTheDesktopKnowTheDriver) {
  for (const Include& include : AllIncludes()) {
    if (include.folder != "desktop" || include.file.rfind("desktop/scripted/", 0) == 0) continue;
    EXPECT_NE(FolderOf(include.what), "drive") << include.file << " includes " << include.what;
  }
}

}  // namespace
}  // namespace marlowbeck
