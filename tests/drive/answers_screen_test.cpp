#include <array>

#include "drive/workbench.h"

namespace marlowbeck {
namespace {

/// A click on cmdDo asks something; what the program was told then stands in lblPlain.
class Answers : public WorkbenchTest {
 protected:
  void AskBy(BoxStyle style) {
    OnDo([=](Workbench& bench) {
      const int button = bench.context.platform.boxes.Message({"Sure ?", "Title", style});
      bench.lblPlain.SetCaption(std::to_string(button));
    });
  }
  void AskForText(std::optional<int> topic = std::nullopt) {
    OnDo([=](Workbench& bench) {
      bench.lblPlain.SetCaption(
          bench.context.platform.boxes.Input({"How many ?", "Title", "3", topic}));
    });
  }
  void AskForFile(const FileDialogRequest& request) {
    OnDo([=](Workbench& bench) {
      bench.lblPlain.SetCaption(
          bench.context.platform.dialogs.File(request).value_or("(cancelled)"));
    });
  }
  Json Event() { return Do("click cmdDo")["events"].at(0); }
  Json Waiting() { return Do("waiting")["waiting"]; }
  std::string Answered() { return Caption("lblPlain"); }
};

const FileDialogRequest kOpenDialog = {
    FileDialogRequest::Mode::Open, "[Marlowbeck] OPEN file.", "*.qza", "/club", "*.qza", "qza"};

TEST_F(Answers, OfABoxWithOkAloneAreTakenFromNobody) {
  for (const BoxStyle style : {BoxStyle::StopOk, BoxStyle::WarningOk, BoxStyle::InformationOk}) {
    AskBy(style);
    Do("answer no");
    EXPECT_EQ(Event()["box"]["answer"], 1);
    EXPECT_EQ(Answered(), "1");
    EXPECT_EQ(Waiting()["answer"], 1);
    Do("forget");
  }
}

TEST_F(Answers, AreTakenInTheOrderInWhichTheyWait) {
  AskBy(BoxStyle::InformationYesNoCancel);
  DoAll({"answer no", "answer cancel", "answer yes"});
  for (const char* expected : {"7", "2", "6"}) {
    Do("click cmdDo");
    EXPECT_EQ(Answered(), expected);
    EXPECT_FALSE(Boxes().at(0).unexpected);
  }
  EXPECT_EQ(Waiting()["answer"], 0);
}

TEST_F(Answers, MissingForABoxAreCancelWhereItHasItElseNo) {
  const std::pair<BoxStyle, int> boxes[] = {{BoxStyle::StopOkCancel, 2},
                                            {BoxStyle::StopYesNo, 7},
                                            {BoxStyle::InformationYesNoCancel, 2},
                                            {BoxStyle::InformationYesNo, 7}};
  for (const auto& [style, answer] : boxes) {
    AskBy(style);
    const Json expected = {{"text", "Sure ?"},
                           {"title", "Title"},
                           {"style", static_cast<int>(style)},
                           {"answer", answer},
                           {"unexpected", true}};
    EXPECT_EQ(Event()["box"], expected);
    EXPECT_EQ(Answered(), std::to_string(answer));
  }
}

TEST_F(Answers, WithAButtonThatTheBoxLacksAreUsedUpAndToldAsUnexpected) {
  AskBy(BoxStyle::StopOkCancel);
  Do("answer yes");
  EXPECT_EQ(Event()["box"]["unexpected"], true);
  EXPECT_EQ(Answered(), "2");
  EXPECT_EQ(Waiting()["answer"], 0);
}

TEST_F(Answers, OfAnInputBoxThatAsksForNoNameHaveTheLettersOfTheProgram) {
  AskForText(46);
  Do("input \u0141\u00F3d\u017A");
  EXPECT_EQ(Event()["input"]["answer"], "?\u00F3d?");
  EXPECT_EQ(Answered(), "?\u00F3d?");
}

TEST_F(Answers, OfAnInputBoxAreTextsBlanksIncluded) {
  AskForText(46);
  DoAll({"input  4 teams ", "input", "input-cancel"});
  const Json expected = Json::parse(R"({"input": {"prompt": "How many ?", "title": "Title",
                                        "default": "3", "topic": 46, "answer": " 4 teams "}})");
  EXPECT_EQ(Event(), expected);
  EXPECT_EQ(Answered(), " 4 teams ");
  for (int i = 0; i < 2; ++i) {
    EXPECT_FALSE(Event()["input"].contains("unexpected"));
    EXPECT_EQ(Answered(), "");
  }
}

TEST_F(Answers, OfAnInputBoxAreRefusedForWhatNoKeyWrites) {
  EXPECT_EQ(Refused("input A\tB"), "input: there is no key that writes character 9 into a box");
  EXPECT_EQ(Waiting()["input"], 0);
}

