#pragma once

#include <array>
#include <cstdint>
#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

#include "data/integer.h"
#include "data/records.h"
#include "ladder/ladder_rules.h"

namespace marlowbeck {

/// A team's line of the ladder. All of it is 16-bit arithmetic that throws Overflow.
struct LadderRow {
  std::string Team;  ///< trimmed
  Integer Played;
  Integer Won;
  Integer Lost;
  Integer Draw;
  Integer For;      ///< games won in all matches
  Integer Against;  ///< games won by the opponents
  Integer Points;   ///< with what was adjusted
  Integer Percent;  ///< rounded to a whole number, halves to even: the sort key
  Integer Adjust;   ///< points given and taken
};

using LadderRows = std::vector<LadderRow>;

/// Works out the ladder of a grade up to a date: takes the matches in the order of their file, and
/// answers a row for each team. A team stands in the table for its players, so that a match's team
/// without any is passed over, and a bye's blank team is nobody.
class LadderTally {
 public:
  LadderTally(const std::vector<std::string>& teams, const LadderRules& rules, Date up_to);

  /// Counts a match, if it was played by then. Throws Overflow where a figure of a team leaves 16
  /// bits, its games For a hundredfold included.
  void Add(const LadderView& match);

  /// The teams in the order they were given in, not yet sorted.
  [[nodiscard]] LadderRows Rows() const;

 private:
  using NameWords = std::array<std::uint64_t, 4>;
  struct KnownName {
    NameWords words{};
    int row = kUnset;
  };
  struct Side {
    std::int16_t own = 0;
    std::int16_t other = 0;
    std::int16_t penalty = 0;
  };
  static constexpr int kNobody = -1;
  static constexpr int kUnset = -2;
  static constexpr unsigned kKnownNamesBits = 9;
  static constexpr std::size_t kNeighbours = 4;

  [[nodiscard]] static NameWords WordsOf(Bytes field);
  [[nodiscard]] static bool AreEqual(const NameWords& a, const NameWords& b);
  [[nodiscard]] static std::size_t PlaceOf(const NameWords& words);
  [[nodiscard]] int RowOf(Bytes field);
  int Learn(KnownName& known, const NameWords& words, Bytes field) const;
  [[nodiscard]] int RowNamed(std::string_view name) const;
  void Count(int row, const Side& side);

  /// A team's figures so far.
  struct Sums {
    int played = 0;
    int won = 0;
    int lost = 0;
    int games_for = 0;
    int against = 0;
    int adjust = 0;
  };
  [[nodiscard]] static int DrawsOf(const Sums& team) { return team.played - team.won - team.lost; }
  void CheckFigures(const Sums& team) const;
  [[nodiscard]] Integer PointsOf(const Sums& team) const;

  LadderRules rules_;
  int most_worth_;  ///< the most points that a match can move a team by
  Date up_to_;
  std::vector<std::string> names_;
  std::vector<Sums> sums_;
  std::unordered_map<std::string_view, int> by_name_;  ///< of names_
  /// Where names that were met already lead to, by their bytes: a match is looked up without a
  /// glance at its letters.
  std::vector<KnownName> known_;
};

/// For x 100 / Against, or / 1 while Against is below 1.
[[nodiscard]] double PercentOf(int games_for, int against);

/// The same with two places, halves away from zero: 94.12.
[[nodiscard]] std::string PercentText(int games_for, int against);

/// Points given stand with a plus sign: "+2", "0", "-1".
[[nodiscard]] std::string AdjustText(int adjust);

/// Puts the rows in the order of the ladder: by points, then by the rounded percentage, in two
/// passes of the gap sort. Teams level on both stay as the passes leave them.
void SortLadder(LadderRows& rows);

}  // namespace marlowbeck
