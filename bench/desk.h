#pragma once

#include <filesystem>
#include <string>

#include <QApplication>

#include "data/real_file_system.h"
#include "desktop/windows.h"
#include "program/program.h"
#include "tests/desktop/still_world.h"

namespace marlowbeck::bench {

/// The program on its windows in a folder of its own, to be worked and timed.
class Desk {
 public:
  explicit Desk(Platform& platform) : program_(platform, files_, folder_.string()) {}
  Desk(const Desk&) = delete;
  Desk& operator=(const Desk&) = delete;
  ~Desk() { std::filesystem::remove_all(folder_); }

  [[nodiscard]] const std::filesystem::path& Folder() const { return folder_; }
  void Start() {
    program_.Start();
    windows_.Refresh();
    QApplication::processEvents();
  }

  /// A control of a screen that is loaded.
  [[nodiscard]] Control& Find(const char* screen, const char* control) {
    return *program_.GetScreens().Find(screen)->Find(control);
  }
  /// Lets the hand act, and the windows paint what has come of it.
  void Do(const Windows::Act& act) {
    windows_.Do(nullptr, act);
    QApplication::processEvents();
    if (ScreenWindow* const front = windows_.Front()) front->Window().repaint();
  }
  void Click(const char* screen, const char* control) {
    Control& clicked = Find(screen, control);
    Do([&](Hand& hand) { return hand.Click(clicked); });
  }

 private:
  static std::filesystem::path MakeFolder() {
    std::string pattern = (std::filesystem::temp_directory_path() / "marlowbeck-XXXXXX").string();
    if (mkdtemp(pattern.data()) == nullptr) std::abort();
    return pattern;
  }

  std::filesystem::path folder_ = MakeFolder();
  RealFileSystem files_;
  Program program_;
  Windows windows_{program_.GetScreens(), program_.GetHand(), [] {}};
};

}  // namespace marlowbeck::bench
