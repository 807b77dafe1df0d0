#pragma once

#include <string>
#include <vector>

#include "support/club.h"

namespace marlowbeck {

inline constexpr int kYesNo = 68;
inline constexpr int kYesNoCancel = 67;
inline constexpr int kDangerYesNo = 20;
inline constexpr int kInformation = 64;
inline constexpr int kWarningStyle = 48;

/// The copier over a working folder with a few files of a season and others, and an empty folder
/// "Stick" in it, which the D pane can go to.
class CopierTest : public ClubTest {
 protected:
  CopierTest() {
    WriteFile("Summer.qza", "summer");
    WriteFile("Winter.qza", "players");
    WriteFile("Winter_A.qzr", "results");
    WriteFile("notes.txt", "notes");
    WriteFile("Stick/.x", "");
    DeleteFile("Stick/.x");
  }

  void Open(Here here = Here::current()) { Do("click imgbackup", here); }
  void OpenWithStick(Here here = Here::current()) {
    Open(here);
    Do("dblpick BuDirD =Stick", here);
  }
  /// Whether a command can be pressed, letter by letter: All, Unselect, Copy, New, Delete file,
  /// delete Folder; a dash for one that cannot.
  std::string Buttons(char pane, Here here = Here::current()) {
    std::string buttons;
    const std::vector<std::pair<const char*, char>> names = {
        {"cmdAll", 'A'}, {"cmdUS", 'U'},     {"cmdBu", 'C'},
        {"cmdNew", 'N'}, {"cmdDelete", 'D'}, {"cmdDelFolder", 'F'}};
    for (const auto& [name, letter] : names) {
      buttons += Enabled(std::string(name) + pane, here) ? letter : '-';
    }
    return buttons;
  }
  std::string Upper(const std::string& name) const {
    std::string path = name.empty() ? Folder().string() : PathOf(name);
    for (char& letter : path) {
      if (letter >= 'a' && letter <= 'z') letter = static_cast<char>(letter - 'a' + 'A');
    }
    return path;
  }
  std::string PathOf(const std::string& name) const { return (Folder() / name).string(); }
  std::vector<int> Marked(const std::string& list, Here here = Here::current()) {
    return Get(list, here)["selected"].get<std::vector<int>>();
  }
  std::string Color(const std::string& label, Here here = Here::current()) {
    return Get(label, here)["color"];
  }
};

}  // namespace marlowbeck
