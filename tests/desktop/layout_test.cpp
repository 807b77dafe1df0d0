// Every screen in every state that the scripts of tools/ bring it into, in the smallest window that
// the program is made for and in a larger one.

#include <cstdlib>
#include <filesystem>
#include <fstream>

#include <QApplication>

#include "tests/desktop/layout_lint.h"
#include "tests/desktop/window_club.h"

namespace marlowbeck {
namespace {

namespace fs = std::filesystem;

constexpr QSize kSmall(800, 600);
constexpr QSize kWide(1280, 800);

std::vector<fs::path> Scripts() {
  std::vector<fs::path> scripts = {MARLOWBECK_SOURCE_DIR "/tools/tour.drive"};
  for (const auto& entry : fs::directory_iterator(MARLOWBECK_SOURCE_DIR "/tools/screens")) {
    scripts.push_back(entry.path());
  }
  std::sort(scripts.begin(), scripts.end());
  return scripts;
}

/// A script played on a copy of the sample, with a look at the window in front after each line.
class Layout : public testing::TestWithParam<fs::path> {
 protected:
  void Play(const std::string& line) {
    if (line.empty() || line.starts_with('#') || line.starts_with("shot")) return;
    const Json answer = club_.Do(line);
    EXPECT_FALSE(answer.value("lost", false)) << line;
    EXPECT_EQ(club_.Count("error"), 0) << line;
    for (const SeenBox& box : club_.Boxes()) EXPECT_FALSE(box.unexpected) << line << box.text;
    const std::string front = club_.Front();
    QWidget* const window = WindowOf(front);
    ASSERT_NE(window, nullptr) << front;
    for (const QSize size : {kWide, kSmall}) LookAt(*window, size, line);
  }

 private:
  /// A small window keeps its own size.
  void LookAt(QWidget& window, QSize size, const std::string& line) {
    const bool is_small = window.sizeHint().width() < 700 && window.width() < kSmall.width();
    if (!is_small) window.resize(size);
    QApplication::processEvents();
    for (const QString& fault : SizeFaults(window, size) + LayoutFaults(window)) {
      const QString told = QString("%1 at %2 x %3").arg(fault).arg(size.width()).arg(size.height());
      // What has been told once is not told at every line that follows.
      if (told_.contains(told)) continue;
      told_.append(told);
      ADD_FAILURE() << told.toStdString() << " after \"" << line << "\"";
    }
  }

  WindowClub club_;
  QStringList told_;
};

TEST_P(Layout, CutsNothingAndCoversNothing) {
  std::ifstream script(GetParam());
  for (std::string line; std::getline(script, line) && !HasFatalFailure();) Play(line);
}

/// Panels that take each other's place, where more of them are up than a person needs.
class PanelsOfTheScoreSheets : public testing::Test {
 protected:
  PanelsOfTheScoreSheets() {
    club_.DoAll({"click imgSheets", "pick cboResGrade =A Grade", "date Cal 2004-03-31",
                 "click cmdGotoResults", "pick cboResTeam =Bluebells"});
  }
  QString Faults() {
    QWidget& window = *WindowOf("frmResults");
    window.resize(kSmall);
    QApplication::processEvents();
    return LayoutFaults(window).join("; ");
  }

