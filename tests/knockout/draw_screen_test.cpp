// The draw on the screen, and as text.

#include <algorithm>
#include <set>

#include "knockout/knock_out.h"

namespace marlowbeck {
namespace {

class KnockOutDraw : public KnockOutTest {
 protected:
  void OpenMany(int count) {
    Lay(ManyPlayers(count));
    OpenSelection();
    Do("click cmdALL");
  }
  std::string Copied() {
    Do("click cmdClipBoard");
    const auto texts = EventsNamed("clipboard");
    EXPECT_EQ(texts.size(), 2U);
    EXPECT_EQ(texts.front(), "");
    return texts.back();
  }
};

TEST_F(KnockOutDraw, ChangesTheOrderAndNothingElse) {
  OpenFive();
  Do("click cmdALL");
  const TextList before = Players();
  std::set<TextList> orders;
  for (int press = 1; press <= 8; ++press) {
    Do("click cmdScramble");
    EXPECT_TRUE(Events().empty()) << "it asks and tells nothing";
    TextList after = Players();
    orders.insert(after);
    EXPECT_TRUE(std::is_permutation(after.begin(), after.end(), before.begin(), before.end()));
  }
  EXPECT_GT(orders.size(), 4U) << "every press begins another sequence";
  EXPECT_EQ(Counts(), (TextList{"0", "5", "5"}));
}

TEST_F(KnockOutDraw, NumbersStillCountAndEachPlayerKeepsTheGrade) {
  OpenFive();
  Do("click cmdALL");
  Do("click cmdScramble");
  const TextList players = Players();
  for (int row = 1; row <= 5; ++row) {
    const TextList cells = Row("grdKO", row);
    EXPECT_EQ(cells[0], std::to_string(row));
    const bool is_b = cells[1] == "Dean, Di" || cells[1] == "Ely, Bo";
    EXPECT_EQ(cells[2], is_b ? "B Grade" : "A Grade") << cells[1];
  }
}

TEST_F(KnockOutDraw, NobodyOrOneStaysAsItIs) {
  OpenFive();
  Do("click cmdScramble");
  EXPECT_TRUE(Players().empty());
  Select({"Moss, Cy : A Grade"});
  Do("click cmdScramble");
  EXPECT_EQ(Players(), (TextList{"Moss, Cy"}));
  EXPECT_EQ(Row("grdKO", 2), (TextList{"2", "", ""}));
}

TEST_F(KnockOutDraw, SixtyFourAreAllStillThere) {
  OpenMany(64);
  const TextList before = Players();
  Do("click cmdScramble");
  TextList after = Players();
  EXPECT_NE(after, before);
  EXPECT_TRUE(std::is_permutation(after.begin(), after.end(), before.begin(), before.end()));
}

TEST_F(KnockOutDraw, PlacesBehindAFreeOneAreNotDrawn) {
  OpenFive();
  WriteFile("Old.ko4", ListFile({"Moss, Cy", "Archer, Jo", "", "Young, Al"}, "A Grade"));
  DoAll({"file Old.ko4", "click cmdOpen"});
  for (int press = 1; press <= 5; ++press) Do("click cmdScramble");
  EXPECT_EQ(Players().size(), 2U);
  EXPECT_EQ(Row("grdKO", 3), (TextList{"3", "", ""}));
  EXPECT_EQ(Row("grdKO", 4), (TextList{"4", "Young, Al", "A Grade"}));
}

TEST_F(KnockOutDraw, ASavedDrawComesBackAsDrawn) {
  OpenMany(32);
  Do("click cmdScramble");
  const TextList drawn = Players();
  DoAll({"file Draw.ko4", "click cmdSaveKO", "click cmdReRun", "click cmdOK", "file Draw.ko4",
         "click cmdOpen"});
  EXPECT_EQ(Players(), drawn);
}

TEST_F(KnockOutDraw, TheTextHasTitleHeadsAndRows) {
  OpenFive();
  Select({"Moss, Cy : A Grade", "Dean, Di : B Grade"});
  EXPECT_EQ(Copied(),
            "KNOCK-OUT Competition    All Association Grades\r\nWednesday 31 March 2004    \r\n"
            "#\tPlayer\tGrade\t\r\n1\tMoss, Cy\tA Grade\t\r\n2\tDean, Di\tB Grade\t\r\n");
}

TEST_F(KnockOutDraw, TheTextOfASingleGradeHasAllThreeColumns) {
  OpenFive();
  TakeGrade("B Grade");
  Do("click cmdALL");
  EXPECT_EQ(Copied(),
            "KNOCK-OUT Competition    B Grade\r\nWednesday 31 March 2004    \r\n"
            "#\tPlayer\tGrade\t\r\n1\tDean, Di\tB Grade\t\r\n2\tEly, Bo\tB Grade\t\r\n");
}

TEST_F(KnockOutDraw, TheBoxOfTheCopyHasItsOwnWords) {
  // KEPT: no blanks pad the lines, as they do in the other boxes of a copy.
  OpenFive();
  Select({"Moss, Cy : A Grade", "Dean, Di : B Grade"});
  Do("click cmdClipBoard");
  ASSERT_EQ(Boxes().size(), 1U);
  EXPECT_EQ(Boxes()[0].style, 64);
  EXPECT_EQ(Boxes()[0].text,
            "KNOCK-OUT Competition : All Association Grades\rWednesday 31 March 2004    \r\r"
            "has been copied to the clipboard\rand can now be pasted as text into your\r"
            "favourite spreadsheet or wordprocessor.");
  EXPECT_EQ(Count("beep"), 0);
}

TEST_F(KnockOutDraw, SevenAreCopiedAsEightWithTheByeAndTheTableKeepsSeven) {
  OpenMany(7);
  const std::string text = Copied();
  EXPECT_TRUE(text.ends_with("7\tP7, X\tA Grade\t\r\n8\t--- bye ---\t\t\r\n")) << text;
  EXPECT_EQ(Players().size(), 7U);
  EXPECT_EQ(Row("grdKO", 8), (TextList{"8", "", ""}));
  EXPECT_EQ(Boxes().size(), 1U) << "without a question";
}

TEST_F(KnockOutDraw, SixtyThreeAreCopiedAsSixtyFour) {
  OpenMany(63);
  EXPECT_TRUE(Copied().ends_with("63\tP63, X\tA Grade\t\r\n64\t--- bye ---\t\t\r\n"));
}

TEST_F(KnockOutDraw, NobodyIsCopiedAsTheHeadsAlone) {
  OpenFive();
  EXPECT_TRUE(Copied().ends_with("    \r\n#\tPlayer\tGrade\t\r\n"));
}

TEST_F(KnockOutDraw, TheTextKnowsNeitherFontNorPage) {
  WriteFile("FontName.qz3", "24,\"MS Sans Serif\",#TRUE#,#TRUE#\r\n");
  OpenMany(64);
  DoAll({"printer width 500", "printer height 500"});
  const std::string text = Copied();
  EXPECT_EQ(std::count(text.begin(), text.end(), '\n'), 2 + 1 + 64);
}

}  // namespace
}  // namespace marlowbeck
