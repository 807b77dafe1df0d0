#include "season/season_results.h"

#include <algorithm>

#include "data/competition.h"

namespace marlowbeck {

SeasonResults::SeasonResults(Session& session, Channels& channels) {
  OpenFile(session, channels);
  channels.ForEachRecord(Channel::Players, [&](Bytes record, int) {
    const PlayerView player(record);
    players_.push_back({player.ID(), std::string(player.FirstName()), std::string(player.Surname()),
                        std::string(player.Team()), std::string(player.Grade())});
  });
  channels.Close(Channel::Players);
  OpenResultSFile(session, channels);
  records_.reserve(static_cast<std::size_t>(int{session.ResultCount}) * kResultLength);
  channels.ForEachRecord(Channel::Results, [&](Bytes record, int) {
    places_[ResultView(record).ID()].push_back(records_.size());
    records_.insert(records_.end(), record.begin(), record.end());
  });
  channels.CloseAll();
}

std::string SeasonResults::NameOf(std::int32_t id) const {
  const auto player = std::find_if(players_.begin(), players_.end(),
                                   [id](const Somebody& somebody) { return somebody.id == id; });
  return player == players_.end() ? std::string() : player->first_name + " " + player->surname;
}

AnnualReport SeasonResults::ReportOf(std::int32_t id) const {
  AnnualReport report;
  const auto places = places_.find(id);
  if (places == places_.end()) return report;
  for (const std::size_t place : places->second) {
    report.Add(ResultView(Bytes(records_).subspan(place, kResultLength)));
  }
  return report;
}

std::vector<SeasonResults::Listed> SeasonResults::PlayersOf(std::string_view grade,
                                                            std::string_view team) const {
  std::vector<Listed> listed;
  for (const Somebody& somebody : players_) {
    if (somebody.grade != grade || somebody.team != team || !HasAny(somebody.id)) continue;
    listed.push_back({somebody.id, somebody.surname + ",  " + somebody.first_name});
  }
  return listed;
}

}  // namespace marlowbeck
