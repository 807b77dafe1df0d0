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

constexpr std::string_view kBetweenNames = ", ";

bool IsOf(const PlayerView& player, std::string_view team, std::string_view grade) {
  return player.Team() == Trimmed(team) && player.Grade() == Trimmed(grade);
}

enum class AfterAMatch { Stop, GoOn };

/// The last match that is met.
std::optional<ListedPlayer> Listed(Channels& channels, const ListedLine& at, AfterAMatch after) {
  std::optional<ListedPlayer> found;
  channels.ForEachRecord(Channel::Players, [&](Bytes bytes, int number) {
    const PlayerView player(bytes);
    if (!IsOf(player, at.team, at.grade) || player.FullName(kBetweenNames) != at.line) return true;
    found = {number, Integer::Narrow(player.ID()), std::string(player.Surname()),
             std::string(player.FirstName())};
    return after == AfterAMatch::GoOn;
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
    if (IsOf(player, team, grade)) players.push_back(player.FullName(kBetweenNames));
  });
  return players;
}

std::optional<ListedPlayer> LastListed(Channels& channels, const ListedLine& at) {
  return Listed(channels, at, AfterAMatch::GoOn);
}

std::optional<ListedPlayer> FirstListed(Channels& channels, const ListedLine& at) {
  return Listed(channels, at, AfterAMatch::Stop);
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
