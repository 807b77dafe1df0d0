// Random evenings with the copier against two folders kept as plain maps.

#include <map>
#include <random>

#include "support/club.h"

namespace marlowbeck {
namespace {

constexpr int kSteps = 240;

/// A folder as a map from name to content. Names differ in more than capitals.
using PlainFolder = std::map<std::string, std::string>;

class RandomCopies : public testing::TestWithParam<unsigned> {
 protected:
  RandomCopies() : club(ModelFaceAlone()) {
    for (const char* folder : {"Left", "Right"}) {
      for (int i = 0; i < 6; ++i) Put(folder, Name());
      club.WriteFile(std::string(folder) + "/other.txt", "not of a season");
    }
    club.DoAll({"click imgbackup", "dblpick BuDirS =Left", "dblpick BuDirD =Right"});
  }

  unsigned Below(unsigned bound) { return static_cast<unsigned>(chance() % bound); }
  std::string Name() { return std::string(1, static_cast<char>('a' + Below(9))) + ".qza"; }
  void Put(const std::string& folder, const std::string& name) {
    std::string content = folder + " " + std::to_string(++version);
    club.WriteFile(folder + "/" + name, content);
    folders[folder][name] = std::move(content);
  }
  char Letter(const std::string& folder) const { return folder == "Left" ? 'S' : 'D'; }
  static std::string Other(const std::string& folder) {
    return folder == "Left" ? "Right" : "Left";
  }

  /// Marks some of a folder's files and answers their names; none when there are none.
  std::vector<std::string> Mark(const std::string& folder) {
    std::vector<std::string> marked;
    std::string line = std::string("select BuFile") + Letter(folder);
    int index = 0;
    for (const auto& [name, content] : folders[folder]) {
      if (Below(2) == 0) {
        marked.push_back(name);
        line += " " + std::to_string(index);
      }
      ++index;
    }
    if (!marked.empty()) club.Do(line);
    return marked;
  }

  void CopySome() {
    const std::string from = Below(2) == 0 ? "Left" : "Right";
    const PlainFolder before = folders[Other(from)];
    const auto marked = Mark(from);
    if (marked.empty()) return;
    club.Do("answer yes");
    int copied = 0;
    bool cancelled = false;
    for (const std::string& name : marked) {
      if (cancelled) break;
      if (!overwriting && before.contains(name)) {
        const unsigned answer = Below(5);
        club.Do(answer == 0 ? "answer cancel" : answer < 3 ? "answer no" : "answer yes");
        cancelled = answer == 0;
        if (answer < 3) continue;
      }
      folders[Other(from)][name] = folders[from][name];
      ++copied;
    }
    club.Do(std::string("click cmdBu") + Letter(from));
    const std::string last = club.BoxTexts().back();
    if (cancelled) {
      EXPECT_NE(last.find("already exists"), std::string::npos);
    } else if (copied == 0) {
      EXPECT_EQ(last, "No files copied.");
    } else {
      EXPECT_EQ(last.substr(0, last.find(' ')), std::to_string(copied));
    }
  }

  void DeleteSome() {
    const std::string folder = Below(2) == 0 ? "Left" : "Right";
    const auto marked = Mark(folder);
    if (marked.empty()) return;
    const bool sure = Below(3) > 0;
    club.Do(sure ? "answer yes" : "answer no");
    club.Do(std::string("click cmdDelete") + Letter(folder));
    for (const std::string& name : marked) {
      if (sure) folders[folder].erase(name);
    }
  }

  void Step() {
    switch (Below(6)) {
      case 0:
        return DeleteSome();
      case 1:
        club.Do("click chkReplace");
        overwriting = !overwriting;
        return;
      case 2:
        Put(Below(2) == 0 ? "Left" : "Right", Name());
        club.DoAll({"click opt(0)", "click opt(1)"});
        return;
      default:
        return CopySome();
    }
  }

  void ExpectWhatThePlainFoldersHold() {
    for (const auto& [folder, files] : folders) {
      std::vector<std::string> names;
      for (const auto& [name, content] : files) {
        names.push_back(name);
        EXPECT_EQ(club.File(folder + "/" + name), content);
      }
      EXPECT_EQ(club.Lines(std::string("BuFile") + Letter(folder)), names);
      EXPECT_EQ(club.File(folder + "/other.txt"), "not of a season");
      EXPECT_EQ(Entries(folder), names.size() + 1) << "nothing else is left behind";
    }
  }
  std::size_t Entries(const std::string& folder) const {
    const auto entries = std::filesystem::directory_iterator(club.FilePath(folder));
    return static_cast<std::size_t>(std::distance(begin(entries), end(entries)));
  }

  std::mt19937 chance{GetParam()};
  Club club;
  std::map<std::string, PlainFolder> folders;
  bool overwriting = false;
  int version = 0;
};

TEST_P(RandomCopies, LeaveWhatAPersonAskedFor) {
  for (int step = 1; step <= kSteps; ++step) {
    Step();
    if (step % 20 == 0) ExpectWhatThePlainFoldersHold();
    ASSERT_FALSE(HasFailure()) << "step " << step << " of seed " << GetParam();
  }
}

INSTANTIATE_TEST_SUITE_P(Seeds, RandomCopies, testing::Values(1U, 2U, 3U));

}  // namespace
}  // namespace marlowbeck
