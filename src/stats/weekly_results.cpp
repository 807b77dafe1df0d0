#include "stats/weekly_results.h"

#include "data/gap_sort.h"
#include "data/numbers.h"
#include "data/table.h"
#include "stats/limits.h"

namespace marlowbeck {
namespace {

WeeklyRow RowOf(const ResultView& result) {
  WeeklyRow row;
  const bool forfeit = result.IsForfeit();
  // A forfeit has no average of its own; 1 over 1 puts it below all that were played.
  row.agg = forfeit ? std::int16_t{1} : result.Aggregate();
  row.shots = forfeit ? 1 : result.Shots();
  row.c180 = result.Scores180();
  row.c100 = result.Centuries();
  row.hs = result.HighScore();
  for (std::size_t peg = 0; peg < row.pegs.size(); ++peg) row.pegs[peg] = result.Peg(peg);
  return row;
}

/// Best average first. The averages are compared uncut, and equal ones stay as they are.
void SortByAverage(Table<WeeklyRow>& rows, int count) {
  const auto average = [&](int place) { return Divide(rows[place].agg, rows[place].shots); };
  GapSort(
      count, [&](int j, int k) { return !(average(k) > average(j)); },
      [&](int j, int k) { rows.Swap(j, k); });
}

std::int16_t ShortNumber(SideFileReader& reader) {
  return static_cast<std::int16_t>(int{Integer::Narrow(reader.Number())});
}

}  // namespace

void WeeklyResults::AddResult(const ResultView& result) {
  if (result.GameDate() != date_ || result.Team() != team_) return;
  nights_.push_back(
      {result.ID(), result.IsForfeit(), RowOf(result), std::string(result.Opposition())});
  if (ids_.Add(result.ID()) == static_cast<int>(names_.size())) names_.emplace_back();
}

void WeeklyResults::AddPlayer(const PlayerView& player) {
  const int place = ids_.Find(player.ID());
  if (place == IdIndex::kNone) return;
  auto& name = names_[static_cast<std::size_t>(place)];
  if (!name) name = player.FullName(", ");
}

const std::string* WeeklyResults::NameOf(std::int32_t id) const {
  const auto& name = names_[static_cast<std::size_t>(ids_.Find(id))];
  return name ? &*name : nullptr;
}

std::optional<std::string> WeeklyResults::Opposition() const {
  if (nights_.empty()) return std::nullopt;
  const Night& last = nights_.back();
  return NameOf(last.id) == nullptr ? std::string() : last.opposition;
}

std::vector<WeeklyRow> WeeklyResults::Rows() const {
  Table<WeeklyRow> rows(1, kReportPlaces);
  int count = 0;
  for (const Night& night : nights_) {
    const std::string* const name = NameOf(night.id);
    if (name == nullptr) continue;
    WeeklyRow& row = rows[++count];
    row = night.row;
    row.name = *name + (night.forfeit ? " *" : "");
  }
  SortByAverage(rows, count);
  std::vector<WeeklyRow> sorted;
  for (int i = 1; i <= count; ++i) sorted.push_back(std::move(rows[i]));
  return sorted;
}

void WriteWeekly(SideFileWriter& writer, const std::vector<WeeklyRow>& rows) {
  for (const WeeklyRow& row : rows) {
    writer.Text(row.name).Number(row.agg).Number(row.shots);
    writer.Number(row.c180).Number(row.c100).Number(row.hs).EndLine();
    for (const std::int16_t peg : row.pegs) writer.Number(peg);
    writer.EndLine();
  }
}

std::vector<WeeklyRow> ReadWeekly(SideFileReader& reader, int count) {
  std::vector<WeeklyRow> rows;
  for (int i = 0; i < count; ++i) {
    WeeklyRow row;
    row.name = reader.TextToLastQuote();
    row.agg = ShortNumber(reader);
    row.shots = NarrowToLong(reader.Number());
    row.c180 = ShortNumber(reader);
    row.c100 = ShortNumber(reader);
    row.hs = ShortNumber(reader);
    for (std::int16_t& peg : row.pegs) peg = ShortNumber(reader);
    rows.push_back(std::move(row));
  }
  return rows;
}

std::array<std::string, 10> WeeklyCells(const WeeklyRow& row) {
  // KEPT: a weekly row is known for a forfeit by the star at the end of its name, so that a player
  // whose own name ends with one shows as "Forfeit"; a repair would hand the mark over by itself.
  const bool forfeit = row.name.ends_with('*');
  const bool has_average = row.agg >= 2 && row.shots >= 2;
  return {row.name,
          forfeit ? "Forfeit" : NumberText(row.agg),
          forfeit ? "Win" : NumberText(row.shots),
          FigureAboveZero(row.c180),
          FigureAboveZero(row.c100),
          FigureAboveZero(row.hs),
          PegText(row.pegs[0], row.pegs[1]),
          PegText(row.pegs[2], row.pegs[3]),
          PegText(row.pegs[4], row.pegs[5]),
          has_average ? TwoPlaces(AverageQuotientFirst(row.agg, row.shots)) : std::string()};
}

std::string PegText(int first, int second) {
  if (first > 0 && second > 0) return NumberText(first) + ", " + NumberText(second);
  return FigureAboveZero(first > 0 ? first : second);
}

std::string FigureAboveZero(double figure) {
  return figure > 0 ? NumberText(figure) : std::string();
}

}  // namespace marlowbeck
