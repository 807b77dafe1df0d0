#include "support/sample.h"

namespace marlowbeck {
namespace {

/// The driver on the sample season.
class SampleSeason : public ClubTest {
 protected:
  SampleSeason() { LaySample(*this); }
};

TEST_F(SampleSeason, AMenuThatWasClickedOnTakesTheLettersOfItsEntries) {
  Do("click mnuHelp");
  Do("key Alt+H");
  EXPECT_EQ(Events(), Json::parse(R"([{"help": {"file": "qz1.HLP", "topic": 0}}])"));
}

TEST_F(SampleSeason, ScreensStandInTheSameOrderAfterAnErrorAndAMenu) {
  DoAll({"fault open 1 57", "click imgPlayers", "click mnuFile"});
  EXPECT_EQ(Front(), "frmDB");
}

TEST_F(SampleSeason, TheFocusStandsSomewhereAfterABoxThatWasBrokenOff) {
  DeleteFile("Winter_A Grade.qzs");
  Do("click imgPrinter");
  EXPECT_EQ(Try("click Image6")["ok"], false);
  EXPECT_NE(Focus(), "");
}

}  // namespace
}  // namespace marlowbeck
