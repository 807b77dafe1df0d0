#pragma once

#include <random>
#include <string>
#include <vector>

#include "stats/report_records.h"

namespace marlowbeck {

/// Makes small competitions in which everything that can go together does: ties, forfeits, players
/// gone and moved, doubled ids, blank names, figures at the ends of their range, dates out of
/// order.
class RandomCompetition {
 public:
  explicit RandomCompetition(unsigned seed) : engine_(seed) {}

  Competition Make() {
    Competition competition;
    const int players = Below(14);
    for (int i = 0; i < players; ++i) competition.players.push_back(MakePlayer());
    const int results = Below(60);
    for (int i = 0; i < results; ++i) competition.results.push_back(MakeResult());
    return competition;
  }

  /// The same players with results in several grades.
  std::vector<std::vector<ResultRecord>> MakeResultsOfGrades() {
    std::vector<std::vector<ResultRecord>> grades(static_cast<std::size_t>(1 + Below(3)));
    for (auto& results : grades) {
      const int count = Below(30);
      for (int i = 0; i < count; ++i) results.push_back(MakeResult());
    }
    return grades;
  }

  int Below(int end) { return std::uniform_int_distribution<int>(0, end - 1)(engine_); }
  std::string Team() { return OneOf({"Rovers", "Swifts", "", "rovers"}); }
  std::string Grade() { return OneOf({"A", "B"}); }
  double Day() { return 38063 + 7 * Below(4); }

 private:
  std::string OneOf(const std::vector<std::string>& words) {
    return words[static_cast<std::size_t>(Below(static_cast<int>(words.size())))];
  }

  PlayerRecord MakePlayer() {
    return Person(Below(10),
                  OneOf({"Archer", "Baker", "", "O\"Brien", "Day, Lee", " Low ", "Cox \"Ace\""}),
                  OneOf({"Jo", "", "A.*", "Al \"Ace\""}), Team(), Grade());
  }

  /// Mostly the figures of a night, so that averages meet; now and then the end of the range.
  std::int16_t Figure() {
    switch (Below(12)) {
      case 0:
        return 32767;
      case 1:
        return -32768;
      case 2:
        return 0;
      default:
        return static_cast<std::int16_t>(10 * (1 + Below(3)));
    }
  }

  ResultRecord MakeResult() {
    ResultRecord result = Night(Below(12), Team(), OneOf({"Hawks", "Swifts", ""}), Day(), Figure(),
                                Below(9) == 0 ? Figure() : 1 + Below(4));
    if (Below(6) == 0) result.Forfeit = OneOf({"F", " F", "f"});
    result.HighScore = Figure();
    result.Centuries = Figure();
    result.Scores180 = Figure();
    for (std::int16_t& peg : result.Pegs) peg = Below(2) == 0 ? Figure() : std::int16_t{0};
    return result;
  }

  std::mt19937 engine_;
};

}  // namespace marlowbeck
