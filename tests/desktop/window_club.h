#pragma once

#include <filesystem>
#include <stdexcept>

#include <QApplication>
#include <QWidget>

#include "support/club.h"

namespace marlowbeck {

/// The face on windows alone.
inline TestFace WindowsAlone() {
  static int argc = 1;
  static char name[] = "desktop-tests";
  static char* argv[] = {name, nullptr};
  return {"windows", [](BoxAnswers& answers) { return MakeWindowFace(answers, argc, argv); }};
}

/// The visible window of a screen; null for none.
inline QWidget* WindowOf(const std::string& screen) {
  for (QWidget* widget : QApplication::topLevelWidgets()) {
    const bool is_it = widget->objectName() == QString::fromStdString(screen);
    if (is_it && widget->isVisible()) return widget;
  }
  return nullptr;
}

/// The program on its windows with the sample open, a week after its last night.
class WindowClub : public Club {
 public:
  WindowClub() : Club({WindowsAlone()}) {
    namespace fs = std::filesystem;
    today = *DateFromIso("2004-04-07");
    for (const auto& entry : fs::directory_iterator(MARLOWBECK_SOURCE_DIR "/samples")) {
      const std::string name = entry.path().filename().string();
      const bool is_data = name.starts_with("Winter") || name.ends_with(".qz3");
      if (is_data) fs::copy_file(entry.path(), FilePath(name));
    }
    NameOpenFile("Winter.qza");
  }

  /// A widget of the window in front.
  template <typename Widget = QWidget>
  Widget& Find(const char* name) {
    const QWidget* const window = WindowOf(Front());
    auto* const found = window == nullptr ? nullptr : window->findChild<Widget*>(name);
    if (found == nullptr) throw std::logic_error(std::string(name) + " is not in front");
    return *found;
  }
};

}  // namespace marlowbeck
