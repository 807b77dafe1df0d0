// Other names for grades and teams on the setup screen.

#include "data/competition.h"
#include "data/text.h"
#include "session/messages.h"
#include "setup/frmNames.h"
#include "setup/renames.h"

namespace marlowbeck {
namespace {

void TellRenamed(const Context& context, const std::string& from, const std::string& to) {
  GoodMessage(context, Lines({"    " + from, "has been changed to    ", "    " + to + "    "}));
}

}  // namespace

void frmNames::cmdEdGradeName_Click() {
  TakeGradeAndTeam();
  WithButtonsOff([this] {
    const std::string name = AskForOtherName("Edit Grade Name", session_.Grade);
    if (!IsFree(AsGrade(name), GradeInUse)) return BackToNames();
    RenameGrade(name);
    Reset();
  });
}

void frmNames::cmdEdTeamName_Click() {
  TakeGradeAndTeam();
  WithButtonsOff([this] {
    const std::string name = AskForOtherName("Edit Team Name", session_.Team);
    // Every place that is blank would be taken for the team's.
    if (session_.Team.empty() || !IsFree(AsTeam(name), TeamInUse)) return BackToNames();
    RenameTeam(name);
    Reset();
  });
}

void frmNames::TakeGradeAndTeam() {
  session_.Team = Trim(cboAddTm.Text());
  session_.Grade = Trim(cboAddGrd.Text());
}

std::string frmNames::AskForOtherName(const std::string& title, const std::string& name) {
  return context_.platform.boxes.Input({Lines({"Enter NEW Name for    ", name}), title, {}, {}});
}

/// `name` is what a record can hold of the reply: two names that are one when they are cut would
/// become one for good.
bool frmNames::IsFree(std::string_view name, InUse in_use) {
  if (Trimmed(name).empty()) return false;
  OpenPlayers();
  const bool taken = in_use(context_.channels, name);
  context_.channels.CloseAll();
  if (taken) Warning(context_, "Name is already in use.    ");
  return !taken;
}

void frmNames::RenameGrade(const std::string& name) {
  OpenPlayers();
  RenameGradeOfPlayers(context_.channels, {session_.Grade, name});
  // KEPT: the box tells of the new name before the files of the grade have it; a repair would tell
  // when all is done.
  TellRenamed(context_, session_.Grade, name);
  RenameFilesOfGrade(name);
}

/// KEPT: that the files, or some of them, still have the old name is told to nobody; a repair would
/// name them.
///
/// KEPT: the file names in hand stay those of the old name; a repair would take the new ones.
void frmNames::RenameFilesOfGrade(const std::string& name) {
  try {
    OpenPlayers();
    NameGradeFiles(session_);
    RenameGradeFiles(context_.channels.Files(), session_.PlayerFile, {session_.Grade, name});
  } catch (const RunTimeError&) {
    context_.channels.AbandonAll();
  }
}

void frmNames::RenameTeam(const std::string& name) {
  const std::string old_name = session_.Team;
  const Renaming team{old_name, name};
  OpenPlayers();
  RenameTeamOfPlayers(context_.channels, session_.Grade, team);
  OpenResultSFile();
  RenameTeamInResults(context_.channels, team);
  OpenLadderFile(session_, context_.channels);
  RenameTeamInMatches(context_.channels, team);
  TellRenamed(context_, old_name, name);
}

}  // namespace marlowbeck
