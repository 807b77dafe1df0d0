#include "session/fixture_entry.h"

#include "data/integer.h"
#include "data/numbers.h"
#include "data/text.h"

namespace marlowbeck {
namespace {

constexpr int kFewestTeams = 3;
constexpr int kMostTeams = 50;

Integer AskOnce(const Context& context) {
  const std::string reply = context.platform.boxes.Input(
      {Lines({"Accepted range for this fixture", "generator is from 3 to 50.", "", "",
              "How many teams in the fixture ?", ""}),
       "(Marlowbeck) Fixture Generator",
       "0",
       {}});
  return Integer::Narrow(Val(reply));
}

}  // namespace

bool AskTeamCount(const Context& context, Beep beep) {
  for (;;) {
    context.session.TeamCount = AskOnce(context);
    const int teams = context.session.TeamCount;
    if (teams < 1) return false;
    if (teams >= kFewestTeams && teams <= kMostTeams) return true;
    Warning(context, Lines({"Accepted range is from 3 to 50,    ", "Please try again.    "}), beep);
  }
}

}  // namespace marlowbeck
