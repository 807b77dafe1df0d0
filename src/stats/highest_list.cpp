#include "stats/highest_list.h"

#include <algorithm>
#include <utility>

#include "data/integer.h"
#include "data/numbers.h"
#include "data/runtime_error.h"
#include "stats/limits.h"
#include "stats/quoted_texts.h"
#include "stats/ranked_rows.h"

namespace marlowbeck {
namespace {

constexpr std::size_t kPegFields = 6;

std::int16_t HighestPeg(const ResultView& result) {
  std::int16_t highest = 0;
  for (std::size_t peg = 0; peg < kPegFields; ++peg) highest = std::max(highest, result.Peg(peg));
  return highest;
}

int PegCount(const ResultView& result) {
  int count = 0;
  for (std::size_t peg = 0; peg < kPegFields; ++peg) count += result.Peg(peg) > 0 ? 1 : 0;
  return count;
}

bool HasPointsAndShots(const ResultView& result) {
  return result.Aggregate() > 0 && result.Shots() > 0;
}

double ValueOfDate(HighestOf list, const ResultView& result) {
  switch (list) {
    case HighestOf::Averages:
      return AverageQuotientFirst(result.Aggregate(), result.Shots());
    case HighestOf::HighPegs:
      return HighestPeg(result);
    case HighestOf::HighScores:
      return result.HighScore();
    case HighestOf::Pegs:
      return PegCount(result);
    case HighestOf::Centuries:
      return result.Centuries();
    case HighestOf::Scores180:
      break;
  }
  return result.Scores180();
}

std::vector<HighestRow> ByValue(std::vector<HighestRow> rows) {
  return HighestFirst(std::move(rows), [](const HighestRow& row) { return row.value; });
}

void DropWithoutValue(std::vector<HighestRow>& rows) {
  std::erase_if(rows, [](const HighestRow& row) { return !(row.value > 0); });
}

}  // namespace

std::string_view HeadingOf(HighestOf list, ListSpan span) {
  switch (list) {
    case HighestOf::Averages:
      return "Avg";
    case HighestOf::HighPegs:
      return span == ListSpan::OneDate ? "Peg" : "Hi Peg";
    case HighestOf::HighScores:
      return "Score";
    case HighestOf::Pegs:
      return "Pegs";
    case HighestOf::Centuries:
      return "100's";
    case HighestOf::Scores180:
      break;
  }
  return "180's";
}

void HighestOfDate::AddResultOfDate(const ResultView& result) {
  if (!HasPointsAndShots(result)) return;
  if (rows_.size() == kReportPlaces) throw RunTimeError(ErrorNumber::SubscriptOutOfRange);
  const auto id = static_cast<std::size_t>(ids_.Add(result.ID()));
  if (id == waiting_.size()) waiting_.emplace_back();
  same_id_before_.push_back(std::exchange(waiting_[id].last, static_cast<int>(rows_.size())));
  HighestRow& row = rows_.emplace_back();
  row.id = result.ID();
  row.value = ValueOfDate(list_, result);
  if (row.value > 0) row.team = result.Team();
}

// KEPT: a player who is in the file no more stays in a list of one date, without a name, and drops
// out of the progressive one; a repair would leave the row out of both.
void HighestOfDate::AddPlayer(const PlayerView& player) {
  const int id = ids_.Find(player.ID());
  if (id == IdIndex::kNone) return;
  Waiting& waiting = waiting_[static_cast<std::size_t>(id)];
  if (std::exchange(waiting.named, true)) return;
  for (int row = waiting.last; row != kNone; row = same_id_before_[static_cast<std::size_t>(row)]) {
    HighestRow& waiter = rows_[static_cast<std::size_t>(row)];
    if (waiter.value > 0) waiter.name = player.FullName(", ");
  }
}

/// Those without a value are sorted too: how many there are has a say in where equal ones end up.
std::vector<HighestRow> HighestOfDate::TakeRows() {
  std::vector<HighestRow> rows = ByValue(std::exchange(rows_, {}));
  DropWithoutValue(rows);
  return rows;
}

// KEPT: the grade of a player is not looked at, so that one who has moved is still listed in the
// old grade, with the new team; a repair would list the players of the grade alone.
void HighestUpToDate::AddPlayer(const PlayerView& player) {
  if (players_.size() == kReportPlaces) throw RunTimeError(ErrorNumber::SubscriptOutOfRange);
  players_.push_back({player.ID(), player.FullName(", "), std::string(player.Team()), 0, 0});
  places_.push_back(ids_.Add(player.ID()));
  sums_.resize(static_cast<std::size_t>(ids_.Count()));
}

void HighestUpToDate::AddResult(const ResultView& result) {
  if (result.GameDate() > until_) return;
  const int place = ids_.Find(result.ID());
  if (place != IdIndex::kNone) Count(sums_[static_cast<std::size_t>(place)], result);
}

void HighestUpToDate::Count(Sums& sums, const ResultView& result) const {
  switch (list_) {
    case HighestOf::Averages:
      sums.agg += std::max<std::int64_t>(result.Aggregate(), 0);
      sums.shots += std::max<std::int64_t>(result.Shots(), 0);
      break;
    case HighestOf::HighPegs:
      sums.value = std::max<std::int64_t>(sums.value, HighestPeg(result));
      break;
    case HighestOf::HighScores:
      sums.value = std::max<std::int64_t>(sums.value, result.HighScore());
      break;
    case HighestOf::Pegs:
      sums.value += PegCount(result);
      break;
    case HighestOf::Centuries:
      sums.value += result.Centuries();
      break;
    case HighestOf::Scores180:
      sums.value += result.Scores180();
      break;
  }
  if (HasPointsAndShots(result)) ++sums.games;
}

double HighestUpToDate::ValueOf(const Sums& sums) const {
  if (list_ != HighestOf::Averages) return static_cast<double>(sums.value);
  if (sums.agg <= 0 || sums.shots <= 0) return 0;
  return AverageHundredfold(static_cast<double>(sums.agg), static_cast<double>(sums.shots));
}

std::vector<HighestRow> HighestUpToDate::Rows() const {
  std::vector<HighestRow> rows;
  for (std::size_t i = 0; i < players_.size(); ++i) {
    const Sums& sums = sums_[static_cast<std::size_t>(places_[i])];
    const double value = ValueOf(sums);
    if (!(value > 0)) continue;
    rows.push_back(players_[i]);
    rows.back().value = value;
    rows.back().games = sums.games;
  }
  return ByValue(std::move(rows));
}

void WriteHighest(SideFileWriter& writer, const std::vector<HighestRow>& rows) {
  for (const HighestRow& row : rows) {
    writer.Number(row.id).Text(row.name).Text(row.team).Number(row.value).Number(row.games);
    writer.EndLine();
  }
}

std::vector<HighestRow> ReadHighest(SideFileReader& reader, int count) {
  std::vector<HighestRow> rows;
  for (int i = 0; i < count; ++i) {
    HighestRow row;
    row.id = NarrowToLong(reader.Number());
    auto texts = ReadTextsSideBySide(reader, 2);
    row.name = std::move(texts[0]);
    row.team = std::move(texts[1]);
    row.value = reader.Number();
    row.games = NarrowToLong(reader.Number());
    rows.push_back(std::move(row));
  }
  return rows;
}

std::array<std::string, 5> HighestCells(int number, const HighestRow& row, HighestOf list) {
  return {NumberText(number), row.name, row.team,
          list == HighestOf::Averages ? TwoPlaces(row.value) : NumberText(row.value),
          NumberText(row.games)};
}

}  // namespace marlowbeck
