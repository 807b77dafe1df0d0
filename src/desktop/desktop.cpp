#include "desktop/desktop.h"

#include <utility>

#include <QApplication>
#include <QDir>

#include "desktop/encoding.h"
#include "desktop/working_folder.h"

namespace marlowbeck {

Desktop::Desktop(const QString& working_folder, const QString& program_folder)
    : help_(FolderWith("topics.txt", {working_folder, program_folder})),
      boxes_([this] { windows_.Refresh(); }, [this](int topic) { help_.Open("qz1.HLP", topic); }),
      dialogs_(printer_, [this] { windows_.Refresh(); }),
      sound_({working_folder, program_folder}),
      display_([this] { Refresh(); }),
      platform_{boxes_, dialogs_, printer_, clipboard_, sound_,
                help_,  clock_,   timer_,   display_,   *this},
      program_(platform_, files_, FromQt(QDir::toNativeSeparators(working_folder))),
      windows_(program_.GetScreens(), program_.GetHand(), [] { QApplication::exit(); }),
      filter_(windows_) {
  qApp->installEventFilter(&filter_);
}

Desktop::~Desktop() { qApp->removeEventFilter(&filter_); }

bool Desktop::Start(std::function<void()> before_showing) {
  windows_.CallBeforeShowing(std::move(before_showing));
  program_.Start();
  windows_.Refresh();
  return !program_.GetScreens().Ended();
}

/// In long work: what is seen is painted, but nobody can act, and the pointer says so.
void Desktop::Refresh() {
  windows_.ShowBusy();
  windows_.Refresh();
  QApplication::processEvents(QEventLoop::ExcludeUserInputEvents);
}

}  // namespace marlowbeck
