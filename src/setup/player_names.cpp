#include "setup/player_names.h"

#include <algorithm>
#include <set>

#include "data/text.h"

namespace marlowbeck {
namespace {

using NameOf = std::string_view (PlayerView::*)() const;

std::vector<std::string> Distinct(Channels& channels, NameOf name) {
  std::set<std::string, std::less<>> names;
  channels.ForEachRecord(Channel::Players, [&](Bytes bytes, int) {
    const PlayerView player(bytes);
    const std::string_view found = (player.*name)();
    if (!names.contains(found)) names.emplace(found);
  });
  return {names.begin(), names.end()};
}

bool InUse(Channels& channels, NameOf name, std::string_view wanted) {
  bool found = false;
  channels.ForEachRecord(Channel::Players, [&](Bytes bytes, int) {
    const PlayerView player(bytes);
    found = EqualsIgnoringCase((player.*name)(), Trimmed(wanted));
    return !found;
  });
  return found;
}

}  // namespace

std::vector<std::string> AllGrades(Channels& channels) {
  return Distinct(channels, &PlayerView::Grade);
}

std::vector<std::string> AllTeams(Channels& channels) {
  return Distinct(channels, &PlayerView::Team);
}

std::vector<std::string> PlayersOf(Channels& channels, std::string_view team,
                                   std::string_view grade) {
  std::vector<std::string> players;
  channels.ForEachRecord(Channel::Players, [&](Bytes bytes, int) {
    const PlayerView player(bytes);
    if (player.Team() == Trimmed(team) && player.Grade() == Trimmed(grade)) {
      players.push_back(player.FullName(", "));
    }
  });
  return players;
}

bool GradeInUse(Channels& channels, std::string_view grade) {
  return InUse(channels, &PlayerView::Grade, grade);
}

bool TeamInUse(Channels& channels, std::string_view team) {
  return InUse(channels, &PlayerView::Team, team);
}

std::optional<Integer> BestOfThreeOf(Channels& channels, std::string_view grade) {
  std::optional<Integer> code;
  channels.ForEachRecord(Channel::Players, [&](Bytes bytes, int) {
    const PlayerView player(bytes);
    const bool found = player.Grade() == Trimmed(grade);
    if (found) code = Integer::Narrow(player.BestOfThree());
    return !found;
  });
  return code;
}

RecordsBefore LookThroughPlayers(Channels& channels) {
  RecordsBefore before;
  channels.ForEachRecord(Channel::Players, [&](Bytes bytes, int) {
    before.highest_id = std::max(before.highest_id, PlayerView(bytes).ID());
    before.last_reserved1 = ReadDate(bytes, kPlayerFields[5].offset);
  });
  return before;
}

}  // namespace marlowbeck
