#include "results/player_listing.h"

#include "data/competition.h"

namespace marlowbeck {
namespace {

constexpr int kNamePlaces = 1000;
constexpr int kSparePlaces = 10;

}  // namespace

PlayerListing::PlayerListing(std::string_view team, std::string_view grade,
                             std::string_view opposition, Date date, int player_count)
    : team_(team),
      grade_(grade),
      opposition_(opposition),
      date_(date),
      ids_(1, player_count + kSparePlaces),
      names_(1, kNamePlaces) {}

void PlayerListing::AddPlayer(const PlayerView& player) {
  if (player.Team() != team_ || player.Grade() != grade_) return;
  const Integer id = player.ID();
  ++count_;
  ids_[count_] = id;
  names_[count_] = player.FullName(kSheetNameSeparator);
  places_[id].push_back(count_);
  results_.push_back(0);
}

void PlayerListing::AddResult(const ResultView& result) {
  if (result.GameDate() != date_) return;
  const auto listed = places_.find(result.ID());
  if (listed == places_.end() || result.Opposition() != opposition_) return;
  for (const int place : listed->second) ++results_[static_cast<std::size_t>(place - 1)];
}

std::vector<std::string> PlayerListing::ToEnter() const {
  // Each result takes away the first line like its player's that still stands, so of players who
  // share a name as many go as there are results among them.
  std::unordered_map<std::string_view, int> to_go;
  for (int i = 1; i <= count_; ++i) to_go[names_[i]] += results_[static_cast<std::size_t>(i - 1)];
  std::vector<std::string> lines;
  for (int i = 1; i <= count_; ++i) {
    int& left = to_go[names_[i]];
    if (left > 0) {
      --left;
    } else {
      lines.push_back(names_[i]);
    }
  }
  return lines;
}

std::vector<std::string> PlayerListing::Entered() const {
  std::vector<std::string> lines;
  for (int i = 1; i <= count_; ++i) {
    const auto results = static_cast<std::size_t>(results_[static_cast<std::size_t>(i - 1)]);
    lines.insert(lines.end(), results, names_[i]);
  }
  return lines;
}

PlayerListing ReadPlayerListing(Session& session, Channels& channels, std::string_view opposition) {
  OpenFile(session, channels);
  PlayerListing listing(session.Team, session.Grade, opposition, session.WorkDate,
                        session.PlayerCount);
  channels.ForEachRecord(Channel::Players,
                         [&](Bytes bytes, int) { listing.AddPlayer(PlayerView(bytes)); });
  OpenResultSFile(session, channels);
  channels.ForEachRecord(Channel::Results,
                         [&](Bytes bytes, int) { listing.AddResult(ResultView(bytes)); });
  channels.CloseAll();
  return listing;
}

}  // namespace marlowbeck
