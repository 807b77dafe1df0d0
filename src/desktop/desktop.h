#pragma once

#include <functional>
#include <memory>
#include <string>

#include "data/real_file_system.h"
#include "desktop/dialogs.h"
#include "desktop/help_window.h"
#include "desktop/input_filter.h"
#include "desktop/message_boxes.h"
#include "desktop/page_printer.h"
#include "desktop/services.h"
#include "desktop/windows.h"
#include "program/program.h"

namespace marlowbeck {

/// The program on a desktop: its platform, its windows, and the way in for mouse and keyboard.
class Desktop : private Observer {
 public:
  /// The sound and the manual lie in the working folder or, where it has none, in the program's.
  Desktop(const QString& working_folder, const QString& program_folder);
  ~Desktop() override;

  /// Shows the main menu, with `before_showing` between the making of its window and the showing.
  /// Answers false when the program has ended itself on the way.
  bool Start(std::function<void()> before_showing = nullptr);

 private:
  void Refresh();
  void ErrorRaised(int /*number*/) override {}
  void Ended() override {}

  RealFileSystem files_;
  HelpWindow help_;
  MessageBoxes boxes_;
  PagePrinter printer_{OpenInViewer};
  DesktopDialogs dialogs_;
  DesktopClipboard clipboard_;
  DesktopSound sound_;
  DesktopClock clock_;
  DesktopTimer timer_;
  DesktopDisplay display_;
  Platform platform_;
  Program program_;
  Windows windows_;
  InputFilter filter_;
};

}  // namespace marlowbeck
