// Hundreds of corrections on a made-up competition, worked on the screens and told to a plain
// model: every box, and after each hundred every file, is as the model says, through a new start
// too.

#include "support/random_corrections.h"

namespace marlowbeck {
namespace {

constexpr int kRounds = 6;
constexpr int kCorrectionsInARound = 100;
constexpr const char* kBase = "Winter";

TEST_F(RandomCorrections, EveryFileIsAsAPlainModelSays) {
  MakeCompetition();
  WriteFile("WkDate.qz3", "#2004-03-31#\r\n");
  model.Lay(*this, kBase);
  for (int round = 0; round < kRounds && !HasFailure(); ++round) {
    for (int i = 0; i < kCorrectionsInARound && !HasFailure(); ++i) CorrectAnything();
    LeaveTheScreens();
    model.ExpectFiles(*this, kBase);
    Restart();
  }
}

}  // namespace
}  // namespace marlowbeck