TEST_F(Answers, MissingForAnInputBoxCancelIt) {
  AskForText();
  const Json expected = Json::parse(R"({"input": {"prompt": "How many ?", "title": "Title",
                                        "default": "3", "answer": "", "unexpected": true}})");
  EXPECT_EQ(Event(), expected);
}

TEST_F(Answers, OfAFileDialogAreHandedBackAsTheyStand) {
  AskForFile(kOpenDialog);
  Do("file /other/My file.txt");
  const Json expected = Json::parse(
      R"({"file": {"mode": "open", "title": "[Marlowbeck] OPEN file.", "filter": "*.qza",
          "folder": "/club", "name": "*.qza", "ext": "qza", "answer": "/other/My file.txt"}})");
  EXPECT_EQ(Event(), expected);
  EXPECT_EQ(Answered(), "/other/My file.txt");
}

TEST_F(Answers, OfAFileDialogWithABareNameStandInItsFolder) {
  for (const char* folder : {"/club", "/club/"}) {
    FileDialogRequest request = kOpenDialog;
    request.folder = folder;
    AskForFile(request);
    DoAll({"file Winter", "click cmdDo"});
    EXPECT_EQ(Answered(), "/club/Winter");
  }
  DoAll({"file sub/Winter.qza", "click cmdDo"});
  EXPECT_EQ(Answered(), "sub/Winter.qza");
}

TEST_F(Answers, OfAFileDialogThatBeginWithAStarAreThePatternShown) {
  AskForFile(kOpenDialog);
  DoAll({"file *", "click cmdDo"});
  EXPECT_EQ(Answered(), "*.qza");
  FileDialogRequest named = kOpenDialog;
  named.mode = FileDialogRequest::Mode::Save;
  named.name = "Winter";
  named.filter = "*.ko4";
  AskForFile(named);
  Do("file *.qza");
  const Json event = Event()["file"];
  EXPECT_EQ(event["mode"], "save");
  EXPECT_EQ(event["answer"], "*.ko4");
}

TEST_F(Answers, MissingForAFileDialogCancelIt) {
  AskForFile(kOpenDialog);
  EXPECT_EQ(Event()["file"]["unexpected"], true);
  EXPECT_EQ(Answered(), "(cancelled)");
  Do("file-cancel");
  const Json event = Event()["file"];
  EXPECT_EQ(event["answer"], "");
  EXPECT_FALSE(event.contains("unexpected"));
}

TEST_F(Answers, OfAFontDialogAreWholeFonts) {
  OnDo([](Workbench& bench) {
    const auto font = bench.context.platform.dialogs.Font({"MS Sans Serif", 10, true, false});
    bench.lblPlain.SetCaption(font ? font->name + std::to_string(font->size) : "(cancelled)");
  });
  DoAll({"font 12 0 1 Liberation Sans", "font-cancel"});
  EXPECT_EQ(Event(), Json::parse(R"({"font": {"size": 10, "name": "MS Sans Serif", "bold": true,
      "italic": false, "answer": {"size": 12, "name": "Liberation Sans", "bold": false,
      "italic": true}}})"));
  EXPECT_EQ(Answered(), "Liberation Sans12");
  const Json cancelled = Event()["font"];
  EXPECT_TRUE(cancelled["answer"].is_null());
  EXPECT_FALSE(cancelled.contains("unexpected"));
  EXPECT_EQ(Answered(), "(cancelled)");
  EXPECT_EQ(Event()["font"]["unexpected"], true);
  EXPECT_EQ(Refused("font 12 0 2 Sans"), "font: italic is 0 or 1");
  EXPECT_EQ(Refused("font 12 0 1"), "font: needs a name");
  EXPECT_EQ(Refused("font big 0 1 Sans"), "font: needs a number for the size, not \"big\"");
}

TEST_F(Answers, OfASetUpDialogAreOrientations) {
  OnDo([](Workbench& bench) {
    const auto chosen = bench.context.platform.dialogs.PrinterSetup(Orientation::Portrait);
    bench.lblPlain.SetCaption(chosen ? std::to_string(static_cast<int>(*chosen)) : "(cancelled)");
  });
  DoAll({"setup landscape", "setup portrait", "setup-cancel"});
  EXPECT_EQ(Event(), Json::parse(R"({"setup": {"answer": "Landscape"}})"));
  EXPECT_EQ(Answered(), "2");
  EXPECT_EQ(Event(), Json::parse(R"({"setup": {"answer": "Portrait"}})"));
  EXPECT_EQ(Event(), Json::parse(R"({"setup": {"answer": null}})"));
  EXPECT_EQ(Answered(), "(cancelled)");
  EXPECT_EQ(Event(), Json::parse(R"({"setup": {"answer": null, "unexpected": true}})"));
  EXPECT_EQ(Refused("setup sideways"), "setup: there is no orientation sideways");
}

