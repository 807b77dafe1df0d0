#include "drive/workbench.h"

namespace marlowbeck {
namespace {

/// Every handler of the workbench tells that it was called.
class Acting : public WorkbenchTest {
 protected:
  Acting() {
    prepare = [](Workbench& bench) {
      for (Control* control : bench.Controls()) {
        if (control == &bench.lblPlain || control == &bench.fraPlain) continue;
        if (control == &bench.lblTold || control == &bench.prgBar) continue;
        const auto telling = [&bench, name = control->Name()](const char* what) {
          return [&bench, told = name + what] { bench.Tell(told); };
        };
        control->Click = telling(" clicked");
        control->DoubleClick = telling(" doubly");
        control->Change = telling(" changed");
        control->MouseMove = telling(" hovered");
      }
    };
  }
};

TEST_F(Acting, ClickReachesEveryKindThatHasOne) {
  for (const char* name : {"cmdDo", "fraClick", "lblClick", "imgShape", "mnuOpen"}) {
    EXPECT_EQ(ToldBy(std::string("click ") + name), std::string(name) + " clicked;");
  }
}

TEST_F(Acting, ClickOnAnEntryOrAGridBesideItsCellsIsToldToo) {
  for (const char* name : {"txtName", "txtLocked", "dtpDay", "grdTable"}) {
    EXPECT_EQ(ToldBy(std::string("click ") + name), std::string(name) + " clicked;");
    EXPECT_EQ(Focus(), std::string("frmBench.") + name);
    EXPECT_EQ(ToldBy(std::string("dblclick ") + name),
              std::string(name) + " clicked;" + name + " doubly;");
  }
}

TEST_F(Acting, ClickBesideTheLinesOnlyBringsTheFocus) {
  for (const char* name :
       {"lstOne", "lstMany", "cboLocked", "cboFree", "drvDrives", "dirFolders", "filFiles"}) {
    EXPECT_EQ(ToldBy(std::string("click ") + name), "");
    EXPECT_EQ(Focus(), std::string("frmBench.") + name);
    EXPECT_EQ(Index(name), -1);
  }
}

TEST_F(Acting, ClickBesideTheLinesFindsAPlaceInAListThatIsFull) {
  Change([](Workbench& bench) {
    for (int i = 0; i < 50; ++i) bench.lstOne.AddLine("line " + std::to_string(i));
    bench.grdTable.SetSize(60, 12);
  });
  EXPECT_EQ(ToldBy("click lstOne"), "");
  EXPECT_EQ(Focus(), "frmBench.lstOne");
  EXPECT_EQ(ToldBy("focus grdTable"), "");
  EXPECT_EQ(Focus(), "frmBench.grdTable");
  EXPECT_EQ(ToldBy("click grdTable"), "grdTable clicked;");
}

TEST_F(Acting, ClickTicksABoxAndChoosesAnOption) {
  EXPECT_EQ(ToldBy("click chkTick"), "chkTick clicked;");
  EXPECT_TRUE(Ticked("chkTick"));
  ToldBy("click chkTick");
  EXPECT_FALSE(Ticked("chkTick"));
  EXPECT_EQ(ToldBy("click optBoth(1)"), "optBoth(1) clicked;");
  EXPECT_TRUE(Ticked("optBoth(1)"));
  Do("click optBoth(0)");
  EXPECT_FALSE(Ticked("optBoth(1)"));
}

TEST_F(Acting, ClickIsRefusedWhereNobodyCouldClick) {
  EXPECT_EQ(Refused("click lblPlain"), "lblPlain has no click");
  EXPECT_EQ(Refused("click fraPlain"), "fraPlain has no click");
  Change([](Workbench& bench) { bench.cmdDo.Hide(); });
  EXPECT_EQ(Refused("click cmdDo"), "cmdDo is hidden");
  Change([](Workbench& bench) { bench.cmdOff.Disable(); });
  EXPECT_EQ(Refused("click cmdOff"), "cmdOff is disabled");
  Change([](Workbench& bench) { bench.fraPlain.Disable(); });
  EXPECT_EQ(Refused("click optBoth(1)"), "optBoth(1) is disabled");
  Change([](Workbench& bench) { bench.fraPlain.Hide(); });
  EXPECT_EQ(Refused("click optBoth(1)"), "optBoth(1) is hidden");
  Change([](Workbench& bench) { bench.SetEnabled(false); });
  EXPECT_EQ(Refused("click cmdHelp"), "cmdHelp is disabled");
}

TEST_F(Acting, DoubleClickComesAfterTheClickThatBelongsToIt) {
  EXPECT_EQ(ToldBy("dblclick imgShape"), "imgShape clicked;imgShape doubly;");
}

TEST_F(Acting, TypeReplacesTheTextBlanksIncluded) {
  EXPECT_EQ(ToldBy("type txtName  Jo  Archer "),
            "txtName changed;txtName changed;txtName changed;txtName changed;txtName changed;"
            "txtName changed;txtName changed;txtName changed;txtName changed;txtName changed;"
            "txtName changed;txtName changed;");
  EXPECT_EQ(Text("txtName"), " Jo  Archer ");
  Do("type txtName Jo");
  EXPECT_EQ(Text("txtName"), "Jo");
  EXPECT_EQ(Focus(), "frmBench.txtName");
}

TEST_F(Acting, TypeAloneEmptiesTheBox) {
  for (const char* line : {"type txtName", "type txtName "}) {
    Do("type txtName Jo");
    Do(line);
    EXPECT_EQ(Text("txtName"), "");
  }
}

TEST_F(Acting, TypeHasAQuestionMarkForALetterBeyondTheProgramsPage) {
  Do("type txtName \u0141\u00F3d\u017A");
  EXPECT_EQ(Text("txtName"), "?\u00F3d?");
}

TEST_F(Acting, PickTakesALineWhoseLettersBeyondTheProgramsPageWereTyped) {
  OnDo([](Workbench& bench) {
    const char* const as_kept =
        "?\xF3"
        "d?";
    bench.lstOne.AddLine(as_kept);
  });
  DoAll({"click cmdDo", "pick lstOne =\u0141\u00F3d\u017A"});
  const Json list = Get("lstOne");
  EXPECT_EQ(list["lines"][list["index"].get<std::size_t>()], "?\u00F3d?");
}

TEST_F(Acting, TypeTakesLettersOfTheProgramsPage) {
  Do("type txtName M\xC3\xBCller");
  EXPECT_EQ(Text("txtName"), "M\xC3\xBCller");
  OnDo([](Workbench& bench) {
    EXPECT_EQ(bench.txtName.Text(), "M\xFCller");
    bench.Tell("seen");
  });
  EXPECT_EQ(ToldBy("click cmdDo"), "seen;");
}

TEST_F(Acting, TypeIsRefusedForWhatNoKeyWrites) {
  Do("type txtName old");
  EXPECT_EQ(Refused("type txtName A\tB"),
            "type txtName: there is no key that writes character 9 into a box");
  EXPECT_EQ(Refused("type txtName A\rB"),
            "type txtName: there is no key that writes character 13 into a box");
  Refused("type txtName \x7F");
  Refused("type txtName \xC2\x81");  // a character of no page
  EXPECT_EQ(Text("txtName"), "old");
  Do("type txtName a\xC2\xA0\xC2\xAD\xE2\x82\xAC");  // hard blank, soft hyphen, euro
  EXPECT_EQ(Text("txtName"), "a\xC2\xA0\xC2\xAD\xE2\x82\xAC");
}

TEST_F(Acting, TypeIsRefusedOnWhatIsLocked) {
  EXPECT_EQ(Refused("type txtLocked x"), "txtLocked cannot be typed into");
  EXPECT_EQ(Refused("type cboLocked x"), "cboLocked cannot be typed into");
  EXPECT_EQ(Refused("type cmdDo x"), "cmdDo cannot be typed into");
  Do("type cboFree second");
  EXPECT_EQ(Text("cboFree"), "second");
  EXPECT_EQ(Index("cboFree"), 1);
}

TEST_F(Acting, PickClicksALineByItsNumberOrItsText) {
  for (const char* list : {"lstOne", "cboLocked"}) {
    EXPECT_EQ(ToldBy("pick " + std::string(list) + " 2"), std::string(list) + " clicked;");
    EXPECT_EQ(Index(list), 2);
    EXPECT_EQ(ToldBy("pick " + std::string(list) + " =second"), std::string(list) + " clicked;");
    EXPECT_EQ(Index(list), 1);
  }
}

TEST_F(Acting, PickOfTheCurrentLineIsAClickLikeAnyOther) {
  Do("pick lstOne 1");
  EXPECT_EQ(ToldBy("pick lstOne 1"), "lstOne clicked;");
}

TEST_F(Acting, PickByTextTakesTheFirstEqualLineBlanksIncluded) {
  Change([](Workbench& bench) {
    for (const char* line : {"a  b ", " =c", "a  b "}) bench.lstOne.AddLine(line);
  });
  Do("pick lstOne =a  b ");
  EXPECT_EQ(Index("lstOne"), 3);
  Do("pick lstOne = =c");
  EXPECT_EQ(Index("lstOne"), 4);
  EXPECT_EQ(Refused("pick lstOne =a  b"), "lstOne has no line \"a  b\"");
  EXPECT_EQ(Refused("pick lstOne =First"), "lstOne has no line \"First\"");
}

TEST_F(Acting, PickReachesEveryLineOfALongList) {
  Change([](Workbench& bench) {
    for (int i = 3; i < 60; ++i) {
      for (LineHolder* list :
           std::initializer_list<LineHolder*>{&bench.lstOne, &bench.cboLocked, &bench.cboFree}) {
        list->AddLine("line " + std::to_string(i));
      }
    }
  });
  for (const char* list : {"lstOne", "cboLocked", "cboFree"}) {
    for (const int line : {59, 0, 30, 30, 31, 1}) {
      EXPECT_EQ(ToldBy(std::string("pick ") + list + " " + std::to_string(line)),
                std::string(list) + " clicked;");
      EXPECT_EQ(Index(list), line);
    }
  }
}

TEST_F(Acting, PickOfALineThatLeavingTheBoxTakesAwayIsAClickBesideTheLines) {
  Change([](Workbench& bench) { bench.txtName.LostFocus = [&bench] { bench.cboLocked.Clear(); }; });
  Do("focus txtName");
  EXPECT_EQ(ToldBy("pick cboLocked 2"), "");
  EXPECT_EQ(Focus(), "frmBench.cboLocked");
}

TEST_F(Acting, PickIsRefusedForALineThatIsNotThere) {
  EXPECT_EQ(Refused("pick lstOne 3"), "lstOne has no such line");
  EXPECT_EQ(Refused("pick cmdDo 0"), "cmdDo has no lines");
  EXPECT_EQ(Refused("pick cmdDo =first"), "cmdDo has no lines");
}

TEST_F(Acting, SelectMarksJustTheseLines) {
  Do("select lstMany 0 2");
  EXPECT_EQ(Get("lstMany")["selected"], Json::parse("[0, 2]"));
  Do("select lstMany 1");
  EXPECT_EQ(Get("lstMany")["selected"], Json::parse("[1]"));
  Do("select lstMany");
  EXPECT_EQ(Get("lstMany")["selected"], Json::array());
}

TEST_F(Acting, SelectClicksOnEachLineOnce) {
  EXPECT_EQ(ToldBy("select lstMany 1 1"), "lstMany clicked;");
  EXPECT_EQ(ToldBy("select lstMany 2 0 2"), "lstMany clicked;lstMany clicked;");
  EXPECT_EQ(Index("lstMany"), 0);
  EXPECT_EQ(ToldBy("select lstMany"), "lstMany clicked;lstMany clicked;");
  EXPECT_EQ(ToldBy("select lstMany"), "");
}

TEST_F(Acting, SelectThatUnmarksNothingClicksOnNothing) {
  Do("focus cmdDo");
  Do("select lstMany");
  EXPECT_EQ(Focus(), "frmBench.cmdDo");
}

TEST_F(Acting, SelectEndsWhereAClickTakesTheListAway) {
  Change([](Workbench& bench) {
    bench.lstMany.Click = [&bench] {
      bench.Tell("clicked");
      bench.lstMany.Disable();
    };
  });
  EXPECT_EQ(ToldBy("select lstMany 0 1 2"), "clicked;");
  EXPECT_EQ(Get("lstMany")["selected"], Json::parse("[0]"));
}

TEST_F(Acting, SelectEndsWhereAClickTakesTheLinesAway) {
  Change([](Workbench& bench) { bench.lstMany.Click = [&bench] { bench.lstMany.Clear(); }; });
  Do("select lstMany 0 1 2");
  EXPECT_EQ(Lines("lstMany"), TextList{});
}

TEST_F(Acting, TheFocusMakesNoLineTheCurrentOne) {
  for (const char* list : {"lstOne", "lstMany", "drvDrives", "dirFolders", "filFiles"}) {
    Do(std::string("focus ") + list);
    EXPECT_EQ(Index(list), -1) << list;
  }
  Do("key Tab");
  Do("key Shift+Tab");
  EXPECT_EQ(Index("filFiles"), -1);
  Change([](Workbench& bench) {
    bench.filFiles.Clear();
    bench.filFiles.AddLine("anew");
  });
  EXPECT_EQ(Index("filFiles"), -1);
}

TEST_F(Acting, SelectIsRefusedWhereOneLineIsMarkedOrNoneIsThere) {
  EXPECT_EQ(Refused("select lstOne 0"), "lstOne marks one line only");
  EXPECT_EQ(Refused("select lstMany 0 3"), "lstMany has no such line");
}

TEST_F(Acting, DoublePickPicksFirst) {
  EXPECT_EQ(ToldBy("dblpick lstOne 1"), "lstOne clicked;lstOne doubly;");
  EXPECT_EQ(Index("lstOne"), 1);
}

TEST_F(Acting, CellClicksInAGridHeadingCountedIn) {
  EXPECT_EQ(ToldBy("cell grdTable 1 2"), "grdTable clicked;");
  EXPECT_EQ(Get("grdTable")["row"], 1);
  EXPECT_EQ(Get("grdTable")["col"], 2);
  EXPECT_EQ(ToldBy("dblcell grdTable 0 0"), "grdTable clicked;grdTable doubly;");
  EXPECT_EQ(Refused("cell grdTable 2 0"), "grdTable has no such cell");
  EXPECT_EQ(Refused("cell grdTable 0 3"), "grdTable has no such cell");
  EXPECT_EQ(Refused("cell lstOne 0 0"), "lstOne has no cells");
}

TEST_F(Acting, AnotherDateFiresChangeAndTheSameOneNothing) {
  EXPECT_EQ(ToldBy("date dtpDay 2004-04-07"), "dtpDay changed;");
  EXPECT_EQ(DateOf("dtpDay"), "2004-04-07");
  EXPECT_EQ(ToldBy("date dtpDay 2004-04-07"), "");
  EXPECT_EQ(Refused("date txtName 2004-04-07"), "txtName has no date");
}

TEST_F(Acting, AnyDayOfAnyYearCanBePicked) {
  for (const char* day : {"2004-02-29", "2004-03-01", "2004-08-01", "2003-12-31", "2005-05-31",
                          "0100-01-02", "9999-12-31", "1899-12-30", "2026-11-30"}) {
    EXPECT_EQ(ToldBy(std::string("date dtpDay ") + day), "dtpDay changed;") << day;
    EXPECT_EQ(DateOf("dtpDay"), day);
  }
}

TEST_F(Acting, KeysGoToTheControlWithTheFocus) {
  Do("focus txtName");
  Do("key Tab");
  EXPECT_EQ(Focus(), "frmBench.txtLocked");
  Do("key Shift+Tab");
  EXPECT_EQ(Focus(), "frmBench.txtName");
  Do("key Enter");  // in an entry box a Tab
  EXPECT_EQ(Focus(), "frmBench.txtLocked");
  Do("focus cmdDo");
  EXPECT_EQ(ToldBy("key Enter"), "cmdDo clicked;");
  EXPECT_EQ(ToldBy("key F1"), "cmdHelp clicked;");
  EXPECT_EQ(ToldBy("key Esc"), "cmdEnd clicked;");
  Do("pick lstOne 0");
  EXPECT_EQ(ToldBy("key Down"), "lstOne clicked;");
  EXPECT_EQ(Index("lstOne"), 1);
  Do("key Up");
  EXPECT_EQ(Index("lstOne"), 0);
}

TEST_F(Acting, AKeyComesUpInTheListThatHasTheFocusByThen) {
  Change([](Workbench& bench) {
    bench.lstOne.SetCaption("O&ne");
    bench.lstOne.KeyUp = [&bench] { bench.Tell("key up"); };
  });
  EXPECT_EQ(ToldBy("key Alt+N"), "key up;");
  EXPECT_EQ(ToldBy("key Down"), "lstOne clicked;key up;");
  EXPECT_EQ(ToldBy("key F1"), "cmdHelp clicked;key up;");
  EXPECT_EQ(ToldBy("key Alt+F"), "") << "it comes up in the menu";
  EXPECT_EQ(ToldBy("key Alt+O"), "mnuOpen clicked;key up;");
  const std::string before = Caption("lblTold");
  Refused("key Alt+Q");
  EXPECT_EQ(Caption("lblTold"), before);
  EXPECT_EQ(ToldBy("key Tab"), "");
}

TEST_F(Acting, MnemonicsGoByTheirLetter) {
  EXPECT_EQ(ToldBy("key Alt+D"), "cmdDo clicked;");
  EXPECT_EQ(ToldBy("key Alt+d"), "cmdDo clicked;");
  Do("key Alt+F");
  EXPECT_EQ(ToldBy("key Alt+O"), "mnuOpen clicked;");
  EXPECT_EQ(Refused("key Alt+Q"), "frmBench has no live mnemonic Q");
}

TEST_F(Acting, FocusAloneClicksOnNothing) {
  for (const char* name : {"txtName", "txtLocked", "cmdDo", "cmdEnd", "optBoth(0)", "optBoth(1)",
                           "chkTick", "imgShape", "lstOne", "lstMany", "cboLocked", "cboFree",
                           "grdTable", "dtpDay", "drvDrives", "dirFolders", "filFiles"}) {
    EXPECT_EQ(ToldBy(std::string("focus ") + name), "") << name;
    EXPECT_EQ(Focus(), std::string("frmBench.") + name);
  }
  EXPECT_FALSE(Ticked("chkTick"));
  EXPECT_FALSE(Ticked("optBoth(1)"));
}

TEST_F(Acting, FocusGoesWhereItIsTaken) {
  Do("focus cboFree");
  EXPECT_EQ(Focus(), "frmBench.cboFree");
  EXPECT_EQ(Refused("focus lblPlain"), "lblPlain takes no focus");
}

TEST_F(Acting, HoverReachesControlsAndTheBareScreen) {
  EXPECT_EQ(ToldBy("hover imgShape"), "imgShape hovered;");
  Do("hover frmBench");
  EXPECT_EQ(Refused("hover frmShelf"), "frmBench has no control frmShelf");
}

TEST_F(Acting, HoverIsRefusedWhereNobodyCouldAct) {
  Change([](Workbench& bench) {
    bench.imgShape.Disable();
    bench.cmdOff.Hide();
  });
  EXPECT_EQ(Refused("hover imgShape"), "imgShape is disabled");
  EXPECT_EQ(Refused("hover cmdOff"), "cmdOff is hidden");
}

TEST_F(Acting, HoverIsRefusedOverAScreenThatIsDisabled) {
  Change([](Workbench& bench) {
    bench.InScreens().Show("frmShelf");
    bench.SetEnabled(false);
  });
  EXPECT_EQ(Refused("hover frmBench"), "frmBench is disabled");
  Do("hover frmShelf");
}

TEST_F(Acting, HoverIsRefusedOverAScreenThatIsHidden) {
  Change([](Workbench& bench) {
    bench.InScreens().Show("frmShelf");
    bench.InScreens().Hide(bench);
  });
  EXPECT_EQ(Refused("hover frmBench"), "frmBench is hidden");
}

TEST_F(Acting, AMenuStaysDownUntilSomethingElseIsDone) {
  Do("click mnuFile");
  Refused("click lblPlain");
  Refused("pick lstOne 9");
  EXPECT_EQ(ToldBy("key Alt+O"), "mnuOpen clicked;");
  for (const char* line : {"hover imgShape", "hover frmBench", "click chkTick", "pick lstOne 0",
                           "key Tab", "focus cmdDo", "type txtName x"}) {
    Do("click mnuFile");
    Do(line);
    Refused("key Alt+O");
  }
}

TEST_F(Acting, CloseUsesTheWindowsButton) {
  Change([](Workbench& bench) { bench.InScreens().Show("frmShelf"); });
  Do("close frmShelf");
  EXPECT_FALSE(Loaded("frmShelf"));
  EXPECT_EQ(Refused("close frmShelf"), "there is no screen frmShelf now");
}

TEST_F(Acting, IsLostWhenTheControlLeftShowsABox) {
  Change([](Workbench& bench) { bench.txtName.LostFocus = [&bench] { bench.Box("Wait."); }; });
  for (const char* line : {"click cmdDo", "type cboFree x", "pick lstOne 1", "cell grdTable 1 1",
                           "date dtpDay 2004-04-07", "select lstMany 1", "dblclick imgShape"}) {
    Do("focus txtName");
    const std::string before = Caption("lblTold");
    const Json answer = Do(line);
    EXPECT_EQ(answer.value("lost", false), true) << line;
    EXPECT_EQ(Boxes().size(), 1U) << line;
    EXPECT_EQ(Caption("lblTold"), before) << line;
  }
}

TEST_F(Acting, IsLostWhenTheControlLeftCallsTheFocusBack) {
  Do("focus txtName");
  Change(
      [](Workbench& bench) { bench.txtName.LostFocus = [&bench] { bench.txtName.SetFocus(); }; });
  EXPECT_EQ(Do("click cmdDo")["lost"], true);
  EXPECT_EQ(Focus(), "frmBench.txtName");
  EXPECT_EQ(Caption("lblTold"), "");
}

TEST_F(Acting, ThatIsNotLostSaysNothingOfIt) { EXPECT_FALSE(Do("click cmdDo").contains("lost")); }

TEST_F(Acting, OnAScreenThatGoesWithTheClickIsSafe) {
  Change([](Workbench& bench) {
    auto* const shelf = static_cast<Shelf*>(bench.InScreens().Show("frmShelf"));
    shelf->cmdTake.Click = [shelf] { shelf->InScreens().Unload(*shelf); };
    shelf->cmdTake.DoubleClick = [&bench] { bench.Tell("too late"); };
  });
  EXPECT_EQ(ToldBy("dblclick cmdTake"), "");
  EXPECT_EQ(Front(), "frmBench");
}

}  // namespace
}  // namespace marlowbeck
