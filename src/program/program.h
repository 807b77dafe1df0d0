#pragma once

#include <functional>
#include <string>

#include "data/channels.h"
#include "data/session.h"
#include "platform/platform.h"
#include "program/register_screens.h"
#include "ui/context.h"
#include "ui/hand.h"
#include "ui/screens.h"

namespace marlowbeck {

/// The program, put together from a platform, a file system and a working folder. The one place
/// that knows all screens.
class Program {
 public:
  /// Puts the screens of a program into its registry.
  using Registration = std::function<void(Screens&, const Context&)>;

  Program(Platform& platform, FileSystem& files, std::string working_folder,
          const Registration& registration = RegisterScreens);
  Program(const Program&) = delete;
  Program& operator=(const Program&) = delete;

  /// Loads, shows and activates the main menu.
  void Start();
  /// Cleans up after an event that was given up from outside, by an exception that the dispatcher
  /// lets pass: no file stays open.
  void GiveUpEvent();

  [[nodiscard]] Screens& GetScreens() { return screens_; }
  [[nodiscard]] Session& GetSession() { return session_; }
  [[nodiscard]] Hand& GetHand() { return hand_; }

 private:
  /// The end of every event that failed: no file stays open, and the user is told.
  void ReportError(int number);

  std::string working_folder_;
  Platform& platform_;
  Session session_;
  Channels channels_;
  Context context_;
  Screens screens_;
  Hand hand_;
};

}  // namespace marlowbeck
