#include "drive/workbench.h"

namespace marlowbeck {
namespace {

using Looking = WorkbenchTest;

TEST_F(Looking, ScreensListsWhatIsLoadedWithTheFrontAndTheFocus) {
  Change([](Workbench& bench) { bench.InScreens().Load("frmShelf"); });
  EXPECT_EQ(Do("screens"), Json::parse(R"({"ok": true,
    "screens": [
      {"name": "frmShelf", "title": "Shelf", "visible": false, "enabled": true},
      {"name": "frmDB", "title": "Door", "visible": false, "enabled": true},
      {"name": "frmBench", "title": "Workbench", "visible": true, "enabled": true}],
    "front": "frmBench", "focus": "frmBench.txtName"})"));
}

TEST_F(Looking, ScreensSaysNullWhereNothingIsInFront) {
  Change([](Workbench& bench) { bench.InScreens().HideQuietly(bench); });
  const Json answer = Do("screens");
  EXPECT_TRUE(answer["front"].is_null());
  EXPECT_TRUE(answer["focus"].is_null());
}

/// A control and its whole state but for the fields that all kinds have.
struct KindState {
  const char* control;
  const char* kind;
  const char* fields;
};

class StateOfKind : public WorkbenchTest, public ::testing::WithParamInterface<KindState> {};

TEST_P(StateOfKind, HasTheFieldsOfTheKindAndNoOther) {
  for (const char* file : {"a/x", "B/y", "c.txt", "D"}) WriteFile(file, "");
  Json expected = {{"name", GetParam().control},
                   {"kind", GetParam().kind},
                   {"visible", true},
                   {"shown", true},
                   {"enabled", true}};
  expected.update(Json::parse(GetParam().fields));
  if (expected.contains("path")) expected["path"] = Folder().string();
  EXPECT_EQ(Get(GetParam().control), expected);
}

INSTANTIATE_TEST_SUITE_P(
    Of, StateOfKind,
    ::testing::Values(
        KindState{"cmdDo", "command", R"({"caption": "&Do it"})"},
        KindState{"lblPlain", "label", R"({"caption": "plain"})"},
        KindState{"fraPlain", "panel", R"({"caption": "A panel"})"},
        KindState{"imgShape", "picture", R"({"caption": "Shape"})"},
        KindState{"mnuOpen", "menu", R"({"caption": "&Open"})"},
        KindState{"txtLocked", "text", R"({"text": "as it is", "locked": true})"},
        KindState{"chkTick", "check", R"({"caption": "Tick", "value": false})"},
        KindState{"optBoth(1)", "option", R"({"caption": "Both", "value": false})"},
        KindState{"lstOne", "list", R"({"lines": ["first", "second", "third"], "index": -1})"},
        KindState{"lstMany", "list",
                  R"({"lines": ["first", "second", "third"], "index": -1, "selected": []})"},
        KindState{"dirFolders", "folders",
                  R"({"lines": ["..", "a", "B"], "index": -1, "path": "{folder}"})"},
        KindState{"filFiles", "files",
                  R"({"lines": ["c.txt", "D"], "index": -1, "selected": [], "path": "{folder}"})"},
        KindState{"cboFree", "combo",
                  R"({"text": "", "lines": ["first", "second", "third"], "index": -1,
                      "locked": false})"},
        KindState{"cboLocked", "combo",
                  R"({"text": "", "lines": ["first", "second", "third"], "index": -1,
                      "locked": true})"},
        KindState{"grdTable", "grid",
                  R"({"rows": 2, "cols": 3, "cells": [["Name", "", ""], ["", "", "17.89"]],
                      "row": 0, "col": 0})"},
        KindState{"dtpDay", "date", R"({"value": "2004-03-31"})"},
        KindState{"prgBar", "progress", R"({"min": 0, "max": 40, "value": 10})"}),
    [](const auto& with) {
      std::string name = with.param.control;
      std::erase_if(name, [](char c) { return c == '(' || c == ')'; });
      return name;
    });

TEST_F(Looking, StateOfDrivesHasTheMountPoints) {
  const Json state = Get("drvDrives");
  EXPECT_EQ(state["kind"], "drives");
  EXPECT_EQ(state["lines"][0], "/");
  EXPECT_EQ(state["index"], -1);
  EXPECT_FALSE(state.contains("path"));
  EXPECT_FALSE(state.contains("selected"));
}

TEST_F(Looking, StateTellsOwnVisibilityFromBeingShown) {
  Change([](Workbench& bench) { bench.fraPlain.Hide(); });
  EXPECT_EQ(Get("optBoth(1)")["visible"], true);
  EXPECT_EQ(Get("optBoth(1)")["shown"], false);
  Change([](Workbench& bench) {
    bench.fraPlain.Show();
    bench.fraPlain.Disable();
  });
  EXPECT_EQ(Get("optBoth(1)")["shown"], true);
  EXPECT_EQ(Get("optBoth(1)")["enabled"], false);
}

