// The rules of the boxes where figures are put right from the weekly table: what differs from the
// score sheets, and that the rest does not.

#include "results/from_reports.h"

namespace marlowbeck {
namespace {

class EditScoreRules : public FromReports {
 protected:
  static ResultRecord Saved() {
    ResultRecord result = Night(11, "Hawks", "Lions");
    result.HighScore = 140;
    result.Pegs = {11, 0, 0, 0, 0, 0};
    return result;
  }
  void SetUp() override {
    FromReports::SetUp();
    Lay({Saved()});
    OpenWeekly();
    Do("dblcell grdWeek 1 0");
  }
  void ExpectUnchanged(Here here = Here::current()) {
    EXPECT_TRUE(SameResults(File(kAResults, here), FileOf(std::vector{Saved()})));
    EXPECT_EQ(Count("sound"), 0);
    EXPECT_EQ(Front(here), "frmEdScore");
  }
  ResultRecord Now() { return Results(kAResults).at(0); }
};

TEST_F(EditScoreRules, AnAggregateTooHighIsPutBackAlone) {
  TypeInto({{"txtHS", "120"}, {"txtLegs", "8"}, {"txtAgg", "7001"}});
  Do("key Enter");
  EXPECT_EQ(TheBox(), "Score is too high !");
  EXPECT_EQ(Text("txtAgg"), "950");
  EXPECT_EQ(Text("txtHS"), "120");
  EXPECT_EQ(Text("txtLegs"), "8");
  EXPECT_EQ(Text("txtAvg"), "");
  EXPECT_EQ(Focus(), "frmEdScore.txtAgg");
  Do("key Enter");
  EXPECT_EQ(Text("txtAvg"), "47.50");
  EXPECT_EQ(Focus(), "frmEdScore.txtShots");
}

TEST_F(EditScoreRules, AnAggregateOf7000IsNotTooHigh) {
  TypeInto({{"txtAgg", "7000"}, {"txtShots", "35"}});
  Do("click cmdSave");
  EXPECT_TRUE(Boxes().empty()) << "an average of exactly 200 is possible too";
  EXPECT_EQ(Now().Aggregate, 7000);
}

TEST_F(EditScoreRules, TheClickThatMetAnAggregateTooHighIsLost) {
  Do("type txtAgg 7001");
  EXPECT_EQ(Do("click cmdSave")["lost"], true);
  EXPECT_EQ(TheBox(), "Score is too high !");
  ExpectUnchanged();
}

TEST_F(EditScoreRules, AnAverageTooHighPutsTheSavedFiguresBack) {
  TypeInto({{"txtHS", "120"}, {"txtP1", "12"}, {"txtLegs", "8"}, {"txtAgg", "4001"}});
  Do("focus txtLegs");
  EXPECT_EQ(Text("txtAvg"), "200.05");
  Do("click cmdSave");
  EXPECT_EQ(TheBox(), "Some entries seem too high !");
  EXPECT_EQ(Text("txtAgg"), "950");
  EXPECT_EQ(Text("txtShots"), "20");
  EXPECT_EQ(Text("txtHS"), "140");
  EXPECT_EQ(Text("txtP1"), "11");
  EXPECT_EQ(Focus(), "frmEdScore.txtAgg");
  ExpectUnchanged();
}

TEST_F(EditScoreRules, RestoredFiguresStayWithoutLegsAndWithoutTwoPlaces) {
  TypeInto({{"txtLegs", "8"}, {"txtAgg", "4001"}});
  Do("focus txtLegs");
  Do("click cmdSave");
  EXPECT_EQ(Text("txtAvg"), "47.5");
  EXPECT_EQ(Text("txtLegs"), "8");
}

TEST_F(EditScoreRules, APegAbove170StaysSaved) {
  TypeInto({{"txtP1", "171"}, {"txtP3", "999"}});
  Do("focus txtLegs");
  EXPECT_TRUE(Boxes().empty());
  Do("click cmdSave");
  EXPECT_TRUE(Boxes().empty());
  EXPECT_EQ(Now().Pegs[0], 171);
  EXPECT_EQ(Now().Pegs[2], 999);
}

TEST_F(EditScoreRules, WithAllThreeEmptyTheCheckStaysPassed) {
  TypeInto({{"txtHS", ""}, {"txtCent", "2"}});
  Do("click cmdSave");
  EXPECT_EQ(TheBox(), "Highest score has not been entered.\rTotal Centuries will be set to zero.");
  EXPECT_EQ(Text("txtCent"), "");
  EXPECT_EQ(InSession("Flag"), 1);
  // All three are empty now. The score sheets would stop here without a word.
  Do("click cmdSave");
  EXPECT_EQ(Count("sound"), 1);
  EXPECT_EQ(Now().HighScore, 0);
  EXPECT_EQ(Now().Centuries, 0);
  EXPECT_EQ(InSession("Flag"), 0);
}

TEST_F(EditScoreRules, EveryOtherStepOfTheCheckIsThatOfTheScoreSheets) {
  struct Case {
    const char* high_score;
    const char* centuries;
    const char* scores_180;
    const char* words;
    const char* focus;
  };
  for (const Case& wrong : std::vector<Case>{
           {"181", "1", "", "Highest score cannot be more than 180!", "txtHS"},
           {"99", "1", "", "Highest score is less than 100.\rTotal Centuries will be set to zero.",
            "txtHS"},
           {"100", "", "", "Please enter Total Centuries scored!", "cmdSave"},
           {"180", "1", "", "Please enter number of 180's scored!", "txtHowMany180s"},
           {"180", "1", "2",
            "Number of Centuries MUST be EQUAL to\ror GREATER than the number of 180's.",
            "txtCent"}}) {
    // Centuries last, so that leaving the 180's finds nothing to say.
    TypeInto({{"txtHS", ""}, {"txtCent", ""}, {"txtHowMany180s", ""}});
    Do("focus txtLegs");
    DoAll({"type txtHS " + std::string(wrong.high_score)});
    Do("type txtCent " + std::string(wrong.centuries));
    if (*wrong.scores_180 != '\0') {
      Do("type txtHowMany180s " + std::string(wrong.scores_180));
      Do("key Enter");
    } else {
      Do("click cmdSave");
    }
    EXPECT_EQ(TheBox(), wrong.words);
    EXPECT_EQ(Focus(), std::string("frmEdScore.") + wrong.focus) << wrong.words;
    EXPECT_EQ(InSession("Flag"), 1) << wrong.words;
    ExpectUnchanged();
  }
}

TEST_F(EditScoreRules, The180sAskForTheHighestScoreAndTheSaveStops) {
  Do("type txtHowMany180s 1");
  Do("answer yes");
  Do("key Enter");
  EXPECT_EQ(TheBox(), "180's = 1. Do you want the Highest Score updated to 180 ?");
  EXPECT_EQ(Text("txtHS"), "180");
  EXPECT_EQ(Focus(), "frmEdScore.txtHowMany180s");
  EXPECT_EQ(InSession("Flag"), 1);
  Do("click cmdSave");
  EXPECT_EQ(Now().HighScore, 180);
  EXPECT_EQ(Now().Scores180, 1);
}

TEST_F(EditScoreRules, ANoToTheHighestScoreBlanksThe180s) {
  Do("type txtHowMany180s 1");
  Do("answer no");
  Do("key Enter");
  EXPECT_EQ(Text("txtHowMany180s"), "");
  EXPECT_EQ(Text("txtHS"), "140");
}

TEST_F(EditScoreRules, AggregateAndShotsAreNeeded) {
  for (const char* empty : {"txtAgg", "txtShots"}) {
    TypeInto({{"txtAgg", "950"}, {"txtShots", "20"}, {empty, "0.9"}});
    Do("click cmdSave");
    EXPECT_EQ(TheBox(), "Must have AGGREGATE and SHOTS before saving !");
    EXPECT_EQ(Focus(), "frmEdScore.txtAgg");
    ExpectUnchanged();
  }
}

TEST_F(EditScoreRules, LegsAreNeeded) {
  Do("type txtLegs none");
  Do("click cmdSave");
  EXPECT_EQ(TheBox(), "You must enter Legs before saving !");
  EXPECT_EQ(Text("txtLegs"), "");
  EXPECT_EQ(Focus(), "frmEdScore.txtLegs");
  ExpectUnchanged();
  Do("type txtLegs 4");
  Do("click cmdSave");
  EXPECT_EQ(Now().Legs, 4);
}

TEST_F(EditScoreRules, AFigureTooLargeForItsFieldIsAnOverflowAndWritesNothing) {
  Do("type txtCent 32768");
  Do("click cmdSave");
  EXPECT_EQ(Errors(), (std::vector<int>{6}));
  ExpectUnchanged();
  Do("type txtCent 32767");
  Do("click cmdSave");
  EXPECT_EQ(Now().Centuries, 32767);
}

TEST_F(EditScoreRules, TheAverageFollowsAggregateAndShotsCutToTwoPlaces) {
  TypeInto({{"txtAgg", "1000"}, {"txtShots", "21"}});
  Do("focus txtLegs");
  EXPECT_EQ(Text("txtAvg"), "47.61");
  Do("type txtShots 0");
  Do("focus txtLegs");
  EXPECT_EQ(Text("txtAvg"), "");
}

TEST_F(EditScoreRules, WithoutARecordFiguresTooHighStayAsTyped) {
  Do("click Command2");
  WriteResults(kAResults, {});
  Do("dblcell grdWeek 1 0");
  EXPECT_EQ(InSession("EditRecord"), 0);
  Do("type txtAgg 7001");
  Do("key Enter");
  EXPECT_EQ(BoxTexts(), (TextList{"Score is too high !"}));
  EXPECT_EQ(Text("txtAgg"), "7001");
  TypeInto({{"txtAgg", "4001"}, {"txtShots", "20"}});
  Do("focus txtLegs");
  Do("click cmdSave");
  EXPECT_EQ(BoxTexts(), (TextList{"Some entries seem too high !"}));
  EXPECT_EQ(Text("txtAgg"), "4001");
  EXPECT_EQ(Focus(), "frmEdScore.txtAgg");
}

}  // namespace
}  // namespace marlowbeck
