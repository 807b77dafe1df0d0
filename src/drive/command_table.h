#pragma once

#include <functional>
#include <map>
#include <string>

#include "drive/arguments.h"
#include "drive/json.h"
#include "drive/world.h"

namespace marlowbeck {

/// A command of the script: takes its arguments, does its work, and fills in the answer beyond
/// "ok". Throws Refusal before anything has changed.
using DriveCommand = std::function<void(World&, Arguments&, Json& answer)>;
using CommandTable = std::map<std::string, DriveCommand, std::less<>>;

// The commands by what they are about; each adds its own.
void AddActing(CommandTable& table);     ///< what a person does
void AddLooking(CommandTable& table);    ///< what a person sees, and more
void AddPreparing(CommandTable& table);  ///< answers laid ready
void AddPrinter(CommandTable& table);
void AddFaults(CommandTable& table);  ///< faults of the disk, and the clock

/// The next word as a way to hold the paper: portrait or landscape.
[[nodiscard]] Orientation TakeOrientation(Arguments& arguments);

/// The answer of a command that went as it was meant to; others say why not.
[[nodiscard]] Json Done();
[[nodiscard]] Json NotDone(const std::string& why);

}  // namespace marlowbeck