  WindowClub club_;
};

TEST_F(PanelsOfTheScoreSheets, CoverNothingAfterAFailure) {
  int failed = 0;
  for (int operation = 1; operation <= 12; ++operation) {
    club_.Do("fault any " + std::to_string(operation) + " 57");
    club_.Do("pick lstFinished 0");
    failed += club_.Count("error");
    club_.Do("fault off");
    EXPECT_EQ(Faults(), QString()) << "operation " << operation;
    if (club_.Shown("cmdResultsCancel")) club_.Do("click cmdResultsCancel");
  }
  EXPECT_GT(failed, 3);
}

TEST_F(PanelsOfTheScoreSheets, LetASheetWithoutARecordBeLeft) {
  club_.DoAll({"pick lstFinished 0", "click cmdResultsCancel"});
  auto results = club_.Results("Winter_A Grade.qzr");
  for (ResultRecord& result : results) result.Team = "Elsewhere";
  club_.WriteResults("Winter_A Grade.qzr", results);
  club_.Do("pick lstFinished 0");
  ASSERT_TRUE(club_.Shown("fraResults") && club_.Shown("fraResControls"));
  EXPECT_EQ(Faults(), QString());
  club_.DoAll({"click chkFF", "click cmdResultsCancel"});
  EXPECT_EQ(Faults(), QString());
  club_.Do("click cmdLeaveResults");
}

TEST_F(PanelsOfTheScoreSheets, StandBesideThatOfARefusedPlayer) {
  club_.DoAll({"click panAddNames", "click cmdAddSave0"});
  for (const char* line : {"pick lstFinished 0", "click cmdResultsCancel", "click cmdChangeGrade",
                           "date Cal 2004-04-07", "click cmdGotoResults", "pick lstResPlayers 0",
                           "click cmdAddCancel0"}) {
    EXPECT_TRUE(club_.Do(line).value("ok", false)) << line;
    EXPECT_EQ(Faults(), QString()) << line;
  }
  EXPECT_TRUE(club_.Shown("fraResults") && club_.Shown("fraResControls"));
}

TEST_F(PanelsOfTheScoreSheets, StandBesideThatOfAnotherOpposition) {
  club_.DoAll({"click cmdChangeGrade", "date Cal 2004-04-07", "click cmdGotoResults"});
  for (const char* line : {"click panChangeOpp", "click cmdChangeGrade", "date Cal 2004-04-07",
                           "click cmdGotoResults", "pick lstResPlayers 0"}) {
    EXPECT_TRUE(club_.Do(line).value("ok", false)) << line;
    EXPECT_EQ(Faults(), QString()) << line;
  }
  EXPECT_TRUE(club_.Shown("fraReDoOpp") && club_.Shown("fraTeams"));
}

TEST_F(PanelsOfTheScoreSheets, StandInTheMiddleOverWhatIsOutOfReach) {
  const auto off_the_middle = [this] {
    const QWidget& window = *WindowOf("frmResults");
    const QWidget& card = club_.Find("fraChangeGrade");
    const int left = card.mapTo(&window, QPoint(0, 0)).x();
    return std::abs(left - (window.width() - left - card.width()));
  };
  club_.Do("click cmdChangeGrade");
  EXPECT_EQ(Faults(), QString());
  EXPECT_LE(off_the_middle(), 1);
  club_.DoAll({"click cmdGotoResults", "click panAddNames", "click cmdAddSave0",
               "pick lstFinished 0", "click cmdResultsCancel", "click cmdChangeGrade"});
  ASSERT_TRUE(club_.Shown("panResAddPlayer"));
  EXPECT_EQ(Faults(), QString());
  EXPECT_GT(off_the_middle(), 100) << "the panel of the refused player can be worked";
  club_.DoAll({"click cmdAddCancel0", "click cmdLeaveResults", "click imgSheets"});
  EXPECT_EQ(Faults(), QString());
  EXPECT_LE(off_the_middle(), 1);
}

TEST_F(PanelsOfTheScoreSheets, FitIntoTheSmallestWindowWhereGradeAndDateIsChosenAgain) {
  club_.Do("click cmdChangeGrade");
  EXPECT_EQ(Faults(), QString());
  EXPECT_EQ(WindowOf("frmResults")->size(), kSmall);
}

TEST_F(PanelsOfTheScoreSheets, ThatChangePlacesLeaveTheWindowAsLargeAsItIs) {
  EXPECT_EQ(Faults(), QString());
  for (const char* line : {"pick lstFinished 0", "click cmdResultsCancel", "click panAddNames",
                           "click cmdAddCancel0", "click cmdChangeGrade", "click cmdGotoResults"}) {
    EXPECT_TRUE(club_.Do(line).value("ok", false)) << line;
    EXPECT_EQ(WindowOf("frmResults")->size(), kSmall) << line;
  }
}

INSTANTIATE_TEST_SUITE_P(Of, Layout, testing::ValuesIn(Scripts()), [](const auto& script) {
  std::string name = script.param.stem().string();
  std::replace(name.begin(), name.end(), '-', '_');
  return name;
});

}  // namespace
}  // namespace marlowbeck
