#include "ladder/ladder_rows.h"

#include <algorithm>
#include <bit>
#include <cstdlib>
#include <cstring>
#include <utility>

#include "data/gap_sort.h"
#include "data/text.h"

namespace marlowbeck {
namespace {

/// Sorts by one test of the row in front against the one behind.
template <typename InOrder>
void SortRows(LadderRows& rows, InOrder in_order) {
  const auto at = [&](int place) -> LadderRow& {
    return rows[static_cast<std::size_t>(place - 1)];
  };
  GapSort(
      static_cast<int>(rows.size()), [&](int j, int k) { return in_order(at(j), at(k)); },
      [&](int j, int k) { std::swap(at(j), at(k)); });
}

constexpr int kSmallFor = 327;

std::uint64_t WordAt(Bytes field, std::size_t offset) {
  std::uint64_t word = 0;
  std::memcpy(&word, field.data() + offset, sizeof(word));
  return word;
}

}  // namespace

LadderTally::LadderTally(const std::vector<std::string>& teams, const LadderRules& rules,
                         Date up_to)
    : rules_(rules),
      most_worth_(std::max(
          {std::abs(rules.WinPoints), std::abs(rules.LossPoints), std::abs(rules.DrawPoints), 1})),
      up_to_(up_to),
      sums_(teams.size()),
      known_(std::size_t{1} << kKnownNamesBits) {
  for (const std::string& team : teams) names_.push_back(Trim(team));
  for (std::size_t i = 0; i < names_.size(); ++i) {
    if (!names_[i].empty()) by_name_.emplace(names_[i], static_cast<int>(i));
  }
}

int LadderTally::RowNamed(std::string_view name) const {
  const auto found = by_name_.find(name);
  return found == by_name_.end() ? kNobody : found->second;
}

/// The last two words overlap: together the four are all of the 30 bytes.
LadderTally::NameWords LadderTally::WordsOf(Bytes field) {
  return {WordAt(field, 0), WordAt(field, 8), WordAt(field, 16), WordAt(field, 22)};
}

bool LadderTally::AreEqual(const NameWords& a, const NameWords& b) {
  return ((a[0] ^ b[0]) | (a[1] ^ b[1]) | (a[2] ^ b[2]) | (a[3] ^ b[3])) == 0;
}

/// Any place will do, as long as names that differ in a few letters get different ones.
std::size_t LadderTally::PlaceOf(const NameWords& words) {
  constexpr std::uint64_t kMix = 0x9E3779B97F4A7C15;
  const std::uint64_t all =
      words[0] ^ std::rotl(words[1], 13) ^ std::rotl(words[2], 29) ^ std::rotl(words[3], 43);
  return (all * kMix) >> (64 - kKnownNamesBits);
}

int LadderTally::RowOf(Bytes field) {
  const NameWords words = WordsOf(field);
  const std::size_t first = PlaceOf(words);
  for (std::size_t step = 0; step < kNeighbours; ++step) {
    KnownName& known = known_[(first + step) & (known_.size() - 1)];
    if (AreEqual(known.words, words) && known.row != kUnset) return known.row;
    if (known.row == kUnset) return Learn(known, words, field);
  }
  return Learn(known_[first], words, field);
}

int LadderTally::Learn(KnownName& known, const NameWords& words, Bytes field) const {
  known = {words, RowNamed(Trimmed(ReadText(field, 0, field.size())))};
  return known.row;
}

inline void LadderTally::Count(int row, const Side& side) {
  if (row == kNobody) return;
  Sums& team = sums_[static_cast<std::size_t>(row)];
  ++team.played;
  team.won += static_cast<int>(side.own > side.other);
  team.lost += static_cast<int>(side.own < side.other);
  team.games_for += side.own;
  team.against += side.other;
  team.adjust += side.penalty;
  // While these are small nothing that is made of them can leave 16 bits.
  const bool small = std::int64_t{team.played} * most_worth_ + std::abs(team.adjust) <= INT16_MAX &&
                     std::abs(team.games_for) < kSmallFor && std::abs(team.against) <= INT16_MAX;
  if (!small) CheckFigures(team);
}

void LadderTally::Add(const LadderView& match) {
  if (!(match.GameDate() <= up_to_)) return;
  const std::int16_t home = match.HomeScore();
  const std::int16_t away = match.AwayScore();
  Count(RowOf(match.HomeField()), {home, away, match.HomePenalty()});
  Count(RowOf(match.AwayField()), {away, home, match.AwayPenalty()});
}

/// Every result on the way, in the order that it is formed in: whichever leaves 16 bits, it is the
/// same failure.
void LadderTally::CheckFigures(const Sums& team) const {
  static_cast<void>(Integer(team.played));
  static_cast<void>(Integer(team.against));
  static_cast<void>(Integer(team.adjust));
  static_cast<void>(PointsOf(team));
  // KEPT: a hundredfold of the games For has to find room in 16 bits, so that a team that passes
  // 327 ends in Overflow and the table is not shown; a repair would form it in doubles at once.
  static_cast<void>(Integer(Integer(team.games_for) * 100));
}

Integer LadderTally::PointsOf(const Sums& team) const {
  Integer points = Integer(team.won) * rules_.WinPoints;
  points += Integer(Integer(team.lost) * rules_.LossPoints);
  points += Integer(Integer(DrawsOf(team)) * rules_.DrawPoints);
  return points += team.adjust;
}

LadderRows LadderTally::Rows() const {
  LadderRows rows;
  rows.reserve(sums_.size());
  for (std::size_t i = 0; i < sums_.size(); ++i) {
    const Sums& team = sums_[i];
    rows.push_back({names_[i], team.played, team.won, team.lost, DrawsOf(team), team.games_for,
                    team.against, PointsOf(team),
                    Integer::Narrow(PercentOf(team.games_for, team.against)), team.adjust});
  }
  return rows;
}

double PercentOf(int games_for, int against) {
  const double hundredfold = games_for * 100.0;
  return against >= 1 ? hundredfold / against : hundredfold;
}

std::string PercentText(int games_for, int against) {
  const std::int64_t divisor = against >= 1 ? against : 1;
  const std::int64_t dividend = std::int64_t{games_for} * 10000;
  const std::int64_t size = dividend < 0 ? -dividend : dividend;
  const std::int64_t hundredths = (2 * size + divisor) / (2 * divisor);
  const std::string places = std::to_string(hundredths % 100);
  return (dividend < 0 && hundredths > 0 ? "-" : "") + std::to_string(hundredths / 100) + "." +
         std::string(2 - places.size(), '0') + places;
}

std::string AdjustText(int adjust) { return (adjust > 0 ? "+" : "") + std::to_string(adjust); }

void SortLadder(LadderRows& rows) {
  SortRows(rows, [](const LadderRow& a, const LadderRow& b) { return a.Points >= b.Points; });
  // KEPT: teams level on points and percentage stand as the two passes leave them, which need not
  // be by their names; a repair would order them by name.
  // KEPT: teams level on points are ordered by the percentage rounded to a whole number, so that
  // 94.4 and 93.6 tie; a repair would compare the percentages themselves.
  SortRows(rows, [](const LadderRow& a, const LadderRow& b) {
    return a.Points > b.Points || a.Percent >= b.Percent;
  });
}

}  // namespace marlowbeck
