#pragma once

#include <array>
#include <string>
#include <string_view>

#include "session/messages.h"
#include "ui/context.h"
#include "ui/controls.h"

namespace marlowbeck {

class Screens;

/// Refills a list with the distinct grades of the open competition, ascending. Opens and closes the
/// player file; nothing is listed while no file is open.
void GetGrades(const Context& context, LineHolder& list);

/// Refills a list with the distinct teams of a grade, ascending.
void GetTeams(const Context& context, std::string_view grade, LineHolder& list);

/// Reads the six strings of `GameName.qz3` into the session. A file that is missing, or holds
/// fewer, is written anew with the names that every installation begins with.
void GameNames(const Context& context);
/// Writes the file, one name to a line as it stands.
void WriteGameNames(const Context& context, const std::array<std::string, 6>& names);

/// Reads the open competition's path from `FileName.qz3` in the working folder into PlayerFile.
/// Throws when it cannot be read.
void ReadFileName(const Context& context);
void WriteFileName(const Context& context);

/// The words for a Best of Three code, with the game names of the session: BestOfThreeText.
[[nodiscard]] std::string PegsDescription(const Session& session, int code);

/// Asks for a surname to search for: trimmed and upper-cased, empty for none.
[[nodiscard]] std::string AskSurname(const Context& context);

/// Tells that no competition is open, on the main menu and in a box.
void nofile(const Context& context, Screens& screens, Beep beep);

/// The way out must not depend on a folder that may have gone.
void GoToWorkingFolderIfThere(const Context& context);

/// The end of the program: what runs now is the last thing that it does.
void EndProgram(const Context& context, Screens& screens);

}  // namespace marlowbeck