TEST_F(Looking, StateHasAColourOnlyWhereItMeansSomething) {
  EXPECT_FALSE(Get("lblPlain").contains("color"));
  const std::pair<Meaning, const char*> colours[] = {
      {Meaning::Red, "red"}, {Meaning::Green, "green"}, {Meaning::Black, "black"}};
  for (const auto& [meaning, word] : colours) {
    Change([meaning = meaning](Workbench& bench) { bench.lblPlain.SetMeaning(meaning); });
    EXPECT_EQ(Get("lblPlain")["color"], word);
  }
}

TEST_F(Looking, StateKeepsALineBreakAsOneReturn) {
  Change([](Workbench& bench) { bench.lblPlain.SetCaption(marlowbeck::Lines({"one", "two"})); });
  EXPECT_EQ(Caption("lblPlain"), "one\rtwo");
}

TEST_F(Looking, StateOfADateThatNoCalendarHasIsNull) {
  Change([](Workbench& bench) { bench.dtpDay.SetValue(Date{1e300}); });
  EXPECT_TRUE(Get("dtpDay")["value"].is_null());
}

TEST_F(Looking, StateOfALockedComboWhoseTextHasGoneHasNoLine) {
  for (const int line : {-1, 1}) {
    Change([line](Workbench& bench) {
      bench.cboLocked.SetText("none of the lines");
      bench.cboLocked.SetIndex(line);
    });
    EXPECT_EQ(Get("cboLocked")["index"], line);
    Change([](Workbench& bench) { bench.cboLocked.SetText(""); });
    EXPECT_EQ(Text("cboLocked"), "");
    EXPECT_EQ(Get("cboLocked")["index"], -1);
    EXPECT_EQ(Get("cboLocked")["lines"].size(), 3U);
  }
}

TEST_F(Looking, StateHasEveryControlOfAScreen) {
  const Json controls = Do("state")["controls"];
  OnDo([&](Workbench& bench) {
    EXPECT_EQ(controls.size(), bench.Controls().size());
    bench.InScreens().Load("frmShelf");
  });
  Do("click cmdDo");
  EXPECT_EQ(controls["optBoth(0)"], Get("optBoth(0)"));
  EXPECT_EQ(Do("state FRMSHELF")["controls"].size(), 1U);
  EXPECT_EQ(Refused("state frmAttic"), "there is no screen frmAttic now");
}

TEST_F(Looking, SessionTellsEveryFieldWithNullForNoDate) {
  OnDo([](Workbench& bench) {
    const Context& context = bench.context;
    context.session.Grade =
        "A Gr\xE4"
        "de";
    context.session.WorkDate = *DateFromCivil({2004, 3, 31});
    context.session.TeamDates = {*DateFromCivil({2004, 4, 7}), Date{}, Date{-1}};
    context.session.PlayerCount = 32767;
    context.session.Quiet = true;
  });
  EXPECT_TRUE(InSession("WorkDate").is_null());
  Do("click cmdDo");
  EXPECT_EQ(InSession("Grade"),
            "A Gr\xC3\xA4"
            "de");
  EXPECT_EQ(InSession("WorkDate"), "2004-03-31");
  EXPECT_EQ(InSession("TeamDates"), Json::parse(R"(["2004-04-07", null, "1899-12-29"])"));
  EXPECT_EQ(InSession("PlayerCount"), 32767);
  EXPECT_EQ(InSession("Quiet"), true);
  EXPECT_EQ(InSession("GameNames").size(), 6U);
  EXPECT_EQ(Do("session")["session"].size(), FieldsOf(Session()).size());
}

TEST_F(Looking, ClipboardTellsItsTextAndItsEvents) {
  EXPECT_EQ(Do("clipboard")["text"], "");
  OnDo([](Workbench& bench) {
    const Context& context = bench.context;
    context.platform.clipboard.Clear();
    context.platform.clipboard.SetText("a\tb\r\n");
  });
  EXPECT_EQ(Do("click cmdDo")["events"],
            Json::parse(R"([{"clipboard": ""}, {"clipboard": "a\tb\r\n"}])"));
  EXPECT_EQ(Do("clipboard")["text"], "a\tb\r\n");
}

TEST_F(Looking, ShotIsRefusedWhereThereAreNoWindows) {
  HOLDS_FOR_MODELS_ALONE("a window can be taken a picture of");
  EXPECT_EQ(Refused("shot menu.png"), "shot: no picture of a window can be taken here");
  EXPECT_EQ(Refused("shot my menu.png 800 600"), "shot: no picture of a window can be taken here");
}

