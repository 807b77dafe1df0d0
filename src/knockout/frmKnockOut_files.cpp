// The selection saved by name, and opened again.

#include "data/text.h"
#include "knockout/frmKnockOut.h"
#include "session/messages.h"

namespace marlowbeck {
namespace {

constexpr const char* kPattern = "*.ko4";
// KEPT: both file boxes write KNOCK-OUT with a zero in their titles; a repair would write the
// letter.
constexpr const char* kSaveTitle = "[Marlowbeck] SAVE KNOCK-0UT file.";
constexpr const char* kOpenTitle = "[Marlowbeck] OPEN KNOCK-0UT file.";

/// The path that a file dialog came back with; empty when it was cancelled or left as it stood.
std::string AskForFile(const Context& context, FileDialogRequest::Mode mode, const char* title) {
  context.GoToWorkingFolder();
  FileDialogRequest request = {mode, title, kPattern, context.working_folder, kPattern, "ko4"};
  request.asks_before_overwriting = mode == FileDialogRequest::Mode::Save;
  const auto answer = context.platform.dialogs.File(request);
  context.GoToWorkingFolder();
  return answer && FileNameOf(*answer) != kPattern ? *answer : std::string();
}

}  // namespace

/// Whatever goes wrong with a list file is told in the words of the file dialogs.
void frmKnockOut::WithFileWords(const Handler& work) {
  try {
    work();
  } catch (const RunTimeError&) {
    context_.channels.AbandonAll();
    Warning(context_,
            Lines({"The file name specified could    ", "not be found. Please retry.    "}),
            Beep::First);
  }
}

void frmKnockOut::cmdSaveKO_Click() {
  if (Selected() < 1) {
    Warning(context_, "Nothing to save!", Beep::First);
    return;
  }
  WithFileWords([this] {
    const std::string file_name = AskForFile(context_, FileDialogRequest::Mode::Save, kSaveTitle);
    if (!file_name.empty()) SaveList(file_name);
  });
}

void frmKnockOut::SaveList(const std::string& file_name) {
  context_.channels.CloseAll();
  context_.channels.OpenOutput(Channel::Side, file_name, Keeping::Lasting);
  WriteList(context_.channels.Writer(Channel::Side), {PlacesInGrid(), date_, lblGrade.Caption()});
  context_.channels.CloseAll();
  GoodMessage(context_, file_name + " has been saved!");
}

void frmKnockOut::cmdOpen_Click() {
  const std::string grade_before = grade_;
  WithFileWords([&] {
    try {
      OpenList();
    } catch (const RunTimeError&) {
      grade_ = grade_before;
      throw;
    }
  });
  UpdateNOP();
}

void frmKnockOut::OpenList() {
  const std::string file_name = AskForFile(context_, FileDialogRequest::Mode::Open, kOpenTitle);
  if (file_name.empty()) return;
  const ListReading reading = ReadList(context_.channels.ReadWhole(file_name));
  grade_ = reading.last_item;
  GetAssocPlayers();
  ShowList(reading);
}

/// A file that is not whole fills the table as far as it goes.
void frmKnockOut::ShowList(const ListReading& reading) {
  PutPlaces(reading.list.places);
  RemoveDupes();
  if (!reading.whole) throw RunTimeError(ErrorNumber::InputPastEnd);
  date_ = reading.list.date;
  ShowDate();
  lblGrade.SetCaption(reading.list.grade);
}

/// Takes those out of the list who stand in the table.
void frmKnockOut::RemoveDupes() {
  for (int row = 1; row < FirstFreePlace(); ++row) {
    const Entrant entrant = EntrantAt(row);
    const std::string line = LineOf({Trim(entrant.name), Trim(entrant.grade)});
    for (int place = lstAllPlayers.Find(line); place >= 0; place = lstAllPlayers.Find(line)) {
      lstAllPlayers.RemoveLine(place);
    }
  }
}

}  // namespace marlowbeck
