// FontName.qz3 with each file operation failing, cut and broken off in turn.

#include "stats/report_records.h"
#include "support/sweep.h"

namespace marlowbeck {
namespace {

const std::string kOld = "12,\"Liberation Serif\",#TRUE#,#FALSE#\r\n";
const std::string kNew = "14,\"Liberation Sans\",#FALSE#,#TRUE#\r\n";
const std::string kDefault = "10,\"MS Sans Serif\",#FALSE#,#FALSE#\r\n";

void OpenReports(Club& club) {
  club.WritePlayers("Winter.qza", {Person(1, "Archer", "Jo", "Rovers", "A")});
  club.WriteResults("Winter_A.qzr", {Night(1, "Rovers", "Hawks", 38063, 500, 20)});
  club.WriteFile("Winter_A.qzs", "\"Winter 2004\"\r\n");
  club.NameOpenFile("Winter.qza");
  club.WriteFile("FontName.qz3", kOld);
  club.DoAll({"click imgPrinter", "click Image6"});
}

SweptWork ChoosingAFont() {
  return {[](Club& club) { OpenReports(club); },
          {"font 14 0 1 Liberation Sans", "click lblFont"},
          [](Club& club) {
            const std::string kept = club.File("FontName.qz3");
            EXPECT_TRUE(kept == kOld || kept == kNew) << kept;
            // The next choice goes through.
            club.DoAll({"fault off", "forget"});
            if (club.Front() == "frmDB") club.DoAll({"click imgPrinter", "click Image6"});
            club.DoAll({"font 14 0 1 Liberation Sans", "click lblFont"});
            EXPECT_EQ(club.File("FontName.qz3"), kNew);
          }};
}

TEST(FontFaults, AChoiceThatCannotBeWrittenLeavesTheOldOrTheNew) {
  EXPECT_GT(SweepFailures(ChoosingAFont()), 3);
}

TEST(FontFaults, AChoiceCutShortLeavesTheOldOrTheNew) {
  EXPECT_GT(SweepCutWrites(ChoosingAFont()), 0);
}

TEST(FontFaults, AChoiceBrokenOffLeavesTheOldOrTheNew) {
  EXPECT_GT(SweepPowerCuts(ChoosingAFont()), 3);
}

SweptWork StartingWithoutAFont() {
  return {[](Club& club) {
            OpenReports(club);
            club.DoAll({"click cmdCancelWK", "click Image10"});
            club.DeleteFile("FontName.qz3");
          },
          {"click imgPrinter"},
          [](Club& club) {
            const bool there = club.HasFile("FontName.qz3");
            EXPECT_TRUE(!there || club.File("FontName.qz3") == kDefault);
            club.Do("fault off");
            if (club.Front() == "frmPMenu") {
              EXPECT_EQ(club.Caption("lblFont"), "MS Sans Serif");
              club.Do("click Image10");
            }
            club.Do("click imgPrinter");
            EXPECT_EQ(club.File("FontName.qz3"), kDefault);
            EXPECT_EQ(club.Caption("lblFont"), "MS Sans Serif");
          }};
}

TEST(FontFaults, ADefaultThatCannotBeWrittenIsWrittenTheNextTime) {
  EXPECT_GT(SweepFailures(StartingWithoutAFont()), 3);
}

TEST(FontFaults, ADefaultBrokenOffIsWrittenTheNextTime) {
  EXPECT_GT(SweepPowerCuts(StartingWithoutAFont()), 3);
}

}  // namespace
}  // namespace marlowbeck
