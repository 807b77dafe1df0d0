#include <array>

#include "drive/workbench.h"

namespace marlowbeck {
namespace {

/// A click on cmdDo prints.
class Printing : public WorkbenchTest {
 protected:
  void Print(const std::function<void(Printer&)>& work) {
    OnDo([work](Workbench& bench) { work(bench.context.platform.printer); });
  }
};

const PrinterFont kSmall = {"Liberation Sans", 8, false, true, false};

TEST_F(Printing, KeepsADocumentAsOperationsPageByPage) {
  Print([](Printer& printer) {
    printer.SetFont(kSmall);
    printer.Print(567, 100.5, "Name");
    printer.NewPage();
    printer.Line(1, 2, 3, 4);
    printer.Box(5, 6, 7.25, 8);
    printer.EndDoc();
  });
  EXPECT_EQ(Do("click cmdDo")["events"].dump(),
            R"([{"printed":{"pages":[[{"text":"Name","x":567,"y":100.5,"font":"Liberation Sans",)"
            R"("size":8,"bold":false,"italic":true,"underline":false}],)"
            R"([{"line":[1,2,3,4]},{"box":[5,6,7.25,8]}]]}}])");
}

TEST_F(Printing, LeavesAnEmptyLastPageOut) {
  Print([](Printer& printer) {
    printer.NewPage();
    printer.Line(0, 0, 1, 1);
    printer.NewPage();
    printer.EndDoc();
  });
  EXPECT_EQ(Do("click cmdDo")["events"],
            Json::parse(R"([{"printed": {"pages": [[], [{"line": [0, 0, 1, 1]}]]}}])"));
}

TEST_F(Printing, BeginsEachDocumentAfresh) {
  Print([](Printer& printer) {
    printer.Line(0, 0, 1, 1);
    printer.KillDoc();
    printer.EndDoc();
  });
  EXPECT_EQ(Do("click cmdDo")["events"],
            Json::parse(R"([{"killed": true}, {"printed": {"pages": []}}])"));
}

TEST_F(Printing, MeasuresTextByTheFixedRule) {
  Print([](Printer& printer) {
    for (const bool bold : {false, true}) {
      printer.SetFont({"Any", 12, bold, false, false});
      EXPECT_EQ(printer.TextWidth("88888"), 600);
      EXPECT_EQ(printer.TextHeight("x"), 288);
    }
    printer.SetFont(kSmall);
    EXPECT_EQ(printer.TextWidth("\xE4\xF6"), 160);
    EXPECT_EQ(printer.TextWidth(""), 0);
    EXPECT_EQ(printer.GetFont().name, "Liberation Sans");
  });
  Do("click cmdDo");
}

TEST_F(Printing, ChangesTheSidesWithTheOrientation) {
  Print([](Printer& printer) {
    EXPECT_EQ(printer.GetOrientation(), Orientation::Portrait);
    EXPECT_EQ(printer.PageWidth(), 11906);
    EXPECT_EQ(printer.PageHeight(), 16838);
    printer.SetOrientation(Orientation::Landscape);
    EXPECT_EQ(printer.PageWidth(), 16838);
    EXPECT_EQ(printer.PageHeight(), 11906);
  });
  Do("click cmdDo");
}

TEST_F(Printing, TakesSizesForThePresentOrientationAlone) {
  DoAll({"printer width 5000", "printer orientation landscape", "printer height 6000"});
  Print([](Printer& printer) {
    EXPECT_EQ(printer.PageWidth(), 16838);
    EXPECT_EQ(printer.PageHeight(), 6000);
    printer.SetOrientation(Orientation::Portrait);
    EXPECT_EQ(printer.PageWidth(), 5000);
    EXPECT_EQ(printer.PageHeight(), 16838);
  });
  Do("click cmdDo");
}

TEST_F(Printing, HasADeviceName) {
  OnDo([](Workbench& bench) {
    bench.lblPlain.SetCaption(bench.context.platform.printer.DeviceName());
  });
  Do("click cmdDo");
  EXPECT_EQ(Caption("lblPlain"), "Test printer");
  DoAll({"printer name Old Laser 5", "click cmdDo"});
  EXPECT_EQ(Caption("lblPlain"), "Old Laser 5");
}

TEST_F(Printing, FailsAtTheOperationThatIsAskedFor) {
  const std::array<std::function<void(Printer&)>, 5> operations = {
      [](Printer& printer) { printer.Print(0, 0, "x"); },
      [](Printer& printer) { printer.Line(0, 0, 1, 1); },
      [](Printer& printer) { printer.Box(0, 0, 1, 1); },
      [](Printer& printer) { printer.NewPage(); }, [](Printer& printer) { printer.EndDoc(); }};
  for (std::size_t nth = 0; nth < operations.size(); ++nth) {
    Print([&](Printer& printer) {
      printer.SetFont(kSmall);  // no operation
      for (std::size_t i = 0; i < nth; ++i) operations[i](printer);
      EXPECT_THROW(operations[nth](printer), RunTimeError);
      operations[nth](printer);
    });
    Do("printer fail " + std::to_string(nth + 1));
    Do("click cmdDo");
  }
}

TEST_F(Printing, FailureIsRunTimeError27) {
  Print([](Printer& printer) { printer.EndDoc(); });
  Do("printer fail 1");
  Do("click cmdDo");
  EXPECT_EQ(EventsNamed("error"), std::vector<Json>{Json::parse(R"({"number": 27})")});
  EXPECT_EQ(Count("printed"), 0);
}

TEST_F(Printing, RefusesSettingsThatNoPrinterHas) {
  EXPECT_EQ(Refused("printer"), "printer: needs width, height, name, orientation or fail");
  EXPECT_EQ(Refused("printer colour"), "printer: there is no colour to set");
  EXPECT_EQ(Refused("printer width 0"), "printer: the width must be at least 1");
  EXPECT_EQ(Refused("printer height x"), "printer: needs a number for the height, not \"x\"");
  EXPECT_EQ(Refused("printer fail 0"), "printer: the operation must be at least 1");
  EXPECT_EQ(Refused("printer orientation upright"), "printer: there is no orientation upright");
  EXPECT_EQ(Refused("printer width 1 2"), "printer: has \"2\" more than it takes");
}

}  // namespace
}  // namespace marlowbeck
