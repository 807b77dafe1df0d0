#pragma once

#include <array>
#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

#include "data/id_index.h"
#include "data/records.h"
#include "data/side_file.h"

namespace marlowbeck {

/// How often a player finishes a game.
struct RatioRow {
  std::string name;  ///< "Surname,  First name"
  std::string team;
  std::int32_t legs = 0;
  std::int32_t pegs = 0;  ///< pegs made, not what they add up to

  friend bool operator==(const RatioRow&, const RatioRow&) = default;
};

/// Pegs against legs of the players of a grade, over the whole season. Handed every player record
/// in file order, then every result record of the grade.
class PegRatios {
 public:
  /// `grade` is trimmed.
  explicit PegRatios(std::string_view grade) : grade_(grade) {}

  /// Throws Overflow for an id outside 16 bits and SubscriptOutOfRange past 1000 players.
  void AddPlayer(const PlayerView& player);
  /// Forfeits count as any other result does.
  void AddResult(const ResultView& result);

  [[nodiscard]] int PlayerCount() const { return static_cast<int>(players_.size()); }
  /// Those with legs and pegs, in file order.
  [[nodiscard]] std::vector<RatioRow> Rows() const;

 private:
  struct Sums {
    std::int32_t legs = 0;
    std::int32_t pegs = 0;
  };

  std::string grade_;
  std::vector<RatioRow> players_;
  std::vector<std::size_t> places_;  ///< of each player, in sums_
  IdIndex ids_;
  std::vector<Sums> sums_;
};

/// The number of a result's pegs above 0.
[[nodiscard]] int PegsMade(const ResultView& result);

enum class RatioOrder { Alphabetical, HighToLow };

/// Names ascending by their bytes, or ratios descending; equal ones as the sorting pass leaves
/// them.
void SortRatios(std::vector<RatioRow>& rows, RatioOrder order);

/// A line a row: name, team, legs, pegs.
void WriteRatios(SideFileWriter& writer, const std::vector<RatioRow>& rows);

/// Pegs out of legs in hundred, with two places, halves away from zero: 5 of 20 are "25.00%".
[[nodiscard]] std::string RatioText(std::int32_t pegs, std::int32_t legs);

/// The cells of a row in the table, `number` being its place from 1.
[[nodiscard]] std::array<std::string, 6> RatioCells(int number, const RatioRow& row);

}  // namespace marlowbeck
