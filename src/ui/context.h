#pragma once

#include <string>

#include "data/channels.h"
#include "data/session.h"
#include "platform/platform.h"

namespace marlowbeck {

/// What every screen works with, handed to it at its making.
struct Context {
  Session& session;
  Channels& channels;
  Platform& platform;
  const std::string& working_folder;

  /// Makes the working folder the current one, in which side files lie.
  void GoToWorkingFolder() const { channels.Files().ChangeFolder(working_folder); }
};

}  // namespace marlowbeck
