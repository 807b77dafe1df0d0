#pragma once

#include <span>
#include <string>
#include <string_view>
#include <vector>

#include <gtest/gtest.h>

#include "data/records.h"

namespace marlowbeck {

// Files of records as bytes, and what differs between two of them.

[[nodiscard]] std::vector<PlayerRecord> PlayersIn(std::string_view file);
[[nodiscard]] std::vector<ResultRecord> ResultsIn(std::string_view file);
[[nodiscard]] std::vector<LadderRecord> MatchesIn(std::string_view file);

[[nodiscard]] std::string FileOf(const std::vector<PlayerRecord>& players);
[[nodiscard]] std::string FileOf(const std::vector<ResultRecord>& results);
[[nodiscard]] std::string FileOf(const std::vector<LadderRecord>& matches);

/// A player as one is entered: `code` is the Best of Three code.
[[nodiscard]] PlayerRecord Player(int id, std::string_view surname, std::string_view first_name,
                                  std::string_view team, std::string_view grade, int code = 333);

/// Compares two files of records and names the fields that differ: "record 7, Peg3: 2, expected 3".
[[nodiscard]] ::testing::AssertionResult SamePlayers(std::string_view actual,
                                                     std::string_view expected);
[[nodiscard]] ::testing::AssertionResult SameResults(std::string_view actual,
                                                     std::string_view expected);
[[nodiscard]] ::testing::AssertionResult SameMatches(std::string_view actual,
                                                     std::string_view expected);

}  // namespace marlowbeck
