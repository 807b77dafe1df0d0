#include "session/season.h"

#include "data/competition.h"
#include "data/text.h"

namespace marlowbeck {
namespace {

std::string AskForTitle(const Context& context) {
  const std::string prompt = Lines({"Enter a title that describes the Year and Season Name",
                                    "of the competition for " + context.session.Grade + ".", "",
                                    "eg: Men's Summer Comp  2000 / 2001.    ", "",
                                    "(This will appear on most printed output).    "});
  for (;;) {
    std::string reply = context.platform.boxes.Input({prompt, "Competition Name", {}, {}});
    if (!Trimmed(reply).empty()) return reply;
  }
}

}  // namespace

bool ReadSeason(const Context& context) {
  context.channels.CloseAll();
  try {
    context.session.SeasonDescription = ReadOneString(context.channels, context.session.SeasonFile);
  } catch (const RunTimeError&) {
    context.channels.AbandonAll();
    return false;
  }
  context.channels.CloseAll();
  return true;
}

void GetSeason(const Context& context) {
  if (ReadSeason(context)) return;
  context.session.SeasonDescription = AskForTitle(context);
  WriteOneString(context.channels, context.session.SeasonFile, context.session.SeasonDescription);
}

}  // namespace marlowbeck
