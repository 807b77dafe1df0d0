// What a season's nights become on the score sheets and from the weekly table.

#include <algorithm>
#include <set>

#include "data/text.h"
#include "support/season_model.h"

namespace marlowbeck {
namespace {

bool Stands(std::string_view field, std::string_view name) { return Trimmed(field) == name; }

bool IsOf(const ResultRecord& result, const TeamNight& at) {
  return result.GameDate == at.date && Stands(result.Team, at.team);
}

std::string NameOf(const PlayerRecord& player, std::string_view between) {
  return Trim(player.Surname) + std::string(between) + Trim(player.FirstName);
}

const PlayerRecord* WithId(const std::vector<PlayerRecord>& players, std::int32_t id) {
  const auto found =
      std::ranges::find_if(players, [&](const PlayerRecord& player) { return player.ID == id; });
  return found == players.end() ? nullptr : &*found;
}

constexpr std::string_view kOnSheets = ",  ";
constexpr std::string_view kInReports = ", ";

void Move(ResultRecord& result, const Figures& typed) {
  const auto narrow = [](int figure) { return static_cast<std::int16_t>(figure); };
  result.Aggregate = narrow(typed.aggregate);
  result.Shots = typed.shots;
  result.HighScore = narrow(typed.high_score);
  result.Centuries = narrow(typed.centuries);
  result.Scores180 = narrow(typed.scores_180);
  result.Legs = narrow(typed.legs);
}

}  // namespace

const std::vector<ResultRecord>& SeasonModel::ResultsOf(std::string_view grade) const {
  static const std::vector<ResultRecord> none;
  const auto found = results.find(UpperCase(grade));
  return found == results.end() ? none : found->second;
}

const PlayerRecord* SeasonModel::Listed(std::string_view grade, std::string_view team,
                                        std::string_view line, std::string_view between) const {
  for (const PlayerRecord& player : players) {
    if (Stands(player.Grade, grade) && Stands(player.Team, team) &&
        NameOf(player, between) == line) {
      return &player;
    }
  }
  return nullptr;
}

std::vector<std::string> SeasonModel::FreeTeams(const TeamNight& at) const {
  std::vector<std::string> free = Teams(at.grade);
  std::erase(free, at.team);
  for (const ResultRecord& result : ResultsOf(at.grade)) {
    if (result.GameDate != at.date) continue;
    std::erase(free, Trim(result.Team));
    std::erase(free, Trim(result.Opposition));
  }
  return free;
}

std::string SeasonModel::OppositionOn(const TeamNight& at) const {
  for (const ResultRecord& result : ResultsOf(at.grade)) {
    if (result.GameDate != at.date) continue;
    if (Stands(result.Team, at.team)) return Trim(result.Opposition);
    if (Stands(result.Opposition, at.team)) return Trim(result.Team);
  }
  const std::vector<std::string> free = FreeTeams(at);
  return free.empty() ? std::string() : free.front();
}

bool SeasonModel::CanSwap(const TeamNight& at) const {
  const TeamNight other{at.grade, OppositionOn(at), at.date};
  const bool has_entered = std::ranges::any_of(
      ResultsOf(at.grade), [&](const ResultRecord& result) { return IsOf(result, other); });
  return !FreeTeams(at).empty() && !has_entered;
}

SeasonModel::Boxes SeasonModel::SwapOpposition(const TeamNight& at, const std::string& to,
                                               bool sure) {
  const std::string from = OppositionOn(at);
  if (from == to) return {};
  if (sure) {
    for (ResultRecord& result : results[UpperCase(at.grade)]) {
      if (IsOf(result, at)) result.Opposition = FixedWidth(to, 30);
    }
  }
  return {"You are about to swap " + to + " for " + from + "\ras the opposition for " + at.team +
          " on " + ShortDate(at.date) + "\r\rDo you still want to make the change?"};
}

std::vector<std::string> SeasonModel::Entered(const TeamNight& at) const {
  const std::string opposition = OppositionOn(at);
  std::vector<std::string> lines;
  for (const PlayerRecord& player : players) {
    if (!Stands(player.Grade, at.grade) || !Stands(player.Team, at.team)) continue;
    for (const ResultRecord& result : ResultsOf(at.grade)) {
      if (result.ID == player.ID && result.GameDate == at.date &&
          Stands(result.Opposition, opposition)) {
        lines.push_back(NameOf(player, kOnSheets));
      }
    }
  }
  return lines;
}

std::optional<SeasonModel::Boxes> SeasonModel::DeleteResult(const TeamNight& at,
                                                            std::string_view line, bool sure) {
  const PlayerRecord* const player = Listed(at.grade, at.team, line, kOnSheets);
  const std::string opposition = OppositionOn(at);
  std::vector<ResultRecord>& all = results[UpperCase(at.grade)];
  const auto doomed = std::find_if(all.rbegin(), all.rend(), [&](const ResultRecord& result) {
    return result.ID == player->ID && IsOf(result, at) && Stands(result.Opposition, opposition);
  });
  if (doomed == all.rend()) return std::nullopt;
  if (sure) all.erase(std::next(doomed).base());
  return Boxes{"W A R N I N G !\rYou are about to Delete results from\r" + at.team +
               "\rrecorded on " + ShortDate(at.date) + "\r\rPlayer:  " + Trim(player->FirstName) +
               " " + Trim(player->Surname) + "\r\rAre you Sure ?"};
}

SeasonModel::Boxes SeasonModel::AddFromSheets(std::string_view grade_in_hand, const Edit& typed) {
  if (typed.surname.empty() || typed.first_name.empty()) {
    return {"Surname & First name\rmust be completed."};
  }
  const std::int32_t code = CodeOf(grade_in_hand);
  Add(typed.grade, typed.team, typed.surname, typed.first_name);
  players.back().BestOfThree = code;
  return {};
}

void SeasonModel::CloseSheets(std::string_view grade) {
  std::ranges::stable_sort(
      results[UpperCase(grade)],
      [](const ResultRecord& a, const ResultRecord& b) { return a.GameDate < b.GameDate; });
}

std::vector<Date> SeasonModel::Dates(std::string_view grade, std::string_view team) const {
  std::set<double> days;
  for (const ResultRecord& result : ResultsOf(grade)) {
    if (Stands(result.Team, team)) days.insert(result.GameDate.days);
  }
  std::vector<Date> dates;
  for (const double day : days) dates.push_back(Date{day});
  return dates;
}

std::vector<std::string> SeasonModel::Rows(const TeamNight& at) const {
  std::vector<std::string> rows;
  for (const ResultRecord& result : ResultsOf(at.grade)) {
    const PlayerRecord* const player = WithId(players, result.ID);
    if (!IsOf(result, at) || player == nullptr) continue;
    rows.push_back(NameOf(*player, kInReports) + (Stands(result.Forfeit, "F") ? " *" : ""));
  }
  return rows;
}

/// That of the last result, if its player is still there.
std::string SeasonModel::WeeklyOpposition(const TeamNight& at) const {
  std::string opposition;
  for (const ResultRecord& result : ResultsOf(at.grade)) {
    if (!IsOf(result, at)) continue;
    opposition = WithId(players, result.ID) == nullptr ? std::string() : Trim(result.Opposition);
  }
  return opposition;
}

bool SeasonModel::HasPegBox(const TeamNight& at, std::string_view row, std::size_t peg) const {
  const PlayerRecord* const player = Listed(at.grade, at.team, row, kInReports);
  const int code = player == nullptr ? 0 : player->BestOfThree;
  if (peg % 2 == 0 || code == 0) return true;
  const std::array<int, 3> digits = {code / 100, code / 10 % 10, code % 10};
  return digits[peg / 2] == 3;
}

SeasonModel::Boxes SeasonModel::CorrectScore(const TeamNight& at, std::string_view row,
                                             const Figures& typed) {
  if (typed.aggregate < 1 || typed.shots < 1) {
    return {"Must have AGGREGATE and SHOTS before saving !"};
  }
  if (typed.legs < 1) return {"You must enter Legs before saving !"};
  const PlayerRecord* const player = Listed(at.grade, at.team, row, kInReports);
  const std::string opposition = WeeklyOpposition(at);
  for (ResultRecord& result : results[UpperCase(at.grade)]) {
    if (player == nullptr || result.ID != player->ID || !IsOf(result, at) ||
        !Stands(result.Opposition, opposition)) {
      continue;
    }
    Move(result, typed);
    for (std::size_t peg = 0; peg < result.Pegs.size(); ++peg) {
      if (!HasPegBox(at, row, peg)) continue;
      result.Pegs[peg] = static_cast<std::int16_t>(typed.pegs[peg]);
    }
    return {};
  }
  return {"BAD RECORD NUMBER IN FILE    "};
}

SeasonModel::Boxes SeasonModel::ChangeDate(const TeamNight& at, Date to) {
  if (to == at.date) return {"No change of date was detected."};
  const std::string opposition = WeeklyOpposition(at);
  std::vector<ResultRecord>& all = results[UpperCase(at.grade)];
  for (const ResultRecord& result : all) {
    if (result.GameDate != to) continue;
    if (!Stands(result.Team, at.team) && !Stands(result.Opposition, at.team)) continue;
    return {at.team + " played " + opposition + " on " + ShortDate(to) +
            ".\rYou cannot make this change."};
  }
  for (ResultRecord& result : all) {
    if (result.GameDate != at.date) continue;
    const bool there = Stands(result.Team, at.team) && Stands(result.Opposition, opposition);
    const bool back = Stands(result.Team, opposition) && Stands(result.Opposition, at.team);
    if (there || back) result.GameDate = to;
  }
  return {};
}

}  // namespace marlowbeck
