#include "ladder/clipboard_text.h"

#include <gtest/gtest.h>

namespace marlowbeck {
namespace {

TEST(LadderClipboard, IsTabbedTextLineByLine) {
  Session session;
  session.AssociationName = "Marlow Darts ";
  session.SeasonDescription = " Winter 2004 ";
  const LadderTab tab = {
      "A Grade",
      "A Grade    Wednesday, 17 March 2004 ",
      "not in it",
      {"Alpha", "Bravo"},
      {{"Alpha", "6", " def ", "Bravo", "5"}, {"Delta", "5", " drew ", "Cubs", "5"}},
      {{"Alpha", "1", "1", "0", "0", "6", "5", "120.00", "2", "0"},
       {"Bravo", "1", "0", "1", "0", "5", "6", "83.33", "1", "+1"}}};
  EXPECT_EQ(LadderClipboardText(session, Date{38063}, tab),
            "Marlow Darts \r\n"
            "Winter 2004\r\n"
            "A Grade    Wednesday, 17 March 2004\r\n"
            "Alpha\t6\t def \tBravo\t5\t\r\n"
            "Delta\t5\t drew \tCubs\t5\t\r\n"
            "PREMIERSHIP LADDER  -  up to  17/03/2004\r\n"
            "Team\tPlayed\tWon\tLost\tDraw\tFor\tAgainst\tPercent\tPoints\tAdjust\r\n"
            "Alpha\t1\t1\t0\t0\t6\t5\t120.00\t2\t0\t\r\n"
            "Bravo\t1\t0\t1\t0\t5\t6\t83.33\t1\t+1\t\r\n");
}

}  // namespace
}  // namespace marlowbeck
