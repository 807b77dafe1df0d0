#include "stats/combined_list.h"

#include <utility>

#include "data/integer.h"
#include "data/numbers.h"
#include "data/runtime_error.h"
#include "stats/limits.h"
#include "stats/quoted_texts.h"
#include "stats/ranked_rows.h"

namespace marlowbeck {

void CombinedAverages::AddPlayer(const PlayerView& player) {
  if (players_.size() == kReportPlaces) throw RunTimeError(ErrorNumber::SubscriptOutOfRange);
  players_.push_back({player.ID(), player.FullName(", "), std::string(player.Team()),
                      std::string(player.Grade()), 0, 0});
  places_.push_back(ids_.Add(player.ID()));
  sums_.resize(static_cast<std::size_t>(ids_.Count()));
}

void CombinedAverages::AddResult(const ResultView& result) {
  if (result.GameDate() > until_) return;
  const int place = ids_.Find(result.ID());
  if (place == IdIndex::kNone) return;
  Sums& sums = sums_[static_cast<std::size_t>(place)];
  const std::int16_t agg = result.Aggregate();
  const std::int32_t shots = result.Shots();
  if (agg > 0) sums.agg += agg;
  if (shots > 0) sums.shots += shots;
  if (agg > 0 && shots > 0) ++sums.games;
}

void CombinedAverages::EndGrade() {
  for (Sums& sums : sums_) {
    // KEPT: a player with results in several grades has the average of the last of them, beside the
    // games of all; a repair would add points and shots up over the grades.
    if (sums.agg > 0 && sums.shots > 0) {
      sums.avg = AverageHundredfold(static_cast<double>(sums.agg), static_cast<double>(sums.shots));
    }
    sums.agg = 0;
    sums.shots = 0;
  }
}

std::vector<CombinedRow> CombinedAverages::Rows() const {
  std::vector<CombinedRow> rows;
  for (std::size_t i = players_.size(); i-- > 0;) {
    const Sums& sums = sums_[static_cast<std::size_t>(places_[i])];
    if (!(sums.avg > 0)) continue;
    rows.push_back(players_[i]);
    rows.back().avg = sums.avg;
    rows.back().games = sums.games;
  }
  return rows;
}

std::vector<CombinedRow> Ordered(std::vector<CombinedRow> rows, CombinedOrder order) {
  rows = order == CombinedOrder::ByAverage
             ? HighestFirst(std::move(rows), [](const CombinedRow& row) { return row.avg; })
             : AToZ(std::move(rows));
  std::erase_if(rows, [](const CombinedRow& row) { return !(row.avg > 0); });
  return rows;
}

void WriteCombined(SideFileWriter& writer, const std::vector<CombinedRow>& rows) {
  for (const CombinedRow& row : rows) {
    writer.Number(row.id).Text(row.name).Text(row.team).Text(row.grade);
    writer.Number(row.avg).Number(row.games).EndLine();
  }
}

std::vector<CombinedRow> ReadCombined(SideFileReader& reader, int count) {
  std::vector<CombinedRow> rows;
  for (int i = 0; i < count; ++i) {
    CombinedRow row;
    row.id = NarrowToLong(reader.Number());
    auto texts = ReadTextsSideBySide(reader, 3);
    row.name = std::move(texts[0]);
    row.team = std::move(texts[1]);
    row.grade = std::move(texts[2]);
    row.avg = reader.Number();
    row.games = NarrowToLong(reader.Number());
    rows.push_back(std::move(row));
  }
  return rows;
}

std::array<std::string, 6> CombinedCells(int number, const CombinedRow& row) {
  return {NumberText(number),    row.name,          row.team, row.grade,
          NumberText(row.games), TwoPlaces(row.avg)};
}

}  // namespace marlowbeck
