#include "season/frmPlayersLists.h"

#include "data/competition.h"
#include "data/text.h"
#include "print/tabbed_text.h"
#include "season/team_lists.h"
#include "session/messages.h"
#include "session/season.h"
#include "session/shared_procedures.h"
#include "ui/screens.h"

namespace marlowbeck {

frmPlayersLists::frmPlayersLists(Screens& screens, const Context& context)
    : Screen(screens, "frmPlayersLists", "[Marlowbeck]  Players Lists "),
      context_(context),
      session_(context.session) {
  Combo1.Click = [this] { GetTeams(); };
  cmdClip.Click = [this] { cmdClip_Click(); };
  cmdHelp1.Click = [this] { context_.platform.help.Open("qz1.HLP", 0); };
  cmdExit.Click = [this] { InScreens().Unload(*this); };
  Cancels = {&cmdExit};
  Helps = {&cmdHelp1};
}

void frmPlayersLists::Load() { Start(); }

void frmPlayersLists::Unload() { InScreens().Show("frmDB"); }

void frmPlayersLists::Start() {
  ReadFileName(context_);
  if (session_.PlayerFile.empty()) return nofile(context_, InScreens(), Beep::No);
  GetGrades();
  if (Combo1.Count() == 0) GetTeams();
  TakeGrade();
}

/// Selecting the first grade lists its teams.
void frmPlayersLists::GetGrades() {
  marlowbeck::GetGrades(context_, Combo1);
  if (Combo1.Count() > 0) Combo1.SetIndex(0);
}

void frmPlayersLists::GetTeams() {
  lstteams.Clear();
  TakeGrade();
  OpenFile(session_, context_.channels);
  if (session_.PlayerCount == 1) return ListOnlyPlayersTeam();
  ListTeams();
  cmdClip.SetFocus();
}

/// The title that is copied is that of the grade on show.
void frmPlayersLists::TakeGrade() {
  session_.Grade = Trim(Combo1.Text());
  session_.SeasonFile = GradeFileName(session_.PlayerFile, session_.Grade, ".qzs");
}

void frmPlayersLists::ListOnlyPlayersTeam() {
  // KEPT: of a file with one player only the team is listed, without rule or player; a repair would
  // list it as any other.
  context_.channels.ForEachRecord(
      Channel::Players, [&](Bytes record, int) { lstteams.AddLine(PlayerView(record).Team()); });
  context_.channels.CloseAll();
}

void frmPlayersLists::ListTeams() {
  TeamLists teams(session_.Grade);
  context_.channels.ForEachRecord(Channel::Players,
                                  [&](Bytes record, int) { teams.Add(PlayerView(record)); });
  context_.channels.CloseAll();
  for (const std::string& line : teams.TakeLines()) lstteams.AddLine(line);
}

void frmPlayersLists::cmdClip_Click() {
  context_.platform.clipboard.Clear();
  GetSeason(context_);
  TabbedText text;
  text.Line(session_.AssociationName).Line(Trim(session_.SeasonDescription));
  text.Line("PLAYER LIST").Line("");
  for (const std::string& line : lstteams.Lines()) text.Line(line);
  context_.platform.clipboard.SetText(text.Text());
  // KEPT: the box says that leaving clears the clipboard, which it does not; a repair would leave
  // those words out.
  GoodMessage(context_,
              Lines({"The Player List has been copied to the clipboard    ",
                     "and can now be pasted as text into your    ",
                     "favourite spreadsheet or wordprocessor.    ", "",
                     "Note: When you leave this section,    ", "the Clipboard will be cleared !"}));
}

}  // namespace marlowbeck
