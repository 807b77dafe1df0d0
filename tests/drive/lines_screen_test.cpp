#include "drive/workbench.h"

namespace marlowbeck {
namespace {

using ScriptLine = WorkbenchTest;

TEST(ScriptLineReading, PassesOverEmptyLinesAndComments) {
  for (const char* line : {"", "\n", "\r\n", "#", "# click cmdDo", "\xEF\xBB\xBF"}) {
    EXPECT_EQ(ReadScriptLine(line), std::nullopt) << line;
  }
}

TEST(ScriptLineReading, TakesTheLineEndOffAndKeepsTheBlanks) {
  EXPECT_EQ(ReadScriptLine("type txtName Jo  \r\n"), "type txtName Jo  ");
  EXPECT_EQ(ReadScriptLine("screens"), "screens");
  EXPECT_EQ(ReadScriptLine(" # no comment"), " # no comment");
}

TEST(ScriptLineReading, TurnsUtf8IntoTheProgramsBytes) {
  EXPECT_EQ(ReadScriptLine("input M\xC3\xBCller \xE2\x82\xAC"), "input M\xFCller \x80");
  EXPECT_EQ(ReadScriptLine("pick C =\u0141"),
            "pick C =\x81"
            "000141");
}

TEST_F(ScriptLine, OfAnUnknownCommandIsRefusedByName) {
  EXPECT_EQ(Refused("cilck cmdDo"), "there is no command \"cilck\"");
  EXPECT_EQ(Refused("Click cmdDo"), "there is no command \"Click\"");
  EXPECT_EQ(Refused("   "), "there is no command \"\"");
}

TEST_F(ScriptLine, WithoutWhatItNeedsIsRefusedByName) {
  EXPECT_EQ(Refused("click"), "click: needs a control");
  EXPECT_EQ(Refused("pick lstOne"), "pick lstOne: needs a line");
  EXPECT_EQ(Refused("pick lstOne two"), "pick lstOne: needs a number for the line, not \"two\"");
  EXPECT_EQ(Refused("pick lstOne 1x"), "pick lstOne: needs a number for the line, not \"1x\"");
  EXPECT_EQ(Refused("cell grdTable 1"), "cell grdTable: needs the column");
  EXPECT_EQ(Refused("date dtpDay 31/03/2004"),
            "date dtpDay: needs a date as YYYY-MM-DD, not \"31/03/2004\"");
  EXPECT_EQ(Refused("date dtpDay 2004-02-30"),
            "date dtpDay: needs a date as YYYY-MM-DD, not \"2004-02-30\"");
  EXPECT_EQ(Refused("key Escape"), "key: there is no key Escape");
  EXPECT_EQ(Refused("file"), "file: needs a path");
  EXPECT_EQ(Refused("close"), "close: needs a screen");
}

TEST_F(ScriptLine, WithNumbersBelowThoseThatAreThereIsRefusedByTheControlsName) {
  EXPECT_EQ(Refused("pick LSTONE -1"), "pick lstOne: the line must be at least 0");
  EXPECT_EQ(Refused("select lstMany 0 -1"), "select lstMany: a line must be at least 0");
  EXPECT_EQ(Refused("select lstMany x"), "select lstMany: needs a number for a line, not \"x\"");
  EXPECT_EQ(Refused("cell grdTable -1 0"), "cell grdTable: the row must be at least 0");
  EXPECT_EQ(Refused("cell grdTable 0 -1"), "cell grdTable: the column must be at least 0");
  EXPECT_EQ(Refused("close frmBench now"), "close frmBench: has \"now\" more than it takes");
  EXPECT_EQ(Refused("hover txtName now"), "hover txtName: has \"now\" more than it takes");
}

TEST_F(ScriptLine, WithMoreThanItTakesIsRefused) {
  EXPECT_EQ(Refused("click cmdDo now"), "click cmdDo: has \"now\" more than it takes");
  EXPECT_EQ(Refused("screens all"), "screens: has \"all\" more than it takes");
  EXPECT_EQ(Refused("waiting 1"), "waiting: has \"1\" more than it takes");
  EXPECT_EQ(Refused("answer yes no"), "answer: has \"no\" more than it takes");
}

TEST_F(ScriptLine, ThatIsRefusedChangesNothingAndHasNoEvents) {
  const Json before = Do("state");
  for (const char* line : {"pick lstOne 3", "type txtLocked x", "click cmdGone", "date dtpDay x",
                           "cell grdTable 2 0", "select lstOne 0", "answer maybe"}) {
    const Json answer = Try(line);
    EXPECT_EQ(answer["ok"], false) << line;
    EXPECT_FALSE(answer.contains("events")) << line;
  }
  EXPECT_EQ(Do("state"), before);
  EXPECT_EQ(Do("waiting")["waiting"]["answer"], 0);
}

TEST_F(ScriptLine, NamesControlsWithoutRegardToCase) {
  EXPECT_EQ(Get("TXTNAME")["name"], "txtName");
  EXPECT_EQ(Get("FRMbench.OptBoth(1)")["name"], "optBoth(1)");
}

TEST_F(ScriptLine, ReachesAnotherScreenOnlyByItsName) {
  Change([](Workbench& bench) { bench.InScreens().Load("frmShelf"); });
  EXPECT_EQ(Refused("get cmdTake"), "frmBench has no control cmdTake");
  EXPECT_EQ(Get("frmShelf.cmdTake")["caption"], "Take");
  EXPECT_EQ(Refused("get frmAttic.cmdTake"), "frmAttic.cmdTake: its screen is not loaded");
  EXPECT_EQ(Refused("get frmBench.cmdTake"), "frmBench has no control cmdTake");
}

TEST_F(ScriptLine, WithABareNameIsRefusedWhenNoScreenIsInFront) {
  Change([](Workbench& bench) { bench.InScreens().HideQuietly(bench); });
  EXPECT_EQ(Refused("get txtName"), "txtName: no screen is in front");
  EXPECT_EQ(Refused("state"), "no screen is in front");
  EXPECT_EQ(Refused("key Enter"), "no screen is in front");
  EXPECT_EQ(Front(), "");
}

}  // namespace
}  // namespace marlowbeck
