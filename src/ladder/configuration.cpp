// The rules of a grade's ladder on the Configuration tab.

#include "data/numbers.h"
#include "data/text.h"
#include "ladder/frmLadder.h"
#include "session/messages.h"

namespace marlowbeck {
namespace {

std::string TextOf(int number) { return std::to_string(number); }

}  // namespace

void frmLadder::OpenConfig() {
  Channels& channels = context_.channels;
  context_.GoToWorkingFolder();
  channels.CloseAll();
  LadderRules rules;
  try {
    rules = ReadLadderRules(channels, session_.LadderConfigFile);
  } catch (const RunTimeError&) {
    channels.AbandonAll();
    Warning(context_, Lines({"The Marlowbeck LADDER configuration file was not found.    ",
                             "A default file has been created for you which    ",
                             "may be edited by selecting the Configuration Tab.    "}));
    WriteLadderRules(channels, session_.LadderConfigFile, rules);
  }
  TakeInHand(session_, rules);
  cfgGrade.SetText(session_.Grade);
  cfgGames.SetText(TextOf(rules.GamesPerMatch));
  cfgWin.SetText(TextOf(rules.WinPoints));
  cfgLoss.SetText(TextOf(rules.LossPoints));
  cfgDraw.SetText(TextOf(rules.DrawPoints));
  cfgFinals.SetText(TextOf(rules.FinalsTeams));
}

void frmLadder::cmdSaveConfig_Click() {
  for (const TextBox* box : {&cfgGames, &cfgWin, &cfgLoss, &cfgDraw, &cfgFinals}) {
    if (!box->Text().empty()) continue;
    Warning(context_, "All boxes must be completed - including zeros.    ");
    return;
  }
  const auto number = [](const TextBox& box) { return Integer::Narrow(Val(box.Text())); };
  const LadderRules rules = {number(cfgWin), number(cfgLoss), number(cfgDraw),
                             CInt(cfgFinals.Text()), number(cfgGames)};
  // KEPT: nothing comes of the number of teams in the finals but that it is kept; a repair would
  // mark those teams in the table.
  context_.GoToWorkingFolder();
  WriteLadderRules(context_.channels, session_.LadderConfigFile, rules);
  context_.channels.CloseAll();
  TakeInHand(session_, rules);
  OKSound(context_);
  LeaveConfiguration();
}

void frmLadder::cmdCancel_Click() { LeaveConfiguration(); }

void frmLadder::LeaveConfiguration() {
  const bool on_ladder = fraPL.Visible();
  fraCF.Hide();
  fraSC.Enable();
  fraPL.Enable();
  cmdPL.SetEnabled(!on_ladder);
  cmdSC.SetEnabled(on_ladder);
  cmdCF.Enable();
  fraButtons.Show();
  cmdCF.SetFocus();
}

}  // namespace marlowbeck