TEST_F(Looking, ShotIsRefusedWithoutAFileOrWithNoSize) {
  EXPECT_EQ(Refused("shot"), "shot: needs a file");
  EXPECT_EQ(Refused("shot menu.png 0 600"), "shot: the size must be at least 1 by 1");
}

TEST_F(Looking, ShotIsRefusedOfAWindowThatNoMachineCanPaint) {
  EXPECT_EQ(Refused("shot menu.png 8193 600"), "shot: the size must be at most 8192 by 8192");
  EXPECT_EQ(Refused("shot menu.png 800 99999"), "shot: the size must be at most 8192 by 8192");
}

TEST_F(Looking, EventsOfTheStartAreInTheFirstAnswerThatHasAny) {
  prepare = [](Workbench& made) { made.context.platform.sound.Beep(); };
  Do("get txtName");
  Refused("click cmdGone");
  EXPECT_EQ(Do("events")["events"], Json::parse(R"([{"beep": true}])"));
  EXPECT_EQ(Do("events")["events"], Json::array());
  Restart();
  EXPECT_EQ(Do("click cmdHelp")["events"], Json::parse(R"([{"beep": true}])"));
}

TEST_F(Looking, EventsOfTheSmallServicesAreToldInOrder) {
  OnDo([](Workbench& bench) {
    const Context& context = bench.context;
    context.platform.sound.Prepare("ok.WAV");
    context.platform.sound.Play();
    context.platform.help.Open("qz1.HLP", 0);
    context.platform.help.Open("qz1.hlp", 215);
    context.platform.sound.Beep();
  });
  EXPECT_EQ(Do("click cmdDo")["events"], Json::parse(R"([
    {"sound": "ok.WAV"}, {"help": {"file": "qz1.HLP", "topic": 0}},
    {"help": {"file": "qz1.hlp", "topic": 215}}, {"beep": true}])"));
}

TEST_F(Looking, AnErrorIsToldAndItsBoxFollows) {
  OnDo([](Workbench&) { throw RunTimeError(ErrorNumber::DiskFull); });
  EXPECT_EQ(Do("click cmdDo")["events"], Json::parse(R"([
    {"error": {"number": 61}},
    {"box": {"text": "DISK FULL    ", "title": "Marlowbeck Error!", "style": 16, "answer": 1}}])"));
}

TEST_F(Looking, AfterTheEndOnlyScreensAndEventsAnswer) {
  OnDo([](Workbench& bench) {
    bench.InScreens().End();
    bench.context.platform.observer.Ended();
  });
  EXPECT_EQ(Do("click cmdDo"),
            Json::parse(R"({"ok": true, "events": [{"ended": true}], "ended": true})"));
  for (const char* line : {"click cmdDo", "get txtName", "state", "session", "answer yes",
                           "waiting", "fault count", "clock 2004-04-01", "printer name x"}) {
    EXPECT_NE(Refused(line).find("the program has ended"), std::string::npos) << line;
  }
  EXPECT_EQ(Do("screens")["ok"], true);
  EXPECT_EQ(Do("events")["events"], Json::array());
}

TEST_F(Looking, AnEndAtTheStartIsInTheFirstEvents) {
  prepare = [](Workbench& made) {
    made.InScreens().End();
    made.context.platform.observer.Ended();
  };
  EXPECT_EQ(Do("events"),
            Json::parse(R"({"ok": true, "events": [{"ended": true}], "ended": true})"));
}

TEST_F(Looking, TheClockTheTimerAndTheWidthAreTheScripts) {
  today = *DateFromCivil({2005, 1, 2});
  seed = 7;
  screen_width = 9999;
  OnDo([](Workbench& bench) {
    const Context& context = bench.context;
    auto& platform = context.platform;
    context.session.WorkDate = platform.clock.Today();
    context.session.Flag = static_cast<int>(platform.timer.Seed());
    context.session.EditRecord = static_cast<int>(platform.timer.Seed());
    context.session.ReportChoice = platform.display.WidthInTwips();
  });
  Do("click cmdDo");
  EXPECT_EQ(InSession("WorkDate"), "2005-01-02");
  EXPECT_EQ(InSession("Flag"), 7);
  EXPECT_EQ(InSession("EditRecord"), 8);
  EXPECT_EQ(InSession("ReportChoice"), 9999);
  Do("clock 2005-01-03");
  Do("click cmdDo");
  EXPECT_EQ(InSession("WorkDate"), "2005-01-03");
  EXPECT_EQ(Refused("clock tomorrow"), "clock: needs a date as YYYY-MM-DD, not \"tomorrow\"");
}

}  // namespace
}  // namespace marlowbeck
