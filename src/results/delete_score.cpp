// Deleting the result that is open for correction: the file is rewritten without its record.

#include "data/competition.h"
#include "data/record_rewriting.h"
#include "data/text.h"
#include "results/frmResults.h"
#include "session/messages.h"

namespace marlowbeck {

void frmResults::cmdEdDelete_Click() {
  if (AskToDelete() != kAnswerYes) return RePick();
  Session& session = context_.session;
  context_.channels.CloseAll();
  OpenResultSFile(session, context_.channels);
  const std::string work_file = WithExtension(session.ResultsFile, ".qz3");
  CopyRecordsWithout(
      context_.channels, Channel::Results,
      [&](Bytes, int number) { return number == session.EditRecord; }, work_file);
  PutInPlace(work_file);
  fraResults.Hide();
  fraEdButtons.Hide();
  RePick();
}

int frmResults::AskToDelete() {
  const std::string player = Trim(panFirstName.Caption()) + " " + Trim(panSurname.Caption());
  return WarningYesNo(
      context_, Lines({"W A R N I N G !", "You are about to Delete results from",
                       context_.session.Team, "recorded on " + ShortDate(context_.session.WorkDate),
                       "", "Player:  " + player, "", "Are you Sure ?"}));
}

void frmResults::PutInPlace(const std::string& work_file) {
  Session& session = context_.session;
  FileSystem& files = context_.channels.Files();
  try {
    files.Replace(work_file, session.ResultsFile);
    session.EditRecord = 0;
    OpenResultSFile(session, context_.channels);
    context_.channels.CloseAll();
  } catch (const RunTimeError&) {
    // Once the record is gone its number is another one's: nothing more may be done with the sheet.
    if (!files.Exists(work_file)) CloseSheet();
    throw;
  }
}

}  // namespace marlowbeck
