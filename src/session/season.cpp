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
  Channels& channels = context.channels;
  channels.CloseAll();
  try {
    channels.OpenInput(Channel::Side, context.session.SeasonFile);
    // KEPT: a title with a double quote in it comes back only up to that; a repair would read on to
    // the quote that ends the line.
    context.session.SeasonDescription = channels.Reader(Channel::Side).TextToFirstQuote();
  } catch (const RunTimeError&) {
    channels.AbandonAll();
    return false;
  }
  channels.CloseAll();
  return true;
}

void GetSeason(const Context& context) {
  if (ReadSeason(context)) return;
  context.session.SeasonDescription = AskForTitle(context);
  WriteOneString(context.channels, context.session.SeasonFile, context.session.SeasonDescription);
}

}  // namespace marlowbeck
