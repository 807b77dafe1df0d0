#include "knockout/entrants.h"

#include <gtest/gtest.h>

#include "data/expect_error.h"
#include "support/record_files.h"

namespace marlowbeck {
namespace {

void Add(Available& available, const PlayerRecord& player) {
  const PlayerBytes bytes = Encode(player);
  available.Add(PlayerView(bytes));
}

TEST(Entrants, ALineIsNameAndGrade) {
  EXPECT_EQ(LineOf({"Archer, Jo", "A Grade"}), "Archer, Jo : A Grade");
  EXPECT_EQ(LineOf({"Archer, Jo", ""}), "Archer, Jo : ");
}

TEST(Available, NamesAndGradesAreTrimmed) {
  Available available;
  const PlayerBytes bytes = Encode(Player(1, "  Archer ", " Jo ", "Rovers", " A Grade"));
  EXPECT_EQ(available.Add(PlayerView(bytes)), (Entrant{"Archer, Jo", "A Grade"}));
}

TEST(Available, TheFirstOfEqualLinesIsTakenForEither) {
  Available available;
  Add(available, Player(1, "Archer", "Jo : A", "Rovers", "B"));
  Add(available, Player(2, "Archer", "Jo", "Rovers", "A : B"));
  EXPECT_EQ(available.Behind("Archer, Jo : A : B"), (Entrant{"Archer, Jo : A", "B"}));
}

TEST(Available, AGradeMayHoldWhatPartsItFromTheName) {
  Available available;
  Add(available, Player(1, "Archer", "Jo", "Rovers", "A : B"));
  EXPECT_EQ(available.Behind("Archer, Jo : A : B"), (Entrant{"Archer, Jo", "A : B"}));
}

TEST(Available, ALineOfNobodyIsTakenApart) {
  const Available available;
  EXPECT_EQ(available.Behind("Gone, Al : C Grade"), (Entrant{"Gone, Al", "C Grade"}));
  EXPECT_EQ(available.Behind("Gone : Al : C"), (Entrant{"Gone : Al", "C"}));
  EXPECT_EQ(available.Behind("Gone, Al : "), (Entrant{"Gone, Al", ""}));
  EXPECT_EQ(available.Behind("Gone"), (Entrant{"Gone", ""}));
  EXPECT_EQ(available.Behind(""), (Entrant{"", ""}));
}

TEST(Available, AThousandPlayersHaveRoom) {
  Available available;
  for (int id = 1; id <= 1000; ++id) {
    Add(available, Player(id, "P" + std::to_string(id), "X", "T", "G"));
  }
  EXPECT_EQ(available.Behind("P1000, X : G"), (Entrant{"P1000, X", "G"}));
  EXPECT_ERROR(9, Add(available, Player(1001, "One", "More", "T", "G")));
  available.Clear();
  EXPECT_NO_THROW(Add(available, Player(1, "One", "More", "T", "G")));
}

}  // namespace
}  // namespace marlowbeck
