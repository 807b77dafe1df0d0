#include "stats/progressive_details.h"

#include <algorithm>

#include "data/gap_sort.h"
#include "data/numbers.h"
#include "data/table.h"
#include "stats/limits.h"
#include "stats/weekly_results.h"

namespace marlowbeck {

void ProgressiveDetails::AddPlayer(const PlayerView& player) {
  if (player.Team() != team_ || player.Grade() != grade_) return;
  players_.emplace_back(player.FullName(", "), player.ID());
  if (ids_.Add(player.ID()) == static_cast<int>(sums_.size())) sums_.emplace_back();
}

void ProgressiveDetails::AddResult(const ResultView& result) {
  if (result.GameDate() > until_) return;
  const int place = ids_.Find(result.ID());
  if (place != IdIndex::kNone) Count(sums_[static_cast<std::size_t>(place)], result);
}

void ProgressiveDetails::Count(Sums& sums, const ResultView& result) {
  ProgressiveRow& totals = sums.totals;
  totals.agg += result.Aggregate();
  totals.shots += result.Shots();
  totals.hs = std::max(totals.hs, result.HighScore());
  totals.c180 += result.Scores180();
  totals.c100 += result.Centuries();
  CountPegs(totals, result);
  if (totals.agg > 0 && totals.shots > 0) {
    sums.average_agg = totals.agg;
    sums.average_shots = totals.shots;
  }
  ++totals.games;
  if (result.IsForfeit()) ++totals.forfeits;
}

void ProgressiveDetails::CountPegs(ProgressiveRow& totals, const ResultView& result) {
  for (std::size_t peg = 0; peg < 6; ++peg) {
    const std::int16_t value = result.Peg(peg);
    if (value > 0) ++totals.pegs;
    totals.hipeg = std::max(totals.hipeg, value);
  }
}

ProgressiveRow ProgressiveDetails::RowOf(const std::string& name, std::int32_t id) const {
  const Sums& sums = sums_[static_cast<std::size_t>(ids_.Find(id))];
  ProgressiveRow row = sums.totals;
  row.name = name;
  row.id = id;
  if (sums.average_shots > 0) {
    row.avg = AverageHundredfold(static_cast<double>(sums.average_agg),
                                 static_cast<double>(sums.average_shots));
  }
  return row;
}

std::vector<ProgressiveRow> ProgressiveDetails::Rows() const {
  const int count = static_cast<int>(players_.size());
  Table<ProgressiveRow> rows(1, kReportPlaces);
  for (int i = 1; i <= count; ++i) {
    const auto& [name, id] = players_[static_cast<std::size_t>(i - 1)];
    rows[i] = RowOf(name, id);
  }
  GapSort(
      count, [&](int j, int k) { return !(rows[j].avg < rows[k].avg); },
      [&](int j, int k) { rows.Swap(j, k); });
  std::vector<ProgressiveRow> sorted;
  for (int i = 1; i <= count; ++i) sorted.push_back(std::move(rows[i]));
  return sorted;
}

void WriteProgressive(SideFileWriter& writer, const std::vector<ProgressiveRow>& rows) {
  for (const ProgressiveRow& row : rows) {
    writer.Text(row.name);
    writer.Number(static_cast<double>(row.agg)).Number(static_cast<double>(row.shots));
    writer.Number(row.hs);
    writer.Number(static_cast<double>(row.c180)).Number(static_cast<double>(row.c100));
    writer.Number(row.pegs).Number(row.hipeg).Number(row.games).Number(row.avg).EndLine();
  }
}

std::array<std::string, 10> ProgressiveCells(const ProgressiveRow& row, Forfeits forfeits) {
  const int games = forfeits == Forfeits::LeftOut ? row.games - row.forfeits : row.games;
  return {row.name,
          NumberText(static_cast<double>(row.agg)),
          NumberText(static_cast<double>(row.shots)),
          FigureAboveZero(static_cast<double>(row.c180)),
          FigureAboveZero(static_cast<double>(row.c100)),
          FigureAboveZero(row.hs),
          FigureAboveZero(row.pegs),
          FigureAboveZero(row.hipeg),
          NumberText(games),
          row.avg > 0 ? TwoPlaces(row.avg) : std::string()};
}

}  // namespace marlowbeck
