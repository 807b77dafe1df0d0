#include "session/shared_procedures.h"

#include <array>
#include <vector>

#include "data/competition.h"
#include "data/side_file.h"
#include "data/text.h"
#include "session/messages.h"
#include "ui/screens.h"

namespace marlowbeck {
namespace {

constexpr const char* kFileNameFile = "FileName.qz3";
constexpr const char* kGameNameFile = "GameName.qz3";

void Refill(LineHolder& list, const std::vector<std::string>& lines) {
  list.Clear();
  for (const std::string& line : lines) list.AddLine(line);
}

void ReadGameNames(const Context& context) {
  context.channels.OpenInput(Channel::GameNames, kGameNameFile);
  std::array<std::string, 6> names;
  for (std::string& name : names) name = context.channels.Reader(Channel::GameNames).Text();
  context.channels.Close(Channel::GameNames);
  context.session.GameNames = names;
}

}  // namespace

void GetGrades(const Context& context, LineHolder& list) {
  list.Clear();
  OpenFile(context.session, context.channels);
  if (context.session.PlayerFile.empty()) return;
  Refill(list, SortedDistinct(GradesInFile(context.channels)));
  context.channels.CloseAll();
}

void GetTeams(const Context& context, std::string_view grade, LineHolder& list) {
  list.Clear();
  OpenFile(context.session, context.channels);
  if (context.session.PlayerFile.empty()) return;
  Refill(list, SortedDistinct(TeamsInFile(context.channels, grade)));
  context.channels.CloseAll();
}

void GameNames(const Context& context) {
  try {
    ReadGameNames(context);
  } catch (const RunTimeError& error) {
    if (!SideFileIsAtFault(error)) throw;
    context.channels.AbandonAll();
    WriteGameNames(context, {"Triples", "Doubles", "Singles", "Tpls", "Dbls", "Sgls"});
    ReadGameNames(context);
  }
}

void WriteGameNames(const Context& context, const std::array<std::string, 6>& names) {
  context.channels.OpenOutput(Channel::GameNames, kGameNameFile, Keeping::Lasting);
  for (const std::string& name : names) {
    context.channels.Writer(Channel::GameNames).PlainLine(name);
  }
  context.channels.Close(Channel::GameNames);
}

void ReadFileName(const Context& context) {
  context.GoToWorkingFolder();
  context.session.PlayerFile = ReadOneString(context.channels, kFileNameFile);
}

void WriteFileName(const Context& context) {
  context.GoToWorkingFolder();
  WriteOneString(context.channels, kFileNameFile, context.session.PlayerFile);
}

std::string PegsDescription(const Session& session, int code) {
  const auto& names = session.GameNames;
  switch (code) {
    case 111:
      return " No games.";
    case 333:
      return " All games.";
    case 300:
      return names[0] + " Only";
    case 30:
      return names[1] + " Only";
    case 3:
      return names[2] + " Only";
    case 330:
      return names[0] + " & " + names[1];
    case 303:
      return names[0] + " & " + names[2];
    case 33:
      return names[1] + " & " + names[2];
    default:
      return {};
  }
}

std::string AskSurname(const Context& context) {
  return UpperCase(Trimmed(
      context.platform.boxes.Input({"Enter SURNAME to Search for.", "Name Search", {}, {}})));
}

void nofile(const Context& context, Screens& screens, Beep beep) {
  if (const Screen* menu = screens.Find("frmDB")) {
    menu->Find("lblHMPlayers")->SetCaption(" No File Open ");
    for (const char* name : {"imgSheets", "imgPlayers", "imgPrinter"}) menu->Find(name)->Disable();
  }
  Warning(context,
          Lines({"No Marlowbeck file is open.", "To Open an existing file, select       ",
                 "Open from the File Menu.", "", "To Create a NEW file, select",
                 "NEW from the File Menu."}),
          beep);
}

void GoToWorkingFolderIfThere(const Context& context) {
  try {
    context.GoToWorkingFolder();
  } catch (const RunTimeError&) {
    context.channels.AbandonAll();
  }
}

void EndProgram(const Context& context, Screens& screens) {
  context.channels.CloseAll();
  screens.End();
  context.platform.observer.Ended();
}

}  // namespace marlowbeck
