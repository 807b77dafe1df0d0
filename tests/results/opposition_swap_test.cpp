#include "results/opposition_swap.h"

#include <random>

#include "data/text.h"
#include "support/league.h"

namespace marlowbeck {
namespace {

const OppositionSwap kToCubs{March(31), "Hawks", "Cubs"};

TEST(OppositionSwap, ChangesTheTeamAndTheDateAlone) {
  std::vector<ResultRecord> results = {Night(11, "Hawks", "Lions", 24), Night(11, "Hawks", "Lions"),
                                       Night(21, "Lions", "Hawks"), Night(12, "Hawks", "Rovers"),
                                       Night(12, "hawks", "Rovers")};
  std::string file = FileOf(results);
  EXPECT_TRUE(SwapOpposition(file, kToCubs));
  results[1].Opposition = "Cubs";
  results[3].Opposition = "Cubs";
  EXPECT_TRUE(SameResults(file, FileOf(results)));
}

TEST(OppositionSwap, AnswersFalseWhereNothingIsToBeChanged) {
  const std::string file =
      FileOf(std::vector{Night(11, "Hawks", "Cubs"), Night(11, "Hawks", "Lions", 24)});
  std::string swapped = file;
  EXPECT_FALSE(SwapOpposition(swapped, kToCubs));
  EXPECT_EQ(swapped, file);
  std::string empty;
  EXPECT_FALSE(SwapOpposition(empty, kToCubs));
}

TEST(OppositionSwap, LeavesBytesBehindTheLastWholeRecord) {
  std::string file = FileOf(std::vector{Night(11, "Hawks", "Lions")}) +
                     FileOf(std::vector{Night(11, "Hawks", "Lions")}).substr(0, 147);
  const std::string rest = file.substr(kResultLength);
  EXPECT_TRUE(SwapOpposition(file, kToCubs));
  EXPECT_EQ(file.substr(kResultLength), rest);
}

TEST(OppositionSwap, LeavesEveryOtherByteOfAChangedRecord) {
  std::mt19937 chance(7);
  std::string before(kResultLength, ' ');
  for (char& byte : before) byte = static_cast<char>(chance());
  const std::string whole = FileOf(std::vector{Night(11, "Hawks", "Lions")});
  before.replace(4, 30, whole, 4, 30);  // the team
  before.replace(84, 8, whole, 84, 8);  // the date
  std::string after = before;
  EXPECT_TRUE(SwapOpposition(after, kToCubs));
  EXPECT_EQ(after.substr(34, 30), FixedWidth("Cubs", 30));
  EXPECT_TRUE(after.substr(0, 34) == before.substr(0, 34));
  EXPECT_TRUE(after.substr(64) == before.substr(64));
}

bool Taken(const ResultRecord& result) {
  const ResultBytes bytes = Encode(result);
  return IsTakenBy(ResultView(bytes), kToCubs);
}

TEST(OppositionSwap, IsTakenWhereTheOtherSideStandsAsOppositionOfTheDate) {
  EXPECT_TRUE(Taken(Night(1, "Rovers", "Cubs")));
  EXPECT_TRUE(Taken(Night(1, "Hawks", "Cubs")));
  EXPECT_FALSE(Taken(Night(1, "Rovers", "Cubs", 24)));
  EXPECT_FALSE(Taken(Night(1, "Rovers", "cubs")));
}

TEST(OppositionSwap, IsNotTakenWhereTheOtherSideStandsAsTeamAlone) {
  EXPECT_FALSE(Taken(Night(31, "Cubs", "Rovers")));
}

}  // namespace
}  // namespace marlowbeck
