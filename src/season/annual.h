#pragma once

#include <array>
#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

#include "data/records.h"
#include "data/side_file.h"

namespace marlowbeck {

/// One night of a player. An aggregate or shots of 0 stand for none.
struct AnnualGame {
  Date date;
  std::string opposition;  ///< as the record holds it, padding included
  std::int16_t aggregate = 0;
  std::int32_t shots = 0;
  std::int16_t high_score = 0;
  std::int16_t scores_180 = 0;
  std::int16_t centuries = 0;
  std::array<std::int16_t, 6> pegs{};

  /// With neither aggregate nor shots a night counts as a forfeit, whatever its mark.
  [[nodiscard]] bool IsForfeit() const { return aggregate == 0 && shots == 0; }
};

/// What a player's nights add up to. Pegs are counted, not added up.
struct AnnualTotals {
  std::int64_t aggregate = 0;
  std::int64_t shots = 0;
  std::int16_t high_score = 0;
  std::int64_t scores_180 = 0;
  std::int64_t centuries = 0;
  std::array<std::int32_t, 3> pegs_by_game{};
  std::int32_t pegs = 0;
  std::int16_t high_peg = 0;
};

/// One player's season in a grade, fed with the player's results in file order.
class AnnualReport {
 public:
  /// Throws SubscriptOutOfRange past 5000 games.
  void Add(const ResultView& result);

  [[nodiscard]] const std::vector<AnnualGame>& Games() const { return games_; }
  [[nodiscard]] const AnnualTotals& Totals() const { return totals_; }

 private:
  void Count(const AnnualGame& game);

  std::vector<AnnualGame> games_;
  AnnualTotals totals_;
};

/// The work file: the name, three lines for each game, the totals. What a game lacks of aggregate
/// and shots is an empty item.
void WriteAnnual(SideFileWriter& writer, std::string_view name, const AnnualReport& report);

/// The cells of a game: date, against, aggregate, shots, 180s, 100s, high score, the pegs of the
/// three games, average.
[[nodiscard]] std::array<std::string, 11> AnnualCells(const AnnualGame& game);

/// Whether a row of those stands for a forfeit: the star behind the opposition.
[[nodiscard]] bool IsForfeitRow(const std::array<std::string, 11>& cells);

/// The cells of the totals, `games` being the number of games that counts.
[[nodiscard]] std::array<std::string, 12> TotalsCells(const AnnualTotals& totals, int games);

}  // namespace marlowbeck