TEST_F(Answers, ThatWaitAreCountedByKindUntilForgotten) {
  DoAll({"answer yes", "answer no", "input x", "input-cancel", "input", "file a", "font-cancel",
         "setup-cancel", "setup portrait"});
  EXPECT_EQ(Waiting(),
            Json::parse(R"({"answer": 2, "input": 3, "file": 1, "font": 1, "setup": 2})"));
  EXPECT_EQ(Do("forget"), Json::parse(R"({"ok": true})"));
  EXPECT_EQ(Waiting(),
            Json::parse(R"({"answer": 0, "input": 0, "file": 0, "font": 0, "setup": 0})"));
}

TEST_F(Answers, AreRefusedForAButtonThatNoBoxHas) {
  EXPECT_EQ(Refused("answer maybe"), "answer: there is no button maybe");
  EXPECT_EQ(Refused("answer"), "answer: needs a button: ok, cancel, yes or no");
}

/// A box that comes back for ever, with a file held open meanwhile.
class EndlessBox : public WorkbenchTest {
 protected:
  void AskForEver() {
    OnDo([](Workbench& bench) {
      const Context& context = bench.context;
      context.channels.OpenRandom(Channel::Players, "Club.qza", kPlayerLength);
      for (;;) context.platform.boxes.Message({"Again ?", "Title", BoxStyle::InformationYesNo});
    });
  }
};

TEST_F(EndlessBox, IsBrokenOffAfterTwentyAnswersThatNobodyPrepared) {
  AskForEver();
  DoAll({"answer yes", "answer yes"});
  const Json answer = Try("click cmdDo");
  EXPECT_EQ(answer["ok"], false);
  EXPECT_NE(answer["error"].get<std::string>().find("kept coming back"), std::string::npos);
  EXPECT_EQ(Boxes().size(), 22U);
  EXPECT_FALSE(Boxes()[1].unexpected);
  EXPECT_TRUE(Boxes()[2].unexpected);
}

TEST_F(EndlessBox, LeavesAProgramThatGoesOn) {
  AskForEver();
  Try("click cmdDo");
  OnDo([](Workbench& bench) {
    const Context& context = bench.context;
    EXPECT_THROW((void)context.channels.RecordCount(Channel::Players), RunTimeError);
    context.session.Grade = "A";
  });
  EXPECT_EQ(Do("click cmdDo")["events"], Json::array());
  EXPECT_EQ(InSession("Grade"), "A");
}

TEST_F(EndlessBox, CountsAnewInEachCommand) {
  OnDo([](Workbench& bench) {
    const Context& context = bench.context;
    for (int i = 0; i < 20; ++i) {
      context.platform.boxes.Message({"Again ?", "Title", BoxStyle::InformationYesNo});
    }
  });
  Do("click cmdDo");
  Do("click cmdDo");
  EXPECT_EQ(Boxes().size(), 20U);
}

TEST_F(EndlessBox, IsNoneWhereEachBoxSaysSomethingElse) {
  OnDo([](Workbench& bench) {
    const Context& context = bench.context;
    for (int i = 0; i < 30; ++i) {
      context.platform.boxes.Message({std::to_string(i), "Title", BoxStyle::InformationYesNo});
    }
  });
  Do("click cmdDo");
  EXPECT_EQ(Boxes().size(), 30U);
}

TEST_F(EndlessBox, MayBeAnInputBoxOrADialog) {
  const std::array<std::function<void(const Context&)>, 3> asking = {
      [](const Context& context) {
        context.platform.boxes.Input({"P", "T", "", {}});
      },
      [](const Context& context) { (void)context.platform.dialogs.File(kOpenDialog); },
      [](const Context& context) { (void)context.platform.dialogs.Font({}); }};
  for (const auto& ask : asking) {
    OnDo([ask](Workbench& bench) {
      const Context& context = bench.context;
      for (;;) ask(context);
    });
    EXPECT_EQ(Try("click cmdDo")["ok"], false);
    EXPECT_EQ(Events().size(), 20U);
  }
}

TEST_F(EndlessBox, AtTheStartLeavesADriverThatAnswers) {
  prepare = [](Workbench& made) {
    for (;;) made.context.platform.boxes.Message({"Again ?", "T", BoxStyle::StopYesNo});
  };
  EXPECT_EQ(Do("events")["events"].size(), 20U);
}

}  // namespace
}  // namespace marlowbeck
