#include "season/peg_ratios.h"

#include <utility>

#include "data/gap_sort.h"
#include "data/integer.h"
#include "data/runtime_error.h"
#include "stats/limits.h"

namespace marlowbeck {
namespace {

constexpr std::size_t kPegFields = 6;

double RatioOf(const RatioRow& row) {
  return static_cast<double>(row.pegs) / static_cast<double>(row.legs);
}

template <typename InOrder>
void Sort(std::vector<RatioRow>& rows, InOrder in_order) {
  const auto at = [&](int place) -> RatioRow& { return rows[static_cast<std::size_t>(place - 1)]; };
  GapSort(
      static_cast<int>(rows.size()), [&](int j, int k) { return in_order(at(j), at(k)); },
      [&](int j, int k) { std::swap(at(j), at(k)); });
}

}  // namespace

int PegsMade(const ResultView& result) {
  int made = 0;
  for (std::size_t peg = 0; peg < kPegFields; ++peg) made += result.Peg(peg) > 0 ? 1 : 0;
  return made;
}

void PegRatios::AddPlayer(const PlayerView& player) {
  if (player.Grade() != grade_) return;
  if (PlayerCount() == kReportPlaces) throw RunTimeError(ErrorNumber::SubscriptOutOfRange);
  // KEPT: the ids are held in 16 bits, so that a grade with a player numbered above 32767 ends in
  // Overflow and has no ratios; a repair would hold them in 32.
  const Integer id = player.ID();
  players_.push_back({player.FullName(",  "), std::string(player.Team()), 0, 0});
  places_.push_back(static_cast<std::size_t>(ids_.Add(id)));
  sums_.resize(static_cast<std::size_t>(ids_.Count()));
}

void PegRatios::AddResult(const ResultView& result) {
  const int place = ids_.Find(result.ID());
  if (place == IdIndex::kNone) return;
  Sums& sums = sums_[static_cast<std::size_t>(place)];
  sums.legs += result.Legs();
  sums.pegs += PegsMade(result);
}

std::vector<RatioRow> PegRatios::Rows() const {
  std::vector<RatioRow> rows;
  for (std::size_t i = 0; i < players_.size(); ++i) {
    const Sums& sums = sums_[places_[i]];
    if (sums.legs <= 0 || sums.pegs <= 0) continue;
    rows.push_back({players_[i].name, players_[i].team, sums.legs, sums.pegs});
  }
  return rows;
}

void SortRatios(std::vector<RatioRow>& rows, RatioOrder order) {
  if (order == RatioOrder::Alphabetical) {
    Sort(rows, [](const RatioRow& a, const RatioRow& b) { return a.name <= b.name; });
  } else {
    Sort(rows, [](const RatioRow& a, const RatioRow& b) { return RatioOf(b) <= RatioOf(a); });
  }
}

void WriteRatios(SideFileWriter& writer, const std::vector<RatioRow>& rows) {
  for (const RatioRow& row : rows) {
    writer.Text(row.name).Text(row.team).Number(row.legs).Number(row.pegs).EndLine();
  }
}

std::string RatioText(std::int32_t pegs, std::int32_t legs) {
  const std::int64_t hundredths = (std::int64_t{pegs} * 20000 + legs) / (std::int64_t{legs} * 2);
  const std::string places = std::to_string(100 + hundredths % 100).substr(1);
  return std::to_string(hundredths / 100) + "." + places + "%";
}

std::array<std::string, 6> RatioCells(int number, const RatioRow& row) {
  return {std::to_string(number),
          row.name,
          row.team,
          std::to_string(row.legs),
          std::to_string(row.pegs),
          RatioText(row.pegs, row.legs)};
}

}  // namespace marlowbeck
